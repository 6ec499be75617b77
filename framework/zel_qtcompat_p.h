// Internal: the few places where Qt 5 and Qt 6 differ, kept in one header.
// Never installed; include it from sources only.
#ifndef ZEL_QTCOMPAT_P_H
#define ZEL_QTCOMPAT_P_H

#include <QtGlobal>
#include <QDateTime>
#include <QElapsedTimer>
#include <QRegExp> // Qt 6: from the Core5Compat module

namespace ZelCompat {

// Measures elapsed milliseconds (QTime::start/elapsed is gone in Qt 6).
using ElapsedTimer = QElapsedTimer;

// Whole seconds since 1970-01-01 00:00 UTC as an unsigned 32-bit number, as
// QDateTime::toTime_t gave it (removed in Qt 6): uint(-1) for an invalid
// moment or one outside that range, rather than a wrapped number.
inline uint toTimeT(const QDateTime& dateTime)
{
    if (!dateTime.isValid())
        return uint(-1);
    const qint64 seconds = dateTime.toSecsSinceEpoch();
    if (seconds < 0 || seconds > qint64(0xFFFFFFFEu))
        return uint(-1);
    return static_cast<uint>(seconds);
}

// The regular expression class of name validation (Qt 6: Core5Compat).
using RegExp = QRegExp;

} // namespace ZelCompat

#endif
