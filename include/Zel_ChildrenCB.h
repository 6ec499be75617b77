// Zel_ChildrenCB: the callback of Zel_ChildrenReq, answered by
// Zel_ChildrenRes. An answer is either a node with a flag or a pair of nodes,
// each with its own success handler; a failure names the (first) node it
// concerns.
//
// The application derives from it, implements the handlers and gives it, under
// a boost::shared_ptr, to the request; the result calls one handler per answer
// on the engine's delivery thread and catches and discards any exception a
// handler throws. The callback lives as long as a result holds it.
#ifndef ZEL_CHILDRENCB_H
#define ZEL_CHILDRENCB_H

#include "zel_export.h"
#include "Orv_ResultsCB.h"

#include <boost/shared_ptr.hpp>

class Zel_Error;
class Zel_Node;

class ZEL_EXPORT Zel_ChildrenCB : public Orv_ResultsCB
{
public:
    Zel_ChildrenCB();
    Zel_ChildrenCB(const Zel_ChildrenCB& other);
    virtual ~Zel_ChildrenCB();

    // A node-and-flag answer: the node and the flag stored with it.
    virtual void succeeded(boost::shared_ptr<Zel_Node> node, bool flag) = 0;
    // A node-pair answer: both nodes, in the order stored.
    virtual void succeeded(boost::shared_ptr<Zel_Node> first, boost::shared_ptr<Zel_Node> second) = 0;
    // An answer that is an error: the (first) node and the error record.
    virtual void failed(boost::shared_ptr<Zel_Node> node, boost::shared_ptr<Zel_Error> error) = 0;
    // The request has delivered its last answer.
    virtual void finished() = 0;

private:
    Zel_ChildrenCB& operator=(const Zel_ChildrenCB&) = delete;
};

#endif
