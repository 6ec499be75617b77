// Zel_RootNodeCB: the callback of Zel_RootNodeReq. One answer, the root node
// of the tree, and no end notice.
//
// The application derives from it, implements the handlers and gives it, under
// a boost::shared_ptr, to the request. The request is answered by a result
// class of the backend, which calls one handler per answer (failed for an
// error record that reports an error) on the engine's delivery thread.
#ifndef ZEL_ROOTNODECB_H
#define ZEL_ROOTNODECB_H

#include "zel_export.h"
#include "Orv_ResultsCB.h"

#include <boost/shared_ptr.hpp>

class Zel_Error;
class Zel_Node;

class ZEL_EXPORT Zel_RootNodeCB : public Orv_ResultsCB
{
public:
    Zel_RootNodeCB();
    Zel_RootNodeCB(const Zel_RootNodeCB& other);
    virtual ~Zel_RootNodeCB();

    // One answer: the root node.
    virtual void succeeded(boost::shared_ptr<Zel_Node> root) = 0;
    // The request failed: its error record.
    virtual void failed(boost::shared_ptr<Zel_Error> error) = 0;

private:
    Zel_RootNodeCB& operator=(const Zel_RootNodeCB&) = delete;
};

#endif
