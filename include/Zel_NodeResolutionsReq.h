// Zel_NodeResolutionsReq: the request named "Zel_NodeResolutionsReq".
//
// Fixes the operation's name and place in the class tree; it carries no
// parameters and no work. A backend derives from it, adds the operation's
// parameters and implements doProcess().
// Answered through Zel_NodeResolutionsCB by a Zel_NodeResolutionsRes.
#ifndef ZEL_NODERESOLUTIONSREQ_H
#define ZEL_NODERESOLUTIONSREQ_H

#include "zel_export.h"
#include "Zel_Req.h"

#include <boost/shared_ptr.hpp>

class Orv_ResultsCB;

class ZEL_EXPORT Zel_NodeResolutionsReq : public Zel_Req
{
public:
    explicit Zel_NodeResolutionsReq(boost::shared_ptr<Orv_ResultsCB> callback);
    Zel_NodeResolutionsReq(const Zel_NodeResolutionsReq& other);
    virtual ~Zel_NodeResolutionsReq();

private:
    Zel_NodeResolutionsReq& operator=(const Zel_NodeResolutionsReq&) = delete;
};

#endif
