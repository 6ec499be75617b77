// Zel_CopyNodeReq: the request named "Zel_CopyNodeReq".
//
// Fixes the operation's name and place in the class tree; it carries no
// parameters and no work. A backend derives from it, adds the operation's
// parameters and implements doProcess().
// Answered through Zel_CopyNodeCB, by a result class of the backend.
#ifndef ZEL_COPYNODEREQ_H
#define ZEL_COPYNODEREQ_H

#include "zel_export.h"
#include "Zel_Req.h"

#include <boost/shared_ptr.hpp>

class Orv_ResultsCB;

class ZEL_EXPORT Zel_CopyNodeReq : public Zel_Req
{
public:
    explicit Zel_CopyNodeReq(boost::shared_ptr<Orv_ResultsCB> callback);
    Zel_CopyNodeReq(const Zel_CopyNodeReq& other);
    virtual ~Zel_CopyNodeReq();

private:
    Zel_CopyNodeReq& operator=(const Zel_CopyNodeReq&) = delete;
};

#endif
