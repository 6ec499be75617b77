#include "Zel_SetUserSettingsRes.h"

#include "zel_resultitems_p.h"

#include <utility>

Zel_SetUserSettingsRes::ResultItem::ResultItem(boost::shared_ptr<Zel_Error> error)
    : mError(std::move(error))
{
}

Zel_SetUserSettingsRes::ResultItem::~ResultItem() = default;

Zel_SetUserSettingsRes::Zel_SetUserSettingsRes(boost::shared_ptr<Zel_SetUserSettingsCB> callback,
                                               bool finalResult)
    : Zel_GenericRes(callback, finalResult)
    , mCallback(std::move(callback))
    , mCursor(0)
{
}

Zel_SetUserSettingsRes::Zel_SetUserSettingsRes(const Zel_SetUserSettingsRes& other) = default;
Zel_SetUserSettingsRes& Zel_SetUserSettingsRes::operator=(const Zel_SetUserSettingsRes& other) = default;
Zel_SetUserSettingsRes::~Zel_SetUserSettingsRes() = default;

void Zel_SetUserSettingsRes::setResult(boost::shared_ptr<Zel_Error> error)
{
    mItems.emplace_back(ZelResults::errorRecord(std::move(error)));
}

void Zel_SetUserSettingsRes::callSucceeded(Zel_SetUserSettingsCB& callback, const ResultItem& item)
{
    callback.succeeded();
}
