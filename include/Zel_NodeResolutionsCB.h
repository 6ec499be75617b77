// Zel_NodeResolutionsCB: the callback of Zel_NodeResolutionsReq, answered by
// Zel_NodeResolutionsRes with a media object identifier and a text per
// resolution.
//
// The application derives from it, implements the handlers and gives it, under
// a boost::shared_ptr, to the request; the result calls one handler per answer
// on the engine's delivery thread and catches and discards any exception a
// handler throws. The callback lives as long as a result holds it.
#ifndef ZEL_NODERESOLUTIONSCB_H
#define ZEL_NODERESOLUTIONSCB_H

#include "zel_export.h"
#include "Orv_ResultsCB.h"

#include <QString>
#include <boost/shared_ptr.hpp>

class Zel_Error;
class Zel_MobID;

class ZEL_EXPORT Zel_NodeResolutionsCB : public Orv_ResultsCB
{
public:
    Zel_NodeResolutionsCB();
    Zel_NodeResolutionsCB(const Zel_NodeResolutionsCB& other);
    virtual ~Zel_NodeResolutionsCB();

    // One answer: the media object identifier and its text.
    virtual void succeeded(boost::shared_ptr<Zel_MobID> mobID, boost::shared_ptr<QString> text) = 0;
    // One answer that is an error: its error record.
    virtual void failed(boost::shared_ptr<Zel_Error> error) = 0;
    // The request has delivered its last answer.
    virtual void finished() = 0;

private:
    Zel_NodeResolutionsCB& operator=(const Zel_NodeResolutionsCB&) = delete;
};

#endif
