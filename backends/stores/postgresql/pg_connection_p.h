// Internal: connections to a PostgreSQL store.
//
// openPostgresqlStore connects with Qt SQL's PostgreSQL driver to the
// database a store URL names (what the URL leaves out comes from libpq's PG*
// environment variables and defaults), and creates or migrates the schema.
// A failed connection is a StoreError that says what was wrong: the server
// cannot be reached (StoreUnavailable), or it refused the login: a wrong
// password, an unknown role, a missing database (LoginRefused).
//
// A connection lost (StoreUnavailable, OutcomeUnknown) is not reopened in
// place: the server forgot its prepared statements, so the owner makes a new
// Connection.
//
// Change transactions run SERIALIZABLE (beginPostgresqlWrite), so the
// server's rules hold under concurrent sessions; the serialization failures
// this causes are Conflict errors, for the caller to retry a bounded number
// of times. Writers take the journal lock (JournalLockKey) before their first
// change_journal row and keep it until they end, so the journal's numbers
// follow commit order.
#ifndef PG_CONNECTION_P_H
#define PG_CONNECTION_P_H

#include "sql_connection_p.h"
#include "sql_schema_p.h"
#include "sql_url_p.h"

#include <QByteArray>
#include <QList>
#include <QPair>

#include <memory>

namespace ZelSql {

// Advisory lock keys (pg_advisory_xact_lock): schema changes, journal writes.
const qint64 SchemaLockKey = 0x7a656c5343484dLL; // "zelSCHM"
const qint64 JournalLockKey = 0x7a656c4a524e4cLL; // "zelJRNL"

// The PostgreSQL dialect (stateless; one for the process).
const Dialect& postgresqlDialect();

// A connection to the URL's database; its schema not yet looked at.
std::unique_ptr<Connection> openPostgresqlConnection(const StoreUrl& url);

// A connection to a ready store: openPostgresqlConnection, then ensureSchema
// with the plan (this build's when none is given); what ensureSchema found
// and did goes to outcome when given.
std::unique_ptr<Connection> openPostgresqlStore(const StoreUrl& url, const SchemaPlan* plan = nullptr,
                                                SchemaOutcome* outcome = nullptr);

// Begins a change transaction: SERIALIZABLE.
void beginPostgresqlWrite(Connection& connection);
// Takes the journal lock inside the current transaction (appendToJournal
// does it through the dialect).
void lockPostgresqlJournal(Connection& connection);
// NOTIFY in the current transaction: the channel hears lastSeq, the number
// of the transaction's last journal entry, when (and only if) it commits.
void publishPostgresqlChanges(Connection& connection, const QByteArray& channel, qint64 lastSeq);

// The notification channel of a store's changes.
const char* const ChangeChannel = "zel_changes";

// The error for a connection that libpq could not make, from its message:
// which server (socket folder or host and port), and what went wrong.
StoreError postgresqlConnectError(const QList<QPair<QString, QString>>& parameters, const QString& libpqMessage);

// "socket /run/x" or "host:port", from the parameters or the PG* variables
// and libpq's defaults.
QString postgresqlServerName(const QList<QPair<QString, QString>>& parameters);

} // namespace ZelSql

#endif
