// Internal: connections to a SQLite store file.
//
// openSqliteStore opens (creating when missing) the file with Qt SQL's SQLite
// driver, refuses a file that is not a SQLite database, is damaged, belongs
// to something else or has a newer schema (each a StoreError naming the file,
// the file left unchanged), switches it to WAL mode (readers never wait for
// the writer; several processes share the file), turns foreign keys on and
// creates or migrates the schema.
//
// Writers wait for each other: a write transaction (beginWrite, BEGIN
// IMMEDIATE) waits up to the busy timeout for another connection's write
// transaction to end, then fails with StoreUnavailable rather than hang.
#ifndef SQLITE_CONNECTION_P_H
#define SQLITE_CONNECTION_P_H

#include "sql_connection_p.h"
#include "sql_schema_p.h"

#include <memory>

namespace ZelSql {

// How long a write waits for another connection's write transaction to end
// before the request is answered with StoreUnavailable: 5 seconds.
const int SqliteBusyTimeoutMs = 5000;

struct SqliteOptions {
    int busyTimeoutMs = SqliteBusyTimeoutMs;
};

// The SQLite dialect (stateless; one for the process).
const Dialect& sqliteDialect();

// A connection to the file, opened and checked to be a SQLite database, with
// foreign keys on; its schema not yet looked at.
std::unique_ptr<Connection> openSqliteConnection(const QString& path, const SqliteOptions& options = SqliteOptions());

// A connection to a ready store: openSqliteConnection, then WAL mode and
// ensureSchema with the plan (this build's when none is given); what
// ensureSchema found and did goes to outcome when given.
std::unique_ptr<Connection> openSqliteStore(const QString& path, const SqliteOptions& options = SqliteOptions(),
                                            const SchemaPlan* plan = nullptr, SchemaOutcome* outcome = nullptr);

// Begins a write transaction (BEGIN IMMEDIATE: takes the write lock now, so
// the transaction never fails later for a write lock it cannot get).
void beginSqliteWrite(Connection& connection);

} // namespace ZelSql

#endif
