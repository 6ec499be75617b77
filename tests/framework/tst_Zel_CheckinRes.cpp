// Check-in, check-in update, start-up and add-dependency results.
#include "ResultsTestSupport.h"

#include "Zel_AddDependencyRes.h"
#include "Zel_CheckinRes.h"
#include "Zel_CheckinUpdateRes.h"
#include "Zel_Dependency.h"
#include "Zel_StartupRes.h"

#include <gtest/gtest.h>

using namespace ResultsTest;

namespace {

// Three items, the second an error.
void fillCheckin(Zel_CheckinRes& result, CallLog& log)
{
    result.addItem(log.desc("d1"), log.node("n1"), log.text("t1"), ok());
    result.addItem(log.desc("d2"), log.node("n2"), log.text("t2"), log.error("e2"));
    result.addItem(log.desc("d3"), log.node("n3"), log.text("t3"), ok());
}

const Calls kCheckinCalls{"succeeded(d1,n1,t1)", "failed(d2,e2)", "succeeded(d3,n3,t3)"};

struct DependencyCB : Recording<Zel_DependencyCB> {
    using Recording::Recording;
    void succeeded(NodeSP node, Zel_DependencySPList dependencies) override
    {
        std::string line = "succeeded(" + mLog.arg(node);
        for (const auto& dependency : dependencies)
            line += "," + mLog.arg(dependency);
        mLog.record(line + ")");
    }
};

} // namespace

TEST(Zel_CheckinResTest, DeliversEachOutcomeAndFinishesAfterTheLastOfAFinalResult)
{
    for (bool finalResult : {true, false}) {
        SCOPED_TRACE(finalResult ? "final" : "not final");
        CallLog log;
        Zel_CheckinRes result(boost::make_shared<CheckinCB>(log), finalResult);
        fillCheckin(result, log);
        EXPECT_EQ(deliverAll(result), "TTF");
        Calls expected = kCheckinCalls;
        if (finalResult)
            expected.push_back("finished()");
        EXPECT_EQ(log.calls, expected);
    }

    CallLog log;
    Zel_CheckinRes empty(boost::make_shared<CheckinCB>(log), true);
    EXPECT_FALSE(empty.deliverNext());
    EXPECT_EQ(log.calls, (Calls{"finished()"}));

    Zel_CheckinRes::ListItem item(log.desc("d"), log.node("n"), log.text("t"), ok());
    EXPECT_EQ(memberOrder({{&item.mMobDesc, "desc"}, {&item.mError, "error"}, {&item.mNode, "node"}, {&item.mText, "text"}}),
              "desc<error<node<text");
}

TEST(Zel_CheckinResTest, HandlerExceptionsAtFirstMiddleAndLastItemLoseNothing)
{
    for (std::size_t throwingCall : {1u, 2u, 3u, 4u}) {
        for (bool foreign : {false, true}) {
            SCOPED_TRACE(testing::Message() << "throwing call " << throwingCall << (foreign ? " (int)" : ""));
            CallLog log;
            log.throwAt(throwingCall, foreign);
            Zel_CheckinRes result(boost::make_shared<CheckinCB>(log), true);
            fillCheckin(result, log);
            // Answers as if the handler had returned; call 4 is finished().
            EXPECT_EQ(deliverAll(result), "TTF");
            Calls expected = kCheckinCalls;
            expected.push_back("finished()");
            EXPECT_EQ(log.calls, expected);
        }
    }
}

TEST(Zel_CheckinResTest, NoCallbackDeliversNothingNullErrorMeansSuccessAndCopiesKeepTheCursor)
{
    Zel_CheckinRes orphan(boost::shared_ptr<Zel_CheckinCB>(), true);
    orphan.addItem(boost::make_shared<Zel_MobDesc>(), boost::make_shared<Zel_Node>(), boost::make_shared<QString>(),
                   boost::make_shared<Zel_Error>(4, QString()));
    EXPECT_FALSE(orphan.deliverNext());

    CallLog log;
    Zel_CheckinRes result(boost::make_shared<CheckinCB>(log), false);
    result.addItem(log.desc("d"), log.node("n"), TextSP(), ErrorSP());
    EXPECT_FALSE(result.deliverNext());
    EXPECT_EQ(log.calls, (Calls{"succeeded(d,n,null)"}));

    CallLog copyLog;
    Zel_CheckinRes source(boost::make_shared<CheckinCB>(copyLog), true);
    fillCheckin(source, copyLog);
    EXPECT_TRUE(source.deliverNext());
    Zel_CheckinRes copy(source);
    EXPECT_EQ(deliverAll(copy), "TF");
    EXPECT_EQ(copyLog.calls, (Calls{"succeeded(d1,n1,t1)", "failed(d2,e2)", "succeeded(d3,n3,t3)", "finished()"}));
}

