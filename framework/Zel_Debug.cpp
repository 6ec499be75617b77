#include "Zel_Debug.h"

#include "Orv.h"

#include <QDateTime>
#include <QtDebug>

#include <mutex>

boost::shared_ptr<Zel_Debug> Zel_Debug::mInstanceSP;

Zel_Debug::Zel_Debug()
    : mEnabled(false)
{
}

Zel_Debug::Zel_Debug(const Zel_Debug& other) = default;
Zel_Debug& Zel_Debug::operator=(const Zel_Debug& other) = default;
Zel_Debug::~Zel_Debug() = default;

boost::shared_ptr<Zel_Debug> Zel_Debug::instance()
{
    static std::once_flag created;
    std::call_once(created, [] { mInstanceSP.reset(new Zel_Debug); });
    return mInstanceSP;
}

void Zel_Debug::setEnabled(bool enabled)
{
    mEnabled = enabled;
}

bool Zel_Debug::getEnabled()
{
    return mEnabled;
}

void Zel_Debug::debug(const QString& source, const QString& text, int elapsedMs)
{
    if (!mEnabled)
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
