// Zel_MobBinaryReq: the request named "Zel_MobBinaryReq".
//
// Fixes the operation's name and place in the class tree; it carries no
// parameters and no work. A backend derives from it, adds the operation's
// parameters and implements doProcess().
// Answered through Zel_MobBinaryCB, by a result class of the backend.
#ifndef ZEL_MOBBINARYREQ_H
#define ZEL_MOBBINARYREQ_H

#include "zel_export.h"
#include "Zel_Req.h"

#include <boost/shared_ptr.hpp>

class Orv_ResultsCB;

class ZEL_EXPORT Zel_MobBinaryReq : public Zel_Req
{
public:
    explicit Zel_MobBinaryReq(boost::shared_ptr<Orv_ResultsCB> callback);
    Zel_MobBinaryReq(const Zel_MobBinaryReq& other);
    virtual ~Zel_MobBinaryReq();

private:
    Zel_MobBinaryReq& operator=(const Zel_MobBinaryReq&) = delete;
};

#endif
