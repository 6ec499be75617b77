#include "TraceCapture.h"
#include "VtableSlot.h"

#include "Zel_Debug.h"
#include "Zel_Error.h"
#include "Zel_Message.h"

#include <QDateTime>
#include <QRegularExpression>

#include <gtest/gtest.h>

#include <atomic>
#include <map>
#include <set>
#include <thread>
#include <vector>

namespace {

// The debug output carries "[<date and time>]" before the line.
QString stripStamp(const QString& qtLine)
{
    static const QRegularExpression stamp(QStringLiteral("^\\[([^\\]]*)\\]"));
    const QRegularExpressionMatch match = stamp.match(qtLine);
    if (!match.hasMatch())
        return QStringLiteral("<no stamp>");
    return qtLine.mid(match.capturedLength());
}

} // namespace

TEST(Zel_DebugTest, WritesNothingWhileTracingIsOff)
{
    TraceCapture capture(false);
    Zel_Debug::instance()->debug(QStringLiteral("Src"), QStringLiteral("text"), 15);
    EXPECT_TRUE(capture.orvLines().empty());
    EXPECT_TRUE(capture.qtLines().isEmpty());
}

TEST(Zel_DebugTest, FormatsSourceTextAndSecondsExactly)
{
    struct Row
    {
        const char *source, *text;
        int milliseconds;
        std::string line;
    };
    const std::vector<Row> rows = {
        {"Zel_GetNodeReq", "processed request ID:12)", 15, "ZEL: Zel_GetNodeReq: processed request ID:12) (0.015 seconds)"},
        {nullptr, "only text", 0, "ZEL: only text"},        {"OnlySource", nullptr, 0, "ZEL: OnlySource:"},
        {nullptr, nullptr, 0, "ZEL:"},                      {nullptr, nullptr, 1500, "ZEL: (1.5 seconds)"},
        {nullptr, nullptr, -1500, "ZEL: (-1.5 seconds)"},   {"S", "t", 1, "ZEL: S: t (0.001 seconds)"},
        {"S", "t", 123456789, "ZEL: S: t (123457 seconds)"},
    };
    TraceCapture capture;
    std::vector<std::string> expected;
    for (const Row& row : rows) {
        Zel_Debug::instance()->debug(QString::fromLatin1(row.source), QString::fromLatin1(row.text), row.milliseconds);
        expected.push_back(row.line);
    }
    EXPECT_EQ(capture.orvLines(), expected);
    const QStringList qtLines = capture.qtLines();
    ASSERT_EQ(qtLines.size(), static_cast<int>(expected.size()));
    for (int i = 0; i < qtLines.size(); ++i)
        EXPECT_EQ(stripStamp(qtLines[i]).toStdString(), expected[i]) << "line " << i;
}

TEST(Zel_DebugTest, StampsDebugOutputWithTextDateOfNow)
{
    TraceCapture capture;
    const QDateTime before = QDateTime::currentDateTime();
    Zel_Debug::instance()->debug(QString(), QString(), 0);
    const QDateTime after = QDateTime::currentDateTime();

    ASSERT_EQ(capture.qtLines().size(), 1);
    const QString line = capture.qtLines().first();
    ASSERT_TRUE(line.startsWith(QLatin1Char('['))) << line.toStdString();
    const int close = line.indexOf(QLatin1Char(']'));
    ASSERT_GT(close, 0);
    EXPECT_EQ(line.mid(close + 1), QStringLiteral("ZEL:"));
    const QDateTime stamped = QDateTime::fromString(line.mid(1, close - 1), Qt::TextDate);
    ASSERT_TRUE(stamped.isValid()) << line.toStdString();
    // The text form has whole seconds only.
    EXPECT_GE(stamped.toSecsSinceEpoch(), before.toSecsSinceEpoch());
    EXPECT_LE(stamped.toSecsSinceEpoch(), after.toSecsSinceEpoch());
}

TEST(Zel_DebugTest, WritesPercentSignsAndLatin1Verbatim)
{
    TraceCapture capture;
    const QString text = QStringLiteral("bin %s %d %% %n 100%") + QChar(0xE9);
    Zel_Debug::instance()->debug(QStringLiteral("%1"), text, 0);

    ASSERT_EQ(capture.orvLines().size(), 1u);
    const QByteArray expectedLatin1 = (QStringLiteral("ZEL: %1: ") + text).toLatin1();
    EXPECT_EQ(capture.orvLines()[0], expectedLatin1.toStdString());
    EXPECT_EQ(static_cast<unsigned char>(capture.orvLines()[0].back()), 0xE9u);
    ASSERT_EQ(capture.qtLines().size(), 1);
    EXPECT_TRUE(capture.qtLines()[0].endsWith(QStringLiteral("ZEL: %1: bin %s %d %% %n 100%") + QChar(0xE9)));
}

TEST(Zel_DebugTest, InstanceIsOneObjectEvenUnderConcurrentFirstCallsAndCopiesAreNotIt)
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

TEST(Zel_DebugTest, SwitchToggledWhileOtherThreadsTraceConcurrently)
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

TEST(Zel_ErrorTest, MinusOneAloneMeansNoErrorEvenThroughAnOverriddenCode)
{
    EXPECT_FALSE(Zel_Error().isError());
    EXPECT_EQ(Zel_Error().getCode(), -1);
    for (int code : {0, 42, -2})
        EXPECT_TRUE(Zel_Error(code, QStringLiteral("x")).isError()) << code;
    EXPECT_FALSE(Zel_Error(-1, QStringLiteral("message but no error")).isError());
    EXPECT_FALSE(Zel_Error(13, QStringLiteral("denied")).isPrivilegeError());

    Zel_Error error(5, QStringLiteral("five"));
    error.setCode(-1);
    EXPECT_FALSE(error.isError());
    Zel_Error& self = error;
    error = self;
    EXPECT_EQ(error.getMsg(), QStringLiteral("five"));

    struct AlwaysOk : Zel_Error {
        AlwaysOk() : Zel_Error(7, QStringLiteral("stored")) {}
        const int getCode() const override { return -1; }
        bool isPrivilegeError() const override { return true; }
    };
    const AlwaysOk alwaysOk;
    const Zel_Error& asBase = alwaysOk;
    EXPECT_FALSE(asBase.isError());
    EXPECT_TRUE(asBase.isPrivilegeError());

    EXPECT_EQ(slotsOutOfOrder(2, {ZEL_SLOT_ROW(Zel_Error, setMsg), ZEL_SLOT_ROW(Zel_Error, getMsg),
                                  ZEL_SLOT_ROW(Zel_Error, setCode), ZEL_SLOT_ROW(Zel_Error, getCode),
                                  ZEL_SLOT_ROW(Zel_Error, isError), ZEL_SLOT_ROW(Zel_Error, isPrivilegeError)}),
              "");
}

TEST(Zel_MessageTest, HoldsItsText)
{
    Zel_Message copy;
    EXPECT_TRUE(static_cast<QString>(copy).isNull());
    copy = Zel_Message(QStringLiteral("hello"));
    EXPECT_EQ(static_cast<QString>(copy), QStringLiteral("hello"));
}
