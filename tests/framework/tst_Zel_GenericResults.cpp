// The generic results: each stores its payload with an error record and hands
// the payload (and only that) to its callback, one answer per deliverNext().
#include "ResultsTestSupport.h"

#include "Orv_Engine.h"
#include "Orv_ResultQ.h"
#include "Zel_AssociationsRes.h"
#include "Zel_ChildrenRes.h"
#include "Zel_CreateFolderUniqueRes.h"
#include "Zel_CreateNodeUniqueRes.h"
#include "Zel_CreateReservationRes.h"
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
#include "Zel_MobID.h"
#include "Zel_Node.h"
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

#include <boost/weak_ptr.hpp>
#include <gtest/gtest.h>

using namespace ResultsTest;

namespace {

boost::shared_ptr<Zel_Node> node(CallLog& log, const std::string& name)
{
    return log.named(boost::make_shared<Zel_Node>(QString::fromStdString(name)), name);
}

// Fills a result of the node family with (n1, ok), (n2, e2), (n3, ok) and
// checks the whole delivery, final and not final.
template <class Res, class CB>
void expectNodeResultDelivery()
{
    for (bool finalResult : {true, false}) {
        SCOPED_TRACE(finalResult ? "final" : "not final");
        CallLog log;
        auto callback = boost::make_shared<NodeCB<CB>>(log);
        Res result(callback, finalResult);
        result.setResult(node(log, "n1"), success(log, "ok"));
        result.setResult(node(log, "n2"), failure(log, "e2"));
        result.setResult(node(log, "n3"), success(log, "ok3"));
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
    auto callback = boost::make_shared<VoidCB<CB>>(log);
    Res result(callback, true);
    result.setResult(success(log, "ok"));
    result.setResult(failure(log, "e2"));
    EXPECT_TRUE(result.deliverNext());
    EXPECT_FALSE(result.deliverNext());
    EXPECT_EQ(log.calls, (Calls{"succeeded()", "failed(e2)", "finished()"}));
}

template <class Res, class CB>
void expectTextDelivery()
{
    CallLog log;
    auto callback = boost::make_shared<TextCB<CB>>(log);
    Res result(callback, true);
    result.setResult(QStringLiteral("<settings/>"), success(log, "ok"));
    result.setResult(QStringLiteral("ignored"), failure(log, "e2"));
    result.setResult(QString(), success(log, "ok3"));
    EXPECT_TRUE(result.deliverNext());
    EXPECT_TRUE(result.deliverNext());
    EXPECT_FALSE(result.deliverNext());
    EXPECT_EQ(log.calls, (Calls{"succeeded(<settings/>)", "failed(e2)", "succeeded()", "finished()"}));
}

// Gives a test access to the stored items and the field layout.
class InspectableMediaResolutionsRes : public Zel_MediaResolutionsRes
{
public:
    using Zel_MediaResolutionsRes::Zel_MediaResolutionsRes;
    const std::vector<ResultItem>& items() const { return mItems; }
};

class MediaResolutionsCB : public Recording<Zel_MediaResolutionsCB>
{
public:
    using Recording::Recording;
    void succeeded(Zel_PropertyKeyInfoList resolutions) override
    {
        mLog.record("succeeded(" + text(resolutions.toZelString()) + ")");
        // The handler's copy is its own: changing it must not reach the result.
        resolutions.addIfKeyNotInList(
            Zel_PropertyKeyInfo(QStringLiteral("Added"), QStringLiteral("Added"), true, true, QStringLiteral("added"),
                                Zel_PropertyKeyType(1), false, false));
        resolutions.clear();
    }
};

Zel_PropertyKeyInfo keyInfo(const char* key)
{
    const QString name = QString::fromLatin1(key);
    return Zel_PropertyKeyInfo(name, name + QStringLiteral(" Display"), false, true, name.toLower(),
                               Zel_PropertyKeyType(2), false, false);
}

template <class Layout>
std::ptrdiff_t offsetIn(const Layout& object, const void* member)
{
    return static_cast<const char*>(member) - reinterpret_cast<const char*>(&object);
}

class LayoutNodePermissionsRes : public Zel_NodePermissionsRes
{
public:
    using Zel_NodePermissionsRes::Zel_NodePermissionsRes;
    bool itemsAndCursorBeforeCallback() const
    {
        return offsetIn(*this, &mItems) < offsetIn(*this, &mCursor) &&
               offsetIn(*this, &mCursor) < offsetIn(*this, &mCallback);
    }
};

class LayoutAssociationsRes : public Zel_AssociationsRes
{
public:
    using Zel_AssociationsRes::Zel_AssociationsRes;
    bool itemsAndCursorBeforeCallback() const
    {
        return offsetIn(*this, &mItems) < offsetIn(*this, &mCursor) &&
               offsetIn(*this, &mCursor) < offsetIn(*this, &mCallback);
    }
};

class LayoutGetNodeRes : public Zel_GetNodeRes
{
public:
    using Zel_GetNodeRes::Zel_GetNodeRes;
    bool callbackBeforeItemsAndCursor() const
    {
        return offsetIn(*this, &mCallback) < offsetIn(*this, &mItems) &&
               offsetIn(*this, &mItems) < offsetIn(*this, &mCursor);
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

TEST(Zel_GenericResTest, ErrorOnlyResultsCallSucceededWithoutArguments)
{
    expectErrorOnlyDelivery<Zel_CreateReservationRes, Zel_CreateReservationCB>();
    expectErrorOnlyDelivery<Zel_RemoveReservationRes, Zel_RemoveReservationCB>();
    expectErrorOnlyDelivery<Zel_SetApplicationSettingsRes, Zel_SetApplicationSettingsCB>();
    expectErrorOnlyDelivery<Zel_SetUserSettingsRes, Zel_SetUserSettingsCB>();
}

TEST(Zel_GenericResTest, SettingsTextResultsHandOverTheTextUnchanged)
{
    expectTextDelivery<Zel_GetApplicationSettingsRes, Zel_GetApplicationSettingsCB>();
    expectTextDelivery<Zel_SettingsRes, Zel_SettingsCB>();
}

TEST(Zel_GenericResTest, ReservationsAndUserSettingsHandOverEveryPayloadValueInOrder)
{
    CallLog log;
    auto reservations = boost::make_shared<GetReservationsCB>(log);
    Zel_GetReservationsRes reservationsRes(reservations, true);
    const QDateTime when(QDate(2021, 3, 4), QTime(5, 6, 7), Qt::UTC);
    reservationsRes.setResult(QStringLiteral("held by ann"), when, success(log, "ok"));
    EXPECT_FALSE(reservationsRes.deliverNext());
    EXPECT_EQ(log.calls, (Calls{"succeeded(held by ann,2021-03-04T05:06:07Z)", "finished()"}));

    // The settings type is passed through unchanged, named or not.
    CallLog userLog;
    auto user = boost::make_shared<GetUserSettingsCB>(userLog);
    Zel_GetUserSettingsRes userRes(user, false);
    userRes.setResult(Zel_GetUserSettingsCB::UserSettingsProject, QStringLiteral("a"), success(userLog, "ok"));
    userRes.setResult(static_cast<Zel_GetUserSettingsCB::UserSettingsType>(-77), QStringLiteral("b"),
                      success(userLog, "ok2"));
    userRes.setResult(Zel_GetUserSettingsCB::UserSettingsGeneral, QStringLiteral("c"), failure(userLog, "e3"));
    EXPECT_TRUE(userRes.deliverNext());
    EXPECT_TRUE(userRes.deliverNext());
    EXPECT_FALSE(userRes.deliverNext());
    EXPECT_EQ(userLog.calls, (Calls{"succeeded(1,a)", "succeeded(-77,b)", "failed(e3)"}));
    static_assert(sizeof(Zel_GetUserSettingsCB::UserSettingsType) == 4, "a 32-bit value");
}

TEST(Zel_GenericResTest, AssociationsHandOverTheDirectoryAndKeepItemsBeforeCallback)
{
    CallLog log;
    auto callback = boost::make_shared<AssociationsCB>(log);
    LayoutAssociationsRes result(callback, true);
    auto directory = log.named(boost::make_shared<Zel_Directory>(QStringLiteral("/a/b"), QStringLiteral("/")), "d1");
    result.setResult(directory, success(log, "ok"));
    result.setResult(boost::shared_ptr<Zel_Directory>(), failure(log, "e2"));
    EXPECT_TRUE(result.deliverNext());
    EXPECT_FALSE(result.deliverNext());
    EXPECT_EQ(log.calls, (Calls{"succeeded(d1)", "failed(e2)", "finished()"}));
    EXPECT_TRUE(result.itemsAndCursorBeforeCallback());
    EXPECT_TRUE(LayoutGetNodeRes(boost::shared_ptr<Zel_ResultCB>(), true).callbackBeforeItemsAndCursor());
}

TEST(Zel_GenericResTest, NodePermissionsHandOverThePermissionsNotTheRecord)
{
    CallLog log;
    auto callback = boost::make_shared<NodePermissionsCB>(log);
    LayoutNodePermissionsRes result(callback, true);
    auto permissions = log.named(boost::make_shared<Zel_NodePermissions>(), "P");
    result.setResult(permissions, success(log, "record"));
    EXPECT_FALSE(result.deliverNext());
    EXPECT_EQ(log.calls, (Calls{"succeeded(P)", "finished()"}));
    EXPECT_TRUE(result.itemsAndCursorBeforeCallback());

    // The item keeps the error record before the permissions.
    Zel_NodePermissionsRes::ResultItem item(permissions, success(log, "record"));
    EXPECT_LT(offsetIn(item, &item.mError), offsetIn(item, &item.mPermissions));
}

TEST(Zel_GenericResTest, NodeResolutionsHandOverIdentifierThenTextInSetResultOrder)
{
    CallLog log;
    auto callback = boost::make_shared<NodeResolutionsCB>(log);
    Zel_NodeResolutionsRes result(callback, true);
    auto mobID = log.named(boost::make_shared<Zel_MobID>(QStringLiteral("060a2b34")), "mob");
    auto label = log.named(boost::make_shared<QString>(QStringLiteral("HD")), "label");
    result.setResult(mobID, label, success(log, "ok"));
    result.setResult(mobID, label, failure(log, "e2"));
    EXPECT_TRUE(result.deliverNext());
    EXPECT_FALSE(result.deliverNext());
    EXPECT_EQ(log.calls, (Calls{"succeeded(mob,label)", "failed(e2)", "finished()"}));

    // Stored as text, error, identifier.
    Zel_NodeResolutionsRes::ResultItem item(mobID, label, success(log, "ok"));
    EXPECT_LT(offsetIn(item, &item.mText), offsetIn(item, &item.mError));
    EXPECT_LT(offsetIn(item, &item.mError), offsetIn(item, &item.mMobID));
    EXPECT_EQ(item.mMobID, mobID);
    EXPECT_EQ(item.mText, label);
}

TEST(Zel_GenericResTest, MediaResolutionsHandEachCallItsOwnCopyOfTheList)
{
    CallLog log;
    auto callback = boost::make_shared<MediaResolutionsCB>(log);
    InspectableMediaResolutionsRes result(callback, false);
    Zel_PropertyKeyInfoList list;
    list.addIfKeyNotInList(keyInfo("HD"));
    result.setResult(list, success(log, "ok"));
    result.setResult(list, success(log, "ok2"));
    const std::string rendered = text(list.toZelString());

    EXPECT_TRUE(result.deliverNext());
    EXPECT_FALSE(result.deliverNext());
    // The first handler emptied its copy; the second call still got the full list.
    EXPECT_EQ(log.calls, (Calls{"succeeded(" + rendered + ")", "succeeded(" + rendered + ")"}));
    ASSERT_EQ(result.items().size(), 2u);
    EXPECT_EQ(text(result.items()[0].mResolutions.toZelString()), rendered);
    EXPECT_FALSE(result.items()[0].mResolutions.findByKey(QStringLiteral("Added")).isValid());
    // The caller's list is not touched either.
    EXPECT_EQ(text(list.toZelString()), rendered);
}

TEST(Zel_GenericResTest, ChildrenDeliverBothItemKindsAndIgnoreTheUnstoredBool)
{
    CallLog log;
    auto callback = boost::make_shared<ChildrenCB>(log);
    Zel_ChildrenRes result(callback, true);
    auto n1 = node(log, "n1");
    auto n2 = node(log, "n2");
    result.setResult(n1, false, true, success(log, "ok"));
    result.setResult(n1, true, false, success(log, "ok"));
    result.setResult(n1, n2, success(log, "ok"));
    result.setResult(n2, n1, failure(log, "e4"));
    result.setResult(n2, true, true, failure(log, "e5"));

    for (int call = 0; call < 4; ++call)
        EXPECT_TRUE(result.deliverNext());
    EXPECT_FALSE(result.deliverNext());
    EXPECT_EQ(log.calls, (Calls{"succeeded(n1,true)", "succeeded(n1,false)", "succeeded(n1,n2)", "failed(n2,e4)",
                                "failed(n2,e5)", "finished()"}));

    // Item layout and contents: first node, second node, error, kind, flag.
    Zel_ChildrenRes::ResultItem item(n1, n2, success(log, "ok"), false, true);
    EXPECT_LT(offsetIn(item, &item.mFirstNode), offsetIn(item, &item.mSecondNode));
    EXPECT_LT(offsetIn(item, &item.mSecondNode), offsetIn(item, &item.mError));
    EXPECT_LT(offsetIn(item, &item.mError), offsetIn(item, &item.mNodeAndFlag));
    EXPECT_LT(offsetIn(item, &item.mNodeAndFlag), offsetIn(item, &item.mFlag));
}

TEST(Zel_GenericResTest, DeleteNodeResultDeliversOutcomeAndFinishesInOneCall)
{
    CallLog log;
    auto callback = boost::make_shared<ResultBoolCB>(log);
    Zel_DeleteNodeRes result(callback, true);
    result.setResult(true, success(log, "ok"));
    EXPECT_FALSE(result.deliverNext());
    EXPECT_EQ(log.calls, (Calls{"succeeded(true)", "finished()"}));

    CallLog log2;
    Zel_DeleteNodeRes two(boost::make_shared<ResultBoolCB>(log2), false);
    two.setResult(false, success(log2, "ok"));
    two.setResult(true, failure(log2, "e2"));
    EXPECT_TRUE(two.deliverNext());
    EXPECT_FALSE(two.deliverNext());
    EXPECT_EQ(log2.calls, (Calls{"succeeded(false)", "failed(e2)"}));
}

TEST(Zel_GenericResTest, EmptyResultsFinishOnlyWhenFinalAndRepeatTheEndNotice)
{
    CallLog log;
    Zel_GetNodeRes finalRes(boost::make_shared<NodeCB<Zel_ResultCB>>(log), true);
    EXPECT_FALSE(finalRes.deliverNext());
    EXPECT_EQ(log.calls, (Calls{"finished()"}));
    EXPECT_FALSE(finalRes.deliverNext());
    EXPECT_EQ(log.calls, (Calls{"finished()", "finished()"}));

    CallLog log2;
    Zel_GetNodeRes partial(boost::make_shared<NodeCB<Zel_ResultCB>>(log2), false);
    EXPECT_FALSE(partial.deliverNext());
    EXPECT_TRUE(log2.calls.empty());
}

TEST(Zel_GenericResTest, HandlerExceptionsAtFirstMiddleAndLastItemLoseNothing)
{
    for (std::size_t throwingCall : {1u, 2u, 3u}) {
        for (bool foreign : {false, true}) {
            SCOPED_TRACE(testing::Message() << "throwing call " << throwingCall << (foreign ? " (int)" : ""));
            CallLog log;
            log.throwAt(throwingCall, foreign);
            Zel_GetNodeRes result(boost::make_shared<NodeCB<Zel_ResultCB>>(log), true);
            result.setResult(node(log, "n1"), success(log, "ok"));
            result.setResult(node(log, "n2"), failure(log, "e2"));
            result.setResult(node(log, "n3"), success(log, "ok"));
            EXPECT_TRUE(result.deliverNext());
            EXPECT_TRUE(result.deliverNext());
            EXPECT_FALSE(result.deliverNext());
            EXPECT_EQ(log.calls, (Calls{"succeeded(n1)", "failed(e2)", "succeeded(n3)", "finished()"}));
        }
    }

    // An exception from finished() itself is discarded too.
    CallLog log;
    log.throwAt(2);
    Zel_SettingsRes result(boost::make_shared<TextCB<Zel_SettingsCB>>(log), true);
    result.setResult(QStringLiteral("x"), success(log, "ok"));
    EXPECT_FALSE(result.deliverNext());
    EXPECT_EQ(log.calls, (Calls{"succeeded(x)", "finished()"}));
}

TEST(Zel_GenericResTest, EmptyCallbackConsumesItemsAndNullErrorMeansNoError)
{
    // No callback: nothing is called, yet delivery comes to an end.
    Zel_GetNodeRes orphan(boost::shared_ptr<Zel_ResultCB>(), true);
    orphan.setResult(boost::make_shared<Zel_Node>(), boost::make_shared<Zel_Error>());
    orphan.setResult(boost::make_shared<Zel_Node>(), boost::make_shared<Zel_Error>(3, QString()));
    EXPECT_TRUE(orphan.deliverNext());
    EXPECT_FALSE(orphan.deliverNext());
    EXPECT_FALSE(orphan.deliverNext());
    EXPECT_FALSE(orphan.haveResults());

    Zel_ChildrenRes orphanChildren(boost::shared_ptr<Zel_ChildrenCB>(), false);
    orphanChildren.setResult(boost::shared_ptr<Zel_Node>(), false, true, boost::shared_ptr<Zel_Error>());
    EXPECT_FALSE(orphanChildren.deliverNext());

    // An empty error pointer is a success and is never read through.
    CallLog log;
    Zel_GetNodeRes result(boost::make_shared<NodeCB<Zel_ResultCB>>(log), true);
    result.setResult(node(log, "n1"), boost::shared_ptr<Zel_Error>());
    EXPECT_FALSE(result.isCurrentResultError());
    EXPECT_FALSE(result.deliverNext());
    EXPECT_EQ(log.calls, (Calls{"succeeded(n1)", "finished()"}));

    CallLog childLog;
    Zel_ChildrenRes children(boost::make_shared<ChildrenCB>(childLog), false);
    children.setResult(node(childLog, "a"), node(childLog, "b"), boost::shared_ptr<Zel_Error>());
    EXPECT_FALSE(children.deliverNext());
    EXPECT_EQ(childLog.calls, (Calls{"succeeded(a,b)"}));

    CallLog voidLog;
    Zel_CreateReservationRes reservation(boost::make_shared<VoidCB<Zel_CreateReservationCB>>(voidLog), false);
    reservation.setResult(boost::shared_ptr<Zel_Error>());
    EXPECT_FALSE(reservation.deliverNext());
    EXPECT_EQ(voidLog.calls, (Calls{"succeeded()"}));
}

TEST(Zel_GenericResTest, CopySharesCallbackAndPayloadButKeepsItsOwnCursor)
{
    CallLog log;
    auto callback = boost::make_shared<NodeCB<Zel_ResultCB>>(log);
    boost::weak_ptr<Zel_ResultCB> watch = callback;
    auto original = boost::make_shared<Zel_GetNodeRes>(callback, true);
    callback.reset();
    original->setResult(node(log, "n1"), success(log, "ok"));
    original->setResult(node(log, "n2"), success(log, "ok"));
    EXPECT_TRUE(original->deliverNext());

    Zel_GetNodeRes copy(*original);
    EXPECT_FALSE(original->deliverNext());
    EXPECT_FALSE(copy.deliverNext()) << "the copy starts at the original's cursor";
    EXPECT_EQ(log.calls, (Calls{"succeeded(n1)", "succeeded(n2)", "finished()", "succeeded(n2)", "finished()"}));

    // Assignment takes over items and cursor; the callback lives while a result holds it.
    Zel_GetNodeRes assigned(boost::shared_ptr<Zel_ResultCB>(), false);
    assigned = copy;
    EXPECT_TRUE(assigned.isFinalResult());
    EXPECT_FALSE(assigned.haveResults());
    original.reset();
    EXPECT_FALSE(watch.expired());
}

namespace {

// A backend-style request whose work answers with two nodes.
class TwoNodesReq : public Zel_GetNodeReq
{
public:
    TwoNodesReq(boost::shared_ptr<Zel_ResultCB> callback, boost::shared_ptr<Zel_Node> first,
                boost::shared_ptr<Zel_Node> second)
        : Zel_GetNodeReq(callback)
        , mCallback(std::move(callback))
        , mFirst(std::move(first))
        , mSecond(std::move(second))
    {
    }
    bool doProcess(boost::shared_ptr<Orv_Result>& result) override
    {
        auto res = boost::make_shared<Zel_GetNodeRes>(mCallback, true);
        res->setResult(mFirst, boost::make_shared<Zel_Error>());
        res->setResult(mSecond, boost::make_shared<Zel_Error>(12, QStringLiteral("gone")));
        result = res;
        return true;
    }

private:
    boost::shared_ptr<Zel_ResultCB> mCallback;
    boost::shared_ptr<Zel_Node> mFirst;
    boost::shared_ptr<Zel_Node> mSecond;
};

} // namespace

TEST(Zel_GenericResTest, EngineDeliversAGetNodeResultToTheApplicationCallback)
{
    CallLog log;
    auto callback = boost::make_shared<NodeCB<Zel_ResultCB>>(log);
    Orv_Engine engine;
    engine.Submit(boost::make_shared<TwoNodesReq>(callback, node(log, "n1"), node(log, "n2")));
    engine.DeliverAll();
    ASSERT_EQ(log.calls.size(), 3u);
    EXPECT_EQ(log.calls[0], "succeeded(n1)");
    EXPECT_EQ(log.calls[1], "failed(anon)");
    EXPECT_EQ(log.calls[2], "finished()");
}
