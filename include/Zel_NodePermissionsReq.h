// Zel_NodePermissionsReq: the request named "Zel_NodePermissionsReq".
//
// Fixes the operation's name and place in the class tree; it carries no
// parameters and no work. A backend derives from it, adds the operation's
// parameters and implements doProcess().
// Answered through Zel_NodePermissionsCB by a Zel_NodePermissionsRes.
#ifndef ZEL_NODEPERMISSIONSREQ_H
#define ZEL_NODEPERMISSIONSREQ_H

#include "zel_export.h"
#include "Zel_Req.h"

#include <boost/shared_ptr.hpp>

class Orv_ResultsCB;

class ZEL_EXPORT Zel_NodePermissionsReq : public Zel_Req
{
public:
    explicit Zel_NodePermissionsReq(boost::shared_ptr<Orv_ResultsCB> callback);
    Zel_NodePermissionsReq(const Zel_NodePermissionsReq& other);
    virtual ~Zel_NodePermissionsReq();

private:
    Zel_NodePermissionsReq& operator=(const Zel_NodePermissionsReq&) = delete;
};

#endif
