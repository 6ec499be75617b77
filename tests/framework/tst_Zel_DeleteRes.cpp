// Zel_DeleteRes: every outcome kind delivers itself to its own handler, in
// storage order, with its arguments in order.
#include "ResultsTestSupport.h"

#include "Zel_DeleteRes.h"

#include <gtest/gtest.h>

#include <climits>

using namespace ResultsTest;

namespace {

struct InspectableDeleteRes : Zel_DeleteRes {
    using Zel_DeleteRes::Zel_DeleteRes;
    const QList<boost::shared_ptr<ResultItem>>& items() const { return mItems; }
};

} // namespace

TEST(Zel_DeleteResTest, EveryItemKindReachesItsOwnHandlerWithArgumentsInStorageOrderThenFinishes)
{
    for (bool finalResult : {true, false}) {
        CallLog log;
        Zel_DeleteRes result(boost::make_shared<DeleteCB>(log), finalResult);
        result.setRemoteAssetDeleteSuccessTotalResult(LONG_MAX, ok());
        result.setRemoteMetadataDeleteSuccessTotalResult(LONG_MIN, ok());
        result.setRemoteMetadataDeleteErrorPartialResult(log.mob("m1"), log.error("e3"));
        result.setRemoteMediaDeleteSuccessPartialResult(log.mob("m2"), ok());
        result.setRemoteMediaDeleteErrorPartialResult(log.text("a"), log.text("b"), log.text("c"), log.text("d"),
                                                      log.text("e"), log.error("e5"));
        result.setLocalDeleteMediaSuccessPartialResult(log.mob("m3"), ok());
        result.setLocalDeleteMediaErrorPartialResult(log.text("w"), log.text("x"), log.text("y"), log.text("z"),
                                                     log.error("e7"));
        result.setLocalDeleteMobNotFoundErrorPartialResult(log.mob("m4"), log.error("e8"));
        result.setErrorResult(log.error("e9"));
        result.setErrorResult(log.error("e10"));
        EXPECT_TRUE(log.calls.empty()) << "setters never deliver";

        EXPECT_TRUE(result.deliverNext());
        EXPECT_EQ(log.calls, (Calls{"remoteAssetDeleteSuccessTotalResult(" + std::to_string(LONG_MAX) + ")"}));
        EXPECT_EQ(deliverAll(result), "TTTTTTTTF");
        Calls expected{
            "remoteAssetDeleteSuccessTotalResult(" + std::to_string(LONG_MAX) + ")",
            "remoteMetadataDeleteSuccessTotalResult(" + std::to_string(LONG_MIN) + ")",
            "remoteMetadataDeleteErrorPartialResult(m1,e3)",
            "remoteMediaDeleteSuccessPartialResult(m2)",
            "remoteMediaDeleteErrorPartialResult(a,b,c,d,e,e5)",
            "localDeleteMediaSuccessPartialResult(m3)",
            "localDeleteMediaErrorPartialResult(w,x,y,z,e7)",
            "localDeleteMobNotFoundErrorPartialResult(m4,e8)",
            "errorResult(e9)",
            "errorResult(e10)",
        };
        if (finalResult)
            expected.push_back("finished()");
        EXPECT_EQ(log.calls, expected) << (finalResult ? "final" : "not final");
    }

    CallLog log;
    Zel_DeleteRes partial(boost::make_shared<DeleteCB>(log), false);
    EXPECT_FALSE(partial.deliverNext());
    Zel_DeleteRes finalRes(boost::make_shared<DeleteCB>(log), true);
    EXPECT_FALSE(finalRes.deliverNext());
    EXPECT_EQ(log.calls, (Calls{"finished()"})) << "an empty result finishes only when final";
}

