// The PostgreSQL store's database: the schema made on first open and kept,
// its rules, schema versions (newer refused, older migrated), a database of
// other tables, logins refused with what was wrong, and the errors of
// concurrent and interrupted transactions. Each test works in a database of
// its own on the cluster of scripts/with-postgresql.sh.
#include "StoreTestSupport.h"

#include "pg_connection_p.h"
#include "sql_schema_p.h"

#include <QSqlDatabase>

using namespace ZelSql;
using StoreTest::count;
using StoreTest::str;

namespace {

SchemaPlan planWithColour(Connection& connection, bool failing = false)
{
    SchemaPlan plan = currentSchemaPlan(connection);
    plan.version = SchemaVersion + 1;
    const QString addColumn = QStringLiteral("ALTER TABLE nodes ADD COLUMN colour TEXT NOT NULL DEFAULT ''");
    plan.create << addColumn;
    plan.steps.push_back({SchemaVersion, [=](Connection& c) {
                              c.exec(addColumn);
                              c.exec(QStringLiteral("UPDATE nodes SET colour = ?"), {QStringLiteral("red")});
                              if (failing)
                                  throw StoreError(StoreError::Internal, QStringLiteral("step broke"));
                          }});
    return plan;
}

bool hasColumn(Connection& connection, const QString& table, const QString& column)
{
    return count(connection,
                 QStringLiteral("SELECT count(*) FROM information_schema.columns"
                                " WHERE table_schema = current_schema() AND table_name = ? AND column_name = ?"),
                 {table, column})
        == 1;
}

QString serverOf(const StoreUrl& url)
{
    return postgresqlServerName(url.parameters);
}

} // namespace

TEST(PostgresqlStore, CreatesTheSchemaOnFirstOpenAndKeepsItOnReopening)
{
    SKIP_WITHOUT_POSTGRESQL();
    StoreTest::ScratchDatabase scratch;
    {
        SchemaOutcome outcome;
        std::unique_ptr<Connection> store = openPostgresqlStore(scratch.url(), nullptr, &outcome);
        EXPECT_TRUE(outcome.created);
        EXPECT_EQ(0, outcome.foundVersion);
        EXPECT_EQ(SchemaVersion, outcome.version);
        EXPECT_EQ(StoreTest::expectedTables(), StoreTest::sortedTables(*store));
        EXPECT_EQ(SchemaVersion, storedSchemaVersion(*store));
        StoreTest::insertNode(*store, QStringLiteral("R"), 0, QStringLiteral("Root"));
    }
    SchemaOutcome outcome;
    std::unique_ptr<Connection> again = openPostgresqlStore(scratch.url(), nullptr, &outcome);
    EXPECT_FALSE(outcome.created);
    EXPECT_EQ(SchemaVersion, outcome.foundVersion);
    EXPECT_EQ(1, count(*again, QStringLiteral("SELECT count(*) FROM nodes WHERE name = ?"), {QStringLiteral("Root")}));
    EXPECT_EQ(1, count(*again, QStringLiteral("SELECT count(*) FROM zel_meta")));
    EXPECT_EQ(1, QSqlDatabase::connectionNames().size());
    again.reset();
    EXPECT_TRUE(QSqlDatabase::connectionNames().isEmpty());
}

TEST(PostgresqlStore, SchemaKeepsSiblingNamesUniqueAndRemovesWholeSubtrees)
{
    SKIP_WITHOUT_POSTGRESQL();
    StoreTest::ScratchDatabase scratch;
    std::unique_ptr<Connection> store = openPostgresqlStore(scratch.url());
    StoreTest::expectSchemaRules(*store);
}

