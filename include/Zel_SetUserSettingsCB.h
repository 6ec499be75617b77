// Zel_SetUserSettingsCB: the callback of Zel_SetUserSettingsReq, answered by
// Zel_SetUserSettingsRes: each answer only says whether the settings were
// stored.
//
// The application derives from it, implements the handlers and gives it, under
// a boost::shared_ptr, to the request; the result calls one handler per answer
// on the engine's delivery thread and catches and discards any exception a
// handler throws. The callback lives as long as a result holds it.
#ifndef ZEL_SETUSERSETTINGSCB_H
#define ZEL_SETUSERSETTINGSCB_H

#include "zel_export.h"
#include "Orv_ResultsCB.h"

#include <boost/shared_ptr.hpp>

class Zel_Error;

class ZEL_EXPORT Zel_SetUserSettingsCB : public Orv_ResultsCB
{
public:
    Zel_SetUserSettingsCB();
    Zel_SetUserSettingsCB(const Zel_SetUserSettingsCB& other);
    virtual ~Zel_SetUserSettingsCB();

    // One answer: the settings were stored.
    virtual void succeeded() = 0;
    // One answer that is an error: its error record.
    virtual void failed(boost::shared_ptr<Zel_Error> error) = 0;
    // The request has delivered its last answer.
    virtual void finished() = 0;

private:
    Zel_SetUserSettingsCB& operator=(const Zel_SetUserSettingsCB&) = delete;
};

#endif
