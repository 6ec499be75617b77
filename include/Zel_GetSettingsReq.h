// Zel_GetSettingsReq: the request named "Zel_GetSettingsReq".
//
// Fixes the operation's name and place in the class tree; it carries no
// parameters and no work. A backend derives from it, adds the operation's
// parameters and implements doProcess().
// Answered through Zel_GetSettingsCB, by a result class of the backend.
#ifndef ZEL_GETSETTINGSREQ_H
#define ZEL_GETSETTINGSREQ_H

#include "zel_export.h"
#include "Zel_Req.h"

#include <boost/shared_ptr.hpp>

class Orv_ResultsCB;

class ZEL_EXPORT Zel_GetSettingsReq : public Zel_Req
{
public:
    explicit Zel_GetSettingsReq(boost::shared_ptr<Orv_ResultsCB> callback);
    Zel_GetSettingsReq(const Zel_GetSettingsReq& other);
    virtual ~Zel_GetSettingsReq();

private:
    Zel_GetSettingsReq& operator=(const Zel_GetSettingsReq&) = delete;
};

#endif
