#include "Threads_Mutex.h"

namespace Threads {

Mutex::Mutex(const char* name, bool flag)
    : mName(name ? name : "")
    , mFlag(flag)
{
}

Mutex::~Mutex() = default;

} // namespace Threads
