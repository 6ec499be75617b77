// Zel_CreatePropertyReq: the request named "Zel_CreatePropertyReq".
//
// Fixes the operation's name and place in the class tree; it carries no
// parameters and no work. A backend derives from it, adds the operation's
// parameters and implements doProcess().
// Answered through Zel_CreatePropertyCB, by a result class of the backend.
#ifndef ZEL_CREATEPROPERTYREQ_H
#define ZEL_CREATEPROPERTYREQ_H

#include "zel_export.h"
#include "Zel_Req.h"

#include <boost/shared_ptr.hpp>

class Orv_ResultsCB;

class ZEL_EXPORT Zel_CreatePropertyReq : public Zel_Req
{
public:
    explicit Zel_CreatePropertyReq(boost::shared_ptr<Orv_ResultsCB> callback);
    Zel_CreatePropertyReq(const Zel_CreatePropertyReq& other);
    virtual ~Zel_CreatePropertyReq();

private:
    Zel_CreatePropertyReq& operator=(const Zel_CreatePropertyReq&) = delete;
};

#endif
