// Internal: the folder listener that a Zel_IEventListenerFolder owns and
// registers. It forwards the three notifications to its facade through a
// plain pointer, which the facade clears in its destructor; afterwards the
// notifications do nothing. Never installed.
#ifndef ZEL_EVENTLISTENERFOLDERIMPL_P_H
#define ZEL_EVENTLISTENERFOLDERIMPL_P_H

#include "Zel_EventListenerFolder.h"

#include <QString>
#include <boost/shared_ptr.hpp>

class Zel_IEventListenerFolder;

class Zel_EventListenerFolderImpl : public Zel_EventListenerFolder
{
public:
    Zel_EventListenerFolderImpl(boost::shared_ptr<QString> moniker, Zel_IEventListenerFolder* facade);
    virtual ~Zel_EventListenerFolderImpl();

    virtual void childAdded(boost::shared_ptr<QString> parentMoniker, boost::shared_ptr<QString> childMoniker) override;
    virtual void childRemoved(boost::shared_ptr<QString> parentMoniker, boost::shared_ptr<QString> childMoniker) override;
    virtual void childUpdated(boost::shared_ptr<QString> parentMoniker, boost::shared_ptr<QString> childMoniker) override;

    // Called by the facade's destructor: no call reaches the facade afterwards.
    void detachFacade() { mFacade = nullptr; }

private:
    Zel_EventListenerFolderImpl(const Zel_EventListenerFolderImpl&) = delete;
    Zel_EventListenerFolderImpl& operator=(const Zel_EventListenerFolderImpl&) = delete;

    Zel_IEventListenerFolder* mFacade;
};

#endif
