// The delivery protocol of Zel_Res and the generic results built on it: each
// stores its payload with an error record and hands the payload (and only
// that) to its callback, one answer per deliverNext().
#include "ResultsTestSupport.h"

#include "Orv_Engine.h"
#include "Zel_AssociationsRes.h"
#include "Zel_CheckinRes.h"
#include "Zel_CheckinUpdateRes.h"
#include "Zel_ChildrenRes.h"
#include "Zel_CreateFolderUniqueRes.h"
#include "Zel_CreateNodeUniqueRes.h"
#include "Zel_CreateReservationRes.h"
#include "Zel_DeleteRes.h"
#include "Zel_DeleteNodeRes.h"
#include "Zel_Directory.h"
#include "Zel_GetApplicationSettingsRes.h"
#include "Zel_GetChildrenRes.h"
#include "Zel_GetLinkedProjectsRes.h"
#include "Zel_GetNodeReq.h"
#include "Zel_GetNodeRes.h"
#include "Zel_GetReservationsRes.h"
#include "Zel_GetSyncedProjRootRes.h"
#include "Zel_GetUserSettingsRes.h"
#include "Zel_MediaResolutionsRes.h"
#include "Zel_NodePermissions.h"
#include "Zel_NodePermissionsRes.h"
#include "Zel_NodeResolutionsRes.h"
#include "Zel_PropertyKeyInfo.h"
#include "Zel_PropertyKeyInfoList.h"
#include "Zel_RemoveReservationRes.h"
#include "Zel_RenameUniqueRes.h"
#include "Zel_SetApplicationSettingsRes.h"
#include "Zel_SetUserSettingsRes.h"
#include "Zel_SettingsRes.h"
#include "Zel_StartupRes.h"

#include <boost/weak_ptr.hpp>
#include <gtest/gtest.h>

using namespace ResultsTest;

namespace {

// Fills a result of the node family with (n1, ok), (n2, e2), (n3, ok) and
// checks the whole delivery, final and not final.
template <class Res, class CB>
void expectNodeResultDelivery()
{
    for (bool finalResult : {true, false}) {
        SCOPED_TRACE(std::string(typeid(Res).name()) + (finalResult ? " final" : " not final"));
        CallLog log;
        Res result(boost::make_shared<NodeCB<CB>>(log), finalResult);
        result.setResult(log.node("n1"), ok());
        result.setResult(log.node("n2"), log.error("e2"));
        result.setResult(log.node("n3"), ok());
        EXPECT_TRUE(log.calls.empty()) << "setResult never delivers";

        EXPECT_TRUE(result.deliverNext());
        EXPECT_EQ(log.calls, (Calls{"succeeded(n1)"}));
        EXPECT_TRUE(result.deliverNext());
        EXPECT_EQ(log.calls, (Calls{"succeeded(n1)", "failed(e2)"}));
        EXPECT_FALSE(result.deliverNext());
        Calls expected{"succeeded(n1)", "failed(e2)", "succeeded(n3)"};
        if (finalResult)
            expected.push_back("finished()");
        EXPECT_EQ(log.calls, expected);
        EXPECT_EQ(result.getRequestID().getValue(), -2) << "the callback's identifier";
    }
}

// Error-only results: a success reaches succeeded() without arguments.
template <class Res, class CB>
void expectErrorOnlyDelivery()
{
    CallLog log;
    Res result(boost::make_shared<VoidCB<CB>>(log), true);
    result.setResult(ok());
    result.setResult(log.error("e2"));
    EXPECT_EQ(deliverAll(result), "TF");
    EXPECT_EQ(log.calls, (Calls{"succeeded()", "failed(e2)", "finished()"})) << typeid(Res).name();
}

template <class Res, class CB>
void expectTextDelivery()
{
    CallLog log;
    Res result(boost::make_shared<TextCB<CB>>(log), true);
    result.setResult(QStringLiteral("<settings/>"), ok());
    result.setResult(QStringLiteral("ignored"), log.error("e2"));
    result.setResult(QString(), ok());
    EXPECT_EQ(deliverAll(result), "TTF");
    EXPECT_EQ(log.calls, (Calls{"succeeded(<settings/>)", "failed(e2)", "succeeded()", "finished()"}))
        << typeid(Res).name();
}

// Gives a test access to the stored items.
struct InspectableMediaResolutionsRes : Zel_MediaResolutionsRes {
    using Zel_MediaResolutionsRes::Zel_MediaResolutionsRes;
    const std::vector<ResultItem>& items() const { return mItems; }
};

struct MediaResolutionsCB : Recording<Zel_MediaResolutionsCB> {
    using Recording::Recording;
    void succeeded(Zel_PropertyKeyInfoList resolutions) override
    {
        mLog.call(__func__, resolutions.toZelString());
        // The handler's copy is its own: changing it must not reach the result.
        resolutions.addIfKeyNotInList(Zel_PropertyKeyInfo(QStringLiteral("Added"), QStringLiteral("Added"), true, true,
                                                          QStringLiteral("added"), Zel_PropertyKeyType(1), false, false));
        resolutions.clear();
    }
};

} // namespace

