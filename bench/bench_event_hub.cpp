// Event hub: Zel_EventRes::deliverNext through a session's Zel_EventCB, against
// the floor of calling the same listeners' handleEvent straight from a vector,
// and Zel_EventCB::hasRegisteredListener against plain QMap lookups.
//
// The hub holds a realistic table: the listeners of the event's folder (1, 10
// or 100), two listeners for every node (filed under ""), and 50 other folders
// with one listener each.
//
// Rows:
//   hub/deliverNext/L+2                one event result delivered to L + 2 listeners
//   hub/floor/L+2                      for (listener : listeners) listener->handleEvent(event)
//   hub/hasRegisteredListener/<case>   filed: the folder has listeners; unfiled: only the
//                                      "" listeners answer; none: a hub without "" listeners
//   hub/QMap-lookups/<case>            the same contains() calls on an unlocked QMap (floor)
//   hub/locked-QMap-lookups/<case>     the same under a std::recursive_mutex (peer)
#include "StubSession.h"
#include "BenchSupport.h"

#include "Zel_Event.h"
#include "Zel_EventCB.h"
#include "Zel_EventChildAdded.h"
#include "Zel_EventListener.h"
#include "Zel_EventRes.h"

#include <QMap>
#include <QString>
#include <boost/make_shared.hpp>
#include <boost/shared_ptr.hpp>

#include <cstdio>
#include <cstdlib>
#include <mutex>
#include <vector>

namespace {

// Takes what its mask accepts and counts it: the least a folder listener does.
class CountingListener : public Zel_EventListener
{
public:
    explicit CountingListener(boost::shared_ptr<QString> moniker)
        : Zel_EventListener(std::move(moniker), 7, boost::shared_ptr<Zel_Session>())
    {
    }

    // Public, so that the floor can call it directly.
    void handleEvent(boost::shared_ptr<Zel_Event> event) override
    {
        if (isEnabled(event))
            ++mHeard;
    }

    long mHeard = 0;

protected:
    const unsigned long getValidEventMask() const override { return 7; }
};

const int kEveryNodeListeners = 2;
const int kOtherFolders = 50;

boost::shared_ptr<QString> folderMoniker()
{
    return boost::make_shared<QString>(QStringLiteral("zel://server/Projects/Show/Bin 0042"));
}

boost::shared_ptr<QString> otherMoniker(int i)
{
    return boost::make_shared<QString>(QStringLiteral("zel://server/Projects/Show/Bin %1").arg(1000 + i));
}

// A session whose hub holds the table described above; listeners for the
// event's folder and for every node are kept in delivery order for the floor.
struct HubFixture
{
    HubFixture(int folderListeners, bool everyNodeListeners)
        : session(boost::make_shared<StubSession>())
        , moniker(folderMoniker())
    {
        for (int i = 0; i < kOtherFolders; ++i)
            session->RegisterListener(boost::make_shared<CountingListener>(otherMoniker(i)));
        for (int i = 0; i < folderListeners; ++i) {
            inOrder.push_back(boost::make_shared<CountingListener>(moniker));
            session->RegisterListener(inOrder.back());
        }
        if (everyNodeListeners) {
            for (int i = 0; i < kEveryNodeListeners; ++i) {
                inOrder.push_back(boost::make_shared<CountingListener>(boost::shared_ptr<QString>()));
                session->RegisterListener(inOrder.back());
            }
        }
        hub = session->getEventCBSP();
    }

    long heard() const
    {
        long total = 0;
        for (const boost::shared_ptr<CountingListener>& listener : inOrder)
            total += listener->mHeard;
        return total;
    }

