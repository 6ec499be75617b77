// Threads::Mutex: a named, recursive mutex.
//
// Recursive so that code called while the mutex is held (an event listener
// called by the event hub, say) may take it again on the same thread. The
// name is kept for diagnostics; the flag is kept and has no effect here.
// Lock it with a scoped Threads::MutexTenure.
#ifndef THREADS_MUTEX_H
#define THREADS_MUTEX_H

#include "zel_platform_export.h"

#include <mutex>
#include <string>

namespace Threads {

class ZEL_PLATFORM_EXPORT Mutex
{
public:
    Mutex(const char* name, bool flag);
    ~Mutex();

    void lock() { mMutex.lock(); }
    bool try_lock() { return mMutex.try_lock(); }
    void unlock() { mMutex.unlock(); }

    const std::string& name() const { return mName; }
    bool flag() const { return mFlag; }

private:
    Mutex(const Mutex&) = delete;
    Mutex& operator=(const Mutex&) = delete;

    std::recursive_mutex mMutex;
    std::string mName;
    bool mFlag;
};

} // namespace Threads

#endif
