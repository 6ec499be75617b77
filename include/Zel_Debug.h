// Zel_Debug: the process-wide trace log.
//
// One instance per process, created on the first instance() call (safe under
// concurrent first calls) with tracing off. When tracing is on, debug() writes
// one line, "ZEL:" + optional " <source>:" + optional " <text>" + optional
// " (<seconds> seconds)", to two places: Qt's debug output, prefixed with the
// bracketed local date and time, and the engine's log (Orv::log), alone. Both
// are Latin-1; the text is written verbatim (percent signs included).
//
//     Zel_Debug::instance()->setEnabled(true);
//     Zel_Debug::instance()->debug("MyReq", "started", 0);   // "ZEL: MyReq: started"
//
// The switch may be set from any thread while others trace: it is an atomic
// flag of the size of a bool, read and written without ordering (relaxed) and
// without a lock, so a line in progress may still be written just after
// tracing is switched off.
#ifndef ZEL_DEBUG_H
#define ZEL_DEBUG_H

#include "zel_export.h"

#include <QString>
#include <boost/shared_ptr.hpp>

#include <atomic>

class ZEL_EXPORT Zel_Debug
{
public:
    Zel_Debug(const Zel_Debug& other);
    Zel_Debug& operator=(const Zel_Debug& other);
    virtual ~Zel_Debug();

    static boost::shared_ptr<Zel_Debug> instance();

    void setEnabled(bool enabled);
    bool getEnabled();

    // Writes one trace line from a source name, a text and elapsed milliseconds
    // (0 leaves the seconds part out). Does nothing while tracing is off.
    void debug(const QString& source, const QString& text, int elapsedMs);

private:
    Zel_Debug();

    std::atomic<bool> mEnabled;
    static boost::shared_ptr<Zel_Debug> mInstanceSP;
};

#endif
