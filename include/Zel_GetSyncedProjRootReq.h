// Zel_GetSyncedProjRootReq: the request named "Zel_GetSyncedProjRootReq".
//
// Fixes the operation's name and place in the class tree; it carries no
// parameters and no work. A backend derives from it, adds the operation's
// parameters and implements doProcess().
// Answered through Zel_ResultCB by a Zel_GetSyncedProjRootRes.
#ifndef ZEL_GETSYNCEDPROJROOTREQ_H
#define ZEL_GETSYNCEDPROJROOTREQ_H

#include "zel_export.h"
#include "Zel_Req.h"

#include <boost/shared_ptr.hpp>

class Orv_ResultsCB;

class ZEL_EXPORT Zel_GetSyncedProjRootReq : public Zel_Req
{
public:
    explicit Zel_GetSyncedProjRootReq(boost::shared_ptr<Orv_ResultsCB> callback);
    Zel_GetSyncedProjRootReq(const Zel_GetSyncedProjRootReq& other);
    virtual ~Zel_GetSyncedProjRootReq();

private:
    Zel_GetSyncedProjRootReq& operator=(const Zel_GetSyncedProjRootReq&) = delete;
};

#endif
