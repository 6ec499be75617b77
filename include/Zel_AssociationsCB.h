// Zel_AssociationsCB: the callback of Zel_AssociationsReq, answered by
// Zel_AssociationsRes with the directories associated with the request's
// subject.
//
// The application derives from it, implements the handlers and gives it, under
// a boost::shared_ptr, to the request; the result calls one handler per answer
// on the engine's delivery thread and catches and discards any exception a
// handler throws. The callback lives as long as a result holds it.
#ifndef ZEL_ASSOCIATIONSCB_H
#define ZEL_ASSOCIATIONSCB_H

#include "zel_export.h"
#include "Orv_ResultsCB.h"

#include <boost/shared_ptr.hpp>

class Zel_Directory;
class Zel_Error;

class ZEL_EXPORT Zel_AssociationsCB : public Orv_ResultsCB
{
public:
    Zel_AssociationsCB();
    Zel_AssociationsCB(const Zel_AssociationsCB& other);
    virtual ~Zel_AssociationsCB();

    // One answer: an associated directory.
    virtual void succeeded(boost::shared_ptr<Zel_Directory> directory) = 0;
    // One answer that is an error: its error record.
    virtual void failed(boost::shared_ptr<Zel_Error> error) = 0;
    // The request has delivered its last answer.
    virtual void finished() = 0;

private:
    Zel_AssociationsCB& operator=(const Zel_AssociationsCB&) = delete;
};

#endif
