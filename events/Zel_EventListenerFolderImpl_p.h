// Internal: the folder listener that a Zel_IEventListenerFolder owns and
// registers. It forwards the three notifications to its facade through a
// plain pointer. It remembers the hub it is filed in, so that the facade can
// take it out of that hub even when the session it was registered through is
// gone (a dead copy of a session sharing the hub, or the last session in the
// middle of its destruction). Never installed.
//
// Threads: the facade pointer is read during delivery, with the hub's lock
// held, and cleared with that same lock held; the remembered hub is touched
// only by the facade's own operations. A listener is filed in one hub at a
// time: the facade detaches it before it attaches it again.
#ifndef ZEL_EVENTLISTENERFOLDERIMPL_P_H
#define ZEL_EVENTLISTENERFOLDERIMPL_P_H

#include "Zel_EventListenerFolder.h"
#include "Zel_IEventListenerFolder.h"

#include <QString>
#include <boost/shared_ptr.hpp>
#include <boost/weak_ptr.hpp>

class Zel_EventCB;
class Zel_IEventListenerFolder;
class Zel_Session;

class Zel_EventListenerFolderImpl : public Zel_EventListenerFolder
{
public:
    Zel_EventListenerFolderImpl(boost::shared_ptr<QString> moniker, Zel_IEventListenerFolder* facade);
    virtual ~Zel_EventListenerFolderImpl();

    virtual void childAdded(boost::shared_ptr<QString> parentMoniker, boost::shared_ptr<QString> childMoniker) override;
    virtual void childRemoved(boost::shared_ptr<QString> parentMoniker, boost::shared_ptr<QString> childMoniker) override;
    virtual void childUpdated(boost::shared_ptr<QString> parentMoniker, boost::shared_ptr<QString> childMoniker) override;

    // Registers this listener with the session and remembers the session's
    // hub. Call detach first when it may be filed elsewhere.
    void attach(Zel_Session& session);
    // Takes this listener out of the remembered hub, if that hub still lives;
    // with forgetFacade, also clears the facade pointer so that no call ever
    // reaches the facade again. Both happen under the hub's lock: when this
    // returns, no other thread is inside a notification of the facade and none
    // can enter one. The lock is recursive, so a notification may detach its
    // own listener on the delivering thread. Without a live hub nothing can
    // deliver to this listener, and nothing is done.
    void detach(bool forgetFacade);

    // What handleEvent does once it has found the event's type (1, 2 or 4)
    // enabled and read the child: one call to the facade, if there still is
    // one. The hub calls this for the library's own child events; it holds
    // its lock, under which the facade pointer is cleared.
    void notify(unsigned long type, const boost::shared_ptr<QString>& parent, const boost::shared_ptr<QString>& child)
    {
        Zel_IEventListenerFolder* const facade = mFacade;
        if (!facade)
            return;
        switch (type) {
        case 1:
            facade->childAdded(parent, child);
            break;
        case 2:
            facade->childRemoved(parent, child);
            break;
        case 4:
            facade->childUpdated(parent, child);
            break;
        default:
            break;
        }
    }

private:
    Zel_EventListenerFolderImpl(const Zel_EventListenerFolderImpl&) = delete;
    Zel_EventListenerFolderImpl& operator=(const Zel_EventListenerFolderImpl&) = delete;

    Zel_IEventListenerFolder* mFacade;
    boost::weak_ptr<Zel_EventCB> mHub;
};

#endif
