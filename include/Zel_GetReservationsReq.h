// Zel_GetReservationsReq: the request named "Zel_GetReservationsReq".
//
// Fixes the operation's name and place in the class tree; it carries no
// parameters and no work. A backend derives from it, adds the operation's
// parameters and implements doProcess().
// Answered through Zel_GetReservationsCB by a Zel_GetReservationsRes.
#ifndef ZEL_GETRESERVATIONSREQ_H
#define ZEL_GETRESERVATIONSREQ_H

#include "zel_export.h"
#include "Zel_Req.h"

#include <boost/shared_ptr.hpp>

class Orv_ResultsCB;

class ZEL_EXPORT Zel_GetReservationsReq : public Zel_Req
{
public:
    explicit Zel_GetReservationsReq(boost::shared_ptr<Orv_ResultsCB> callback);
    Zel_GetReservationsReq(const Zel_GetReservationsReq& other);
    virtual ~Zel_GetReservationsReq();

private:
    Zel_GetReservationsReq& operator=(const Zel_GetReservationsReq&) = delete;
};

#endif
