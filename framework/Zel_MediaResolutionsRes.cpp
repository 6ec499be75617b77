#include "Zel_MediaResolutionsRes.h"

#include "zel_resultitems_p.h"

#include <utility>

Zel_MediaResolutionsRes::ResultItem::ResultItem(Zel_PropertyKeyInfoList resolutions,
                                                boost::shared_ptr<Zel_Error> error)
    : mResolutions(std::move(resolutions))
    , mError(std::move(error))
{
}

Zel_MediaResolutionsRes::ResultItem::~ResultItem() = default;

Zel_MediaResolutionsRes::Zel_MediaResolutionsRes(boost::shared_ptr<Zel_MediaResolutionsCB> callback,
                                                 bool finalResult)
    : Zel_GenericRes(callback, finalResult)
    , mCallback(std::move(callback))
    , mCursor(0)
{
}

Zel_MediaResolutionsRes::Zel_MediaResolutionsRes(const Zel_MediaResolutionsRes& other) = default;
Zel_MediaResolutionsRes& Zel_MediaResolutionsRes::operator=(const Zel_MediaResolutionsRes& other) = default;
Zel_MediaResolutionsRes::~Zel_MediaResolutionsRes() = default;

void Zel_MediaResolutionsRes::setResult(Zel_PropertyKeyInfoList resolutions,
                                        boost::shared_ptr<Zel_Error> error)
{
    mItems.emplace_back(std::move(resolutions), ZelResults::errorRecord(std::move(error)));
}

void Zel_MediaResolutionsRes::callSucceeded(Zel_MediaResolutionsCB& callback, const ResultItem& item)
{
    callback.succeeded(item.mResolutions);
}
