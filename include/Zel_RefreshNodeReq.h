// Zel_RefreshNodeReq: the request named "Zel_RefreshNodeReq".
//
// Fixes the operation's name and place in the class tree; it carries no
// parameters and no work. A backend derives from it, adds the operation's
// parameters and implements doProcess().
// Answered through Zel_RefreshNodeCB, by a result class of the backend.
#ifndef ZEL_REFRESHNODEREQ_H
#define ZEL_REFRESHNODEREQ_H

#include "zel_export.h"
#include "Zel_Req.h"

#include <boost/shared_ptr.hpp>

class Orv_ResultsCB;

class ZEL_EXPORT Zel_RefreshNodeReq : public Zel_Req
{
public:
    explicit Zel_RefreshNodeReq(boost::shared_ptr<Orv_ResultsCB> callback);
    Zel_RefreshNodeReq(const Zel_RefreshNodeReq& other);
    virtual ~Zel_RefreshNodeReq();

private:
    Zel_RefreshNodeReq& operator=(const Zel_RefreshNodeReq&) = delete;
};

#endif
