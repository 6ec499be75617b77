#include "pg_listener_p.h"

#include "pg_connection_p.h"
#include "sql_error_p.h"

#include <libpq-fe.h>

#include <cerrno>
#include <fcntl.h>
#include <poll.h>
#include <thread>
#include <unistd.h>
#include <vector>

namespace ZelSql {

namespace {

// How long one connection attempt may take before it counts as failed.
const int ConnectTimeoutMs = 10000;

// Parameters that make a dead TCP peer show up as a lost connection within
// seconds rather than hours; a URL that sets them keeps its own.
const char* const KeepaliveDefaults[][2] = {
    {"keepalives", "1"}, {"keepalives_idle", "5"}, {"keepalives_interval", "2"}, {"keepalives_count", "3"}};

// The server's notices (such as the reason it gives when it ends the
// connection) are the owner's business through lost(), not stderr's.
void ignoreNotice(void*, const char*)
{
}

QString libpqError(PGconn* connection)
{
    return connection ? QString::fromUtf8(PQerrorMessage(connection)).trimmed() : QStringLiteral("out of memory");
}

} // namespace

struct PgListener::Private {
    std::vector<QByteArray> keys;
    std::vector<QByteArray> values;
    QList<QPair<QString, QString>> parameters;
    QByteArray channel;
    Handlers handlers;
    Backoff backoff;
    PGconn* connection = nullptr;
    int wakeRead = -1;
    int wakeWrite = -1;
    std::thread thread;

    enum Outcome { Connected, Failed, Woken };

    // Waits until fd is ready for events or the wake pipe is written, at
    // most timeoutMs (-1: no limit). Answers the fd's revents, 0 on timeout,
    // -1 when woken.
    int wait(int fd, short events, int timeoutMs)
    {
        pollfd fds[2] = {{fd, events, 0}, {wakeRead, POLLIN, 0}};
        const int count = fd >= 0 ? 2 : 1;
        pollfd* first = fd >= 0 ? fds : fds + 1;
        for (;;) {
            const int ready = poll(first, count, timeoutMs);
            if (ready < 0 && errno == EINTR)
                continue;
            if (ready <= 0)
                return 0;
            if (fds[1].revents)
                return -1;
            return fds[0].revents;
        }
    }

    // Connects and LISTENs; reason holds libpq's message on failure.
    Outcome connect(QString& reason)
    {
        std::vector<const char*> keyPointers;
        std::vector<const char*> valuePointers;
        for (std::size_t i = 0; i < keys.size(); ++i) {
            keyPointers.push_back(keys[i].constData());
            valuePointers.push_back(values[i].constData());
        }
        keyPointers.push_back(nullptr);
        valuePointers.push_back(nullptr);
        PGconn* attempt = PQconnectStartParams(keyPointers.data(), valuePointers.data(), 0);
        if (!attempt || PQstatus(attempt) == CONNECTION_BAD) {
            reason = libpqError(attempt);
            PQfinish(attempt);
            return Failed;
        }
        PQsetNoticeProcessor(attempt, ignoreNotice, nullptr);
        PostgresPollingStatusType status = PGRES_POLLING_WRITING;
        while (status != PGRES_POLLING_OK) {
            if (status == PGRES_POLLING_FAILED) {
                reason = libpqError(attempt);
                PQfinish(attempt);
                return Failed;
            }
            const int ready = wait(PQsocket(attempt), status == PGRES_POLLING_READING ? POLLIN : POLLOUT, ConnectTimeoutMs);
            if (ready < 0) {
                PQfinish(attempt);
                return Woken;
            }
            if (ready == 0) {
                reason = QStringLiteral("timeout expired after %1 ms").arg(ConnectTimeoutMs);
                PQfinish(attempt);
                return Failed;
            }
            status = PQconnectPoll(attempt);
        }
        char* identifier = PQescapeIdentifier(attempt, channel.constData(), size_t(channel.size()));
        if (!identifier) {
            reason = libpqError(attempt);
            PQfinish(attempt);
            return Failed;
        }
        const QByteArray listen = QByteArray("LISTEN ") + static_cast<const char*>(identifier);
        PQfreemem(identifier);
        PGresult* result = PQexec(attempt, listen.constData());
        const bool listening = PQresultStatus(result) == PGRES_COMMAND_OK;
        PQclear(result);
        if (!listening) {
            reason = libpqError(attempt);
            PQfinish(attempt);
            return Failed;
        }
        PQsetnonblocking(attempt, 1);
        connection = attempt;
        return Connected;
    }

