// Zel_ChildrenAtCB: the callback of Zel_ChildrenAtReq. One answer per child
// node.
//
// The application derives from it, implements the handlers and gives it, under
// a boost::shared_ptr, to the request. The request is answered by a result
// class of the backend, which calls one handler per answer (failed for an
// error record that reports an error, finished after the last answer of the
// request) on the engine's delivery thread.
#ifndef ZEL_CHILDRENATCB_H
#define ZEL_CHILDRENATCB_H

#include "zel_export.h"
#include "Orv_ResultsCB.h"

#include <boost/shared_ptr.hpp>

class Zel_Error;
class Zel_Node;

class ZEL_EXPORT Zel_ChildrenAtCB : public Orv_ResultsCB
{
public:
    Zel_ChildrenAtCB();
    Zel_ChildrenAtCB(const Zel_ChildrenAtCB& other);
    virtual ~Zel_ChildrenAtCB();

    // One answer: a child node.
    virtual void succeeded(boost::shared_ptr<Zel_Node> child) = 0;
    // One answer that is an error: its error record.
    virtual void failed(boost::shared_ptr<Zel_Error> error) = 0;
    // The request has delivered its last answer.
    virtual void finished() = 0;

private:
    Zel_ChildrenAtCB& operator=(const Zel_ChildrenAtCB&) = delete;
};

#endif
