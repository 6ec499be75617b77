// Zel_GetSettingsCB: the callback of Zel_GetSettingsReq. The settings arrive
// as one text (the XML form of a settings list).
//
// The application derives from it, implements the handlers and gives it, under
// a boost::shared_ptr, to the request. The request is answered by a result
// class of the backend, which calls one handler per answer (failed for an
// error record that reports an error, finished after the last answer of the
// request) on the engine's delivery thread.
#ifndef ZEL_GETSETTINGSCB_H
#define ZEL_GETSETTINGSCB_H

#include "zel_export.h"
#include "Orv_ResultsCB.h"

#include <QString>
#include <boost/shared_ptr.hpp>

class Zel_Error;

class ZEL_EXPORT Zel_GetSettingsCB : public Orv_ResultsCB
{
public:
    Zel_GetSettingsCB();
    Zel_GetSettingsCB(const Zel_GetSettingsCB& other);
    virtual ~Zel_GetSettingsCB();

    // One answer: the settings text.
    virtual void succeeded(QString settings) = 0;
    // One answer that is an error: its error record.
    virtual void failed(boost::shared_ptr<Zel_Error> error) = 0;
    // The request has delivered its last answer.
    virtual void finished() = 0;

private:
    Zel_GetSettingsCB& operator=(const Zel_GetSettingsCB&) = delete;
};

#endif
