// Zel_AddFrameRestrictionListReq: the request named "Zel_AddFrameRestrictionListReq".
//
// Fixes the operation's name and place in the class tree; it carries no
// parameters and no work. A backend derives from it, adds the operation's
// parameters and implements doProcess().
// Answered through Zel_FrameRestrictionListCB, by a result class of the backend.
#ifndef ZEL_ADDFRAMERESTRICTIONLISTREQ_H
#define ZEL_ADDFRAMERESTRICTIONLISTREQ_H

#include "zel_export.h"
#include "Zel_Req.h"

#include <boost/shared_ptr.hpp>

class Orv_ResultsCB;

class ZEL_EXPORT Zel_AddFrameRestrictionListReq : public Zel_Req
{
public:
    explicit Zel_AddFrameRestrictionListReq(boost::shared_ptr<Orv_ResultsCB> callback);
    Zel_AddFrameRestrictionListReq(const Zel_AddFrameRestrictionListReq& other);
    virtual ~Zel_AddFrameRestrictionListReq();

private:
    Zel_AddFrameRestrictionListReq& operator=(const Zel_AddFrameRestrictionListReq&) = delete;
};

#endif
