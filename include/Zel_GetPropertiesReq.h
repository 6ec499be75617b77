// Zel_GetPropertiesReq: the request named "Zel_GetPropertiesReq".
//
// Fixes the operation's name and place in the class tree; it carries no
// parameters and no work. A backend derives from it, adds the operation's
// parameters and implements process() itself (this request goes through no trace lines).
// Answered through a callback and result of the backend's choosing.
#ifndef ZEL_GETPROPERTIESREQ_H
#define ZEL_GETPROPERTIESREQ_H

#include "zel_export.h"
#include "Orv_Request.h"

#include <boost/shared_ptr.hpp>

class Orv_ResultsCB;

class ZEL_EXPORT Zel_GetPropertiesReq : public Orv_Request
{
public:
    explicit Zel_GetPropertiesReq(boost::shared_ptr<Orv_ResultsCB> callback);
    Zel_GetPropertiesReq(const Zel_GetPropertiesReq& other);
    virtual ~Zel_GetPropertiesReq();

private:
    Zel_GetPropertiesReq& operator=(const Zel_GetPropertiesReq&) = delete;
};

#endif
