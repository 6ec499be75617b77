#include "Orv.h"

#include <memory>
#include <mutex>

namespace {
// Recursive: a handler may log, or install another handler, on its own thread.
std::recursive_mutex& logMutex()
{
    static std::recursive_mutex mutex;
    return mutex;
}

// The installed handler, replaced whole by setLogHandler; log() keeps its own
// reference during the call, so a handler that replaces itself stays alive.
std::shared_ptr<const Orv::LogHandler>& logHandler()
{
    static std::shared_ptr<const Orv::LogHandler> handler;
    return handler;
}
} // namespace

void Orv::log(const char* line)
{
    if (!line)
        return;
    // The lock is held through the call: once setLogHandler() has returned on
    // any thread, the handler it replaced is not running and can be destroyed.
    std::lock_guard<std::recursive_mutex> lock(logMutex());
    const std::shared_ptr<const LogHandler> handler = logHandler();
    if (handler && *handler)
        (*handler)(line);
}

Orv::LogHandler Orv::setLogHandler(LogHandler handler)
{
    std::shared_ptr<const LogHandler> installed;
    if (handler)
        installed = std::make_shared<const LogHandler>(std::move(handler));
    std::lock_guard<std::recursive_mutex> lock(logMutex());
    const std::shared_ptr<const LogHandler> previous = std::move(logHandler());
    logHandler() = std::move(installed);
    return previous ? *previous : LogHandler();
}
