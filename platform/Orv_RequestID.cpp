#include "Orv_RequestID.h"

#include <atomic>

Orv_RequestID::Orv_RequestID(RequestType type)
    : mValue(static_cast<std::int32_t>(type))
{
}

Orv_RequestID::~Orv_RequestID() = default;

Orv_RequestID Orv_RequestID::next()
{
    static std::atomic<std::int32_t> counter{0};
    return Orv_RequestID(static_cast<RequestType>(counter.fetch_add(1, std::memory_order_relaxed) + 1));
}
