// Zel_DeleteRes: every outcome kind delivers itself to its own handler, in
// storage order, with its arguments in order.
#include "ResultsTestSupport.h"

#include "Zel_DeleteRes.h"
#include "Zel_MobID.h"

#include <gtest/gtest.h>

#include <climits>

using namespace ResultsTest;

namespace {

boost::shared_ptr<Zel_MobID> mob(CallLog& log, const std::string& name)
{
    return log.named(boost::make_shared<Zel_MobID>(QString::fromStdString(name)), name);
}

boost::shared_ptr<QString> txt(CallLog& log, const std::string& name)
{
    return log.named(boost::make_shared<QString>(QString::fromStdString(name)), name);
}

class InspectableDeleteRes : public Zel_DeleteRes
{
public:
    using Zel_DeleteRes::Zel_DeleteRes;
    const QList<boost::shared_ptr<ResultItem>>& items() const { return mItems; }
};

} // namespace

TEST(Zel_DeleteResTest, DeliversTotalsAndPartialsInStorageOrderThenFinishes)
{
    CallLog log;
    Zel_DeleteRes result(boost::make_shared<DeleteCB>(log), true);
    auto e = failure(log, "e");
    result.setRemoteAssetDeleteSuccessTotalResult(3, success(log, "ok"));
    result.setRemoteMediaDeleteSuccessPartialResult(mob(log, "m1"), success(log, "ok"));
    result.setLocalDeleteMobNotFoundErrorPartialResult(mob(log, "m2"), e);
    EXPECT_TRUE(log.calls.empty()) << "setters never deliver";

    EXPECT_TRUE(result.deliverNext());
    EXPECT_EQ(log.calls, (Calls{"remoteAssetDeleteSuccessTotalResult(3)"}));
    EXPECT_TRUE(result.deliverNext());
    EXPECT_FALSE(result.deliverNext());
    EXPECT_EQ(log.calls, (Calls{"remoteAssetDeleteSuccessTotalResult(3)", "remoteMediaDeleteSuccessPartialResult(m1)",
                                "localDeleteMobNotFoundErrorPartialResult(m2,e)", "finished()"}));
}

TEST(Zel_DeleteResTest, EveryItemKindReachesItsOwnHandlerWithArgumentsInOrder)
{
    CallLog log;
    Zel_DeleteRes result(boost::make_shared<DeleteCB>(log), false);
    result.setRemoteAssetDeleteSuccessTotalResult(5, success(log, "ok"));
    result.setRemoteMetadataDeleteSuccessTotalResult(-2, success(log, "ok"));
    result.setRemoteMetadataDeleteErrorPartialResult(mob(log, "m1"), failure(log, "e3"));
    result.setRemoteMediaDeleteSuccessPartialResult(mob(log, "m2"), success(log, "ok"));
    result.setRemoteMediaDeleteErrorPartialResult(txt(log, "a"), txt(log, "b"), txt(log, "c"), txt(log, "d"),
                                                  txt(log, "e"), failure(log, "e5"));
    result.setLocalDeleteMediaSuccessPartialResult(mob(log, "m3"), success(log, "ok"));
    result.setLocalDeleteMediaErrorPartialResult(txt(log, "w"), txt(log, "x"), txt(log, "y"), txt(log, "z"),
                                                 failure(log, "e7"));
    result.setLocalDeleteMobNotFoundErrorPartialResult(mob(log, "m4"), failure(log, "e8"));
    result.setErrorResult(failure(log, "e9"));
    result.setErrorResult(failure(log, "e10"));

    int trueAnswers = 0;
    while (result.deliverNext())
        ++trueAnswers;
    EXPECT_EQ(trueAnswers, 9);
    EXPECT_EQ(log.calls, (Calls{
                             "remoteAssetDeleteSuccessTotalResult(5)",
                             "remoteMetadataDeleteSuccessTotalResult(-2)",
                             "remoteMetadataDeleteErrorPartialResult(m1,e3)",
                             "remoteMediaDeleteSuccessPartialResult(m2)",
                             "remoteMediaDeleteErrorPartialResult(a,b,c,d,e,e5)",
                             "localDeleteMediaSuccessPartialResult(m3)",
                             "localDeleteMediaErrorPartialResult(w,x,y,z,e7)",
                             "localDeleteMobNotFoundErrorPartialResult(m4,e8)",
                             "errorResult(e9)",
                             "errorResult(e10)",
                         }))
        << "not final: no finished()";
}

