// Zel_GetFrameLocatorListReq: the request named "Zel_GetFrameLocatorListReq".
//
// Fixes the operation's name and place in the class tree; it carries no
// parameters and no work. A backend derives from it, adds the operation's
// parameters and implements doProcess().
// Answered through Zel_FrameLocatorListCB, by a result class of the backend.
#ifndef ZEL_GETFRAMELOCATORLISTREQ_H
#define ZEL_GETFRAMELOCATORLISTREQ_H

#include "zel_export.h"
#include "Zel_Req.h"

#include <boost/shared_ptr.hpp>

class Orv_ResultsCB;

class ZEL_EXPORT Zel_GetFrameLocatorListReq : public Zel_Req
{
public:
    explicit Zel_GetFrameLocatorListReq(boost::shared_ptr<Orv_ResultsCB> callback);
    Zel_GetFrameLocatorListReq(const Zel_GetFrameLocatorListReq& other);
    virtual ~Zel_GetFrameLocatorListReq();

private:
    Zel_GetFrameLocatorListReq& operator=(const Zel_GetFrameLocatorListReq&) = delete;
};

#endif
