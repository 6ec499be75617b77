// Zel_EventChildUpdated: a child of a node was updated (type code 4).
//
// Holds the parent's moniker (the event's moniker) and the child's moniker;
// either may be null. Nothing in the library makes it; the backend or the application may.
// Rendering for the trace log, with "" for a null moniker:
//
//     Zel_EventChildUpdated parent: <parent> child: <child>
//
// Immutable; copies share both strings.
#ifndef ZEL_EVENTCHILDUPDATED_H
#define ZEL_EVENTCHILDUPDATED_H

#include "zel_export.h"
#include "Zel_Event.h"

#include <QString>
#include <boost/shared_ptr.hpp>

class ZEL_EXPORT Zel_EventChildUpdated : public Zel_Event
{
public:
    Zel_EventChildUpdated(boost::shared_ptr<QString> parentMoniker, boost::shared_ptr<QString> childMoniker);
    Zel_EventChildUpdated(const Zel_EventChildUpdated& other);
    virtual ~Zel_EventChildUpdated();

    virtual QString toZelString() override;
    // Always 4.
    virtual const unsigned long getEventType() const override;
    // The moniker of the child (the string is shared).
    virtual boost::shared_ptr<QString> getChildMoniker();

private:
    // The hub reads the child of this exact class without a copy.
    friend class Zel_EventCB;

    Zel_EventChildUpdated& operator=(const Zel_EventChildUpdated&) = delete;

    boost::shared_ptr<QString> mChildMoniker;
};

#endif
