// Internal: hears a PostgreSQL notification channel on a connection of its own.
//
// A PgListener opens its own libpq connection (not Qt SQL's: the driver does
// not hand out notification payloads in order with their sender, nor notice a
// dropped connection while idle), runs LISTEN on the channel and waits on the
// connection's socket and a wake-up pipe in a thread of its own. It calls
//   notified(payload, senderPid)  for each notification, in the order the
//                                 server sends them: commit order of the
//                                 notifying transactions; senderPid is the
//                                 server process of the sending connection
//                                 (a session skips its own by it);
//   lost(reason)                  once when the connection drops;
//   regained()                    once when it is back and listening again;
// all on the listener's thread, one at a time. After a loss it reconnects
// with a bounded back-off (first wait firstRetryMs, doubling up to
// maxRetryMs). Notifications sent while it was away are not replayed by the
// server: the owner catches up from the change journal on regained().
//
// start() connects on the calling thread and throws StoreError when it
// cannot; stop() (also the destructor) wakes the thread and waits for it:
// after it returns no handler is called. Never call stop() from a handler.
#ifndef PG_LISTENER_P_H
#define PG_LISTENER_P_H

#include <QByteArray>
#include <QList>
#include <QPair>
#include <QString>

#include <functional>
#include <memory>

namespace ZelSql {

struct PgListenerHandlers {
    std::function<void(const QByteArray& payload, int senderPid)> notified;
    std::function<void(const QString& reason)> lost;
    std::function<void()> regained;
};

struct PgListenerBackoff {
    int firstRetryMs = 50;
    int maxRetryMs = 2000;
};

class PgListener
{
public:
    using Handlers = PgListenerHandlers;
    using Backoff = PgListenerBackoff;

    // parameters: libpq keywords and values (StoreUrl::parameters).
    PgListener(const QList<QPair<QString, QString>>& parameters, const QByteArray& channel, Handlers handlers,
               Backoff backoff = Backoff());
    ~PgListener();

    void start();
    void stop();

private:
    PgListener(const PgListener&) = delete;
    PgListener& operator=(const PgListener&) = delete;

    struct Private;
    std::unique_ptr<Private> d;
};

} // namespace ZelSql

#endif
