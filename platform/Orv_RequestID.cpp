#include "Orv_RequestID.h"

#include <atomic>
#include <limits>

Orv_RequestID::Orv_RequestID(RequestType type)
    : mValue(static_cast<std::int32_t>(type))
{
}

Orv_RequestID::~Orv_RequestID() = default;

namespace {

// Identifiers handed out so far. A request's identifier is positive: the
// count runs through 1 .. 2^31 - 1 and then starts again at 1, so that it
// never wraps into the engine's own values (Callback, Invalid, Session).
std::atomic<std::uint64_t> issued{0};
const std::uint64_t positiveValues = static_cast<std::uint64_t>(std::numeric_limits<std::int32_t>::max());

std::int32_t valueOf(std::uint64_t count)
{
    return static_cast<std::int32_t>(count % positiveValues) + 1;
}

} // namespace

Orv_RequestID Orv_RequestID::next()
{
    return Orv_RequestID(static_cast<RequestType>(valueOf(issued.fetch_add(1, std::memory_order_relaxed))));
}

std::int32_t Orv_RequestID::restartAt(std::int32_t value)
{
    const std::uint64_t count = value > 0 ? static_cast<std::uint64_t>(value) - 1 : 0;
    return valueOf(issued.exchange(count, std::memory_order_relaxed));
}
