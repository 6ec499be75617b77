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
// QDateTime::toTime_t gave it (removed in Qt 6).
inline uint toTimeT(const QDateTime& dateTime)
{
    return static_cast<uint>(dateTime.toSecsSinceEpoch());
}

// The regular expression class of name validation (Qt 6: Core5Compat).
using RegExp = QRegExp;

} // namespace ZelCompat

#endif
