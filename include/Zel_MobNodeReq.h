// Zel_MobNodeReq: the request named "Zel_MobNodeReq".
//
// Fixes the operation's name and place in the class tree; it carries no
// parameters and no work. A backend derives from it, adds the operation's
// parameters and implements doProcess().
// Answered through Zel_MobNodeCB, by a result class of the backend.
#ifndef ZEL_MOBNODEREQ_H
#define ZEL_MOBNODEREQ_H

#include "zel_export.h"
#include "Zel_Req.h"

#include <boost/shared_ptr.hpp>

class Orv_ResultsCB;

class ZEL_EXPORT Zel_MobNodeReq : public Zel_Req
{
public:
    explicit Zel_MobNodeReq(boost::shared_ptr<Orv_ResultsCB> callback);
    Zel_MobNodeReq(const Zel_MobNodeReq& other);
    virtual ~Zel_MobNodeReq();

private:
    Zel_MobNodeReq& operator=(const Zel_MobNodeReq&) = delete;
};

#endif
