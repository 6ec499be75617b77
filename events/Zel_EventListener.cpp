#include "Zel_EventListener.h"

#include "Zel_Event.h"
#include "Zel_Session.h"

#include <boost/smart_ptr/bad_weak_ptr.hpp>

Zel_EventListener::Zel_EventListener(boost::shared_ptr<QString> moniker, unsigned long enabledMask,
                                     boost::shared_ptr<Zel_Session> session)
    : mEnabledMask(enabledMask)
    , mSession(session)
    , mMoniker(std::move(moniker))
{
}

Zel_EventListener::Zel_EventListener(const Zel_EventListener& other)
    : boost::enable_shared_from_this<Zel_EventListener>() // a copy is not owned yet
    , mEnabledMask(other.mEnabledMask.load(std::memory_order_relaxed))
    , mSession(other.mSession)
    , mMoniker(other.mMoniker)
{
}

Zel_EventListener& Zel_EventListener::operator=(const Zel_EventListener& other)
{
    if (this != &other) {
        mEnabledMask.store(other.mEnabledMask.load(std::memory_order_relaxed), std::memory_order_relaxed);
        mSession = other.mSession;
        mMoniker = other.mMoniker;
    }
    return *this;
}

Zel_EventListener::~Zel_EventListener() = default;

unsigned long Zel_EventListener::enableEvent(unsigned long eventType)
{
    if (isValidEventType(eventType))
        return mEnabledMask.fetch_or(eventType, std::memory_order_relaxed) | eventType;
    return mEnabledMask.load(std::memory_order_relaxed);
}

unsigned long Zel_EventListener::disableEvent(unsigned long eventType)
{
    if (isValidEventType(eventType))
        return mEnabledMask.fetch_and(~eventType, std::memory_order_relaxed) & ~eventType;
    return mEnabledMask.load(std::memory_order_relaxed);
}

unsigned long Zel_EventListener::operator+=(unsigned long eventType)
{
    return enableEvent(eventType);
}

unsigned long Zel_EventListener::operator-=(unsigned long eventType)
{
    return disableEvent(eventType);
}

bool Zel_EventListener::registerWithSession()
{
    const boost::shared_ptr<Zel_Session> session = mSession.lock();
    if (!session)
        return false;
    try {
        session->RegisterListener(shared_from_this());
    } catch (const boost::bad_weak_ptr&) {
        return false; // not owned by a shared pointer (yet)
    }
    return true;
}

bool Zel_EventListener::unregisterFromSession()
{
    const boost::shared_ptr<Zel_Session> session = mSession.lock();
    if (!session)
        return false;
    try {
        session->UnregisterListener(shared_from_this());
    } catch (const boost::bad_weak_ptr&) {
        return false;
    }
    return true;
}

boost::shared_ptr<QString> Zel_EventListener::getMoniker()
{
    return mMoniker;
}

bool Zel_EventListener::isEnabled(boost::shared_ptr<Zel_Event> event) const
{
    if (!event)
        return false;
    return isEnabledEventType(event->getEventType());
}

boost::shared_ptr<Zel_Session> Zel_EventListener::getSessionSP() const
{
    return mSession.lock();
}

const unsigned long Zel_EventListener::getEnabledEventMask() const
{
    return mEnabledMask.load(std::memory_order_relaxed);
}

bool Zel_EventListener::isEnabledEventType(unsigned long eventType) const
{
    return (eventType & getEnabledEventMask()) != 0;
}

bool Zel_EventListener::isValidEventType(unsigned long eventType) const
{
    return (eventType & getValidEventMask()) != 0;
}