TEST(Zel_GenericResTest, NodeResultsHandEachNodeToItsHandlerAndFinishOnlyWhenFinal)
{
    expectNodeResultDelivery<Zel_GetNodeRes, Zel_ResultCB>();
    expectNodeResultDelivery<Zel_CreateNodeUniqueRes, Zel_ResultCB>();
    expectNodeResultDelivery<Zel_GetChildrenRes, Zel_ResultCB>();
    expectNodeResultDelivery<Zel_GetLinkedProjectsRes, Zel_ResultCB>();
    expectNodeResultDelivery<Zel_GetSyncedProjRootRes, Zel_ResultCB>();
    expectNodeResultDelivery<Zel_CreateFolderUniqueRes, Zel_CreateFolderUniqueCB>();
    expectNodeResultDelivery<Zel_RenameUniqueRes, Zel_RenameUniqueCB>();
}

TEST(Zel_GenericResTest, ErrorOnlyAndTextResultsHandOverNothingOrTheTextUnchanged)
{
    expectErrorOnlyDelivery<Zel_CreateReservationRes, Zel_CreateReservationCB>();
    expectErrorOnlyDelivery<Zel_RemoveReservationRes, Zel_RemoveReservationCB>();
    expectErrorOnlyDelivery<Zel_SetApplicationSettingsRes, Zel_SetApplicationSettingsCB>();
    expectErrorOnlyDelivery<Zel_SetUserSettingsRes, Zel_SetUserSettingsCB>();
    expectTextDelivery<Zel_GetApplicationSettingsRes, Zel_GetApplicationSettingsCB>();
    expectTextDelivery<Zel_SettingsRes, Zel_SettingsCB>();
}

TEST(Zel_GenericResTest, ReservationsAndUserSettingsHandOverEveryPayloadValueInOrder)
{
    CallLog log;
    Zel_GetReservationsRes reservations(boost::make_shared<GetReservationsCB>(log), true);
    reservations.setResult(QStringLiteral("held by ann"), QDateTime(QDate(2021, 3, 4), QTime(5, 6, 7), Qt::UTC), ok());
    EXPECT_EQ(deliverAll(reservations), "F");
    EXPECT_EQ(log.calls, (Calls{"succeeded(held by ann,2021-03-04T05:06:07Z)", "finished()"}));

    // The settings type is passed through unchanged, named or not.
    CallLog userLog;
    Zel_GetUserSettingsRes user(boost::make_shared<GetUserSettingsCB>(userLog), false);
    user.setResult(Zel_GetUserSettingsCB::UserSettingsProject, QStringLiteral("a"), ok());
    user.setResult(static_cast<Zel_GetUserSettingsCB::UserSettingsType>(-77), QStringLiteral("b"), ok());
    user.setResult(Zel_GetUserSettingsCB::UserSettingsGeneral, QStringLiteral("c"), userLog.error("e3"));
    EXPECT_EQ(deliverAll(user), "TTF");
    EXPECT_EQ(userLog.calls, (Calls{"succeeded(1,a)", "succeeded(-77,b)", "failed(e3)"}));
    static_assert(sizeof(Zel_GetUserSettingsCB::UserSettingsType) == 4, "a 32-bit value");
}

