// Zel_NodeCB: the callback of Zel_NodeReq. An answer is a node.
//
// The application derives from it, implements the handlers and gives it, under
// a boost::shared_ptr, to the request. The request is answered by a result
// class of the backend, which calls one handler per answer (failed for an
// error record that reports an error, finished after the last answer of the
// request) on the engine's delivery thread.
#ifndef ZEL_NODECB_H
#define ZEL_NODECB_H

#include "zel_export.h"
#include "Orv_ResultsCB.h"

#include <boost/shared_ptr.hpp>

class Zel_Error;
class Zel_Node;

class ZEL_EXPORT Zel_NodeCB : public Orv_ResultsCB
{
public:
    Zel_NodeCB();
    Zel_NodeCB(const Zel_NodeCB& other);
    virtual ~Zel_NodeCB();

    // One answer: a node.
    virtual void succeeded(boost::shared_ptr<Zel_Node> node) = 0;
    // One answer that is an error: its error record.
    virtual void failed(boost::shared_ptr<Zel_Error> error) = 0;
    // The request has delivered its last answer.
    virtual void finished() = 0;

private:
    Zel_NodeCB& operator=(const Zel_NodeCB&) = delete;
};

#endif
