#include "Zel_DeleteNodeRes.h"

#include "zel_resultitems_p.h"

#include <utility>

Zel_DeleteNodeRes::ResultItem::ResultItem(bool deleted, boost::shared_ptr<Zel_Error> error)
    : mDeleted(deleted)
    , mError(std::move(error))
{
}

Zel_DeleteNodeRes::ResultItem::~ResultItem() = default;

Zel_DeleteNodeRes::Zel_DeleteNodeRes(boost::shared_ptr<Zel_ResultBoolCB> callback, bool finalResult)
    : Zel_GenericRes(callback, finalResult)
    , mCallback(std::move(callback))
    , mCursor(0)
{
}

Zel_DeleteNodeRes::Zel_DeleteNodeRes(const Zel_DeleteNodeRes& other) = default;
Zel_DeleteNodeRes& Zel_DeleteNodeRes::operator=(const Zel_DeleteNodeRes& other) = default;
Zel_DeleteNodeRes::~Zel_DeleteNodeRes() = default;

void Zel_DeleteNodeRes::setResult(bool deleted, boost::shared_ptr<Zel_Error> error)
{
    mItems.emplace_back(deleted, ZelResults::errorRecord(std::move(error)));
}

void Zel_DeleteNodeRes::callSucceeded(Zel_ResultBoolCB& callback, const ResultItem& item)
{
    callback.succeeded(item.mDeleted);
}
