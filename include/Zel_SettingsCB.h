// Zel_SettingsCB: the callback answered by Zel_SettingsRes with settings as
// one text.
//
// The application derives from it, implements the handlers and gives it, under
// a boost::shared_ptr, to the request; the result calls one handler per answer
// on the engine's delivery thread and catches and discards any exception a
// handler throws. The callback lives as long as a result holds it.
#ifndef ZEL_SETTINGSCB_H
#define ZEL_SETTINGSCB_H

#include "zel_export.h"
#include "Orv_ResultsCB.h"

#include <QString>
#include <boost/shared_ptr.hpp>

class Zel_Error;

class ZEL_EXPORT Zel_SettingsCB : public Orv_ResultsCB
{
public:
    Zel_SettingsCB();
    Zel_SettingsCB(const Zel_SettingsCB& other);
    virtual ~Zel_SettingsCB();

    // One answer: the settings text.
    virtual void succeeded(QString settings) = 0;
    // One answer that is an error: its error record.
    virtual void failed(boost::shared_ptr<Zel_Error> error) = 0;
    // The request has delivered its last answer.
    virtual void finished() = 0;

private:
    Zel_SettingsCB& operator=(const Zel_SettingsCB&) = delete;
};

#endif
