// The in-memory backend: loading a tree, browsing a large folder and the
// request path through the engine, each against its floor or a smaller size.
//
// Rows (N children in one folder; the tree also holds a project above it):
//   tree/load/N                         Zel_MemoryTree::fromJson of the whole text; the
//                                       tree's destruction, and the allocator's tidying
//                                       up after it, are not timed (target: 300,000
//                                       children at most 12x the time of 30,000)
//   browse/GetChildren/engine/N         a GetChildren request of the folder: made,
//                                       submitted, processed on a worker and delivered
//                                       on this thread (DeliverAll) to a counting callback
//   browse/GetChildren/snapshots/N      the floor: a loop over the folder's children
//                                       building the same nodes, in the order they were
//                                       added, unchecked (Zel_MemoryTree::childSnapshots),
//                                       each handed to the same callback (target: at
//                                       most 2x)
//   request/GetNode/engine/R            R GetNode requests, each made and submitted, all
//                                       processed on the workers and delivered here
//   request/GetNode/direct/R            the same R requests made and processed on this
//                                       thread, each result delivered at once (target:
//                                       at most 3x; items/s is requests per second)
// The engine rows and their floors count the CPU time of every thread of the
// process, so that the workers' share is not left out.
#include "BenchSupport.h"
#include "CountingNodeCB.h"

#include "Orv_Engine.h"
#include "Orv_Result.h"
#include "Orv_ResultQ.h"
#include "Zel_Error.h"
#include "Zel_GetChildrenReq.h"
#include "Zel_GetNodeReq.h"
#include "Zel_LoginCB.h"
#include "Zel_LoginReq.h"
#include "Zel_MemorySession.h"
#include "Zel_MemoryTree.h"
#include "Zel_Node.h"
#include "Zel_ResultCB.h"

#include <QByteArray>
#include <QString>
#include <boost/make_shared.hpp>
#include <boost/shared_ptr.hpp>

#include <cstdio>
#include <cstdlib>
#ifdef __GLIBC__
#include <malloc.h>
#endif
#include <string>
#include <vector>

