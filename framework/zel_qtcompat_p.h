// Internal: the few places where Qt 5 and Qt 6 differ, kept in one header.
// Never installed; include it from sources only.
#ifndef ZEL_QTCOMPAT_P_H
#define ZEL_QTCOMPAT_P_H

#include <QtGlobal>
#include <QDateTime>
#include <QElapsedTimer>
#include <QHash>
#include <QLocale>
#include <QStringView>
#include <QRegExp> // Qt 6: from the Core5Compat module

#include <cstddef>

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

// A local date and time as Qt 5's Qt::TextDate writes it: the system
// locale's short day and month names, the day, hh:mm:ss and the year, for
// example "Di. März 5 14:07:09 2024" under de_DE. Qt 6's Qt::TextDate always
// writes English names, so there the same text is made from the system locale.
inline QString systemTextDate(const QDateTime& local)
{
#if QT_VERSION_MAJOR >= 6
    if (!local.isValid())
        return QString();
    const QLocale system = QLocale::system();
    const QDate date = local.date();
    return system.dayName(date.dayOfWeek(), QLocale::ShortFormat) + QLatin1Char(' ')
        + system.monthName(date.month(), QLocale::ShortFormat) + QLatin1Char(' ') + QString::number(date.day())
        + QLatin1Char(' ') + local.time().toString(QStringLiteral("hh:mm:ss")) + QLatin1Char(' ')
        + QString::number(date.year());
#else
    return local.toString(Qt::TextDate);
#endif
}

// The process's seed of Qt's hash functions, as QHash uses it (random unless
// QT_HASH_SEED fixes it), so that hashed lookups cannot be flooded with
// colliding names.
inline std::size_t hashSeed()
{
#if QT_VERSION_MAJOR >= 6
    return QHashSeed::globalSeed();
#else
    return static_cast<uint>(qGlobalQHashSeed());
#endif
}

// Qt's hash of a text with a seed from hashSeed().
inline uint hashText(QStringView text, std::size_t seed)
{
#if QT_VERSION_MAJOR >= 6
    return static_cast<uint>(qHash(text, seed));
#else
    return qHash(text, static_cast<uint>(seed));
#endif
}

// The regular expression class of name validation (Qt 6: Core5Compat).
using RegExp = QRegExp;

} // namespace ZelCompat

#endif
