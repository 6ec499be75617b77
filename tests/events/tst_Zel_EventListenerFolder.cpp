#include "EventTestSupport.h"
#include "StubSession.h"
#include "VtableSlot.h"
#include "Zel_EventListenerFolder.h"
#include "Zel_IEventListenerFolder.h"

#include <gtest/gtest.h>

#include <type_traits>

namespace {

// The application's side: records the three notifications.
class FolderWatch : public Zel_IEventListenerFolder
{
public:
    FolderWatch(EventLog* log, const QString& name, boost::shared_ptr<QString> key, unsigned long mask,
                boost::shared_ptr<Zel_Session> session)
        : Zel_IEventListenerFolder(key, mask, session)
        , mLog(log)
        , mName(name)
    {
    }
    void childAdded(boost::shared_ptr<QString> parent, boost::shared_ptr<QString> child) override
    {
        record(QStringLiteral("added"), parent, child);
    }
    void childRemoved(boost::shared_ptr<QString> parent, boost::shared_ptr<QString> child) override
    {
        record(QStringLiteral("removed"), parent, child);
    }
    void childUpdated(boost::shared_ptr<QString> parent, boost::shared_ptr<QString> child) override
    {
        record(QStringLiteral("updated"), parent, child);
    }

private:
    void record(const QString& what, const boost::shared_ptr<QString>& parent, const boost::shared_ptr<QString>& child)
    {
        mLog->add(mName + QLatin1Char(' ') + what + QLatin1Char(' ') + text(parent) + QLatin1Char(' ') + text(child));
    }
    EventLog* mLog;
    QString mName;
};

// A folder listener used directly, recording its notifications.
class DirectFolderListener : public Zel_EventListenerFolder
{
public:
    DirectFolderListener(EventLog* log, boost::shared_ptr<QString> key)
        : Zel_EventListenerFolder(key)
        , mLog(log)
    {
    }
    void childAdded(boost::shared_ptr<QString> p, boost::shared_ptr<QString> c) override { mLog->add("added " + text(p) + " " + text(c)); }
    void childRemoved(boost::shared_ptr<QString> p, boost::shared_ptr<QString> c) override { mLog->add("removed " + text(p) + " " + text(c)); }
    void childUpdated(boost::shared_ptr<QString> p, boost::shared_ptr<QString> c) override { mLog->add("updated " + text(p) + " " + text(c)); }
    using Zel_EventListenerFolder::getValidEventMask;
    using Zel_EventListenerFolder::handleEvent;

private:
    EventLog* mLog;
};

// An event of another class carrying the child-added code.
class ForeignEvent : public Zel_Event
{
public:
    explicit ForeignEvent(unsigned long type)
        : Zel_Event(moniker("F"))
        , mType(type)
    {
    }
    const unsigned long getEventType() const override { return mType; }

private:
    unsigned long mType;
};

boost::shared_ptr<Zel_Event> removedEvent(const char* parent, const char* child)
{
    return boost::shared_ptr<Zel_Event>(new Zel_EventChildRemoved(moniker(parent), moniker(child)));
}

boost::shared_ptr<Zel_Event> updatedEvent(const char* parent, const char* child)
{
    return boost::shared_ptr<Zel_Event>(new Zel_EventChildUpdated(moniker(parent), moniker(child)));
}

// Its first new virtual follows the three notifications and the destructor.
class FacadeProbe : public Zel_IEventListenerFolder
{
public:
    FacadeProbe()
        : Zel_IEventListenerFolder(boost::shared_ptr<QString>(), 0, boost::shared_ptr<Zel_Session>())
    {
    }
    virtual void firstNewSlot() {}
};

class Zel_IEventListenerFolderTest : public ::testing::Test
{
protected:
    boost::shared_ptr<StubSession> session{new StubSession};
    boost::shared_ptr<Zel_EventCB> hub = session->getEventCBSP();
    EventLog log;
};

} // namespace

