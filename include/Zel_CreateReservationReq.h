// Zel_CreateReservationReq: the request named "Zel_CreateReservationReq".
//
// Fixes the operation's name and place in the class tree; it carries no
// parameters and no work. A backend derives from it, adds the operation's
// parameters and implements doProcess().
// Answered through Zel_CreateReservationCB by a Zel_CreateReservationRes.
#ifndef ZEL_CREATERESERVATIONREQ_H
#define ZEL_CREATERESERVATIONREQ_H

#include "zel_export.h"
#include "Zel_Req.h"

#include <boost/shared_ptr.hpp>

class Orv_ResultsCB;

class ZEL_EXPORT Zel_CreateReservationReq : public Zel_Req
{
public:
    explicit Zel_CreateReservationReq(boost::shared_ptr<Orv_ResultsCB> callback);
    Zel_CreateReservationReq(const Zel_CreateReservationReq& other);
    virtual ~Zel_CreateReservationReq();

private:
    Zel_CreateReservationReq& operator=(const Zel_CreateReservationReq&) = delete;
};

#endif
