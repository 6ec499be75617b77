// Zel_LoginBriefCB: the brief form of the login callback: one answer that only
// says whether the login succeeded, and no end notice.
//
// The application derives from it, implements the handlers and gives it, under
// a boost::shared_ptr, to the request. The request is answered by a result
// class of the backend, which calls one handler per answer (failed for an
// error record that reports an error) on the engine's delivery thread.
#ifndef ZEL_LOGINBRIEFCB_H
#define ZEL_LOGINBRIEFCB_H

#include "zel_export.h"
#include "Orv_ResultsCB.h"

#include <boost/shared_ptr.hpp>

class Zel_Error;

class ZEL_EXPORT Zel_LoginBriefCB : public Orv_ResultsCB
{
public:
    Zel_LoginBriefCB();
    Zel_LoginBriefCB(const Zel_LoginBriefCB& other);
    virtual ~Zel_LoginBriefCB();

    // Logged in.
    virtual void succeeded() = 0;
    // The login failed: its error record.
    virtual void failed(boost::shared_ptr<Zel_Error> error) = 0;

private:
    Zel_LoginBriefCB& operator=(const Zel_LoginBriefCB&) = delete;
};

#endif
