// Threads::MutexTenure: holds a Threads::Mutex for the life of the object.
//
// The name argument labels the holder for diagnostics and may be null.
#ifndef THREADS_MUTEXTENURE_H
#define THREADS_MUTEXTENURE_H

#include "zel_platform_export.h"
#include "Threads_Mutex.h"

namespace Threads {

class ZEL_PLATFORM_EXPORT MutexTenure
{
public:
    explicit MutexTenure(Mutex& mutex, const char* name = nullptr)
        : mMutex(mutex)
    {
        (void)name;
        mMutex.lock();
    }
    ~MutexTenure() { mMutex.unlock(); }

private:
    MutexTenure(const MutexTenure&) = delete;
    MutexTenure& operator=(const MutexTenure&) = delete;

    Mutex& mMutex;
};

} // namespace Threads

#endif
