#include "Zel_GetUserSettingsRes.h"

#include "zel_resultitems_p.h"

#include <utility>

Zel_GetUserSettingsRes::ResultItem::ResultItem(Zel_GetUserSettingsCB::UserSettingsType type,
                                               QString text, boost::shared_ptr<Zel_Error> error)
    : mType(type)
    , mText(std::move(text))
    , mError(std::move(error))
{
}

Zel_GetUserSettingsRes::ResultItem::~ResultItem() = default;

Zel_GetUserSettingsRes::Zel_GetUserSettingsRes(boost::shared_ptr<Zel_GetUserSettingsCB> callback,
                                               bool finalResult)
    : Zel_GenericRes(callback, finalResult)
    , mCallback(std::move(callback))
    , mCursor(0)
{
}

Zel_GetUserSettingsRes::Zel_GetUserSettingsRes(const Zel_GetUserSettingsRes& other) = default;
Zel_GetUserSettingsRes& Zel_GetUserSettingsRes::operator=(const Zel_GetUserSettingsRes& other) = default;
Zel_GetUserSettingsRes::~Zel_GetUserSettingsRes() = default;

void Zel_GetUserSettingsRes::setResult(Zel_GetUserSettingsCB::UserSettingsType type, QString text,
                                       boost::shared_ptr<Zel_Error> error)
{
    mItems.emplace_back(type, std::move(text), ZelResults::errorRecord(std::move(error)));
}

void Zel_GetUserSettingsRes::callSucceeded(Zel_GetUserSettingsCB& callback, const ResultItem& item)
{
    callback.succeeded(item.mType, item.mText);
}
