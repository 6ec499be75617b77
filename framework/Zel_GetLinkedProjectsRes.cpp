#include "Zel_GetLinkedProjectsRes.h"

#include "zel_resultitems_p.h"

#include <utility>

Zel_GetLinkedProjectsRes::ResultItem::ResultItem(boost::shared_ptr<Zel_Node> node,
                                                 boost::shared_ptr<Zel_Error> error)
    : mNode(std::move(node))
    , mError(std::move(error))
{
}

Zel_GetLinkedProjectsRes::ResultItem::~ResultItem() = default;

Zel_GetLinkedProjectsRes::Zel_GetLinkedProjectsRes(boost::shared_ptr<Zel_ResultCB> callback,
                                                   bool finalResult)
    : Zel_GenericRes(callback, finalResult)
    , mCallback(std::move(callback))
    , mCursor(0)
{
}

Zel_GetLinkedProjectsRes::Zel_GetLinkedProjectsRes(const Zel_GetLinkedProjectsRes& other) = default;
Zel_GetLinkedProjectsRes& Zel_GetLinkedProjectsRes::operator=(const Zel_GetLinkedProjectsRes& other) = default;
Zel_GetLinkedProjectsRes::~Zel_GetLinkedProjectsRes() = default;

void Zel_GetLinkedProjectsRes::setResult(boost::shared_ptr<Zel_Node> node,
                                         boost::shared_ptr<Zel_Error> error)
{
    mItems.emplace_back(std::move(node), ZelResults::errorRecord(std::move(error)));
}

void Zel_GetLinkedProjectsRes::callSucceeded(Zel_ResultCB& callback, const ResultItem& item)
{
    callback.succeeded(item.mNode);
}
