// Zel_AddFrameLocatorListReq: the request named "Zel_AddFrameLocatorListReq".
//
// Fixes the operation's name and place in the class tree; it carries no
// parameters and no work. A backend derives from it, adds the operation's
// parameters and implements doProcess().
// Answered through Zel_FrameLocatorListCB, by a result class of the backend.
#ifndef ZEL_ADDFRAMELOCATORLISTREQ_H
#define ZEL_ADDFRAMELOCATORLISTREQ_H

#include "zel_export.h"
#include "Zel_Req.h"

#include <boost/shared_ptr.hpp>

class Orv_ResultsCB;

class ZEL_EXPORT Zel_AddFrameLocatorListReq : public Zel_Req
{
public:
    explicit Zel_AddFrameLocatorListReq(boost::shared_ptr<Orv_ResultsCB> callback);
    Zel_AddFrameLocatorListReq(const Zel_AddFrameLocatorListReq& other);
    virtual ~Zel_AddFrameLocatorListReq();

private:
    Zel_AddFrameLocatorListReq& operator=(const Zel_AddFrameLocatorListReq&) = delete;
};

#endif
