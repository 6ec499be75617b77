#include "EventTestSupport.h"
#include "StubSession.h"
#include "VtableSlot.h"

#include <gtest/gtest.h>

#include <stdexcept>

namespace {

class Zel_EventCBTest : public ::testing::Test
{
protected:
    boost::shared_ptr<RecordingListener> listener(const QString& name, boost::shared_ptr<QString> key,
                                                  unsigned long mask = 7)
    {
        return boost::shared_ptr<RecordingListener>(new RecordingListener(&log, name, key, mask, session));
    }
    QStringList names() const
    {
        QStringList result;
        for (const QString& line : log.lines())
            result << line.section(QLatin1Char(':'), 0, 0);
        return result;
    }

    boost::shared_ptr<StubSession> session{new StubSession};
    boost::shared_ptr<Zel_EventCB> hub = session->getEventCBSP();
    EventLog log;
};

} // namespace

TEST_F(Zel_EventCBTest, DeliversToMonikerListenersInRegistrationOrderThenToEveryNodeListeners)
{
    const boost::shared_ptr<RecordingListener> all1 = listener(QStringLiteral("all1"), boost::shared_ptr<QString>());
    const boost::shared_ptr<RecordingListener> a1 = listener(QStringLiteral("a1"), moniker("A"));
    const boost::shared_ptr<RecordingListener> b1 = listener(QStringLiteral("b1"), moniker("B"));
    const boost::shared_ptr<RecordingListener> all2 = listener(QStringLiteral("all2"), moniker(""));
    const boost::shared_ptr<RecordingListener> a2 = listener(QStringLiteral("a2"), moniker("A"));
    const boost::shared_ptr<RecordingListener> lowerA = listener(QStringLiteral("lower"), moniker("a"));
    for (const auto& l : {all1, a1, b1, all2, a2, lowerA})
        session->RegisterListener(l);

    EXPECT_FALSE(deliver(hub, addedEvent("A", "child")));
    EXPECT_EQ(names(), QStringList({"a1", "a2", "all1", "all2"}));
    EXPECT_EQ(log.lines().first(), QStringLiteral("a1:Zel_EventChildAdded parent: A child: child"));

    // Keys match exactly: "a" is not "A"; an unknown moniker reaches only "".
    log.clear();
    deliver(hub, addedEvent("Z", "child"));
    EXPECT_EQ(names(), QStringList({"all1", "all2"}));
}

TEST_F(Zel_EventCBTest, NullAndEmptyEventMonikersReachEveryNodeListenersOnce)
{
    session->RegisterListener(listener(QStringLiteral("all"), boost::shared_ptr<QString>()));
    session->RegisterListener(listener(QStringLiteral("a"), moniker("A")));

    deliver(hub, addedEvent(nullptr, "c"));
    EXPECT_EQ(names(), QStringList({"all"}));
    log.clear();
    deliver(hub, addedEvent("", "c"));
    EXPECT_EQ(names(), QStringList({"all"}));
}

TEST_F(Zel_EventCBTest, RegistrationIsByIdentityAndKeysStayAfterTheirLastListenerLeaves)
{
    const boost::shared_ptr<RecordingListener> a = listener(QStringLiteral("a"), moniker("A"));
    // Same moniker text, another object: a second entry.
    const boost::shared_ptr<RecordingListener> twin = listener(QStringLiteral("twin"), moniker("A"));

    EXPECT_FALSE(hub->hasRegisteredListener(moniker("A")));
    session->RegisterListener(a);
    session->RegisterListener(a);
    session->RegisterListener(twin);
    deliver(hub, addedEvent("A", "c"));
    EXPECT_EQ(names(), QStringList({"a", "twin"}));

    // One unregistration removes the listener however often it was registered.
    session->UnregisterListener(a);
    log.clear();
    deliver(hub, addedEvent("A", "c"));
    EXPECT_EQ(names(), QStringList({"twin"}));

    session->UnregisterListener(twin);
    log.clear();
    deliver(hub, addedEvent("A", "c"));
    EXPECT_TRUE(log.lines().isEmpty());
    EXPECT_TRUE(hub->hasRegisteredListener(moniker("A")));    // the key stays
    EXPECT_FALSE(hub->hasRegisteredListener(moniker("a")));

    // Unregistering a never-registered listener creates no key.
    session->UnregisterListener(listener(QStringLiteral("never"), moniker("N")));
    EXPECT_FALSE(hub->hasRegisteredListener(moniker("N")));
    EXPECT_FALSE(hub->hasRegisteredListener(boost::shared_ptr<QString>()));

    // A listener under "" makes every moniker interesting.
    session->RegisterListener(listener(QStringLiteral("all"), moniker("")));
    EXPECT_TRUE(hub->hasRegisteredListener(moniker("N")));
    EXPECT_TRUE(hub->hasRegisteredListener(boost::shared_ptr<QString>()));
}

