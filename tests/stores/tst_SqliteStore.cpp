// The SQLite store file: the schema made on first open and kept on reopening,
// its rules and indexes, schema versions (newer refused, older migrated),
// files that are not a zel store or are damaged, and the busy timeout.
#include "StoreTestSupport.h"

#include "sql_schema_p.h"
#include "sqlite_connection_p.h"

#include <QFile>
#include <QSqlDatabase>
#include <QTemporaryDir>

using namespace ZelSql;
using StoreTest::count;
using StoreTest::str;

namespace {

QByteArray contentOf(const QString& path)
{
    QFile file(path);
    EXPECT_TRUE(file.open(QIODevice::ReadOnly)) << str(path);
    return file.readAll();
}

void writeFile(const QString& path, const QByteArray& content)
{
    QFile file(path);
    ASSERT_TRUE(file.open(QIODevice::WriteOnly | QIODevice::Truncate)) << str(path);
    file.write(content);
}

QString queryPlan(Connection& connection, const QString& sql, const QVariantList& values)
{
    QSqlQuery plan = connection.exec(QStringLiteral("EXPLAIN QUERY PLAN ") + sql, values);
    QStringList details;
    while (plan.next())
        details << plan.value(3).toString();
    return details.join(QStringLiteral(" | "));
}

// A plan of version 2: version 1 plus a column, and its migration step.
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
    QSqlQuery columns = connection.exec(QStringLiteral("SELECT name FROM pragma_table_info(?)"), {table});
    while (columns.next()) {
        if (columns.value(0).toString() == column)
            return true;
    }
    return false;
}

} // namespace

TEST(SqliteStore, CreatesTheSchemaOnFirstOpenAndKeepsItOnReopening)
{
    QTemporaryDir dir;
    const QString path = dir.filePath(QStringLiteral("t.zel"));
    {
        std::unique_ptr<Connection> store = openSqliteStore(path);
        EXPECT_EQ(StoreTest::expectedTables(), StoreTest::sortedTables(*store));
        EXPECT_EQ(SchemaVersion, storedSchemaVersion(*store));
        EXPECT_EQ("wal", str(store->value(QStringLiteral("PRAGMA journal_mode")).toString()));
        EXPECT_EQ(1, store->value(QStringLiteral("PRAGMA foreign_keys")).toInt());
        EXPECT_EQ(SqliteBusyTimeoutMs, store->value(QStringLiteral("PRAGMA busy_timeout")).toInt());
        StoreTest::insertNode(*store, QStringLiteral("R"), 0, QStringLiteral("Root"));
    }
    std::unique_ptr<Connection> again = openSqliteConnection(path);
    const SchemaOutcome outcome = ensureSchema(*again, currentSchemaPlan(*again));
    EXPECT_EQ(SchemaVersion, outcome.foundVersion);
    EXPECT_EQ(SchemaVersion, outcome.version);
    EXPECT_FALSE(outcome.created);
    EXPECT_EQ(1, count(*again, QStringLiteral("SELECT count(*) FROM nodes WHERE name = ?"), {QStringLiteral("Root")}));
    EXPECT_EQ(1, count(*again, QStringLiteral("SELECT count(*) FROM zel_meta")));
    // Each connection is a Qt SQL connection of its own name, removed with it.
    EXPECT_EQ(1, QSqlDatabase::connectionNames().size());
    again.reset();
    EXPECT_TRUE(QSqlDatabase::connectionNames().isEmpty());
}

TEST(SqliteStore, SchemaKeepsSiblingNamesUniqueAndRemovesWholeSubtrees)
{
    QTemporaryDir dir;
    std::unique_ptr<Connection> store = openSqliteStore(dir.filePath(QStringLiteral("t.zel")));
    StoreTest::expectSchemaRules(*store);
}