TEST(Zel_DeleteResTest, SuccessItemsWithAnErrorRecordStillReachTheirSuccessHandler)
{
    CallLog log;
    Zel_DeleteRes result(boost::make_shared<DeleteCB>(log), true);
    result.setRemoteAssetDeleteSuccessTotalResult(1, failure(log, "e1"));
    result.setRemoteMetadataDeleteSuccessTotalResult(2, failure(log, "e2", 0));
    result.setRemoteMediaDeleteSuccessPartialResult(mob(log, "m"), failure(log, "e3"));
    result.setLocalDeleteMediaSuccessPartialResult(mob(log, "n"), failure(log, "e4"));
    EXPECT_TRUE(result.isCurrentResultError()) << "the record still classifies the item";
    EXPECT_TRUE(result.deliverNext());
    EXPECT_TRUE(result.deliverNext());
    EXPECT_TRUE(result.deliverNext());
    EXPECT_FALSE(result.deliverNext());
    EXPECT_EQ(log.calls, (Calls{"remoteAssetDeleteSuccessTotalResult(1)", "remoteMetadataDeleteSuccessTotalResult(2)",
                                "remoteMediaDeleteSuccessPartialResult(m)", "localDeleteMediaSuccessPartialResult(n)",
                                "finished()"}));
}

TEST(Zel_DeleteResTest, EmptyResultsFinishOnlyWhenFinal)
{
    CallLog log;
    Zel_DeleteRes partial(boost::make_shared<DeleteCB>(log), false);
    EXPECT_FALSE(partial.deliverNext());
    EXPECT_TRUE(log.calls.empty());

    Zel_DeleteRes finalRes(boost::make_shared<DeleteCB>(log), true);
    EXPECT_FALSE(finalRes.deliverNext());
    EXPECT_EQ(log.calls, (Calls{"finished()"}));
}

TEST(Zel_DeleteResTest, NullErrorRecordsAreStoredAsNoErrorAndNeverReadThrough)
{
    CallLog log;
    InspectableDeleteRes result(boost::make_shared<DeleteCB>(log), false);
    result.setErrorResult(boost::shared_ptr<Zel_Error>());
    result.setRemoteMetadataDeleteErrorPartialResult(mob(log, "m"), boost::shared_ptr<Zel_Error>());
    result.setRemoteAssetDeleteSuccessTotalResult(4, boost::shared_ptr<Zel_Error>());
    ASSERT_EQ(result.items().size(), 3);
    for (const auto& item : result.items()) {
        ASSERT_TRUE(item->mError);
        EXPECT_FALSE(item->mError->isError());
        EXPECT_EQ(item->mError->getCode(), -1);
    }
    EXPECT_FALSE(result.isCurrentResultError());
    EXPECT_TRUE(result.deliverNext());
    EXPECT_TRUE(result.deliverNext());
    EXPECT_FALSE(result.deliverNext());
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
        result.setErrorResult(failure(log, "e1"));
        result.setRemoteMediaDeleteSuccessPartialResult(mob(log, "m"), success(log, "ok"));
        result.setRemoteAssetDeleteSuccessTotalResult(9, success(log, "ok"));
        EXPECT_TRUE(result.deliverNext());
        EXPECT_TRUE(result.deliverNext());
        EXPECT_FALSE(result.deliverNext());
        EXPECT_EQ(log.calls, (Calls{"errorResult(e1)", "remoteMediaDeleteSuccessPartialResult(m)",
                                    "remoteAssetDeleteSuccessTotalResult(9)", "finished()"}));
    }

    Zel_DeleteRes orphan(boost::shared_ptr<Zel_DeleteCB>(), true);
    orphan.setErrorResult(boost::make_shared<Zel_Error>(1, QString()));
    orphan.setLocalDeleteMediaSuccessPartialResult(boost::make_shared<Zel_MobID>(), boost::make_shared<Zel_Error>());
    EXPECT_TRUE(orphan.deliverNext());
    EXPECT_FALSE(orphan.deliverNext());
    EXPECT_FALSE(orphan.haveResults());

    // An item handed an empty callback calls nothing.
    Zel_DeleteRes::ResultItem item(boost::make_shared<Zel_Error>());
    item.deliver(boost::shared_ptr<Zel_DeleteCB>());
}

TEST(Zel_DeleteResTest, CopiesShareTheItemObjectsAndKeepTheirOwnCursor)
{
    CallLog log;
    InspectableDeleteRes original(boost::make_shared<DeleteCB>(log), true);
    original.setRemoteAssetDeleteSuccessTotalResult(1, success(log, "ok"));
    original.setErrorResult(failure(log, "e"));
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

TEST(Zel_DeleteResTest, TotalsKeepTheFullRangeOfLong)
{
    CallLog log;
    Zel_DeleteRes result(boost::make_shared<DeleteCB>(log), false);
    result.setRemoteAssetDeleteSuccessTotalResult(LONG_MAX, success(log, "ok"));
    result.setRemoteMetadataDeleteSuccessTotalResult(LONG_MIN, success(log, "ok"));
    EXPECT_TRUE(result.deliverNext());
    EXPECT_FALSE(result.deliverNext());
    EXPECT_EQ(log.calls, (Calls{"remoteAssetDeleteSuccessTotalResult(" + std::to_string(LONG_MAX) + ")",
                                "remoteMetadataDeleteSuccessTotalResult(" + std::to_string(LONG_MIN) + ")"}));
}
