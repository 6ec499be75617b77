// Zel_EventListenerFolder: a listener that turns child events into calls.
//
// For each event whose type is enabled it calls childAdded (type 1),
// childRemoved (type 2) or childUpdated (type 4) with its own moniker as the
// parent and the event's child moniker; other types, and events of another
// class carrying those codes, produce no call. It can accept all three types
// (valid mask 7) and starts with none enabled; its own notifications do
// nothing. Applications normally derive from the facade
// Zel_IEventListenerFolder instead, which owns and registers such a listener.
// Runs on the thread that delivers events, with the hub's lock held.
#ifndef ZEL_EVENTLISTENERFOLDER_H
#define ZEL_EVENTLISTENERFOLDER_H

#include "zel_export.h"
#include "Zel_EventListener.h"
#include "Zel_IIEventListenerFolder.h"

#include <QString>
#include <boost/shared_ptr.hpp>

class ZEL_EXPORT Zel_EventListenerFolder : public Zel_EventListener, public Zel_IIEventListenerFolder
{
public:
    Zel_EventListenerFolder(const Zel_EventListenerFolder& other);
    Zel_EventListenerFolder& operator=(const Zel_EventListenerFolder& other);
    virtual ~Zel_EventListenerFolder();

    // Do nothing here.
    virtual void childAdded(boost::shared_ptr<QString> parentMoniker, boost::shared_ptr<QString> childMoniker) override;
    virtual void childRemoved(boost::shared_ptr<QString> parentMoniker, boost::shared_ptr<QString> childMoniker) override;
    virtual void childUpdated(boost::shared_ptr<QString> parentMoniker, boost::shared_ptr<QString> childMoniker) override;

protected:
    // Mask 0, no session.
    explicit Zel_EventListenerFolder(boost::shared_ptr<QString> moniker);

    virtual void handleEvent(boost::shared_ptr<Zel_Event> event) override;
    // 7: child added, removed and updated.
    virtual const unsigned long getValidEventMask() const override;
};

#endif