TEST(Zel_GenericResTest, AssociationsAndPermissionsHandOverTheirObjectAndKeepTheirFieldOrder)
{
    CallLog log;
    Layout<Zel_AssociationsRes> associations(boost::make_shared<AssociationsCB>(log), true);
    associations.setResult(log.named(boost::make_shared<Zel_Directory>(QStringLiteral("/a/b"), QStringLiteral("/")), "d1"),
                           ok());
    associations.setResult(boost::shared_ptr<Zel_Directory>(), log.error("e2"));
    EXPECT_EQ(deliverAll(associations), "TF");
    EXPECT_EQ(log.calls, (Calls{"succeeded(d1)", "failed(e2)", "finished()"}));
    EXPECT_EQ(associations.order(), "items<cursor<callback");
    EXPECT_EQ(Layout<Zel_GetNodeRes>(boost::shared_ptr<Zel_ResultCB>(), true).order(), "callback<items<cursor");

    // The permissions, not the record, reach the handler; the item keeps the record first.
    CallLog permissionsLog;
    Layout<Zel_NodePermissionsRes> permissions(boost::make_shared<NodePermissionsCB>(permissionsLog), true);
    auto flags = permissionsLog.named(boost::make_shared<Zel_NodePermissions>(), "P");
    permissions.setResult(flags, ok());
    EXPECT_EQ(deliverAll(permissions), "F");
    EXPECT_EQ(permissionsLog.calls, (Calls{"succeeded(P)", "finished()"}));
    EXPECT_EQ(permissions.order(), "items<cursor<callback");
    Zel_NodePermissionsRes::ResultItem item(flags, ok());
    EXPECT_EQ(memberOrder({{&item.mError, "error"}, {&item.mPermissions, "permissions"}}), "error<permissions");
}

TEST(Zel_GenericResTest, NodeResolutionsHandOverIdentifierThenTextStoredAsTextErrorIdentifier)
{
    CallLog log;
    Zel_NodeResolutionsRes result(boost::make_shared<NodeResolutionsCB>(log), true);
    auto mobID = log.mob("mob");
    auto label = log.text("label");
    result.setResult(mobID, label, ok());
    result.setResult(mobID, label, log.error("e2"));
    EXPECT_EQ(deliverAll(result), "TF");
    EXPECT_EQ(log.calls, (Calls{"succeeded(mob,label)", "failed(e2)", "finished()"}));

    Zel_NodeResolutionsRes::ResultItem item(mobID, label, ok());
    EXPECT_EQ(memberOrder({{&item.mText, "text"}, {&item.mError, "error"}, {&item.mMobID, "mob"}}), "text<error<mob");
    EXPECT_EQ(item.mMobID, mobID);
    EXPECT_EQ(item.mText, label);
}

TEST(Zel_GenericResTest, MediaResolutionsHandEachCallItsOwnCopyOfTheList)
{
    CallLog log;
    InspectableMediaResolutionsRes result(boost::make_shared<MediaResolutionsCB>(log), false);
    Zel_PropertyKeyInfoList list;
    list.addIfKeyNotInList(Zel_PropertyKeyInfo(QStringLiteral("HD"), QStringLiteral("HD Display"), false, true,
                                               QStringLiteral("hd"), Zel_PropertyKeyType(2), false, false));
    result.setResult(list, ok());
    result.setResult(list, ok());
    const std::string rendered = list.toZelString().toStdString();

    EXPECT_EQ(deliverAll(result), "TF");
    // The first handler emptied its copy; the second call still got the full list.
    EXPECT_EQ(log.calls, (Calls{"succeeded(" + rendered + ")", "succeeded(" + rendered + ")"}));
    ASSERT_EQ(result.items().size(), 2u);
    EXPECT_EQ(result.items()[0].mResolutions.toZelString().toStdString(), rendered);
    EXPECT_FALSE(result.items()[0].mResolutions.findByKey(QStringLiteral("Added")).isValid());
    EXPECT_EQ(list.toZelString().toStdString(), rendered) << "the caller's list is not touched either";
}

TEST(Zel_GenericResTest, ChildrenDeliverBothItemKindsAndIgnoreTheUnstoredBool)
{
    CallLog log;
    Zel_ChildrenRes result(boost::make_shared<ChildrenCB>(log), true);
    auto n1 = log.node("n1");
    auto n2 = log.node("n2");
    result.setResult(n1, false, true, ok());
    result.setResult(n1, true, false, ok());
    result.setResult(n1, n2, ok());
    result.setResult(n2, n1, log.error("e4"));
    result.setResult(n2, true, true, log.error("e5"));
    EXPECT_EQ(deliverAll(result), "TTTTF");
    EXPECT_EQ(log.calls, (Calls{"succeeded(n1,true)", "succeeded(n1,false)", "succeeded(n1,n2)", "failed(n2,e4)",
                                "failed(n2,e5)", "finished()"}));

    Zel_ChildrenRes::ResultItem item(n1, n2, ok(), false, true);
    EXPECT_EQ(memberOrder({{&item.mFirstNode, "first"}, {&item.mSecondNode, "second"}, {&item.mError, "error"},
                           {&item.mNodeAndFlag, "kind"}, {&item.mFlag, "flag"}}),
              "first<second<error<kind<flag");
}

