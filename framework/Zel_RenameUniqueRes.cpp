#include "Zel_RenameUniqueRes.h"

#include "zel_resultitems_p.h"

#include <utility>

Zel_RenameUniqueRes::ResultItem::ResultItem(boost::shared_ptr<Zel_Node> node,
                                            boost::shared_ptr<Zel_Error> error)
    : mNode(std::move(node))
    , mError(std::move(error))
{
}

Zel_RenameUniqueRes::ResultItem::~ResultItem() = default;

Zel_RenameUniqueRes::Zel_RenameUniqueRes(boost::shared_ptr<Zel_RenameUniqueCB> callback,
                                         bool finalResult)
    : Zel_GenericRes(callback, finalResult)
    , mCallback(std::move(callback))
    , mCursor(0)
{
}

Zel_RenameUniqueRes::Zel_RenameUniqueRes(const Zel_RenameUniqueRes& other) = default;
Zel_RenameUniqueRes& Zel_RenameUniqueRes::operator=(const Zel_RenameUniqueRes& other) = default;
Zel_RenameUniqueRes::~Zel_RenameUniqueRes() = default;

void Zel_RenameUniqueRes::setResult(boost::shared_ptr<Zel_Node> node,
                                    boost::shared_ptr<Zel_Error> error)
{
    mItems.emplace_back(std::move(node), ZelResults::errorRecord(std::move(error)));
}

void Zel_RenameUniqueRes::callSucceeded(Zel_RenameUniqueCB& callback, const ResultItem& item)
{
    callback.succeeded(item.mNode);
}
