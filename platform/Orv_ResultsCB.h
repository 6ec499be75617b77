// Orv_ResultsCB: base of every callback that results are delivered to.
//
// The application derives its callbacks (through the zel callback classes)
// from it. It carries the request identifier given at construction and two
// flags that the engine and the application share: cancelled (set by
// cancelRequest(), from any thread) and finished (set by the engine once the
// final result of the request has been delivered). Both flags are atomic.
#ifndef ORV_RESULTSCB_H
#define ORV_RESULTSCB_H

#include "zel_platform_export.h"
#include "Orv_RequestID.h"

#include <atomic>

class ZEL_PLATFORM_EXPORT Orv_ResultsCB
{
public:
    explicit Orv_ResultsCB(Orv_RequestID id);
    Orv_ResultsCB(const Orv_ResultsCB& other);
    virtual ~Orv_ResultsCB();

    // Asks the engine to drop the requests answered through this callback that
    // have not run yet. Answers false when the request has already finished.
    virtual bool cancelRequest();
    // True once the engine has delivered the final result to this callback.
    virtual bool isFinished() const;

    const Orv_RequestID& getCallbackID() const { return mID; }
    bool isCancelRequested() const { return mCanceled.load(std::memory_order_acquire); }

private:
    friend class Orv_Engine;
    void setFinished(bool finished) { mFinished.store(finished, std::memory_order_release); }

    Orv_ResultsCB& operator=(const Orv_ResultsCB&) = delete;

    Orv_RequestID mID;
    std::atomic<bool> mCanceled;
    std::atomic<bool> mFinished;
};

#endif
