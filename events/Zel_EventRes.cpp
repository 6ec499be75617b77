#include "Zel_EventRes.h"

#include "Zel_Event.h"
#include "Zel_EventCB.h"

#include <exception>

Zel_EventRes::Zel_EventRes(boost::shared_ptr<Zel_EventCB> hub, boost::shared_ptr<Zel_Event> event)
    : Orv_Result(hub, false)
    , mHub(std::move(hub))
    , mEvent(std::move(event))
{
}

Zel_EventRes::Zel_EventRes(const Zel_EventRes& other) = default;

Zel_EventRes& Zel_EventRes::operator=(const Zel_EventRes& other) = default;

Zel_EventRes::~Zel_EventRes() = default;

bool Zel_EventRes::deliverNext()
{
    if (!mHub)
        return false;
    try {
        mHub->deliver(mEvent);
    } catch (...) {
        // Delivery problems stay here; the engine goes on with the next result.
        // The unwinding of a thread that is cancelled or calls pthread_exit
        // (abi::__forced_unwind) must go on; it carries no C++ object, so
        // current_exception() is empty for it.
        if (!std::current_exception())
            throw;
    }
    return false;
}
