// Zel_CreateNodeUniqueReq: the request named "Zel_CreateNodeUniqueReq".
//
// Fixes the operation's name and place in the class tree; it carries no
// parameters and no work. A backend derives from it, adds the operation's
// parameters and implements doProcess().
// Answered through Zel_ResultCB by a Zel_CreateNodeUniqueRes.
#ifndef ZEL_CREATENODEUNIQUEREQ_H
#define ZEL_CREATENODEUNIQUEREQ_H

#include "zel_export.h"
#include "Zel_Req.h"

#include <boost/shared_ptr.hpp>

class Orv_ResultsCB;

class ZEL_EXPORT Zel_CreateNodeUniqueReq : public Zel_Req
{
public:
    explicit Zel_CreateNodeUniqueReq(boost::shared_ptr<Orv_ResultsCB> callback);
    Zel_CreateNodeUniqueReq(const Zel_CreateNodeUniqueReq& other);
    virtual ~Zel_CreateNodeUniqueReq();

private:
    Zel_CreateNodeUniqueReq& operator=(const Zel_CreateNodeUniqueReq&) = delete;
};

#endif
