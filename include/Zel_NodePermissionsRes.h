// Zel_NodePermissionsRes: the answers to Zel_NodePermissionsReq, each the
// current user's permissions on a node.
//
// The backend creates it with the request's Zel_NodePermissionsCB and the
// final-result flag and adds the answers in order with setResult(permissions,
// error). The engine then calls deliverNext() once per answer:
// succeeded(permissions) for a success, failed(error) for an error record that
// reports an error, and finished() after the last answer of a final result. An
// empty error pointer counts as "no error". Delivery is that of
// Zel_GenericRes. Filled by one thread, then delivered; no lock.
#ifndef ZEL_NODEPERMISSIONSRES_H
#define ZEL_NODEPERMISSIONSRES_H

#include "zel_export.h"
#include "Zel_GenericRes.h"
#include "Zel_NodePermissionsCB.h"

#include <QtGlobal>
#include <boost/shared_ptr.hpp>

#include <vector>

class Zel_Error;
class Zel_NodePermissions;

class ZEL_EXPORT Zel_NodePermissionsRes
    : public Zel_GenericRes<Zel_NodePermissionsRes, Zel_NodePermissionsCB>
{
public:
    // One answer: its error record, the permissions.
    class ResultItem
    {
    public:
        ResultItem(boost::shared_ptr<Zel_NodePermissions> permissions,
                   boost::shared_ptr<Zel_Error> error);
        ResultItem(const ResultItem& other) = default;
        ResultItem(ResultItem&& other) = default;
        ResultItem& operator=(const ResultItem& other) = default;
        ResultItem& operator=(ResultItem&& other) = default;
        virtual ~ResultItem();

        boost::shared_ptr<Zel_Error> mError;
        boost::shared_ptr<Zel_NodePermissions> mPermissions;
    };

    Zel_NodePermissionsRes(boost::shared_ptr<Zel_NodePermissionsCB> callback, bool finalResult);
    Zel_NodePermissionsRes(const Zel_NodePermissionsRes& other);
    Zel_NodePermissionsRes& operator=(const Zel_NodePermissionsRes& other);
    virtual ~Zel_NodePermissionsRes();

    // Appends one answer; an empty error pointer is stored as a "no error" record.
    virtual void setResult(boost::shared_ptr<Zel_NodePermissions> permissions,
                           boost::shared_ptr<Zel_Error> error);

protected:
    std::vector<ResultItem> mItems;
    quint64 mCursor;
    boost::shared_ptr<Zel_NodePermissionsCB> mCallback;

private:
    friend class Zel_GenericRes<Zel_NodePermissionsRes, Zel_NodePermissionsCB>;
    static void callSucceeded(Zel_NodePermissionsCB& callback, const ResultItem& item);
};

#endif
