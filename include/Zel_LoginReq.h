// Zel_LoginReq: the request named "Zel_LoginReq".
//
// Fixes the operation's name and place in the class tree; it carries no
// parameters and no work. A backend derives from it, adds the operation's
// parameters and implements process() itself (this request goes through no trace lines).
// Answered through Zel_LoginCB, by a result class of the backend.
#ifndef ZEL_LOGINREQ_H
#define ZEL_LOGINREQ_H

#include "zel_export.h"
#include "Orv_Request.h"

#include <boost/shared_ptr.hpp>

class Orv_ResultsCB;

class ZEL_EXPORT Zel_LoginReq : public Orv_Request
{
public:
    explicit Zel_LoginReq(boost::shared_ptr<Orv_ResultsCB> callback);
    Zel_LoginReq(const Zel_LoginReq& other);
    virtual ~Zel_LoginReq();

private:
    Zel_LoginReq& operator=(const Zel_LoginReq&) = delete;
};

#endif
