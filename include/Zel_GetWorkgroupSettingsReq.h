// Zel_GetWorkgroupSettingsReq: the request named "Zel_GetWorkgroupSettingsReq".
//
// Fixes the operation's name and place in the class tree; it carries no
// parameters and no work. A backend derives from it, adds the operation's
// parameters and implements doProcess().
// Answered through a callback and result of the backend's choosing.
#ifndef ZEL_GETWORKGROUPSETTINGSREQ_H
#define ZEL_GETWORKGROUPSETTINGSREQ_H

#include "zel_export.h"
#include "Zel_Req.h"

#include <boost/shared_ptr.hpp>

class Orv_ResultsCB;

class ZEL_EXPORT Zel_GetWorkgroupSettingsReq : public Zel_Req
{
public:
    explicit Zel_GetWorkgroupSettingsReq(boost::shared_ptr<Orv_ResultsCB> callback);
    Zel_GetWorkgroupSettingsReq(const Zel_GetWorkgroupSettingsReq& other);
    virtual ~Zel_GetWorkgroupSettingsReq();

private:
    Zel_GetWorkgroupSettingsReq& operator=(const Zel_GetWorkgroupSettingsReq&) = delete;
};

#endif
