// Zel_GetLinkedProjectsReq: the request named "Zel_GetLinkedProjectsReq".
//
// Fixes the operation's name and place in the class tree; it carries no
// parameters and no work. A backend derives from it, adds the operation's
// parameters and implements doProcess().
// Answered through Zel_ResultCB by a Zel_GetLinkedProjectsRes.
#ifndef ZEL_GETLINKEDPROJECTSREQ_H
#define ZEL_GETLINKEDPROJECTSREQ_H

#include "zel_export.h"
#include "Zel_Req.h"

#include <boost/shared_ptr.hpp>

class Orv_ResultsCB;

class ZEL_EXPORT Zel_GetLinkedProjectsReq : public Zel_Req
{
public:
    explicit Zel_GetLinkedProjectsReq(boost::shared_ptr<Orv_ResultsCB> callback);
    Zel_GetLinkedProjectsReq(const Zel_GetLinkedProjectsReq& other);
    virtual ~Zel_GetLinkedProjectsReq();

private:
    Zel_GetLinkedProjectsReq& operator=(const Zel_GetLinkedProjectsReq&) = delete;
};

#endif
