#include "TraceCapture.h"
#include "VtableSlot.h"

#include "Orv_ResultQ.h"
#include "Orv_ResultsCB.h"
#include "Zel_Req.h"
#include "Zel_Res.h"

#include <boost/make_shared.hpp>
#include <gtest/gtest.h>

#include <chrono>
#include <stdexcept>
#include <thread>

namespace {

struct NullCB : Orv_ResultsCB {
    NullCB() : Orv_ResultsCB(Orv_RequestID(Orv_RequestID::Callback)) {}
};

struct EmptyRes : Zel_Res {
    EmptyRes() : Zel_Res(boost::make_shared<NullCB>(), true) {}
    bool haveResults() override { return false; }
    bool isCurrentResultError() override { return true; }
    void doFailed() override {}
    void doSucceeded() override {}
    void doFinished() override {}
};

// A request whose work is a function given by the test.
struct ScriptedReq : Zel_Req {
    explicit ScriptedReq(QString name, std::function<bool(boost::shared_ptr<Orv_Result>&)> work)
        : Zel_Req(std::move(name), boost::make_shared<NullCB>())
        , mWork(std::move(work))
    {
    }
    bool doProcess(boost::shared_ptr<Orv_Result>& result) override
    {
        ++mRuns;
        return mWork(result);
    }
    boost::shared_ptr<Orv_ResultQ> queue() const { return getORVResultQ(); }

    std::function<bool(boost::shared_ptr<Orv_Result>&)> mWork;
    int mRuns = 0;
};

// Exposes the protected slots so that their positions can be checked.
struct SlotProbe : Zel_Req {
    using Zel_Req::makeCanceledResult;
    using Zel_Req::setCanceled;
};

std::string idText(const Zel_Req& request)
{
    return " ID:" + std::to_string(request.getRequestID().getValue()) + ")";
}

} // namespace

TEST(Zel_ReqTest, TracesStartAndEndAroundWorkAndPushesTheResult)
{
    TraceCapture capture;
    const boost::shared_ptr<Orv_Result> produced = boost::make_shared<EmptyRes>();
    ScriptedReq request(QStringLiteral("Zel_GetNodeReq"), [&](boost::shared_ptr<Orv_Result>& result) {
        std::this_thread::sleep_for(std::chrono::milliseconds(20));
        result = produced;
        return true;
    });
    const boost::shared_ptr<Orv_ResultQ> queue = boost::make_shared<Orv_ResultQ>();

    EXPECT_TRUE(request.process(queue));
    EXPECT_EQ(request.mRuns, 1);
    EXPECT_EQ(request.queue(), queue);
    ASSERT_EQ(queue->Size(), 1u);
    EXPECT_EQ(queue->TryPop(), produced);

    const std::vector<std::string> lines = capture.orvLines();
    ASSERT_EQ(lines.size(), 2u);
    EXPECT_EQ(lines[0], "ZEL: Zel_GetNodeReq: processing request" + idText(request));
    const std::string prefix = "ZEL: Zel_GetNodeReq: processed request" + idText(request) + " (";
    ASSERT_EQ(lines[1].compare(0, prefix.size(), prefix), 0) << lines[1];
    ASSERT_EQ(lines[1].substr(lines[1].size() - 9), " seconds)") << lines[1];
    const double seconds = std::stod(lines[1].substr(prefix.size()));
    EXPECT_GE(seconds, 0.02);
    EXPECT_LT(seconds, 10.0);
    EXPECT_EQ(capture.qtLines().size(), 2);
}

TEST(Zel_ReqTest, EmptyQueueSkipsWorkButStillTracesAndAnEmptyNameLeavesTheSourceOut)
{
    TraceCapture capture;
    ScriptedReq request(QStringLiteral("R"), [](boost::shared_ptr<Orv_Result>&) { return true; });
    EXPECT_FALSE(request.process(boost::shared_ptr<Orv_ResultQ>()));
    EXPECT_EQ(request.mRuns, 0);
    ScriptedReq unnamed(QString(), [](boost::shared_ptr<Orv_Result>&) { return true; });
    EXPECT_FALSE(unnamed.process(boost::shared_ptr<Orv_ResultQ>()));
    // The closing lines may carry a seconds part on a slow machine; drop it.
    std::vector<std::string> lines = capture.orvLines();
    for (std::string& line : lines) {
        const std::size_t seconds = line.rfind(" (");
        if (seconds != std::string::npos && line.size() > 9 && line.compare(line.size() - 9, 9, " seconds)") == 0)
            line.erase(seconds);
    }
    EXPECT_EQ(lines, (std::vector<std::string>{
                                      "ZEL: R: processing request" + idText(request),
                                      "ZEL: R: processed request" + idText(request),
                                      "ZEL: processing request" + idText(unnamed),
                                      "ZEL: processed request" + idText(unnamed),
                                  }));
    // Request numbers are distinct and increasing.
    EXPECT_GT(request.getRequestID().getValue(), 0);
    EXPECT_GT(unnamed.getRequestID().getValue(), request.getRequestID().getValue());
}

TEST(Zel_ReqTest, LatinOneNameComesBackFromGetNameAndReachesTheTraceUnchanged)
{
    // getName() reads the engine's name as Latin-1, so the name must be stored as
    // Latin-1 too: a UTF-8 copy would come back with two characters for the e-acute.
    TraceCapture capture;
    const QString name = QStringLiteral("Z") + QChar(0xE9) + QStringLiteral("l");
    ScriptedReq request(name, [](boost::shared_ptr<Orv_Result>&) { return true; });
    EXPECT_EQ(request.getName(), name);
    EXPECT_EQ(request.name(), std::string("Z\xE9l"));

    request.process(boost::make_shared<Orv_ResultQ>());
    const std::vector<std::string> lines = capture.orvLines();
    ASSERT_EQ(lines.size(), 2u);
    EXPECT_EQ(lines[0], "ZEL: Z\xE9l: processing request" + idText(request));
}

