#include "Zel_ConnectionListener.h"

#include "Orv_ResultQ.h"
#include "Zel_StatusNotificationCB.h"
#include "Zel_StatusNotificationRes.h"

Zel_ConnectionListener::Zel_ConnectionListener(boost::shared_ptr<Zel_StatusNotificationCB> callback,
                                               boost::shared_ptr<Orv_ResultQ> resultQ)
    : mCallback(std::move(callback))
    , mResultQ(std::move(resultQ))
{
}

Zel_ConnectionListener::Zel_ConnectionListener(const Zel_ConnectionListener& other) = default;

Zel_ConnectionListener& Zel_ConnectionListener::operator=(const Zel_ConnectionListener& other) = default;

Zel_ConnectionListener::~Zel_ConnectionListener() = default;

void Zel_ConnectionListener::ConnectionWillReconnect()
{
    sendConnectedNotification(false);
}

void Zel_ConnectionListener::ConnectionReconnected()
{
    sendConnectedNotification(true);
}

void Zel_ConnectionListener::sendConnectedNotification(bool connected)
{
    const Zel_StatusNotificationRes::NotificationType type =
        connected ? Zel_StatusNotificationRes::Connected : Zel_StatusNotificationRes::Disconnected;
    if (!mCallback || !mResultQ)
        return;
    mResultQ->Push(boost::shared_ptr<Orv_Result>(new Zel_StatusNotificationRes(mCallback, type)));
}

boost::shared_ptr<Zel_StatusNotificationCB> Zel_ConnectionListener::getStatusNotificationCBSP()
{
    return mCallback;
}

boost::shared_ptr<Orv_ResultQ> Zel_ConnectionListener::getResultQSP()
{
    return mResultQ;
}
