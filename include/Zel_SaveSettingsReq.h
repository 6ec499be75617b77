// Zel_SaveSettingsReq: the request named "Zel_SaveSettingsReq".
//
// Fixes the operation's name and place in the class tree; it carries no
// parameters and no work. A backend derives from it, adds the operation's
// parameters and implements doProcess().
// Answered through Zel_SaveSettingsCB, by a result class of the backend.
#ifndef ZEL_SAVESETTINGSREQ_H
#define ZEL_SAVESETTINGSREQ_H

#include "zel_export.h"
#include "Zel_Req.h"

#include <boost/shared_ptr.hpp>

class Orv_ResultsCB;

class ZEL_EXPORT Zel_SaveSettingsReq : public Zel_Req
{
public:
    explicit Zel_SaveSettingsReq(boost::shared_ptr<Orv_ResultsCB> callback);
    Zel_SaveSettingsReq(const Zel_SaveSettingsReq& other);
    virtual ~Zel_SaveSettingsReq();

private:
    Zel_SaveSettingsReq& operator=(const Zel_SaveSettingsReq&) = delete;
};

#endif
