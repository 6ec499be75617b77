// Zel_GetChildrenReq: the request named "Zel_GetChildrenReq".
//
// Fixes the operation's name and place in the class tree; it carries no
// parameters and no work. A backend derives from it, adds the operation's
// parameters and implements doProcess().
// Answered through Zel_ResultCB by a Zel_GetChildrenRes.
#ifndef ZEL_GETCHILDRENREQ_H
#define ZEL_GETCHILDRENREQ_H

#include "zel_export.h"
#include "Zel_Req.h"

#include <boost/shared_ptr.hpp>

class Orv_ResultsCB;

class ZEL_EXPORT Zel_GetChildrenReq : public Zel_Req
{
public:
    explicit Zel_GetChildrenReq(boost::shared_ptr<Orv_ResultsCB> callback);
    Zel_GetChildrenReq(const Zel_GetChildrenReq& other);
    virtual ~Zel_GetChildrenReq();

private:
    Zel_GetChildrenReq& operator=(const Zel_GetChildrenReq&) = delete;
};

#endif
