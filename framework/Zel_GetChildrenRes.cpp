#include "Zel_GetChildrenRes.h"

#include "zel_resultitems_p.h"

#include <utility>

Zel_GetChildrenRes::ResultItem::ResultItem(boost::shared_ptr<Zel_Node> node,
                                           boost::shared_ptr<Zel_Error> error)
    : mNode(std::move(node))
    , mError(std::move(error))
{
}

Zel_GetChildrenRes::ResultItem::~ResultItem() = default;

Zel_GetChildrenRes::Zel_GetChildrenRes(boost::shared_ptr<Zel_ResultCB> callback, bool finalResult)
    : Zel_GenericRes(callback, finalResult)
    , mCallback(std::move(callback))
    , mCursor(0)
{
}

Zel_GetChildrenRes::Zel_GetChildrenRes(const Zel_GetChildrenRes& other) = default;
Zel_GetChildrenRes& Zel_GetChildrenRes::operator=(const Zel_GetChildrenRes& other) = default;
Zel_GetChildrenRes::~Zel_GetChildrenRes() = default;

void Zel_GetChildrenRes::setResult(boost::shared_ptr<Zel_Node> node,
                                   boost::shared_ptr<Zel_Error> error)
{
    mItems.emplace_back(std::move(node), ZelResults::errorRecord(std::move(error)));
}

void Zel_GetChildrenRes::callSucceeded(Zel_ResultCB& callback, const ResultItem& item)
{
    callback.succeeded(item.mNode);
}
