// Zel_CreateFolderUniqueReq: the request named "Zel_CreateFolderUniqueReq".
//
// Fixes the operation's name and place in the class tree; it carries no
// parameters and no work. A backend derives from it, adds the operation's
// parameters and implements doProcess().
// Answered through Zel_CreateFolderUniqueCB by a Zel_CreateFolderUniqueRes.
#ifndef ZEL_CREATEFOLDERUNIQUEREQ_H
#define ZEL_CREATEFOLDERUNIQUEREQ_H

#include "zel_export.h"
#include "Zel_Req.h"

#include <boost/shared_ptr.hpp>

class Orv_ResultsCB;

class ZEL_EXPORT Zel_CreateFolderUniqueReq : public Zel_Req
{
public:
    explicit Zel_CreateFolderUniqueReq(boost::shared_ptr<Orv_ResultsCB> callback);
    Zel_CreateFolderUniqueReq(const Zel_CreateFolderUniqueReq& other);
    virtual ~Zel_CreateFolderUniqueReq();

private:
    Zel_CreateFolderUniqueReq& operator=(const Zel_CreateFolderUniqueReq&) = delete;
};

#endif
