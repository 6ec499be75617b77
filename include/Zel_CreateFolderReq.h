// Zel_CreateFolderReq: the request named "Zel_CreateFolderReq".
//
// Fixes the operation's name and place in the class tree; it carries no
// parameters and no work. A backend derives from it, adds the operation's
// parameters and implements doProcess().
// Answered through Zel_CreateFolderCB, by a result class of the backend.
#ifndef ZEL_CREATEFOLDERREQ_H
#define ZEL_CREATEFOLDERREQ_H

#include "zel_export.h"
#include "Zel_Req.h"

#include <boost/shared_ptr.hpp>

class Orv_ResultsCB;

class ZEL_EXPORT Zel_CreateFolderReq : public Zel_Req
{
public:
    explicit Zel_CreateFolderReq(boost::shared_ptr<Orv_ResultsCB> callback);
    Zel_CreateFolderReq(const Zel_CreateFolderReq& other);
    virtual ~Zel_CreateFolderReq();

private:
    Zel_CreateFolderReq& operator=(const Zel_CreateFolderReq&) = delete;
};

#endif
