// Result delivery: Zel_Res::deliverNext through the generic results, and the
// engine's round trip (queue, pop, deliverNext), against the floor of calling
// the same callback's handler with the same payloads straight from a vector.
//
// Rows (N answers per result, one final result per iteration):
//   delivery/GetNodeRes/deliverNext/N      while (result.deliverNext()) {}
//   delivery/GetNodeRes/floor/N            for (node : nodes) cb->succeeded(node); cb->finished();
//                                          (target: 1,000,000 answers at most 1.4x the floor)
//   delivery/GetNodeRes/failures-1in10/... the same with every tenth answer an error
//   delivery/SettingsRes/...               the same with QString payloads
//   engine/GetNodeRes/...                  100 results of 10 answers: Orv_Engine (Push,
//                                          DeliverPending), the bare queue (Push, TryPop,
//                                          deliverNext), deliverNext alone, and the floor
#include "BenchSupport.h"
#include "CountingNodeCB.h"

#include "Orv_Engine.h"
#include "Orv_ResultQ.h"
#include "Zel_Error.h"
#include "Zel_GetNodeRes.h"
#include "Zel_Node.h"
#include "Zel_ResultCB.h"
#include "Zel_SettingsCB.h"
#include "Zel_SettingsRes.h"

#include <QString>
#include <boost/make_shared.hpp>
#include <boost/shared_ptr.hpp>

#include <cstdio>
#include <cstdlib>
#include <vector>

namespace {

// Handlers that do the least an application would: look at the payload.
class CountingSettingsCB : public Zel_SettingsCB
{
public:
    void succeeded(QString settings) override
    {
        mChars += settings.size();
        ++mSucceeded;
    }
    void failed(boost::shared_ptr<Zel_Error> error) override
    {
        benchmark::DoNotOptimize(error.get());
        ++mFailed;
    }
    void finished() override { ++mFinished; }

