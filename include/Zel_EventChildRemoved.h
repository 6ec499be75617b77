// Zel_EventChildRemoved: a child of a node was removed (type code 2).
//
// Holds the parent's moniker (the event's moniker) and the child's moniker;
// either may be null. Made by Zel_NodeListener::NodeRemoved.
// Rendering for the trace log, with "" for a null moniker:
//
//     Zel_EventChildRemoved parent: <parent> child: <child>
//
// Immutable; copies share both strings.
#ifndef ZEL_EVENTCHILDREMOVED_H
#define ZEL_EVENTCHILDREMOVED_H

#include "zel_export.h"
#include "Zel_Event.h"

#include <QString>
#include <boost/shared_ptr.hpp>

class ZEL_EXPORT Zel_EventChildRemoved : public Zel_Event
{
public:
    Zel_EventChildRemoved(boost::shared_ptr<QString> parentMoniker, boost::shared_ptr<QString> childMoniker);
    Zel_EventChildRemoved(const Zel_EventChildRemoved& other);
    virtual ~Zel_EventChildRemoved();

    virtual QString toZelString() override;
    // Always 2.
    virtual const unsigned long getEventType() const override;
    // The moniker of the child (the string is shared).
    virtual boost::shared_ptr<QString> getChildMoniker();

private:
    // The hub reads the child of this exact class without a copy.
    friend class Zel_EventCB;

    Zel_EventChildRemoved& operator=(const Zel_EventChildRemoved&) = delete;

    boost::shared_ptr<QString> mChildMoniker;
};

#endif
