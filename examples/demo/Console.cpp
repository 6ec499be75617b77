#include "Console.h"

#include "Zel_Error.h"
#include "Zel_MemoryErrorCodes.h"
#include "Zel_Node.h"

#include <QStringList>

#include <cstdio>

Console& Console::instance()
{
    static Console console;
    return console;
}

void Console::write(const QString& text)
{
    const QByteArray bytes = text.toUtf8();
    std::lock_guard<std::mutex> lock(mMutex);
    std::fwrite(bytes.constData(), 1, static_cast<size_t>(bytes.size()), stdout);
    std::fputc('\n', stdout);
    std::fflush(stdout);
}

void Console::line(const QString& text)
{
    write(text);
}

void Console::heading(int number, const QString& title, const QString& intro)
{
    QString head = QStringLiteral("== %1. %2 ").arg(number).arg(title);
    if (head.size() < 72)
        head += QString(72 - head.size(), QLatin1Char('='));
    write(QString());
    write(head);
    for (const QString& part : intro.split(QLatin1Char('\n')))
        write(QStringLiteral("  ") + part);
}

void Console::note(const QString& text)
{
    for (const QString& part : text.split(QLatin1Char('\n')))
        write(QStringLiteral("  ") + part);
}

void Console::send(const QString& text)
{
    write(QStringLiteral("  -> ") + text);
}

void Console::answer(const QString& text)
{
    write(QStringLiteral("     <- ") + text);
}

void Console::detail(const QString& text)
{
    write(QStringLiteral("        ") + text);
}

void Console::event(const QString& text)
{
    write(QStringLiteral("     ~~ ") + text);
}

void Console::block(const QString& text)
{
    QStringList lines = text.split(QLatin1Char('\n'));
    while (!lines.isEmpty() && lines.last().trimmed().isEmpty())
        lines.removeLast();
    for (const QString& l : lines)
        write(QStringLiteral("        | ") + l);
}

void Console::mismatch(const QString& text)
{
    write(QStringLiteral("  !! ") + text);
}

void Console::trace(const char* line)
{
    write(QStringLiteral("        trace: ") + QString::fromLatin1(line));
}

void Console::qtMessage(const QString& text)
{
    const QByteArray bytes = text.toUtf8();
    std::lock_guard<std::mutex> lock(mMutex);
    std::fprintf(stderr, "zel-demo: %s\n", bytes.constData());
    std::fflush(stderr);
}

QString quoted(const QString& text)
{
    return QLatin1Char('"') + text + QLatin1Char('"');
}

QString describeNode(const boost::shared_ptr<Zel_Node>& node)
{
    if (!node)
        return QStringLiteral("(no node)");
    return quoted(node->getName()) + QStringLiteral(" [") + node->getMimeType() + QLatin1Char(']');
}

QString errorCodeName(int code)
{
    switch (code) {
    case Zel_MemoryErrorCodes::UnknownMoniker: return QStringLiteral("UnknownMoniker");
    case Zel_MemoryErrorCodes::InvalidName: return QStringLiteral("InvalidName");
    case Zel_MemoryErrorCodes::PermissionDenied: return QStringLiteral("PermissionDenied");
    case Zel_MemoryErrorCodes::ReservedByOtherUser: return QStringLiteral("ReservedByOtherUser");
    case Zel_MemoryErrorCodes::NotLoggedIn: return QStringLiteral("NotLoggedIn");
    case Zel_MemoryErrorCodes::LoginFailed: return QStringLiteral("LoginFailed");
    case Zel_MemoryErrorCodes::NotConnected: return QStringLiteral("NotConnected");
    case Zel_MemoryErrorCodes::NameExists: return QStringLiteral("NameExists");
    case Zel_MemoryErrorCodes::NotAFolder: return QStringLiteral("NotAFolder");
    case Zel_MemoryErrorCodes::InvalidTarget: return QStringLiteral("InvalidTarget");
    case Zel_MemoryErrorCodes::PropertyNotModifiable: return QStringLiteral("PropertyNotModifiable");
    case Zel_MemoryErrorCodes::UnknownProperty: return QStringLiteral("UnknownProperty");
    case Zel_MemoryErrorCodes::PropertyExists: return QStringLiteral("PropertyExists");
    case Zel_MemoryErrorCodes::NotReserved: return QStringLiteral("NotReserved");
    case Zel_MemoryErrorCodes::InvalidArgument: return QStringLiteral("InvalidArgument");
    case Zel_MemoryErrorCodes::NotFound: return QStringLiteral("NotFound");
    case Zel_MemoryErrorCodes::NotMedia: return QStringLiteral("NotMedia");
    case Zel_MemoryErrorCodes::ValueChanged: return QStringLiteral("ValueChanged");
    case Zel_MemoryErrorCodes::InvalidMedia: return QStringLiteral("InvalidMedia");
    case Zel_MemoryErrorCodes::TooDeep: return QStringLiteral("TooDeep");
    case Zel_MemoryErrorCodes::MobIDExists: return QStringLiteral("MobIDExists");
    }
    return QStringLiteral("code");
}

QString errorHeadline(const boost::shared_ptr<Zel_Error>& error)
{
    if (!error || !error->isError())
        return QStringLiteral("no error");
    QString text = errorCodeName(error->getCode()) + QLatin1Char(' ') + QString::number(error->getCode());
    if (error->isPrivilegeError())
        text += QStringLiteral(" (privilege error)");
    return text;
}

QString describeError(const boost::shared_ptr<Zel_Error>& error)
{
    if (!error || !error->isError())
        return QStringLiteral("no error");
    return errorHeadline(error) + QStringLiteral(": ") + error->getMsg();
}
