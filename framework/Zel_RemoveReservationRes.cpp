#include "Zel_RemoveReservationRes.h"

#include "zel_resultitems_p.h"

#include <utility>

Zel_RemoveReservationRes::ResultItem::ResultItem(boost::shared_ptr<Zel_Error> error)
    : mError(std::move(error))
{
}

Zel_RemoveReservationRes::ResultItem::~ResultItem() = default;

Zel_RemoveReservationRes::Zel_RemoveReservationRes(boost::shared_ptr<Zel_RemoveReservationCB> callback,
                                                   bool finalResult)
    : Zel_GenericRes(callback, finalResult)
    , mCallback(std::move(callback))
    , mCursor(0)
{
}

Zel_RemoveReservationRes::Zel_RemoveReservationRes(const Zel_RemoveReservationRes& other) = default;
Zel_RemoveReservationRes& Zel_RemoveReservationRes::operator=(const Zel_RemoveReservationRes& other) = default;
Zel_RemoveReservationRes::~Zel_RemoveReservationRes() = default;

void Zel_RemoveReservationRes::setResult(boost::shared_ptr<Zel_Error> error)
{
    mItems.emplace_back(ZelResults::errorRecord(std::move(error)));
}

void Zel_RemoveReservationRes::callSucceeded(Zel_RemoveReservationCB& callback,
                                             const ResultItem& item)
{
    callback.succeeded();
}
