// Zel_GetApplicationSettingsReq: the request named "Zel_GetApplicationSettingsReq".
//
// Fixes the operation's name and place in the class tree; it carries no
// parameters and no work. A backend derives from it, adds the operation's
// parameters and implements doProcess().
// Answered through Zel_GetApplicationSettingsCB by a Zel_GetApplicationSettingsRes.
#ifndef ZEL_GETAPPLICATIONSETTINGSREQ_H
#define ZEL_GETAPPLICATIONSETTINGSREQ_H

#include "zel_export.h"
#include "Zel_Req.h"

#include <boost/shared_ptr.hpp>

class Orv_ResultsCB;

class ZEL_EXPORT Zel_GetApplicationSettingsReq : public Zel_Req
{
public:
    explicit Zel_GetApplicationSettingsReq(boost::shared_ptr<Orv_ResultsCB> callback);
    Zel_GetApplicationSettingsReq(const Zel_GetApplicationSettingsReq& other);
    virtual ~Zel_GetApplicationSettingsReq();

private:
    Zel_GetApplicationSettingsReq& operator=(const Zel_GetApplicationSettingsReq&) = delete;
};

#endif
