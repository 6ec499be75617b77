// Folder facades destroyed on one thread while another delivers events to
// them. Run under AddressSanitizer and ThreadSanitizer as well.
#include "EventTestSupport.h"
#include "StubSession.h"
#include "Zel_IEventListenerFolder.h"

#include <gtest/gtest.h>

#include <atomic>
#include <thread>

namespace {

// Counts its notifications; a notification that is still running or reaches
// it once its destruction has begun counts as late (and touches freed memory
// once the destructor has returned, which AddressSanitizer reports).
class GuardedFolder : public Zel_IEventListenerFolder
{
public:
    GuardedFolder(boost::shared_ptr<QString> key, std::atomic<long>* calls, std::atomic<long>* lateCalls)
        : Zel_IEventListenerFolder(std::move(key), 7, boost::shared_ptr<Zel_Session>())
        , mCalls(calls)
        , mLateCalls(lateCalls)
    {
    }
    // As the facade's notes advise: unregister first thing.
    ~GuardedFolder() override
    {
        unregisterEventListener();
        mDying.store(true);
    }

    void childAdded(boost::shared_ptr<QString>, boost::shared_ptr<QString>) override
    {
        ++mOwnCalls;
        // Gives a destruction on another thread the chance to run meanwhile;
        // it must wait for this call to end.
        std::this_thread::yield();
        if (mDying.load())
            ++*mLateCalls;
        ++*mCalls;
    }

    std::atomic<long> mOwnCalls{0};

private:
    std::atomic<bool> mDying{false};
    std::atomic<long>* mCalls;
    std::atomic<long>* mLateCalls;
};

} // namespace

TEST(Zel_IEventListenerFolderThreadTest, FacadesDestroyedDuringDeliveryAreNeverCalledAfterwardsAndLeaveTheHub)
{
    // The facades register through session copies that die at once, so only
    // the facade itself can take its listener out of the shared hub.
    boost::shared_ptr<StubSession> session(new StubSession);
    const boost::shared_ptr<Zel_EventCB> hub = session->getEventCBSP();
    const boost::shared_ptr<QString> key = moniker("/f");
    std::atomic<long> calls{0};
    std::atomic<long> lateCalls{0};
    std::atomic<bool> done{false};
    std::atomic<long> deliveries{0};

    std::thread deliverer([&] {
        const boost::shared_ptr<Zel_Event> event = addedEvent("/f", "c");
        while (!done.load()) {
            deliver(hub, event);
            ++deliveries;
        }
    });

    constexpr int kRounds = 400;
    int roundsWithACall = 0;
    for (int round = 0; round < kRounds; ++round) {
        boost::shared_ptr<StubSession> copy(new StubSession(*session));
        GuardedFolder* folder = new GuardedFolder(key, &calls, &lateCalls);
        folder->registerEventListener(copy);
        copy.reset();
        // Let deliveries reach it (bounded), then destroy it while they go on.
        for (int spin = 0; spin < 10000 && folder->mOwnCalls.load() == 0; ++spin)
            std::this_thread::yield();
        if (folder->mOwnCalls.load() > 0)
            ++roundsWithACall;
        if (round % 2)
            folder->unregisterEventListener();
        delete folder;
    }
    done.store(true);
    deliverer.join();

    EXPECT_EQ(lateCalls.load(), 0);
    EXPECT_GT(roundsWithACall, 0);
    EXPECT_GT(deliveries.load(), 0);
    // Every internal listener has left the hub and is gone.
    EXPECT_EQ(key.use_count(), 1);
}
