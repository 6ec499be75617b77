// The trace log used from several threads at once.
#include "TraceCapture.h"

#include "Zel_Debug.h"

#include <QString>

#include <gtest/gtest.h>

#include <atomic>
#include <map>
#include <set>
#include <string>
#include <thread>
#include <vector>

TEST(Zel_DebugThreadTest, InstanceIsOneObjectEvenUnderConcurrentFirstCallsAndCopiesAreNotIt)
{
    std::vector<std::thread> threads;
    std::vector<Zel_Debug*> seen(8, nullptr);
    std::atomic<bool> go(false);
    for (int i = 0; i < 8; ++i) {
        threads.emplace_back([&, i] {
            while (!go.load()) {
            }
            seen[i] = Zel_Debug::instance().get();
        });
    }
    go = true;
    for (std::thread& t : threads)
        t.join();
    EXPECT_EQ(std::set<Zel_Debug*>(seen.begin(), seen.end()), std::set<Zel_Debug*>{Zel_Debug::instance().get()});
    EXPECT_NE(seen[0], nullptr);

    // A copy takes the switch but not the identity.
    TraceCapture capture(true);
    Zel_Debug copy(*Zel_Debug::instance());
    EXPECT_TRUE(copy.getEnabled());
    copy.setEnabled(false);
    EXPECT_TRUE(Zel_Debug::instance()->getEnabled());
}

TEST(Zel_DebugThreadTest, SwitchToggledWhileOtherThreadsTraceConcurrently)
{
    // The application switches tracing while engine workers read the switch
    // and trace: no data race (ThreadSanitizer runs this), no torn line, and
    // the last switch reaches every thread.
    TraceCapture capture(false);
    const boost::shared_ptr<Zel_Debug> debug = Zel_Debug::instance();
    std::atomic<bool> stop(false);
    std::vector<std::thread> tracers;
    for (int t = 0; t < 2; ++t) {
        tracers.emplace_back([&, t] {
            const QString source = QStringLiteral("T%1").arg(t);
            while (!stop.load()) {
                if (debug->getEnabled())
                    debug->debug(source, QStringLiteral("on"), 0);
                debug->debug(source, QStringLiteral("any"), 0);
            }
            // The switch was last set to on before stop was raised.
            if (debug->getEnabled())
                debug->debug(source, QStringLiteral("done"), 0);
        });
    }
    std::thread toggler([&] {
        for (int i = 0; i < 2000; ++i)
            debug->setEnabled(i % 2 == 0);
        debug->setEnabled(true);
    });
    toggler.join();
    stop = true;
    for (std::thread& tracer : tracers)
        tracer.join();

    std::map<std::string, int> counts;
    for (const std::string& line : capture.orvLines())
        ++counts[line];
    for (const auto& entry : counts) {
        const std::string& line = entry.first;
        EXPECT_TRUE(line == "ZEL: T0: on" || line == "ZEL: T1: on" || line == "ZEL: T0: any" || line == "ZEL: T1: any"
                    || line == "ZEL: T0: done" || line == "ZEL: T1: done")
            << line;
    }
    EXPECT_EQ(counts["ZEL: T0: done"], 1);
    EXPECT_EQ(counts["ZEL: T1: done"], 1);
    EXPECT_EQ(capture.qtLines().size(), static_cast<int>(capture.orvLines().size()));
}
