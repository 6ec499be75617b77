#include "Zel_Debug.h"

#include "Orv.h"

#include <QDateTime>
#include <QtDebug>

#include <mutex>

// The switch keeps the size and place of the plain bool it replaced.
static_assert(sizeof(std::atomic<bool>) == sizeof(bool) && alignof(std::atomic<bool>) == alignof(bool),
              "the trace switch must keep the layout of a bool");
static_assert(std::atomic<bool>::is_always_lock_free, "the trace switch must not need a lock");

boost::shared_ptr<Zel_Debug> Zel_Debug::mInstanceSP;

Zel_Debug::Zel_Debug()
    : mEnabled(false)
{
}

Zel_Debug::Zel_Debug(const Zel_Debug& other)
    : mEnabled(other.mEnabled.load(std::memory_order_relaxed))
{
}

Zel_Debug& Zel_Debug::operator=(const Zel_Debug& other)
{
    mEnabled.store(other.mEnabled.load(std::memory_order_relaxed), std::memory_order_relaxed);
    return *this;
}

Zel_Debug::~Zel_Debug() = default;

boost::shared_ptr<Zel_Debug> Zel_Debug::instance()
{
    static std::once_flag created;
    std::call_once(created, [] { mInstanceSP.reset(new Zel_Debug); });
    return mInstanceSP;
}

// Relaxed: the switch orders nothing else; a thread sees a change soon, not
// at a given point of its work.
void Zel_Debug::setEnabled(bool enabled)
{
    mEnabled.store(enabled, std::memory_order_relaxed);
}

bool Zel_Debug::getEnabled()
{
    return mEnabled.load(std::memory_order_relaxed);
}

void Zel_Debug::debug(const QString& source, const QString& text, int elapsedMs)
{
    if (!mEnabled.load(std::memory_order_relaxed))
        return;

    QString line = QStringLiteral("ZEL:");
    if (!source.isEmpty())
        line += QLatin1Char(' ') + source + QLatin1Char(':');
    if (!text.isEmpty())
        line += QLatin1Char(' ') + text;
    if (elapsedMs != 0) {
        const float seconds = static_cast<float>(elapsedMs) / 1000.0f;
        line += QStringLiteral(" (") + QString::number(static_cast<double>(seconds), 'g', 6)
            + QStringLiteral(" seconds)");
    }

    const QString stamped = QLatin1Char('[') + QDateTime::currentDateTime().toString(Qt::TextDate)
        + QLatin1Char(']') + line;
    // Both outputs carry the Latin-1 form of the line (characters beyond
    // Latin-1 become '?'). The debug output gets it as a string, never as a
    // format, so percent signs stay as they are; going through QString keeps
    // Latin-1 letters intact on a UTF-8 terminal.
    qDebug().noquote() << QString::fromLatin1(stamped.toLatin1());
    Orv::log(line.toLatin1().constData());
}