TEST(Zel_GenericResTest, DeleteNodeResultDeliversOutcomeAndFinishesInOneCall)
{
    CallLog log;
    Zel_DeleteNodeRes result(boost::make_shared<ResultBoolCB>(log), true);
    result.setResult(true, ok());
    result.setResult(false, log.error("e2"));
    EXPECT_EQ(deliverAll(result), "TF");
    EXPECT_EQ(log.calls, (Calls{"succeeded(true)", "failed(e2)", "finished()"}));
}

TEST(Zel_ResTest, EmptyResultsFinishOnlyWhenFinalAndRepeatTheEndNotice)
{
    CallLog log;
    Zel_GetNodeRes finalRes(boost::make_shared<NodeCB<Zel_ResultCB>>(log), true);
    EXPECT_EQ(deliverAll(finalRes), "F");
    EXPECT_EQ(deliverAll(finalRes), "F");
    EXPECT_EQ(log.calls, (Calls{"finished()", "finished()"}));

    CallLog partialLog;
    Zel_GetNodeRes partial(boost::make_shared<NodeCB<Zel_ResultCB>>(partialLog), false);
    EXPECT_EQ(deliverAll(partial), "F");
    EXPECT_TRUE(partialLog.calls.empty());
}

TEST(Zel_ResTest, HandlerExceptionsAtFirstMiddleLastItemAndEndNoticeLoseNothing)
{
    for (std::size_t throwingCall : {1u, 2u, 3u, 4u}) {
        for (bool foreign : {false, true}) {
            SCOPED_TRACE(testing::Message() << "throwing call " << throwingCall << (foreign ? " (int)" : ""));
            CallLog log;
            log.throwAt(throwingCall, foreign);
            Zel_GetNodeRes result(boost::make_shared<NodeCB<Zel_ResultCB>>(log), true);
            result.setResult(log.node("n1"), ok());
            result.setResult(log.node("n2"), log.error("e2"));
            result.setResult(log.node("n3"), ok());
            EXPECT_EQ(deliverAll(result), "TTF");
            EXPECT_EQ(log.calls, (Calls{"succeeded(n1)", "failed(e2)", "succeeded(n3)", "finished()"}));
        }
    }
}

TEST(Zel_ResTest, EmptyCallbackConsumesItemsAndNullErrorMeansNoError)
{
    // No callback: nothing is called, yet delivery comes to an end.
    Zel_GetNodeRes orphan(boost::shared_ptr<Zel_ResultCB>(), true);
    orphan.setResult(boost::make_shared<Zel_Node>(), ok());
    orphan.setResult(boost::make_shared<Zel_Node>(), boost::make_shared<Zel_Error>(3, QString()));
    EXPECT_EQ(deliverAll(orphan), "TF");
    EXPECT_FALSE(orphan.deliverNext());
    EXPECT_FALSE(orphan.haveResults());
    Zel_ChildrenRes orphanChildren(boost::shared_ptr<Zel_ChildrenCB>(), false);
    orphanChildren.setResult(NodeSP(), false, true, ErrorSP());
    EXPECT_EQ(deliverAll(orphanChildren), "F");

    // An empty error pointer is a success and is never read through.
    CallLog log;
    Zel_GetNodeRes result(boost::make_shared<NodeCB<Zel_ResultCB>>(log), true);
    result.setResult(log.node("n1"), ErrorSP());
    EXPECT_FALSE(result.isCurrentResultError());
    Zel_ChildrenRes children(boost::make_shared<ChildrenCB>(log), false);
    children.setResult(log.node("a"), log.node("b"), ErrorSP());
    Zel_CreateReservationRes reservation(boost::make_shared<VoidCB<Zel_CreateReservationCB>>(log), false);
    reservation.setResult(ErrorSP());
    EXPECT_EQ(deliverAll(result), "F");
    EXPECT_EQ(deliverAll(children), "F");
    EXPECT_EQ(deliverAll(reservation), "F");
    EXPECT_EQ(log.calls, (Calls{"succeeded(n1)", "finished()", "succeeded(a,b)", "succeeded()"}));
}

