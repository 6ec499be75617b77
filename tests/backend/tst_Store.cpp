// The storage interface's transactions, on every kind of store
// (StoreUnderTest.h): a write transaction without commit leaves the records,
// the observers and the effects as they were; savepoints undo only what came
// after them.
#include "StoreUnderTest.h"

#include "Zel_MemoryTree.h"
#include "store_p.h"

#include <QStringList>
#include <boost/make_shared.hpp>
#include <gtest/gtest.h>

#include <memory>
#include <stdexcept>
#include <vector>

namespace {

// Hears the changes the store publishes, as "added PARENT CHILD" lines.
struct HeardChanges : ZelMemory::Observer {
    QStringList lines;
    void treeChanged(const std::vector<ZelMemory::Change>& changes) override
    {
        static const char* const kinds[] = {"added", "removed", "updated"};
        for (const ZelMemory::Change& change : changes)
            lines << QStringLiteral("%1 %2 %3").arg(QLatin1String(kinds[change.kind]), change.parentMoniker, change.childMoniker);
    }
};

QString monikerOf(const char* id)
{
    return QStringLiteral("zel-mem://") + QLatin1String(id);
}

ZelMemory::Node newBin(const QString& name)
{
    ZelMemory::Node node;
    node.name = name;
    node.mimeType = QStringLiteral("bin");
    return node;
}

} // namespace

// A store of the kind under test holding the sample tree.
class StoreTest : public ::testing::TestWithParam<StoreKind>
{
protected:
    void SetUp() override
    {
        QString error;
        tree = GetParam().load(Zel_MemoryTree::sampleJson(), &error);
        ASSERT_TRUE(tree) << error.toStdString();
    }

    std::unique_ptr<StoreUnderTest> tree;
};

INSTANTIATE_TEST_SUITE_P(Store, StoreTest, ::testing::ValuesIn(storeKinds()), StoreKindName());

TEST_P(StoreTest, WriteTransactionWithoutCommitLeavesTheStoreAsItWasAndTellsNobody)
{
    ZelMemory::Store& store = tree->records();
    const boost::shared_ptr<HeardChanges> heard = boost::make_shared<HeardChanges>();
    store.addObserver(heard);
    const QByteArray before = tree->toJson();
    bool effectRan = false;
    QString firstNewMoniker;
    {
        const std::unique_ptr<ZelMemory::WriteTxn> txn = store.beginWrite();
        const ZelMemory::Node* footage = txn->nodeByMoniker(monikerOf("B-FOOTAGE"));
        const ZelMemory::Node* archive = txn->nodeByMoniker(monikerOf("B-ARCHIVE"));
        const ZelMemory::Node* mayor = txn->nodeByMoniker(monikerOf("C-MAYOR"));
        const ZelMemory::Node* cityHall = txn->nodeByMoniker(monikerOf("C-CITYHALL"));
        ASSERT_TRUE(footage && archive && mayor && cityHall);
        // Every kind of change, some on records changed before in the same
        // transaction: new nodes inside a subtree that is then removed, a
        // node edited, renamed and moved out of it first.
        const ZelMemory::Node& fresh = txn->insertNode(newBin(QStringLiteral("Fresh")), *footage);
        firstNewMoniker = fresh.moniker;
        txn->insertNode(newBin(QStringLiteral("Inner")), fresh);
        txn->edit(*mayor).properties.append(ZelMemory::Property{QStringLiteral("Tape"), QStringLiteral("T-9"), QString()});
        txn->edit(*mayor).reservation = ZelMemory::Reservation{QStringLiteral("editor"), txn->now(), QDateTime()};
        txn->renameNode(*mayor, QStringLiteral("Mayor renamed"));
        txn->moveNode(*mayor, *archive);
        EXPECT_EQ(1, txn->removeSubtree(*cityHall));
        EXPECT_EQ(6, txn->removeSubtree(*footage)); // Footage, Fresh, Inner and three clips left in it
        ZelMemory::KeyDesc key;
        key.key = QStringLiteral("Rolled Back");
        txn->insertKey(key);
        txn->setApplicationSettings(QStringLiteral("zel-demo"), {qMakePair(QStringLiteral("A.b"), QStringLiteral("1"))});
        txn->setApplicationSettings(QStringLiteral("new-app"), {qMakePair(QStringLiteral("A.b"), QStringLiteral("2"))});
        txn->setUserSettings(QStringLiteral("editor"), 0, {});
        txn->setUserSettings(QStringLiteral("assistant"), 2, {qMakePair(QStringLiteral("S"), QStringLiteral("3"))});
        txn->setDocument(QStringLiteral("Layout"), QStringLiteral("<Layout/>"));
        txn->reportAdded(monikerOf("B-FOOTAGE"), firstNewMoniker); // fresh went with Footage
        txn->onCommit([&effectRan] { effectRan = true; });
        EXPECT_EQ(2, txn->childCount(*archive)); // the election clip and the moved one
    }
    EXPECT_EQ(before.toStdString(), tree->toJson().toStdString());
    EXPECT_TRUE(heard->lines.isEmpty()) << heard->lines.join(QLatin1Char('\n')).toStdString();
    EXPECT_FALSE(effectRan);

    EXPECT_TRUE(tree->monikerAt(QStringLiteral("/Evening News/Footage/Fresh")).isEmpty());

    // The store goes on as if the transaction had never been: a committed
    // change is kept, its report heard and its effect run.
    QString againMoniker;
    {
        const std::unique_ptr<ZelMemory::WriteTxn> txn = store.beginWrite();
        const ZelMemory::Node& again = txn->insertNode(newBin(QStringLiteral("Again")), *txn->nodeByMoniker(monikerOf("B-FOOTAGE")));
        againMoniker = again.moniker;
        txn->reportAdded(monikerOf("B-FOOTAGE"), again.moniker);
        txn->onCommit([&effectRan] { effectRan = true; });
        txn->commit();
    }
    EXPECT_EQ(QStringList{QStringLiteral("added zel-mem://B-FOOTAGE ") + againMoniker}, heard->lines);
    EXPECT_TRUE(effectRan);
    EXPECT_EQ(QStringLiteral("zel-mem://B-FOOTAGE"), tree->monikerAt(QStringLiteral("/Evening News/Footage")));
    EXPECT_EQ(againMoniker, tree->monikerAt(QStringLiteral("/Evening News/Footage/Again")));
}

