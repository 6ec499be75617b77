#include "Zel_CheckinUpdateRes.h"

#include "zel_resultitems_p.h"

#include <utility>

Zel_CheckinUpdateRes::ListItem::ListItem(boost::shared_ptr<Zel_Error> error)
    : mError(std::move(error))
{
}

Zel_CheckinUpdateRes::ListItem::~ListItem() = default;

Zel_CheckinUpdateRes::Zel_CheckinUpdateRes(boost::shared_ptr<Zel_CheckinUpdateCB> callback, bool finalResult)
    : Orv_Result(callback, finalResult)
    , mCallback(std::move(callback))
    , mCursor(0)
{
}

Zel_CheckinUpdateRes::Zel_CheckinUpdateRes(const Zel_CheckinUpdateRes& other) = default;
Zel_CheckinUpdateRes& Zel_CheckinUpdateRes::operator=(const Zel_CheckinUpdateRes& other) = default;
Zel_CheckinUpdateRes::~Zel_CheckinUpdateRes() = default;

bool Zel_CheckinUpdateRes::deliverNext()
{
    return ZelResults::deliverListItem(*this, mCallback, mItems, mCursor,
                                       [](Zel_CheckinUpdateCB& callback, const ListItem& item) {
                                           if (ZelResults::reportsError(item.mError))
                                               callback.failed(item.mError);
                                           else
                                               callback.succeeded();
                                       });
}

void Zel_CheckinUpdateRes::addItem(boost::shared_ptr<Zel_Error> error)
{
    mItems.emplace_back(ZelResults::errorRecord(std::move(error)));
}