    long mChars = 0;
    long mSucceeded = 0;
    long mFailed = 0;
    long mFinished = 0;
};

// Results that can be delivered again: rewinding the cursor makes each
// iteration deliver the same stored answers without refilling them.
class RewindableNodeRes : public Zel_GetNodeRes
{
public:
    using Zel_GetNodeRes::Zel_GetNodeRes;
    void rewind() { mCursor = 0; }
};

class RewindableSettingsRes : public Zel_SettingsRes
{
public:
    using Zel_SettingsRes::Zel_SettingsRes;
    void rewind() { mCursor = 0; }
};

// The answers of one result, kept for the floor in the order they are added.
struct NodeAnswers
{
    std::vector<boost::shared_ptr<Zel_Node>> nodes;
    std::vector<boost::shared_ptr<Zel_Error>> errors; // null: a success
};

NodeAnswers makeNodeAnswers(int count, int errorEvery)
{
    NodeAnswers answers;
    for (int i = 0; i < count; ++i) {
        answers.nodes.push_back(boost::make_shared<Zel_Node>(QStringLiteral("node-%1").arg(i)));
        if (errorEvery > 0 && i % errorEvery == errorEvery - 1)
            answers.errors.push_back(boost::make_shared<Zel_Error>(404, QStringLiteral("no such node")));
        else
            answers.errors.push_back(boost::shared_ptr<Zel_Error>());
    }
    return answers;
}

boost::shared_ptr<RewindableNodeRes> makeNodeRes(const boost::shared_ptr<Zel_ResultCB>& callback,
                                                 const NodeAnswers& answers)
{
    boost::shared_ptr<RewindableNodeRes> result = boost::make_shared<RewindableNodeRes>(callback, true);
    for (std::size_t i = 0; i < answers.nodes.size(); ++i)
        result->setResult(answers.nodes[i], answers.errors[i]);
    return result;
}

// The floor: the same handlers with the same payloads, straight from the vectors.
inline void deliverDirectly(Zel_ResultCB* callback, const NodeAnswers& answers)
{
    const std::size_t count = answers.nodes.size();
    for (std::size_t i = 0; i < count; ++i) {
        if (answers.errors[i])
            callback->failed(answers.errors[i]);
        else
            callback->succeeded(answers.nodes[i]);
    }
    callback->finished();
}

void check(bool condition, const char* what)
{
    if (!condition) {
        std::fprintf(stderr, "bench_result_delivery: %s\n", what);
        std::exit(2);
    }
}

// Registers the pair; with maxRatio > 0 the pair is a target.
void registerNodeRows(const char* variant, int count, int errorEvery, double maxRatio = 0)
{
    const std::string stem = std::string("delivery/GetNodeRes/") + variant;
    const std::string feature = stem + "/deliverNext/" + std::to_string(count);
    const std::string floor = stem + "/floor/" + std::to_string(count);

    zelbench::row(feature, count, [count, errorEvery](benchmark::State& state) {
        const boost::shared_ptr<CountingNodeCB> callback = boost::make_shared<CountingNodeCB>();
        const NodeAnswers answers = makeNodeAnswers(count, errorEvery);
        const boost::shared_ptr<RewindableNodeRes> result = makeNodeRes(callback, answers);
        Zel_Res* res = result.get();
        benchmark::DoNotOptimize(res); // a call through Zel_Res*, as the engine makes it
        for (auto _ : state) {
            result->rewind();
            while (res->deliverNext()) {
            }
        }
        check(callback->mFinished == static_cast<long>(state.iterations()), "finished() not called once per delivery");
        check(callback->mSucceeded + callback->mFailed == static_cast<long>(state.iterations()) * count,
              "not every answer was delivered");
    });
    zelbench::row(floor, count, [count, errorEvery](benchmark::State& state) {
        const boost::shared_ptr<CountingNodeCB> callback = boost::make_shared<CountingNodeCB>();
        const NodeAnswers answers = makeNodeAnswers(count, errorEvery);
        Zel_ResultCB* cb = callback.get();
        benchmark::DoNotOptimize(cb); // keeps the handler calls virtual
        for (auto _ : state)
            deliverDirectly(cb, answers);
    });
    if (maxRatio > 0)
        zelbench::target("result delivery", feature, floor, "floor", maxRatio);
    else
        zelbench::compare(feature, floor, "floor");
}

void registerSettingsRows(int count)
{
    const std::string feature = "delivery/SettingsRes/deliverNext/" + std::to_string(count);
    const std::string floor = "delivery/SettingsRes/floor/" + std::to_string(count);

    auto makeTexts = [count]() {
        std::vector<QString> texts;
        for (int i = 0; i < count; ++i)
            texts.push_back(QStringLiteral("<Settings version=\"1.0\"><General><Language>en-%1</Language></General></Settings>").arg(i));
        return texts;
    };

    zelbench::row(feature, count, [count, makeTexts](benchmark::State& state) {
        const boost::shared_ptr<CountingSettingsCB> callback = boost::make_shared<CountingSettingsCB>();
        const boost::shared_ptr<RewindableSettingsRes> result = boost::make_shared<RewindableSettingsRes>(callback, true);
        for (const QString& text : makeTexts())
            result->setResult(text, boost::shared_ptr<Zel_Error>());
        Zel_Res* res = result.get();
        benchmark::DoNotOptimize(res);
        for (auto _ : state) {
            result->rewind();
            while (res->deliverNext()) {
            }
        }
        check(callback->mSucceeded == static_cast<long>(state.iterations()) * count, "not every answer was delivered");
    });
    zelbench::row(floor, count, [makeTexts](benchmark::State& state) {
        const boost::shared_ptr<CountingSettingsCB> callback = boost::make_shared<CountingSettingsCB>();
        const std::vector<QString> texts = makeTexts();
        Zel_SettingsCB* cb = callback.get();
        benchmark::DoNotOptimize(cb);
        for (auto _ : state) {
            for (const QString& text : texts)
                cb->succeeded(text);
            cb->finished();
        }
    });
    zelbench::compare(feature, floor, "floor");
}

// The engine's round trip: results queued, popped and delivered to the end.
const int kResults = 100;
const int kAnswersPerResult = 10;

struct EngineFixture
{
    EngineFixture()
        : callback(boost::make_shared<CountingNodeCB>())
    {
        for (int r = 0; r < kResults; ++r) {
            answers.push_back(makeNodeAnswers(kAnswersPerResult, 0));
            results.push_back(makeNodeRes(callback, answers.back()));
        }
    }
    void rewindAll()
    {
        for (const boost::shared_ptr<RewindableNodeRes>& result : results)
            result->rewind();
    }

