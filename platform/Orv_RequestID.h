// Orv_RequestID: the engine's identifier of a request or callback.
//
// It holds one signed 32-bit value. Callbacks are built with the type
// Callback (-2), a session's own identifier with Session (0); every request
// gets a fresh positive number from next(), which is its number in trace lines.
// After 2^31 - 1 requests the numbers start again at 1: a request's number is
// never one of the values above. A plain copyable value; next() is thread-safe.
#ifndef ORV_REQUESTID_H
#define ORV_REQUESTID_H

#include "zel_platform_export.h"

#include <cstdint>

class ZEL_PLATFORM_EXPORT Orv_RequestID
{
public:
    // Any 32-bit value may be held; the named ones are the engine's own.
    enum RequestType : std::int32_t {
        Callback = -2,
        Invalid = -1,
        Session = 0
    };

    explicit Orv_RequestID(RequestType type = Invalid);
    Orv_RequestID(const Orv_RequestID& other) = default;
    Orv_RequestID& operator=(const Orv_RequestID& other) = default;
    virtual ~Orv_RequestID();

    // The 32-bit value.
    std::int32_t getValue() const { return mValue; }

    bool operator==(const Orv_RequestID& other) const { return mValue == other.mValue; }
    bool operator!=(const Orv_RequestID& other) const { return mValue != other.mValue; }

    // A new identifier for a request: 1, 2, 3, ... in the order of the calls,
    // up to 2^31 - 1, then 1 again.
    static Orv_RequestID next();

private:
    // Tests of the wrap-around reach the sequence through this friend.
    friend struct Orv_RequestIDTestAccess;
    // Makes value (1 .. 2^31 - 1) the next one next() hands out; returns the
    // one it would have handed out.
    static std::int32_t restartAt(std::int32_t value);

    std::int32_t mValue;
};

#endif
