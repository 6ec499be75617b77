// Zel_SetPropertiesReq: the request named "Zel_SetPropertiesReq".
//
// Fixes the operation's name and place in the class tree; it carries no
// parameters and no work. A backend derives from it, adds the operation's
// parameters and implements doProcess().
// Answered through Zel_SetPropertiesCB or Zel_ConditionalSetPropertiesCB, by a result class of the backend.
#ifndef ZEL_SETPROPERTIESREQ_H
#define ZEL_SETPROPERTIESREQ_H

#include "zel_export.h"
#include "Zel_Req.h"

#include <boost/shared_ptr.hpp>

class Orv_ResultsCB;

class ZEL_EXPORT Zel_SetPropertiesReq : public Zel_Req
{
public:
    explicit Zel_SetPropertiesReq(boost::shared_ptr<Orv_ResultsCB> callback);
    Zel_SetPropertiesReq(const Zel_SetPropertiesReq& other);
    virtual ~Zel_SetPropertiesReq();

private:
    Zel_SetPropertiesReq& operator=(const Zel_SetPropertiesReq&) = delete;
};

#endif