TEST(PostgresqlStore, RefusesANewerSchemaAndChangesNothing)
{
    SKIP_WITHOUT_POSTGRESQL();
    StoreTest::ScratchDatabase scratch;
    {
        std::unique_ptr<Connection> store = openPostgresqlStore(scratch.url());
        store->exec(QStringLiteral("UPDATE zel_meta SET value = ? WHERE key = ?"), {QStringLiteral("7"), QStringLiteral("schema_version")});
        store->exec(QStringLiteral("DROP TABLE documents"));
    }
    EXPECT_STORE_ERROR(StoreError::Incompatible,
                       QStringLiteral("PostgreSQL: the store has schema version 7, newer than this build of zel reads (up to %1); nothing was changed")
                           .arg(SchemaVersion),
                       openPostgresqlStore(scratch.url()));
    std::unique_ptr<Connection> look = openPostgresqlConnection(scratch.url());
    EXPECT_EQ(7, storedSchemaVersion(*look));
    EXPECT_FALSE(StoreTest::sortedTables(*look).contains(QStringLiteral("documents")));
}

TEST(PostgresqlStore, MigratesAnOlderSchemaOneStepPerTransaction)
{
    SKIP_WITHOUT_POSTGRESQL();
    StoreTest::ScratchDatabase scratch;
    {
        std::unique_ptr<Connection> store = openPostgresqlStore(scratch.url());
        StoreTest::insertNode(*store, QStringLiteral("R"), 0, QStringLiteral("Root"));
    }
    std::unique_ptr<Connection> store = openPostgresqlConnection(scratch.url());
    // The failing step's ALTER TABLE is rolled back with it.
    EXPECT_STORE_ERROR(StoreError::Internal,
                       QStringLiteral("PostgreSQL: migrating the store from schema version %1 to %2 failed; it keeps version %1: step broke")
                           .arg(SchemaVersion)
                           .arg(SchemaVersion + 1),
                       ensureSchema(*store, planWithColour(*store, true)));
    EXPECT_EQ(SchemaVersion, storedSchemaVersion(*store));
    EXPECT_FALSE(hasColumn(*store, QStringLiteral("nodes"), QStringLiteral("colour")));

    const SchemaOutcome outcome = ensureSchema(*store, planWithColour(*store));
    EXPECT_EQ(SchemaVersion, outcome.foundVersion);
    EXPECT_EQ(SchemaVersion + 1, outcome.version);
    EXPECT_EQ(SchemaVersion + 1, storedSchemaVersion(*store));
    EXPECT_EQ("red", str(store->value(QStringLiteral("SELECT colour FROM nodes WHERE id = ?"), {QStringLiteral("R")}).toString()));
    EXPECT_STORE_ERROR(StoreError::Incompatible,
                       QStringLiteral("PostgreSQL: the store has schema version %1, newer than this build of zel reads (up to %2); nothing was changed")
                           .arg(SchemaVersion + 1)
                           .arg(SchemaVersion),
                       openPostgresqlStore(scratch.url()));
}

TEST(PostgresqlStore, RefusesADatabaseOfOtherTablesAndLeavesItAlone)
{
    SKIP_WITHOUT_POSTGRESQL();
    StoreTest::ScratchDatabase scratch;
    {
        std::unique_ptr<Connection> foreign = openPostgresqlConnection(scratch.url());
        foreign->exec(QStringLiteral("CREATE TABLE photos (id BIGINT PRIMARY KEY, file TEXT)"));
    }
    EXPECT_STORE_ERROR(StoreError::Incompatible,
                       QStringLiteral("PostgreSQL: the database is not a zel store: it holds other tables (photos) and no zel_meta; nothing was changed"),
                       openPostgresqlStore(scratch.url()));
    std::unique_ptr<Connection> look = openPostgresqlConnection(scratch.url());
    EXPECT_EQ(QStringList{QStringLiteral("photos")}, StoreTest::sortedTables(*look));
}

