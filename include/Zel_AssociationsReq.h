// Zel_AssociationsReq: the request named "Zel_AssociationsReq".
//
// Fixes the operation's name and place in the class tree; it carries no
// parameters and no work. A backend derives from it, adds the operation's
// parameters and implements doProcess().
// Answered through Zel_AssociationsCB by a Zel_AssociationsRes.
#ifndef ZEL_ASSOCIATIONSREQ_H
#define ZEL_ASSOCIATIONSREQ_H

#include "zel_export.h"
#include "Zel_Req.h"

#include <boost/shared_ptr.hpp>

class Orv_ResultsCB;

class ZEL_EXPORT Zel_AssociationsReq : public Zel_Req
{
public:
    explicit Zel_AssociationsReq(boost::shared_ptr<Orv_ResultsCB> callback);
    Zel_AssociationsReq(const Zel_AssociationsReq& other);
    virtual ~Zel_AssociationsReq();

private:
    Zel_AssociationsReq& operator=(const Zel_AssociationsReq&) = delete;
};

#endif
