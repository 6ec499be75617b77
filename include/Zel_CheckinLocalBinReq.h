// Zel_CheckinLocalBinReq: the request named "Zel_CheckinLocalBinReq".
//
// Fixes the operation's name and place in the class tree; it carries no
// parameters and no work. A backend derives from it, adds the operation's
// parameters and implements doProcess().
// Answered through a callback and result of the backend's choosing.
#ifndef ZEL_CHECKINLOCALBINREQ_H
#define ZEL_CHECKINLOCALBINREQ_H

#include "zel_export.h"
#include "Zel_Req.h"

#include <boost/shared_ptr.hpp>

class Orv_ResultsCB;

class ZEL_EXPORT Zel_CheckinLocalBinReq : public Zel_Req
{
public:
    explicit Zel_CheckinLocalBinReq(boost::shared_ptr<Orv_ResultsCB> callback);
    Zel_CheckinLocalBinReq(const Zel_CheckinLocalBinReq& other);
    virtual ~Zel_CheckinLocalBinReq();

private:
    Zel_CheckinLocalBinReq& operator=(const Zel_CheckinLocalBinReq&) = delete;
};

#endif
