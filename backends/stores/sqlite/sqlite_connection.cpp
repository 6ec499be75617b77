#include "sqlite_connection_p.h"

#include <QDir>
#include <QElapsedTimer>
#include <QFileInfo>
#include <QThread>

namespace ZelSql {

namespace {

// SQLite's primary result codes that the mapping tells apart.
enum SqliteCode {
    SqliteBusy = 5,
    SqliteLocked = 6,
    SqliteReadOnly = 8,
    SqliteIoError = 10,
    SqliteCorrupt = 11,
    SqliteFull = 13,
    SqliteCantOpen = 14,
    SqliteConstraint = 19,
    SqliteNotADatabase = 26
};

int busyTimeoutOf(Connection& connection)
{
    const QString options = connection.database().connectOptions();
    const QLatin1String key("QSQLITE_BUSY_TIMEOUT=");
    const int at = options.indexOf(key);
    return at < 0 ? 0 : options.mid(at + key.size()).section(QLatin1Char(';'), 0, 0).toInt();
}

class SqliteDialect : public Dialect
{
public:
    QString name() const override { return QStringLiteral("SQLite"); }

    QStringList createSchema() const override
    {
        QStringList statements;
        statements << QStringLiteral("CREATE TABLE zel_meta (key TEXT PRIMARY KEY, value TEXT NOT NULL)");
        // nid is the rowid: the fastest key SQLite has.
        statements << QStringLiteral(
            "CREATE TABLE nodes ("
            " nid INTEGER PRIMARY KEY,"
            " id TEXT NOT NULL UNIQUE,"
            " moniker TEXT NOT NULL UNIQUE,"
            " parent_nid INTEGER REFERENCES nodes (nid) ON DELETE CASCADE,"
            " position BIGINT NOT NULL,"
            " name TEXT NOT NULL,"
            " mime_type TEXT NOT NULL,"
            " master_moniker TEXT NOT NULL DEFAULT '',"
            " mob_id TEXT,"
            " user_placed BOOLEAN NOT NULL DEFAULT 1,"
            " created_ms BIGINT NOT NULL,"
            " modified_ms BIGINT NOT NULL,"
            " reserved_by TEXT,"
            " reserved_since_ms BIGINT,"
            " reserved_until_ms BIGINT,"
            " UNIQUE (parent_nid, name))");
        statements << commonSchemaStatements();
        // AUTOINCREMENT: a number is never used twice, even after the newest
        // rows are pruned. One writer at a time makes number order commit order.
        statements << QStringLiteral(
            "CREATE TABLE change_journal ("
            " seq INTEGER PRIMARY KEY AUTOINCREMENT,"
            " kind SMALLINT NOT NULL CHECK (kind IN (1, 2, 4)),"
            " parent_moniker TEXT NOT NULL,"
            " child_moniker TEXT NOT NULL,"
            " origin TEXT NOT NULL,"
            " committed_ms BIGINT NOT NULL)");
        return statements;
    }

    QStringList tables(Connection& connection) const override
    {
        QSqlQuery query = connection.exec(
            QStringLiteral("SELECT name FROM sqlite_master WHERE type = 'table' AND name NOT LIKE 'sqlite!_%' ESCAPE '!'"));
        QStringList names;
        while (query.next())
            names << query.value(0).toString();
        connection.checkRows(query, QStringLiteral("sqlite_master"));
        return names;
    }

    void beginSchemaChange(Connection& connection) const override { beginSqliteWrite(connection); }

