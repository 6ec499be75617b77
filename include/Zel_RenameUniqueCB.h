// Zel_RenameUniqueCB: the callback of Zel_RenameUniqueReq, answered by
// Zel_RenameUniqueRes with the renamed node.
//
// The application derives from it, implements the handlers and gives it, under
// a boost::shared_ptr, to the request; the result calls one handler per answer
// on the engine's delivery thread and catches and discards any exception a
// handler throws. The callback lives as long as a result holds it.
#ifndef ZEL_RENAMEUNIQUECB_H
#define ZEL_RENAMEUNIQUECB_H

#include "zel_export.h"
#include "Orv_ResultsCB.h"

#include <boost/shared_ptr.hpp>

class Zel_Error;
class Zel_Node;

class ZEL_EXPORT Zel_RenameUniqueCB : public Orv_ResultsCB
{
public:
    Zel_RenameUniqueCB();
    Zel_RenameUniqueCB(const Zel_RenameUniqueCB& other);
    virtual ~Zel_RenameUniqueCB();

    // One answer: the renamed node.
    virtual void succeeded(boost::shared_ptr<Zel_Node> node) = 0;
    // One answer that is an error: its error record.
    virtual void failed(boost::shared_ptr<Zel_Error> error) = 0;
    // The request has delivered its last answer.
    virtual void finished() = 0;

private:
    Zel_RenameUniqueCB& operator=(const Zel_RenameUniqueCB&) = delete;
};

#endif
