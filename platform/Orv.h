// Orv: the engine's log.
//
// Orv::log() receives each trace line (Latin-1 text) and hands it to the log
// handler that a program or test installed with setLogHandler(). Without a
// handler lines are discarded: the zel trace log also writes every line to
// Qt's debug output, so nothing is lost by default. Thread-safe: calls of the
// handler are serialised, and once setLogHandler() has returned the handler it
// replaced is no longer running. A handler may itself log or install another
// handler (on its own thread); it must not wait for another thread that logs.
#ifndef ORV_H
#define ORV_H

#include "zel_platform_export.h"

#include <functional>

class ZEL_PLATFORM_EXPORT Orv
{
public:
    using LogHandler = std::function<void(const char* line)>;

    static void log(const char* line);
    // Installs a handler (an empty one discards lines); returns the previous one.
    static LogHandler setLogHandler(LogHandler handler);

private:
    Orv() = delete;
};

#endif
