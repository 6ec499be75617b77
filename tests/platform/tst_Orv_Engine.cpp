#include "Orv.h"
#include "Orv_Engine.h"
#include "Orv_Request.h"
#include "Orv_Result.h"
#include "Orv_ResultQ.h"
#include "Orv_ResultsCB.h"

#include <boost/make_shared.hpp>
#include <gtest/gtest.h>

#include <algorithm>
#include <atomic>
#include <climits>
#include <memory>
#include <cstdint>
#include <mutex>
#include <stdexcept>
#include <string>
#include <thread>
#include <vector>

namespace {

struct LogCB : Orv_ResultsCB {
    LogCB() : Orv_ResultsCB(Orv_RequestID(Orv_RequestID::Callback)) {}
    std::vector<std::string> delivered; // only touched on the delivering thread
};

// A result that hands `count` numbered items to its callback, one per call.
struct CountingResult : Orv_Result {
    CountingResult(boost::shared_ptr<LogCB> cb, std::string tag, int count, bool final)
        : Orv_Result(cb, final), mCB(std::move(cb)), mTag(std::move(tag)), mCount(count) {}
    bool deliverNext() override
    {
        if (mNext < mCount)
            mCB->delivered.push_back(mTag + ":" + std::to_string(mNext++));
        return mNext < mCount;
    }
    boost::shared_ptr<LogCB> mCB;
    std::string mTag;
    int mCount;
    int mNext = 0;
};

struct PushingRequest : Orv_Request {
    PushingRequest(boost::shared_ptr<LogCB> cb, std::string tag, int results)
        : Orv_Request("PushingRequest", cb), mCB(std::move(cb)), mTag(std::move(tag)), mResults(results) {}
    bool process(boost::shared_ptr<Orv_ResultQ> q) override
    {
        ++mProcessed;
        for (int i = 0; i < mResults; ++i)
            q->Push(boost::make_shared<CountingResult>(mCB, mTag + "/" + std::to_string(i), 2, i + 1 == mResults));
        return true;
    }
    void cancel() { setCanceled(true); }
    boost::shared_ptr<LogCB> mCB;
    std::string mTag;
    int mResults;
    std::atomic<int> mProcessed{0};
};

// A result of `count` items whose deliverNext() throws instead of delivering
// the items listed in `throwsAt` (the item counts as handed out all the same).
struct ThrowingResult : Orv_Result {
    ThrowingResult(boost::shared_ptr<LogCB> cb, std::string tag, int count, std::vector<int> throwsAt)
        : Orv_Result(cb, true), mCB(std::move(cb)), mTag(std::move(tag)), mCount(count), mThrowsAt(std::move(throwsAt)) {}
    bool deliverNext() override
    {
        ++mCalls;
        if (mNext >= mCount)
            return false;
        const int item = mNext++;
        for (int bad : mThrowsAt)
            if (bad == item)
                throw std::runtime_error(mTag + " item " + std::to_string(item));
        mCB->delivered.push_back(mTag + ":" + std::to_string(item));
        return mNext < mCount;
    }
    boost::shared_ptr<LogCB> mCB;
    std::string mTag;
    int mCount;
    std::vector<int> mThrowsAt;
    int mNext = 0;
    int mCalls = 0;
};

// Every line the engine logs while it lives.
struct LogLines {
    LogLines()
        : mPrevious(Orv::setLogHandler([this](const char* line) {
            std::lock_guard<std::mutex> lock(mMutex);
            mLines.push_back(line);
        }))
    {
    }
    ~LogLines() { Orv::setLogHandler(mPrevious); }
    std::vector<std::string> lines()
    {
        std::lock_guard<std::mutex> lock(mMutex);
        return mLines;
    }
    Orv::LogHandler mPrevious;
    std::mutex mMutex;
    std::vector<std::string> mLines;
};

} // namespace

// The sequence of request identifiers, for tests of its wrap-around.
struct Orv_RequestIDTestAccess {
    static std::int32_t restartAt(std::int32_t value) { return Orv_RequestID::restartAt(value); }
};

