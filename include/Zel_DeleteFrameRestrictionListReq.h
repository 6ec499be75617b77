// Zel_DeleteFrameRestrictionListReq: the request named "Zel_DeleteFrameRestrictionListReq".
//
// Fixes the operation's name and place in the class tree; it carries no
// parameters and no work. A backend derives from it, adds the operation's
// parameters and implements doProcess().
// Answered through Zel_FrameRestrictionListCB, by a result class of the backend.
#ifndef ZEL_DELETEFRAMERESTRICTIONLISTREQ_H
#define ZEL_DELETEFRAMERESTRICTIONLISTREQ_H

#include "zel_export.h"
#include "Zel_Req.h"

#include <boost/shared_ptr.hpp>

class Orv_ResultsCB;

class ZEL_EXPORT Zel_DeleteFrameRestrictionListReq : public Zel_Req
{
public:
    explicit Zel_DeleteFrameRestrictionListReq(boost::shared_ptr<Orv_ResultsCB> callback);
    Zel_DeleteFrameRestrictionListReq(const Zel_DeleteFrameRestrictionListReq& other);
    virtual ~Zel_DeleteFrameRestrictionListReq();

private:
    Zel_DeleteFrameRestrictionListReq& operator=(const Zel_DeleteFrameRestrictionListReq&) = delete;
};

#endif
