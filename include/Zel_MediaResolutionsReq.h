// Zel_MediaResolutionsReq: the request named "Zel_MediaResolutionsReq".
//
// Fixes the operation's name and place in the class tree; it carries no
// parameters and no work. A backend derives from it, adds the operation's
// parameters and implements doProcess().
// Answered through Zel_MediaResolutionsCB by a Zel_MediaResolutionsRes.
#ifndef ZEL_MEDIARESOLUTIONSREQ_H
#define ZEL_MEDIARESOLUTIONSREQ_H

#include "zel_export.h"
#include "Zel_Req.h"

#include <boost/shared_ptr.hpp>

class Orv_ResultsCB;

class ZEL_EXPORT Zel_MediaResolutionsReq : public Zel_Req
{
public:
    explicit Zel_MediaResolutionsReq(boost::shared_ptr<Orv_ResultsCB> callback);
    Zel_MediaResolutionsReq(const Zel_MediaResolutionsReq& other);
    virtual ~Zel_MediaResolutionsReq();

private:
    Zel_MediaResolutionsReq& operator=(const Zel_MediaResolutionsReq&) = delete;
};

#endif
