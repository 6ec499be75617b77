// Internal: the URL that names a store.
//
//   memory:                     the in-memory sample tree
//   memory:FILE.json            an in-memory tree loaded from (and saved to) a file
//   sqlite:PATH                 a SQLite file (also sqlite:///ABSOLUTE/PATH)
//   postgresql://user@host:port/db?param=value...
//                               a PostgreSQL database, as libpq reads the URL
//                               (postgres:// too); what the URL leaves out comes
//                               from libpq's PG* environment variables and
//                               defaults when connecting.
// parseStoreUrl throws StoreError(BadUrl) with a message that quotes the URL
// (its password masked) and says what is wrong with it.
#ifndef SQL_URL_P_H
#define SQL_URL_P_H

#include <QList>
#include <QPair>
#include <QString>

namespace ZelSql {

struct StoreUrl {
    enum Type { Memory, Sqlite, Postgresql };
    Type type = Memory;
    // The URL as given, its password masked: for messages.
    QString display;
    // Memory: the tree file (empty for the sample tree). Sqlite: the file.
    QString path;
    // PostgreSQL: the parameters the URL sets, by libpq's keywords (host,
    // port, dbname, user, password, sslmode, ...), in libpq's order.
    QList<QPair<QString, QString>> parameters;

    // A PostgreSQL parameter's value; empty when the URL does not set it.
    QString parameter(const QString& keyword) const;
};

StoreUrl parseStoreUrl(const QString& text);

// The URL with any password replaced by "***" (user:secret@host and
// password=secret alike).
QString maskedUrl(const QString& text);

} // namespace ZelSql

#endif