    void deliverNotifications()
    {
        while (PGnotify* notification = PQnotifies(connection)) {
            const QByteArray payload(notification->extra);
            const int sender = notification->be_pid;
            PQfreemem(notification);
            if (handlers.notified)
                handlers.notified(payload, sender);
        }
    }

    void drop()
    {
        PQfinish(connection);
        connection = nullptr;
    }

    void run()
    {
        int retryMs = backoff.firstRetryMs;
        for (;;) {
            if (connection) {
                const int ready = wait(PQsocket(connection), POLLIN, -1);
                if (ready < 0)
                    return;
                if (!PQconsumeInput(connection) || PQstatus(connection) == CONNECTION_BAD) {
                    const QString reason = libpqError(connection);
                    drop();
                    retryMs = backoff.firstRetryMs;
                    if (handlers.lost)
                        handlers.lost(reason);
                    continue;
                }
                deliverNotifications();
            } else {
                if (wait(-1, 0, retryMs) < 0)
                    return;
                QString reason;
                const Outcome outcome = connect(reason);
                if (outcome == Woken)
                    return;
                if (outcome == Failed) {
                    retryMs = std::min(retryMs * 2, backoff.maxRetryMs);
                    continue;
                }
                retryMs = backoff.firstRetryMs;
                if (handlers.regained)
                    handlers.regained();
                deliverNotifications();
            }
        }
    }
};

PgListener::PgListener(const QList<QPair<QString, QString>>& parameters, const QByteArray& channel, Handlers handlers,
                       Backoff backoff)
    : d(new Private)
{
    d->parameters = parameters;
    d->channel = channel;
    d->handlers = std::move(handlers);
    d->backoff = backoff;
    for (const auto& parameter : parameters) {
        d->keys.push_back(parameter.first.toUtf8());
        d->values.push_back(parameter.second.toUtf8());
    }
    for (const auto& keepalive : KeepaliveDefaults) {
        bool given = false;
        for (const auto& parameter : parameters)
            given = given || parameter.first == QLatin1String(keepalive[0]);
        if (!given) {
            d->keys.push_back(keepalive[0]);
            d->values.push_back(keepalive[1]);
        }
    }
}

PgListener::~PgListener()
{
    stop();
}

void PgListener::start()
{
    if (d->thread.joinable())
        return;
    int pipeEnds[2];
    if (pipe2(pipeEnds, O_CLOEXEC | O_NONBLOCK) != 0)
        throw StoreError(StoreError::Internal, QStringLiteral("PostgreSQL listener: cannot make a wake-up pipe"));
    d->wakeRead = pipeEnds[0];
    d->wakeWrite = pipeEnds[1];
    QString reason;
    if (d->connect(reason) != Private::Connected) {
        close(d->wakeRead);
        close(d->wakeWrite);
        d->wakeRead = d->wakeWrite = -1;
        throw postgresqlConnectError(d->parameters, reason);
    }
    d->thread = std::thread([this] { d->run(); });
}

void PgListener::stop()
{
    if (!d->thread.joinable())
        return;
    const char byte = 0;
    while (write(d->wakeWrite, &byte, 1) < 0 && errno == EINTR) {
    }
    d->thread.join();
    if (d->connection)
        d->drop();
    close(d->wakeRead);
    close(d->wakeWrite);
    d->wakeRead = d->wakeWrite = -1;
}

} // namespace ZelSql