TEST_P(StoreTest, RollingBackToASavepointUndoesOnlyWhatCameAfterIt)
{
    ZelMemory::Store& store = tree->records();
    const boost::shared_ptr<HeardChanges> heard = boost::make_shared<HeardChanges>();
    store.addObserver(heard);
    QStringList effects;
    {
        const std::unique_ptr<ZelMemory::WriteTxn> txn = store.beginWrite();
        const ZelMemory::Node* footage = txn->nodeByMoniker(monikerOf("B-FOOTAGE"));
        const ZelMemory::Node* mayor = txn->nodeByMoniker(monikerOf("C-MAYOR"));
        const ZelMemory::Node& kept = txn->insertNode(newBin(QStringLiteral("Kept")), *footage);
        txn->reportAdded(footage->moniker, kept.moniker);
        txn->onCommit([&effects] { effects << QStringLiteral("kept"); });

        const ZelMemory::WriteTxn::Savepoint point = txn->savepoint();
        const ZelMemory::Node& dropped = txn->insertNode(newBin(QStringLiteral("Dropped")), *footage);
        txn->edit(*mayor).properties.clear();
        txn->renameNode(*mayor, QStringLiteral("Gone"));
        txn->reportAdded(footage->moniker, dropped.moniker);
        txn->onCommit([&effects] { effects << QStringLiteral("dropped"); });
        txn->rollbackTo(point);

        // After the rollback the same record can be changed again, and that
        // change is kept.
        txn->edit(*mayor).properties.append(ZelMemory::Property{QStringLiteral("Tape"), QStringLiteral("T-1"), QString()});
        txn->reportUpdated(footage->moniker, mayor->moniker);
        txn->commit();
    }
    EXPECT_EQ((QStringList{QStringLiteral("added zel-mem://B-FOOTAGE ") + tree->monikerAt(QStringLiteral("/Evening News/Footage/Kept")),
                           QStringLiteral("updated zel-mem://B-FOOTAGE zel-mem://C-MAYOR")}),
              heard->lines);
    EXPECT_EQ(QStringList{QStringLiteral("kept")}, effects);
    EXPECT_TRUE(tree->monikerAt(QStringLiteral("/Evening News/Footage/Dropped")).isEmpty());
    EXPECT_EQ(QStringLiteral("zel-mem://C-MAYOR"), tree->monikerAt(QStringLiteral("/Evening News/Footage/Interview Mayor")));

    const std::unique_ptr<ZelMemory::ReadTxn> read = store.beginRead();
    const ZelMemory::Node* mayor = read->nodeByMoniker(monikerOf("C-MAYOR"));
    ASSERT_TRUE(mayor);
    ASSERT_FALSE(mayor->properties.isEmpty());
    EXPECT_EQ(QStringLiteral("T-1"), mayor->properties.last().value);
    EXPECT_GT(mayor->properties.size(), 1); // the properties cleared after the savepoint are back
}

TEST_P(StoreTest, EffectThatThrowsAfterCommitKeepsTheChangeAndItsReport)
{
    ZelMemory::Store& store = tree->records();
    const boost::shared_ptr<HeardChanges> heard = boost::make_shared<HeardChanges>();
    store.addObserver(heard);
    QStringList effects;
    QString moniker;
    {
        const std::unique_ptr<ZelMemory::WriteTxn> txn = store.beginWrite();
        const ZelMemory::Node& added = txn->insertNode(newBin(QStringLiteral("Kept")), *txn->nodeByMoniker(monikerOf("B-FOOTAGE")));
        moniker = added.moniker;
        txn->reportAdded(monikerOf("B-FOOTAGE"), moniker);
        txn->onCommit([&effects] { effects << QStringLiteral("first"); });
        txn->onCommit([&effects] {
            effects << QStringLiteral("throws");
            throw std::runtime_error("effect failed");
        });
        txn->onCommit([&effects] { effects << QStringLiteral("last"); });
        try {
            txn->commit();
            ADD_FAILURE() << "the effect's exception was swallowed";
        } catch (const std::runtime_error& e) {
            EXPECT_STREQ("effect failed", e.what());
        }
        EXPECT_TRUE(txn->isCommitted());
    }
    EXPECT_EQ((QStringList{QStringLiteral("first"), QStringLiteral("throws"), QStringLiteral("last")}), effects);
    EXPECT_EQ(QStringList{QStringLiteral("added zel-mem://B-FOOTAGE ") + moniker}, heard->lines);
    EXPECT_EQ(moniker, tree->monikerAt(QStringLiteral("/Evening News/Footage/Kept")));

    // The store's next batch is not held up behind the one whose effect threw.
    {
        const std::unique_ptr<ZelMemory::WriteTxn> txn = store.beginWrite();
        txn->reportUpdated(monikerOf("B-FOOTAGE"), moniker);
        txn->commit();
    }
    EXPECT_EQ(2, heard->lines.size());
}