TEST(SqliteStore, IndexesServeChildrenInOrderMonikersMediaAndProperties)
{
    QTemporaryDir dir;
    std::unique_ptr<Connection> store = openSqliteStore(dir.filePath(QStringLiteral("t.zel")));
    const QString children = queryPlan(*store, QStringLiteral("SELECT nid, name FROM nodes WHERE parent_nid = ? ORDER BY position"), {1});
    EXPECT_NE(-1, children.indexOf(QStringLiteral("nodes_children_in_order"))) << str(children);
    EXPECT_EQ(-1, children.indexOf(QStringLiteral("TEMP B-TREE"))) << str(children);
    const QString moniker = queryPlan(*store, QStringLiteral("SELECT nid FROM nodes WHERE moniker = ?"), {QStringLiteral("m")});
    EXPECT_NE(-1, moniker.indexOf(QStringLiteral("INDEX"))) << str(moniker);
    EXPECT_NE(-1, moniker.indexOf(QStringLiteral("(moniker=?)"))) << str(moniker);
    const QString media = queryPlan(*store, QStringLiteral("SELECT nid FROM nodes WHERE mob_id = ?"), {QStringLiteral("m")});
    EXPECT_NE(-1, media.indexOf(QStringLiteral("nodes_by_mob_id (mob_id=?)"))) << str(media);
    const QString properties = queryPlan(
        *store, QStringLiteral("SELECT key, value FROM node_properties WHERE nid = ? ORDER BY position"), {1});
    EXPECT_NE(-1, properties.indexOf(QStringLiteral("(nid=?)"))) << str(properties);
    EXPECT_EQ(-1, properties.indexOf(QStringLiteral("TEMP B-TREE"))) << str(properties);
    EXPECT_EQ(-1, properties.indexOf(QStringLiteral("SCAN"))) << str(properties);
}

TEST(SqliteStore, RefusesANewerSchemaAndChangesNothing)
{
    QTemporaryDir dir;
    const QString path = dir.filePath(QStringLiteral("t.zel"));
    {
        std::unique_ptr<Connection> store = openSqliteStore(path);
        store->exec(QStringLiteral("UPDATE zel_meta SET value = ? WHERE key = ?"), {QStringLiteral("7"), QStringLiteral("schema_version")});
    }
    const QByteArray before = contentOf(path);
    ASSERT_FALSE(before.isEmpty());
    EXPECT_STORE_ERROR(StoreError::Incompatible,
                       QStringLiteral("SQLite: the store has schema version 7, newer than this build of zel reads (up to %1); nothing was changed")
                           .arg(SchemaVersion),
                       openSqliteStore(path));
    EXPECT_EQ(before, contentOf(path));

    // A zel_meta without a version is damage, not a version.
    {
        std::unique_ptr<Connection> store = openSqliteConnection(path);
        store->exec(QStringLiteral("UPDATE zel_meta SET value = ? WHERE key = ?"), {QStringLiteral("seven"), QStringLiteral("schema_version")});
    }
    EXPECT_STORE_ERROR(StoreError::Damaged,
                       QStringLiteral("SQLite: the store's table zel_meta holds no valid schema version (\"seven\")"),
                       openSqliteStore(path));
}

