// Zel_EventCB: a session's event hub.
//
// The hub files listeners under the text of their monikers (the empty text for
// a listener without moniker: it hears about every node) and hands each change
// event, delivered to it by a Zel_EventRes, first to the listeners filed under
// the event's moniker, in registration order, then to those filed under "".
// An event whose moniker is null or empty reaches the "" listeners once.
// Registration is by pointer identity: a listener is filed at most once per
// key. A key, once created by a registration, stays until UnregisterAll (so
// hasRegisteredListener keeps answering true for it).
//
// Only Zel_Session creates hubs and registers listeners (RegisterListener,
// UnregisterListener); event results deliver; node listeners ask
// hasRegisteredListener before they make an event.
//
// Threads: one Threads::Mutex, "Zel_EventCB Mutex", serialises every table
// access and is held through delivery, so once Unregister has returned the
// hub never calls that listener again. The mutex is recursive: a listener may
// register or unregister listeners of the same hub (itself included) from
// its handleEvent or its destructor. Delivery works on a snapshot of the
// lists, so such changes never disturb the delivery in progress: a listener
// registered meanwhile waits for the next event, and one unregistered
// meanwhile is skipped. Each listener call is isolated: an exception from one
// listener is discarded and the others still receive the event. The unwinding
// of a thread that is cancelled or calls pthread_exit inside a listener is not
// an error and passes through (releasing the lock).
//
// The hub holds its listeners strongly; sessions, node listeners and event
// results hold the hub, which may therefore outlive its session.
//
// Speed: the table is hashed, so delivery costs the same however many
// monikers are filed. The library's own child events reach the library's own
// folder listeners (those of Zel_IEventListenerFolder) without the generic
// handleEvent call; both are recognised by their exact class, so a class
// derived from either still has every one of its overrides called.
#ifndef ZEL_EVENTCB_H
#define ZEL_EVENTCB_H

#include "zel_export.h"
#include "Orv_ResultsCB.h"
#include "Threads_Mutex.h"
#include "Zel_EventListenerSPList.h"

#include <QHash>
#include <QString>
#include <boost/shared_ptr.hpp>

#include <cstdint>

class Zel_Event;
class Zel_EventListener;

class ZEL_EXPORT Zel_EventCB : public Orv_ResultsCB
{
public:
    // Empties the table (releasing every listener) before the lock goes.
    virtual ~Zel_EventCB();

    // True when listeners were ever filed under the moniker's text or under ""
    // (since the last UnregisterAll): an event for that moniker may be wanted.
    bool hasRegisteredListener(boost::shared_ptr<QString> moniker);

protected:
    // Files the listener under its moniker's text, at the end; once only.
    void Register(boost::shared_ptr<Zel_EventListener> listener);
    // Removes the listener from the key of the moniker it reports now.
    void Unregister(boost::shared_ptr<Zel_EventListener> listener);
    // Drops every listener and every key.
    void UnregisterAll();
    // Delivers the event to the listeners of its moniker, then to those under "".
    void handleEvent(boost::shared_ptr<Zel_Event> event);

private:
    friend class Zel_Session;
    friend class Zel_EventRes;
    // Takes itself out of the hub under the hub's lock (folder facades).
    friend class Zel_EventListenerFolderImpl;

    typedef QHash<QString, Zel_EventListenerSPList> Table;

    Zel_EventCB();
    Zel_EventCB(const Zel_EventCB&) = delete;
    Zel_EventCB& operator=(const Zel_EventCB&) = delete;

    static QString getMonikerString(const boost::shared_ptr<QString>& moniker);
    // handleEvent without copying the event pointer (event results call it).
    void deliver(const boost::shared_ptr<Zel_Event>& event);
    // Calls each listener of the snapshot that is still filed under the key.
    // childType and child describe the library's own child events (0 and
    // null for any other event), which its folder listeners take directly.
    void processEvent(const QList<boost::shared_ptr<Zel_EventListener>>& listeners, const QString& key,
                      const boost::shared_ptr<Zel_Event>& event, unsigned long childType,
                      const boost::shared_ptr<QString>* child, std::uint64_t changesAtStart);
    bool isFiled(const QString& key, const boost::shared_ptr<Zel_EventListener>& listener) const;

    Threads::Mutex mMutex;
    Table mTable;
    // Counts table changes, so that delivery rechecks a listener only when the
    // table changed during the delivery.
    std::uint64_t mChanges;
};

#endif
