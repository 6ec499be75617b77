// Zel_DeleteReq: the request named "Zel_DeleteReq".
//
// Fixes the operation's name and place in the class tree; it carries no
// parameters and no work. A backend derives from it, adds the operation's
// parameters and implements doProcess().
// Answered through Zel_DeleteCB by a Zel_DeleteRes.
#ifndef ZEL_DELETEREQ_H
#define ZEL_DELETEREQ_H

#include "zel_export.h"
#include "Zel_Req.h"

#include <boost/shared_ptr.hpp>

class Orv_ResultsCB;

class ZEL_EXPORT Zel_DeleteReq : public Zel_Req
{
public:
    explicit Zel_DeleteReq(boost::shared_ptr<Orv_ResultsCB> callback);
    Zel_DeleteReq(const Zel_DeleteReq& other);
    virtual ~Zel_DeleteReq();

private:
    Zel_DeleteReq& operator=(const Zel_DeleteReq&) = delete;
};

#endif
