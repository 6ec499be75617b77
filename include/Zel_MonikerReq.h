// Zel_MonikerReq: the request named "Zel_MonikerReq".
//
// Fixes the operation's name and place in the class tree; it carries no
// parameters and no work. A backend derives from it, adds the operation's
// parameters and implements doProcess().
// Answered through Zel_MonikerCB, by a result class of the backend.
#ifndef ZEL_MONIKERREQ_H
#define ZEL_MONIKERREQ_H

#include "zel_export.h"
#include "Zel_Req.h"

#include <boost/shared_ptr.hpp>

class Orv_ResultsCB;

class ZEL_EXPORT Zel_MonikerReq : public Zel_Req
{
public:
    explicit Zel_MonikerReq(boost::shared_ptr<Orv_ResultsCB> callback);
    Zel_MonikerReq(const Zel_MonikerReq& other);
    virtual ~Zel_MonikerReq();

private:
    Zel_MonikerReq& operator=(const Zel_MonikerReq&) = delete;
};

#endif
