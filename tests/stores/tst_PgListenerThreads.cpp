// The PostgreSQL notification listener against a real server: committed
// notifications arrive once each, in commit order, with their sender; rolled
// back ones never; a dropped connection is reported once, then its return;
// a stopped listener calls nothing more.
#include "StoreTestSupport.h"

#include "pg_connection_p.h"
#include "pg_listener_p.h"

#include <chrono>
#include <condition_variable>
#include <cstdlib>
#include <mutex>
#include <string>
#include <vector>

using namespace ZelSql;
using StoreTest::str;

namespace {

const QByteArray Channel("zel_test_changes");

// What a listener reported, in order: "notify:PAYLOAD@PID", "lost", "regained".
class Recorder
{
public:
    PgListener::Handlers handlers()
    {
        PgListener::Handlers handlers;
        handlers.notified = [this](const QByteArray& payload, int pid) {
            add("notify:" + payload.toStdString() + "@" + std::to_string(pid));
        };
        handlers.lost = [this](const QString&) { add("lost"); };
        handlers.regained = [this] { add("regained"); };
        return handlers;
    }

    // Waits until an event equal to event has been recorded; false when it
    // has not come after a minute (a guard against hanging, not a timing).
    bool waitFor(const std::string& event)
    {
        std::unique_lock<std::mutex> lock(mMutex);
        return mChanged.wait_for(lock, std::chrono::minutes(1), [&] {
            for (const std::string& seen : mEvents) {
                if (seen == event)
                    return true;
            }
            return false;
        });
    }

    std::vector<std::string> events()
    {
        std::lock_guard<std::mutex> lock(mMutex);
        return mEvents;
    }

private:
    void add(const std::string& event)
    {
        std::lock_guard<std::mutex> lock(mMutex);
        mEvents.push_back(event);
        mChanged.notify_all();
    }

    std::mutex mMutex;
    std::condition_variable mChanged;
    std::vector<std::string> mEvents;
};

void notify(Connection& connection, const QString& payload)
{
    connection.exec(QStringLiteral("SELECT pg_notify(?, ?)"), {QString::fromLatin1(Channel), payload});
}

std::string pidOf(Connection& connection)
{
    return connection.value(QStringLiteral("SELECT pg_backend_pid()")).toString().toStdString();
}

PgListener::Backoff quickBackoff()
{
    PgListener::Backoff backoff;
    backoff.firstRetryMs = 20;
    backoff.maxRetryMs = 200;
    return backoff;
}

// The server process of the listener's connection.
qint64 listenerPid(Connection& connection, const QString& database)
{
    return connection
        .value(QStringLiteral("SELECT pid FROM pg_stat_activity WHERE datname = ? AND query LIKE 'LISTEN%'"), {database})
        .toLongLong();
}

} // namespace

TEST(PgListenerThreads, DeliversCommittedNotificationsOnceInCommitOrder)
{
    SKIP_WITHOUT_POSTGRESQL();
    StoreTest::ScratchDatabase scratch;
    Recorder recorder;
    PgListener listener(scratch.url().parameters, Channel, recorder.handlers(), quickBackoff());
    listener.start();
    std::unique_ptr<Connection> one = openPostgresqlConnection(scratch.url());
    std::unique_ptr<Connection> two = openPostgresqlConnection(scratch.url());
    const std::string pidOne = pidOf(*one);
    const std::string pidTwo = pidOf(*two);

    one->exec(QStringLiteral("BEGIN"));
    notify(*one, QStringLiteral("a"));
    notify(*one, QStringLiteral("b"));
    one->commit();

    one->exec(QStringLiteral("BEGIN"));
    notify(*one, QStringLiteral("rolled back"));
    one->rollback();

    // Begun first, committed last: heard last.
    one->exec(QStringLiteral("BEGIN"));
    notify(*one, QStringLiteral("p"));
    two->exec(QStringLiteral("BEGIN"));
    notify(*two, QStringLiteral("q"));
    two->commit();
    one->commit();

    notify(*two, QStringLiteral("c"));
    notify(*one, QStringLiteral("end"));
    ASSERT_TRUE(recorder.waitFor("notify:end@" + pidOne));
    const std::vector<std::string> expected{"notify:a@" + pidOne, "notify:b@" + pidOne, "notify:q@" + pidTwo,
                                            "notify:p@" + pidOne, "notify:c@" + pidTwo, "notify:end@" + pidOne};
    EXPECT_EQ(expected, recorder.events());

    // Stopped, it hears nothing more: a second listener hears what follows.
    listener.stop();
    Recorder second;
    PgListener witness(scratch.url().parameters, Channel, second.handlers(), quickBackoff());
    witness.start();
    notify(*one, QStringLiteral("after stop"));
    ASSERT_TRUE(second.waitFor("notify:after stop@" + pidOne));
    EXPECT_EQ(expected, recorder.events());
}

TEST(PgListenerThreads, ReportsALostConnectionOnceAndListensAgainAfterReconnecting)
{
    SKIP_WITHOUT_POSTGRESQL();
    StoreTest::ScratchDatabase scratch;
    Recorder recorder;
    PgListener listener(scratch.url().parameters, Channel, recorder.handlers(), quickBackoff());
    listener.start();
    std::unique_ptr<Connection> admin = openPostgresqlConnection(scratch.url());
    const std::string pid = pidOf(*admin);

    const qint64 victim = listenerPid(*admin, scratch.name());
    ASSERT_NE(0, victim);
    EXPECT_TRUE(admin->value(QStringLiteral("SELECT pg_terminate_backend(?)"), {victim}).toBool());
    ASSERT_TRUE(recorder.waitFor("regained"));
    notify(*admin, QStringLiteral("back"));
    ASSERT_TRUE(recorder.waitFor("notify:back@" + pid));
    EXPECT_EQ((std::vector<std::string>{"lost", "regained", "notify:back@" + pid}), recorder.events());
    EXPECT_NE(victim, listenerPid(*admin, scratch.name()));
}

TEST(PgListenerThreads, StartNamesWhatWasWrong)
{
    SKIP_WITHOUT_POSTGRESQL();
    Recorder recorder;
    const StoreUrl missing = StoreTest::urlOfDatabase(QStringLiteral("no_such_zel_store"));
    PgListener listener(missing.parameters, Channel, recorder.handlers(), quickBackoff());
    const StoreError error = StoreTest::storeErrorOf([&] { listener.start(); });
    EXPECT_EQ(StoreError::LoginRefused, error.kind()) << error.what();
    EXPECT_EQ(0, error.message().indexOf(QStringLiteral("PostgreSQL server %1 has no database \"no_such_zel_store\" (")
                                             .arg(postgresqlServerName(missing.parameters))))
        << error.what();
    listener.stop(); // never started: nothing to stop
    EXPECT_TRUE(recorder.events().empty());
}
