// Zel_StatusNotificationRes: one piece of connection news on its way to the
// application's Zel_StatusNotificationCB.
//
// Made by Zel_ConnectionListener and pushed onto the engine's result queue.
// One deliverNext() call calls connected() for a Connected notification,
// disconnected() for a Disconnected one and nothing for any other value;
// it always answers false and discards exceptions from the handler (the
// unwinding of a thread that is cancelled or calls pthread_exit passes through).
#ifndef ZEL_STATUSNOTIFICATIONRES_H
#define ZEL_STATUSNOTIFICATIONRES_H

#include "zel_export.h"
#include "Orv_Result.h"

#include <boost/shared_ptr.hpp>

#include <cstdint>

class Zel_StatusNotificationCB;

class ZEL_EXPORT Zel_StatusNotificationRes : public Orv_Result
{
public:
    enum NotificationType : std::int32_t {
        Connected = 1,    // the connection is back
        Disconnected = 2  // the connection is lost and will be re-established
    };

    Zel_StatusNotificationRes(boost::shared_ptr<Zel_StatusNotificationCB> callback, NotificationType type);
    Zel_StatusNotificationRes(const Zel_StatusNotificationRes& other);
    Zel_StatusNotificationRes& operator=(const Zel_StatusNotificationRes& other);
    virtual ~Zel_StatusNotificationRes();

    // Calls the handler of the notification's type; answers false.
    virtual bool deliverNext() override;

protected:
    virtual bool isConnectedResult();
    virtual bool isDisconnectedResult();

private:
    boost::shared_ptr<Zel_StatusNotificationCB> mCallback;
    NotificationType mType;
};

#endif
