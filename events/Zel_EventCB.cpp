#include "Zel_EventCB.h"

#include "Threads_MutexTenure.h"
#include "Zel_Event.h"
#include "Zel_EventListener.h"

#include <exception>

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
    const QString key = getMonikerString(moniker);
    Threads::MutexTenure tenure(mMutex, nullptr);
    return mTable.contains(key) || mTable.contains(QString());
}

void Zel_EventCB::handleEvent(boost::shared_ptr<Zel_Event> event)
{
    if (!event)
        return;

    Threads::MutexTenure tenure(mMutex, nullptr);
    const QString key = getMonikerString(event->getMonikerSP());

    // Snapshots (shared, not copied, until the table changes): re-entrant
    // registrations during the calls below cannot disturb this delivery.
    Zel_EventListenerSPList forMoniker;
    Zel_EventListenerSPList forEveryNode;
    if (!key.isEmpty()) {
        const Table::const_iterator found = mTable.constFind(key);
        if (found != mTable.constEnd())
            forMoniker = *found;
    }
    const Table::const_iterator all = mTable.constFind(QString());
    if (all != mTable.constEnd())
        forEveryNode = *all;

    const std::uint64_t changesAtStart = mChanges;
    processEvent(forMoniker, key, event, changesAtStart);
    processEvent(forEveryNode, QString(), event, changesAtStart);
}

void Zel_EventCB::processEvent(const Zel_EventListenerSPList& listeners, const QString& key,
                               const boost::shared_ptr<Zel_Event>& event, std::uint64_t changesAtStart)
{
    for (const boost::shared_ptr<Zel_EventListener>& entry : listeners) {
        if (!entry)
            continue;
        // Skip a listener that was unregistered during this delivery.
        if (mChanges != changesAtStart && !isFiled(key, entry))
            continue;
        // The snapshot keeps the listener alive through its call.
        try {
            entry->handleEvent(event);
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
