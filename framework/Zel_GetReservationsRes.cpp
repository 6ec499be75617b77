#include "Zel_GetReservationsRes.h"

#include "zel_resultitems_p.h"

#include <utility>

Zel_GetReservationsRes::ResultItem::ResultItem(QString text, QDateTime dateTime,
                                               boost::shared_ptr<Zel_Error> error)
    : mText(std::move(text))
    , mDateTime(std::move(dateTime))
    , mError(std::move(error))
{
}

Zel_GetReservationsRes::ResultItem::~ResultItem() = default;

Zel_GetReservationsRes::Zel_GetReservationsRes(boost::shared_ptr<Zel_GetReservationsCB> callback,
                                               bool finalResult)
    : Zel_GenericRes(callback, finalResult)
    , mCallback(std::move(callback))
    , mCursor(0)
{
}

Zel_GetReservationsRes::Zel_GetReservationsRes(const Zel_GetReservationsRes& other) = default;
Zel_GetReservationsRes& Zel_GetReservationsRes::operator=(const Zel_GetReservationsRes& other) = default;
Zel_GetReservationsRes::~Zel_GetReservationsRes() = default;

void Zel_GetReservationsRes::setResult(QString text, QDateTime dateTime,
                                       boost::shared_ptr<Zel_Error> error)
{
    mItems.emplace_back(std::move(text), std::move(dateTime), ZelResults::errorRecord(std::move(error)));
}

void Zel_GetReservationsRes::callSucceeded(Zel_GetReservationsCB& callback, const ResultItem& item)
{
    callback.succeeded(item.mText, item.mDateTime);
}
