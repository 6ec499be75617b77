// Zel_ChildrenReq: the request named "Zel_ChildrenReq".
//
// Fixes the operation's name and place in the class tree; it carries no
// parameters and no work. A backend derives from it, adds the operation's
// parameters and implements doProcess().
// Answered through Zel_ChildrenCB by a Zel_ChildrenRes.
#ifndef ZEL_CHILDRENREQ_H
#define ZEL_CHILDRENREQ_H

#include "zel_export.h"
#include "Zel_Req.h"

#include <boost/shared_ptr.hpp>

class Orv_ResultsCB;

class ZEL_EXPORT Zel_ChildrenReq : public Zel_Req
{
public:
    explicit Zel_ChildrenReq(boost::shared_ptr<Orv_ResultsCB> callback);
    Zel_ChildrenReq(const Zel_ChildrenReq& other);
    virtual ~Zel_ChildrenReq();

private:
    Zel_ChildrenReq& operator=(const Zel_ChildrenReq&) = delete;
};

#endif
