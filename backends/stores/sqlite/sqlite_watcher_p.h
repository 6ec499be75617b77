// Internal: hears the changes other connections commit to a SQLite store.
//
// SQLite has no notifications between processes, so a SqliteJournalWatcher
// looks, every pollMs, at the file's data version (PRAGMA data_version, which
// moves when another connection commits) and, when it has moved, reads the
// change journal after the last number it delivered. It calls
//   changed(entries)   with every new entry, in journal (commit) order, each
//                      entry exactly once; the watcher's own connection
//                      never writes, so every commit shows;
//   failed(reason)     when the file cannot be read (busy past the timeout,
//                      damaged); it tries again at the next look;
// on its own thread, one call at a time. The thread opens its own connection
// (Qt SQL connections belong to their thread) and closes it when it stops.
//
// start(afterSeq) begins with the entries after afterSeq (usually
// lastJournalSeq at the session's start); it throws StoreError when the file
// cannot be opened as a store. stop() (also the destructor) wakes the thread
// and waits for it: after it returns no handler is called. Never call stop()
// from a handler.
#ifndef SQLITE_WATCHER_P_H
#define SQLITE_WATCHER_P_H

#include "sql_journal_p.h"

#include <QString>

#include <functional>
#include <memory>
#include <vector>

namespace ZelSql {

// How often a watcher looks at the file by default: 50 ms.
const int SqliteWatchIntervalMs = 50;

struct SqliteWatcherHandlers {
    std::function<void(const std::vector<JournalEntry>& entries)> changed;
    std::function<void(const QString& reason)> failed;
};

class SqliteJournalWatcher
{
public:
    SqliteJournalWatcher(const QString& path, SqliteWatcherHandlers handlers, int pollMs = SqliteWatchIntervalMs);
    ~SqliteJournalWatcher();

    void start(qint64 afterSeq);
    void stop();

private:
    SqliteJournalWatcher(const SqliteJournalWatcher&) = delete;
    SqliteJournalWatcher& operator=(const SqliteJournalWatcher&) = delete;

    struct Private;
    std::unique_ptr<Private> d;
};

} // namespace ZelSql

#endif
