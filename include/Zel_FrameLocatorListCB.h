// Zel_FrameLocatorListCB: the callback of the frame locator requests
// (Zel_AddFrameLocatorListReq, Zel_DeleteFrameLocatorListReq,
// Zel_GetFrameLocatorListReq). An answer is the list of locators added,
// deleted or read.
//
// The application derives from it, implements the handlers and gives it, under
// a boost::shared_ptr, to the request. The request is answered by a result
// class of the backend, which calls one handler per answer (failed for an
// error record that reports an error, finished after the last answer of the
// request) on the engine's delivery thread.
#ifndef ZEL_FRAMELOCATORLISTCB_H
#define ZEL_FRAMELOCATORLISTCB_H

#include "zel_export.h"
#include "Orv_ResultsCB.h"
#include "Zel_FrameLocator.h"

#include <QList>
#include <boost/shared_ptr.hpp>

class Zel_Error;

class ZEL_EXPORT Zel_FrameLocatorListCB : public Orv_ResultsCB
{
public:
    Zel_FrameLocatorListCB();
    Zel_FrameLocatorListCB(const Zel_FrameLocatorListCB& other);
    virtual ~Zel_FrameLocatorListCB();

    // One answer: the locators concerned, in the server's order.
    virtual void succeeded(QList<Zel_FrameLocator> locators) = 0;
    // One answer that is an error: its error record.
    virtual void failed(boost::shared_ptr<Zel_Error> error) = 0;
    // The request has delivered its last answer.
    virtual void finished() = 0;

private:
    Zel_FrameLocatorListCB& operator=(const Zel_FrameLocatorListCB&) = delete;
};

#endif
