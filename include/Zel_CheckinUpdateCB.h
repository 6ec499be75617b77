// Zel_CheckinUpdateCB: the callback of Zel_CheckinUpdateReq, answered by
// Zel_CheckinUpdateRes: each answer only says whether one update succeeded.
//
// The application derives from it, implements the handlers and gives it, under
// a boost::shared_ptr, to the request; the result calls one handler per answer
// on the engine's delivery thread and catches and discards any exception a
// handler throws. The callback lives as long as a result holds it.
#ifndef ZEL_CHECKINUPDATECB_H
#define ZEL_CHECKINUPDATECB_H

#include "zel_export.h"
#include "Orv_ResultsCB.h"

#include <boost/shared_ptr.hpp>

class Zel_Error;

class ZEL_EXPORT Zel_CheckinUpdateCB : public Orv_ResultsCB
{
public:
    Zel_CheckinUpdateCB();
    Zel_CheckinUpdateCB(const Zel_CheckinUpdateCB& other);
    virtual ~Zel_CheckinUpdateCB();

    // One update succeeded.
    virtual void succeeded() = 0;
    // One answer that is an error: its error record.
    virtual void failed(boost::shared_ptr<Zel_Error> error) = 0;
    // The request has delivered its last answer.
    virtual void finished() = 0;

private:
    Zel_CheckinUpdateCB& operator=(const Zel_CheckinUpdateCB&) = delete;
};

#endif
