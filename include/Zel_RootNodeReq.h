// Zel_RootNodeReq: the request named "Zel_RootNodeReq".
//
// Fixes the operation's name and place in the class tree; it carries no
// parameters and no work. A backend derives from it, adds the operation's
// parameters and implements process() itself (this request goes through no trace lines).
// Answered through Zel_RootNodeCB, by a result class of the backend.
#ifndef ZEL_ROOTNODEREQ_H
#define ZEL_ROOTNODEREQ_H

#include "zel_export.h"
#include "Orv_Request.h"

#include <boost/shared_ptr.hpp>

class Orv_ResultsCB;

class ZEL_EXPORT Zel_RootNodeReq : public Orv_Request
{
public:
    explicit Zel_RootNodeReq(boost::shared_ptr<Orv_ResultsCB> callback);
    Zel_RootNodeReq(const Zel_RootNodeReq& other);
    virtual ~Zel_RootNodeReq();

private:
    Zel_RootNodeReq& operator=(const Zel_RootNodeReq&) = delete;
};

#endif