namespace {

// An error record whose code cannot be read: isError() throws.
struct UnreadableError : Zel_Error {
    const int getCode() const override { throw std::runtime_error("unreadable code"); }
};

// A node result whose own haveResults() or isCurrentResultError() throws (an
// int) while the cursor stands at the given item.
struct ThrowingQuestionsRes : Zel_GetNodeRes {
    ThrowingQuestionsRes(boost::shared_ptr<Zel_ResultCB> callback, quint64 haveResultsThrowsAt,
                         quint64 verdictThrowsAt)
        : Zel_GetNodeRes(callback, true), mHaveResultsThrowsAt(haveResultsThrowsAt), mVerdictThrowsAt(verdictThrowsAt)
    {
    }
    bool haveResults() override
    {
        if (mCursor == mHaveResultsThrowsAt)
            throw 1;
        return Zel_GetNodeRes::haveResults();
    }
    bool isCurrentResultError() override
    {
        if (mCursor == mVerdictThrowsAt)
            throw 2;
        return Zel_GetNodeRes::isCurrentResultError();
    }
    quint64 mHaveResultsThrowsAt, mVerdictThrowsAt;
};

// A result derived straight from Zel_Res that keeps items the base cannot see
// and cannot tell whether its current item is an error.
struct OpaqueRes : Zel_Res {
    OpaqueRes(CallLog& log, bool finalResult) : Zel_Res(boost::shared_ptr<Orv_ResultsCB>(), finalResult), mLog(log) {}
    bool haveResults() override { return mLeft > 0; }
    bool isCurrentResultError() override { throw std::logic_error("no verdict"); }
    void doFailed() override { --mLeft, mLog.record("doFailed"); }
    void doSucceeded() override { --mLeft, mLog.record("doSucceeded"); }
    void doFinished() override { mLog.record("doFinished"); }
    CallLog& mLog;
    int mLeft = 3;
};

} // namespace

TEST(Zel_ResTest, ThrowingQuestionsEndTheCallAndTheNextCallMovesOnToTheNextItem)
{
    // An item whose record cannot be read is passed over: the call that meets
    // it ends, the next one delivers the following item, and the end notice
    // still comes.
    {
        CallLog log;
        Zel_GetNodeRes result(boost::make_shared<NodeCB<Zel_ResultCB>>(log), true);
        result.setResult(log.node("n1"), ok());
        result.setResult(log.node("n2"), boost::make_shared<UnreadableError>());
        result.setResult(log.node("n3"), ok());
        result.setResult(log.node("n4"), boost::make_shared<UnreadableError>());
        EXPECT_EQ(deliverAll(result), "TTTF");
        EXPECT_EQ(log.calls, (Calls{"succeeded(n1)", "succeeded(n3)", "finished()"}));
    }
    // The same for a derived result whose own questions throw: haveResults()
    // before the first item and after the second, isCurrentResultError() at the
    // third.
    {
        CallLog log;
        ThrowingQuestionsRes result(boost::make_shared<NodeCB<Zel_ResultCB>>(log), 0, 2);
        for (const char* name : {"n1", "n2", "n3", "n4"})
            result.setResult(log.node(name), ok());
        EXPECT_EQ(deliverAll(result), "TTTF");
        EXPECT_EQ(log.calls, (Calls{"succeeded(n2)", "succeeded(n4)", "finished()"}));

        CallLog afterLog;
        ThrowingQuestionsRes after(boost::make_shared<NodeCB<Zel_ResultCB>>(afterLog), 1, 99);
        for (const char* name : {"n1", "n2", "n3"})
            after.setResult(afterLog.node(name), ok());
        EXPECT_EQ(deliverAll(after), "TTF");
        EXPECT_EQ(afterLog.calls, (Calls{"succeeded(n1)", "succeeded(n3)", "finished()"}));
    }
    // Deletion outcomes: the item picks its handler, but an unreadable record
    // still ends the call that meets it.
    {
        CallLog log;
        Zel_DeleteRes result(boost::make_shared<DeleteCB>(log), true);
        result.setRemoteAssetDeleteSuccessTotalResult(3, ok());
        result.setErrorResult(boost::make_shared<UnreadableError>());
        result.setRemoteMetadataDeleteSuccessTotalResult(4, ok());
        EXPECT_EQ(deliverAll(result), "TTF");
        EXPECT_EQ(log.calls, (Calls{"remoteAssetDeleteSuccessTotalResult(3)",
                                    "remoteMetadataDeleteSuccessTotalResult(4)", "finished()"}));
    }
    // A result whose items the base cannot pass over ends at the first
    // unanswerable question; a final one still reports the end.
    for (bool finalResult : {true, false}) {
        CallLog log;
        OpaqueRes result(log, finalResult);
        EXPECT_EQ(deliverAll(result), "F");
        EXPECT_EQ(log.calls, finalResult ? Calls{"doFinished"} : Calls{});
    }
}

