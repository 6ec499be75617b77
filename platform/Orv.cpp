#include "Orv.h"

#include <mutex>

namespace {
std::mutex& logMutex()
{
    static std::mutex mutex;
    return mutex;
}

Orv::LogHandler& logHandler()
{
    static Orv::LogHandler handler;
    return handler;
}
} // namespace

void Orv::log(const char* line)
{
    if (!line)
        return;
    std::lock_guard<std::mutex> lock(logMutex());
    if (logHandler())
        logHandler()(line);
}

Orv::LogHandler Orv::setLogHandler(LogHandler handler)
{
    std::lock_guard<std::mutex> lock(logMutex());
    LogHandler previous = std::move(logHandler());
    logHandler() = std::move(handler);
    return previous;
}
