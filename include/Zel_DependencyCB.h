// Zel_DependencyCB: the callback of Zel_AddDependencyReq, answered by
// Zel_AddDependencyRes with a node and its dependencies.
//
// The application derives from it, implements the handlers and gives it, under
// a boost::shared_ptr, to the request; the result calls one handler per answer
// on the engine's delivery thread and catches and discards any exception a
// handler throws. The callback lives as long as a result holds it.
#ifndef ZEL_DEPENDENCYCB_H
#define ZEL_DEPENDENCYCB_H

#include "zel_export.h"
#include "Orv_ResultsCB.h"
#include "Zel_DependencySPList.h"

#include <boost/shared_ptr.hpp>

class Zel_Error;
class Zel_Node;

class ZEL_EXPORT Zel_DependencyCB : public Orv_ResultsCB
{
public:
    Zel_DependencyCB();
    Zel_DependencyCB(const Zel_DependencyCB& other);
    virtual ~Zel_DependencyCB();

    // One answer: the node and its dependency list (a copy).
    virtual void succeeded(boost::shared_ptr<Zel_Node> node, Zel_DependencySPList dependencies) = 0;
    // One answer that is an error: its error record.
    virtual void failed(boost::shared_ptr<Zel_Error> error) = 0;
    // The request has delivered its last answer.
    virtual void finished() = 0;

private:
    Zel_DependencyCB& operator=(const Zel_DependencyCB&) = delete;
};

#endif
