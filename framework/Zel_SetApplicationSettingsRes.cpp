#include "Zel_SetApplicationSettingsRes.h"

#include "zel_resultitems_p.h"

#include <utility>

Zel_SetApplicationSettingsRes::ResultItem::ResultItem(boost::shared_ptr<Zel_Error> error)
    : mError(std::move(error))
{
}

Zel_SetApplicationSettingsRes::ResultItem::~ResultItem() = default;

Zel_SetApplicationSettingsRes::Zel_SetApplicationSettingsRes(boost::shared_ptr<Zel_SetApplicationSettingsCB> callback,
                                                             bool finalResult)
    : Zel_GenericRes(callback, finalResult)
    , mCallback(std::move(callback))
    , mCursor(0)
{
}

Zel_SetApplicationSettingsRes::Zel_SetApplicationSettingsRes(const Zel_SetApplicationSettingsRes& other) = default;
Zel_SetApplicationSettingsRes& Zel_SetApplicationSettingsRes::operator=(const Zel_SetApplicationSettingsRes& other) = default;
Zel_SetApplicationSettingsRes::~Zel_SetApplicationSettingsRes() = default;

void Zel_SetApplicationSettingsRes::setResult(boost::shared_ptr<Zel_Error> error)
{
    mItems.emplace_back(ZelResults::errorRecord(std::move(error)));
}

void Zel_SetApplicationSettingsRes::callSucceeded(Zel_SetApplicationSettingsCB& callback,
                                                  const ResultItem& item)
{
    callback.succeeded();
}
