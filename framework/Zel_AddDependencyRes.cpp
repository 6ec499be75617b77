#include "Zel_AddDependencyRes.h"

#include "zel_resultitems_p.h"

#include <utility>

Zel_AddDependencyRes::ResultItem::ResultItem(boost::shared_ptr<Zel_Node> node,
                                             Zel_DependencySPList dependencies,
                                             boost::shared_ptr<Zel_Error> error)
    : mNode(std::move(node))
    , mDependencies(std::move(dependencies))
    , mError(std::move(error))
{
}

Zel_AddDependencyRes::ResultItem::~ResultItem() = default;

Zel_AddDependencyRes::Zel_AddDependencyRes(boost::shared_ptr<Zel_DependencyCB> callback,
                                           bool finalResult)
    : Zel_GenericRes(callback, finalResult)
    , mCursor(0)
    , mCallback(std::move(callback))
{
}

Zel_AddDependencyRes::Zel_AddDependencyRes(const Zel_AddDependencyRes& other) = default;
Zel_AddDependencyRes& Zel_AddDependencyRes::operator=(const Zel_AddDependencyRes& other) = default;
Zel_AddDependencyRes::~Zel_AddDependencyRes() = default;

void Zel_AddDependencyRes::setResult(boost::shared_ptr<Zel_Node> node,
                                     Zel_DependencySPList dependencies,
                                     boost::shared_ptr<Zel_Error> error)
{
    mItems.emplace_back(std::move(node), std::move(dependencies), ZelResults::errorRecord(std::move(error)));
}

void Zel_AddDependencyRes::callSucceeded(Zel_DependencyCB& callback, const ResultItem& item)
{
    callback.succeeded(item.mNode, item.mDependencies);
}
