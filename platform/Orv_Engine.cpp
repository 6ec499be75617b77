#include "Orv_Engine.h"

#include "Orv.h"
#include "Orv_Request.h"
#include "Orv_Result.h"
#include "Orv_ResultQ.h"
#include "Orv_ResultsCB.h"

#ifdef __GLIBCXX__
#include <cxxabi.h>
#endif

#include <exception>
#include <string>

namespace {

// Calls the result's deliverNext() until it answers false. An exception is
// logged and taken as "more to come"; after MaxDeliveryFailuresInARow
// exceptions in a row the result is ended. The unwinding that cancels a
// thread is let through.
void deliverToEnd(Orv_Result& result)
{
    int failuresInARow = 0;
    for (;;) {
        std::string failure;
        try {
            if (!result.deliverNext())
                return;
            failuresInARow = 0;
            continue;
        }
#ifdef __GLIBCXX__
        catch (abi::__forced_unwind&) {
            throw;
        }
#endif
        catch (const std::exception& e) {
            failure = e.what();
        } catch (...) {
            failure = "unknown exception";
        }
        const std::string line = "orv: delivery of a result failed: " + failure;
        Orv::log(line.c_str());
        if (++failuresInARow == Orv_Engine::MaxDeliveryFailuresInARow)
            return;
    }
}

} // namespace

// --- Orv_EngineHandle ---------------------------------------------------------

Orv_EngineHandle::Orv_EngineHandle(Orv_Engine* engine)
    : mEngine(engine)
{
}

bool Orv_EngineHandle::Submit(boost::shared_ptr<Orv_Request> request)
{
    if (!request)
        return false;
    std::shared_lock<std::shared_mutex> lock(mMutex);
    if (!mEngine)
        return false;
    mEngine->Submit(std::move(request));
    return true;
}

void Orv_EngineHandle::close()
{
    std::unique_lock<std::shared_mutex> lock(mMutex);
    mEngine = nullptr;
}

// --- Orv_Engine -------------------------------------------------------------------

Orv_Engine::Orv_Engine(unsigned workerCount)
    : mResultQ(new Orv_ResultQ)
    , mHandle(new Orv_EngineHandle(this))
{
    if (workerCount == 0)
        workerCount = 1;
    mWorkers.reserve(workerCount);
    for (unsigned i = 0; i < workerCount; ++i)
        mWorkers.emplace_back(&Orv_Engine::workerLoop, this);
}

Orv_Engine::~Orv_Engine()
{
    // From here on the handle refuses requests; one it is handing over now
    // is queued before this returns, and dropped below with the rest.
    mHandle->close();
    {
        std::lock_guard<std::mutex> lock(mMutex);
        mStopping = true;
        mRequests.clear();
    }
    mWork.notify_all();
    for (std::thread& worker : mWorkers)
        worker.join();
}

void Orv_Engine::Submit(boost::shared_ptr<Orv_Request> request)
{
    if (!request)
        return;
    {
        std::lock_guard<std::mutex> lock(mMutex);
        mRequests.push_back(std::move(request));
    }
    mWork.notify_one();
}

boost::shared_ptr<Orv_EngineHandle> Orv_Engine::getHandle() const
{
    return mHandle;
}

boost::shared_ptr<Orv_ResultQ> Orv_Engine::getResultQ() const
{
    return mResultQ;
}

std::size_t Orv_Engine::DeliverPending()
{
    std::size_t delivered = 0;
    // Deliver only what is queued now, so that a result pushed during delivery
    // waits for the next call rather than starving the caller.
    for (std::size_t left = mResultQ->Size(); left > 0; --left) {
        boost::shared_ptr<Orv_Result> result = mResultQ->TryPop();
        if (!result)
            break;
        deliverToEnd(*result);
        if (result->isFinalResult() && result->getCallback())
            result->getCallback()->setFinished(true);
        ++delivered;
    }
    return delivered;
}

bool Orv_Engine::WaitForResults(std::chrono::milliseconds timeout)
{
    return mResultQ->WaitForResult(timeout);
}

void Orv_Engine::WaitIdle()
{
    std::unique_lock<std::mutex> lock(mMutex);
    mIdle.wait(lock, [this] { return mRequests.empty() && mRunning == 0; });
}

std::size_t Orv_Engine::DeliverAll()
{
    std::size_t delivered = 0;
    for (;;) {
        WaitIdle();
        if (mResultQ->Size() == 0)
            break;
        delivered += DeliverPending();
    }
    return delivered;
}

std::size_t Orv_Engine::failedRequestCount() const
{
    std::lock_guard<std::mutex> lock(mMutex);
    return mFailed;
}

void Orv_Engine::workerLoop()
{
    std::unique_lock<std::mutex> lock(mMutex);
    for (;;) {
        mWork.wait(lock, [this] { return mStopping || !mRequests.empty(); });
        if (mStopping)
            return;
        boost::shared_ptr<Orv_Request> request = std::move(mRequests.front());
        mRequests.pop_front();
        ++mRunning;
        lock.unlock();
        runRequest(request);
        request.reset();
        lock.lock();
        --mRunning;
        if (mRequests.empty() && mRunning == 0)
            mIdle.notify_all();
    }
}

void Orv_Engine::runRequest(const boost::shared_ptr<Orv_Request>& request)
{
    std::string failure;
    try {
        if (request->isCanceled())
            mResultQ->Push(request->makeCanceledResult());
        else
            request->process(mResultQ);
        return;
    } catch (const std::exception& e) {
        failure = e.what();
    } catch (...) {
        if (!std::current_exception())
            throw; // the unwinding that ends the thread goes on
        failure = "unknown exception";
    }
    {
        std::lock_guard<std::mutex> lock(mMutex);
        ++mFailed;
    }
    const std::string line = "orv: request " + request->name() + " failed: " + failure;
    Orv::log(line.c_str());
    // The request's own answer for work that did not run tells its callback
    // that it ended; a request without one leaves its callback unanswered.
    try {
        mResultQ->Push(request->makeCanceledResult());
    } catch (const std::exception& e) {
        const std::string lost = "orv: request " + request->name() + " could not be answered: " + e.what();
        Orv::log(lost.c_str());
    }
}