TEST_F(Zel_EventCBTest, NullListenerAndNullEventAreIgnored)
{
    session->RegisterListener(boost::shared_ptr<Zel_EventListener>());
    EXPECT_FALSE(hub->hasRegisteredListener(moniker("")));
    session->UnregisterListener(boost::shared_ptr<Zel_EventListener>());
    session->RegisterListener(listener(QStringLiteral("all"), boost::shared_ptr<QString>()));
    EXPECT_FALSE(deliver(hub, boost::shared_ptr<Zel_Event>()));
    EXPECT_TRUE(log.lines().isEmpty());

    Zel_EventRes noHub(boost::shared_ptr<Zel_EventCB>(), addedEvent("A", "c"));
    EXPECT_FALSE(noHub.deliverNext());
    EXPECT_TRUE(log.lines().isEmpty());
}

TEST_F(Zel_EventCBTest, DisabledTypesAreStillDeliveredTheListenerDecides)
{
    const boost::shared_ptr<RecordingListener> a = listener(QStringLiteral("a"), moniker("A"), 2);
    session->RegisterListener(a);
    deliver(hub, addedEvent("A", "c"));
    EXPECT_EQ(log.lines(), QStringList() << QStringLiteral("a(off):Zel_EventChildAdded parent: A child: c"));
}

TEST_F(Zel_EventCBTest, AThrowingListenerDoesNotStopDeliveryToTheOthers)
{
    const boost::shared_ptr<RecordingListener> a1 = listener(QStringLiteral("a1"), moniker("A"));
    const boost::shared_ptr<RecordingListener> thrower = listener(QStringLiteral("thrower"), moniker("A"));
    const boost::shared_ptr<RecordingListener> a2 = listener(QStringLiteral("a2"), moniker("A"));
    const boost::shared_ptr<RecordingListener> allThrower = listener(QStringLiteral("allThrower"), moniker(""));
    const boost::shared_ptr<RecordingListener> all = listener(QStringLiteral("all"), moniker(""));
    thrower->onEvent = [](RecordingListener&) { throw std::runtime_error("listener failed"); };
    allThrower->onEvent = [](RecordingListener&) { throw 42; };
    for (const auto& l : {a1, thrower, a2, allThrower, all})
        session->RegisterListener(l);

    EXPECT_FALSE(deliver(hub, addedEvent("A", "c")));
    EXPECT_EQ(names(), QStringList({"a1", "a2", "all"}));

    // The hub is not left locked or damaged: the next event goes through.
    log.clear();
    deliver(hub, addedEvent("A", "d"));
    EXPECT_EQ(names(), QStringList({"a1", "a2", "all"}));
}

TEST_F(Zel_EventCBTest, ListenersMayChangeRegistrationsDuringDeliveryWithoutDisturbingIt)
{
    const boost::shared_ptr<RecordingListener> a1 = listener(QStringLiteral("a1"), moniker("A"));
    const boost::shared_ptr<RecordingListener> a2 = listener(QStringLiteral("a2"), moniker("A"));
    const boost::shared_ptr<RecordingListener> a3 = listener(QStringLiteral("a3"), moniker("A"));
    const boost::shared_ptr<RecordingListener> all = listener(QStringLiteral("all"), moniker(""));
    const boost::shared_ptr<RecordingListener> late = listener(QStringLiteral("late"), moniker("A"));
    const boost::shared_ptr<RecordingListener> lateAll = listener(QStringLiteral("lateAll"), moniker(""));
    boost::shared_ptr<StubSession> s = session;
    // a1 unregisters itself and a3 (later in the same list), and registers two
    // newcomers; a2 is untouched and must still be called, a3 must not.
    a1->onEvent = [s, a3, late, lateAll](RecordingListener& self) {
        s->UnregisterListener(self.shared_from_this());
        s->UnregisterListener(a3);
        s->RegisterListener(late);
        s->RegisterListener(lateAll);
    };
    for (const auto& l : {a1, a2, a3, all})
        session->RegisterListener(l);

    deliver(hub, addedEvent("A", "c"));
    EXPECT_EQ(names(), QStringList({"a1", "a2", "all"}));

    // The changes hold for the next event.
    log.clear();
    deliver(hub, addedEvent("A", "c"));
    EXPECT_EQ(names(), QStringList({"a2", "late", "all", "lateAll"}));
}

