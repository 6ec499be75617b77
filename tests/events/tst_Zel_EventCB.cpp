#include "EventTestSupport.h"
#include "StubSession.h"
#include "VtableSlot.h"

#include <gtest/gtest.h>

#include <stdexcept>
#include <vector>

namespace {

class Zel_EventCBTest : public ::testing::Test
{
protected:
    // A listener under the key (nullptr: an empty key pointer).
    boost::shared_ptr<RecordingListener> listener(const char* name, const char* key, unsigned long mask = 7)
    {
        return boost::shared_ptr<RecordingListener>(new RecordingListener(
            &log, QString::fromLatin1(name), key ? moniker(key) : boost::shared_ptr<QString>(), mask, session));
    }
    // Makes and registers listeners; the names are also their keys' labels.
    using Rows = std::initializer_list<std::pair<const char*, const char*>>;
    std::vector<boost::shared_ptr<RecordingListener>> registered(Rows rows)
    {
        std::vector<boost::shared_ptr<RecordingListener>> made;
        for (const auto& row : rows) {
            made.push_back(listener(row.first, row.second));
            session->RegisterListener(made.back());
        }
        return made;
    }
    // The listeners reached since the last call, in order.
    QStringList names()
    {
        QStringList result;
        for (const QString& line : log.lines())
            result << line.section(QLatin1Char(':'), 0, 0);
        log.clear();
        return result;
    }

    boost::shared_ptr<StubSession> session{new StubSession};
    boost::shared_ptr<Zel_EventCB> hub = session->getEventCBSP();
    EventLog log;
};

} // namespace

TEST_F(Zel_EventCBTest, DeliversToMonikerListenersInRegistrationOrderThenToEveryNodeListeners)
{
    registered({{"all1", nullptr}, {"a1", "A"}, {"b1", "B"}, {"all2", ""}, {"a2", "A"}, {"lower", "a"}});
    EXPECT_FALSE(deliver(hub, addedEvent("A", "child")));
    EXPECT_EQ(log.lines().first(), QStringLiteral("a1:Zel_EventChildAdded parent: A child: child"));
    EXPECT_EQ(names(), QStringList({"a1", "a2", "all1", "all2"}));

    // Keys match exactly: "a" is not "A"; an unknown, null or empty moniker
    // reaches only the every-node listeners, once.
    for (const char* parent : {"Z", (const char*)nullptr, ""}) {
        deliver(hub, addedEvent(parent, "child"));
        EXPECT_EQ(names(), QStringList({"all1", "all2"})) << (parent ? parent : "null");
    }
}

TEST_F(Zel_EventCBTest, RegistrationIsByIdentityAndKeysStayAfterTheirLastListenerLeaves)
{
    const auto a = listener("a", "A");
    // Same moniker text, another object: a second entry.
    const auto twin = listener("twin", "A");

    EXPECT_FALSE(hub->hasRegisteredListener(moniker("A")));
    session->RegisterListener(a);
    session->RegisterListener(a);
    session->RegisterListener(twin);
    deliver(hub, addedEvent("A", "c"));
    EXPECT_EQ(names(), QStringList({"a", "twin"}));

    // One unregistration removes the listener however often it was registered.
    session->UnregisterListener(a);
    deliver(hub, addedEvent("A", "c"));
    EXPECT_EQ(names(), QStringList({"twin"}));

    session->UnregisterListener(twin);
    deliver(hub, addedEvent("A", "c"));
    EXPECT_TRUE(names().isEmpty());
    EXPECT_TRUE(hub->hasRegisteredListener(moniker("A")));    // the key stays
    EXPECT_FALSE(hub->hasRegisteredListener(moniker("a")));

    // Unregistering a never-registered listener creates no key.
    session->UnregisterListener(listener("never", "N"));
    EXPECT_FALSE(hub->hasRegisteredListener(moniker("N")));
    EXPECT_FALSE(hub->hasRegisteredListener(boost::shared_ptr<QString>()));

    // A listener under "" makes every moniker interesting.
    session->RegisterListener(listener("all", ""));
    EXPECT_TRUE(hub->hasRegisteredListener(moniker("N")));
    EXPECT_TRUE(hub->hasRegisteredListener(boost::shared_ptr<QString>()));
}

