// The PostgreSQL server stopped under a listener and started again: the
// listener reports the loss once, keeps trying with its back-off, reports
// its return once and hears notifications again. It takes the test cluster
// away, so it runs alone (RUN_SERIAL).
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

namespace {

class Recorder
{
public:
    PgListener::Handlers handlers()
    {
        PgListener::Handlers handlers;
        handlers.notified = [this](const QByteArray& payload, int) { add("notify:" + payload.toStdString()); };
        handlers.lost = [this](const QString&) { add("lost"); };
        handlers.regained = [this] { add("regained"); };
        return handlers;
    }
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

int cluster(const char* command)
{
    const QByteArray line = qgetenv("ZEL_TEST_POSTGRESQL_SCRIPT") + ' ' + command + " '" + qgetenv("ZEL_TEST_POSTGRESQL_CLUSTER") + '\'';
    return std::system(line.constData());
}

// Starts the server again however the test ends.
struct ResumeAtEnd {
    bool paused = false;
    ~ResumeAtEnd()
    {
        if (paused)
            cluster("resume");
    }
};

} // namespace

TEST(PgListenerRestartThreads, ServerStoppedAndStartedGivesLostThenRegainedOnce)
{
    SKIP_WITHOUT_POSTGRESQL();
    if (qEnvironmentVariableIsEmpty("ZEL_TEST_POSTGRESQL_CLUSTER") || qEnvironmentVariableIsEmpty("ZEL_TEST_POSTGRESQL_SCRIPT"))
        GTEST_SKIP() << "the server cannot be restarted: ZEL_TEST_POSTGRESQL_CLUSTER and ZEL_TEST_POSTGRESQL_SCRIPT are not set "
                        "(run the tests under scripts/with-postgresql.sh)";
    const StoreUrl url = parseStoreUrl(StoreTest::postgresqlUrl());
    Recorder recorder;
    PgListener::Backoff backoff;
    backoff.firstRetryMs = 20;
    backoff.maxRetryMs = 200;
    PgListener listener(url.parameters, QByteArray("zel_test_restart"), recorder.handlers(), backoff);
    listener.start();

    ResumeAtEnd resume;
    ASSERT_EQ(0, cluster("pause"));
    resume.paused = true;
    ASSERT_TRUE(recorder.waitFor("lost"));
    ASSERT_EQ(0, cluster("resume"));
    resume.paused = false;
    ASSERT_TRUE(recorder.waitFor("regained"));

    std::unique_ptr<Connection> sender = openPostgresqlConnection(url);
    sender->exec(QStringLiteral("SELECT pg_notify(?, ?)"), {QStringLiteral("zel_test_restart"), QStringLiteral("back")});
    ASSERT_TRUE(recorder.waitFor("notify:back"));
    EXPECT_EQ((std::vector<std::string>{"lost", "regained", "notify:back"}), recorder.events());
    listener.stop();
}
