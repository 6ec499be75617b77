// Zel_EventChildAdded: a child of a node was added (type code 1).
//
// Holds the parent's moniker (the event's moniker) and the child's moniker;
// either may be null. Made by Zel_NodeListener::NodeAdded.
// Rendering for the trace log, with "" for a null moniker:
//
//     Zel_EventChildAdded parent: <parent> child: <child>
//
// Immutable; copies share both strings.
#ifndef ZEL_EVENTCHILDADDED_H
#define ZEL_EVENTCHILDADDED_H

#include "zel_export.h"
#include "Zel_Event.h"

#include <QString>
#include <boost/shared_ptr.hpp>

class ZEL_EXPORT Zel_EventChildAdded : public Zel_Event
{
public:
    Zel_EventChildAdded(boost::shared_ptr<QString> parentMoniker, boost::shared_ptr<QString> childMoniker);
    Zel_EventChildAdded(const Zel_EventChildAdded& other);
    virtual ~Zel_EventChildAdded();

    virtual QString toZelString() override;
    // Always 1.
    virtual const unsigned long getEventType() const override;
    // The moniker of the child (the string is shared).
    virtual boost::shared_ptr<QString> getChildMoniker();

private:
    // The hub reads the child of this exact class without a copy.
    friend class Zel_EventCB;

    Zel_EventChildAdded& operator=(const Zel_EventChildAdded&) = delete;

    boost::shared_ptr<QString> mChildMoniker;
};

#endif
