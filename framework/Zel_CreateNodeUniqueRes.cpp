#include "Zel_CreateNodeUniqueRes.h"

#include "zel_resultitems_p.h"

#include <utility>

Zel_CreateNodeUniqueRes::ResultItem::ResultItem(boost::shared_ptr<Zel_Node> node,
                                                boost::shared_ptr<Zel_Error> error)
    : mNode(std::move(node))
    , mError(std::move(error))
{
}

Zel_CreateNodeUniqueRes::ResultItem::~ResultItem() = default;

Zel_CreateNodeUniqueRes::Zel_CreateNodeUniqueRes(boost::shared_ptr<Zel_ResultCB> callback,
                                                 bool finalResult)
    : Zel_GenericRes(callback, finalResult)
    , mCallback(std::move(callback))
    , mCursor(0)
{
}

Zel_CreateNodeUniqueRes::Zel_CreateNodeUniqueRes(const Zel_CreateNodeUniqueRes& other) = default;
Zel_CreateNodeUniqueRes& Zel_CreateNodeUniqueRes::operator=(const Zel_CreateNodeUniqueRes& other) = default;
Zel_CreateNodeUniqueRes::~Zel_CreateNodeUniqueRes() = default;

void Zel_CreateNodeUniqueRes::setResult(boost::shared_ptr<Zel_Node> node,
                                        boost::shared_ptr<Zel_Error> error)
{
    mItems.emplace_back(std::move(node), ZelResults::errorRecord(std::move(error)));
}

void Zel_CreateNodeUniqueRes::callSucceeded(Zel_ResultCB& callback, const ResultItem& item)
{
    callback.succeeded(item.mNode);
}
