#include "Zel_EventCB.h"

#include "Threads_MutexTenure.h"
#include "Zel_Event.h"
#include "Zel_EventChildAdded.h"
#include "Zel_EventChildRemoved.h"
#include "Zel_EventChildUpdated.h"
#include "Zel_EventListener.h"
#include "Zel_EventListenerFolderImpl_p.h"

#include <atomic>
#include <exception>
#include <typeinfo>

Zel_EventCB::Zel_EventCB()
    : Orv_ResultsCB(Orv_RequestID(Orv_RequestID::Callback))
    , mMutex("Zel_EventCB Mutex", false)
    , mChanges(0)
{
}

Zel_EventCB::~Zel_EventCB()
{
    UnregisterAll();
}

QString Zel_EventCB::getMonikerString(const boost::shared_ptr<QString>& moniker)
{
    return moniker ? *moniker : QString();
}

void Zel_EventCB::Register(boost::shared_ptr<Zel_EventListener> listener)
{
    if (!listener)
        return;
    const QString key = getMonikerString(listener->getMoniker());

    Threads::MutexTenure tenure(mMutex, nullptr);
    Zel_EventListenerSPList& listeners = mTable[key];
    if (!listeners.contains(listener))
        listeners.append(listener);
    ++mChanges;
}

void Zel_EventCB::Unregister(boost::shared_ptr<Zel_EventListener> listener)
{
    if (!listener)
        return;
    const QString key = getMonikerString(listener->getMoniker());

    // The argument keeps the listener alive, so removing the table's
    // references cannot run its destructor while the list is being changed.
    Threads::MutexTenure tenure(mMutex, nullptr);
    const Table::iterator found = mTable.find(key);
    if (found != mTable.end()) {
        found->removeAll(listener);
        ++mChanges;
    }
}

void Zel_EventCB::UnregisterAll()
{
    Threads::MutexTenure tenure(mMutex, nullptr);
    Table old;
    old.swap(mTable);
    ++mChanges;
    // Drop the old table's references while the lock is held. Listener
    // destructors that call back into this hub see the new, empty table.
    old.clear();
}

bool Zel_EventCB::hasRegisteredListener(boost::shared_ptr<QString> moniker)
{
    const QString none;
    const QString& key = moniker ? *moniker : none;
    Threads::MutexTenure tenure(mMutex, nullptr);
    return mTable.contains(key) || mTable.contains(none);
}

void Zel_EventCB::handleEvent(boost::shared_ptr<Zel_Event> event)
{
    deliver(event);
}

void Zel_EventCB::deliver(const boost::shared_ptr<Zel_Event>& event)
{
    if (!event)
        return;

    // The library's own child events are recognised by their exact class, so
    // that no override can change what they answer: their code, moniker and
    // child are read here, once and without copies, instead of once per
    // listener. Any other event (a class derived from them included) is left
    // to each listener's handleEvent.
    Zel_Event& received = *event;
    const std::type_info& eventClass = typeid(received);
    unsigned long childType = 0;
    const boost::shared_ptr<QString>* child = nullptr;
    if (&eventClass == &typeid(Zel_EventChildAdded)) {
        childType = 1;
        child = &static_cast<Zel_EventChildAdded&>(received).mChildMoniker;
    } else if (&eventClass == &typeid(Zel_EventChildRemoved)) {
        childType = 2;
        child = &static_cast<Zel_EventChildRemoved&>(received).mChildMoniker;
    } else if (&eventClass == &typeid(Zel_EventChildUpdated)) {
        childType = 4;
        child = &static_cast<Zel_EventChildUpdated&>(received).mChildMoniker;
    }

    Threads::MutexTenure tenure(mMutex, nullptr);
    // The virtual getMonikerSP() of any other event class.
    boost::shared_ptr<QString> asked;
    if (!child)
        asked = received.getMonikerSP();
    const boost::shared_ptr<QString>& moniker = child ? received.mMoniker : asked;
    const QString none;
    const QString& key = moniker && !moniker->isEmpty() ? *moniker : none;

    // Snapshots (shared, not copied, until the table changes): re-entrant
    // registrations during the calls below cannot disturb this delivery.
    QList<boost::shared_ptr<Zel_EventListener>> forMoniker;
    QList<boost::shared_ptr<Zel_EventListener>> forEveryNode;
    if (!key.isEmpty()) {
        const Table::const_iterator found = mTable.constFind(key);
        if (found != mTable.constEnd())
            forMoniker = *found;
    }
    const Table::const_iterator all = mTable.constFind(none);
    if (all != mTable.constEnd())
        forEveryNode = *all;

    const std::uint64_t changesAtStart = mChanges;
    if (!forMoniker.isEmpty())
        processEvent(forMoniker, key, event, childType, child, changesAtStart);
    if (!forEveryNode.isEmpty())
        processEvent(forEveryNode, none, event, childType, child, changesAtStart);
}

void Zel_EventCB::processEvent(const QList<boost::shared_ptr<Zel_EventListener>>& listeners, const QString& key,
                               const boost::shared_ptr<Zel_Event>& event, unsigned long childType,
                               const boost::shared_ptr<QString>* child, std::uint64_t changesAtStart)
{
    for (const boost::shared_ptr<Zel_EventListener>& entry : listeners) {
        Zel_EventListener* const listener = entry.get();
        if (!listener)
            continue;
        // Skip a listener that was unregistered during this delivery.
        if (mChanges != changesAtStart && !isFiled(key, entry))
            continue;
        // The snapshot keeps the listener alive through its call.
        try {
            // A folder facade's own listener, whose class no one derives
            // from: its handleEvent would test the mask and call the facade,
            // and so does this, without copying the event for the call.
            if (childType && &typeid(*listener) == &typeid(Zel_EventListenerFolderImpl)) {
                if (childType & listener->mEnabledMask.load(std::memory_order_relaxed))
                    static_cast<Zel_EventListenerFolderImpl*>(listener)->notify(childType, listener->mMoniker, *child);
            } else {
                listener->handleEvent(event);
            }
        } catch (...) {
            // One listener's failure must not keep the event from the others.
            // The unwinding of a thread that is cancelled or calls pthread_exit
            // (abi::__forced_unwind) must go on; it carries no C++ object, so
            // current_exception() is empty for it.
            if (!std::current_exception())
                throw;
        }
    }
}

bool Zel_EventCB::isFiled(const QString& key, const boost::shared_ptr<Zel_EventListener>& listener) const
{
    const Table::const_iterator found = mTable.constFind(key);
    return found != mTable.constEnd() && found->contains(listener);
}
