// Zel_RemoveReservationCB: the callback of Zel_RemoveReservationReq, answered
// by Zel_RemoveReservationRes. Each answer only says whether the reservation
// was removed.
//
// The application derives from it, implements the handlers and gives it, under
// a boost::shared_ptr, to the request; the result calls one handler per answer
// on the engine's delivery thread and catches and discards any exception a
// handler throws. The callback lives as long as a result holds it.
#ifndef ZEL_REMOVERESERVATIONCB_H
#define ZEL_REMOVERESERVATIONCB_H

#include "zel_export.h"
#include "Orv_ResultsCB.h"

#include <boost/shared_ptr.hpp>

class Zel_Error;

class ZEL_EXPORT Zel_RemoveReservationCB : public Orv_ResultsCB
{
public:
    Zel_RemoveReservationCB();
    Zel_RemoveReservationCB(const Zel_RemoveReservationCB& other);
    virtual ~Zel_RemoveReservationCB();

    // One answer: the reservation was removed.
    virtual void succeeded() = 0;
    // One answer that is an error: its error record.
    virtual void failed(boost::shared_ptr<Zel_Error> error) = 0;
    // The request has delivered its last answer.
    virtual void finished() = 0;

private:
    Zel_RemoveReservationCB& operator=(const Zel_RemoveReservationCB&) = delete;
};

#endif