TEST(Orv_EngineTest, DeliversEveryItemOfEveryResultInPushOrder)
{
    Orv_Engine engine(3);
    auto cb = boost::make_shared<LogCB>();
    std::vector<boost::shared_ptr<PushingRequest>> requests;
    for (int i = 0; i < 50; ++i) {
        requests.push_back(boost::make_shared<PushingRequest>(cb, "r" + std::to_string(i), 3));
        engine.Submit(requests.back());
    }
    engine.DeliverAll();

    ASSERT_EQ(cb->delivered.size(), 50u * 3u * 2u);
    // Within one request its results arrive in push order, each item in order.
    for (int i = 0; i < 50; ++i) {
        const std::string tag = "r" + std::to_string(i) + "/";
        std::vector<std::string> mine;
        for (const std::string& d : cb->delivered)
            if (d.compare(0, tag.size(), tag) == 0)
                mine.push_back(d.substr(tag.size()));
        EXPECT_EQ(mine, (std::vector<std::string>{"0:0", "0:1", "1:0", "1:1", "2:0", "2:1"})) << tag;
        EXPECT_EQ(requests[i]->mProcessed.load(), 1);
    }
    EXPECT_TRUE(cb->isFinished());
    EXPECT_EQ(engine.getResultQ()->Size(), 0u);
}

TEST(Orv_EngineTest, ResultsPushedFromManyThreadsComeOutInPushOrder)
{
    Orv_ResultQ queue;
    auto cb = boost::make_shared<LogCB>();
    std::mutex orderMutex;
    std::vector<boost::shared_ptr<Orv_Result>> pushed;
    std::vector<std::thread> threads;
    for (int t = 0; t < 4; ++t) {
        threads.emplace_back([&, t] {
            for (int i = 0; i < 200; ++i) {
                auto r = boost::make_shared<CountingResult>(cb, std::to_string(t), 1, false);
                std::lock_guard<std::mutex> lock(orderMutex);
                pushed.push_back(r);
                queue.Push(r);
            }
        });
    }
    for (std::thread& t : threads)
        t.join();
    ASSERT_EQ(queue.Size(), 800u);
    for (const boost::shared_ptr<Orv_Result>& expected : pushed)
        EXPECT_EQ(queue.TryPop(), expected);
    EXPECT_FALSE(queue.TryPop());
    queue.Push(boost::shared_ptr<Orv_Result>());
    EXPECT_EQ(queue.Size(), 0u) << "empty results are ignored";
}

TEST(Orv_EngineTest, CancelledRequestsAreNotProcessed)
{
    Orv_Engine engine(1);
    auto cb = boost::make_shared<LogCB>();
    auto byRequest = boost::make_shared<PushingRequest>(cb, "a", 1);
    byRequest->cancel();
    auto cancelledCB = boost::make_shared<LogCB>();
    auto byCallback = boost::make_shared<PushingRequest>(cancelledCB, "b", 1);
    EXPECT_TRUE(cancelledCB->cancelRequest());
    EXPECT_TRUE(byCallback->isCanceled());
    engine.Submit(byRequest);
    engine.Submit(byCallback);
    engine.DeliverAll();
    EXPECT_EQ(byRequest->mProcessed.load(), 0);
    EXPECT_EQ(byCallback->mProcessed.load(), 0);
    EXPECT_TRUE(cb->delivered.empty());

    // A finished request can no longer be cancelled.
    auto doneCB = boost::make_shared<LogCB>();
    engine.Submit(boost::make_shared<PushingRequest>(doneCB, "c", 1));
    engine.DeliverAll();
    EXPECT_TRUE(doneCB->isFinished());
    EXPECT_FALSE(doneCB->cancelRequest());
}

