#include "EventTestSupport.h"
#include "StubSession.h"
#include "VtableSlot.h"
#include "Zel_EventListenerFolder.h"
#include "Zel_IEventListenerFolder.h"

#include <gtest/gtest.h>

#include <functional>
#include <stdexcept>
#include <type_traits>
#include <utility>
#include <vector>

namespace {

// Records the three notifications as "<name> <what> <parent> <child>".
template <class Base>
struct FolderRecorder : Base {
    template <class... Args>
    FolderRecorder(EventLog* log, const char* name, Args&&... args) : Base(std::forward<Args>(args)...), mLog(log), mName(name)
    {
    }
    void childAdded(boost::shared_ptr<QString> p, boost::shared_ptr<QString> c) override { record("added", p, c); }
    void childRemoved(boost::shared_ptr<QString> p, boost::shared_ptr<QString> c) override { record("removed", p, c); }
    void childUpdated(boost::shared_ptr<QString> p, boost::shared_ptr<QString> c) override { record("updated", p, c); }
    void record(const char* what, const boost::shared_ptr<QString>& parent, const boost::shared_ptr<QString>& child)
    {
        mLog->add(mName + QLatin1Char(' ') + QLatin1String(what) + QLatin1Char(' ') + text(parent) + QLatin1Char(' ')
                  + text(child));
    }
    EventLog* mLog;
    QString mName;
};

// The application's side: a facade registered with a session.
using FolderWatch = FolderRecorder<Zel_IEventListenerFolder>;

// A folder listener used directly.
struct DirectFolderListener : FolderRecorder<Zel_EventListenerFolder> {
    using FolderRecorder::FolderRecorder;
    using Zel_EventListenerFolder::getValidEventMask;
    using Zel_EventListenerFolder::handleEvent;
};

// An event of another class carrying a given type code.
struct ForeignEvent : Zel_Event {
    explicit ForeignEvent(unsigned long type) : Zel_Event(moniker("F")), mType(type) {}
    const unsigned long getEventType() const override { return mType; }
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
struct FacadeProbe : Zel_IEventListenerFolder {
    FacadeProbe() : Zel_IEventListenerFolder(boost::shared_ptr<QString>(), 0, boost::shared_ptr<Zel_Session>()) {}
    virtual void firstNewSlot() {}
};

// A session whose destructor body runs code while the session can no longer
// be reached through a weak reference and its hub has not been emptied yet.
struct DyingSession : StubSession {
    using StubSession::StubSession;
    ~DyingSession() override
    {
        if (onDestroy)
            onDestroy();
    }
    std::function<void()> onDestroy;
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
    DirectFolderListener folder(&log, "d", moniker("mine"));
    EXPECT_EQ(folder.getValidEventMask(), 7ul);
    EXPECT_EQ(folder.enableEvent(0), 0ul); // starts with nothing enabled

    folder.handleEvent(addedEvent("P", "c1"));
    EXPECT_TRUE(log.lines().isEmpty());

    folder.enableEvent(7);
    folder.handleEvent(addedEvent("P", "c1"));
    folder.handleEvent(removedEvent("P", "c2"));
    folder.handleEvent(updatedEvent("P", "c3"));
    folder.handleEvent(addedEvent("P", nullptr));
    EXPECT_EQ(log.lines(), QStringList({"d added mine c1", "d removed mine c2", "d updated mine c3", "d added mine <null>"}));

    // Other type codes, and events of other classes with a child code, make no call.
    log.clear();
    folder.enableEvent(9);
    for (unsigned long type : {8ul, 3ul, 1ul})
        folder.handleEvent(boost::shared_ptr<Zel_Event>(new ForeignEvent(type)));
    folder.handleEvent(boost::shared_ptr<Zel_Event>());
    EXPECT_TRUE(log.lines().isEmpty());

