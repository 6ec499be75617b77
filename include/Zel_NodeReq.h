// Zel_NodeReq: the request named "Zel_NodeReq".
//
// Fixes the operation's name and place in the class tree; it carries no
// parameters and no work. A backend derives from it, adds the operation's
// parameters and implements doProcess().
// Answered through Zel_NodeCB, by a result class of the backend.
#ifndef ZEL_NODEREQ_H
#define ZEL_NODEREQ_H

#include "zel_export.h"
#include "Zel_Req.h"

#include <boost/shared_ptr.hpp>

class Orv_ResultsCB;

class ZEL_EXPORT Zel_NodeReq : public Zel_Req
{
public:
    explicit Zel_NodeReq(boost::shared_ptr<Orv_ResultsCB> callback);
    Zel_NodeReq(const Zel_NodeReq& other);
    virtual ~Zel_NodeReq();

private:
    Zel_NodeReq& operator=(const Zel_NodeReq&) = delete;
};

#endif