TEST(Orv_EngineTest, ThrowingRequestIsLoggedAndCounted)
{
    struct Thrower : Orv_Request {
        Thrower() : Orv_Request("Thrower", boost::shared_ptr<Orv_ResultsCB>()) {}
        bool process(boost::shared_ptr<Orv_ResultQ>) override { throw std::runtime_error("boom"); }
    };
    std::vector<std::string> lines;
    std::mutex linesMutex;
    const Orv::LogHandler previous = Orv::setLogHandler([&](const char* line) {
        std::lock_guard<std::mutex> lock(linesMutex);
        lines.push_back(line);
    });
    {
        Orv_Engine engine(2);
        engine.Submit(boost::make_shared<Thrower>());
        engine.WaitIdle();
        EXPECT_EQ(engine.failedRequestCount(), 1u);
    }
    Orv::setLogHandler(previous);
    ASSERT_EQ(lines.size(), 1u);
    EXPECT_EQ(lines[0], "orv: request Thrower failed: boom");
}

TEST(Orv_EngineTest, ThrowingRequestIsAnsweredByItsCanceledResultWhereItMakesOne)
{
    // A request whose process() throws, with or without an answer of its own
    // for work that did not run; and one that throws something that is no
    // std::exception. The one with an answer gets it delivered in place of
    // its work's, the others leave their callbacks unanswered; every one is
    // logged and counted, and requests after them run as usual.
    struct Thrower : Orv_Request {
        Thrower(boost::shared_ptr<LogCB> cb, bool answers, bool stdException)
            : Orv_Request("Thrower", cb), mCB(std::move(cb)), mAnswers(answers), mStd(stdException) {}
        bool process(boost::shared_ptr<Orv_ResultQ>) override
        {
            if (mStd)
                throw std::runtime_error("boom");
            throw 7;
        }
        boost::shared_ptr<Orv_Result> makeCanceledResult() override
        {
            if (!mAnswers)
                return boost::shared_ptr<Orv_Result>();
            return boost::make_shared<CountingResult>(mCB, "failed", 1, true);
        }
        boost::shared_ptr<LogCB> mCB;
        bool mAnswers;
        bool mStd;
    };
    std::vector<std::string> lines;
    std::mutex linesMutex;
    const Orv::LogHandler previous = Orv::setLogHandler([&](const char* line) {
        std::lock_guard<std::mutex> lock(linesMutex);
        lines.push_back(line);
    });
    const auto answered = boost::make_shared<LogCB>();
    const auto silent = boost::make_shared<LogCB>();
    const auto foreign = boost::make_shared<LogCB>();
    const auto after = boost::make_shared<LogCB>();
    {
        Orv_Engine engine(1);
        engine.Submit(boost::make_shared<Thrower>(answered, true, true));
        engine.Submit(boost::make_shared<Thrower>(silent, false, true));
        engine.Submit(boost::make_shared<Thrower>(foreign, true, false));
        engine.Submit(boost::make_shared<PushingRequest>(after, "after", 1));
        engine.DeliverAll();
        EXPECT_EQ(engine.failedRequestCount(), 3u);
    }
    Orv::setLogHandler(previous);
    EXPECT_EQ(answered->delivered, std::vector<std::string>{"failed:0"});
    EXPECT_TRUE(answered->isFinished());
    EXPECT_TRUE(silent->delivered.empty());
    EXPECT_FALSE(silent->isFinished());
    EXPECT_EQ(foreign->delivered, std::vector<std::string>{"failed:0"});
    EXPECT_EQ(after->delivered, (std::vector<std::string>{"after/0:0", "after/0:1"}));
    EXPECT_EQ(lines, (std::vector<std::string>{"orv: request Thrower failed: boom", "orv: request Thrower failed: boom",
                                               "orv: request Thrower failed: unknown exception"}));
}

TEST(Orv_EngineTest, LogWithoutHandlerDiscardsAndHandlerCanBeReplaced)
{
    const Orv::LogHandler previous = Orv::setLogHandler(Orv::LogHandler());
    Orv::log("dropped");
    Orv::log(nullptr);
    std::vector<std::string> seen;
    Orv::setLogHandler([&](const char* line) { seen.push_back(line); });
    Orv::log("kept");
    EXPECT_EQ(seen, (std::vector<std::string>{"kept"}));

    // A handler may log itself and replace itself while it runs.
    seen.clear();
    Orv::setLogHandler([&](const char* line) {
        seen.push_back(std::string("first:") + line);
        Orv::setLogHandler([&](const char* inner) { seen.push_back(std::string("second:") + inner); });
        Orv::log("from the handler");
    });
    Orv::log("outer");
    Orv::log("after");
    Orv::setLogHandler(previous);
    EXPECT_EQ(seen, (std::vector<std::string>{"first:outer", "second:from the handler", "second:after"}));
}

