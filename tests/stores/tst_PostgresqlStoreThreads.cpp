// Several sessions opening one new PostgreSQL store at the same moment, each
// on a thread of its own as separate processes would: the schema is created
// by exactly one of them (the schema lock holds the others off until it has
// committed) and every one of them then finds it complete.
#include "StoreTestSupport.h"

#include "pg_connection_p.h"

#include <QSqlDatabase>

#include <mutex>
#include <thread>
#include <vector>

using namespace ZelSql;

TEST(PostgresqlStoreThreads, SessionsOpeningANewStoreTogetherCreateItsSchemaOnce)
{
    SKIP_WITHOUT_POSTGRESQL();
    StoreTest::ScratchDatabase scratch;
    const StoreUrl url = scratch.url();
    const int sessions = 4;
    std::mutex mutex;
    QStringList failures;
    int created = 0;
    std::vector<QStringList> tablesSeen;

    std::vector<std::thread> threads;
    for (int i = 0; i < sessions; ++i) {
        threads.emplace_back([&] {
            try {
                SchemaOutcome outcome;
                std::unique_ptr<Connection> store = openPostgresqlStore(url, nullptr, &outcome);
                const QStringList tables = StoreTest::sortedTables(*store);
                std::lock_guard<std::mutex> lock(mutex);
                created += outcome.created ? 1 : 0;
                tablesSeen.push_back(tables);
            } catch (const std::exception& error) {
                std::lock_guard<std::mutex> lock(mutex);
                failures << QString::fromUtf8(error.what());
            }
        });
    }
    for (std::thread& thread : threads)
        thread.join();

    EXPECT_TRUE(failures.isEmpty()) << StoreTest::str(failures.join(QLatin1Char('\n')));
    EXPECT_EQ(1, created);
    ASSERT_EQ(std::size_t(sessions), tablesSeen.size());
    for (const QStringList& tables : tablesSeen)
        EXPECT_EQ(StoreTest::expectedTables(), tables);
    EXPECT_TRUE(QSqlDatabase::connectionNames().isEmpty());
}
