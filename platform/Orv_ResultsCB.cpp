#include "Orv_ResultsCB.h"

Orv_ResultsCB::Orv_ResultsCB(Orv_RequestID id)
    : mID(id)
    , mCanceled(false)
    , mFinished(false)
{
}

Orv_ResultsCB::Orv_ResultsCB(const Orv_ResultsCB& other)
    : mID(other.mID)
    , mCanceled(other.mCanceled.load())
    , mFinished(other.mFinished.load())
{
}

Orv_ResultsCB::~Orv_ResultsCB() = default;

bool Orv_ResultsCB::cancelRequest()
{
    if (isFinished())
        return false;
    mCanceled.store(true, std::memory_order_release);
    return true;
}

bool Orv_ResultsCB::isFinished() const
{
    return mFinished.load(std::memory_order_acquire);
}
