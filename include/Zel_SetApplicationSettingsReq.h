// Zel_SetApplicationSettingsReq: the request named "Zel_SetApplicationSettingsReq".
//
// Fixes the operation's name and place in the class tree; it carries no
// parameters and no work. A backend derives from it, adds the operation's
// parameters and implements doProcess().
// Answered through Zel_SetApplicationSettingsCB by a Zel_SetApplicationSettingsRes.
#ifndef ZEL_SETAPPLICATIONSETTINGSREQ_H
#define ZEL_SETAPPLICATIONSETTINGSREQ_H

#include "zel_export.h"
#include "Zel_Req.h"

#include <boost/shared_ptr.hpp>

class Orv_ResultsCB;

class ZEL_EXPORT Zel_SetApplicationSettingsReq : public Zel_Req
{
public:
    explicit Zel_SetApplicationSettingsReq(boost::shared_ptr<Orv_ResultsCB> callback);
    Zel_SetApplicationSettingsReq(const Zel_SetApplicationSettingsReq& other);
    virtual ~Zel_SetApplicationSettingsReq();

private:
    Zel_SetApplicationSettingsReq& operator=(const Zel_SetApplicationSettingsReq&) = delete;
};

#endif
