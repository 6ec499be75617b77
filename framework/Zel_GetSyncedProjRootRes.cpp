#include "Zel_GetSyncedProjRootRes.h"

#include "zel_resultitems_p.h"

#include <utility>

Zel_GetSyncedProjRootRes::ResultItem::ResultItem(boost::shared_ptr<Zel_Node> node,
                                                 boost::shared_ptr<Zel_Error> error)
    : mNode(std::move(node))
    , mError(std::move(error))
{
}

Zel_GetSyncedProjRootRes::ResultItem::~ResultItem() = default;

Zel_GetSyncedProjRootRes::Zel_GetSyncedProjRootRes(boost::shared_ptr<Zel_ResultCB> callback,
                                                   bool finalResult)
    : Zel_GenericRes(callback, finalResult)
    , mCallback(std::move(callback))
    , mCursor(0)
{
}

Zel_GetSyncedProjRootRes::Zel_GetSyncedProjRootRes(const Zel_GetSyncedProjRootRes& other) = default;
Zel_GetSyncedProjRootRes& Zel_GetSyncedProjRootRes::operator=(const Zel_GetSyncedProjRootRes& other) = default;
Zel_GetSyncedProjRootRes::~Zel_GetSyncedProjRootRes() = default;

void Zel_GetSyncedProjRootRes::setResult(boost::shared_ptr<Zel_Node> node,
                                         boost::shared_ptr<Zel_Error> error)
{
    mItems.emplace_back(std::move(node), ZelResults::errorRecord(std::move(error)));
}

void Zel_GetSyncedProjRootRes::callSucceeded(Zel_ResultCB& callback, const ResultItem& item)
{
    callback.succeeded(item.mNode);
}
