// Zel_PropertyListReq: the request named "Zel_PropertyListReq".
//
// Fixes the operation's name and place in the class tree; it carries no
// parameters and no work. A backend derives from it, adds the operation's
// parameters and implements doProcess().
// Answered through Zel_PropertyListCB, by a result class of the backend.
#ifndef ZEL_PROPERTYLISTREQ_H
#define ZEL_PROPERTYLISTREQ_H

#include "zel_export.h"
#include "Zel_Req.h"

#include <boost/shared_ptr.hpp>

class Orv_ResultsCB;

class ZEL_EXPORT Zel_PropertyListReq : public Zel_Req
{
public:
    explicit Zel_PropertyListReq(boost::shared_ptr<Orv_ResultsCB> callback);
    Zel_PropertyListReq(const Zel_PropertyListReq& other);
    virtual ~Zel_PropertyListReq();

private:
    Zel_PropertyListReq& operator=(const Zel_PropertyListReq&) = delete;
};

#endif
