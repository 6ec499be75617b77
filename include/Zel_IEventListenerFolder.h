// Zel_IEventListenerFolder: the application's way to hear about folder changes.
//
// Derive from it and override childAdded, childRemoved and childUpdated. The
// facade owns an internal folder listener that it registers with a session's
// event hub; the hub routes the events of the folder named by the moniker (of
// every folder, for a null or empty moniker) to it, and it calls the facade:
//
//     class MyFolderWatch : public Zel_IEventListenerFolder {
//     public:
//         MyFolderWatch(boost::shared_ptr<QString> folder, boost::shared_ptr<Zel_Session> session)
//             : Zel_IEventListenerFolder(folder, 1 | 2, session) {}
//         void childAdded(boost::shared_ptr<QString> parent, boost::shared_ptr<QString> child) override;
//     };
//
// The mask is kept whole when it shares a bit with 7 (child added, removed,
// updated) and is 0 otherwise; change it with enableEvent / disableEvent.
// Registration: a facade built with a live session is registered at once;
// registerEventListener moves it to another session (or again to the end of
// the same session's list; a null session just unregisters it);
// unregisterEventListener and the destructor unregister it, after which no
// notification reaches it. The facade refers to its session weakly; it leaves
// the session's event hub even when that session has died meanwhile while the
// hub lives on (a copy of the session shares it, or an event is pending).
//
// Threads: the notifications run on the thread that delivers events, with the
// hub's lock held. unregisterEventListener and the destructor take that lock,
// so when they return no other thread is inside a notification of this
// facade and none can enter one; a notification may unregister or destroy its
// own facade. A facade is not copyable, and one facade is used by one thread
// at a time. If events can be delivered while the facade is built or
// destroyed on another thread, call unregisterEventListener() first thing in
// the derived destructor (the derived part is gone by the time the base
// destructor runs), and pass a null session to the constructor and call
// registerEventListener() once the derived object is complete.
#ifndef ZEL_IEVENTLISTENERFOLDER_H
#define ZEL_IEVENTLISTENERFOLDER_H

#include "zel_export.h"
#include "Zel_IIEventListenerFolder.h"

#include <QString>
#include <boost/shared_ptr.hpp>
#include <boost/weak_ptr.hpp>

class Zel_EventListenerFolderImpl;
class Zel_Session;

class ZEL_EXPORT Zel_IEventListenerFolder : public Zel_IIEventListenerFolder
{
public:
    // Do nothing here; override them.
    virtual void childAdded(boost::shared_ptr<QString> parentMoniker, boost::shared_ptr<QString> childMoniker) override;
    virtual void childRemoved(boost::shared_ptr<QString> parentMoniker, boost::shared_ptr<QString> childMoniker) override;
    virtual void childUpdated(boost::shared_ptr<QString> parentMoniker, boost::shared_ptr<QString> childMoniker) override;
    // Unregisters and cuts the internal listener off this facade.
    virtual ~Zel_IEventListenerFolder();

    // Unregisters as unregisterEventListener does, then registers with this
    // session (unless null).
    void registerEventListener(boost::shared_ptr<Zel_Session> session);
    // Unregisters from the hub of the current session (even if that session
    // has died) and forgets the session.
    void unregisterEventListener();

    // The internal listener's mask operations; they answer its enabled mask.
    unsigned long enableEvent(unsigned long eventType);
    unsigned long disableEvent(unsigned long eventType);
    unsigned long operator+=(unsigned long eventType);
    unsigned long operator-=(unsigned long eventType);

protected:
    // Builds the internal listener with the moniker and mask, then registers
    // it with the session (none for a null session).
    Zel_IEventListenerFolder(boost::shared_ptr<QString> moniker, unsigned long enabledMask,
                             boost::shared_ptr<Zel_Session> session);

private:
    // A copy would share the internal listener, which calls back the original.
    Zel_IEventListenerFolder(const Zel_IEventListenerFolder&) = delete;
    Zel_IEventListenerFolder& operator=(const Zel_IEventListenerFolder&) = delete;

    boost::shared_ptr<Zel_EventListenerFolderImpl> mImpl;
    boost::weak_ptr<Zel_Session> mSession;
};

#endif