TEST_F(Zel_EventCBTest, NullListenerAndNullEventAreIgnoredAndDisabledTypesAreStillDelivered)
{
    session->RegisterListener(boost::shared_ptr<Zel_EventListener>());
    EXPECT_FALSE(hub->hasRegisteredListener(moniker("")));
    session->UnregisterListener(boost::shared_ptr<Zel_EventListener>());
    session->RegisterListener(listener("all", nullptr));
    EXPECT_FALSE(deliver(hub, boost::shared_ptr<Zel_Event>()));
    Zel_EventRes noHub(boost::shared_ptr<Zel_EventCB>(), addedEvent("A", "c"));
    EXPECT_FALSE(noHub.deliverNext());
    EXPECT_TRUE(log.lines().isEmpty());

    // The listener, not the hub, decides about the types it has disabled.
    session->RegisterListener(listener("a", "A", 2));
    deliver(hub, addedEvent("A", "c"));
    EXPECT_EQ(log.lines(), QStringList({"a(off):Zel_EventChildAdded parent: A child: c",
                                        "all:Zel_EventChildAdded parent: A child: c"}));
}

TEST_F(Zel_EventCBTest, ManyFoldersEachHearOnlyTheirOwnEventsAndKeysDifferingInCaseStayApart)
{
    // Enough keys for the table to grow several times while listeners are filed.
    std::vector<boost::shared_ptr<RecordingListener>> made;
    for (int i = 0; i < 3000; ++i) {
        const QByteArray key = QStringLiteral("/Show/Bin %1").arg(i).toLatin1();
        made.push_back(listener(QByteArray("f" + QByteArray::number(i)).constData(), key.constData()));
        session->RegisterListener(made.back());
        if (i % 1000 == 7) {
            made.push_back(listener(QByteArray("lower" + QByteArray::number(i)).constData(),
                                    key.toLower().constData()));
            session->RegisterListener(made.back());
        }
    }
    for (int i : {0, 7, 1007, 2999}) {
        const QByteArray key = QStringLiteral("/Show/Bin %1").arg(i).toLatin1();
        deliver(hub, addedEvent(key.constData(), "c"));
        EXPECT_EQ(names(), QStringList({QStringLiteral("f%1").arg(i)}));
        deliver(hub, addedEvent(key.toLower().constData(), "c"));
        EXPECT_EQ(names(), i % 1000 == 7 ? QStringList({QStringLiteral("lower%1").arg(i)}) : QStringList());
    }
    deliver(hub, addedEvent("/Show/Bin 3000", "c"));
    EXPECT_TRUE(names().isEmpty());

    // Unregistering and registering again among them changes only that key.
    session->UnregisterListener(made[1]);
    session->RegisterListener(listener("again", "/Show/Bin 1"));
    deliver(hub, addedEvent("/Show/Bin 1", "c"));
    deliver(hub, addedEvent("/Show/Bin 2", "c"));
    EXPECT_EQ(names(), QStringList({"again", "f2"}));
}

TEST_F(Zel_EventCBTest, AThrowingListenerDoesNotStopDeliveryToTheOthers)
{
    const auto made = registered({{"a1", "A"}, {"thrower", "A"}, {"a2", "A"}, {"allThrower", ""}, {"all", ""}});
    made[1]->onEvent = [](RecordingListener&) { throw std::runtime_error("listener failed"); };
    made[3]->onEvent = [](RecordingListener&) { throw 42; };
    EXPECT_FALSE(deliver(hub, addedEvent("A", "c")));
    EXPECT_EQ(names(), QStringList({"a1", "a2", "all"}));

    // The hub is not left locked or damaged: the next event goes through.
    deliver(hub, addedEvent("A", "d"));
    EXPECT_EQ(names(), QStringList({"a1", "a2", "all"}));
}

namespace {

// Ends its thread inside its call, by pthread_exit(42) or by cancellation,
// until told to count calls instead. Its call keeps nothing on the stack:
// GCC 12's AddressSanitizer misreports the rethrow of a forced unwind that
// has left the stack redzones of unwound frames poisoned (a false positive
// in its sigaltstack interceptor).
struct EndingListener : Zel_EventListener {
    EndingListener() : Zel_EventListener(moniker("A"), 7, boost::shared_ptr<Zel_Session>()) {}
    void handleEvent(boost::shared_ptr<Zel_Event>) override
    {
        if (mode == Exit)
            pthread_exit(reinterpret_cast<void*>(42));
        if (mode == Cancel) {
            pthread_cancel(pthread_self());
            pthread_testcancel();
        }
        ++calls;
    }
    const unsigned long getValidEventMask() const override { return 7; }
    enum { Exit, Cancel, Count } mode = Exit;
    int calls = 0;
};

} // namespace

