// Check-in, check-in update, start-up and add-dependency results.
#include "ResultsTestSupport.h"

#include "Zel_AddDependencyRes.h"
#include "Zel_CheckinRes.h"
#include "Zel_CheckinUpdateRes.h"
#include "Zel_Dependency.h"
#include "Zel_MobDesc.h"
#include "Zel_Node.h"
#include "Zel_StartupRes.h"

#include <gtest/gtest.h>

using namespace ResultsTest;

namespace {

boost::shared_ptr<Zel_MobDesc> desc(CallLog& log, const std::string& name)
{
    return log.named(boost::make_shared<Zel_MobDesc>(QString::fromStdString(name), QString(), QString()), name);
}

boost::shared_ptr<Zel_Node> node(CallLog& log, const std::string& name)
{
    return log.named(boost::make_shared<Zel_Node>(QString::fromStdString(name)), name);
}

boost::shared_ptr<QString> txt(CallLog& log, const std::string& name)
{
    return log.named(boost::make_shared<QString>(QString::fromStdString(name)), name);
}

// Three items, the second an error.
void fillCheckin(Zel_CheckinRes& result, CallLog& log)
{
    result.addItem(desc(log, "d1"), node(log, "n1"), txt(log, "t1"), success(log, "ok"));
    result.addItem(desc(log, "d2"), node(log, "n2"), txt(log, "t2"), failure(log, "e2"));
    result.addItem(desc(log, "d3"), node(log, "n3"), txt(log, "t3"), success(log, "ok"));
}

const Calls kCheckinCalls{"succeeded(d1,n1,t1)", "failed(d2,e2)", "succeeded(d3,n3,t3)"};

class DependencyCB : public Recording<Zel_DependencyCB>
{
public:
    using Recording::Recording;
    void succeeded(boost::shared_ptr<Zel_Node> node, Zel_DependencySPList dependencies) override
    {
        std::string call = "succeeded(" + mLog.name(node);
        for (const auto& dependency : dependencies)
            call += "," + mLog.name(dependency);
        mLog.record(call + ")");
    }
};

class LayoutAddDependencyRes : public Zel_AddDependencyRes
{
public:
    using Zel_AddDependencyRes::Zel_AddDependencyRes;
    bool itemsAndCursorBeforeCallback() const
    {
        auto at = [this](const void* member) {
            return static_cast<const char*>(member) - reinterpret_cast<const char*>(this);
        };
        return at(&mItems) < at(&mCursor) && at(&mCursor) < at(&mCallback);
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
        EXPECT_TRUE(result.deliverNext());
        EXPECT_TRUE(result.deliverNext());
        EXPECT_FALSE(result.deliverNext());
        Calls expected = kCheckinCalls;
        if (finalResult)
            expected.push_back("finished()");
        EXPECT_EQ(log.calls, expected);
    }

    CallLog log;
    Zel_CheckinRes empty(boost::make_shared<CheckinCB>(log), true);
    EXPECT_FALSE(empty.deliverNext());
    EXPECT_EQ(log.calls, (Calls{"finished()"}));

    // Item layout: descriptor, error, node, text.
    Zel_CheckinRes::ListItem item(desc(log, "d"), node(log, "n"), txt(log, "t"), success(log, "ok"));
    auto at = [&item](const void* member) {
        return static_cast<const char*>(member) - reinterpret_cast<const char*>(&item);
    };
    EXPECT_LT(at(&item.mMobDesc), at(&item.mError));
    EXPECT_LT(at(&item.mError), at(&item.mNode));
    EXPECT_LT(at(&item.mNode), at(&item.mText));
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
            EXPECT_TRUE(result.deliverNext());
            EXPECT_TRUE(result.deliverNext());
            EXPECT_FALSE(result.deliverNext());
            Calls expected = kCheckinCalls;
            expected.push_back("finished()");
            EXPECT_EQ(log.calls, expected);
        }
    }

    // succeeded throws on the first of two items: the second still arrives.
    CallLog log;
    log.throwAt(1);
    Zel_CheckinRes two(boost::make_shared<CheckinCB>(log), false);
    two.addItem(desc(log, "d1"), node(log, "n1"), txt(log, "t1"), success(log, "ok"));
    two.addItem(desc(log, "d2"), node(log, "n2"), txt(log, "t2"), success(log, "ok"));
    EXPECT_TRUE(two.deliverNext());
    EXPECT_FALSE(two.deliverNext());
    EXPECT_EQ(log.calls, (Calls{"succeeded(d1,n1,t1)", "succeeded(d2,n2,t2)"}));
}

