// Zel_RefreshNodeCB: the callback of Zel_RefreshNodeReq. An answer is a
// refreshed node.
//
// The application derives from it, implements the handlers and gives it, under
// a boost::shared_ptr, to the request. The request is answered by a result
// class of the backend, which calls one handler per answer (failed for an
// error record that reports an error, finished after the last answer of the
// request) on the engine's delivery thread.
#ifndef ZEL_REFRESHNODECB_H
#define ZEL_REFRESHNODECB_H

#include "zel_export.h"
#include "Orv_ResultsCB.h"

#include <boost/shared_ptr.hpp>

class Zel_Error;
class Zel_Node;

class ZEL_EXPORT Zel_RefreshNodeCB : public Orv_ResultsCB
{
public:
    Zel_RefreshNodeCB();
    Zel_RefreshNodeCB(const Zel_RefreshNodeCB& other);
    virtual ~Zel_RefreshNodeCB();

    // One answer: the refreshed node.
    virtual void succeeded(boost::shared_ptr<Zel_Node> node) = 0;
    // One answer that is an error: its error record.
    virtual void failed(boost::shared_ptr<Zel_Error> error) = 0;
    // The request has delivered its last answer.
    virtual void finished() = 0;

private:
    Zel_RefreshNodeCB& operator=(const Zel_RefreshNodeCB&) = delete;
};

#endif
