// Zel_QueryReq: the request named "Zel_Query".
//
// Fixes the operation's name and place in the class tree; it carries no
// parameters and no work. A backend derives from it, adds the operation's
// parameters and implements doProcess().
// Answered through Zel_QueryCB, by a result class of the backend.
#ifndef ZEL_QUERYREQ_H
#define ZEL_QUERYREQ_H

#include "zel_export.h"
#include "Zel_Req.h"

#include <boost/shared_ptr.hpp>

class Orv_ResultsCB;

class ZEL_EXPORT Zel_QueryReq : public Zel_Req
{
public:
    explicit Zel_QueryReq(boost::shared_ptr<Orv_ResultsCB> callback);
    Zel_QueryReq(const Zel_QueryReq& other);
    virtual ~Zel_QueryReq();

private:
    Zel_QueryReq& operator=(const Zel_QueryReq&) = delete;
};

#endif
