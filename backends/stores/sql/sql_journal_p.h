// Internal: the change journal, the record of every committed change that
// other processes read to hear about changes.
//
// A write transaction appends its changes with appendToJournal just before it
// commits; the numbers it gets follow commit order in every dialect (SQLite
// has one writer at a time; PostgreSQL writers take the journal lock first
// and hold it to their commit), so a reader that remembers the last number
// it has seen and asks for what follows (journalAfter) misses nothing and
// sees nothing twice.
#ifndef SQL_JOURNAL_P_H
#define SQL_JOURNAL_P_H

#include <QString>
#include <QtGlobal>

#include <vector>

namespace ZelSql {

class Connection;

struct JournalEntry {
    enum Kind { Added = 1, Removed = 2, Updated = 4 }; // the event type codes
    qint64 seq = 0;
    int kind = Added;
    QString parentMoniker;
    QString childMoniker;
    QString origin;      // the session (or process) that made the change
    qint64 committedMs = 0;
};

// Appends the entries (their seq ignored) inside the current write
// transaction, with origin and time; answers the number of the last one, or
// 0 when entries is empty.
qint64 appendToJournal(Connection& connection, const std::vector<JournalEntry>& entries, const QString& origin,
                       qint64 nowMs);

// The entries numbered after seq, in order, at most limit of them.
std::vector<JournalEntry> journalAfter(Connection& connection, qint64 seq, int limit);

// The number of the newest entry; 0 when the journal is empty.
qint64 lastJournalSeq(Connection& connection);

} // namespace ZelSql

#endif
