#include "Zel_GetNodeRes.h"

#include "zel_resultitems_p.h"

#include <utility>

Zel_GetNodeRes::ResultItem::ResultItem(boost::shared_ptr<Zel_Node> node,
                                       boost::shared_ptr<Zel_Error> error)
    : mNode(std::move(node))
    , mError(std::move(error))
{
}

Zel_GetNodeRes::ResultItem::~ResultItem() = default;

Zel_GetNodeRes::Zel_GetNodeRes(boost::shared_ptr<Zel_ResultCB> callback, bool finalResult)
    : Zel_GenericRes(callback, finalResult)
    , mCallback(std::move(callback))
    , mCursor(0)
{
}

Zel_GetNodeRes::Zel_GetNodeRes(const Zel_GetNodeRes& other) = default;
Zel_GetNodeRes& Zel_GetNodeRes::operator=(const Zel_GetNodeRes& other) = default;
Zel_GetNodeRes::~Zel_GetNodeRes() = default;

void Zel_GetNodeRes::setResult(boost::shared_ptr<Zel_Node> node, boost::shared_ptr<Zel_Error> error)
{
    mItems.emplace_back(std::move(node), ZelResults::errorRecord(std::move(error)));
}

void Zel_GetNodeRes::callSucceeded(Zel_ResultCB& callback, const ResultItem& item)
{
    callback.succeeded(item.mNode);
}
