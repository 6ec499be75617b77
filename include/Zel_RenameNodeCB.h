// Zel_RenameNodeCB: the callback of Zel_RenameNodeReq. An answer is the
// renamed node.
//
// The application derives from it, implements the handlers and gives it, under
// a boost::shared_ptr, to the request. The request is answered by a result
// class of the backend, which calls one handler per answer (failed for an
// error record that reports an error, finished after the last answer of the
// request) on the engine's delivery thread.
#ifndef ZEL_RENAMENODECB_H
#define ZEL_RENAMENODECB_H

#include "zel_export.h"
#include "Orv_ResultsCB.h"

#include <boost/shared_ptr.hpp>

class Zel_Error;
class Zel_Node;

class ZEL_EXPORT Zel_RenameNodeCB : public Orv_ResultsCB
{
public:
    Zel_RenameNodeCB();
    Zel_RenameNodeCB(const Zel_RenameNodeCB& other);
    virtual ~Zel_RenameNodeCB();

    // One answer: the renamed node.
    virtual void succeeded(boost::shared_ptr<Zel_Node> node) = 0;
    // One answer that is an error: its error record.
    virtual void failed(boost::shared_ptr<Zel_Error> error) = 0;
    // The request has delivered its last answer.
    virtual void finished() = 0;

private:
    Zel_RenameNodeCB& operator=(const Zel_RenameNodeCB&) = delete;
};

#endif
