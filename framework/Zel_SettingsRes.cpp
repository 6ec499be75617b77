#include "Zel_SettingsRes.h"

#include "zel_resultitems_p.h"

#include <utility>

Zel_SettingsRes::ResultItem::ResultItem(QString text, boost::shared_ptr<Zel_Error> error)
    : mText(std::move(text))
    , mError(std::move(error))
{
}

Zel_SettingsRes::ResultItem::~ResultItem() = default;

Zel_SettingsRes::Zel_SettingsRes(boost::shared_ptr<Zel_SettingsCB> callback, bool finalResult)
    : Zel_GenericRes(callback, finalResult)
    , mCallback(std::move(callback))
    , mCursor(0)
{
}

Zel_SettingsRes::Zel_SettingsRes(const Zel_SettingsRes& other) = default;
Zel_SettingsRes& Zel_SettingsRes::operator=(const Zel_SettingsRes& other) = default;
Zel_SettingsRes::~Zel_SettingsRes() = default;

void Zel_SettingsRes::setResult(QString text, boost::shared_ptr<Zel_Error> error)
{
    mItems.emplace_back(std::move(text), ZelResults::errorRecord(std::move(error)));
}

void Zel_SettingsRes::callSucceeded(Zel_SettingsCB& callback, const ResultItem& item)
{
    callback.succeeded(item.mText);
}