    boost::shared_ptr<CountingNodeCB> callback;
    std::vector<NodeAnswers> answers;
    std::vector<boost::shared_ptr<RewindableNodeRes>> results;
};

void registerEngineRows()
{
    const std::string shape = std::to_string(kResults) + "x" + std::to_string(kAnswersPerResult);
    const std::string engineRow = "engine/GetNodeRes/Push+DeliverPending/" + shape;
    const std::string queueRow = "engine/GetNodeRes/Push+TryPop+deliverNext/" + shape;
    const std::string deliverRow = "engine/GetNodeRes/deliverNext/" + shape;
    const std::string floor = "engine/GetNodeRes/floor/" + shape;
    const double items = kResults * kAnswersPerResult;

    zelbench::row(engineRow, items, [](benchmark::State& state) {
        EngineFixture fixture;
        Orv_Engine engine(1); // its worker stays idle: nothing is submitted
        const boost::shared_ptr<Orv_ResultQ> queue = engine.getResultQ();
        for (auto _ : state) {
            fixture.rewindAll();
            for (const boost::shared_ptr<RewindableNodeRes>& result : fixture.results)
                queue->Push(result);
            engine.DeliverPending();
        }
        check(fixture.callback->mFinished == static_cast<long>(state.iterations()) * kResults,
              "finished() not called once per result");
    });
    zelbench::row(queueRow, items, [](benchmark::State& state) {
        EngineFixture fixture;
        const boost::shared_ptr<Orv_ResultQ> queue = boost::make_shared<Orv_ResultQ>();
        for (auto _ : state) {
            fixture.rewindAll();
            for (const boost::shared_ptr<RewindableNodeRes>& result : fixture.results)
                queue->Push(result);
            while (const boost::shared_ptr<Orv_Result> result = queue->TryPop()) {
                while (result->deliverNext()) {
                }
            }
        }
        check(fixture.callback->mFinished == static_cast<long>(state.iterations()) * kResults,
              "finished() not called once per result");
    });
    zelbench::row(deliverRow, items, [](benchmark::State& state) {
        EngineFixture fixture;
        std::vector<Orv_Result*> results;
        for (const boost::shared_ptr<RewindableNodeRes>& result : fixture.results)
            results.push_back(result.get());
        for (auto _ : state) {
            fixture.rewindAll();
            for (Orv_Result* result : results) {
                while (result->deliverNext()) {
                }
            }
        }
    });
    zelbench::row(floor, items, [](benchmark::State& state) {
        EngineFixture fixture;
        Zel_ResultCB* cb = fixture.callback.get();
        benchmark::DoNotOptimize(cb);
        for (auto _ : state) {
            for (const NodeAnswers& answers : fixture.answers)
                deliverDirectly(cb, answers);
        }
    });
    zelbench::compare(engineRow, floor, "floor");
    zelbench::compare(queueRow, floor, "floor");
    zelbench::compare(deliverRow, floor, "floor");
}

} // namespace

int main(int argc, char** argv)
{
    for (int count : {10, 1000})
        registerNodeRows("ok", count, 0);
    registerNodeRows("ok", zelbench::size(1000000, 2000), 0, 1.4);
    registerNodeRows("failures-1in10", 1000, 10);
    for (int count : {10, 1000})
        registerSettingsRows(count);
    registerEngineRows();
    return zelbench::runMain(argc, argv, "result delivery");
}
