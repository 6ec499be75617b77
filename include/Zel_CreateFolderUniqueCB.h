// Zel_CreateFolderUniqueCB: the callback of Zel_CreateFolderUniqueReq,
// answered by Zel_CreateFolderUniqueRes with the folder created.
//
// The application derives from it, implements the handlers and gives it, under
// a boost::shared_ptr, to the request; the result calls one handler per answer
// on the engine's delivery thread and catches and discards any exception a
// handler throws. The callback lives as long as a result holds it.
#ifndef ZEL_CREATEFOLDERUNIQUECB_H
#define ZEL_CREATEFOLDERUNIQUECB_H

#include "zel_export.h"
#include "Orv_ResultsCB.h"

#include <boost/shared_ptr.hpp>

class Zel_Error;
class Zel_Node;

class ZEL_EXPORT Zel_CreateFolderUniqueCB : public Orv_ResultsCB
{
public:
    Zel_CreateFolderUniqueCB();
    Zel_CreateFolderUniqueCB(const Zel_CreateFolderUniqueCB& other);
    virtual ~Zel_CreateFolderUniqueCB();

    // One answer: the folder created.
    virtual void succeeded(boost::shared_ptr<Zel_Node> folder) = 0;
    // One answer that is an error: its error record.
    virtual void failed(boost::shared_ptr<Zel_Error> error) = 0;
    // The request has delivered its last answer.
    virtual void finished() = 0;

private:
    Zel_CreateFolderUniqueCB& operator=(const Zel_CreateFolderUniqueCB&) = delete;
};

#endif
