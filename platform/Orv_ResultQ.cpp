#include "Orv_ResultQ.h"

#include "Orv_Result.h"

Orv_ResultQ::Orv_ResultQ() = default;
Orv_ResultQ::~Orv_ResultQ() = default;

void Orv_ResultQ::Push(const boost::shared_ptr<Orv_Result>& result)
{
    if (!result)
        return;
    {
        std::lock_guard<std::mutex> lock(mMutex);
        mResults.push_back(result);
    }
    mNotEmpty.notify_all();
}

boost::shared_ptr<Orv_Result> Orv_ResultQ::TryPop()
{
    std::lock_guard<std::mutex> lock(mMutex);
    if (mResults.empty())
        return boost::shared_ptr<Orv_Result>();
    boost::shared_ptr<Orv_Result> result = std::move(mResults.front());
    mResults.pop_front();
    return result;
}

bool Orv_ResultQ::WaitForResult(std::chrono::milliseconds timeout)
{
    std::unique_lock<std::mutex> lock(mMutex);
    return mNotEmpty.wait_for(lock, timeout, [this] { return !mResults.empty(); });
}

std::size_t Orv_ResultQ::Size() const
{
    std::lock_guard<std::mutex> lock(mMutex);
    return mResults.size();
}
