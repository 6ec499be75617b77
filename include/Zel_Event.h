// Zel_Event: base of the change events that tell listeners a folder changed.
//
// An event names the node whose children changed by its moniker (which may be
// null); the concrete events (Zel_EventChildAdded, Zel_EventChildRemoved,
// Zel_EventChildUpdated) also name the child. Each kind has a single-bit type
// code, so listeners keep the types they accept as a mask:
//
//     1  child added      2  child removed      4  child updated
//
// Events are immutable once built and travel as boost::shared_ptr<Zel_Event>;
// copies share the moniker strings. They may be read from any thread.
#ifndef ZEL_EVENT_H
#define ZEL_EVENT_H

#include "zel_export.h"

#include <QString>
#include <boost/shared_ptr.hpp>

class ZEL_EXPORT Zel_Event
{
public:
    Zel_Event(const Zel_Event& other);
    virtual ~Zel_Event();

    // "Zel_Event" here; the concrete events render their monikers.
    virtual QString toZelString();
    // The event's single-bit type code.
    virtual const unsigned long getEventType() const = 0;
    // The moniker of the node whose children changed (the string is shared).
    virtual const boost::shared_ptr<QString> getMonikerSP() const;

protected:
    explicit Zel_Event(boost::shared_ptr<QString> moniker);

private:
    // The hub reads the moniker of the library's own events without a copy.
    friend class Zel_EventCB;

    Zel_Event& operator=(const Zel_Event&) = delete;

    boost::shared_ptr<QString> mMoniker;
};

#endif
