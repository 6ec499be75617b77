// Zel_AddDependencyReq: the request named "Zel_AddDependencyReq".
//
// Fixes the operation's name and place in the class tree; it carries no
// parameters and no work. A backend derives from it, adds the operation's
// parameters and implements doProcess().
// Answered through Zel_DependencyCB by a Zel_AddDependencyRes.
#ifndef ZEL_ADDDEPENDENCYREQ_H
#define ZEL_ADDDEPENDENCYREQ_H

#include "zel_export.h"
#include "Zel_Req.h"

#include <boost/shared_ptr.hpp>

class Orv_ResultsCB;

class ZEL_EXPORT Zel_AddDependencyReq : public Zel_Req
{
public:
    explicit Zel_AddDependencyReq(boost::shared_ptr<Orv_ResultsCB> callback);
    Zel_AddDependencyReq(const Zel_AddDependencyReq& other);
    virtual ~Zel_AddDependencyReq();

private:
    Zel_AddDependencyReq& operator=(const Zel_AddDependencyReq&) = delete;
};

#endif
