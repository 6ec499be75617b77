#include "Zel_EventRes.h"

#include "Zel_Event.h"
#include "Zel_EventCB.h"

#include <cxxabi.h>

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
        mHub->handleEvent(mEvent);
    } catch (abi::__forced_unwind&) {
        // Thread cancellation or pthread_exit: the thread must unwind.
        throw;
    } catch (...) {
        // Delivery problems stay here; the engine goes on with the next result.
    }
    return false;
}