TEST(Zel_CheckinUpdateResTest, DeliversSuccessesWithoutArgumentsAndSurvivesHandlerExceptions)
{
    for (std::size_t throwingCall : {0u, 1u, 2u, 3u, 4u}) {
        SCOPED_TRACE(testing::Message() << "throwing call " << throwingCall);
        CallLog log;
        log.throwAt(throwingCall);
        Zel_CheckinUpdateRes result(boost::make_shared<VoidCB<Zel_CheckinUpdateCB>>(log), true);
        result.addItem(ok());
        result.addItem(log.error("e2"));
        result.addItem(ErrorSP());
        EXPECT_EQ(deliverAll(result), "TTF");
        EXPECT_EQ(log.calls, (Calls{"succeeded()", "failed(e2)", "succeeded()", "finished()"}));
    }

    CallLog log;
    Zel_CheckinUpdateRes partial(boost::make_shared<VoidCB<Zel_CheckinUpdateCB>>(log), false);
    partial.addItem(ok());
    EXPECT_FALSE(partial.deliverNext());
    Zel_CheckinUpdateRes empty(boost::make_shared<VoidCB<Zel_CheckinUpdateCB>>(log), true);
    EXPECT_FALSE(empty.deliverNext());
    EXPECT_EQ(log.calls, (Calls{"succeeded()", "finished()"})) << "only the final result finishes";

    Zel_CheckinUpdateRes orphan(boost::shared_ptr<Zel_CheckinUpdateCB>(), true);
    orphan.addItem(ok());
    EXPECT_FALSE(orphan.deliverNext());
}

TEST(Zel_StartupResTest, DeliversTheOneOutcomeOnEveryCallWithoutEndNotice)
{
    for (bool finalResult : {true, false}) {
        SCOPED_TRACE(finalResult ? "final" : "not final");
        CallLog log;
        Zel_StartupRes result(boost::make_shared<StartupCB>(log), finalResult);
        EXPECT_FALSE(result.deliverNext());
        EXPECT_TRUE(log.calls.empty()) << "no record set: nothing delivered";

        result.setError(ok());
        EXPECT_FALSE(result.deliverNext());
        EXPECT_FALSE(result.deliverNext());
        result.setError(log.error("e"));
        EXPECT_FALSE(result.deliverNext());
        EXPECT_EQ(log.calls, (Calls{"succeeded()", "succeeded()", "failed(e)"}));
    }

    // A throwing handler and a missing callback.
    CallLog log;
    log.throwAt(1);
    log.throwAt(2, true);
    Zel_StartupRes result(boost::make_shared<StartupCB>(log), true);
    result.setError(ok());
    EXPECT_FALSE(result.deliverNext());
    EXPECT_FALSE(result.deliverNext());
    EXPECT_EQ(log.calls, (Calls{"succeeded()", "succeeded()"}));

    Zel_StartupRes orphan(boost::shared_ptr<Zel_StartupCB>(), true);
    orphan.setError(boost::make_shared<Zel_Error>(1, QString()));
    EXPECT_FALSE(orphan.deliverNext());
}

TEST(Zel_StartupResTest, EmptyRecordLeavesNoOutcomeInsteadOfASuccess)
{
    // setError replaces the record; an empty pointer leaves none, and without a
    // record nothing is delivered: a failure set earlier never turns into a
    // success, and no success is made up.
    CallLog log;
    Zel_StartupRes result(boost::make_shared<StartupCB>(log), true);
    result.setError(log.error("e"));
    result.setError(ErrorSP());
    EXPECT_FALSE(result.deliverNext());
    EXPECT_TRUE(log.calls.empty()) << log.calls.front();

    Zel_StartupRes fresh(boost::make_shared<StartupCB>(log), false);
    fresh.setError(ErrorSP());
    EXPECT_FALSE(fresh.deliverNext());
    EXPECT_TRUE(log.calls.empty()) << log.calls.front();

    // A record set afterwards is delivered as usual, also by a copy.
    fresh.setError(log.error("later"));
    const Zel_StartupRes copy(fresh);
    fresh.setError(ErrorSP());
    EXPECT_FALSE(fresh.deliverNext());
    EXPECT_FALSE(Zel_StartupRes(copy).deliverNext());
    EXPECT_EQ(log.calls, (Calls{"failed(later)"}));
}

TEST(Zel_AddDependencyResTest, DeliversNodeAndDependencyListThenFinishesInTheSameCall)
{
    CallLog log;
    Layout<Zel_AddDependencyRes> result(boost::make_shared<DependencyCB>(log), true);
    Zel_DependencySPList dependencies;
    dependencies.append(log.named(boost::make_shared<Zel_Dependency>(), "dep1"));
    dependencies.append(log.named(boost::make_shared<Zel_Dependency>(), "dep2"));
    result.setResult(log.node("n"), dependencies, ok());
    dependencies.clear(); // the result holds its own copy of the list
    EXPECT_FALSE(result.deliverNext());
    EXPECT_EQ(log.calls, (Calls{"succeeded(n,dep1,dep2)", "finished()"}));
    EXPECT_EQ(result.order(), "items<cursor<callback");

    CallLog failLog;
    Zel_AddDependencyRes failing(boost::make_shared<DependencyCB>(failLog), false);
    failLog.throwAt(1);
    failing.setResult(failLog.node("n"), Zel_DependencySPList(), failLog.error("e1"));
    failing.setResult(failLog.node("m"), Zel_DependencySPList(), ok());
    EXPECT_EQ(deliverAll(failing), "TF");
    EXPECT_EQ(failLog.calls, (Calls{"failed(e1)", "succeeded(m)"}));
}