namespace {

void check(bool condition, const char* what)
{
    if (!condition) {
        std::fprintf(stderr, "bench_memory_tree: %s\n", what);
        std::exit(2);
    }
}

const char* const kFolderPath = "/Project/Footage";

// A tree whose folder /Project/Footage holds children clips, sequences and
// subclips, one property each, named in an order unlike the file's (so that
// the answer's node order has work to do). The user "editor" may read and
// change everything below the root.
QByteArray folderTree(int children)
{
    static const char* const mimeTypes[] = {"masterclip", "sequence", "subclip"};
    QByteArray json = "{\"users\":[{\"name\":\"editor\",\"password\":\"pw\"}],\n"
                      "\"root\":{\"id\":\"R\",\"name\":\"Root\",\"mimeType\":\"workspace\","
                      "\"permissions\":{\"*\":[\"All\"]},\"children\":[\n"
                      "{\"id\":\"P\",\"name\":\"Project\",\"mimeType\":\"project\",\"children\":[\n"
                      "{\"id\":\"F\",\"name\":\"Footage\",\"mimeType\":\"bin\",\"children\":[\n";
    for (int i = 0; i < children; ++i) {
        // 7919 is prime and divides no size used here: a permutation of 0..children-1.
        const QByteArray number = QByteArray::number(static_cast<qint64>(i) * 7919 % children);
        if (i > 0)
            json += ",\n";
        json += "{\"name\":\"Shot " + number + "\",\"mimeType\":\"" + mimeTypes[i % 3]
            + "\",\"properties\":{\"Tape\":\"T" + number + "\"}}";
    }
    json += "]}]}]}}\n";
    return json;
}

boost::shared_ptr<Zel_MemoryTree> loadTree(const QByteArray& json)
{
    QString error;
    boost::shared_ptr<Zel_MemoryTree> tree = Zel_MemoryTree::fromJson(json, QStringLiteral("bench.json"), &error);
    if (!tree)
        std::fprintf(stderr, "bench_memory_tree: %s\n", qPrintable(error));
    check(tree != nullptr, "the tree does not load");
    return tree;
}

class LoginCB : public Zel_LoginCB
{
public:
    void succeeded(QString) override { mLoggedIn = true; }
    void failed(boost::shared_ptr<Zel_Error>) override {}
    bool mLoggedIn = false;
};

// A logged-in session of "editor" on the tree, its requests run by engine.
boost::shared_ptr<Zel_MemorySession> loggedInSession(const boost::shared_ptr<Zel_MemoryTree>& tree, Orv_Engine& engine)
{
    boost::shared_ptr<Zel_MemorySession> session(new Zel_MemorySession(tree, &engine, QStringLiteral("bench")));
    const boost::shared_ptr<LoginCB> login = boost::make_shared<LoginCB>();
    session->submitRequest(session->makeLoginReqSP(QStringLiteral("editor"), QStringLiteral("pw"),
                                                   boost::shared_ptr<Zel_LoginCredentials>(), login));
    engine.DeliverAll();
    check(login->mLoggedIn, "the login failed");
    return session;
}

// Processes the request on this thread and delivers its results at once.
void processDirectly(Orv_Request& request, const boost::shared_ptr<Orv_ResultQ>& queue)
{
    request.process(queue);
    while (const boost::shared_ptr<Orv_Result> result = queue->TryPop()) {
        while (result->deliverNext()) {
        }
    }
}

void registerLoadRows(int smallCount, int largeCount)
{
    std::string rows[2];
    int counts[2] = {smallCount, largeCount};
    for (int i = 0; i < 2; ++i) {
        const int count = counts[i];
        rows[i] = "tree/load/" + std::to_string(count);
        zelbench::row(rows[i], count, [count](benchmark::State& state) {
            const QByteArray json = folderTree(count);
            for (auto _ : state) {
                boost::shared_ptr<Zel_MemoryTree> tree = loadTree(json);
                check(tree->nodeCount() == count + 3, "the tree lacks nodes");
                // The tree's destruction is not part of the next load, nor
                // is the allocator's merging of the blocks it freed, which a
                // mid-sized request makes it do (glibc).
                state.PauseTiming();
                tree.reset();
#ifdef __GLIBC__
                malloc_trim(0);
#endif
                state.ResumeTiming();
            }
        })->MeasureProcessCPUTime();
    }
    zelbench::target("tree loading", rows[1], rows[0], "growth", 12.0, false);
}

void registerBrowseRows(int count)
{
    const std::string engineRow = "browse/GetChildren/engine/" + std::to_string(count);
    const std::string floorRow = "browse/GetChildren/snapshots/" + std::to_string(count);

    zelbench::row(engineRow, count, [count](benchmark::State& state) {
        const boost::shared_ptr<Zel_MemoryTree> tree = loadTree(folderTree(count));
        Orv_Engine engine(2);
        const boost::shared_ptr<Zel_MemorySession> session = loggedInSession(tree, engine);
        const boost::shared_ptr<QString> folder = boost::make_shared<QString>(tree->monikerAt(QLatin1String(kFolderPath)));
        const boost::shared_ptr<CountingNodeCB> callback = boost::make_shared<CountingNodeCB>();
        for (auto _ : state) {
            session->submitRequest(session->makeGetChildrenReqSP(folder, callback));
            engine.DeliverAll();
        }
        check(callback->mFailed == 0, "GetChildren failed");
        check(callback->mSucceeded == static_cast<long>(state.iterations()) * count, "children are missing");
    })->MeasureProcessCPUTime();

    zelbench::row(floorRow, count, [count](benchmark::State& state) {
        const boost::shared_ptr<Zel_MemoryTree> tree = loadTree(folderTree(count));
        const QString folder = tree->monikerAt(QLatin1String(kFolderPath));
        const boost::shared_ptr<CountingNodeCB> callback = boost::make_shared<CountingNodeCB>();
        Zel_ResultCB* cb = callback.get();
        benchmark::DoNotOptimize(cb);
        for (auto _ : state) {
            for (const boost::shared_ptr<Zel_Node>& node :
                 Zel_MemoryTree::childSnapshots(tree, folder, QStringLiteral("editor")))
                cb->succeeded(node);
            cb->finished();
        }
        check(callback->mSucceeded == static_cast<long>(state.iterations()) * count, "snapshots are missing");
    })->MeasureProcessCPUTime();

    zelbench::target("children through the engine", engineRow, floorRow, "floor", 2.0);
}

void registerRequestRows(int folderSize, int requests)
{
    const std::string engineRow = "request/GetNode/engine/" + std::to_string(requests);
    const std::string directRow = "request/GetNode/direct/" + std::to_string(requests);

    // The monikers of the folder's children, which the requests read in turn.
    struct Fixture
    {
        explicit Fixture(int folderSize)
            : tree(loadTree(folderTree(folderSize)))
        {
            Orv_Engine engine(1);
            const boost::shared_ptr<Zel_MemorySession> session = loggedInSession(tree, engine);
            struct Collect : CountingNodeCB {
                void succeeded(boost::shared_ptr<Zel_Node> node) override
                {
                    monikers.push_back(boost::make_shared<QString>(node->getMoniker()));
                }
                std::vector<boost::shared_ptr<QString>> monikers;
            };
            const boost::shared_ptr<Collect> collect = boost::make_shared<Collect>();
            session->submitRequest(session->makeGetChildrenReqSP(
                boost::make_shared<QString>(tree->monikerAt(QLatin1String(kFolderPath))), collect));
            engine.DeliverAll();
            monikers = collect->monikers;
            check(static_cast<int>(monikers.size()) == folderSize, "the folder's children are missing");
        }
        boost::shared_ptr<Zel_MemoryTree> tree;
        std::vector<boost::shared_ptr<QString>> monikers;
    };

    zelbench::row(engineRow, requests, [folderSize, requests](benchmark::State& state) {
        Fixture fixture(folderSize);
        Orv_Engine engine(2);
        const boost::shared_ptr<Zel_MemorySession> session = loggedInSession(fixture.tree, engine);
        const boost::shared_ptr<CountingNodeCB> callback = boost::make_shared<CountingNodeCB>();
        const std::size_t nodes = fixture.monikers.size();
        for (auto _ : state) {
            for (int i = 0; i < requests; ++i)
                session->submitRequest(session->makeGetNodeReqSP(fixture.monikers[i % nodes], callback));
            engine.DeliverAll();
        }
        check(callback->mFailed == 0, "GetNode failed");
        check(callback->mFinished == static_cast<long>(state.iterations()) * requests, "answers are missing");
    })->MeasureProcessCPUTime();

    zelbench::row(directRow, requests, [folderSize, requests](benchmark::State& state) {
        Fixture fixture(folderSize);
        Orv_Engine engine(2); // idle: the session needs one, the requests do not go through it
        const boost::shared_ptr<Zel_MemorySession> session = loggedInSession(fixture.tree, engine);
        const boost::shared_ptr<Orv_ResultQ> queue = boost::make_shared<Orv_ResultQ>();
        const boost::shared_ptr<CountingNodeCB> callback = boost::make_shared<CountingNodeCB>();
        const std::size_t nodes = fixture.monikers.size();
        for (auto _ : state) {
            for (int i = 0; i < requests; ++i)
                processDirectly(*session->makeGetNodeReqSP(fixture.monikers[i % nodes], callback), queue);
        }
        check(callback->mFailed == 0, "GetNode failed");
        check(callback->mFinished == static_cast<long>(state.iterations()) * requests, "answers are missing");
    })->MeasureProcessCPUTime();

    zelbench::target("request path", engineRow, directRow, "floor", 3.0);
}

} // namespace

int main(int argc, char** argv)
{
    registerLoadRows(zelbench::size(30000, 300), zelbench::size(300000, 3000));
    registerBrowseRows(zelbench::size(300000, 3000));
    registerRequestRows(zelbench::size(1000, 100), zelbench::size(100000, 1000));
    return zelbench::runMain(argc, argv, "in-memory tree");
}