TEST(PostgresqlStore, LoginRefusalsNameTheRoleTheDatabaseOrThePassword)
{
    SKIP_WITHOUT_POSTGRESQL();
    const StoreUrl missing = StoreTest::urlOfDatabase(QStringLiteral("no_such_zel_store"));
    const QString server = serverOf(missing);
    EXPECT_STORE_ERROR(StoreError::LoginRefused,
                       QStringLiteral("PostgreSQL server %1 has no database \"no_such_zel_store\" (connection to server on socket \"%2/.s.PGSQL.%3\" failed: FATAL:  database \"no_such_zel_store\" does not exist)")
                           .arg(server, missing.parameter(QStringLiteral("host")), QStringLiteral("5432")),
                       openPostgresqlStore(missing));

    StoreUrl ghost = StoreTest::urlOfDatabase(QStringLiteral("zel"));
    for (auto& parameter : ghost.parameters) {
        if (parameter.first == QLatin1String("user"))
            parameter.second = QStringLiteral("zel_ghost");
    }
    const StoreError noRole = StoreTest::storeErrorOf([&] { openPostgresqlStore(ghost); });
    EXPECT_EQ(StoreError::LoginRefused, noRole.kind());
    // Other roles than the owner log in with a password: a role that does
    // not exist is refused as a wrong password would be (the server does not
    // tell which).
    EXPECT_EQ(0, noRole.message().indexOf(QStringLiteral("PostgreSQL server %1 refused the login of role \"zel_ghost\": wrong or missing password (").arg(server)))
        << noRole.what();

    StoreTest::adminExec(QStringLiteral("DROP ROLE IF EXISTS zel_editor"));
    StoreTest::adminExec(QStringLiteral("CREATE ROLE zel_editor LOGIN PASSWORD 'right horse'"));
    StoreUrl editor = ghost;
    for (auto& parameter : editor.parameters) {
        if (parameter.first == QLatin1String("user"))
            parameter.second = QStringLiteral("zel_editor");
    }
    editor.parameters.append(qMakePair(QStringLiteral("password"), QStringLiteral("wrong horse")));
    const StoreError wrong = StoreTest::storeErrorOf([&] { openPostgresqlStore(editor); });
    EXPECT_EQ(StoreError::LoginRefused, wrong.kind());
    EXPECT_EQ(str(QStringLiteral("PostgreSQL server %1 refused the login of role \"zel_editor\": wrong or missing password (connection to server on socket \"%2/.s.PGSQL.5432\" failed: FATAL:  password authentication failed for user \"zel_editor\")")
                      .arg(server, editor.parameter(QStringLiteral("host")))),
              str(wrong.message()));
    EXPECT_EQ(-1, wrong.message().indexOf(QStringLiteral("horse")));
    editor.parameters.last().second = QStringLiteral("right horse");
    EXPECT_NO_THROW(openPostgresqlConnection(editor));
    StoreTest::adminExec(QStringLiteral("DROP ROLE zel_editor"));
    EXPECT_TRUE(QSqlDatabase::connectionNames().isEmpty());
}

TEST(PostgresqlStore, ConcurrentSerializableWritersConflict)
{
    SKIP_WITHOUT_POSTGRESQL();
    StoreTest::ScratchDatabase scratch;
    std::unique_ptr<Connection> first = openPostgresqlStore(scratch.url());
    std::unique_ptr<Connection> second = openPostgresqlStore(scratch.url());
    const QString read = QStringLiteral("SELECT value FROM counters WHERE name = ?");
    const QString bump = QStringLiteral("UPDATE counters SET value = ? WHERE name = ?");
    const QString key = QStringLiteral("node_id");
    beginPostgresqlWrite(*first);
    beginPostgresqlWrite(*second);
    const qint64 seenByFirst = first->value(read, {key}).toLongLong();
    const qint64 seenBySecond = second->value(read, {key}).toLongLong();
    first->exec(bump, {seenByFirst + 1, key});
    first->commit();
    const StoreError lost = StoreTest::storeErrorOf([&] { second->exec(bump, {seenBySecond + 1, key}); });
    EXPECT_EQ(StoreError::Conflict, lost.kind()) << lost.what();
    EXPECT_EQ("40001", str(lost.nativeCode()));
    EXPECT_TRUE(lost.retryTransaction());
    EXPECT_EQ(0, lost.message().indexOf(QStringLiteral("PostgreSQL: the transaction conflicted with a concurrent one (ERROR:  could not serialize access")))
        << lost.what();
    second->rollback();
    // Run again in a fresh transaction, the second writer succeeds.
    beginPostgresqlWrite(*second);
    second->exec(bump, {second->value(read, {key}).toLongLong() + 1, key});
    second->commit();
    EXPECT_EQ(2, count(*first, read, {key}));
}

