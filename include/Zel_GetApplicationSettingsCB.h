// Zel_GetApplicationSettingsCB: the callback of Zel_GetApplicationSettingsReq,
// answered by Zel_GetApplicationSettingsRes with the application settings as
// one text.
//
// The application derives from it, implements the handlers and gives it, under
// a boost::shared_ptr, to the request; the result calls one handler per answer
// on the engine's delivery thread and catches and discards any exception a
// handler throws. The callback lives as long as a result holds it.
#ifndef ZEL_GETAPPLICATIONSETTINGSCB_H
#define ZEL_GETAPPLICATIONSETTINGSCB_H

#include "zel_export.h"
#include "Orv_ResultsCB.h"

#include <QString>
#include <boost/shared_ptr.hpp>

class Zel_Error;

class ZEL_EXPORT Zel_GetApplicationSettingsCB : public Orv_ResultsCB
{
public:
    Zel_GetApplicationSettingsCB();
    Zel_GetApplicationSettingsCB(const Zel_GetApplicationSettingsCB& other);
    virtual ~Zel_GetApplicationSettingsCB();

    // One answer: the settings text.
    virtual void succeeded(QString settings) = 0;
    // One answer that is an error: its error record.
    virtual void failed(boost::shared_ptr<Zel_Error> error) = 0;
    // The request has delivered its last answer.
    virtual void finished() = 0;

private:
    Zel_GetApplicationSettingsCB& operator=(const Zel_GetApplicationSettingsCB&) = delete;
};

#endif
