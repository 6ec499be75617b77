#include "Zel_IEventListenerFolder.h"

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

Zel_IEventListenerFolder::Zel_IEventListenerFolder(boost::shared_ptr<QString> moniker, unsigned long enabledMask,
                                                   boost::shared_ptr<Zel_Session> session)
    : mImpl(new Zel_EventListenerFolderImpl(std::move(moniker), this))
{
    mImpl->enableEvent(enabledMask);
    registerEventListener(std::move(session));
}

Zel_IEventListenerFolder::~Zel_IEventListenerFolder()
{
    unregisterEventListener();
    // A hub may still hold the internal listener (a session copy sharing the
    // hub, say); from now on its notifications go nowhere.
    if (mImpl)
        mImpl->detachFacade();
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
    if (!mSession.expired())
        unregisterEventListener();
    mSession = session;
    if (session && mImpl)
        session->RegisterListener(mImpl);
}

void Zel_IEventListenerFolder::unregisterEventListener()
{
    if (const boost::shared_ptr<Zel_Session> session = mSession.lock())
        session->UnregisterListener(mImpl);
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
