// Zel_MoveNodeReq: the request named "Zel_MoveNodeReq".
//
// Fixes the operation's name and place in the class tree; it carries no
// parameters and no work. A backend derives from it, adds the operation's
// parameters and implements doProcess().
// Answered through Zel_MoveNodeCB, by a result class of the backend.
#ifndef ZEL_MOVENODEREQ_H
#define ZEL_MOVENODEREQ_H

#include "zel_export.h"
#include "Zel_Req.h"

#include <boost/shared_ptr.hpp>

class Orv_ResultsCB;

class ZEL_EXPORT Zel_MoveNodeReq : public Zel_Req
{
public:
    explicit Zel_MoveNodeReq(boost::shared_ptr<Orv_ResultsCB> callback);
    Zel_MoveNodeReq(const Zel_MoveNodeReq& other);
    virtual ~Zel_MoveNodeReq();

private:
    Zel_MoveNodeReq& operator=(const Zel_MoveNodeReq&) = delete;
};

#endif
