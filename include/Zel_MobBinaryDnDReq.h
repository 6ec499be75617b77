// Zel_MobBinaryDnDReq: the request named "Zel_MobBinaryDnDReq".
//
// Fixes the operation's name and place in the class tree; it carries no
// parameters and no work. A backend derives from it, adds the operation's
// parameters and implements doProcess().
// Answered through Zel_MobBinaryDnDCB, by a result class of the backend.
#ifndef ZEL_MOBBINARYDNDREQ_H
#define ZEL_MOBBINARYDNDREQ_H

#include "zel_export.h"
#include "Zel_Req.h"

#include <boost/shared_ptr.hpp>

class Orv_ResultsCB;

class ZEL_EXPORT Zel_MobBinaryDnDReq : public Zel_Req
{
public:
    explicit Zel_MobBinaryDnDReq(boost::shared_ptr<Orv_ResultsCB> callback);
    Zel_MobBinaryDnDReq(const Zel_MobBinaryDnDReq& other);
    virtual ~Zel_MobBinaryDnDReq();

private:
    Zel_MobBinaryDnDReq& operator=(const Zel_MobBinaryDnDReq&) = delete;
};

#endif