    // The base notifications do nothing.
    Zel_EventListenerFolder& base = folder;
    base.Zel_EventListenerFolder::childAdded(moniker("p"), moniker("c"));
    EXPECT_TRUE(log.lines().isEmpty());
}

TEST_F(Zel_IEventListenerFolderTest, ReceivesNotificationsOfItsFolderOrWithoutMonikerOfEveryFolderWhileRegistered)
{
    FolderWatch watch(&log, "w", moniker("/bin"), 7, session);
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

    // Without a moniker it hears every folder, with its own null parent.
    FolderWatch every(&log, "e", boost::shared_ptr<QString>(), 1, session);
    deliver(hub, addedEvent("/x", "/x/1"));
    EXPECT_EQ(log.lines(), QStringList({"e added <null> /x/1"}));
}

TEST_F(Zel_IEventListenerFolderTest, MaskIsKeptWholeWhenItSharesABitWithSevenAndChangesThroughTheFacade)
{
    FolderWatch none(&log, "none", moniker("/b"), 8, session);
    EXPECT_EQ(none.enableEvent(0), 0ul);
    FolderWatch zero(&log, "zero", moniker("/b"), 0, session);
    FolderWatch whole(&log, "whole", moniker("/b"), 8 | 2, session);
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
    FolderWatch watch(&log, "w", moniker("/f"), 7, boost::shared_ptr<Zel_Session>());
    EXPECT_FALSE(hub->hasRegisteredListener(moniker("/f")));
    FolderWatch first(&log, "first", moniker("/f"), 7, session);
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

TEST_F(Zel_IEventListenerFolderTest, DestroyedFacadeIsUnregisteredAndNeverCalledAndADeadSessionIsOnlyForgotten)
{
    {
        FolderWatch watch(&log, "w", moniker("/f"), 7, session);
        deliver(hub, addedEvent("/f", "c"));
    }
    deliver(hub, addedEvent("/f", "d"));
    EXPECT_EQ(log.lines(), QStringList({"w added /f c"}));

    // Registered through a session copy that dies first, it still hears the
    // shared hub while it lives, and nothing once it is gone.
    boost::shared_ptr<StubSession> copy(new StubSession(*session));
    {
        FolderWatch watch(&log, "v", moniker("/g"), 7, copy);
        copy.reset();
        deliver(hub, addedEvent("/g", "c"));
    }
    deliver(hub, addedEvent("/g", "d"));
    EXPECT_EQ(log.lines(), QStringList({"w added /f c", "v added /g c"}));

    // After the last session died (and emptied its hub), unregistering has
    // nothing left to do.
    FolderWatch dead(&log, "x", moniker("/h"), 7, session);
    session.reset();
    dead.unregisterEventListener();
    dead.registerEventListener(boost::shared_ptr<Zel_Session>());
    EXPECT_FALSE(hub->hasRegisteredListener(moniker("/h")));
    deliver(hub, addedEvent("/h", "c"));
    EXPECT_EQ(log.lines().size(), 2);
}

TEST_F(Zel_IEventListenerFolderTest, LeavesTheSharedHubWhenTheSessionCopyItRegisteredWithHasDied)
{
    // The moniker is held by the internal listener only: its count tells
    // whether a hub still holds that listener once the facade is gone.
    const boost::shared_ptr<QString> key = moniker("/g");
    boost::shared_ptr<StubSession> copy(new StubSession(*session));
    FolderWatch* watch = new FolderWatch(&log, "v", key, 7, copy);
    copy.reset(); // the hub lives on in the original session
    deliver(hub, addedEvent("/g", "c"));

    watch->unregisterEventListener();
    deliver(hub, addedEvent("/g", "d"));
    EXPECT_EQ(log.lines(), QStringList({"v added /g c"}));

    // Moving to another session leaves the shared hub as well.
    copy.reset(new StubSession(*session));
    watch->registerEventListener(copy);
    copy.reset();
    boost::shared_ptr<StubSession> other(new StubSession);
    watch->registerEventListener(other);
    log.clear();
    deliver(hub, addedEvent("/g", "e"));
    deliver(other->getEventCBSP(), addedEvent("/g", "f"));
    EXPECT_EQ(log.lines(), QStringList({"v added /g f"}));

    // Registered through a dead copy again, then destroyed: the hub lets go of
    // the internal listener and calls nobody.
    copy.reset(new StubSession(*session));
    watch->registerEventListener(copy);
    copy.reset();
    delete watch;
    EXPECT_EQ(key.use_count(), 1);
    log.clear();
    deliver(hub, addedEvent("/g", "g"));
    deliver(other->getEventCBSP(), addedEvent("/g", "h"));
    EXPECT_TRUE(log.lines().isEmpty());
}

TEST_F(Zel_IEventListenerFolderTest, LeavesTheHubWhileItsLastSessionIsBeingDestroyed)
{
    // The backend's session destructor runs while no weak reference reaches
    // the session any more and before the hub is emptied; a result still
    // holds the hub.
    const boost::shared_ptr<QString> kept = moniker("/k");
    const boost::shared_ptr<QString> gone = moniker("/k");
    boost::shared_ptr<DyingSession> dying(new DyingSession);
    boost::shared_ptr<Zel_EventCB> dyingHub = dying->getEventCBSP();
    FolderWatch unregistered(&log, "u", kept, 7, dying);
    FolderWatch* destroyed = new FolderWatch(&log, "d", gone, 7, dying);
    bool ran = false;
    dying->onDestroy = [&] {
        unregistered.unregisterEventListener();
        delete destroyed;
        EXPECT_EQ(gone.use_count(), 1) << "the destroyed facade's listener is still in the hub";
        deliver(dyingHub, addedEvent("/k", "c"));
        ran = true;
    };
    dying.reset();
    EXPECT_TRUE(ran);
    EXPECT_TRUE(log.lines().isEmpty());
}

TEST_F(Zel_IEventListenerFolderTest, AFacadeMayDestroyItselfOrAnotherFromItsOwnNotification)
{
    boost::shared_ptr<StubSession> copy(new StubSession(*session));
    const boost::shared_ptr<QString> key = moniker("/s");
    struct SelfDestroying : FolderWatch {
        using FolderWatch::FolderWatch;
        void childAdded(boost::shared_ptr<QString> p, boost::shared_ptr<QString> c) override
        {
            FolderWatch::childAdded(p, c);
            delete victim;
            delete this;
        }
        FolderWatch* victim = nullptr;
    };
    SelfDestroying* first = new SelfDestroying(&log, "first", key, 7, copy);
    first->victim = new FolderWatch(&log, "second", key, 7, copy);
    FolderWatch third(&log, "third", key, 7, copy);
    copy.reset();

    // The first destroys the second, which is then skipped, and itself; the
    // third still hears this event, and only the third hears the next one.
    deliver(hub, addedEvent("/s", "c"));
    deliver(hub, addedEvent("/s", "d"));
    EXPECT_EQ(log.lines(), QStringList({"first added /s c", "third added /s c", "third added /s d"}));
    EXPECT_EQ(key.use_count(), 2) << "only the test and the third's listener hold the moniker";
}

namespace {

// A child-added event of the application's own class: the folder listeners
// must read it through its overrides.
struct RenamedAddedEvent : Zel_EventChildAdded {
    RenamedAddedEvent() : Zel_EventChildAdded(moniker("/elsewhere"), moniker("stored")) {}
    const boost::shared_ptr<QString> getMonikerSP() const override { return moniker("/bin"); }
    boost::shared_ptr<QString> getChildMoniker() override { return moniker("overridden"); }
};

// A child-added event class that reports another type code.
struct RetypedAddedEvent : Zel_EventChildAdded {
    explicit RetypedAddedEvent(unsigned long type) : Zel_EventChildAdded(moniker("/bin"), moniker("c")), mType(type) {}
    const unsigned long getEventType() const override { return mType; }
    unsigned long mType;
};

// A folder listener of the application's own kind that accepts every type
// whatever its mask says.
struct EagerFolderListener : DirectFolderListener {
    using DirectFolderListener::DirectFolderListener;
    bool isEnabled(boost::shared_ptr<Zel_Event> event) const override { return event != nullptr; }
};

} // namespace

TEST_F(Zel_IEventListenerFolderTest, EventsOfOtherClassesAreReadThroughTheirOverridesOrMakeNoCall)
{
    FolderWatch watch(&log, "w", moniker("/bin"), 7, session);

    // A class derived from a child event: filed by its getMonikerSP, child
    // from its getChildMoniker.
    deliver(hub, boost::shared_ptr<Zel_Event>(new RenamedAddedEvent));
    EXPECT_EQ(log.lines(), QStringList({"w added /bin overridden"}));

    // Other classes that carry a child code, and a child-added class that
    // reports the code of another child event, make no call.
    log.clear();
    for (unsigned long type : {1ul, 2ul, 4ul}) {
        struct BinEvent : Zel_Event {
            explicit BinEvent(unsigned long type) : Zel_Event(moniker("/bin")), mType(type) {}
            const unsigned long getEventType() const override { return mType; }
            unsigned long mType;
        };
        deliver(hub, boost::shared_ptr<Zel_Event>(new BinEvent(type)));
    }
    deliver(hub, boost::shared_ptr<Zel_Event>(new RetypedAddedEvent(2)));
    deliver(hub, boost::shared_ptr<Zel_Event>(new RetypedAddedEvent(4)));
    EXPECT_TRUE(log.lines().isEmpty());
    // With its own code again, it is a child-added event.
    deliver(hub, boost::shared_ptr<Zel_Event>(new RetypedAddedEvent(1)));
    EXPECT_EQ(log.lines(), QStringList({"w added /bin c"}));
}

TEST_F(Zel_IEventListenerFolderTest, FolderListenersOfTheApplicationKeepTheirOverridesInTheHub)
{
    // Mask 0, but its isEnabled accepts everything; a facade with mask 0
    // beside it hears nothing.
    const boost::shared_ptr<EagerFolderListener> eager(new EagerFolderListener(&log, "eager", moniker("/bin")));
    session->RegisterListener(eager);
    FolderWatch quiet(&log, "quiet", moniker("/bin"), 0, session);
    deliver(hub, addedEvent("/bin", "a"));
    deliver(hub, removedEvent("/bin", "b"));
    EXPECT_EQ(log.lines(), QStringList({"eager added /bin a", "eager removed /bin b"}));
}

TEST_F(Zel_IEventListenerFolderTest, FacadesAndOtherListenersAreCalledInOrderAndAThrowingFacadeStopsNoOne)
{
    struct ThrowingWatch : FolderWatch {
        using FolderWatch::FolderWatch;
        void childUpdated(boost::shared_ptr<QString> p, boost::shared_ptr<QString> c) override
        {
            FolderWatch::childUpdated(p, c);
            throw std::runtime_error("facade failed");
        }
    };
    FolderWatch first(&log, "first", moniker("/bin"), 7, session);
    const boost::shared_ptr<RecordingListener> plain(new RecordingListener(&log, "plain", moniker("/bin")));
    session->RegisterListener(plain);
    ThrowingWatch thrower(&log, "thrower", moniker("/bin"), 7, session);
    FolderWatch every(&log, "every", boost::shared_ptr<QString>(), 7, session);
    FolderWatch last(&log, "last", moniker("/bin"), 7, session);

    deliver(hub, updatedEvent("/bin", "c"));
    deliver(hub, boost::shared_ptr<Zel_Event>(new Zel_EventChildUpdated(moniker("/bin"), boost::shared_ptr<QString>())));
    EXPECT_EQ(log.lines(), QStringList({"first updated /bin c", "plain:Zel_EventChildUpdated parent: /bin child: c",
                                        "thrower updated /bin c", "last updated /bin c", "every updated <null> c",
                                        "first updated /bin <null>",
                                        "plain:Zel_EventChildUpdated parent: /bin child: ",
                                        "thrower updated /bin <null>", "last updated /bin <null>",
                                        "every updated <null> <null>"}));
}

TEST_F(Zel_IEventListenerFolderTest, HandsTheFacadeItsMonikersWithoutKeepingCopiesOfTheirsOrOfTheEvent)
{
    // Inside the notification the monikers are held by their owners and by
    // the by-value parameters only, and the event by the test and its result:
    // delivery to a facade copies nothing else.
    struct CountingWatch : Zel_IEventListenerFolder {
        CountingWatch(boost::shared_ptr<QString> key, boost::shared_ptr<Zel_Session> s)
            : Zel_IEventListenerFolder(std::move(key), 7, std::move(s))
        {
        }
        void childAdded(boost::shared_ptr<QString> p, boost::shared_ptr<QString> c) override { record(p, c); }
        void childRemoved(boost::shared_ptr<QString> p, boost::shared_ptr<QString> c) override { record(p, c); }
        void childUpdated(boost::shared_ptr<QString> p, boost::shared_ptr<QString> c) override { record(p, c); }
        void record(const boost::shared_ptr<QString>& p, const boost::shared_ptr<QString>& c)
        {
            counts.push_back({p.use_count(), c.use_count(), event->use_count()});
        }
        const boost::shared_ptr<Zel_Event>* event = nullptr;
        std::vector<std::vector<long>> counts;
    };
    const boost::shared_ptr<QString> parent = moniker("/bin");
    const boost::shared_ptr<QString> child = moniker("c");
    CountingWatch watch(parent, session);
    const boost::shared_ptr<Zel_Event> events[] = {
        boost::shared_ptr<Zel_Event>(new Zel_EventChildAdded(parent, child)),
        boost::shared_ptr<Zel_Event>(new Zel_EventChildRemoved(parent, child)),
        boost::shared_ptr<Zel_Event>(new Zel_EventChildUpdated(parent, child))};
    for (const boost::shared_ptr<Zel_Event>& event : events) {
        watch.event = &event;
        deliver(hub, event);
    }
    // parent: this test, the listener, the three events, the parameter;
    // child: this test, the three events, the parameter; event: this test, the result.
    const std::vector<long> expected = {6, 5, 2};
    EXPECT_EQ(watch.counts, std::vector<std::vector<long>>(3, expected));
}

TEST(Zel_IEventListenerFolderSlotTest, SlotOrderAndCopyRules)
{
    EXPECT_EQ(slotsOutOfOrder(0, {ZEL_SLOT_ROW(Zel_IIEventListenerFolder, childAdded),
                                  ZEL_SLOT_ROW(Zel_IIEventListenerFolder, childRemoved),
                                  ZEL_SLOT_ROW(Zel_IIEventListenerFolder, childUpdated)}),
              "");
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
