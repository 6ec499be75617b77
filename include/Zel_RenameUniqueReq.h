// Zel_RenameUniqueReq: the request named "Zel_RenameUniqueReq".
//
// Fixes the operation's name and place in the class tree; it carries no
// parameters and no work. A backend derives from it, adds the operation's
// parameters and implements doProcess().
// Answered through Zel_RenameUniqueCB by a Zel_RenameUniqueRes.
#ifndef ZEL_RENAMEUNIQUEREQ_H
#define ZEL_RENAMEUNIQUEREQ_H

#include "zel_export.h"
#include "Zel_Req.h"

#include <boost/shared_ptr.hpp>

class Orv_ResultsCB;

class ZEL_EXPORT Zel_RenameUniqueReq : public Zel_Req
{
public:
    explicit Zel_RenameUniqueReq(boost::shared_ptr<Orv_ResultsCB> callback);
    Zel_RenameUniqueReq(const Zel_RenameUniqueReq& other);
    virtual ~Zel_RenameUniqueReq();

private:
    Zel_RenameUniqueReq& operator=(const Zel_RenameUniqueReq&) = delete;
};

#endif
