#include "EventTestSupport.h"
#include "StubSession.h"
#include "VtableSlot.h"

#include <gtest/gtest.h>

#include <type_traits>

namespace {

// Exposes the protected and private slots for slot pinning; adds one virtual
// after the base's six so that its position shows how many the base has.
struct SlotProbe : Zel_EventListener {
    SlotProbe() : Zel_EventListener(boost::shared_ptr<QString>(), 0, boost::shared_ptr<Zel_Session>()) {}
    void handleEvent(boost::shared_ptr<Zel_Event>) override {}
    boost::shared_ptr<QString> getMoniker() override { return Zel_EventListener::getMoniker(); }
    bool isEnabled(boost::shared_ptr<Zel_Event> event) const override { return Zel_EventListener::isEnabled(event); }
    const unsigned long getValidEventMask() const override { return 7; }
    const unsigned long getEnabledEventMask() const override { return 0; }
    virtual void firstNewSlot() {}
};

// A listener whose kind accepts only child-removed events.
struct RemovedOnlyListener : RecordingListener {
    RemovedOnlyListener() : RecordingListener(nullptr, QStringLiteral("r"), boost::shared_ptr<QString>(), 0) {}
    const unsigned long getValidEventMask() const override { return 2; }
};

} // namespace

TEST(Zel_EventListenerTest, EnableIgnoresTypesOutsideValidMaskOneSharedBitSetsEveryBitAndIsEnabledNeedsASharedBit)
{
    RecordingListener listener(nullptr, QStringLiteral("l"), moniker("m"), 0);
    EXPECT_EQ(listener.enableEvent(8), 0ul);      // no bit shared with 7
    EXPECT_EQ(listener.enableEvent(2), 2ul);
    EXPECT_EQ(listener.enableEvent(9), 11ul);     // 1 and 8, since 1 is valid
    EXPECT_EQ(listener.disableEvent(16), 11ul);   // invalid: unchanged
    EXPECT_EQ(listener.disableEvent(8), 11ul);    // invalid on its own: unchanged
    EXPECT_EQ(listener.disableEvent(10), 1ul);    // 2 is valid: clears 2 and 8
    EXPECT_EQ(listener += 4, 5ul);
    EXPECT_EQ(listener -= 1, 4ul);
    EXPECT_EQ(listener -= 64, 4ul);

    // The initial mask is stored as given, even bits the kind cannot accept.
    RecordingListener unchecked(nullptr, QStringLiteral("l"), moniker("m"), 8 | 2);
    EXPECT_EQ(unchecked.enableEvent(0), 10ul);
    RemovedOnlyListener removedOnly;
    EXPECT_EQ(removedOnly.enableEvent(1), 0ul);
    EXPECT_EQ(removedOnly.enableEvent(3), 3ul);

    // isEnabled needs an event sharing a bit with the enabled mask.
    RecordingListener listener2(nullptr, QStringLiteral("l"), moniker("m"), 0);
    const boost::shared_ptr<Zel_Event> added = addedEvent("m", "c");
    const boost::shared_ptr<Zel_Event> removed(new Zel_EventChildRemoved(moniker("m"), moniker("c")));
    EXPECT_FALSE(listener2.isEnabled(boost::shared_ptr<Zel_Event>()) || listener2.isEnabled(added));
    listener2.enableEvent(2);
    EXPECT_FALSE(listener2.isEnabled(added));
    EXPECT_TRUE(listener2.isEnabled(removed));
    listener2.enableEvent(1);
    EXPECT_TRUE(listener2.isEnabled(added));
    EXPECT_FALSE(listener2.isEnabled(boost::shared_ptr<Zel_Event>()));
}

