#include "Zel_NodePermissionsRes.h"

#include "zel_resultitems_p.h"

#include <utility>

Zel_NodePermissionsRes::ResultItem::ResultItem(boost::shared_ptr<Zel_NodePermissions> permissions,
                                               boost::shared_ptr<Zel_Error> error)
    : mError(std::move(error))
    , mPermissions(std::move(permissions))
{
}

Zel_NodePermissionsRes::ResultItem::~ResultItem() = default;

Zel_NodePermissionsRes::Zel_NodePermissionsRes(boost::shared_ptr<Zel_NodePermissionsCB> callback,
                                               bool finalResult)
    : Zel_GenericRes(callback, finalResult)
    , mCursor(0)
    , mCallback(std::move(callback))
{
}

Zel_NodePermissionsRes::Zel_NodePermissionsRes(const Zel_NodePermissionsRes& other) = default;
Zel_NodePermissionsRes& Zel_NodePermissionsRes::operator=(const Zel_NodePermissionsRes& other) = default;
Zel_NodePermissionsRes::~Zel_NodePermissionsRes() = default;

void Zel_NodePermissionsRes::setResult(boost::shared_ptr<Zel_NodePermissions> permissions,
                                       boost::shared_ptr<Zel_Error> error)
{
    mItems.emplace_back(std::move(permissions), ZelResults::errorRecord(std::move(error)));
}

void Zel_NodePermissionsRes::callSucceeded(Zel_NodePermissionsCB& callback, const ResultItem& item)
{
    callback.succeeded(item.mPermissions);
}
