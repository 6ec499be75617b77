#include "Zel_StatusNotificationRes.h"

#include "Zel_StatusNotificationCB.h"

#include <exception>

Zel_StatusNotificationRes::Zel_StatusNotificationRes(boost::shared_ptr<Zel_StatusNotificationCB> callback,
                                                     NotificationType type)
    : Orv_Result(callback, false)
    , mCallback(std::move(callback))
    , mType(type)
{
}

Zel_StatusNotificationRes::Zel_StatusNotificationRes(const Zel_StatusNotificationRes& other) = default;

Zel_StatusNotificationRes& Zel_StatusNotificationRes::operator=(const Zel_StatusNotificationRes& other) = default;

Zel_StatusNotificationRes::~Zel_StatusNotificationRes() = default;

bool Zel_StatusNotificationRes::deliverNext()
{
    if (!mCallback)
        return false;
    try {
        if (isConnectedResult())
            mCallback->connected();
        else if (isDisconnectedResult())
            mCallback->disconnected();
    } catch (...) {
        // The application's handler failed; the notification counts as delivered.
        // The unwinding of a thread that is cancelled or calls pthread_exit
        // (abi::__forced_unwind) must go on; it carries no C++ object, so
        // current_exception() is empty for it.
        if (!std::current_exception())
            throw;
    }
    return false;
}

bool Zel_StatusNotificationRes::isConnectedResult()
{
    return mType == Connected;
}

bool Zel_StatusNotificationRes::isDisconnectedResult()
{
    return mType == Disconnected;
}