TEST(SqliteStore, MigratesAnOlderSchemaOneStepPerTransaction)
{
    QTemporaryDir dir;
    const QString path = dir.filePath(QStringLiteral("t.zel"));
    {
        std::unique_ptr<Connection> store = openSqliteStore(path);
        StoreTest::insertNode(*store, QStringLiteral("R"), 0, QStringLiteral("Root"));
    }
    // A step that fails leaves version and tables as they were.
    {
        std::unique_ptr<Connection> store = openSqliteConnection(path);
        const SchemaPlan failing = planWithColour(*store, true);
        EXPECT_STORE_ERROR(StoreError::Internal,
                           QStringLiteral("SQLite: migrating the store from schema version %1 to %2 failed; it keeps version %1: step broke")
                               .arg(SchemaVersion)
                               .arg(SchemaVersion + 1),
                           ensureSchema(*store, failing));
        EXPECT_EQ(SchemaVersion, storedSchemaVersion(*store));
        EXPECT_FALSE(hasColumn(*store, QStringLiteral("nodes"), QStringLiteral("colour")));
    }
    {
        std::unique_ptr<Connection> store = openSqliteConnection(path);
        const SchemaPlan plan = planWithColour(*store);
        const SchemaOutcome outcome = ensureSchema(*store, plan);
        EXPECT_EQ(SchemaVersion, outcome.foundVersion);
        EXPECT_EQ(SchemaVersion + 1, outcome.version);
        EXPECT_FALSE(outcome.created);
        EXPECT_EQ(SchemaVersion + 1, storedSchemaVersion(*store));
        EXPECT_EQ("red", str(store->value(QStringLiteral("SELECT colour FROM nodes WHERE id = ?"), {QStringLiteral("R")}).toString()));
        // Opening again with the same plan finds nothing to do.
        const SchemaOutcome again = ensureSchema(*store, plan);
        EXPECT_EQ(SchemaVersion + 1, again.foundVersion);
        EXPECT_EQ(SchemaVersion + 1, again.version);
    }
    // This build's own plan now meets a newer store.
    EXPECT_STORE_ERROR(StoreError::Incompatible,
                       QStringLiteral("SQLite: the store has schema version %1, newer than this build of zel reads (up to %2); nothing was changed")
                           .arg(SchemaVersion + 1)
                           .arg(SchemaVersion),
                       openSqliteStore(path));
    // A fresh file with the newer plan is made at the newer version directly.
    std::unique_ptr<Connection> fresh = openSqliteConnection(dir.filePath(QStringLiteral("fresh.zel")));
    const SchemaOutcome created = ensureSchema(*fresh, planWithColour(*fresh));
    EXPECT_TRUE(created.created);
    EXPECT_EQ(0, created.foundVersion);
    EXPECT_EQ(SchemaVersion + 1, created.version);
    EXPECT_TRUE(hasColumn(*fresh, QStringLiteral("nodes"), QStringLiteral("colour")));
    // A version with no step to it cannot be reached.
    SchemaPlan gap = planWithColour(*fresh);
    gap.version = SchemaVersion + 3;
    EXPECT_STORE_ERROR(StoreError::Incompatible,
                       QStringLiteral("SQLite: the store has schema version %1, which this build of zel cannot migrate to version %2")
                           .arg(SchemaVersion + 1)
                           .arg(SchemaVersion + 3),
                       ensureSchema(*fresh, gap));
}

TEST(SqliteStore, RefusesFilesThatAreNoZelStoreAndLeavesThemAlone)
{
    QTemporaryDir dir;
    const QString text = dir.filePath(QStringLiteral("notes.txt"));
    const QByteArray notes("These are notes, not a database. They are long enough to fill SQLite's header of a hundred bytes.\n");
    writeFile(text, notes);
    EXPECT_STORE_ERROR(StoreError::Damaged,
                       QStringLiteral("SQLite: %1 is not a zel store: not a SQLite database (file is not a database)").arg(text),
                       openSqliteStore(text));
    EXPECT_EQ(notes, contentOf(text));

    const QString other = dir.filePath(QStringLiteral("photos.db"));
    {
        std::unique_ptr<Connection> foreign = openSqliteConnection(other);
        foreign->exec(QStringLiteral("CREATE TABLE photos (id INTEGER PRIMARY KEY, file TEXT)"));
        foreign->exec(QStringLiteral("CREATE TABLE albums (id INTEGER PRIMARY KEY)"));
    }
    const QByteArray photos = contentOf(other);
    EXPECT_STORE_ERROR(StoreError::Incompatible,
                       QStringLiteral("SQLite: the database is not a zel store: it holds other tables (albums, photos) and no zel_meta; nothing was changed"),
                       openSqliteStore(other));
    EXPECT_EQ(photos, contentOf(other));
    EXPECT_FALSE(QFile::exists(other + QStringLiteral("-wal")));

    const QString nowhere = dir.filePath(QStringLiteral("missing/t.zel"));
    EXPECT_STORE_ERROR(StoreError::StoreUnavailable,
                       QStringLiteral("SQLite: cannot open the store file %1: its folder %2 does not exist")
                           .arg(nowhere, dir.filePath(QStringLiteral("missing"))),
                       openSqliteStore(nowhere));
    EXPECT_STORE_ERROR(StoreError::StoreUnavailable,
                       QStringLiteral("SQLite: cannot open the store file %1: it is a folder").arg(dir.path()),
                       openSqliteStore(dir.path()));
    EXPECT_TRUE(QSqlDatabase::connectionNames().isEmpty());
}