TEST(Orv_EngineTest, DestroyingEngineWithQueuedWorkJoinsCleanly)
{
    auto cb = boost::make_shared<LogCB>();
    std::vector<boost::shared_ptr<PushingRequest>> requests;
    {
        Orv_Engine engine(1);
        for (int i = 0; i < 100; ++i) {
            requests.push_back(boost::make_shared<PushingRequest>(cb, "x", 1));
            engine.Submit(requests.back());
        }
    }
    int processed = 0;
    for (const auto& r : requests)
        processed += r->mProcessed.load();
    EXPECT_LE(processed, 100);
    for (const auto& r : requests)
        EXPECT_LE(r->mProcessed.load(), 1);
}

TEST(Orv_EngineTest, ResultWhoseDeliveryThrowsIsDeliveredToItsEndAndFinished)
{
    LogLines log;
    Orv_Engine engine(1);
    auto cb = boost::make_shared<LogCB>();
    auto throwing = boost::make_shared<ThrowingResult>(cb, "t", 4, std::vector<int>{1, 2});
    auto afterCB = boost::make_shared<LogCB>();
    engine.getResultQ()->Push(throwing);
    engine.getResultQ()->Push(boost::make_shared<CountingResult>(afterCB, "after", 1, true));

    std::size_t delivered = 0;
    EXPECT_NO_THROW(delivered = engine.DeliverPending());
    EXPECT_EQ(2u, delivered);
    // The items after the ones that threw still arrive, and the request ends.
    EXPECT_EQ((std::vector<std::string>{"t:0", "t:3"}), cb->delivered);
    EXPECT_TRUE(cb->isFinished());
    EXPECT_EQ((std::vector<std::string>{"after:0"}), afterCB->delivered);
    EXPECT_TRUE(afterCB->isFinished());
    EXPECT_EQ(0u, engine.getResultQ()->Size());
    EXPECT_EQ((std::vector<std::string>{"orv: delivery of a result failed: t item 1",
                                        "orv: delivery of a result failed: t item 2"}),
              log.lines());
}

TEST(Orv_EngineTest, ResultThatThrowsOnEveryCallIsEndedInsteadOfSpinning)
{
    LogLines log;
    Orv_Engine engine(1);
    auto cb = boost::make_shared<LogCB>();
    // A result that never gets past its first item.
    struct Stuck : Orv_Result {
        explicit Stuck(boost::shared_ptr<LogCB> cb) : Orv_Result(std::move(cb), true) {}
        bool deliverNext() override
        {
            ++calls;
            throw 42;
        }
        int calls = 0;
    };
    auto stuck = boost::make_shared<Stuck>(cb);
    engine.getResultQ()->Push(stuck);
    EXPECT_NO_THROW(engine.DeliverAll());
    EXPECT_EQ(Orv_Engine::MaxDeliveryFailuresInARow, stuck->calls);
    EXPECT_TRUE(cb->isFinished());
    const std::vector<std::string> lines = log.lines();
    ASSERT_EQ(static_cast<std::size_t>(Orv_Engine::MaxDeliveryFailuresInARow), lines.size());
    EXPECT_EQ("orv: delivery of a result failed: unknown exception", lines.back());
}

TEST(Orv_EngineTest, HandleRefusesRequestsOnceTheEngineIsGone)
{
    auto cb = boost::make_shared<LogCB>();
    auto before = boost::make_shared<PushingRequest>(cb, "before", 1);
    boost::shared_ptr<Orv_EngineHandle> handle;
    {
        Orv_Engine engine(1);
        handle = engine.getHandle();
        EXPECT_TRUE(handle->Submit(before));
        EXPECT_FALSE(handle->Submit(boost::shared_ptr<Orv_Request>()));
        engine.DeliverAll();
    }
    auto after = boost::make_shared<PushingRequest>(cb, "after", 1);
    EXPECT_FALSE(handle->Submit(after));
    EXPECT_EQ(1, before->mProcessed.load());
    EXPECT_EQ(0, after->mProcessed.load());
    EXPECT_EQ(1, after.use_count()) << "a refused request is not kept";
    EXPECT_EQ((std::vector<std::string>{"before/0:0", "before/0:1"}), cb->delivered);
}

