// Zel_GetUserPriviledgesReq: the request named "Zel_GetUserPriviledgesReq".
//
// Fixes the operation's name and place in the class tree; it carries no
// parameters and no work. A backend derives from it, adds the operation's
// parameters and implements doProcess().
// Answered through a callback and result of the backend's choosing.
#ifndef ZEL_GETUSERPRIVILEDGESREQ_H
#define ZEL_GETUSERPRIVILEDGESREQ_H

#include "zel_export.h"
#include "Zel_Req.h"

#include <boost/shared_ptr.hpp>

class Orv_ResultsCB;

class ZEL_EXPORT Zel_GetUserPriviledgesReq : public Zel_Req
{
public:
    explicit Zel_GetUserPriviledgesReq(boost::shared_ptr<Orv_ResultsCB> callback);
    Zel_GetUserPriviledgesReq(const Zel_GetUserPriviledgesReq& other);
    virtual ~Zel_GetUserPriviledgesReq();

private:
    Zel_GetUserPriviledgesReq& operator=(const Zel_GetUserPriviledgesReq&) = delete;
};

#endif
