// Zel_ConnectionListener: where the backend reports the state of its
// connection to the server.
//
// ConnectionWillReconnect() (the connection is lost, a reconnection follows)
// and ConnectionReconnected() each push one Zel_StatusNotificationRes onto the
// engine's result queue; its delivery calls disconnected() or connected() on
// the application's Zel_StatusNotificationCB, in the order the engine
// delivers them. A null callback or queue drops the news. The listener does
// not touch the session's connection flags. No lock; any thread.
#ifndef ZEL_CONNECTIONLISTENER_H
#define ZEL_CONNECTIONLISTENER_H

#include "zel_export.h"

#include <boost/shared_ptr.hpp>

class Orv_ResultQ;
class Zel_StatusNotificationCB;

class ZEL_EXPORT Zel_ConnectionListener
{
public:
    Zel_ConnectionListener(boost::shared_ptr<Zel_StatusNotificationCB> callback,
                           boost::shared_ptr<Orv_ResultQ> resultQ);
    Zel_ConnectionListener(const Zel_ConnectionListener& other);
    Zel_ConnectionListener& operator=(const Zel_ConnectionListener& other);
    // Not virtual: do not delete a derived connection listener through this class.
    ~Zel_ConnectionListener();

    // The connection is lost and is about to be re-established.
    void ConnectionWillReconnect();
    // The connection is back.
    void ConnectionReconnected();

private:
    // Pushes a Connected (true) or Disconnected (false) notification.
    virtual void sendConnectedNotification(bool connected);

    boost::shared_ptr<Zel_StatusNotificationCB> getStatusNotificationCBSP();
    boost::shared_ptr<Orv_ResultQ> getResultQSP();

    boost::shared_ptr<Zel_StatusNotificationCB> mCallback;
    boost::shared_ptr<Orv_ResultQ> mResultQ;
};

#endif
