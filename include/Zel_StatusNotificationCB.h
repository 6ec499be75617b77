// Zel_StatusNotificationCB: the application's callback for connection news.
//
// Implement connected() and disconnected(). disconnected() is called when the
// backend has lost its connection to the server and is about to reconnect;
// connected() when the connection is back. Both are called by the delivery of
// a Zel_StatusNotificationRes, on the thread on which the engine delivers
// results; exceptions they throw are discarded. Held by shared pointer by the
// connection listener and by every undelivered notification.
#ifndef ZEL_STATUSNOTIFICATIONCB_H
#define ZEL_STATUSNOTIFICATIONCB_H

#include "zel_export.h"
#include "Orv_ResultsCB.h"

class ZEL_EXPORT Zel_StatusNotificationCB : public Orv_ResultsCB
{
public:
    Zel_StatusNotificationCB();
    Zel_StatusNotificationCB(const Zel_StatusNotificationCB& other);
    virtual ~Zel_StatusNotificationCB();

    // The connection is back.
    virtual void connected() = 0;
    // The connection is lost and will be re-established.
    virtual void disconnected() = 0;

private:
    Zel_StatusNotificationCB& operator=(const Zel_StatusNotificationCB&) = delete;
};

#endif
