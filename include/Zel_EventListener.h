// Zel_EventListener: base of every receiver of change events.
//
// A listener is filed in a session's event hub (Zel_EventCB) under its moniker;
// a null or empty moniker files it under "" and it then hears about every
// node. The hub calls handleEvent() with each event for that moniker; the
// listener decides there, with isEnabled(), whether it wants the event's type.
//
// Masks: the enabled mask holds the event type codes (1, 2, 4, see Zel_Event)
// the listener accepts; getValidEventMask() says which types its kind can
// accept at all. enableEvent()/disableEvent() (or += / -=) change the enabled
// mask only when the argument shares at least one bit with the valid mask,
// and then set or clear every bit of the argument:
//
//     listener->enableEvent(8);   // valid mask 7: ignored
//     listener->enableEvent(9);   // sets 1 and 8
//
// Registration: the hub holds listeners by boost::shared_ptr. A listener built
// with a live session registers itself once a shared pointer owns it:
//
//     boost::shared_ptr<MyListener> listener(new MyListener(moniker, 7, session));
//     listener->registerWithSession();     // or session->RegisterListener(listener)
//     ...
//     listener->unregisterFromSession();   // or session->UnregisterListener(listener)
//
// The constructor cannot register (no shared pointer owns the object yet) and
// the destructor need not unregister: while registered, the hub's reference
// keeps the listener alive, so a listener is only destroyed once no hub holds it.
//
// Threads: handleEvent() runs on the thread that delivers event results, with
// the hub's lock held. The masks may be changed from any thread (atomically).
// The listener refers to its session weakly.
#ifndef ZEL_EVENTLISTENER_H
#define ZEL_EVENTLISTENER_H

#include "zel_export.h"

#include <QString>
#include <boost/enable_shared_from_this.hpp>
#include <boost/shared_ptr.hpp>
#include <boost/weak_ptr.hpp>

#include <atomic>

class Zel_Event;
class Zel_EventCB;
class Zel_Session;

class ZEL_EXPORT Zel_EventListener : public boost::enable_shared_from_this<Zel_EventListener>
{
public:
    // Copies the mask, the session reference and the moniker; the copy is a
    // new object, neither registered nor owned by any shared pointer.
    Zel_EventListener(const Zel_EventListener& other);
    Zel_EventListener& operator=(const Zel_EventListener& other);
    virtual ~Zel_EventListener();

    // Set / clear the type bits when they share a bit with the valid mask;
    // answer the enabled mask in either case.
    unsigned long enableEvent(unsigned long eventType);
    unsigned long disableEvent(unsigned long eventType);
    unsigned long operator+=(unsigned long eventType);
    unsigned long operator-=(unsigned long eventType);

    // Registers this listener with the session given at construction. Call it
    // once a boost::shared_ptr owns the listener. False (nothing done) when no
    // shared pointer owns it yet or the session is null or gone.
    bool registerWithSession();
    // Unregisters this listener from that session; false when no shared
    // pointer owns it or the session is null or gone.
    bool unregisterFromSession();

protected:
    // Stores the mask unchanged, the session weakly and the moniker.
    Zel_EventListener(boost::shared_ptr<QString> moniker, unsigned long enabledMask,
                      boost::shared_ptr<Zel_Session> session);

    // Receives an event from the hub (never a null one).
    virtual void handleEvent(boost::shared_ptr<Zel_Event> event) = 0;
    // The key the hub files this listener under.
    virtual boost::shared_ptr<QString> getMoniker();
    // False for a null event, else whether its type shares a bit with the enabled mask.
    virtual bool isEnabled(boost::shared_ptr<Zel_Event> event) const;
    // The event types this kind of listener can accept at all.
    virtual const unsigned long getValidEventMask() const = 0;

    // The session given at construction, if it still lives.
    boost::shared_ptr<Zel_Session> getSessionSP() const;

private:
    friend class Zel_EventCB;

    virtual const unsigned long getEnabledEventMask() const;

    bool isEnabledEventType(unsigned long eventType) const;
    bool isValidEventType(unsigned long eventType) const;

    std::atomic<unsigned long> mEnabledMask;
    boost::weak_ptr<Zel_Session> mSession;
    boost::shared_ptr<QString> mMoniker;
};

#endif
