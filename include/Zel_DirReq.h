// Zel_DirReq: the request named "Zel_DirReq".
//
// Fixes the operation's name and place in the class tree; it carries no
// parameters and no work. A backend derives from it, adds the operation's
// parameters and implements doProcess().
// Answered through Zel_DirCB, by a result class of the backend.
#ifndef ZEL_DIRREQ_H
#define ZEL_DIRREQ_H

#include "zel_export.h"
#include "Zel_Req.h"

#include <boost/shared_ptr.hpp>

class Orv_ResultsCB;

class ZEL_EXPORT Zel_DirReq : public Zel_Req
{
public:
    explicit Zel_DirReq(boost::shared_ptr<Orv_ResultsCB> callback);
    Zel_DirReq(const Zel_DirReq& other);
    virtual ~Zel_DirReq();

private:
    Zel_DirReq& operator=(const Zel_DirReq&) = delete;
};

#endif