TEST_F(Zel_EventCBTest, AListenerDroppingItsLastReferenceDuringItsCallIsKeptAliveUntilTheCallEnds)
{
    bool destroyed = false;
    bool destroyedDuringCall = true;
    boost::shared_ptr<StubSession> s = session;
    {
        boost::shared_ptr<RecordingListener> self = listener(QStringLiteral("self"), moniker("A"));
        self->onDestroy = [&destroyed] { destroyed = true; };
        self->onEvent = [s, &destroyed, &destroyedDuringCall](RecordingListener& me) {
            s->UnregisterListener(me.shared_from_this());
            destroyedDuringCall = destroyed;
        };
        session->RegisterListener(self);
    }
    EXPECT_FALSE(destroyed); // the hub holds it
    deliver(hub, addedEvent("A", "c"));
    EXPECT_FALSE(destroyedDuringCall);
    EXPECT_TRUE(destroyed);
    EXPECT_EQ(names(), QStringList({"self"}));
}

TEST_F(Zel_EventCBTest, ListenerDestructorsRunByTheHubsEmptyingMayCallBackIntoIt)
{
    Zel_Session* raw = session.get();
    const boost::shared_ptr<RecordingListener> other = listener(QStringLiteral("other"), moniker("A"));
    bool destructorRan = false;
    {
        boost::shared_ptr<RecordingListener> reentrant = listener(QStringLiteral("re"), moniker("A"));
        boost::shared_ptr<RecordingListener> keepOther = other;
        reentrant->onDestroy = [raw, keepOther, &destructorRan] {
            raw->UnregisterListener(keepOther);
            raw->RegisterListener(keepOther);
            raw->UnregisterListener(keepOther);
            destructorRan = true;
        };
        session->RegisterListener(reentrant);
        session->RegisterListener(other);
    }
    session.reset(); // last session: the hub is emptied, the listener destroyed under its lock
    EXPECT_TRUE(destructorRan);
    EXPECT_EQ(other.use_count(), 1);
    deliver(hub, addedEvent("A", "c"));
    EXPECT_TRUE(log.lines().isEmpty());
}

TEST_F(Zel_EventCBTest, HubOutlivesItsSessionThroughAnEventResultButHoldsNoListener)
{
    const boost::shared_ptr<RecordingListener> a = listener(QStringLiteral("a"), moniker("A"));
    session->RegisterListener(a);
    EXPECT_EQ(a.use_count(), 2);
    boost::shared_ptr<Zel_EventRes> pending(new Zel_EventRes(hub, addedEvent("A", "c")));
    const boost::weak_ptr<Zel_EventCB> watch = hub;
    hub.reset();

    session.reset();
    EXPECT_FALSE(watch.expired());        // the result holds the hub
    EXPECT_EQ(a.use_count(), 1);          // but the hub no longer holds the listener
    EXPECT_FALSE(pending->deliverNext());
    EXPECT_TRUE(log.lines().isEmpty());
    EXPECT_FALSE(watch.lock()->hasRegisteredListener(moniker("A")));

    pending.reset();
    EXPECT_TRUE(watch.expired());
}

TEST_F(Zel_EventCBTest, EventResultNamesTheHubAsItsCallback)
{
    Zel_EventRes result(hub, addedEvent("A", "c"));
    EXPECT_EQ(result.getCallback().get(), static_cast<Orv_ResultsCB*>(hub.get()));
    EXPECT_FALSE(result.isFinalResult());
    EXPECT_EQ(hub->getCallbackID().getValue(), -2);
    EXPECT_FALSE(hub->isFinished());

    session->RegisterListener(listener(QStringLiteral("a"), moniker("A")));
    Zel_EventRes copy(result);
    EXPECT_FALSE(copy.deliverNext());
    EXPECT_FALSE(result.deliverNext());
    EXPECT_EQ(names(), QStringList({"a", "a"}));
}

TEST(Zel_EventCBSlotTest, HubAndEventResultKeepTheEngineSlots)
{
    EXPECT_EQ(vtableSlot(&Zel_EventCB::cancelRequest), 2);
    EXPECT_EQ(vtableSlot(&Zel_EventCB::isFinished), 3);
    EXPECT_EQ(vtableSlot(&Zel_EventRes::getRequestID), 2);
    EXPECT_EQ(vtableSlot(&Zel_EventRes::isFinalResult), 3);
    EXPECT_EQ(vtableSlot(&Zel_EventRes::deliverNext), 4);
    EXPECT_FALSE(std::is_copy_constructible<Zel_EventCB>::value);
}
