#include "Zel_ChildrenRes.h"

#include "zel_resultitems_p.h"

#include <utility>

Zel_ChildrenRes::ResultItem::ResultItem(boost::shared_ptr<Zel_Node> firstNode, boost::shared_ptr<Zel_Node> secondNode,
                                        boost::shared_ptr<Zel_Error> error, bool nodeAndFlag, bool flag)
    : mFirstNode(std::move(firstNode))
    , mSecondNode(std::move(secondNode))
    , mError(std::move(error))
    , mNodeAndFlag(nodeAndFlag)
    , mFlag(flag)
{
}

Zel_ChildrenRes::ResultItem::~ResultItem() = default;

Zel_ChildrenRes::Zel_ChildrenRes(boost::shared_ptr<Zel_ChildrenCB> callback, bool finalResult)
    : Zel_GenericRes(callback, finalResult)
    , mCallback(std::move(callback))
    , mCursor(0)
{
}

Zel_ChildrenRes::Zel_ChildrenRes(const Zel_ChildrenRes& other) = default;
Zel_ChildrenRes& Zel_ChildrenRes::operator=(const Zel_ChildrenRes& other) = default;
Zel_ChildrenRes::~Zel_ChildrenRes() = default;

void Zel_ChildrenRes::setResult(boost::shared_ptr<Zel_Node> node, bool /*unused*/, bool flag,
                                boost::shared_ptr<Zel_Error> error)
{
    mItems.emplace_back(std::move(node), boost::shared_ptr<Zel_Node>(), ZelResults::errorRecord(std::move(error)),
                        true, flag);
}

void Zel_ChildrenRes::setResult(boost::shared_ptr<Zel_Node> firstNode, boost::shared_ptr<Zel_Node> secondNode,
                                boost::shared_ptr<Zel_Error> error)
{
    mItems.emplace_back(std::move(firstNode), std::move(secondNode), ZelResults::errorRecord(std::move(error)),
                        false, true);
}

void Zel_ChildrenRes::callSucceeded(Zel_ChildrenCB& callback, const ResultItem& item)
{
    if (item.mNodeAndFlag)
        callback.succeeded(item.mFirstNode, item.mFlag);
    else
        callback.succeeded(item.mFirstNode, item.mSecondNode);
}

void Zel_ChildrenRes::callFailed(Zel_ChildrenCB& callback, const ResultItem& item)
{
    callback.failed(item.mFirstNode, item.mError);
}