TEST(PostgresqlStore, LostConnectionIsUnavailableAndALostCommitHasAnUnknownOutcome)
{
    SKIP_WITHOUT_POSTGRESQL();
    StoreTest::ScratchDatabase scratch;
    std::unique_ptr<Connection> admin = openPostgresqlStore(scratch.url());
    std::unique_ptr<Connection> victim = openPostgresqlStore(scratch.url());
    const QString terminate = QStringLiteral("SELECT pg_terminate_backend(?)");

    qint64 pid = victim->value(QStringLiteral("SELECT pg_backend_pid()")).toLongLong();
    EXPECT_TRUE(admin->value(terminate, {pid}).toBool());
    const StoreError gone = StoreTest::storeErrorOf([&] { victim->exec(QStringLiteral("SELECT count(*) FROM nodes")); });
    EXPECT_EQ(StoreError::StoreUnavailable, gone.kind()) << gone.what();
    EXPECT_TRUE(gone.retryCall());
    EXPECT_EQ(0, gone.message().indexOf(QStringLiteral("PostgreSQL: the connection to the server was lost ("))) << gone.what();

    std::unique_ptr<Connection> writer = openPostgresqlStore(scratch.url());
    pid = writer->value(QStringLiteral("SELECT pg_backend_pid()")).toLongLong();
    beginPostgresqlWrite(*writer);
    StoreTest::insertNode(*writer, QStringLiteral("R"), 0, QStringLiteral("Root"));
    EXPECT_TRUE(admin->value(terminate, {pid}).toBool());
    const StoreError unknown = StoreTest::storeErrorOf([&] { writer->commit(); });
    EXPECT_EQ(StoreError::OutcomeUnknown, unknown.kind()) << unknown.what();
    EXPECT_FALSE(unknown.retryCall());
    EXPECT_FALSE(unknown.retryTransaction());
    EXPECT_EQ(0, unknown.message().indexOf(QStringLiteral("PostgreSQL: the connection was lost during COMMIT; the change may or may not be stored (")))
        << unknown.what();
    EXPECT_EQ(0, count(*admin, QStringLiteral("SELECT count(*) FROM nodes")));
}

TEST(PostgresqlStore, PreparedStatementsAreKeptAcrossTransactionsAndFailures)
{
    SKIP_WITHOUT_POSTGRESQL();
    StoreTest::ScratchDatabase scratch;
    std::unique_ptr<Connection> store = openPostgresqlStore(scratch.url());
    const QString insert = QStringLiteral("INSERT INTO users (name, password, full_name, admin) VALUES (?, ?, ?, ?)");
    const QString select = QStringLiteral("SELECT full_name FROM users WHERE name = ?");

    beginPostgresqlWrite(*store);
    store->execPrepared(insert, {QStringLiteral("ann"), QStringLiteral("pw"), QStringLiteral("Ann Example"), false});
    store->commit();
    // The same statement fails inside a transaction, which aborts it ...
    beginPostgresqlWrite(*store);
    const StoreError twice = StoreTest::storeErrorOf(
        [&] { store->execPrepared(insert, {QStringLiteral("ann"), QStringLiteral("pw"), QStringLiteral("Ann Again"), true}); });
    EXPECT_EQ(StoreError::UniqueViolation, twice.kind()) << twice.what();
    store->rollback();
    // ... and still serves the next transaction, with new values.
    beginPostgresqlWrite(*store);
    store->execPrepared(insert, {QStringLiteral("bob"), QStringLiteral("pw"), QStringLiteral("Bob Example"), true});
    store->commit();
    for (const char* name : {"ann", "bob"}) {
        QSqlQuery& query = store->execPrepared(select, {QString::fromLatin1(name)});
        ASSERT_TRUE(query.next()) << name;
        EXPECT_EQ(name[0] == 'a' ? "Ann Example" : "Bob Example", str(query.value(0).toString()));
        query.finish();
    }
    EXPECT_EQ(2, count(*store, QStringLiteral("SELECT count(*) FROM users")));
}
