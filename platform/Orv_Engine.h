// Orv_Engine: a small request engine.
//
// Submit() queues a request; a fixed pool of worker threads runs each queued
// request's process() with the engine's result queue, in submission order per
// worker. Results are delivered on the thread that asks for it:
// DeliverPending() pops every queued result and calls its deliverNext() until
// it returns false, in push order. A request that is cancelled before it runs
// is not processed; its makeCanceledResult(), if any, is queued instead.
//
//     Orv_Engine engine;                 // two worker threads
//     engine.Submit(request);
//     engine.DeliverAll();               // waits for the work, delivers the answers
//
// A request whose process() throws is logged through Orv::log ("orv: request
// <name> failed: <what>") and counted (failedRequestCount); then its
// makeCanceledResult() is queued in place of its answers, as for a request
// cancelled before it ran, so that a request which makes one (a failure and
// the end notice, say) still tells its callback that it ended. A request
// that makes none leaves its callback unanswered: backends should answer
// every failure themselves and not let process() throw.
//
// A deliverNext() that throws does not stop delivery: the exception is logged
// through Orv::log ("orv: delivery of a result failed: <what>") and the engine
// calls deliverNext() of the same result again, as if it had answered true,
// so that the items after the failing one still arrive. A result whose
// deliverNext() throws MaxDeliveryFailuresInARow times in a row is ended
// there. Either way a final result marks its callback finished, and the
// results queued behind it are delivered as usual.
//
// Whoever may outlive the engine (a session, for example) keeps its handle
// (getHandle()) instead of a pointer: the handle passes requests on while the
// engine lives and refuses them once its destruction has begun.
//
// Submit, WaitIdle, the handle and the result queue are thread-safe. Delivery
// methods are meant to be called from one thread at a time (the application's
// thread). The destructor first closes the handle, then finishes the requests
// that are running, drops the ones still queued, and joins the workers.
#ifndef ORV_ENGINE_H
#define ORV_ENGINE_H

#include "zel_platform_export.h"

#include <boost/shared_ptr.hpp>

#include <chrono>
#include <condition_variable>
#include <cstddef>
#include <deque>
#include <mutex>
#include <shared_mutex>
#include <thread>
#include <vector>

class Orv_Engine;
class Orv_Request;
class Orv_ResultQ;

// Orv_EngineHandle: a reference to an engine that may be used in any order
// with the engine's destruction. Submit() hands a request to the engine while
// it lives and answers true; once the engine's destructor has begun it
// answers false and leaves the request alone. The engine's destructor waits
// for a Submit() that is handing a request over, so the engine is never used
// after it is gone. Made by the engine only; shared with its users.
class ZEL_PLATFORM_EXPORT Orv_EngineHandle
{
public:
    // Queues a request on the engine; false (nothing queued) when the
    // request is empty or the engine is gone.
    bool Submit(boost::shared_ptr<Orv_Request> request);

private:
    friend class Orv_Engine;
    explicit Orv_EngineHandle(Orv_Engine* engine);
    Orv_EngineHandle(const Orv_EngineHandle&) = delete;
    Orv_EngineHandle& operator=(const Orv_EngineHandle&) = delete;
    // The engine is going: waits for a Submit() in progress, refuses the rest.
    void close();

    std::shared_mutex mMutex;
    Orv_Engine* mEngine; // guarded by mMutex; null once closed
};

class ZEL_PLATFORM_EXPORT Orv_Engine
{
public:
    // A result whose deliverNext() throws this many times in a row is ended.
    static constexpr int MaxDeliveryFailuresInARow = 8;

    explicit Orv_Engine(unsigned workerCount = 2);
    ~Orv_Engine();

    // Queues a request for a worker; an empty pointer is ignored.
    void Submit(boost::shared_ptr<Orv_Request> request);
    // The handle through which others submit without owning the engine.
    boost::shared_ptr<Orv_EngineHandle> getHandle() const;
    // The queue that every request and listener of this engine pushes onto.
    boost::shared_ptr<Orv_ResultQ> getResultQ() const;

    // Delivers every result queued now, each to its end; returns how many.
    std::size_t DeliverPending();
    // Blocks until a result is queued or the timeout has passed.
    bool WaitForResults(std::chrono::milliseconds timeout);
    // Blocks until no request is queued or running.
    void WaitIdle();
    // Waits and delivers until no request is queued or running and no result
    // is left, including those of requests submitted during delivery.
    std::size_t DeliverAll();

    // Requests whose process() threw: the exception is logged through Orv::log.
    std::size_t failedRequestCount() const;
    unsigned workerCount() const { return static_cast<unsigned>(mWorkers.size()); }

private:
    Orv_Engine(const Orv_Engine&) = delete;
    Orv_Engine& operator=(const Orv_Engine&) = delete;

    void workerLoop();
    void runRequest(const boost::shared_ptr<Orv_Request>& request);

    boost::shared_ptr<Orv_ResultQ> mResultQ;
    mutable std::mutex mMutex;
    std::condition_variable mWork;
    std::condition_variable mIdle;
    std::deque<boost::shared_ptr<Orv_Request>> mRequests;
    std::size_t mRunning = 0;
    std::size_t mFailed = 0;
    bool mStopping = false;
    std::vector<std::thread> mWorkers;
    boost::shared_ptr<Orv_EngineHandle> mHandle;
};

#endif
