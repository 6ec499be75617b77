// The change journal on PostgreSQL under concurrent writers: transactions of
// four sessions append entries, publish their last number and commit in
// whatever order they finish; a listener hears the numbers strictly rising
// (commit order is number order), and reading the journal after the numbers
// it heard misses nothing and repeats nothing.
#include "StoreTestSupport.h"

#include "pg_connection_p.h"
#include "pg_listener_p.h"
#include "sql_journal_p.h"

#include <chrono>
#include <condition_variable>
#include <mutex>
#include <random>
#include <thread>
#include <vector>

using namespace ZelSql;

TEST(PgJournalThreads, NumbersFollowCommitOrderAcrossConcurrentWriters)
{
    SKIP_WITHOUT_POSTGRESQL();
    StoreTest::ScratchDatabase scratch;
    const StoreUrl url = scratch.url();
    openPostgresqlStore(url);
    const QByteArray channel(ChangeChannel);

    std::mutex mutex;
    std::condition_variable heard;
    std::vector<qint64> published;
    bool ended = false;
    PgListener::Handlers handlers;
    handlers.notified = [&](const QByteArray& payload, int) {
        std::lock_guard<std::mutex> lock(mutex);
        if (payload == "end")
            ended = true;
        else
            published.push_back(payload.toLongLong());
        heard.notify_all();
    };
    PgListener listener(url.parameters, channel, handlers);
    listener.start();

    const int writers = 4;
    const int transactions = 15;
    QStringList failures;
    std::vector<std::thread> threads;
    for (int w = 0; w < writers; ++w) {
        threads.emplace_back([&, w] {
            try {
                std::unique_ptr<Connection> session = openPostgresqlConnection(url);
                std::mt19937 random(w);
                for (int t = 0; t < transactions; ++t) {
                    for (int attempt = 0;; ++attempt) {
                        try {
                            beginPostgresqlWrite(*session);
                            JournalEntry added;
                            added.parentMoniker = QStringLiteral("zel-mem://R");
                            added.childMoniker = QStringLiteral("zel-mem://W%1-%2").arg(w).arg(t);
                            JournalEntry updated = added;
                            updated.kind = JournalEntry::Updated;
                            const qint64 last = appendToJournal(*session, {added, updated},
                                                                QStringLiteral("writer %1").arg(w), 0);
                            publishPostgresqlChanges(*session, channel, last);
                            // Some work between the journal and the commit, of
                            // varying length, so that commits overtake each other
                            // unless the journal lock keeps them in turn.
                            session->exec(QStringLiteral("SELECT pg_sleep(?)"), {double(random() % 3) / 1000.0});
                            session->commit();
                            break;
                        } catch (const StoreError& error) {
                            session->rollback();
                            if (!error.retryTransaction() || attempt == 20)
                                throw;
                        }
                    }
                }
            } catch (const std::exception& error) {
                std::lock_guard<std::mutex> lock(mutex);
                failures << QString::fromUtf8(error.what());
            }
        });
    }
    for (std::thread& thread : threads)
        thread.join();
    ASSERT_TRUE(failures.isEmpty()) << StoreTest::str(failures.join(QLatin1Char('\n')));

    std::unique_ptr<Connection> reader = openPostgresqlConnection(url);
    reader->exec(QStringLiteral("SELECT pg_notify(?, ?)"), {QString::fromLatin1(channel), QStringLiteral("end")});
    {
        std::unique_lock<std::mutex> lock(mutex);
        ASSERT_TRUE(heard.wait_for(lock, std::chrono::minutes(1), [&] { return ended; }));
    }
    listener.stop();

    ASSERT_EQ(std::size_t(writers * transactions), published.size());
    for (std::size_t i = 1; i < published.size(); ++i)
        EXPECT_LT(published[i - 1], published[i]) << "notification " << i << " went back in number";
    // Reading after each number heard yields exactly that transaction's entries.
    qint64 seen = 0;
    int entries = 0;
    for (qint64 number : published) {
        const std::vector<JournalEntry> batch = journalAfter(*reader, seen, 1000);
        std::vector<JournalEntry> upTo;
        for (const JournalEntry& entry : batch) {
            if (entry.seq <= number)
                upTo.push_back(entry);
        }
        ASSERT_EQ(2u, upTo.size()) << "after " << seen << " up to " << number;
        EXPECT_EQ(StoreTest::str(upTo[0].childMoniker), StoreTest::str(upTo[1].childMoniker));
        EXPECT_EQ(int(JournalEntry::Added), upTo[0].kind);
        EXPECT_EQ(int(JournalEntry::Updated), upTo[1].kind);
        entries += 2;
        seen = number;
    }
    EXPECT_EQ(writers * transactions * 2, entries);
    EXPECT_TRUE(journalAfter(*reader, seen, 1000).empty());
}
