// Many requests of two sessions in flight at once on one tree, on four
// worker threads: nothing lost, every change heard once, in the order the
// tree made it. Runs under ThreadSanitizer in CI.
#include "BackendRecorders.h"
#include "memory_tree_p.h"

#include "Orv.h"
#include "Zel_Debug.h"

#include <QSet>

#include <sys/syscall.h>
#include <unistd.h>

#include <chrono>
#include <condition_variable>
#include <fstream>
#include <shared_mutex>
#include <string>
#include <thread>

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

// A session whose name rule depends on who is logged in: the rule asks the
// session itself, as a derived session may.
class UserAwareSession : public Zel_MemorySession
{
public:
    UserAwareSession(const boost::shared_ptr<Zel_MemoryTree>& tree, Orv_Engine* engine)
        : Zel_MemorySession(tree, engine)
    {
    }
    const QString illegalAssetNameCharacters() const override
    {
        // Only an editor may use '#'.
        const QString base = Zel_MemorySession::illegalAssetNameCharacters();
        return getUserName() == QLatin1String("editor") ? base : base + QLatin1Char('#');
    }
};

// Delivers until done() holds; false when it does not within the guard time
// (a worker that is stuck never answers).
template <class Done>
bool deliverUntil(Orv_Engine& engine, Done done)
{
    const auto deadline = std::chrono::steady_clock::now() + std::chrono::seconds(30);
    while (!done()) {
        if (std::chrono::steady_clock::now() > deadline)
            return false;
        engine.WaitForResults(std::chrono::milliseconds(50));
        engine.DeliverPending();
    }
    return true;
}

// The scheduling state of a thread of this process ('R' running, 'S' asleep
// waiting, ...), or 0 when it cannot be read.
char threadState(long tid)
{
    std::ifstream stat("/proc/self/task/" + std::to_string(tid) + "/stat");
    std::string text((std::istreambuf_iterator<char>(stat)), std::istreambuf_iterator<char>());
    const std::size_t close = text.rfind(')');
    return close == std::string::npos || close + 2 >= text.size() ? 0 : text[close + 2];
}

// The threaded tests of the server rules, once per kind of store.
class Zel_MemorySessionStoreThreadTest : public ::testing::TestWithParam<StoreKind>
{
protected:
    std::unique_ptr<StoreUnderTest> loadSample()
    {
        QString error;
        std::unique_ptr<StoreUnderTest> store = GetParam().load(Zel_MemoryTree::sampleJson(), &error);
        EXPECT_TRUE(store) << error.toStdString();
        return store;
    }
};

} // namespace

INSTANTIATE_TEST_SUITE_P(Store, Zel_MemorySessionStoreThreadTest, ::testing::ValuesIn(storeKinds()), StoreKindName());

