// Zel_GetUserSettingsReq: the request named "Zel_GetUserSettingsReq".
//
// Fixes the operation's name and place in the class tree; it carries no
// parameters and no work. A backend derives from it, adds the operation's
// parameters and implements doProcess().
// Answered through Zel_GetUserSettingsCB by a Zel_GetUserSettingsRes.
#ifndef ZEL_GETUSERSETTINGSREQ_H
#define ZEL_GETUSERSETTINGSREQ_H

#include "zel_export.h"
#include "Zel_Req.h"

#include <boost/shared_ptr.hpp>

class Orv_ResultsCB;

class ZEL_EXPORT Zel_GetUserSettingsReq : public Zel_Req
{
public:
    explicit Zel_GetUserSettingsReq(boost::shared_ptr<Orv_ResultsCB> callback);
    Zel_GetUserSettingsReq(const Zel_GetUserSettingsReq& other);
    virtual ~Zel_GetUserSettingsReq();

private:
    Zel_GetUserSettingsReq& operator=(const Zel_GetUserSettingsReq&) = delete;
};

#endif