namespace {

// A node result that replaces all five delivery operations: each records its
// call; the verdict is the base's, or "error" for every item with allErrors.
struct ReplacingRes : Zel_GetNodeRes {
    ReplacingRes(CallLog& log, bool allErrors)
        : Zel_GetNodeRes(boost::make_shared<NodeCB<Zel_ResultCB>>(log), true), mLog(log), mAllErrors(allErrors)
    {
    }
    bool haveResults() override
    {
        mLog.record("haveResults");
        return Zel_GetNodeRes::haveResults();
    }
    bool isCurrentResultError() override
    {
        mLog.record("isCurrentResultError");
        return mAllErrors || Zel_GetNodeRes::isCurrentResultError();
    }
    void doFailed() override
    {
        mLog.record("doFailed");
        Zel_GetNodeRes::doFailed();
    }
    void doSucceeded() override
    {
        mLog.record("doSucceeded");
        Zel_GetNodeRes::doSucceeded();
    }
    void doFinished() override { mLog.record("doFinished"); }
    CallLog& mLog;
    bool mAllErrors;
};

} // namespace

TEST(Zel_ResTest, DerivedResultReplacesEveryDeliveryOperationThroughItsSlot)
{
    // Delivery may call a generic result's own operations directly, but only
    // while the object's slots hold them: a class derived from it that
    // replaces them is asked every question and does every step itself.
    CallLog log;
    ReplacingRes result(log, false);
    result.setResult(log.node("n1"), ok());
    result.setResult(log.node("n2"), log.error("e2"));
    Orv_Result& engineView = result; // the call the engine makes
    EXPECT_TRUE(engineView.deliverNext());
    EXPECT_FALSE(engineView.deliverNext());
    EXPECT_EQ(log.calls, (Calls{"haveResults", "isCurrentResultError", "doSucceeded", "succeeded(n1)", "haveResults",
                                "haveResults", "isCurrentResultError", "doFailed", "failed(e2)", "haveResults",
                                "doFinished"}));

    CallLog errorsLog;
    ReplacingRes errors(errorsLog, true);
    errors.setResult(errorsLog.node("n1"), errorsLog.error("ok1", -1));
    Orv_Result& errorsView = errors;
    EXPECT_FALSE(errorsView.deliverNext());
    EXPECT_EQ(errorsLog.calls,
              (Calls{"haveResults", "isCurrentResultError", "doFailed", "failed(ok1)", "haveResults", "doFinished"}));
}

