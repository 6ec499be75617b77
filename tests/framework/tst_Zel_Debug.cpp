#include "TraceCapture.h"

#include "Zel_Debug.h"

#include <QDateTime>
#include <QRegularExpression>

#include <gtest/gtest.h>

#include <string>
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
