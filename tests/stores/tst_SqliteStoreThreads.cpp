// Several connections to one SQLite file at once, each on its own thread, as
// several processes would be: the first opening of a new file by all of them
// together, and write transactions that wait for each other in turn.
#include "StoreTestSupport.h"

#include "sqlite_connection_p.h"

#include <QSqlDatabase>
#include <QTemporaryDir>

#include <mutex>
#include <thread>
#include <vector>

using namespace ZelSql;
using StoreTest::count;

TEST(SqliteStoreThreads, ConnectionsOfManyThreadsCreateTheSchemaOnceAndWriteInTurn)
{
    // Qt SQL's plugin loader is a QObject of the first thread that asks for a
    // driver and lives to the end of the process; asked first here, it keeps
    // no worker thread's Qt data alive (LeakSanitizer would see it).
    ASSERT_TRUE(QSqlDatabase::isDriverAvailable(QStringLiteral("QSQLITE")));
    QTemporaryDir dir;
    const QString path = dir.filePath(QStringLiteral("shared.zel"));
    const int threads = 4;
    const int writes = 25;
    std::mutex failuresMutex;
    QStringList failures;
    int created = 0;

    std::vector<std::thread> workers;
    for (int t = 0; t < threads; ++t) {
        workers.emplace_back([&, t] {
            try {
                SchemaOutcome outcome;
                std::unique_ptr<Connection> store = openSqliteStore(path, SqliteOptions(), nullptr, &outcome);
                {
                    std::lock_guard<std::mutex> lock(failuresMutex);
                    created += outcome.created ? 1 : 0;
                }
                for (int i = 0; i < writes; ++i) {
                    beginSqliteWrite(*store);
                    const QString id = QStringLiteral("T%1-%2").arg(t).arg(i);
                    StoreTest::insertNode(*store, id, 0, id);
                    store->exec(QStringLiteral("INSERT INTO change_journal (kind, parent_moniker, child_moniker, origin, committed_ms)"
                                               " VALUES (1, '', ?, ?, 0)"),
                                {id, QStringLiteral("thread %1").arg(t)});
                    store->commit();
                }
            } catch (const std::exception& error) {
                std::lock_guard<std::mutex> lock(failuresMutex);
                failures << QString::fromUtf8(error.what());
            }
        });
    }
    for (std::thread& worker : workers)
        worker.join();

    EXPECT_TRUE(failures.isEmpty()) << StoreTest::str(failures.join(QLatin1Char('\n')));
    EXPECT_EQ(1, created);
    EXPECT_TRUE(QSqlDatabase::connectionNames().isEmpty());
    std::unique_ptr<Connection> store = openSqliteStore(path);
    EXPECT_EQ(threads * writes, count(*store, QStringLiteral("SELECT count(*) FROM nodes")));
    // One number per change, none skipped or doubled: writers took turns.
    EXPECT_EQ(threads * writes, count(*store, QStringLiteral("SELECT count(DISTINCT seq) FROM change_journal")));
    EXPECT_EQ(threads * writes, count(*store, QStringLiteral("SELECT max(seq) FROM change_journal")));
    EXPECT_EQ(1, count(*store, QStringLiteral("SELECT count(*) FROM zel_meta")));
    // Each thread's changes appear in the journal in the order it made them.
    for (int t = 0; t < threads; ++t) {
        QSqlQuery rows = store->exec(QStringLiteral("SELECT child_moniker FROM change_journal WHERE origin = ? ORDER BY seq"),
                                     {QStringLiteral("thread %1").arg(t)});
        int i = 0;
        while (rows.next())
            EXPECT_EQ(StoreTest::str(QStringLiteral("T%1-%2").arg(t).arg(i++)), StoreTest::str(rows.value(0).toString()));
        EXPECT_EQ(writes, i);
    }
}
