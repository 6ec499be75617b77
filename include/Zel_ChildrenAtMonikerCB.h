// Zel_ChildrenAtMonikerCB: the callback of Zel_ChildrenAtMonikerReq. One
// answer per child of the parent node named by a moniker. The callback also
// carries the parent, by moniker and, once known, as a node: setParentMoniker
// and setParentNode store shared references (no copy), the getters return
// them; both are empty until set. The fields are plain members without a lock:
// set them before the request is submitted.
//
// The application derives from it, implements the handlers and gives it, under
// a boost::shared_ptr, to the request. The request is answered by a result
// class of the backend, which calls one handler per answer (failed for an
// error record that reports an error, finished after the last answer of the
// request) on the engine's delivery thread.
#ifndef ZEL_CHILDRENATMONIKERCB_H
#define ZEL_CHILDRENATMONIKERCB_H

#include "zel_export.h"
#include "Orv_ResultsCB.h"

#include <QString>
#include <boost/shared_ptr.hpp>

class Zel_Error;
class Zel_Node;

class ZEL_EXPORT Zel_ChildrenAtMonikerCB : public Orv_ResultsCB
{
public:
    Zel_ChildrenAtMonikerCB();
    Zel_ChildrenAtMonikerCB(const Zel_ChildrenAtMonikerCB& other);
    virtual ~Zel_ChildrenAtMonikerCB();

    // One answer: a child node.
    virtual void succeeded(boost::shared_ptr<Zel_Node> child) = 0;
    // One answer that is an error: its error record.
    virtual void failed(boost::shared_ptr<Zel_Error> error) = 0;
    // The request has delivered its last answer.
    virtual void finished() = 0;

    // The parent by moniker and as a node (shared, not copied).
    void setParentMoniker(boost::shared_ptr<QString> parentMoniker);
    void setParentNode(boost::shared_ptr<Zel_Node> parentNode);
    const boost::shared_ptr<QString>& getParentMoniker() const;
    const boost::shared_ptr<Zel_Node>& getParentNode() const;

private:
    Zel_ChildrenAtMonikerCB& operator=(const Zel_ChildrenAtMonikerCB&) = delete;

    boost::shared_ptr<QString> mParentMoniker;
    boost::shared_ptr<Zel_Node> mParentNode;
};

#endif
