// Hearing another connection's changes to a SQLite store: every committed
// journal entry after the starting number exactly once, in order, also in a
// burst larger than one batch; nothing of a rolled back transaction; nothing
// after stop; a file that is no store refused at start.
#include "StoreTestSupport.h"

#include "sql_journal_p.h"
#include "sqlite_connection_p.h"
#include "sqlite_watcher_p.h"

#include <QFile>
#include <QSqlDatabase>
#include <QTemporaryDir>

#include <chrono>
#include <condition_variable>
#include <mutex>
#include <string>
#include <vector>

using namespace ZelSql;
using StoreTest::str;

namespace {

// The entries a watcher delivered, as "seq:kind:child" lines, and the sizes
// of its deliveries.
class Recorder
{
public:
    SqliteWatcherHandlers handlers()
    {
        SqliteWatcherHandlers handlers;
        handlers.changed = [this](const std::vector<JournalEntry>& entries) {
            std::lock_guard<std::mutex> lock(mMutex);
            mBatches.push_back(entries.size());
            for (const JournalEntry& entry : entries)
                mEntries.push_back(std::to_string(entry.seq) + ":" + std::to_string(entry.kind) + ":" + str(entry.childMoniker));
            mChanged.notify_all();
        };
        handlers.failed = [this](const QString& reason) {
            std::lock_guard<std::mutex> lock(mMutex);
            mEntries.push_back("failed:" + str(reason));
            mChanged.notify_all();
        };
        return handlers;
    }
    // Waits (a minute at most, against hanging) until count entries came.
    bool waitForCount(std::size_t count)
    {
        std::unique_lock<std::mutex> lock(mMutex);
        return mChanged.wait_for(lock, std::chrono::minutes(1), [&] { return mEntries.size() >= count; });
    }
    std::vector<std::string> entries()
    {
        std::lock_guard<std::mutex> lock(mMutex);
        return mEntries;
    }
    std::vector<std::size_t> batches()
    {
        std::lock_guard<std::mutex> lock(mMutex);
        return mBatches;
    }

private:
    std::mutex mMutex;
    std::condition_variable mChanged;
    std::vector<std::string> mEntries;
    std::vector<std::size_t> mBatches;
};

JournalEntry change(JournalEntry::Kind kind, const QString& child)
{
    JournalEntry entry;
    entry.kind = kind;
    entry.parentMoniker = QStringLiteral("zel-mem://R");
    entry.childMoniker = child;
    return entry;
}

qint64 commitChanges(Connection& writer, const std::vector<JournalEntry>& entries, bool keep = true)
{
    beginSqliteWrite(writer);
    const qint64 last = appendToJournal(writer, entries, QStringLiteral("writer"), 0);
    if (keep)
        writer.commit();
    else
        writer.rollback();
    return last;
}

} // namespace

TEST(SqliteJournalWatcherThreads, HearsEachCommittedEntryOnceInOrder)
{
    QTemporaryDir dir;
    const QString path = dir.filePath(QStringLiteral("t.zel"));
    std::unique_ptr<Connection> writer = openSqliteStore(path);
    commitChanges(*writer, {change(JournalEntry::Added, QStringLiteral("before"))});

    Recorder recorder;
    SqliteJournalWatcher watcher(path, recorder.handlers(), 5);
    watcher.start(lastJournalSeq(*writer));
    commitChanges(*writer, {change(JournalEntry::Added, QStringLiteral("A")), change(JournalEntry::Updated, QStringLiteral("A"))});
    commitChanges(*writer, {change(JournalEntry::Removed, QStringLiteral("rolled back"))}, false);
    commitChanges(*writer, {change(JournalEntry::Added, QStringLiteral("B"))});
    commitChanges(*writer, {change(JournalEntry::Removed, QStringLiteral("A"))});
    ASSERT_TRUE(recorder.waitForCount(4));
    const std::vector<std::string> expected{"2:1:A", "3:4:A", "4:1:B", "5:2:A"};
    EXPECT_EQ(expected, recorder.entries());

    // A burst larger than a batch comes whole and in order, in batches.
    std::vector<JournalEntry> burst;
    for (int i = 0; i < 2500; ++i)
        burst.push_back(change(JournalEntry::Updated, QStringLiteral("N%1").arg(i)));
    commitChanges(*writer, burst);
    ASSERT_TRUE(recorder.waitForCount(4 + 2500));
    const std::vector<std::string> all = recorder.entries();
    ASSERT_EQ(4u + 2500u, all.size());
    for (int i = 0; i < 2500; ++i)
        ASSERT_EQ(std::to_string(6 + i) + ":4:N" + std::to_string(i), all[4 + i]);
    std::size_t largest = 0;
    for (std::size_t size : recorder.batches())
        largest = std::max(largest, size);
    EXPECT_EQ(1000u, largest);

    // Stopped, it hears nothing more; a second watcher hears what follows.
    watcher.stop();
    Recorder witnessRecorder;
    SqliteJournalWatcher witness(path, witnessRecorder.handlers(), 5);
    witness.start(lastJournalSeq(*writer));
    commitChanges(*writer, {change(JournalEntry::Added, QStringLiteral("after stop"))});
    ASSERT_TRUE(witnessRecorder.waitForCount(1));
    EXPECT_EQ((std::vector<std::string>{"2506:1:after stop"}), witnessRecorder.entries());
    EXPECT_EQ(4u + 2500u, recorder.entries().size());
    witness.stop();
    writer.reset();
    EXPECT_TRUE(QSqlDatabase::connectionNames().isEmpty());
}

TEST(SqliteJournalWatcherThreads, StartRefusesAFileThatIsNoStore)
{
    QTemporaryDir dir;
    const QString path = dir.filePath(QStringLiteral("notes.txt"));
    {
        QFile file(path);
        ASSERT_TRUE(file.open(QIODevice::WriteOnly));
        file.write("These are notes, not a database. They are long enough to fill SQLite's header of a hundred bytes.\n");
    }
    Recorder recorder;
    SqliteJournalWatcher watcher(path, recorder.handlers(), 5);
    EXPECT_STORE_ERROR(StoreError::Damaged,
                       QStringLiteral("SQLite: %1 is not a zel store: not a SQLite database (file is not a database)").arg(path),
                       watcher.start(0));
    watcher.stop();
    EXPECT_TRUE(recorder.entries().empty());
    EXPECT_TRUE(QSqlDatabase::connectionNames().isEmpty());
}
