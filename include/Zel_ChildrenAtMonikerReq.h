// Zel_ChildrenAtMonikerReq: the request named "Zel_ChildrenAtMonikerReq".
//
// Fixes the operation's name and place in the class tree; it carries no
// parameters and no work. A backend derives from it, adds the operation's
// parameters and implements doProcess().
// Answered through Zel_ChildrenAtMonikerCB, by a result class of the backend.
#ifndef ZEL_CHILDRENATMONIKERREQ_H
#define ZEL_CHILDRENATMONIKERREQ_H

#include "zel_export.h"
#include "Zel_Req.h"

#include <boost/shared_ptr.hpp>

class Orv_ResultsCB;

class ZEL_EXPORT Zel_ChildrenAtMonikerReq : public Zel_Req
{
public:
    explicit Zel_ChildrenAtMonikerReq(boost::shared_ptr<Orv_ResultsCB> callback);
    Zel_ChildrenAtMonikerReq(const Zel_ChildrenAtMonikerReq& other);
    virtual ~Zel_ChildrenAtMonikerReq();

private:
    Zel_ChildrenAtMonikerReq& operator=(const Zel_ChildrenAtMonikerReq&) = delete;
};

#endif