TEST(Zel_DeleteResTest, SuccessItemsWithAnErrorRecordStillReachTheirSuccessHandler)
{
    CallLog log;
    Zel_DeleteRes result(boost::make_shared<DeleteCB>(log), true);
    result.setRemoteAssetDeleteSuccessTotalResult(1, log.error("e1"));
    result.setRemoteMetadataDeleteSuccessTotalResult(2, log.error("e2", 0));
    result.setRemoteMediaDeleteSuccessPartialResult(log.mob("m"), log.error("e3"));
    result.setLocalDeleteMediaSuccessPartialResult(log.mob("n"), log.error("e4"));
    EXPECT_TRUE(result.isCurrentResultError()) << "the record still classifies the item";
    EXPECT_EQ(deliverAll(result), "TTTF");
    EXPECT_EQ(log.calls, (Calls{"remoteAssetDeleteSuccessTotalResult(1)", "remoteMetadataDeleteSuccessTotalResult(2)",
                                "remoteMediaDeleteSuccessPartialResult(m)", "localDeleteMediaSuccessPartialResult(n)",
                                "finished()"}));
}

TEST(Zel_DeleteResTest, NullErrorRecordsAreStoredAsNoErrorAndNeverReadThrough)
{
    CallLog log;
    InspectableDeleteRes result(boost::make_shared<DeleteCB>(log), false);
    result.setErrorResult(ErrorSP());
    result.setRemoteMetadataDeleteErrorPartialResult(log.mob("m"), ErrorSP());
    result.setRemoteAssetDeleteSuccessTotalResult(4, ErrorSP());
    ASSERT_EQ(result.items().size(), 3);
    for (const auto& item : result.items()) {
        ASSERT_TRUE(item->mError);
        EXPECT_EQ(item->mError->getCode(), -1);
    }
    EXPECT_FALSE(result.isCurrentResultError());
    EXPECT_EQ(deliverAll(result), "TTF");
    // The handlers receive a real "no error" record, never an empty pointer.
    EXPECT_EQ(log.calls, (Calls{"errorResult(anon)", "remoteMetadataDeleteErrorPartialResult(m,anon)",
                                "remoteAssetDeleteSuccessTotalResult(4)"}));
}

TEST(Zel_DeleteResTest, HandlerExceptionsAndAnEmptyCallbackLoseNoItem)
{
    for (std::size_t throwingCall : {1u, 2u, 3u, 4u}) {
        SCOPED_TRACE(testing::Message() << "throwing call " << throwingCall);
        CallLog log;
        log.throwAt(throwingCall, throwingCall == 2);
        Zel_DeleteRes result(boost::make_shared<DeleteCB>(log), true);
        result.setErrorResult(log.error("e1"));
        result.setRemoteMediaDeleteSuccessPartialResult(log.mob("m"), ok());
        result.setRemoteAssetDeleteSuccessTotalResult(9, ok());
        EXPECT_EQ(deliverAll(result), "TTF");
        EXPECT_EQ(log.calls, (Calls{"errorResult(e1)", "remoteMediaDeleteSuccessPartialResult(m)",
                                    "remoteAssetDeleteSuccessTotalResult(9)", "finished()"}));
    }

    Zel_DeleteRes orphan(boost::shared_ptr<Zel_DeleteCB>(), true);
    orphan.setErrorResult(boost::make_shared<Zel_Error>(1, QString()));
    orphan.setLocalDeleteMediaSuccessPartialResult(boost::make_shared<Zel_MobID>(), ok());
    EXPECT_EQ(deliverAll(orphan), "TF");
    EXPECT_FALSE(orphan.haveResults());

    // An item handed an empty callback calls nothing.
    Zel_DeleteRes::ResultItem item(ok());
    item.deliver(boost::shared_ptr<Zel_DeleteCB>());
}

TEST(Zel_DeleteResTest, CopiesShareTheItemObjectsAndKeepTheirOwnCursor)
{
    CallLog log;
    InspectableDeleteRes original(boost::make_shared<DeleteCB>(log), true);
    original.setRemoteAssetDeleteSuccessTotalResult(1, ok());
    original.setErrorResult(log.error("e"));
    EXPECT_TRUE(original.deliverNext());

    InspectableDeleteRes copy(original);
    ASSERT_EQ(copy.items().size(), 2);
    EXPECT_EQ(copy.items()[0].get(), original.items()[0].get());
    EXPECT_EQ(copy.items()[1].get(), original.items()[1].get());
    EXPECT_FALSE(copy.deliverNext());
    EXPECT_FALSE(original.deliverNext());
    EXPECT_EQ(log.calls, (Calls{"remoteAssetDeleteSuccessTotalResult(1)", "errorResult(e)", "finished()",
                                "errorResult(e)", "finished()"}));
}
