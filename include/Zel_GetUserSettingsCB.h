// Zel_GetUserSettingsCB: the callback of Zel_GetUserSettingsReq, answered by
// Zel_GetUserSettingsRes with the kind of user settings and their text.
// UserSettingsType is a 32-bit value that the result stores and hands over
// unchanged; values other than the named ones pass through as well.
//
// The application derives from it, implements the handlers and gives it, under
// a boost::shared_ptr, to the request; the result calls one handler per answer
// on the engine's delivery thread and catches and discards any exception a
// handler throws. The callback lives as long as a result holds it.
#ifndef ZEL_GETUSERSETTINGSCB_H
#define ZEL_GETUSERSETTINGSCB_H

#include "zel_export.h"
#include "Orv_ResultsCB.h"

#include <QString>
#include <boost/shared_ptr.hpp>

class Zel_Error;

class ZEL_EXPORT Zel_GetUserSettingsCB : public Orv_ResultsCB
{
public:
    // The kind of user settings an answer carries.
    enum UserSettingsType : qint32 {
        UserSettingsUnknown = -1,
        UserSettingsGeneral = 0,
        UserSettingsProject = 1,
        UserSettingsSite = 2
    };

    Zel_GetUserSettingsCB();
    Zel_GetUserSettingsCB(const Zel_GetUserSettingsCB& other);
    virtual ~Zel_GetUserSettingsCB();

    // One answer: the kind of settings and their text.
    virtual void succeeded(UserSettingsType type, QString settings) = 0;
    // One answer that is an error: its error record.
    virtual void failed(boost::shared_ptr<Zel_Error> error) = 0;
    // The request has delivered its last answer.
    virtual void finished() = 0;

private:
    Zel_GetUserSettingsCB& operator=(const Zel_GetUserSettingsCB&) = delete;
};

#endif
