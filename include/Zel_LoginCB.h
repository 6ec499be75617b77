// Zel_LoginCB: the callback of Zel_LoginReq. One answer, the login's outcome,
// and no end notice.
//
// The application derives from it, implements the handlers and gives it, under
// a boost::shared_ptr, to the request. The request is answered by a result
// class of the backend, which calls one handler per answer (failed for an
// error record that reports an error) on the engine's delivery thread.
#ifndef ZEL_LOGINCB_H
#define ZEL_LOGINCB_H

#include "zel_export.h"
#include "Orv_ResultsCB.h"

#include <QString>
#include <boost/shared_ptr.hpp>

class Zel_Error;

class ZEL_EXPORT Zel_LoginCB : public Orv_ResultsCB
{
public:
    Zel_LoginCB();
    Zel_LoginCB(const Zel_LoginCB& other);
    virtual ~Zel_LoginCB();

    // Logged in: the name of the user the server knows.
    virtual void succeeded(QString userName) = 0;
    // The login failed: its error record.
    virtual void failed(boost::shared_ptr<Zel_Error> error) = 0;

private:
    Zel_LoginCB& operator=(const Zel_LoginCB&) = delete;
};

#endif
