// Zel_SetUserSettingsReq: the request named "Zel_SetUserSettingsReq".
//
// Fixes the operation's name and place in the class tree; it carries no
// parameters and no work. A backend derives from it, adds the operation's
// parameters and implements doProcess().
// Answered through Zel_SetUserSettingsCB by a Zel_SetUserSettingsRes.
#ifndef ZEL_SETUSERSETTINGSREQ_H
#define ZEL_SETUSERSETTINGSREQ_H

#include "zel_export.h"
#include "Zel_Req.h"

#include <boost/shared_ptr.hpp>

class Orv_ResultsCB;

class ZEL_EXPORT Zel_SetUserSettingsReq : public Zel_Req
{
public:
    explicit Zel_SetUserSettingsReq(boost::shared_ptr<Orv_ResultsCB> callback);
    Zel_SetUserSettingsReq(const Zel_SetUserSettingsReq& other);
    virtual ~Zel_SetUserSettingsReq();

private:
    Zel_SetUserSettingsReq& operator=(const Zel_SetUserSettingsReq&) = delete;
};

#endif