TEST(Orv_EngineTest, HandleSubmittingFromThreadsWhileTheEngineGoesNeverRunsARefusedRequest)
{
    for (int round = 0; round < 20; ++round) {
        auto cb = boost::make_shared<LogCB>();
        std::unique_ptr<Orv_Engine> engine(new Orv_Engine(2));
        const boost::shared_ptr<Orv_EngineHandle> handle = engine->getHandle();
        std::atomic<bool> go(false);
        std::vector<std::vector<boost::shared_ptr<PushingRequest>>> refused(2);
        std::vector<std::thread> submitters;
        for (int t = 0; t < 2; ++t) {
            submitters.emplace_back([&, t] {
                while (!go.load())
                    std::this_thread::yield();
                for (int i = 0; i < 200; ++i) {
                    auto request = boost::make_shared<PushingRequest>(cb, "x", 1);
                    if (!handle->Submit(request))
                        refused[t].push_back(request);
                }
            });
        }
        go = true;
        engine.reset(); // while the submitters run
        for (std::thread& t : submitters)
            t.join();
        EXPECT_FALSE(handle->Submit(boost::make_shared<PushingRequest>(cb, "late", 1)));
        for (const auto& mine : refused)
            for (const auto& request : mine)
                EXPECT_EQ(0, request->mProcessed.load());
    }
}

TEST(Orv_EngineTest, RequestIdentifiersWrapPastTheReservedValues)
{
    const std::int32_t resume = Orv_RequestIDTestAccess::restartAt(INT32_MAX - 1);
    std::vector<std::int32_t> values;
    for (int i = 0; i < 4; ++i)
        values.push_back(Orv_RequestID::next().getValue());
    Orv_RequestIDTestAccess::restartAt(resume);
    // Callback (-2), Invalid (-1) and Session (0) are never a request's; after
    // the largest value the numbers start again at 1.
    EXPECT_EQ((std::vector<std::int32_t>{INT32_MAX - 1, INT32_MAX, 1, 2}), values);
}

TEST(Orv_EngineTest, RequestIdentifiersTakenOnManyThreadsAcrossTheWrapAreDistinctAndPositive)
{
    const std::int32_t resume = Orv_RequestIDTestAccess::restartAt(INT32_MAX - 999);
    const int threads = 4;
    const int each = 1000;
    std::vector<std::vector<std::int32_t>> taken(threads);
    std::vector<std::thread> workers;
    for (int t = 0; t < threads; ++t) {
        workers.emplace_back([&, t] {
            for (int i = 0; i < each; ++i)
                taken[t].push_back(Orv_RequestID::next().getValue());
        });
    }
    for (std::thread& w : workers)
        w.join();
    Orv_RequestIDTestAccess::restartAt(resume);

    std::vector<std::int32_t> all;
    for (const std::vector<std::int32_t>& mine : taken) {
        // Each thread sees its numbers in the order of its calls, across the wrap.
        for (std::size_t i = 1; i < mine.size(); ++i)
            EXPECT_TRUE(mine[i] > mine[i - 1] || (mine[i - 1] > INT32_MAX - 1000 && mine[i] <= 3000)) << mine[i - 1] << " " << mine[i];
        all.insert(all.end(), mine.begin(), mine.end());
    }
    std::sort(all.begin(), all.end());
    EXPECT_EQ(all.end(), std::adjacent_find(all.begin(), all.end()));
    // The 1000 values up to the largest one, then 1 to 3000.
    ASSERT_EQ(4000u, all.size());
    EXPECT_EQ(1, all.front());
    EXPECT_EQ(3000, all[2999]);
    EXPECT_EQ(INT32_MAX - 999, all[3000]);
    EXPECT_EQ(INT32_MAX, all.back());
}