TEST(SqliteStore, ReportsADamagedPageAsDamage)
{
    QTemporaryDir dir;
    const QString path = dir.filePath(QStringLiteral("t.zel"));
    int pageSize = 0;
    int nodesPage = 0;
    {
        std::unique_ptr<Connection> store = openSqliteStore(path);
        const qint64 root = StoreTest::insertNode(*store, QStringLiteral("R"), 0, QStringLiteral("Root"));
        store->exec(QStringLiteral("BEGIN"));
        for (int i = 0; i < 300; ++i)
            StoreTest::insertNode(*store, QStringLiteral("N%1").arg(i), root, QStringLiteral("Clip %1 ").arg(i) + QString(60, QLatin1Char('x')));
        store->commit();
        pageSize = store->value(QStringLiteral("PRAGMA page_size")).toInt();
        nodesPage = store->value(QStringLiteral("SELECT rootpage FROM sqlite_master WHERE name = ?"), {QStringLiteral("nodes")}).toInt();
        store->value(QStringLiteral("PRAGMA wal_checkpoint(TRUNCATE)"));
    }
    ASSERT_GT(pageSize, 0);
    ASSERT_GT(nodesPage, 1);
    QByteArray content = contentOf(path);
    ASSERT_GE(content.size(), nodesPage * pageSize);
    content.replace((nodesPage - 1) * pageSize, pageSize, QByteArray(pageSize, '\xff'));
    writeFile(path, content);

    std::unique_ptr<Connection> store = openSqliteStore(path);
    EXPECT_STORE_ERROR(StoreError::Damaged, QStringLiteral("SQLite: the store %1 is damaged (database disk image is malformed)").arg(path),
                       store->exec(QStringLiteral("SELECT sum(length(mime_type)) FROM nodes")));
}

TEST(SqliteStore, BusyWriterIsAnsweredAfterTheTimeoutAndReadersGoOn)
{
    QTemporaryDir dir;
    const QString path = dir.filePath(QStringLiteral("t.zel"));
    SqliteOptions quick;
    quick.busyTimeoutMs = 100;
    std::unique_ptr<Connection> holder = openSqliteStore(path, quick);
    std::unique_ptr<Connection> waiter = openSqliteStore(path, quick);

    beginSqliteWrite(*holder);
    StoreTest::insertNode(*holder, QStringLiteral("R"), 0, QStringLiteral("Root"));
    EXPECT_STORE_ERROR(StoreError::StoreUnavailable,
                       QStringLiteral("SQLite: the store %1 is busy: another connection held it for longer than the busy timeout (100 ms) (database is locked)")
                           .arg(path),
                       beginSqliteWrite(*waiter));
    // WAL: a reader is not held up by the writer, and sees the last commit.
    EXPECT_EQ(0, count(*waiter, QStringLiteral("SELECT count(*) FROM nodes")));
    holder->commit();
    EXPECT_EQ(1, count(*waiter, QStringLiteral("SELECT count(*) FROM nodes")));
    // The lock is free again: the waiter's next write goes through.
    beginSqliteWrite(*waiter);
    StoreTest::insertNode(*waiter, QStringLiteral("S"), 0, QStringLiteral("Second"));
    waiter->commit();
    EXPECT_EQ(2, count(*holder, QStringLiteral("SELECT count(*) FROM nodes")));
}
