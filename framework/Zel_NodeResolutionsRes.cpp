#include "Zel_NodeResolutionsRes.h"

#include "zel_resultitems_p.h"

#include <utility>

Zel_NodeResolutionsRes::ResultItem::ResultItem(boost::shared_ptr<Zel_MobID> mobID,
                                               boost::shared_ptr<QString> text,
                                               boost::shared_ptr<Zel_Error> error)
    : mText(std::move(text))
    , mError(std::move(error))
    , mMobID(std::move(mobID))
{
}

Zel_NodeResolutionsRes::ResultItem::~ResultItem() = default;

Zel_NodeResolutionsRes::Zel_NodeResolutionsRes(boost::shared_ptr<Zel_NodeResolutionsCB> callback,
                                               bool finalResult)
    : Zel_GenericRes(callback, finalResult)
    , mCallback(std::move(callback))
    , mCursor(0)
{
}

Zel_NodeResolutionsRes::Zel_NodeResolutionsRes(const Zel_NodeResolutionsRes& other) = default;
Zel_NodeResolutionsRes& Zel_NodeResolutionsRes::operator=(const Zel_NodeResolutionsRes& other) = default;
Zel_NodeResolutionsRes::~Zel_NodeResolutionsRes() = default;

void Zel_NodeResolutionsRes::setResult(boost::shared_ptr<Zel_MobID> mobID,
                                       boost::shared_ptr<QString> text,
                                       boost::shared_ptr<Zel_Error> error)
{
    mItems.emplace_back(std::move(mobID), std::move(text), ZelResults::errorRecord(std::move(error)));
}

void Zel_NodeResolutionsRes::callSucceeded(Zel_NodeResolutionsCB& callback, const ResultItem& item)
{
    callback.succeeded(item.mMobID, item.mText);
}
