// Zel_RemoveReservationReq: the request named "Zel_RemoveReservationReq".
//
// Fixes the operation's name and place in the class tree; it carries no
// parameters and no work. A backend derives from it, adds the operation's
// parameters and implements doProcess().
// Answered through Zel_RemoveReservationCB by a Zel_RemoveReservationRes.
#ifndef ZEL_REMOVERESERVATIONREQ_H
#define ZEL_REMOVERESERVATIONREQ_H

#include "zel_export.h"
#include "Zel_Req.h"

#include <boost/shared_ptr.hpp>

class Orv_ResultsCB;

class ZEL_EXPORT Zel_RemoveReservationReq : public Zel_Req
{
public:
    explicit Zel_RemoveReservationReq(boost::shared_ptr<Orv_ResultsCB> callback);
    Zel_RemoveReservationReq(const Zel_RemoveReservationReq& other);
    virtual ~Zel_RemoveReservationReq();

private:
    Zel_RemoveReservationReq& operator=(const Zel_RemoveReservationReq&) = delete;
};

#endif
