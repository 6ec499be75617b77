// Zel_DeleteNodeReq: the request named "Zel_DeleteNodeReq".
//
// Fixes the operation's name and place in the class tree; it carries no
// parameters and no work. A backend derives from it, adds the operation's
// parameters and implements doProcess().
// Answered through Zel_ResultBoolCB by a Zel_DeleteNodeRes.
#ifndef ZEL_DELETENODEREQ_H
#define ZEL_DELETENODEREQ_H

#include "zel_export.h"
#include "Zel_Req.h"

#include <boost/shared_ptr.hpp>

class Orv_ResultsCB;

class ZEL_EXPORT Zel_DeleteNodeReq : public Zel_Req
{
public:
    explicit Zel_DeleteNodeReq(boost::shared_ptr<Orv_ResultsCB> callback);
    Zel_DeleteNodeReq(const Zel_DeleteNodeReq& other);
    virtual ~Zel_DeleteNodeReq();

private:
    Zel_DeleteNodeReq& operator=(const Zel_DeleteNodeReq&) = delete;
};

#endif
