// Zel_StartupReq: the request named "Zel_StartupReq".
//
// Fixes the operation's name and place in the class tree; it carries no
// parameters and no work. A backend derives from it, adds the operation's
// parameters and implements doProcess().
// Answered through Zel_StartupCB by a Zel_StartupRes.
#ifndef ZEL_STARTUPREQ_H
#define ZEL_STARTUPREQ_H

#include "zel_export.h"
#include "Zel_Req.h"

#include <boost/shared_ptr.hpp>

class Orv_ResultsCB;

class ZEL_EXPORT Zel_StartupReq : public Zel_Req
{
public:
    explicit Zel_StartupReq(boost::shared_ptr<Orv_ResultsCB> callback);
    Zel_StartupReq(const Zel_StartupReq& other);
    virtual ~Zel_StartupReq();

private:
    Zel_StartupReq& operator=(const Zel_StartupReq&) = delete;
};

#endif
