// The change journal on a SQLite store: entries appended by committed write
// transactions come back after a given number, in order, with their origin;
// those of a rolled back transaction never appear.
#include "StoreTestSupport.h"

#include "sql_journal_p.h"
#include "sqlite_connection_p.h"

#include <QTemporaryDir>

using namespace ZelSql;
using StoreTest::str;

namespace {

JournalEntry entry(JournalEntry::Kind kind, const char* parent, const char* child)
{
    JournalEntry e;
    e.kind = kind;
    e.parentMoniker = QString::fromLatin1(parent);
    e.childMoniker = QString::fromLatin1(child);
    return e;
}

std::string describe(const std::vector<JournalEntry>& entries)
{
    std::string text;
    for (const JournalEntry& e : entries) {
        text += std::to_string(e.seq) + ":" + std::to_string(e.kind) + " " + str(e.parentMoniker) + ">" + str(e.childMoniker)
            + " by " + str(e.origin) + " at " + std::to_string(e.committedMs) + "\n";
    }
    return text;
}

} // namespace

TEST(SqlJournal, CommittedEntriesComeBackInOrderAfterANumber)
{
    QTemporaryDir dir;
    std::unique_ptr<Connection> store = openSqliteStore(dir.filePath(QStringLiteral("t.zel")));
    EXPECT_EQ(0, lastJournalSeq(*store));

    beginSqliteWrite(*store);
    const qint64 first = appendToJournal(*store, {entry(JournalEntry::Added, "zel-mem://R", "zel-mem://A"),
                                                  entry(JournalEntry::Updated, "zel-mem://R", "zel-mem://B")},
                                         QStringLiteral("session 1"), 1000);
    store->commit();
    EXPECT_EQ(2, first);

    beginSqliteWrite(*store);
    appendToJournal(*store, {entry(JournalEntry::Removed, "zel-mem://R", "zel-mem://gone")}, QStringLiteral("session 2"), 2000);
    store->rollback();

    beginSqliteWrite(*store);
    EXPECT_EQ(0, appendToJournal(*store, {}, QStringLiteral("session 2"), 2500));
    const qint64 second = appendToJournal(*store, {entry(JournalEntry::Removed, "zel-mem://R", "zel-mem://A")},
                                          QStringLiteral("session 2"), 3000);
    store->commit();
    EXPECT_EQ(3, second);
    EXPECT_EQ(3, lastJournalSeq(*store));

    EXPECT_EQ("1:1 zel-mem://R>zel-mem://A by session 1 at 1000\n"
              "2:4 zel-mem://R>zel-mem://B by session 1 at 1000\n"
              "3:2 zel-mem://R>zel-mem://A by session 2 at 3000\n",
              describe(journalAfter(*store, 0, 100)));
    EXPECT_EQ("3:2 zel-mem://R>zel-mem://A by session 2 at 3000\n", describe(journalAfter(*store, first, 100)));
    EXPECT_EQ("2:4 zel-mem://R>zel-mem://B by session 1 at 1000\n", describe(journalAfter(*store, 1, 1)));
    EXPECT_EQ("", describe(journalAfter(*store, second, 100)));
}