TEST_P(Zel_MemorySessionStoreThreadTest, ManyRequestsOfTwoSessionsInFlightLoseNothing)
{
    Orv_Engine engine(4);
    const std::unique_ptr<StoreUnderTest> store = loadSample();
    ASSERT_TRUE(store);
    boost::shared_ptr<Zel_MemorySession> editor = store->newSession(&engine, QStringLiteral("zel"));
    boost::shared_ptr<Zel_MemorySession> producer = store->newSession(&engine, QStringLiteral("zel"));
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

TEST_P(Zel_MemorySessionStoreThreadTest, SessionDestroyedWhileItsRequestsRunFailsThemCleanly)
{
    Orv_Engine engine(4);
    const std::unique_ptr<StoreUnderTest> store = loadSample();
    ASSERT_TRUE(store);
    std::vector<boost::shared_ptr<NodeRec>> answers;
    {
        boost::shared_ptr<Zel_MemorySession> s = store->newSession(&engine, QStringLiteral("zel"));
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

TEST(Zel_MemorySessionThreadTest, NameRuleThatAsksTheSessionDoesNotBlockTheWorker)
{
    // On the heap: a worker stuck in a name check could not be joined.
    Orv_Engine* engine = new Orv_Engine(2);
    const boost::shared_ptr<Zel_MemoryTree> tree = Zel_MemoryTree::sample();
    boost::shared_ptr<Zel_MemorySession> editor(new UserAwareSession(tree, engine));
    boost::shared_ptr<Zel_MemorySession> producer(new UserAwareSession(tree, engine));
    auto login1 = rec<LoginRec>();
    editor->submitRequest(editor->makeLoginReqSP(QStringLiteral("editor"), QStringLiteral("editor"), {}, login1));
    auto login2 = rec<LoginRec>();
    producer->submitRequest(producer->makeLoginReqSP(QStringLiteral("producer"), QStringLiteral("producer"), {}, login2));
    engine->DeliverAll();
    ASSERT_EQ(1, login1->ok);
    ASSERT_EQ(1, login2->ok);

    // Each name through a request of each session, and through the session
    // itself: the requests judge them exactly as the session does.
    const QStringList names{QStringLiteral("Rushes #1"), QStringLiteral("a:b"), QStringLiteral("--- !"),
                            QStringLiteral("_"), QStringLiteral("x\\y"), QString::fromUtf8("\xC3\x9Cn\xC3\xAF" "code"),
                            QString::fromUtf8("e\xCC\x81"), QString::fromUtf8("\xD9\xA3"),
                            QString::fromUtf8("\xF0\x9D\x90\x80")};
    std::vector<boost::shared_ptr<CreateFolderRec>> answers;
    for (const boost::shared_ptr<Zel_MemorySession>& s : {editor, producer}) {
        for (const QString& name : names) {
            answers.push_back(rec<CreateFolderRec>());
            // Each session in a folder of its own: the same name twice is fine.
            const QString parent = s == editor ? m(Footage) : m(Highlights);
            s->submitRequest(s->makeCreateFolderReqSP(mk(parent), name, answers.back()));
        }
    }
    if (!deliverUntil(*engine, [&] {
            for (const auto& a : answers)
                if (a->ends != 1)
                    return false;
            return true;
        })) {
        new boost::shared_ptr<Zel_MemorySession>(editor); // left alive with its stuck worker
        new boost::shared_ptr<Zel_MemorySession>(producer);
        FAIL() << "the name check of a request never returned";
    }
    for (int i = 0; i < static_cast<int>(answers.size()); ++i) {
        const boost::shared_ptr<Zel_MemorySession>& s = i < names.size() ? editor : producer;
        const QString& name = names[i % names.size()];
        if (s->isValidAssetName(name))
            EXPECT_EQ(1, answers[i]->ok) << name.toStdString() << " " << answers[i]->messages.join(QLatin1Char(',')).toStdString();
        else
            EXPECT_EQ(QList<int>{Zel_MemoryErrorCodes::InvalidName}, answers[i]->codes) << name.toStdString();
    }
    // Only the editor may use '#'.
    EXPECT_EQ(1, answers[0]->ok);
    EXPECT_EQ(QList<int>{Zel_MemoryErrorCodes::InvalidName}, answers[names.size()]->codes);
    EXPECT_EQ(1, answers[3]->ok);
    EXPECT_EQ(QList<int>{Zel_MemoryErrorCodes::InvalidName}, answers[1]->codes);
    editor.reset();
    producer.reset();
    delete engine;
}

TEST(Zel_MemorySessionThreadTest, RequestRunningWhenItsSessionGoesFailsNotConnected)
{
    Orv_Engine engine(1);
    const boost::shared_ptr<Zel_MemoryTree> tree = Zel_MemoryTree::sample();
    boost::shared_ptr<Zel_MemorySession> session(new Zel_MemorySession(tree, &engine));
    auto login = rec<LoginRec>();
    session->submitRequest(session->makeLoginReqSP(QStringLiteral("editor"), QStringLiteral("editor"), {}, login));
    engine.DeliverAll();
    ASSERT_EQ(1, login->ok);

    // The worker's trace line tells which thread runs the request; the test
    // holds the tree, so the request, past its connection check, waits for it.
    std::mutex mutex;
    std::condition_variable started;
    long worker = 0;
    const Orv::LogHandler previous = Orv::setLogHandler([&](const char* line) {
        if (std::string(line).find("Zel_CreateFolderReq: processing request") == std::string::npos)
            return;
        std::lock_guard<std::mutex> lock(mutex);
        worker = static_cast<long>(syscall(SYS_gettid));
        started.notify_all();
    });
    Zel_Debug::instance()->setEnabled(true);
    std::unique_lock<std::shared_mutex> treeHold(tree->data().mutex);

    auto created = rec<CreateFolderRec>();
    ASSERT_TRUE(session->submitRequest(session->makeCreateFolderReqSP(mk(m(Footage)), QStringLiteral("Rushes"), created)));
    bool waiting = false;
    {
        std::unique_lock<std::mutex> lock(mutex);
        if (started.wait_for(lock, std::chrono::seconds(60), [&] { return worker != 0; })) {
            const auto deadline = std::chrono::steady_clock::now() + std::chrono::seconds(60);
            while (!(waiting = threadState(worker) == 'S') && std::chrono::steady_clock::now() < deadline)
                std::this_thread::yield();
        }
    }
    session.reset(); // the session goes while its request is running
    treeHold.unlock();
    engine.DeliverAll();
    Zel_Debug::instance()->setEnabled(false);
    Orv::setLogHandler(previous);

    EXPECT_TRUE(waiting) << "the request never waited for the tree";
    EXPECT_EQ((QStringList{QStringLiteral("fail %1").arg(Zel_MemoryErrorCodes::NotConnected), QStringLiteral("finished")}),
              created->log);
    EXPECT_EQ(0u, engine.failedRequestCount());
}
