#include "sqlite_watcher_p.h"

#include "sqlite_connection_p.h"

#include <chrono>
#include <condition_variable>
#include <mutex>
#include <thread>

namespace ZelSql {

namespace {
// Entries read per query: a large burst is delivered in batches of this size.
const int BatchSize = 1000;
}

struct SqliteJournalWatcher::Private {
    QString path;
    SqliteWatcherHandlers handlers;
    int pollMs;
    std::thread thread;
    std::mutex mutex;
    std::condition_variable wake;
    bool stopping = false;

    // Waits one interval; false when stop() came first.
    bool pause()
    {
        std::unique_lock<std::mutex> lock(mutex);
        return !wake.wait_for(lock, std::chrono::milliseconds(pollMs), [this] { return stopping; });
    }

    bool stopRequested()
    {
        std::lock_guard<std::mutex> lock(mutex);
        return stopping;
    }

    void run(std::unique_ptr<Connection> connection, qint64 seq)
    {
        qint64 dataVersion = -1;
        QString lastFailure;
        do {
            try {
                const qint64 version = connection->value(QStringLiteral("PRAGMA data_version")).toLongLong();
                if (version != dataVersion) {
                    dataVersion = version;
                    for (;;) {
                        const std::vector<JournalEntry> entries = journalAfter(*connection, seq, BatchSize);
                        if (entries.empty())
                            break;
                        seq = entries.back().seq;
                        if (handlers.changed)
                            handlers.changed(entries);
                        if (int(entries.size()) < BatchSize || stopRequested())
                            break;
                    }
                }
                lastFailure.clear();
            } catch (const StoreError& error) {
                // Look again next time; report each new reason once.
                dataVersion = -1;
                if (error.message() != lastFailure && handlers.failed)
                    handlers.failed(error.message());
                lastFailure = error.message();
            }
        } while (pause());
        // The connection is this thread's: closed here.
        connection.reset();
    }
};

SqliteJournalWatcher::SqliteJournalWatcher(const QString& path, SqliteWatcherHandlers handlers, int pollMs)
    : d(new Private)
{
    d->path = path;
    d->handlers = std::move(handlers);
    d->pollMs = pollMs;
}

SqliteJournalWatcher::~SqliteJournalWatcher()
{
    stop();
}

void SqliteJournalWatcher::start(qint64 afterSeq)
{
    if (d->thread.joinable())
        return;
    d->stopping = false;
    // The connection is opened on the watcher's thread; its failure to open
    // is handed back here.
    std::mutex openMutex;
    std::condition_variable opened;
    bool done = false;
    std::exception_ptr failure;
    d->thread = std::thread([&, afterSeq] {
        std::unique_ptr<Connection> connection;
        try {
            connection = openSqliteStore(d->path);
        } catch (...) {
            failure = std::current_exception();
        }
        {
            std::lock_guard<std::mutex> lock(openMutex);
            done = true;
            opened.notify_all();
        }
        // From here on start()'s locals are gone: only d is used.
        if (connection)
            d->run(std::move(connection), afterSeq);
    });
    std::unique_lock<std::mutex> lock(openMutex);
    opened.wait(lock, [&] { return done; });
    if (failure) {
        lock.unlock();
        d->thread.join();
        std::rethrow_exception(failure);
    }
}

void SqliteJournalWatcher::stop()
{
    if (!d->thread.joinable())
        return;
    {
        std::lock_guard<std::mutex> lock(d->mutex);
        d->stopping = true;
    }
    d->wake.notify_all();
    d->thread.join();
}

} // namespace ZelSql
