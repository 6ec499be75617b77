// Orv_ResultQ: the engine's queue of results waiting for delivery.
//
// Push() may be called from any thread (request work, listeners); the engine
// pops on the thread that delivers. Results come out in the order they were
// pushed. All operations are thread-safe; waiting blocks, it never spins.
#ifndef ORV_RESULTQ_H
#define ORV_RESULTQ_H

#include "zel_platform_export.h"

#include <boost/shared_ptr.hpp>

#include <chrono>
#include <condition_variable>
#include <cstddef>
#include <deque>
#include <mutex>

class Orv_Result;

class ZEL_PLATFORM_EXPORT Orv_ResultQ
{
public:
    Orv_ResultQ();
    virtual ~Orv_ResultQ();

    // Appends a result; an empty pointer is ignored.
    void Push(const boost::shared_ptr<Orv_Result>& result);
    // The oldest result, removed from the queue; empty when there is none.
    boost::shared_ptr<Orv_Result> TryPop();
    // Blocks until a result is queued or the timeout has passed; true if one is queued.
    bool WaitForResult(std::chrono::milliseconds timeout);
    std::size_t Size() const;

private:
    Orv_ResultQ(const Orv_ResultQ&) = delete;
    Orv_ResultQ& operator=(const Orv_ResultQ&) = delete;

    mutable std::mutex mMutex;
    std::condition_variable mNotEmpty;
    std::deque<boost::shared_ptr<Orv_Result>> mResults;
};

#endif
