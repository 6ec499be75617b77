// Zel_MoveNodeCB: the callback of Zel_MoveNodeReq. An answer is a moved node,
// as it is after the move.
//
// The application derives from it, implements the handlers and gives it, under
// a boost::shared_ptr, to the request. The request is answered by a result
// class of the backend, which calls one handler per answer (failed for an
// error record that reports an error, finished after the last answer of the
// request) on the engine's delivery thread.
#ifndef ZEL_MOVENODECB_H
#define ZEL_MOVENODECB_H

#include "zel_export.h"
#include "Orv_ResultsCB.h"

#include <boost/shared_ptr.hpp>

class Zel_Error;
class Zel_Node;

class ZEL_EXPORT Zel_MoveNodeCB : public Orv_ResultsCB
{
public:
    Zel_MoveNodeCB();
    Zel_MoveNodeCB(const Zel_MoveNodeCB& other);
    virtual ~Zel_MoveNodeCB();

    // One answer: a moved node.
    virtual void succeeded(boost::shared_ptr<Zel_Node> node) = 0;
    // One answer that is an error: its error record.
    virtual void failed(boost::shared_ptr<Zel_Error> error) = 0;
    // The request has delivered its last answer.
    virtual void finished() = 0;

private:
    Zel_MoveNodeCB& operator=(const Zel_MoveNodeCB&) = delete;
};

#endif