TEST(Zel_EventListenerTest, CopyKeepsMaskSessionAndMonikerButIsNotOwned)
{
    boost::shared_ptr<StubSession> session(new StubSession);
    const boost::shared_ptr<QString> key = moniker("folder");
    boost::shared_ptr<RecordingListener> original(new RecordingListener(nullptr, QStringLiteral("o"), key, 5, session));
    EXPECT_EQ(original->shared_from_this().get(), original.get());

    RecordingListener copy(*original);
    EXPECT_EQ(copy.getMoniker().get(), key.get());
    EXPECT_EQ(copy.getSessionSP().get(), session.get());
    EXPECT_EQ(copy.enableEvent(0), 5ul);
    EXPECT_THROW(copy.shared_from_this(), boost::bad_weak_ptr);
    EXPECT_FALSE(copy.registerWithSession());

    RecordingListener assigned(nullptr, QStringLiteral("a"), moniker("other"), 0);
    assigned = *original;
    EXPECT_EQ(assigned.getMoniker().get(), key.get());
    EXPECT_EQ(assigned.enableEvent(0), 5ul);
    EXPECT_THROW(assigned.shared_from_this(), boost::bad_weak_ptr);
    // Changing the copy leaves the original alone.
    copy.disableEvent(1);
    EXPECT_EQ(original->enableEvent(0), 5ul);
}

TEST(Zel_EventListenerTest, RegisterWithSessionWorksOnceASharedPointerOwnsTheListener)
{
    boost::shared_ptr<StubSession> session(new StubSession);
    const boost::shared_ptr<Zel_EventCB> hub = session->getEventCBSP();
    EventLog log;

    // Not yet owned: nothing is registered and nothing is thrown.
    RecordingListener onStack(&log, QStringLiteral("stack"), moniker("f"), 7, session);
    EXPECT_FALSE(onStack.registerWithSession());
    EXPECT_FALSE(onStack.unregisterFromSession());
    EXPECT_FALSE(hub->hasRegisteredListener(moniker("f")));

    boost::shared_ptr<RecordingListener> owned(new RecordingListener(&log, QStringLiteral("owned"), moniker("f"), 7, session));
    EXPECT_TRUE(owned->registerWithSession());
    EXPECT_TRUE(owned->registerWithSession()); // filed once only
    deliver(hub, addedEvent("f", "c"));
    EXPECT_EQ(log.lines(), QStringList() << QStringLiteral("owned:Zel_EventChildAdded parent: f child: c"));

    EXPECT_TRUE(owned->unregisterFromSession());
    log.clear();
    deliver(hub, addedEvent("f", "c"));
    EXPECT_TRUE(log.lines().isEmpty());

    // Without a session, or once it is gone, the helpers do nothing.
    boost::shared_ptr<RecordingListener> sessionless(new RecordingListener(&log, QStringLiteral("n"), moniker("f")));
    EXPECT_FALSE(sessionless->registerWithSession());
    owned->registerWithSession();
    session.reset();
    EXPECT_FALSE(owned->registerWithSession());
    EXPECT_FALSE(owned->unregisterFromSession());
    // The session's end emptied the hub: the listener is held only here now.
    EXPECT_EQ(owned.use_count(), 1);
}

TEST(Zel_EventListenerTest, VirtualSlotOrderIsFixed)
{
    EXPECT_EQ(slotsOutOfOrder(2, {ZEL_SLOT_ROW(SlotProbe, handleEvent), ZEL_SLOT_ROW(SlotProbe, getMoniker),
                                  ZEL_SLOT_ROW(SlotProbe, isEnabled), ZEL_SLOT_ROW(SlotProbe, getValidEventMask),
                                  ZEL_SLOT_ROW(SlotProbe, getEnabledEventMask), ZEL_SLOT_ROW(SlotProbe, firstNewSlot)}),
              "");
    EXPECT_TRUE((std::is_base_of<QList<boost::shared_ptr<Zel_EventListener>>, Zel_EventListenerSPList>::value));
    EXPECT_TRUE(std::has_virtual_destructor<Zel_EventListenerSPList>::value);
}
