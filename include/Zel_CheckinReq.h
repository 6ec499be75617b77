// Zel_CheckinReq: the request named "Zel_CheckinReq".
//
// Fixes the operation's name and place in the class tree; it carries no
// parameters and no work. A backend derives from it, adds the operation's
// parameters and implements doProcess().
// Answered through Zel_CheckinCB by a Zel_CheckinRes.
#ifndef ZEL_CHECKINREQ_H
#define ZEL_CHECKINREQ_H

#include "zel_export.h"
#include "Zel_Req.h"

#include <boost/shared_ptr.hpp>

class Orv_ResultsCB;

class ZEL_EXPORT Zel_CheckinReq : public Zel_Req
{
public:
    explicit Zel_CheckinReq(boost::shared_ptr<Orv_ResultsCB> callback);
    Zel_CheckinReq(const Zel_CheckinReq& other);
    virtual ~Zel_CheckinReq();

private:
    Zel_CheckinReq& operator=(const Zel_CheckinReq&) = delete;
};

#endif
