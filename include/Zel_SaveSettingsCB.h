// Zel_SaveSettingsCB: the callback of Zel_SaveSettingsReq. Each answer only
// says whether the settings were saved.
//
// The application derives from it, implements the handlers and gives it, under
// a boost::shared_ptr, to the request. The request is answered by a result
// class of the backend, which calls one handler per answer (failed for an
// error record that reports an error, finished after the last answer of the
// request) on the engine's delivery thread.
#ifndef ZEL_SAVESETTINGSCB_H
#define ZEL_SAVESETTINGSCB_H

#include "zel_export.h"
#include "Orv_ResultsCB.h"

#include <boost/shared_ptr.hpp>

class Zel_Error;

class ZEL_EXPORT Zel_SaveSettingsCB : public Orv_ResultsCB
{
public:
    Zel_SaveSettingsCB();
    Zel_SaveSettingsCB(const Zel_SaveSettingsCB& other);
    virtual ~Zel_SaveSettingsCB();

    // One answer: the settings were saved.
    virtual void succeeded() = 0;
    // One answer that is an error: its error record.
    virtual void failed(boost::shared_ptr<Zel_Error> error) = 0;
    // The request has delivered its last answer.
    virtual void finished() = 0;

private:
    Zel_SaveSettingsCB& operator=(const Zel_SaveSettingsCB&) = delete;
};

#endif
