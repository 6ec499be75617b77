// Zel_DeleteFrameLocatorListReq: the request named "Zel_DeleteFrameLocatorListReq".
//
// Fixes the operation's name and place in the class tree; it carries no
// parameters and no work. A backend derives from it, adds the operation's
// parameters and implements doProcess().
// Answered through Zel_FrameLocatorListCB, by a result class of the backend.
#ifndef ZEL_DELETEFRAMELOCATORLISTREQ_H
#define ZEL_DELETEFRAMELOCATORLISTREQ_H

#include "zel_export.h"
#include "Zel_Req.h"

#include <boost/shared_ptr.hpp>

class Orv_ResultsCB;

class ZEL_EXPORT Zel_DeleteFrameLocatorListReq : public Zel_Req
{
public:
    explicit Zel_DeleteFrameLocatorListReq(boost::shared_ptr<Orv_ResultsCB> callback);
    Zel_DeleteFrameLocatorListReq(const Zel_DeleteFrameLocatorListReq& other);
    virtual ~Zel_DeleteFrameLocatorListReq();

private:
    Zel_DeleteFrameLocatorListReq& operator=(const Zel_DeleteFrameLocatorListReq&) = delete;
};

#endif
