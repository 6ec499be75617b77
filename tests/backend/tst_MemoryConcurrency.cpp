// Many requests of two sessions in flight at once on one tree, on four
// worker threads: nothing lost, every change heard once, in the order the
// tree made it. Runs under ThreadSanitizer in CI.
#include "BackendRecorders.h"

#include <QSet>

using namespace Sample;

namespace {

// Counts answers across threads (delivery happens on the test thread, but the
// callbacks are shared by many requests).
struct CountingFolderRec : Zel_CreateFolderUniqueCB {
    std::mutex mutex;
    QStringList created;
    int failures = 0;
    int ends = 0;
    void succeeded(NodeSP node) override
    {
        std::lock_guard<std::mutex> lock(mutex);
        created << node->getMoniker();
    }
    void failed(ErrorSP) override
    {
        std::lock_guard<std::mutex> lock(mutex);
        ++failures;
    }
    void finished() override
    {
        std::lock_guard<std::mutex> lock(mutex);
        ++ends;
    }
};

} // namespace

TEST(Zel_MemorySessionConcurrencyTest, ManyRequestsOfTwoSessionsInFlightLoseNothing)
{
    Orv_Engine engine(4);
    boost::shared_ptr<Zel_MemoryTree> tree = Zel_MemoryTree::sample();
    boost::shared_ptr<Zel_MemorySession> editor(new Zel_MemorySession(tree, &engine));
    boost::shared_ptr<Zel_MemorySession> producer(new Zel_MemorySession(tree, &engine));
    auto login1 = rec<LoginRec>();
    auto login2 = rec<LoginRec>();
    editor->submitRequest(editor->makeLoginReqSP(QStringLiteral("editor"), QStringLiteral("editor"), {}, login1));
    producer->submitRequest(producer->makeLoginReqSP(QStringLiteral("producer"), QStringLiteral("producer"), {}, login2));
    engine.DeliverAll();
    ASSERT_EQ(1, login1->ok);
    ASSERT_EQ(1, login2->ok);

    // The editor's session watches the bin both sessions add to.
    FolderRec watcher(m(Footage), editor);

    const int rounds = 60;
    boost::shared_ptr<CountingFolderRec> creations(new CountingFolderRec);
    std::vector<boost::shared_ptr<NodeRec>> reads;
    std::vector<boost::shared_ptr<SetPropertiesRec>> writes;
    std::vector<boost::shared_ptr<NodeRec>> listings;
    for (int i = 0; i < rounds; ++i) {
        boost::shared_ptr<Zel_MemorySession> s = (i % 2) ? producer : editor;
        s->submitRequest(s->makeCreateFolderUniqueReqSP(mk(m(Footage)), QStringLiteral("Batch"), creations));
        reads.push_back(rec<NodeRec>());
        s->submitRequest(s->makeGetNodeReqSP(mk(m(Mayor)), reads.back()));
        writes.push_back(rec<SetPropertiesRec>());
        Zel_PropertyList comment;
        comment.append(Zel_Property(QStringLiteral("Comments"), QStringLiteral("pass %1").arg(i), QString()));
        s->submitRequest(s->makeSetPropertiesReqSP(mk(m(CityHall)), comment, writes.back()));
        listings.push_back(rec<NodeRec>());
        s->submitRequest(s->makeGetChildrenReqSP(mk(m(Footage)), listings.back()));
        if (i % 10 == 0)
            engine.DeliverPending(); // deliver while work is still running
    }
    engine.DeliverAll();

    // Every request answered exactly once, and every answer a success.
    EXPECT_EQ(rounds, creations->ends);
    EXPECT_EQ(0, creations->failures);
    ASSERT_EQ(rounds, creations->created.size());
    EXPECT_EQ(rounds, QSet<QString>(creations->created.begin(), creations->created.end()).size());
    for (int i = 0; i < rounds; ++i) {
        EXPECT_EQ((QStringList{QStringLiteral("ok Interview Mayor"), QStringLiteral("finished")}), reads[i]->log);
        EXPECT_EQ((QStringList{QStringLiteral("ok City Hall Exterior"), QStringLiteral("finished")}), writes[i]->log);
        // A listing sees a consistent tree: the five clips plus some whole number of batches.
        EXPECT_GE(listings[i]->ok, 5);
        EXPECT_EQ(1, listings[i]->ends);
    }

    // Each folder was announced once, with its update events for the clip in between.
    const QStringList events = watcher.events();
    QStringList added;
    int updates = 0;
    for (const QString& event : events) {
        if (event.startsWith(QStringLiteral("added ")))
            added << event.mid(6);
        else if (event == QStringLiteral("updated ") + m(CityHall))
            ++updates;
    }
    EXPECT_EQ(rounds, updates);
    EXPECT_EQ(QSet<QString>(creations->created.begin(), creations->created.end()), QSet<QString>(added.begin(), added.end()));
    // Events follow the order of the tree's changes: the folders' names were
    // handed out in that order, "Batch", "Batch 2", "Batch 3", ...
    QStringList addedNames;
    {
        auto children = rec<NodeRec>();
        editor->submitRequest(editor->makeGetChildrenReqSP(mk(m(Footage)), children));
        engine.DeliverAll();
        QHash<QString, QString> nameOf;
        for (const NodeSP& node : children->nodes)
            nameOf.insert(node->getMoniker(), node->getName());
        for (const QString& moniker : added)
            addedNames << nameOf.value(moniker);
    }
    ASSERT_EQ(rounds, addedNames.size());
    EXPECT_EQ(QStringLiteral("Batch"), addedNames.first());
    for (int i = 1; i < rounds; ++i)
        EXPECT_EQ(QStringLiteral("Batch %1").arg(i + 1), addedNames[i]);
    EXPECT_EQ(0u, engine.failedRequestCount());
}

TEST(Zel_MemorySessionConcurrencyTest, SessionDestroyedWhileItsRequestsRunFailsThemCleanly)
{
    Orv_Engine engine(4);
    boost::shared_ptr<Zel_MemoryTree> tree = Zel_MemoryTree::sample();
    std::vector<boost::shared_ptr<NodeRec>> answers;
    {
        boost::shared_ptr<Zel_MemorySession> s(new Zel_MemorySession(tree, &engine));
        auto login = rec<LoginRec>();
        s->submitRequest(s->makeLoginReqSP(QStringLiteral("editor"), QStringLiteral("editor"), {}, login));
        engine.DeliverAll();
        for (int i = 0; i < 40; ++i) {
            answers.push_back(rec<NodeRec>());
            s->submitRequest(s->makeGetChildrenReqSP(mk(m(Footage)), answers.back()));
        }
    } // the session goes while its requests are queued or running
    engine.DeliverAll();
    for (const boost::shared_ptr<NodeRec>& answer : answers) {
        EXPECT_EQ(1, answer->ends);
        // Either the whole listing (it ran before the session went) or NotConnected.
        EXPECT_TRUE(answer->ok == 5 || answer->codes == QList<int>{Zel_MemoryErrorCodes::NotConnected}) << answer->log.join(QLatin1Char(',')).toStdString();
    }
}
