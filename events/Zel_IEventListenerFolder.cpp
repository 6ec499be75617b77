#include "Zel_IEventListenerFolder.h"

#include "Threads_MutexTenure.h"
#include "Zel_EventCB.h"
#include "Zel_EventListenerFolderImpl_p.h"
#include "Zel_Session.h"

Zel_EventListenerFolderImpl::Zel_EventListenerFolderImpl(boost::shared_ptr<QString> moniker,
                                                         Zel_IEventListenerFolder* facade)
    : Zel_EventListenerFolder(std::move(moniker))
    , mFacade(facade)
{
}

Zel_EventListenerFolderImpl::~Zel_EventListenerFolderImpl() = default;

void Zel_EventListenerFolderImpl::childAdded(boost::shared_ptr<QString> parentMoniker,
                                             boost::shared_ptr<QString> childMoniker)
{
    if (mFacade)
        mFacade->childAdded(std::move(parentMoniker), std::move(childMoniker));
}

void Zel_EventListenerFolderImpl::childRemoved(boost::shared_ptr<QString> parentMoniker,
                                               boost::shared_ptr<QString> childMoniker)
{
    if (mFacade)
        mFacade->childRemoved(std::move(parentMoniker), std::move(childMoniker));
}

void Zel_EventListenerFolderImpl::childUpdated(boost::shared_ptr<QString> parentMoniker,
                                               boost::shared_ptr<QString> childMoniker)
{
    if (mFacade)
        mFacade->childUpdated(std::move(parentMoniker), std::move(childMoniker));
}

void Zel_EventListenerFolderImpl::attach(Zel_Session& session)
{
    session.RegisterListener(shared_from_this());
    mHub = session.getEventCBSP();
}

void Zel_EventListenerFolderImpl::detach(bool forgetFacade)
{
    const boost::shared_ptr<Zel_EventCB> hub = mHub.lock();
    mHub.reset();
    // Never filed, or the hub is gone: no delivery can reach this listener
    // (a delivery holds its hub), so there is nothing to take out or cut off.
    if (!hub)
        return;
    // Delivery holds this lock through every listener call, so taking it waits
    // for a delivery in progress on another thread to end.
    Threads::MutexTenure tenure(hub->mMutex, nullptr);
    hub->Unregister(shared_from_this());
    if (forgetFacade)
        mFacade = nullptr;
}

Zel_IEventListenerFolder::Zel_IEventListenerFolder(boost::shared_ptr<QString> moniker, unsigned long enabledMask,
                                                   boost::shared_ptr<Zel_Session> session)
    : mImpl(new Zel_EventListenerFolderImpl(std::move(moniker), this))
{
    mImpl->enableEvent(enabledMask);
    registerEventListener(std::move(session));
}

Zel_IEventListenerFolder::~Zel_IEventListenerFolder()
{
    // Unregisters, as unregisterEventListener does, and cuts the internal
    // listener off this facade in the same step.
    if (mImpl)
        mImpl->detach(true);
    mSession.reset();
}

void Zel_IEventListenerFolder::childAdded(boost::shared_ptr<QString>, boost::shared_ptr<QString>)
{
}

void Zel_IEventListenerFolder::childRemoved(boost::shared_ptr<QString>, boost::shared_ptr<QString>)
{
}

void Zel_IEventListenerFolder::childUpdated(boost::shared_ptr<QString>, boost::shared_ptr<QString>)
{
}

void Zel_IEventListenerFolder::registerEventListener(boost::shared_ptr<Zel_Session> session)
{
    // Leaves the hub it is filed in first, even when the session it came
    // through is gone while the hub lives on.
    unregisterEventListener();
    mSession = session;
    if (session && mImpl)
        mImpl->attach(*session);
}

void Zel_IEventListenerFolder::unregisterEventListener()
{
    // The hub it was filed in, not the session, which may have died while a
    // copy of it (or a pending event result) keeps the hub alive.
    if (mImpl)
        mImpl->detach(false);
    mSession.reset();
}

unsigned long Zel_IEventListenerFolder::enableEvent(unsigned long eventType)
{
    return mImpl ? mImpl->enableEvent(eventType) : 0;
}

unsigned long Zel_IEventListenerFolder::disableEvent(unsigned long eventType)
{
    return mImpl ? mImpl->disableEvent(eventType) : 0;
}

unsigned long Zel_IEventListenerFolder::operator+=(unsigned long eventType)
{
    return enableEvent(eventType);
}

unsigned long Zel_IEventListenerFolder::operator-=(unsigned long eventType)
{
    return disableEvent(eventType);
}