    boost::shared_ptr<StubSession> session;
    boost::shared_ptr<QString> moniker;
    boost::shared_ptr<Zel_EventCB> hub;
    std::vector<boost::shared_ptr<CountingListener>> inOrder;
};

void check(bool condition, const char* what)
{
    if (!condition) {
        std::fprintf(stderr, "bench_event_hub: %s\n", what);
        std::exit(2);
    }
}

void registerDeliveryRows(int folderListeners)
{
    const std::string shape = std::to_string(folderListeners) + "+" + std::to_string(kEveryNodeListeners);
    const std::string feature = "hub/deliverNext/" + shape;
    const std::string floor = "hub/floor/" + shape;
    const double calls = folderListeners + kEveryNodeListeners;

    zelbench::row(feature, calls, [folderListeners](benchmark::State& state) {
        HubFixture fixture(folderListeners, true);
        const boost::shared_ptr<Zel_Event> event = boost::make_shared<Zel_EventChildAdded>(
            fixture.moniker, boost::make_shared<QString>(QStringLiteral("zel://server/clip/7")));
        const boost::shared_ptr<Zel_EventRes> result = boost::make_shared<Zel_EventRes>(fixture.hub, event);
        Orv_Result* res = result.get();
        benchmark::DoNotOptimize(res); // a call through Orv_Result*, as the engine makes it
        for (auto _ : state)
            res->deliverNext();
        check(fixture.heard() == static_cast<long>(state.iterations()) * (folderListeners + kEveryNodeListeners),
              "an event did not reach every listener");
    });
    zelbench::row(floor, calls, [folderListeners](benchmark::State& state) {
        HubFixture fixture(folderListeners, true);
        const boost::shared_ptr<Zel_Event> event = boost::make_shared<Zel_EventChildAdded>(
            fixture.moniker, boost::make_shared<QString>(QStringLiteral("zel://server/clip/7")));
        std::vector<CountingListener*> listeners;
        for (const boost::shared_ptr<CountingListener>& listener : fixture.inOrder)
            listeners.push_back(listener.get());
        benchmark::DoNotOptimize(listeners.data()); // keeps the handleEvent calls virtual
        for (auto _ : state) {
            for (CountingListener* listener : listeners)
                listener->handleEvent(event);
        }
        check(fixture.heard() == static_cast<long>(state.iterations()) * (folderListeners + kEveryNodeListeners),
              "an event did not reach every listener");
    });
    zelbench::compare(feature, floor, "floor");
}

// The keys of the fixture's table, for the plain QMap baselines.
QMap<QString, int> plainTable(bool everyNodeListeners)
{
    QMap<QString, int> table;
    for (int i = 0; i < kOtherFolders; ++i)
        table.insert(*otherMoniker(i), 1);
    table.insert(*folderMoniker(), 1);
    if (everyNodeListeners)
        table.insert(QString(), kEveryNodeListeners);
    return table;
}

void registerQueryRows(const char* name, bool askForFolder, bool everyNodeListeners, bool expected)
{
    const std::string feature = std::string("hub/hasRegisteredListener/") + name;
    const std::string floor = std::string("hub/QMap-lookups/") + name;
    const std::string peer = std::string("hub/locked-QMap-lookups/") + name;
    auto asked = [askForFolder]() { return askForFolder ? folderMoniker() : otherMoniker(kOtherFolders + 7); };

    zelbench::row(feature, 1, [=](benchmark::State& state) {
        HubFixture fixture(1, everyNodeListeners);
        const boost::shared_ptr<QString> moniker = asked();
        Zel_EventCB* hub = fixture.hub.get();
        check(hub->hasRegisteredListener(moniker) == expected, "hasRegisteredListener gave the wrong answer");
        for (auto _ : state) {
            bool answer = hub->hasRegisteredListener(moniker);
            benchmark::DoNotOptimize(answer);
        }
    });
    zelbench::row(floor, 1, [=](benchmark::State& state) {
        const QMap<QString, int> table = plainTable(everyNodeListeners);
        const boost::shared_ptr<QString> moniker = asked();
        check((table.contains(*moniker) || table.contains(QString())) == expected, "the floor gave the wrong answer");
        for (auto _ : state) {
            bool answer = table.contains(*moniker) || table.contains(QString());
            benchmark::DoNotOptimize(answer);
        }
    });
    zelbench::row(peer, 1, [=](benchmark::State& state) {
        const QMap<QString, int> table = plainTable(everyNodeListeners);
        const boost::shared_ptr<QString> moniker = asked();
        std::recursive_mutex mutex;
        for (auto _ : state) {
            std::lock_guard<std::recursive_mutex> lock(mutex);
            bool answer = table.contains(*moniker) || table.contains(QString());
            benchmark::DoNotOptimize(answer);
        }
    });
    zelbench::compare(feature, floor, "floor");
    zelbench::compare(feature, peer, "peer");
}

} // namespace

int main(int argc, char** argv)
{
    for (int listeners : {1, 10, 100})
        registerDeliveryRows(listeners);
    registerQueryRows("filed", true, true, true);
    registerQueryRows("unfiled", false, true, true);
    registerQueryRows("none", false, false, false);
    return zelbench::runMain(argc, argv, "event hub");
}
