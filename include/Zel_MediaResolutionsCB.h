// Zel_MediaResolutionsCB: the callback of Zel_MediaResolutionsReq, answered by
// Zel_MediaResolutionsRes with lists of media resolutions described as
// property keys.
//
// The application derives from it, implements the handlers and gives it, under
// a boost::shared_ptr, to the request; the result calls one handler per answer
// on the engine's delivery thread and catches and discards any exception a
// handler throws. The callback lives as long as a result holds it.
#ifndef ZEL_MEDIARESOLUTIONSCB_H
#define ZEL_MEDIARESOLUTIONSCB_H

#include "zel_export.h"
#include "Orv_ResultsCB.h"
#include "Zel_PropertyKeyInfoList.h"

#include <boost/shared_ptr.hpp>

class Zel_Error;

class ZEL_EXPORT Zel_MediaResolutionsCB : public Orv_ResultsCB
{
public:
    Zel_MediaResolutionsCB();
    Zel_MediaResolutionsCB(const Zel_MediaResolutionsCB& other);
    virtual ~Zel_MediaResolutionsCB();

    // One answer: the handler's own copy of the list.
    virtual void succeeded(Zel_PropertyKeyInfoList resolutions) = 0;
    // One answer that is an error: its error record.
    virtual void failed(boost::shared_ptr<Zel_Error> error) = 0;
    // The request has delivered its last answer.
    virtual void finished() = 0;

private:
    Zel_MediaResolutionsCB& operator=(const Zel_MediaResolutionsCB&) = delete;
};

#endif