TEST_F(Zel_EventCBTest, AThreadEndedInsideAListenerUnwindsThroughDeliveryAndLeavesTheHubUsable)
{
    // pthread_exit and cancellation unwind the thread with an exception that
    // must not be swallowed (glibc aborts the process if it is).
    const boost::shared_ptr<EndingListener> ender(new EndingListener);
    session->RegisterListener(ender);
    const auto made = registered({{"after", "A"}, {"all", ""}});
    void* const delivered = reinterpret_cast<void*>(1);
    EXPECT_EQ(runOnPosixThread([&] { deliver(hub, addedEvent("A", "c")); return delivered; }), reinterpret_cast<void*>(42));
    ender->mode = EndingListener::Cancel;
    EXPECT_EQ(runOnPosixThread([&] { deliver(hub, addedEvent("A", "c")); return delivered; }), PTHREAD_CANCELED);
    EXPECT_EQ(names(), QStringList()) << "the delivery ended with its thread";

    // The unwinding released the hub's lock: this thread delivers and registers.
    ender->mode = EndingListener::Count;
    session->UnregisterListener(made[0]);
    deliver(hub, addedEvent("A", "d"));
    EXPECT_EQ(ender->calls, 1);
    EXPECT_EQ(names(), QStringList({"all"}));
}

TEST_F(Zel_EventCBTest, ListenersMayChangeRegistrationsDuringDeliveryWithoutDisturbingIt)
{
    const auto late = listener("late", "A");
    const auto lateAll = listener("lateAll", "");
    const auto made = registered({{"a1", "A"}, {"a2", "A"}, {"a3", "A"}, {"all", ""}});
    boost::shared_ptr<StubSession> s = session;
    // a1 unregisters itself and a3 (later in the same list), and registers two
    // newcomers; a2 is untouched and must still be called, a3 must not.
    made[0]->onEvent = [s, a3 = made[2], late, lateAll](RecordingListener& self) {
        s->UnregisterListener(self.shared_from_this());
        s->UnregisterListener(a3);
        s->RegisterListener(late);
        s->RegisterListener(lateAll);
    };
    deliver(hub, addedEvent("A", "c"));
    EXPECT_EQ(names(), QStringList({"a1", "a2", "all"}));

    // The changes hold for the next event.
    deliver(hub, addedEvent("A", "c"));
    EXPECT_EQ(names(), QStringList({"a2", "late", "all", "lateAll"}));
}

TEST_F(Zel_EventCBTest, AListenerDroppingItsLastReferenceDuringItsCallIsKeptAliveUntilTheCallEnds)
{
    bool destroyed = false;
    bool destroyedDuringCall = true;
    boost::shared_ptr<StubSession> s = session;
    {
        boost::shared_ptr<RecordingListener> self = listener("self", "A");
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
    const auto other = listener("other", "A");
    bool destructorRan = false;
    {
        boost::shared_ptr<RecordingListener> reentrant = listener("re", "A");
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
    const auto a = listener("a", "A");
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

TEST_F(Zel_EventCBTest, EventResultNamesTheHubAsItsCallbackAndBothKeepTheEngineSlots)
{
    Zel_EventRes result(hub, addedEvent("A", "c"));
    EXPECT_EQ(result.getCallback().get(), static_cast<Orv_ResultsCB*>(hub.get()));
    EXPECT_FALSE(result.isFinalResult());
    EXPECT_EQ(hub->getCallbackID().getValue(), -2);
    EXPECT_FALSE(hub->isFinished());

    session->RegisterListener(listener("a", "A"));
    Zel_EventRes copy(result);
    EXPECT_FALSE(copy.deliverNext());
    EXPECT_FALSE(result.deliverNext());
    EXPECT_EQ(names(), QStringList({"a", "a"}));

    EXPECT_EQ(slotsOutOfOrder(2, {ZEL_SLOT_ROW(Zel_EventCB, cancelRequest), ZEL_SLOT_ROW(Zel_EventCB, isFinished)}), "");
    EXPECT_EQ(slotsOutOfOrder(2, {ZEL_SLOT_ROW(Zel_EventRes, getRequestID), ZEL_SLOT_ROW(Zel_EventRes, isFinalResult),
                                  ZEL_SLOT_ROW(Zel_EventRes, deliverNext)}),
              "");
    EXPECT_FALSE(std::is_copy_constructible<Zel_EventCB>::value);
}
