// Zel_GetNodeReq: the request named "Zel_GetNodeReq".
//
// Fixes the operation's name and place in the class tree; it carries no
// parameters and no work. A backend derives from it, adds the operation's
// parameters and implements doProcess().
// Answered through Zel_ResultCB by a Zel_GetNodeRes.
#ifndef ZEL_GETNODEREQ_H
#define ZEL_GETNODEREQ_H

#include "zel_export.h"
#include "Zel_Req.h"

#include <boost/shared_ptr.hpp>

class Orv_ResultsCB;

class ZEL_EXPORT Zel_GetNodeReq : public Zel_Req
{
public:
    explicit Zel_GetNodeReq(boost::shared_ptr<Orv_ResultsCB> callback);
    Zel_GetNodeReq(const Zel_GetNodeReq& other);
    virtual ~Zel_GetNodeReq();

private:
    Zel_GetNodeReq& operator=(const Zel_GetNodeReq&) = delete;
};

#endif
