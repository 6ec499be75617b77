// Zel_RenameNodeReq: the request named "Zel_RenameNodeReq".
//
// Fixes the operation's name and place in the class tree; it carries no
// parameters and no work. A backend derives from it, adds the operation's
// parameters and implements doProcess().
// Answered through Zel_RenameNodeCB, by a result class of the backend.
#ifndef ZEL_RENAMENODEREQ_H
#define ZEL_RENAMENODEREQ_H

#include "zel_export.h"
#include "Zel_Req.h"

#include <boost/shared_ptr.hpp>

class Orv_ResultsCB;

class ZEL_EXPORT Zel_RenameNodeReq : public Zel_Req
{
public:
    explicit Zel_RenameNodeReq(boost::shared_ptr<Orv_ResultsCB> callback);
    Zel_RenameNodeReq(const Zel_RenameNodeReq& other);
    virtual ~Zel_RenameNodeReq();

private:
    Zel_RenameNodeReq& operator=(const Zel_RenameNodeReq&) = delete;
};

#endif
