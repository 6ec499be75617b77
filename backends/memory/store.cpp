// The parts of the storage interface that every store shares: the ending of
// a transaction (commit, effects, change reports) and the store's clock.
#include "store_p.h"

#include <utility>

namespace ZelMemory {

Observer::~Observer() = default;

ReadTxn::ReadTxn(const Store& store)
    : mStore(store)
{
}

const QDateTime& ReadTxn::now() const
{
    if (!mHasNow) {
        mNow = mStore.now();
        mHasNow = true;
    }
    return mNow;
}

ReadTxn::~ReadTxn() = default;

void ReadTxn::onCommit(std::function<void()> effect)
{
    mEffects.push_back(std::move(effect));
}

void ReadTxn::commit()
{
    if (mCommitted)
        return;
    commitData();
    mCommitted = true;
    // The effects, then the change reports: an application that hears of a
    // change finds its effects (a registered property key, ...) in place.
    const std::vector<std::function<void()>> effects = std::move(mEffects);
    mEffects.clear();
    for (const std::function<void()>& effect : effects)
        effect();
    publishCommitted();
}

WriteTxn::WriteTxn(const Store& store)
    : ReadTxn(store)
{
}

void WriteTxn::reportAdded(const QString& parentMoniker, const QString& childMoniker)
{
    mChanges.push_back(Change{Change::Added, parentMoniker, childMoniker});
}

void WriteTxn::reportRemoved(const QString& parentMoniker, const QString& childMoniker)
{
    mChanges.push_back(Change{Change::Removed, parentMoniker, childMoniker});
}

void WriteTxn::reportUpdated(const QString& parentMoniker, const QString& childMoniker)
{
    mChanges.push_back(Change{Change::Updated, parentMoniker, childMoniker});
}

Store::Store() = default;

Store::~Store() = default;

QDateTime Store::now() const
{
    if (mClockSet.load(std::memory_order_relaxed)) {
        std::lock_guard<std::mutex> lock(mClockMutex);
        if (mClock)
            return mClock();
    }
    return QDateTime::currentDateTimeUtc();
}

} // namespace ZelMemory
