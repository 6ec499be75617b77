// Zel_GetReservationsCB: the callback of Zel_GetReservationsReq, answered by
// Zel_GetReservationsRes with one text and one date-time per reservation, as
// the backend gives them.
//
// The application derives from it, implements the handlers and gives it, under
// a boost::shared_ptr, to the request; the result calls one handler per answer
// on the engine's delivery thread and catches and discards any exception a
// handler throws. The callback lives as long as a result holds it.
#ifndef ZEL_GETRESERVATIONSCB_H
#define ZEL_GETRESERVATIONSCB_H

#include "zel_export.h"
#include "Orv_ResultsCB.h"

#include <QDateTime>
#include <QString>
#include <boost/shared_ptr.hpp>

class Zel_Error;

class ZEL_EXPORT Zel_GetReservationsCB : public Orv_ResultsCB
{
public:
    Zel_GetReservationsCB();
    Zel_GetReservationsCB(const Zel_GetReservationsCB& other);
    virtual ~Zel_GetReservationsCB();

    // One reservation: its text and its date-time.
    virtual void succeeded(QString text, QDateTime dateTime) = 0;
    // One answer that is an error: its error record.
    virtual void failed(boost::shared_ptr<Zel_Error> error) = 0;
    // The request has delivered its last answer.
    virtual void finished() = 0;

private:
    Zel_GetReservationsCB& operator=(const Zel_GetReservationsCB&) = delete;
};

#endif
