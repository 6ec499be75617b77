// Internal: one connection to a SQL store, and what differs between SQL
// dialects.
//
// A Connection owns one Qt SQL connection, added under a name no other
// connection in the process has and removed when the Connection is destroyed.
// Qt SQL connections belong to the thread that made them: a Connection is
// made, used and destroyed on one thread (each thread of a store opens its
// own). Qt SQL's driver loader is a QObject of the first thread that asks for
// a driver and lives as long as the process: when that is a thread not made
// by Qt, Qt keeps that thread's data to the end (a few hundred bytes), so the
// first Connection is best made on the main thread. Every statement binds its values; none is ever assembled from data.
// Failures are thrown as StoreError, mapped by the connection's Dialect.
#ifndef SQL_CONNECTION_P_H
#define SQL_CONNECTION_P_H

#include "sql_error_p.h"

#include <QSqlDatabase>
#include <QSqlError>
#include <QSqlQuery>
#include <QString>
#include <QStringList>
#include <QVariant>
#include <QVariantList>

#include <unordered_map>

namespace ZelSql {

class Connection;

class Dialect
{
public:
    virtual ~Dialect();
    // "SQLite" or "PostgreSQL", for messages.
    virtual QString name() const = 0;
    // The statements that create the newest schema, in order (without the
    // rows of zel_meta, which ensureSchema writes).
    virtual QStringList createSchema() const = 0;
    // The tables of the store's database, its own catalogue left out.
    virtual QStringList tables(Connection& connection) const = 0;
    // Begins a transaction for a schema change that holds every other
    // schema change off until it ends (also in other processes).
    virtual void beginSchemaChange(Connection& connection) const = 0;
    // Called in a write transaction before its first change_journal row:
    // whatever makes the journal's numbers follow commit order.
    virtual void beforeJournalWrite(Connection& connection) const;
    // The StoreError for a failed statement; commit is true when the
    // statement was the COMMIT of a transaction.
    virtual StoreError mapError(const QSqlError& error, Connection& connection, const QString& statement,
                                bool commit) const = 0;
};

class Connection
{
public:
    // Adds a Qt SQL connection of the driver ("QSQLITE", "QPSQL") under a
    // new name; not opened yet. Throws Internal when Qt has no such driver.
    Connection(const Dialect& dialect, const QString& driver);
    // Closes the connection and removes it from Qt's list.
    ~Connection();

    const Dialect& dialect() const { return mDialect; }
    QSqlDatabase& database() { return mDatabase; }
    const QString& connectionName() const { return mName; }

    // Runs one statement with its values bound in order and returns the
    // query, positioned before its first row. A statement without values is
    // run unprepared (DDL and transaction control cannot be prepared). With
    // values it is prepared for this one run (on PostgreSQL a round trip of
    // its own): statements run often go through execPrepared.
    QSqlQuery exec(const QString& sql, const QVariantList& values = QVariantList());
    // The same for a statement of the hot path: prepared once and kept for
    // the connection's life, bound and run again on each call. The answer is
    // the kept query itself: read its rows, then finish() it (SQLite cannot
    // commit while a statement has rows left to give).
    QSqlQuery& execPrepared(const QString& sql, const QVariantList& values);
    // Throws the error that ended a query's rows early: QSqlQuery::next()
    // answers false both at the end and on an error met while stepping.
    void checkRows(const QSqlQuery& query, const QString& sql);
    // The first column of the first row, or a null QVariant when there is none.
    QVariant value(const QString& sql, const QVariantList& values = QVariantList());
    // COMMIT: a connection lost here is OutcomeUnknown.
    void commit();
    // ROLLBACK, ignoring failures (a lost connection has no transaction left);
    // then frees the statement that failed, if any.
    void rollback() noexcept;

private:
    Connection(const Connection&) = delete;
    Connection& operator=(const Connection&) = delete;

    const Dialect& mDialect;
    QString mName;
    QSqlDatabase mDatabase;
    // The last statement that failed, kept until the transaction has ended:
    // the driver frees a prepared statement when its query is destroyed,
    // which an aborted PostgreSQL transaction refuses.
    QSqlQuery mFailed;
    struct TextHash {
        std::size_t operator()(const QString& text) const { return qHash(text); }
    };
    // The prepared statements of execPrepared, by their text.
    std::unordered_map<QString, QSqlQuery, TextHash> mPrepared;
};

} // namespace ZelSql

#endif