TEST(Zel_EventListenerFolderTest, TurnsEnabledChildEventsIntoCallsWithItsOwnMonikerAsParent)
{
    EventLog log;
    DirectFolderListener folder(&log, moniker("mine"));
    EXPECT_EQ(folder.getValidEventMask(), 7ul);
    EXPECT_EQ(folder.enableEvent(0), 0ul); // starts with nothing enabled

    folder.handleEvent(addedEvent("P", "c1"));
    EXPECT_TRUE(log.lines().isEmpty());

    folder.enableEvent(7);
    folder.handleEvent(addedEvent("P", "c1"));
    folder.handleEvent(removedEvent("P", "c2"));
    folder.handleEvent(updatedEvent("P", "c3"));
    folder.handleEvent(addedEvent("P", nullptr));
    EXPECT_EQ(log.lines(), QStringList({"added mine c1", "removed mine c2", "updated mine c3", "added mine <null>"}));

    // Other type codes, and events of other classes with a child code, make no call.
    log.clear();
    folder.enableEvent(9);
    folder.handleEvent(boost::shared_ptr<Zel_Event>(new ForeignEvent(8)));
    folder.handleEvent(boost::shared_ptr<Zel_Event>(new ForeignEvent(3)));
    folder.handleEvent(boost::shared_ptr<Zel_Event>(new ForeignEvent(1)));
    folder.handleEvent(boost::shared_ptr<Zel_Event>());
    EXPECT_TRUE(log.lines().isEmpty());

    // The base notifications do nothing.
    Zel_EventListenerFolder& base = folder;
    base.Zel_EventListenerFolder::childAdded(moniker("p"), moniker("c"));
    EXPECT_TRUE(log.lines().isEmpty());
}

TEST_F(Zel_IEventListenerFolderTest, ReceivesNotificationsOfItsFolderWhileRegistered)
{
    FolderWatch watch(&log, QStringLiteral("w"), moniker("/bin"), 7, session);
    EXPECT_TRUE(hub->hasRegisteredListener(moniker("/bin")));

    deliver(hub, addedEvent("/bin", "/bin/a"));
    deliver(hub, removedEvent("/bin", "/bin/b"));
    deliver(hub, updatedEvent("/bin", "/bin/c"));
    deliver(hub, addedEvent("/other", "/other/x"));
    EXPECT_EQ(log.lines(), QStringList({"w added /bin /bin/a", "w removed /bin /bin/b", "w updated /bin /bin/c"}));

    watch.unregisterEventListener();
    log.clear();
    deliver(hub, addedEvent("/bin", "/bin/a"));
    EXPECT_TRUE(log.lines().isEmpty());
}

TEST_F(Zel_IEventListenerFolderTest, ListenerWithoutMonikerHearsEveryFolderWithItsOwnNullParent)
{
    FolderWatch watch(&log, QStringLiteral("w"), boost::shared_ptr<QString>(), 1, session);
    deliver(hub, addedEvent("/x", "/x/1"));
    deliver(hub, addedEvent("/y", "/y/1"));
    EXPECT_EQ(log.lines(), QStringList({"w added <null> /x/1", "w added <null> /y/1"}));
}

TEST_F(Zel_IEventListenerFolderTest, MaskIsKeptWholeWhenItSharesABitWithSevenAndChangesThroughTheFacade)
{
    FolderWatch none(&log, QStringLiteral("none"), moniker("/b"), 8, session);
    EXPECT_EQ(none.enableEvent(0), 0ul);
    FolderWatch zero(&log, QStringLiteral("zero"), moniker("/b"), 0, session);
    FolderWatch whole(&log, QStringLiteral("whole"), moniker("/b"), 8 | 2, session);
    EXPECT_EQ(whole.enableEvent(0), 10ul);

    deliver(hub, addedEvent("/b", "c"));
    deliver(hub, removedEvent("/b", "c"));
    EXPECT_EQ(log.lines(), QStringList({"whole removed /b c"}));

    EXPECT_EQ(zero.enableEvent(8), 0ul);
    EXPECT_EQ(zero.enableEvent(9), 9ul);
    EXPECT_EQ(zero += 2, 11ul);
    EXPECT_EQ(zero -= 2, 9ul);
    EXPECT_EQ(zero.disableEvent(8), 9ul);
    EXPECT_EQ(zero.disableEvent(1), 8ul);

    // Disabled types are still delivered by the hub but produce no call.
    whole.disableEvent(2);
    log.clear();
    deliver(hub, removedEvent("/b", "c"));
    EXPECT_TRUE(log.lines().isEmpty());
}

