// Zel_CheckinUpdateReq: the request named "Zel_CheckinUpdateReq".
//
// Fixes the operation's name and place in the class tree; it carries no
// parameters and no work. A backend derives from it, adds the operation's
// parameters and implements doProcess().
// Answered through Zel_CheckinUpdateCB by a Zel_CheckinUpdateRes.
#ifndef ZEL_CHECKINUPDATEREQ_H
#define ZEL_CHECKINUPDATEREQ_H

#include "zel_export.h"
#include "Zel_Req.h"

#include <boost/shared_ptr.hpp>

class Orv_ResultsCB;

class ZEL_EXPORT Zel_CheckinUpdateReq : public Zel_Req
{
public:
    explicit Zel_CheckinUpdateReq(boost::shared_ptr<Orv_ResultsCB> callback);
    Zel_CheckinUpdateReq(const Zel_CheckinUpdateReq& other);
    virtual ~Zel_CheckinUpdateReq();

private:
    Zel_CheckinUpdateReq& operator=(const Zel_CheckinUpdateReq&) = delete;
};

#endif