TEST(Zel_CheckinResTest, NoCallbackDeliversNothingAndNullErrorMeansSuccess)
{
    Zel_CheckinRes orphan(boost::shared_ptr<Zel_CheckinCB>(), true);
    orphan.addItem(boost::make_shared<Zel_MobDesc>(), boost::make_shared<Zel_Node>(), boost::make_shared<QString>(),
                   boost::make_shared<Zel_Error>(4, QString()));
    EXPECT_FALSE(orphan.deliverNext());

    CallLog log;
    Zel_CheckinRes result(boost::make_shared<CheckinCB>(log), false);
    result.addItem(desc(log, "d"), node(log, "n"), boost::shared_ptr<QString>(), boost::shared_ptr<Zel_Error>());
    EXPECT_FALSE(result.deliverNext());
    EXPECT_EQ(log.calls, (Calls{"succeeded(d,n,null)"}));

    // A copy shares the callback and the items and keeps the cursor.
    CallLog copyLog;
    Zel_CheckinRes source(boost::make_shared<CheckinCB>(copyLog), true);
    fillCheckin(source, copyLog);
    EXPECT_TRUE(source.deliverNext());
    Zel_CheckinRes copy(source);
    EXPECT_TRUE(copy.deliverNext());
    EXPECT_FALSE(copy.deliverNext());
    EXPECT_EQ(copyLog.calls, (Calls{"succeeded(d1,n1,t1)", "failed(d2,e2)", "succeeded(d3,n3,t3)", "finished()"}));
}

TEST(Zel_CheckinUpdateResTest, DeliversSuccessesWithoutArgumentsAndSurvivesHandlerExceptions)
{
    for (std::size_t throwingCall : {0u, 1u, 2u, 3u, 4u}) {
        SCOPED_TRACE(testing::Message() << "throwing call " << throwingCall);
        CallLog log;
        if (throwingCall)
            log.throwAt(throwingCall);
        Zel_CheckinUpdateRes result(boost::make_shared<VoidCB<Zel_CheckinUpdateCB>>(log), true);
        result.addItem(success(log, "ok"));
        result.addItem(failure(log, "e2"));
        result.addItem(boost::shared_ptr<Zel_Error>());
        EXPECT_TRUE(result.deliverNext());
        EXPECT_TRUE(result.deliverNext());
        EXPECT_FALSE(result.deliverNext());
        EXPECT_EQ(log.calls, (Calls{"succeeded()", "failed(e2)", "succeeded()", "finished()"}));
    }

    CallLog log;
    Zel_CheckinUpdateRes partial(boost::make_shared<VoidCB<Zel_CheckinUpdateCB>>(log), false);
    partial.addItem(success(log, "ok"));
    EXPECT_FALSE(partial.deliverNext());
    EXPECT_EQ(log.calls, (Calls{"succeeded()"})) << "not final: no finished()";

    Zel_CheckinUpdateRes empty(boost::make_shared<VoidCB<Zel_CheckinUpdateCB>>(log), true);
    EXPECT_FALSE(empty.deliverNext());
    EXPECT_EQ(log.calls, (Calls{"succeeded()", "finished()"}));

    Zel_CheckinUpdateRes orphan(boost::shared_ptr<Zel_CheckinUpdateCB>(), true);
    orphan.addItem(boost::make_shared<Zel_Error>());
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

        result.setError(success(log, "ok"));
        EXPECT_FALSE(result.deliverNext());
        EXPECT_EQ(log.calls, (Calls{"succeeded()"}));
        EXPECT_FALSE(result.deliverNext());
        EXPECT_EQ(log.calls, (Calls{"succeeded()", "succeeded()"}));

        result.setError(failure(log, "e"));
        EXPECT_FALSE(result.deliverNext());
        EXPECT_EQ(log.calls, (Calls{"succeeded()", "succeeded()", "failed(e)"}));
    }

    // A throwing handler, an empty record and a missing callback.
    CallLog log;
    log.throwAt(1);
    log.throwAt(2, true);
    Zel_StartupRes result(boost::make_shared<StartupCB>(log), true);
    result.setError(boost::shared_ptr<Zel_Error>());
    EXPECT_FALSE(result.deliverNext());
    EXPECT_FALSE(result.deliverNext());
    EXPECT_EQ(log.calls, (Calls{"succeeded()", "succeeded()"}));

    Zel_StartupRes orphan(boost::shared_ptr<Zel_StartupCB>(), true);
    orphan.setError(boost::make_shared<Zel_Error>(1, QString()));
    EXPECT_FALSE(orphan.deliverNext());
}

TEST(Zel_AddDependencyResTest, DeliversNodeAndDependencyListThenFinishesInTheSameCall)
{
    CallLog log;
    auto callback = boost::make_shared<DependencyCB>(log);
    LayoutAddDependencyRes result(callback, true);
    Zel_DependencySPList dependencies;
    dependencies.append(log.named(boost::make_shared<Zel_Dependency>(), "dep1"));
    dependencies.append(log.named(boost::make_shared<Zel_Dependency>(), "dep2"));
    result.setResult(node(log, "n"), dependencies, success(log, "ok"));
    dependencies.clear(); // the result holds its own copy of the list
    EXPECT_FALSE(result.deliverNext());
    EXPECT_EQ(log.calls, (Calls{"succeeded(n,dep1,dep2)", "finished()"}));
    EXPECT_TRUE(result.itemsAndCursorBeforeCallback());

    CallLog failLog;
    Zel_AddDependencyRes failing(boost::make_shared<DependencyCB>(failLog), false);
    failLog.throwAt(1);
    failing.setResult(node(failLog, "n"), Zel_DependencySPList(), failure(failLog, "e1"));
    failing.setResult(node(failLog, "m"), Zel_DependencySPList(), success(failLog, "ok"));
    EXPECT_TRUE(failing.deliverNext());
    EXPECT_FALSE(failing.deliverNext());
    EXPECT_EQ(failLog.calls, (Calls{"failed(e1)", "succeeded(m)"}));
}
