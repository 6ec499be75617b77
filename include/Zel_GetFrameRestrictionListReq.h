// Zel_GetFrameRestrictionListReq: the request named "Zel_GetFrameRestrictionListReq".
//
// Fixes the operation's name and place in the class tree; it carries no
// parameters and no work. A backend derives from it, adds the operation's
// parameters and implements doProcess().
// Answered through Zel_FrameRestrictionListCB, by a result class of the backend.
#ifndef ZEL_GETFRAMERESTRICTIONLISTREQ_H
#define ZEL_GETFRAMERESTRICTIONLISTREQ_H

#include "zel_export.h"
#include "Zel_Req.h"

#include <boost/shared_ptr.hpp>

class Orv_ResultsCB;

class ZEL_EXPORT Zel_GetFrameRestrictionListReq : public Zel_Req
{
public:
    explicit Zel_GetFrameRestrictionListReq(boost::shared_ptr<Orv_ResultsCB> callback);
    Zel_GetFrameRestrictionListReq(const Zel_GetFrameRestrictionListReq& other);
    virtual ~Zel_GetFrameRestrictionListReq();

private:
    Zel_GetFrameRestrictionListReq& operator=(const Zel_GetFrameRestrictionListReq&) = delete;
};

#endif
