#include "Zel_EventListenerFolder.h"

#include "Zel_Event.h"
#include "Zel_EventChildAdded.h"
#include "Zel_EventChildRemoved.h"
#include "Zel_EventChildUpdated.h"

#include <typeinfo>

Zel_EventListenerFolder::Zel_EventListenerFolder(boost::shared_ptr<QString> moniker)
    : Zel_EventListener(std::move(moniker), 0, boost::shared_ptr<Zel_Session>())
{
}

Zel_EventListenerFolder::Zel_EventListenerFolder(const Zel_EventListenerFolder& other) = default;

Zel_EventListenerFolder& Zel_EventListenerFolder::operator=(const Zel_EventListenerFolder& other) = default;

Zel_EventListenerFolder::~Zel_EventListenerFolder() = default;

void Zel_EventListenerFolder::childAdded(boost::shared_ptr<QString>, boost::shared_ptr<QString>)
{
}

void Zel_EventListenerFolder::childRemoved(boost::shared_ptr<QString>, boost::shared_ptr<QString>)
{
}

void Zel_EventListenerFolder::childUpdated(boost::shared_ptr<QString>, boost::shared_ptr<QString>)
{
}

namespace {

// The event as the child event class of its type code, or null when it is of
// another class. The exact class is recognised by its type_info (cheap); a
// class derived from it needs the dynamic_cast.
template <class ChildEvent>
ChildEvent* asChildEvent(Zel_Event& event)
{
    if (&typeid(event) == &typeid(ChildEvent))
        return static_cast<ChildEvent*>(&event);
    return dynamic_cast<ChildEvent*>(&event);
}

} // namespace

void Zel_EventListenerFolder::handleEvent(boost::shared_ptr<Zel_Event> event)
{
    if (!event)
        return;
    const unsigned long type = event->getEventType();
    if (!isEnabled(event))
        return;

    // The child moniker is read from the matching event class only: an event
    // of another class that carries one of these codes produces no call.
    Zel_IIEventListenerFolder& folder = *this;
    switch (type) {
    case 1:
        if (Zel_EventChildAdded* added = asChildEvent<Zel_EventChildAdded>(*event))
            folder.childAdded(getMoniker(), added->getChildMoniker());
        break;
    case 2:
        if (Zel_EventChildRemoved* removed = asChildEvent<Zel_EventChildRemoved>(*event))
            folder.childRemoved(getMoniker(), removed->getChildMoniker());
        break;
    case 4:
        if (Zel_EventChildUpdated* updated = asChildEvent<Zel_EventChildUpdated>(*event))
            folder.childUpdated(getMoniker(), updated->getChildMoniker());
        break;
    default:
        break;
    }
}

const unsigned long Zel_EventListenerFolder::getValidEventMask() const
{
    return 7;
}
