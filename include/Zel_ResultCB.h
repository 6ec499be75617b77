// Zel_ResultCB: the callback of the requests that answer with nodes:
// Zel_GetNodeReq, Zel_CreateNodeUniqueReq, Zel_GetChildrenReq,
// Zel_GetLinkedProjectsReq and Zel_GetSyncedProjRootReq, answered by the
// results of the same stems (Zel_GetNodeRes, ...).
//
// The application derives from it, implements the handlers and gives it, under
// a boost::shared_ptr, to the request; the result calls one handler per answer
// on the engine's delivery thread and catches and discards any exception a
// handler throws. The callback lives as long as a result holds it.
#ifndef ZEL_RESULTCB_H
#define ZEL_RESULTCB_H

#include "zel_export.h"
#include "Orv_ResultsCB.h"

#include <boost/shared_ptr.hpp>

class Zel_Error;
class Zel_Node;

class ZEL_EXPORT Zel_ResultCB : public Orv_ResultsCB
{
public:
    Zel_ResultCB();
    Zel_ResultCB(const Zel_ResultCB& other);
    virtual ~Zel_ResultCB();

    // One answer: a node.
    virtual void succeeded(boost::shared_ptr<Zel_Node> node) = 0;
    // One answer that is an error: its error record.
    virtual void failed(boost::shared_ptr<Zel_Error> error) = 0;
    // The request has delivered its last answer.
    virtual void finished() = 0;

private:
    Zel_ResultCB& operator=(const Zel_ResultCB&) = delete;
};

#endif