TEST(Zel_ReqTest, NameWithAnEmbeddedNulComesBackWholeFromGetName)
{
    // The engine's name is a std::string with its own length; a NUL inside it
    // is a character of the name, not its end.
    const QString name = QStringLiteral("Zel_Get") + QChar(0) + QStringLiteral("NodeReq") + QChar(0);
    ScriptedReq request(name, [](boost::shared_ptr<Orv_Result>&) { return true; });
    EXPECT_EQ(request.name(), std::string("Zel_Get\0NodeReq\0", 16));
    EXPECT_EQ(request.getName(), name);
    EXPECT_EQ(request.getName().size(), 16);
}

TEST(Zel_ReqTest, WorkWithoutResultPushesNothingPassesItsAnswerAndRunsAgainOnANewQueue)
{
    TraceCapture capture(false);
    const boost::shared_ptr<Orv_ResultQ> queue = boost::make_shared<Orv_ResultQ>();
    ScriptedReq yes(QStringLiteral("Y"), [](boost::shared_ptr<Orv_Result>&) { return true; });
    ScriptedReq no(QStringLiteral("N"), [](boost::shared_ptr<Orv_Result>&) { return false; });
    EXPECT_TRUE(yes.process(queue));
    EXPECT_FALSE(no.process(queue));
    EXPECT_EQ(queue->Size(), 0u);

    // A result with answer false is still pushed.
    ScriptedReq falseWithResult(QStringLiteral("F"), [](boost::shared_ptr<Orv_Result>& result) {
        result = boost::make_shared<EmptyRes>();
        return false;
    });
    EXPECT_FALSE(falseWithResult.process(queue));
    EXPECT_EQ(queue->Size(), 1u);
    EXPECT_TRUE(capture.orvLines().empty());
    EXPECT_TRUE(capture.qtLines().isEmpty());

    // Processing again runs the work again, on the new queue.
    const boost::shared_ptr<Orv_ResultQ> second = boost::make_shared<Orv_ResultQ>();
    falseWithResult.process(second);
    EXPECT_EQ(falseWithResult.mRuns, 2);
    EXPECT_EQ(queue->Size(), 1u);
    EXPECT_EQ(second->Size(), 1u);
    EXPECT_EQ(falseWithResult.queue(), second);
}

TEST(Zel_ReqTest, TracingSwitchedDuringWorkWritesOnlyTheLineOfTheStateAtItsTime)
{
    // Switched on: only the closing line, which then has no number to show.
    // Switched off: only the opening line.
    for (bool onDuringWork : {true, false}) {
        TraceCapture capture(!onDuringWork);
        ScriptedReq request(QStringLiteral("Toggle"), [onDuringWork](boost::shared_ptr<Orv_Result>&) {
            Zel_Debug::instance()->setEnabled(onDuringWork);
            return true;
        });
        request.process(boost::make_shared<Orv_ResultQ>());
        const std::string expected = onDuringWork ? "ZEL: Toggle: processed request"
                                                  : "ZEL: Toggle: processing request" + idText(request);
        EXPECT_EQ(capture.orvLines(), std::vector<std::string>{expected});
    }
}

TEST(Zel_ReqTest, ExceptionFromWorkPassesThroughAndNothingIsPushed)
{
    TraceCapture capture;
    const boost::shared_ptr<Orv_ResultQ> queue = boost::make_shared<Orv_ResultQ>();
    ScriptedReq request(QStringLiteral("Thrower"), [](boost::shared_ptr<Orv_Result>& result) -> bool {
        result = boost::make_shared<EmptyRes>();
        throw std::runtime_error("work failed");
    });
    EXPECT_THROW(request.process(queue), std::runtime_error);
    EXPECT_EQ(queue->Size(), 0u);
    ASSERT_EQ(capture.orvLines().size(), 1u); // the closing line is never reached
}

TEST(Zel_ReqTest, VirtualSlotsInDeclaredOrder)
{
    EXPECT_EQ(slotsOutOfOrder(2, {ZEL_SLOT_ROW(Orv_Request, name), ZEL_SLOT_ROW(Orv_Request, getRequestID),
                                  ZEL_SLOT_ROW(Orv_Request, isCanceled), ZEL_SLOT_ROW(Zel_Req, process),
                                  ZEL_SLOT_ROW(SlotProbe, makeCanceledResult), ZEL_SLOT_ROW(SlotProbe, setCanceled),
                                  ZEL_SLOT_ROW(Zel_Req, getName), ZEL_SLOT_ROW(Zel_Req, doProcess)}),
              "");
    EXPECT_EQ(slotsOutOfOrder(2, {ZEL_SLOT_ROW(Orv_Result, getRequestID), ZEL_SLOT_ROW(Orv_Result, isFinalResult),
                                  ZEL_SLOT_ROW(Zel_Res, deliverNext), ZEL_SLOT_ROW(Zel_Res, haveResults),
                                  ZEL_SLOT_ROW(Zel_Res, isCurrentResultError), ZEL_SLOT_ROW(Zel_Res, doFailed),
                                  ZEL_SLOT_ROW(Zel_Res, doSucceeded), ZEL_SLOT_ROW(Zel_Res, doFinished)}),
              "");
    EXPECT_EQ(slotsOutOfOrder(2, {ZEL_SLOT_ROW(Orv_ResultsCB, cancelRequest), ZEL_SLOT_ROW(Orv_ResultsCB, isFinished)}), "");
}