TEST(Zel_ResTest, ThreadExitInsideAHandlerEndsOnlyThatThreadAndDeliveryGoesOn)
{
    // pthread_exit unwinds with an exception that must not be swallowed; a
    // result that caught it would abort the process.
    {
        CallLog log;
        log.exitThreadAt(1);
        log.exitThreadAt(4);
        Zel_GetNodeRes result(boost::make_shared<NodeCB<Zel_ResultCB>>(log), true);
        result.setResult(log.node("n1"), ok());
        result.setResult(log.node("n2"), log.error("e2"));
        result.setResult(log.node("n3"), ok());
        EXPECT_EQ(deliverOnOwnThread(result), "X");
        EXPECT_EQ(deliverOnOwnThread(result), "T");
        EXPECT_EQ(deliverOnOwnThread(result), "X");
        EXPECT_EQ(log.calls, (Calls{"succeeded(n1)", "failed(e2)", "succeeded(n3)", "finished()"}));
    }
    {
        CallLog log;
        log.exitThreadAt(2);
        log.exitThreadAt(4);
        Zel_CheckinRes result(boost::make_shared<CheckinCB>(log), true);
        result.addItem(log.desc("d1"), log.node("n1"), log.text("t1"), ok());
        result.addItem(log.desc("d2"), log.node("n2"), log.text("t2"), log.error("e2"));
        result.addItem(log.desc("d3"), log.node("n3"), log.text("t3"), ok());
        EXPECT_EQ(deliverOnOwnThread(result), "T");
        EXPECT_EQ(deliverOnOwnThread(result), "X");
        EXPECT_EQ(deliverOnOwnThread(result), "X");
        EXPECT_EQ(log.calls, (Calls{"succeeded(d1,n1,t1)", "failed(d2,e2)", "succeeded(d3,n3,t3)", "finished()"}));
    }
    {
        CallLog log;
        log.exitThreadAt(1);
        Zel_CheckinUpdateRes result(boost::make_shared<VoidCB<Zel_CheckinUpdateCB>>(log), true);
        result.addItem(ok());
        EXPECT_EQ(deliverOnOwnThread(result), "X");
        EXPECT_EQ(deliverOnOwnThread(result), "F");
        EXPECT_EQ(log.calls, (Calls{"succeeded()", "finished()"}));
    }
    {
        CallLog log;
        log.exitThreadAt(1);
        Zel_StartupRes result(boost::make_shared<StartupCB>(log), true);
        result.setError(log.error("e"));
        EXPECT_EQ(deliverOnOwnThread(result), "X");
        EXPECT_EQ(deliverOnOwnThread(result), "F");
        EXPECT_EQ(log.calls, (Calls{"failed(e)", "failed(e)"}));
    }
}

TEST(Zel_ResTest, CopySharesCallbackAndPayloadKeepsItsOwnCursorAndReleasesTheCallbackLast)
{
    CallLog log;
    auto callback = boost::make_shared<NodeCB<Zel_ResultCB>>(log);
    boost::weak_ptr<Zel_ResultCB> watch = callback;
    auto original = boost::make_shared<Zel_GetNodeRes>(callback, true);
    callback.reset();
    original->setResult(log.node("n1"), ok());
    original->setResult(log.node("n2"), ok());
    EXPECT_TRUE(original->deliverNext());

    auto copy = boost::make_shared<Zel_GetNodeRes>(*original);
    EXPECT_FALSE(original->deliverNext());
    EXPECT_FALSE(copy->deliverNext()) << "the copy starts at the original's cursor";
    EXPECT_EQ(log.calls, (Calls{"succeeded(n1)", "succeeded(n2)", "finished()", "succeeded(n2)", "finished()"}));

    // Assignment takes over items and cursor; the callback lives while a result holds it.
    Zel_GetNodeRes assigned(boost::shared_ptr<Zel_ResultCB>(), false);
    assigned = *copy;
    EXPECT_TRUE(assigned.isFinalResult());
    EXPECT_FALSE(assigned.haveResults());
    original.reset();
    copy.reset();
    EXPECT_FALSE(watch.expired());
    assigned = Zel_GetNodeRes(boost::shared_ptr<Zel_ResultCB>(), false);
    EXPECT_TRUE(watch.expired());
}

namespace {

// A backend-style request whose work answers with two nodes.
struct TwoNodesReq : Zel_GetNodeReq {
    TwoNodesReq(boost::shared_ptr<Zel_ResultCB> callback, NodeSP first, NodeSP second)
        : Zel_GetNodeReq(callback), mCallback(callback), mFirst(first), mSecond(second)
    {
    }
    bool doProcess(boost::shared_ptr<Orv_Result>& result) override
    {
        auto res = boost::make_shared<Zel_GetNodeRes>(mCallback, true);
        res->setResult(mFirst, ok());
        res->setResult(mSecond, boost::make_shared<Zel_Error>(12, QStringLiteral("gone")));
        result = res;
        return true;
    }
    boost::shared_ptr<Zel_ResultCB> mCallback;
    NodeSP mFirst, mSecond;
};

} // namespace

TEST(Zel_GenericResTest, EngineDeliversAGetNodeResultToTheApplicationCallback)
{
    CallLog log;
    Orv_Engine engine;
    engine.Submit(boost::make_shared<TwoNodesReq>(boost::make_shared<NodeCB<Zel_ResultCB>>(log), log.node("n1"),
                                                  log.node("n2")));
    engine.DeliverAll();
    EXPECT_EQ(log.calls, (Calls{"succeeded(n1)", "failed(anon)", "finished()"}));
}
