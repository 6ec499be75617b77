#include "Zel_CreateReservationRes.h"

#include "zel_resultitems_p.h"

#include <utility>

Zel_CreateReservationRes::ResultItem::ResultItem(boost::shared_ptr<Zel_Error> error)
    : mError(std::move(error))
{
}

Zel_CreateReservationRes::ResultItem::~ResultItem() = default;

Zel_CreateReservationRes::Zel_CreateReservationRes(boost::shared_ptr<Zel_CreateReservationCB> callback,
                                                   bool finalResult)
    : Zel_GenericRes(callback, finalResult)
    , mCallback(std::move(callback))
    , mCursor(0)
{
}

Zel_CreateReservationRes::Zel_CreateReservationRes(const Zel_CreateReservationRes& other) = default;
Zel_CreateReservationRes& Zel_CreateReservationRes::operator=(const Zel_CreateReservationRes& other) = default;
Zel_CreateReservationRes::~Zel_CreateReservationRes() = default;

void Zel_CreateReservationRes::setResult(boost::shared_ptr<Zel_Error> error)
{
    mItems.emplace_back(ZelResults::errorRecord(std::move(error)));
}

void Zel_CreateReservationRes::callSucceeded(Zel_CreateReservationCB& callback,
                                             const ResultItem& item)
{
    callback.succeeded();
}
