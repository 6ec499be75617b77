// Zel_EventRes: a change event on its way to an event hub.
//
// Node listeners wrap each event in an event result and push it onto the
// engine's result queue; when the engine delivers the result, deliverNext()
// hands the event to the hub, which passes it on to its listeners. The result
// names the hub to the engine as its callback and holds it, so the hub lives
// at least as long as an undelivered event. One deliverNext() call delivers
// the event; it always answers false. Exceptions are caught and discarded,
// except the unwinding of a thread that is cancelled or calls pthread_exit.
#ifndef ZEL_EVENTRES_H
#define ZEL_EVENTRES_H

#include "zel_export.h"
#include "Orv_Result.h"

#include <boost/shared_ptr.hpp>

class Zel_Event;
class Zel_EventCB;

class ZEL_EXPORT Zel_EventRes : public Orv_Result
{
public:
    Zel_EventRes(boost::shared_ptr<Zel_EventCB> hub, boost::shared_ptr<Zel_Event> event);
    Zel_EventRes(const Zel_EventRes& other);
    Zel_EventRes& operator=(const Zel_EventRes& other);
    virtual ~Zel_EventRes();

    // Hands the event to the hub (nothing without a hub); answers false.
    virtual bool deliverNext() override;

private:
    boost::shared_ptr<Zel_EventCB> mHub;
    boost::shared_ptr<Zel_Event> mEvent;
};

#endif
