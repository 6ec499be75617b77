#include "Zel_GetApplicationSettingsRes.h"

#include "zel_resultitems_p.h"

#include <utility>

Zel_GetApplicationSettingsRes::ResultItem::ResultItem(QString text,
                                                      boost::shared_ptr<Zel_Error> error)
    : mText(std::move(text))
    , mError(std::move(error))
{
}

Zel_GetApplicationSettingsRes::ResultItem::~ResultItem() = default;

Zel_GetApplicationSettingsRes::Zel_GetApplicationSettingsRes(boost::shared_ptr<Zel_GetApplicationSettingsCB> callback,
                                                             bool finalResult)
    : Zel_GenericRes(callback, finalResult)
    , mCallback(std::move(callback))
    , mCursor(0)
{
}

Zel_GetApplicationSettingsRes::Zel_GetApplicationSettingsRes(const Zel_GetApplicationSettingsRes& other) = default;
Zel_GetApplicationSettingsRes& Zel_GetApplicationSettingsRes::operator=(const Zel_GetApplicationSettingsRes& other) = default;
Zel_GetApplicationSettingsRes::~Zel_GetApplicationSettingsRes() = default;

void Zel_GetApplicationSettingsRes::setResult(QString text, boost::shared_ptr<Zel_Error> error)
{
    mItems.emplace_back(std::move(text), ZelResults::errorRecord(std::move(error)));
}

void Zel_GetApplicationSettingsRes::callSucceeded(Zel_GetApplicationSettingsCB& callback,
                                                  const ResultItem& item)
{
    callback.succeeded(item.mText);
}
