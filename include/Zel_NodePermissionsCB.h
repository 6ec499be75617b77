// Zel_NodePermissionsCB: the callback of Zel_NodePermissionsReq, answered by
// Zel_NodePermissionsRes with the current user's rights on a node.
//
// The application derives from it, implements the handlers and gives it, under
// a boost::shared_ptr, to the request; the result calls one handler per answer
// on the engine's delivery thread and catches and discards any exception a
// handler throws. The callback lives as long as a result holds it.
#ifndef ZEL_NODEPERMISSIONSCB_H
#define ZEL_NODEPERMISSIONSCB_H

#include "zel_export.h"
#include "Orv_ResultsCB.h"

#include <boost/shared_ptr.hpp>

class Zel_Error;
class Zel_NodePermissions;

class ZEL_EXPORT Zel_NodePermissionsCB : public Orv_ResultsCB
{
public:
    Zel_NodePermissionsCB();
    Zel_NodePermissionsCB(const Zel_NodePermissionsCB& other);
    virtual ~Zel_NodePermissionsCB();

    // One answer: the permissions.
    virtual void succeeded(boost::shared_ptr<Zel_NodePermissions> permissions) = 0;
    // One answer that is an error: its error record.
    virtual void failed(boost::shared_ptr<Zel_Error> error) = 0;
    // The request has delivered its last answer.
    virtual void finished() = 0;

private:
    Zel_NodePermissionsCB& operator=(const Zel_NodePermissionsCB&) = delete;
};

#endif
