// Zel_FrameRestrictionListCB: the callback of the frame restriction requests
// (Zel_AddFrameRestrictionListReq, Zel_DeleteFrameRestrictionListReq,
// Zel_GetFrameRestrictionListReq). An answer is the list of restrictions
// added, deleted or read. A restriction travels in the form of a frame
// locator: its identifier and its frame properties.
//
// The application derives from it, implements the handlers and gives it, under
// a boost::shared_ptr, to the request. The request is answered by a result
// class of the backend, which calls one handler per answer (failed for an
// error record that reports an error, finished after the last answer of the
// request) on the engine's delivery thread.
#ifndef ZEL_FRAMERESTRICTIONLISTCB_H
#define ZEL_FRAMERESTRICTIONLISTCB_H

#include "zel_export.h"
#include "Orv_ResultsCB.h"
#include "Zel_FrameLocator.h"

#include <QList>
#include <boost/shared_ptr.hpp>

class Zel_Error;

class ZEL_EXPORT Zel_FrameRestrictionListCB : public Orv_ResultsCB
{
public:
    Zel_FrameRestrictionListCB();
    Zel_FrameRestrictionListCB(const Zel_FrameRestrictionListCB& other);
    virtual ~Zel_FrameRestrictionListCB();

    // One answer: the restrictions concerned, in the server's order.
    virtual void succeeded(QList<Zel_FrameLocator> restrictions) = 0;
    // One answer that is an error: its error record.
    virtual void failed(boost::shared_ptr<Zel_Error> error) = 0;
    // The request has delivered its last answer.
    virtual void finished() = 0;

private:
    Zel_FrameRestrictionListCB& operator=(const Zel_FrameRestrictionListCB&) = delete;
};

#endif
