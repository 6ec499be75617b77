#include "sql_url_p.h"

#include "sql_error_p.h"

#include <libpq-fe.h>

namespace ZelSql {

namespace {

const char* const Expected = "expected memory:, memory:FILE.json, sqlite:PATH or postgresql://USER@HOST:PORT/DATABASE";

[[noreturn]] void bad(const QString& text, const QString& what)
{
    throw StoreError(StoreError::BadUrl,
                     QStringLiteral("bad store URL \"%1\": %2").arg(maskedUrl(text), what));
}

// The parameters of a libpq URL, or a BadUrl error with libpq's reason.
QList<QPair<QString, QString>> libpqParameters(const QString& text, const QString& uri)
{
    char* error = nullptr;
    const QByteArray utf8 = uri.toUtf8();
    PQconninfoOption* options = PQconninfoParse(utf8.constData(), &error);
    if (!options) {
        QString reason = error ? QString::fromUtf8(error).trimmed() : QStringLiteral("libpq cannot read it");
        if (error)
            PQfreemem(error);
        // libpq's messages about a URL may quote it whole, password and all.
        bad(text, maskedUrl(reason));
    }
    QList<QPair<QString, QString>> parameters;
    for (PQconninfoOption* option = options; option->keyword; ++option) {
        if (option->val)
            parameters.append(qMakePair(QString::fromUtf8(option->keyword), QString::fromUtf8(option->val)));
    }
    PQconninfoFree(options);
    return parameters;
}

} // namespace

QString StoreUrl::parameter(const QString& keyword) const
{
    for (const auto& parameter : parameters) {
        if (parameter.first == keyword)
            return parameter.second;
    }
    return QString();
}

QString maskedUrl(const QString& text)
{
    QString masked = text;
    // user:secret@ in the authority of a URL.
    const int scheme = masked.indexOf(QLatin1String("://"));
    if (scheme >= 0) {
        const int start = scheme + 3;
        int end = masked.indexOf(QLatin1Char('/'), start);
        const int query = masked.indexOf(QLatin1Char('?'), start);
        if (end < 0 || (query >= 0 && query < end))
            end = query;
        if (end < 0)
            end = masked.size();
        const int at = masked.lastIndexOf(QLatin1Char('@'), end - 1);
        if (at >= start) {
            const int colon = masked.indexOf(QLatin1Char(':'), start);
            if (colon >= 0 && colon < at)
                masked.replace(colon + 1, at - colon - 1, QStringLiteral("***"));
        }
    }
    // password=secret among the query parameters (or a key=value string).
    int from = 0;
    for (;;) {
        const int found = masked.indexOf(QLatin1String("password="), from);
        if (found < 0)
            break;
        const int value = found + 9;
        const bool startsParameter = found == 0 || masked.at(found - 1) == QLatin1Char('?')
            || masked.at(found - 1) == QLatin1Char('&') || masked.at(found - 1).isSpace();
        if (startsParameter) {
            int end = value;
            while (end < masked.size() && masked.at(end) != QLatin1Char('&') && !masked.at(end).isSpace())
                ++end;
            masked.replace(value, end - value, QStringLiteral("***"));
            from = value + 3;
        } else {
            from = value;
        }
    }
    return masked;
}

StoreUrl parseStoreUrl(const QString& text)
{
    if (text.trimmed().isEmpty())
        throw StoreError(StoreError::BadUrl, QStringLiteral("empty store URL: %1").arg(QLatin1String(Expected)));
    const int colon = text.indexOf(QLatin1Char(':'));
    if (colon <= 0)
        bad(text, QStringLiteral("no store type before a colon; %1").arg(QLatin1String(Expected)));
    const QString scheme = text.left(colon).toLower();
    const QString rest = text.mid(colon + 1);

    StoreUrl url;
    url.display = maskedUrl(text);
    if (scheme == QLatin1String("memory")) {
        url.type = StoreUrl::Memory;
        url.path = rest;
        return url;
    }
    if (scheme == QLatin1String("sqlite")) {
        url.type = StoreUrl::Sqlite;
        if (rest.startsWith(QLatin1String("//"))) {
            // sqlite:///ABSOLUTE/PATH: a URL with an empty host.
            if (!rest.startsWith(QLatin1String("///")))
                bad(text, QStringLiteral("a SQLite store is a local file: write sqlite:PATH or sqlite:///ABSOLUTE/PATH"));
            url.path = rest.mid(2);
        } else {
            url.path = rest;
        }
        if (url.path.isEmpty())
            bad(text, QStringLiteral("the SQLite store needs a file path (sqlite:PATH)"));
        return url;
    }
    if (scheme == QLatin1String("postgresql") || scheme == QLatin1String("postgres")) {
        url.type = StoreUrl::Postgresql;
        if (!rest.startsWith(QLatin1String("//")))
            bad(text, QStringLiteral("a PostgreSQL URL starts with postgresql://"));
        url.parameters = libpqParameters(text, QStringLiteral("postgresql:") + rest);
        return url;
    }
    bad(text, QStringLiteral("unknown store type \"%1\"; %2").arg(text.left(colon), QLatin1String(Expected)));
}

} // namespace ZelSql
