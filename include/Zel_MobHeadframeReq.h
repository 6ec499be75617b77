// Zel_MobHeadframeReq: the request named "Zel_MobHeadframeReq".
//
// Fixes the operation's name and place in the class tree; it carries no
// parameters and no work. A backend derives from it, adds the operation's
// parameters and implements doProcess().
// Answered through Zel_MobHeadframeCB, by a result class of the backend.
#ifndef ZEL_MOBHEADFRAMEREQ_H
#define ZEL_MOBHEADFRAMEREQ_H

#include "zel_export.h"
#include "Zel_Req.h"

#include <boost/shared_ptr.hpp>

class Orv_ResultsCB;

class ZEL_EXPORT Zel_MobHeadframeReq : public Zel_Req
{
public:
    explicit Zel_MobHeadframeReq(boost::shared_ptr<Orv_ResultsCB> callback);
    Zel_MobHeadframeReq(const Zel_MobHeadframeReq& other);
    virtual ~Zel_MobHeadframeReq();

private:
    Zel_MobHeadframeReq& operator=(const Zel_MobHeadframeReq&) = delete;
};

#endif
