// Zel_ChildrenAtReq: the request named "Zel_ChildrenAtReq".
//
// Fixes the operation's name and place in the class tree; it carries no
// parameters and no work. A backend derives from it, adds the operation's
// parameters and implements doProcess().
// Answered through Zel_ChildrenAtCB, by a result class of the backend.
#ifndef ZEL_CHILDRENATREQ_H
#define ZEL_CHILDRENATREQ_H

#include "zel_export.h"
#include "Zel_Req.h"

#include <boost/shared_ptr.hpp>

class Orv_ResultsCB;

class ZEL_EXPORT Zel_ChildrenAtReq : public Zel_Req
{
public:
    explicit Zel_ChildrenAtReq(boost::shared_ptr<Orv_ResultsCB> callback);
    Zel_ChildrenAtReq(const Zel_ChildrenAtReq& other);
    virtual ~Zel_ChildrenAtReq();

private:
    Zel_ChildrenAtReq& operator=(const Zel_ChildrenAtReq&) = delete;
};

#endif
