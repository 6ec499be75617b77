#include "sql_journal_p.h"

#include "sql_connection_p.h"

namespace ZelSql {

qint64 appendToJournal(Connection& connection, const std::vector<JournalEntry>& entries, const QString& origin,
                       qint64 nowMs)
{
    if (entries.empty())
        return 0;
    connection.dialect().beforeJournalWrite(connection);
    const QString insert = QStringLiteral(
        "INSERT INTO change_journal (kind, parent_moniker, child_moniker, origin, committed_ms)"
        " VALUES (?, ?, ?, ?, ?) RETURNING seq");
    qint64 last = 0;
    for (const JournalEntry& entry : entries) {
        QSqlQuery& query = connection.execPrepared(insert, {entry.kind, entry.parentMoniker, entry.childMoniker, origin, nowMs});
        if (!query.next()) {
            connection.checkRows(query, insert);
            throw StoreError(StoreError::Internal,
                             QStringLiteral("%1: the change journal gave no number").arg(connection.dialect().name()));
        }
        last = query.value(0).toLongLong();
        query.finish();
    }
    return last;
}

std::vector<JournalEntry> journalAfter(Connection& connection, qint64 seq, int limit)
{
    const QString select = QStringLiteral(
        "SELECT seq, kind, parent_moniker, child_moniker, origin, committed_ms FROM change_journal"
        " WHERE seq > ? ORDER BY seq LIMIT ?");
    QSqlQuery& query = connection.execPrepared(select, {seq, limit});
    std::vector<JournalEntry> entries;
    while (query.next()) {
        JournalEntry entry;
        entry.seq = query.value(0).toLongLong();
        entry.kind = query.value(1).toInt();
        entry.parentMoniker = query.value(2).toString();
        entry.childMoniker = query.value(3).toString();
        entry.origin = query.value(4).toString();
        entry.committedMs = query.value(5).toLongLong();
        entries.push_back(entry);
    }
    connection.checkRows(query, select);
    query.finish();
    return entries;
}

qint64 lastJournalSeq(Connection& connection)
{
    return connection.value(QStringLiteral("SELECT COALESCE(MAX(seq), 0) FROM change_journal")).toLongLong();
}

} // namespace ZelSql