TEST_F(Zel_IEventListenerFolderTest, RegisterFollowsTheSessionRules)
{
    // Null session: not registered until a live session is given.
    FolderWatch watch(&log, QStringLiteral("w"), moniker("/f"), 7, boost::shared_ptr<Zel_Session>());
    EXPECT_FALSE(hub->hasRegisteredListener(moniker("/f")));
    FolderWatch first(&log, QStringLiteral("first"), moniker("/f"), 7, session);
    watch.registerEventListener(session);
    deliver(hub, addedEvent("/f", "c"));
    EXPECT_EQ(log.lines(), QStringList({"first added /f c", "w added /f c"}));

    // Registering again with the same session moves it to the end of its list.
    first.registerEventListener(session);
    log.clear();
    deliver(hub, addedEvent("/f", "c"));
    EXPECT_EQ(log.lines(), QStringList({"w added /f c", "first added /f c"}));

    // Another session: it leaves the first one's hub.
    boost::shared_ptr<StubSession> other(new StubSession);
    first.registerEventListener(other);
    log.clear();
    deliver(hub, addedEvent("/f", "c"));
    deliver(other->getEventCBSP(), addedEvent("/f", "d"));
    EXPECT_EQ(log.lines(), QStringList({"w added /f c", "first added /f d"}));

    // A null session unregisters and leaves it unregistered.
    first.registerEventListener(boost::shared_ptr<Zel_Session>());
    log.clear();
    deliver(other->getEventCBSP(), addedEvent("/f", "d"));
    EXPECT_TRUE(log.lines().isEmpty());
    first.unregisterEventListener(); // nothing to do
}

TEST_F(Zel_IEventListenerFolderTest, DeadSessionIsOnlyForgotten)
{
    FolderWatch watch(&log, QStringLiteral("w"), moniker("/f"), 7, session);
    session.reset();
    watch.unregisterEventListener();
    watch.registerEventListener(boost::shared_ptr<Zel_Session>());
    EXPECT_FALSE(hub->hasRegisteredListener(moniker("/f")));
    deliver(hub, addedEvent("/f", "c"));
    EXPECT_TRUE(log.lines().isEmpty());
}

TEST_F(Zel_IEventListenerFolderTest, DestroyedFacadeIsUnregisteredAndNeverCalled)
{
    {
        FolderWatch watch(&log, QStringLiteral("w"), moniker("/f"), 7, session);
        deliver(hub, addedEvent("/f", "c"));
    }
    deliver(hub, addedEvent("/f", "d"));
    EXPECT_EQ(log.lines(), QStringList({"w added /f c"}));

    // Registered through a session copy that dies first, the internal listener
    // stays in the shared hub; once the facade is gone it calls nobody.
    boost::shared_ptr<StubSession> copy(new StubSession(*session));
    {
        FolderWatch watch(&log, QStringLiteral("v"), moniker("/g"), 7, copy);
        copy.reset();
        deliver(hub, addedEvent("/g", "c"));
    }
    deliver(hub, addedEvent("/g", "d"));
    EXPECT_EQ(log.lines(), QStringList({"w added /f c", "v added /g c"}));
}

TEST(Zel_IEventListenerFolderSlotTest, SlotOrderAndCopyRules)
{
    EXPECT_EQ(vtableSlot(&Zel_IIEventListenerFolder::childAdded), 0);
    EXPECT_EQ(vtableSlot(&Zel_IIEventListenerFolder::childRemoved), 1);
    EXPECT_EQ(vtableSlot(&Zel_IIEventListenerFolder::childUpdated), 2);
    EXPECT_EQ(vtableSlot(&Zel_IEventListenerFolder::childAdded), 0);
    EXPECT_EQ(vtableSlot(&Zel_IEventListenerFolder::childUpdated), 2);
    EXPECT_EQ(vtableSlot(&FacadeProbe::firstNewSlot), 5);
    EXPECT_FALSE(std::has_virtual_destructor<Zel_IIEventListenerFolder>::value);
    EXPECT_TRUE(std::has_virtual_destructor<Zel_IEventListenerFolder>::value);
    EXPECT_FALSE(std::is_copy_constructible<FolderWatch>::value);
    EXPECT_FALSE(std::is_copy_assignable<FolderWatch>::value);
    EXPECT_EQ(vtableSlot(&DirectFolderListener::getValidEventMask), 5);
    EXPECT_EQ(vtableSlot(&DirectFolderListener::handleEvent), 2);
}