    StoreError mapError(const QSqlError& error, Connection& connection, const QString& statement,
                        bool commit) const override
    {
        const QString code = error.nativeErrorCode();
        const int primary = code.toInt() & 0xff;
        const QString text = error.databaseText().isEmpty() ? error.text() : error.databaseText();
        const QString file = connection.database().databaseName();
        switch (primary) {
        case SqliteBusy:
        case SqliteLocked:
            return StoreError(StoreError::StoreUnavailable,
                              QStringLiteral("SQLite: the store %1 is busy: another connection held it for longer than the busy timeout (%2 ms) (%3)")
                                  .arg(file)
                                  .arg(busyTimeoutOf(connection))
                                  .arg(text),
                              code);
        case SqliteNotADatabase:
            return StoreError(StoreError::Damaged,
                              QStringLiteral("SQLite: %1 is not a zel store: not a SQLite database (%2)").arg(file, text), code);
        case SqliteCorrupt:
            return StoreError(StoreError::Damaged,
                              QStringLiteral("SQLite: the store %1 is damaged (%2)").arg(file, text), code);
        case SqliteCantOpen:
        case SqliteReadOnly:
        case SqliteIoError:
        case SqliteFull:
            return StoreError(commit && primary == SqliteIoError ? StoreError::OutcomeUnknown : StoreError::StoreUnavailable,
                              QStringLiteral("SQLite: cannot use the store file %1 (%2)").arg(file, text), code);
        case SqliteConstraint: {
            StoreError::Kind kind = StoreError::CheckViolation;
            if (text.startsWith(QLatin1String("UNIQUE")) || text.startsWith(QLatin1String("PRIMARY KEY")))
                kind = StoreError::UniqueViolation;
            else if (text.startsWith(QLatin1String("FOREIGN KEY")))
                kind = StoreError::ForeignKeyViolation;
            else if (text.startsWith(QLatin1String("NOT NULL")))
                kind = StoreError::NotNullViolation;
            return StoreError(kind, QStringLiteral("SQLite: %1").arg(text), code);
        }
        default:
            return StoreError(StoreError::Internal,
                              QStringLiteral("SQLite: statement failed on %1: %2 [%3]").arg(file, text, statement.left(80)), code);
        }
    }
};

} // namespace

const Dialect& sqliteDialect()
{
    static const SqliteDialect dialect;
    return dialect;
}

void beginSqliteWrite(Connection& connection)
{
    connection.exec(QStringLiteral("BEGIN IMMEDIATE"));
}

std::unique_ptr<Connection> openSqliteConnection(const QString& path, const SqliteOptions& options)
{
    std::unique_ptr<Connection> connection(new Connection(sqliteDialect(), QStringLiteral("QSQLITE")));
    QSqlDatabase& database = connection->database();
    database.setDatabaseName(path);
    database.setConnectOptions(QStringLiteral("QSQLITE_BUSY_TIMEOUT=%1").arg(options.busyTimeoutMs));
    if (!database.open()) {
        const QFileInfo info(path);
        QString why = database.lastError().databaseText();
        if (!info.absoluteDir().exists())
            why = QStringLiteral("its folder %1 does not exist").arg(info.absolutePath());
        else if (info.isDir())
            why = QStringLiteral("it is a folder");
        throw StoreError(StoreError::StoreUnavailable, QStringLiteral("SQLite: cannot open the store file %1: %2").arg(path, why),
                         database.lastError().nativeErrorCode());
    }
    // SQLite reads the file only now: a file that is no database fails here.
    connection->exec(QStringLiteral("SELECT count(*) FROM sqlite_master"));
    connection->exec(QStringLiteral("PRAGMA foreign_keys = ON"));
    return connection;
}

namespace {

// WAL mode and the schema, once.
SchemaOutcome prepareStore(Connection& connection, const QString& path, const SchemaPlan& wanted)
{
    // WAL is a lasting property of the file: set it only on an empty file or
    // on a zel store this build can use, never on someone else's database.
    const QStringList tables = sqliteDialect().tables(connection);
    const bool ours = tables.isEmpty()
        || (tables.contains(QLatin1String(MetaTable)) && storedSchemaVersion(connection) <= wanted.version);
    if (ours && path != QLatin1String(":memory:")) {
        const QString mode = connection.value(QStringLiteral("PRAGMA journal_mode = WAL")).toString();
        if (mode.compare(QLatin1String("wal"), Qt::CaseInsensitive) != 0) {
            throw StoreError(StoreError::StoreUnavailable,
                             QStringLiteral("SQLite: the store file %1 cannot use WAL mode (journal mode stays \"%2\")").arg(path, mode));
        }
    }
    return ensureSchema(connection, wanted);
}

bool isBusy(const StoreError& error)
{
    const int primary = error.nativeCode().toInt() & 0xff;
    return primary == SqliteBusy || primary == SqliteLocked;
}

} // namespace

std::unique_ptr<Connection> openSqliteStore(const QString& path, const SqliteOptions& options, const SchemaPlan* plan,
                                            SchemaOutcome* outcome)
{
    std::unique_ptr<Connection> connection = openSqliteConnection(path, options);
    const SchemaPlan current = plan ? SchemaPlan() : currentSchemaPlan(*connection);
    const SchemaPlan& wanted = plan ? *plan : current;

    // Connections opening a new file together can meet in SQLite's deadlock
    // guard (one switching to WAL while another creates the schema), which
    // answers busy at once instead of waiting: try again, within the busy
    // timeout, as a waiting lock would.
    QElapsedTimer waited;
    waited.start();
    for (;;) {
        try {
            const SchemaOutcome done = prepareStore(*connection, path, wanted);
            if (outcome)
                *outcome = done;
            return connection;
        } catch (const StoreError& error) {
            if (!isBusy(error) || waited.elapsed() >= options.busyTimeoutMs)
                throw;
        }
        QThread::msleep(5);
    }
}

} // namespace ZelSql
