#include "Orv_Request.h"

#include "Orv_Result.h"
#include "Orv_ResultsCB.h"

Orv_Request::Orv_Request(std::string name, boost::shared_ptr<Orv_ResultsCB> callback)
    : mName(std::move(name))
    , mCallback(std::move(callback))
    , mID(Orv_RequestID::next())
    , mCanceled(false)
{
}

Orv_Request::Orv_Request(const Orv_Request& other)
    : mName(other.mName)
    , mCallback(other.mCallback)
    , mID(other.mID)
    , mCanceled(other.mCanceled.load())
{
}

Orv_Request::~Orv_Request() = default;

const std::string& Orv_Request::name() const
{
    return mName;
}

Orv_RequestID Orv_Request::getRequestID() const
{
    return mID;
}

bool Orv_Request::isCanceled() const
{
    return mCanceled.load(std::memory_order_acquire) || (mCallback && mCallback->isCancelRequested());
}

boost::shared_ptr<Orv_Result> Orv_Request::makeCanceledResult()
{
    return boost::shared_ptr<Orv_Result>();
}

void Orv_Request::setCanceled(bool canceled)
{
    mCanceled.store(canceled, std::memory_order_release);
}
