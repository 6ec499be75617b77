// Several threads register and unregister listeners while the engine delivers
// events on another thread. Run under ThreadSanitizer as well.
#include "EventTestSupport.h"
#include "Orv_Engine.h"
#include "Orv_ResultQ.h"
#include "StubSession.h"
#include "Zel_IEventListenerFolder.h"
#include "Zel_NodeListener.h"

#include <gtest/gtest.h>

#include <atomic>
#include <chrono>
#include <thread>
#include <vector>

namespace {

// Counts a call that arrives after its Unregister has returned.
struct GuardedListener : Zel_EventListener {
    GuardedListener(boost::shared_ptr<QString> key, std::atomic<int>* lateCalls, std::atomic<long>* calls)
        : Zel_EventListener(key, 7, boost::shared_ptr<Zel_Session>()), mLateCalls(lateCalls), mCalls(calls)
    {
    }
    void handleEvent(boost::shared_ptr<Zel_Event> event) override
    {
        if (!isEnabled(event))
            return;
        // A call still running when Unregister returns counts as late too.
        std::this_thread::yield();
        if (unregistered.load())
            ++*mLateCalls;
        ++*mCalls;
    }
    const unsigned long getValidEventMask() const override { return 7; }
    std::atomic<bool> unregistered{false};
    std::atomic<int>* mLateCalls;
    std::atomic<long>* mCalls;
};

struct CountingFolder : Zel_IEventListenerFolder {
    CountingFolder(boost::shared_ptr<QString> key, boost::shared_ptr<Zel_Session> session, std::atomic<long>* calls)
        : Zel_IEventListenerFolder(key, 7, boost::shared_ptr<Zel_Session>()), mCalls(calls)
    {
        // Registered once the object is complete, as the facade's notes advise.
        registerEventListener(session);
    }
    ~CountingFolder() override { unregisterEventListener(); }
    void childAdded(boost::shared_ptr<QString>, boost::shared_ptr<QString>) override { ++*mCalls; }
    void childRemoved(boost::shared_ptr<QString>, boost::shared_ptr<QString>) override { ++*mCalls; }
    std::atomic<long>* mCalls;
};

} // namespace

constexpr long kMinimumCalls = 2000;

TEST(Zel_EventCBThreadTest, RegistrationsRaceDeliveryWithoutLateCallsOrDeadlock)
{
    boost::shared_ptr<StubSession> session(new StubSession);
    Orv_Engine engine(1);
    Zel_NodeListener nodes(session->getEventCBSP(), engine.getResultQ());
    const QStringList folders = {"/a", "/b", "/c"};

    std::atomic<int> lateCalls{0};
    std::atomic<long> calls{0};
    std::atomic<long> folderCalls{0};
    std::atomic<bool> stop{false};
    std::atomic<int> registrations{0};

    // A permanent listener for every node keeps events flowing.
    boost::shared_ptr<GuardedListener> everyNode(new GuardedListener(moniker(""), &lateCalls, &calls));
    session->RegisterListener(everyNode);

    std::vector<std::thread> threads;
    // The backend reports changes.
    threads.emplace_back([&] {
        int i = 0;
        while (!stop.load()) {
            if (engine.getResultQ()->Size() > 256) { // let delivery catch up
                std::this_thread::yield();
                continue;
            }
            const boost::shared_ptr<QString> parent(new QString(folders.at(i % folders.size())));
            if (i % 2)
                nodes.NodeAdded(parent, moniker("child"));
            else
                nodes.NodeRemoved(parent, moniker("child"));
            ++i;
            if (i % 64 == 0)
                std::this_thread::yield();
        }
    });
    // The application delivers.
    threads.emplace_back([&] {
        while (!stop.load()) {
            engine.WaitForResults(std::chrono::milliseconds(5));
            engine.DeliverPending();
        }
        engine.DeliverPending();
    });
    // Application threads register and unregister, at least 150 times each
    // and until a good number of events has been delivered meanwhile.
    const auto deadline = std::chrono::steady_clock::now() + std::chrono::seconds(60);
    const auto enough = [&](int round) {
        return round >= 150 && (calls.load() >= kMinimumCalls || std::chrono::steady_clock::now() > deadline);
    };
    for (int t = 0; t < 3; ++t) {
        threads.emplace_back([&, t] {
            for (int round = 0; !enough(round); ++round) {
                const boost::shared_ptr<QString> key(new QString(folders.at((t + round) % folders.size())));
                boost::shared_ptr<GuardedListener> listener(new GuardedListener(key, &lateCalls, &calls));
                session->RegisterListener(listener);
                ++registrations;
                std::this_thread::yield();
                session->UnregisterListener(listener);
                listener->unregistered.store(true);
                // Once Unregister has returned, no delivery may reach it.
                std::this_thread::yield();
            }
        });
    }
    // A thread that creates and destroys folder facades.
    threads.emplace_back([&] {
        for (int round = 0; !enough(round); ++round) {
            CountingFolder folder(moniker("/b"), session, &folderCalls);
            std::this_thread::yield();
        }
    });

    for (std::size_t i = 2; i < threads.size(); ++i)
        threads[i].join();
    stop.store(true);
    threads[0].join();
    threads[1].join();
    engine.DeliverAll();

    EXPECT_EQ(lateCalls.load(), 0);
    EXPECT_GE(registrations.load(), 450);
    EXPECT_GE(calls.load(), kMinimumCalls);
    // Only the permanent listener remains.
    EXPECT_EQ(everyNode.use_count(), 2);
    session.reset();
    EXPECT_EQ(everyNode.use_count(), 1);
}

TEST(Zel_EventCBThreadTest, ListenersRegisteringFromTheirOwnCallsOnTheDeliveringThreadDoNotDeadlock)
{
    boost::shared_ptr<StubSession> session(new StubSession);
    Orv_Engine engine(1);
    Zel_NodeListener nodes(session->getEventCBSP(), engine.getResultQ());
    EventLog log;
    boost::shared_ptr<RecordingListener> churn(new RecordingListener(&log, QStringLiteral("churn"), moniker("/a"), 7, session));
    boost::weak_ptr<StubSession> weakSession = session;
    churn->onEvent = [weakSession, &log](RecordingListener& self) {
        if (boost::shared_ptr<StubSession> s = weakSession.lock()) {
            boost::shared_ptr<RecordingListener> extra(new RecordingListener(&log, QStringLiteral("extra"), moniker("/a")));
            s->RegisterListener(extra);
            s->UnregisterListener(extra);
            s->UnregisterListener(self.shared_from_this());
            s->RegisterListener(self.shared_from_this());
        }
    };
    session->RegisterListener(churn);

    std::atomic<bool> done{false};
    std::thread reporter([&] {
        for (int i = 0; i < 200; ++i)
            nodes.NodeAdded(moniker("/a"), moniker("c"));
        done.store(true);
    });
    std::thread registrar([&] {
        while (!done.load()) {
            boost::shared_ptr<RecordingListener> other(new RecordingListener(nullptr, QStringLiteral("o"), moniker("/a")));
            session->RegisterListener(other);
            session->UnregisterListener(other);
        }
    });
    while (!done.load() || engine.getResultQ()->Size() > 0)
        engine.DeliverPending();
    reporter.join();
    registrar.join();

    const QStringList lines = log.lines();
    EXPECT_EQ(lines.size(), 200);
    EXPECT_EQ(lines.filter(QStringLiteral("churn:")).size(), lines.size()) << "only churn hears";
}
