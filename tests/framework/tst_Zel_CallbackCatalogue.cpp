// The callback catalogue: handler slot order of every callback, the setter
// slots of the results, and the callbacks with fields of their own.
#include "VtableSlot.h"

#include "Zel_AddDependencyRes.h"
#include "Zel_AnalyzeCB.h"
#include "Zel_AssociationsCB.h"
#include "Zel_AssociationsRes.h"
#include "Zel_CheckinCB.h"
#include "Zel_CheckinRes.h"
#include "Zel_CheckinUpdateCB.h"
#include "Zel_CheckinUpdateRes.h"
#include "Zel_ChildrenAtCB.h"
#include "Zel_ChildrenAtMonikerCB.h"
#include "Zel_ChildrenCB.h"
#include "Zel_ChildrenRes.h"
#include "Zel_ConditionalSetPropertiesCB.h"
#include "Zel_CopyNodeCB.h"
#include "Zel_CreateFolderCB.h"
#include "Zel_CreateFolderUniqueCB.h"
#include "Zel_CreateFolderUniqueRes.h"
#include "Zel_CreateNodeUniqueRes.h"
#include "Zel_CreatePropertyCB.h"
#include "Zel_CreateReservationCB.h"
#include "Zel_CreateReservationRes.h"
#include "Zel_DeleteCB.h"
#include "Zel_DeleteNodeRes.h"
#include "Zel_DeleteRes.h"
#include "Zel_DependencyCB.h"
#include "Zel_DirCB.h"
#include "Zel_FrameLocatorListCB.h"
#include "Zel_FrameRestrictionListCB.h"
#include "Zel_GetApplicationSettingsCB.h"
#include "Zel_GetApplicationSettingsRes.h"
#include "Zel_GetChildrenCB.h"
#include "Zel_GetChildrenRes.h"
#include "Zel_GetLinkedProjectsRes.h"
#include "Zel_GetNodeRes.h"
#include "Zel_GetReservationsCB.h"
#include "Zel_GetReservationsRes.h"
#include "Zel_GetSettingsCB.h"
#include "Zel_GetSyncedProjRootRes.h"
#include "Zel_GetUserSettingsCB.h"
#include "Zel_GetUserSettingsRes.h"
#include "Zel_LoginBriefCB.h"
#include "Zel_LoginCB.h"
#include "Zel_MediaResolutionsCB.h"
#include "Zel_MediaResolutionsRes.h"
#include "Zel_MobBinaryCB.h"
#include "Zel_MobBinaryDnDCB.h"
#include "Zel_MobHeadframeCB.h"
#include "Zel_MobNodeCB.h"
#include "Zel_MonikerCB.h"
#include "Zel_MoveNodeCB.h"
#include "Zel_Node.h"
#include "Zel_NodeCB.h"
#include "Zel_NodePermissionsCB.h"
#include "Zel_NodePermissionsRes.h"
#include "Zel_NodeResolutionsCB.h"
#include "Zel_NodeResolutionsRes.h"
#include "Zel_PropertyListCB.h"
#include "Zel_QueryCB.h"
#include "Zel_QuerySpec.h"
#include "Zel_RefreshNodeCB.h"
#include "Zel_RemoveReservationCB.h"
#include "Zel_RemoveReservationRes.h"
#include "Zel_RenameNodeCB.h"
#include "Zel_RenameUniqueCB.h"
#include "Zel_RenameUniqueRes.h"
#include "Zel_ResultBoolCB.h"
#include "Zel_ResultCB.h"
#include "Zel_RootNodeCB.h"
#include "Zel_SaveSettingsCB.h"
#include "Zel_ServerCheckCB.h"
#include "Zel_SetApplicationSettingsCB.h"
#include "Zel_SetApplicationSettingsRes.h"
#include "Zel_SetPropertiesCB.h"
#include "Zel_SetUserSettingsCB.h"
#include "Zel_SetUserSettingsRes.h"
#include "Zel_SettingsCB.h"
#include "Zel_SettingsRes.h"
#include "Zel_StartupCB.h"
#include "Zel_StartupRes.h"

#include <boost/make_shared.hpp>
#include <boost/weak_ptr.hpp>
#include <gtest/gtest.h>

#include <type_traits>

// The slot of an overloaded member, picked by its signature.
#define ZEL_SLOT(Class, Method, Signature) vtableSlot(static_cast<void(Class::*) Signature>(&Class::Method))

namespace {

using NodeSP = boost::shared_ptr<Zel_Node>;
using ErrorSP = boost::shared_ptr<Zel_Error>;
using MobIDSP = boost::shared_ptr<Zel_MobID>;
using TextSP = boost::shared_ptr<QString>;

// After the destructor (0, 1), cancelRequest (2) and isFinished (3), the
// handlers start at slot 4.
constexpr std::ptrdiff_t kFirstHandler = 4;
// After Zel_Res's operations, a result's own filling operations start at 10.
constexpr std::ptrdiff_t kFirstFiller = 10;

template <class CB>
void expectCommonShape()
{
    EXPECT_EQ(vtableSlot(&CB::cancelRequest), 2);
    EXPECT_EQ(vtableSlot(&CB::isFinished), 3);
    EXPECT_EQ(vtableSlot(&CB::failed), kFirstHandler + 1);
    EXPECT_EQ(vtableSlot(&CB::finished), kFirstHandler + 2);
    EXPECT_TRUE(std::is_abstract<CB>::value);
    EXPECT_TRUE((std::is_base_of<Orv_ResultsCB, CB>::value));
    EXPECT_FALSE(std::is_copy_assignable<CB>::value);
}

template <class CB>
void expectThreeSlots()
{
    SCOPED_TRACE(typeid(CB).name());
    expectCommonShape<CB>();
    EXPECT_EQ(vtableSlot(&CB::succeeded), kFirstHandler);
}

template <class Res>
void expectSetResultSlot()
{
    SCOPED_TRACE(typeid(Res).name());
    EXPECT_EQ(vtableSlot(&Res::deliverNext), 4);
    EXPECT_EQ(vtableSlot(&Res::haveResults), 5);
    EXPECT_EQ(vtableSlot(&Res::isCurrentResultError), 6);
    EXPECT_EQ(vtableSlot(&Res::doFailed), 7);
    EXPECT_EQ(vtableSlot(&Res::doSucceeded), 8);
    EXPECT_EQ(vtableSlot(&Res::doFinished), 9);
    EXPECT_EQ(vtableSlot(&Res::setResult), kFirstFiller);
    EXPECT_TRUE((std::is_base_of<Zel_Res, Res>::value));
}

} // namespace

TEST(Zel_CallbackCatalogueTest, CallbacksAnsweredByLibraryResultsKeepTheirHandlerSlots)
{
    expectThreeSlots<Zel_ResultCB>();
    expectThreeSlots<Zel_ResultBoolCB>();
    expectThreeSlots<Zel_AssociationsCB>();
    expectThreeSlots<Zel_CreateFolderUniqueCB>();
    expectThreeSlots<Zel_RenameUniqueCB>();
    expectThreeSlots<Zel_CreateReservationCB>();
    expectThreeSlots<Zel_RemoveReservationCB>();
    expectThreeSlots<Zel_SetApplicationSettingsCB>();
    expectThreeSlots<Zel_SetUserSettingsCB>();
    expectThreeSlots<Zel_GetApplicationSettingsCB>();
    expectThreeSlots<Zel_SettingsCB>();
    expectThreeSlots<Zel_GetReservationsCB>();
    expectThreeSlots<Zel_GetUserSettingsCB>();
    expectThreeSlots<Zel_MediaResolutionsCB>();
    expectThreeSlots<Zel_NodePermissionsCB>();
    expectThreeSlots<Zel_NodeResolutionsCB>();
    expectThreeSlots<Zel_CheckinCB>();
    expectThreeSlots<Zel_CheckinUpdateCB>();
    expectThreeSlots<Zel_DependencyCB>();

    // Two success handlers come before failed.
    EXPECT_EQ(ZEL_SLOT(Zel_ChildrenCB, succeeded, (NodeSP, bool)), kFirstHandler);
    EXPECT_EQ(ZEL_SLOT(Zel_ChildrenCB, succeeded, (NodeSP, NodeSP)), kFirstHandler + 1);
    EXPECT_EQ(vtableSlot(&Zel_ChildrenCB::failed), kFirstHandler + 2);
    EXPECT_EQ(vtableSlot(&Zel_ChildrenCB::finished), kFirstHandler + 3);

    // Start-up: no finished handler.
    EXPECT_EQ(vtableSlot(&Zel_StartupCB::succeeded), kFirstHandler);
    EXPECT_EQ(vtableSlot(&Zel_StartupCB::failed), kFirstHandler + 1);
}

TEST(Zel_CallbackCatalogueTest, DeleteCallbackHasItsTenHandlersInOrder)
{
    EXPECT_EQ(vtableSlot(&Zel_DeleteCB::cancelRequest), 2);
    EXPECT_EQ(vtableSlot(&Zel_DeleteCB::isFinished), 3);
    EXPECT_EQ(vtableSlot(&Zel_DeleteCB::remoteAssetDeleteSuccessTotalResult), 4);
    EXPECT_EQ(vtableSlot(&Zel_DeleteCB::remoteMetadataDeleteSuccessTotalResult), 5);
    EXPECT_EQ(vtableSlot(&Zel_DeleteCB::remoteMetadataDeleteErrorPartialResult), 6);
    EXPECT_EQ(vtableSlot(&Zel_DeleteCB::remoteMediaDeleteSuccessPartialResult), 7);
    EXPECT_EQ(vtableSlot(&Zel_DeleteCB::remoteMediaDeleteErrorPartialResult), 8);
    EXPECT_EQ(vtableSlot(&Zel_DeleteCB::localDeleteMediaSuccessPartialResult), 9);
    EXPECT_EQ(vtableSlot(&Zel_DeleteCB::localDeleteMediaErrorPartialResult), 10);
    EXPECT_EQ(vtableSlot(&Zel_DeleteCB::localDeleteMobNotFoundErrorPartialResult), 11);
    EXPECT_EQ(vtableSlot(&Zel_DeleteCB::errorResult), 12);
    EXPECT_EQ(vtableSlot(&Zel_DeleteCB::finished), 13);
    static_assert(std::is_same<void (Zel_DeleteCB::*)(long), decltype(&Zel_DeleteCB::remoteAssetDeleteSuccessTotalResult)>::value,
                  "totals are passed as long");
}

TEST(Zel_CallbackCatalogueTest, CallbacksAnsweredByBackendResultsHaveTheirSlotCounts)
{
    expectThreeSlots<Zel_AnalyzeCB>();
    expectThreeSlots<Zel_ChildrenAtCB>();
    expectThreeSlots<Zel_ChildrenAtMonikerCB>();
    expectThreeSlots<Zel_CreateFolderCB>();
    expectThreeSlots<Zel_CreatePropertyCB>();
    expectThreeSlots<Zel_DirCB>();
    expectThreeSlots<Zel_FrameLocatorListCB>();
    expectThreeSlots<Zel_FrameRestrictionListCB>();
    expectThreeSlots<Zel_GetSettingsCB>();
    expectThreeSlots<Zel_MobBinaryCB>();
    expectThreeSlots<Zel_MobBinaryDnDCB>();
    expectThreeSlots<Zel_MobHeadframeCB>();
    expectThreeSlots<Zel_MobNodeCB>();
    expectThreeSlots<Zel_MonikerCB>();
    expectThreeSlots<Zel_MoveNodeCB>();
    expectThreeSlots<Zel_NodeCB>();
    expectThreeSlots<Zel_PropertyListCB>();
    expectThreeSlots<Zel_QueryCB>();
    expectThreeSlots<Zel_RefreshNodeCB>();
    expectThreeSlots<Zel_RenameNodeCB>();
    expectThreeSlots<Zel_SaveSettingsCB>();
    expectThreeSlots<Zel_ServerCheckCB>();
    expectThreeSlots<Zel_SetPropertiesCB>();

    // The query specification setter follows the three handlers.
    EXPECT_EQ(vtableSlot(&Zel_QueryCB::setQuerySpec), kFirstHandler + 3);

    // Four slots: the fourth after the common three.
    expectThreeSlots<Zel_CopyNodeCB>();
    EXPECT_EQ(vtableSlot(&Zel_CopyNodeCB::progress), kFirstHandler + 3);
    expectThreeSlots<Zel_GetChildrenCB>();
    EXPECT_EQ(vtableSlot(&Zel_GetChildrenCB::childrenCount), kFirstHandler + 3);
    expectThreeSlots<Zel_ConditionalSetPropertiesCB>();
    EXPECT_EQ(vtableSlot(&Zel_ConditionalSetPropertiesCB::conditionFailed), kFirstHandler + 3);
    EXPECT_TRUE((std::is_base_of<Zel_SetPropertiesCB, Zel_ConditionalSetPropertiesCB>::value));

    // Two slots.
    EXPECT_EQ(vtableSlot(&Zel_LoginCB::succeeded), kFirstHandler);
    EXPECT_EQ(vtableSlot(&Zel_LoginCB::failed), kFirstHandler + 1);
    EXPECT_EQ(vtableSlot(&Zel_LoginBriefCB::succeeded), kFirstHandler);
    EXPECT_EQ(vtableSlot(&Zel_LoginBriefCB::failed), kFirstHandler + 1);
    EXPECT_EQ(vtableSlot(&Zel_RootNodeCB::succeeded), kFirstHandler);
    EXPECT_EQ(vtableSlot(&Zel_RootNodeCB::failed), kFirstHandler + 1);
}

TEST(Zel_CallbackCatalogueTest, ResultsKeepTheirFillingSlotsAfterTheDeliveryOperations)
{
    expectSetResultSlot<Zel_AssociationsRes>();
    expectSetResultSlot<Zel_CreateFolderUniqueRes>();
    expectSetResultSlot<Zel_CreateNodeUniqueRes>();
    expectSetResultSlot<Zel_CreateReservationRes>();
    expectSetResultSlot<Zel_GetApplicationSettingsRes>();
    expectSetResultSlot<Zel_GetChildrenRes>();
    expectSetResultSlot<Zel_GetLinkedProjectsRes>();
    expectSetResultSlot<Zel_GetNodeRes>();
    expectSetResultSlot<Zel_GetReservationsRes>();
    expectSetResultSlot<Zel_GetSyncedProjRootRes>();
    expectSetResultSlot<Zel_GetUserSettingsRes>();
    expectSetResultSlot<Zel_MediaResolutionsRes>();
    expectSetResultSlot<Zel_NodePermissionsRes>();
    expectSetResultSlot<Zel_NodeResolutionsRes>();
    expectSetResultSlot<Zel_RemoveReservationRes>();
    expectSetResultSlot<Zel_RenameUniqueRes>();
    expectSetResultSlot<Zel_SetApplicationSettingsRes>();
    expectSetResultSlot<Zel_SetUserSettingsRes>();
    expectSetResultSlot<Zel_SettingsRes>();
    expectSetResultSlot<Zel_DeleteNodeRes>();
    expectSetResultSlot<Zel_AddDependencyRes>();

    EXPECT_EQ(ZEL_SLOT(Zel_ChildrenRes, setResult, (NodeSP, bool, bool, ErrorSP)), kFirstFiller);
    EXPECT_EQ(ZEL_SLOT(Zel_ChildrenRes, setResult, (NodeSP, NodeSP, ErrorSP)), kFirstFiller + 1);

    // The three results on the engine base add one slot after deliverNext.
    EXPECT_EQ(vtableSlot(&Zel_CheckinRes::deliverNext), 4);
    EXPECT_EQ(vtableSlot(&Zel_CheckinRes::addItem), 5);
    EXPECT_EQ(vtableSlot(&Zel_CheckinUpdateRes::deliverNext), 4);
    EXPECT_EQ(vtableSlot(&Zel_CheckinUpdateRes::addItem), 5);
    EXPECT_EQ(vtableSlot(&Zel_StartupRes::deliverNext), 4);
    EXPECT_EQ(vtableSlot(&Zel_StartupRes::setError), 5);
    EXPECT_FALSE((std::is_base_of<Zel_Res, Zel_CheckinRes>::value));
}

TEST(Zel_CallbackCatalogueTest, DeleteResultSettersAndItemDeliveryKeepTheirSlots)
{
    EXPECT_EQ(vtableSlot(&Zel_DeleteRes::doFinished), 9);
    EXPECT_EQ(vtableSlot(&Zel_DeleteRes::setRemoteAssetDeleteSuccessTotalResult), 10);
    EXPECT_EQ(vtableSlot(&Zel_DeleteRes::setRemoteMetadataDeleteSuccessTotalResult), 11);
    EXPECT_EQ(vtableSlot(&Zel_DeleteRes::setRemoteMetadataDeleteErrorPartialResult), 12);
    EXPECT_EQ(vtableSlot(&Zel_DeleteRes::setRemoteMediaDeleteSuccessPartialResult), 13);
    EXPECT_EQ(vtableSlot(&Zel_DeleteRes::setRemoteMediaDeleteErrorPartialResult), 14);
    EXPECT_EQ(vtableSlot(&Zel_DeleteRes::setLocalDeleteMediaSuccessPartialResult), 15);
    EXPECT_EQ(vtableSlot(&Zel_DeleteRes::setLocalDeleteMediaErrorPartialResult), 16);
    EXPECT_EQ(vtableSlot(&Zel_DeleteRes::setLocalDeleteMobNotFoundErrorPartialResult), 17);
    EXPECT_EQ(vtableSlot(&Zel_DeleteRes::setErrorResult), 18);

    // Items: destructor, then deliver.
    EXPECT_EQ(vtableSlot(&Zel_DeleteRes::ResultItem::deliver), 2);
    EXPECT_EQ(vtableSlot(&Zel_DeleteRes::LocalDeleteMobNotFoundErrorPartialResultItem::deliver), 2);
    EXPECT_TRUE((std::is_base_of<Zel_DeleteRes::ResultItem, Zel_DeleteRes::RemoteMediaDeleteErrorPartialResultItem>::value));
}

namespace {

class QueryCB : public Zel_QueryCB
{
public:
    void succeeded(NodeSP) override {}
    void failed(ErrorSP) override {}
    void finished() override {}
    void setQuerySpec(boost::shared_ptr<Zel_QuerySpec> querySpec) override
    {
        ++setCount;
        Zel_QueryCB::setQuerySpec(std::move(querySpec));
    }
    int setCount = 0;
};

class ChildrenAtMonikerCB : public Zel_ChildrenAtMonikerCB
{
public:
    void succeeded(NodeSP) override {}
    void failed(ErrorSP) override {}
    void finished() override {}
};

class MobBinaryCB : public Zel_MobBinaryCB
{
public:
    void succeeded(MobIDSP, QByteArray) override {}
    void failed(ErrorSP) override {}
    void finished() override {}
    boost::shared_ptr<void>& context() { return mContext; }
};

class MobHeadframeCB : public Zel_MobHeadframeCB
{
public:
    void succeeded(MobIDSP, QByteArray) override {}
    void failed(ErrorSP) override {}
    void finished() override {}
    boost::shared_ptr<void>& context() { return mContext; }
};

} // namespace

TEST(Zel_CallbackCatalogueTest, ChildrenAtMonikerAndQueryCallbacksShareWhatTheyAreGiven)
{
    ChildrenAtMonikerCB callback;
    EXPECT_FALSE(callback.getParentNode());
    EXPECT_FALSE(callback.getParentMoniker());
    EXPECT_EQ(callback.getCallbackID().getValue(), -2);

    auto parent = boost::make_shared<Zel_Node>(QStringLiteral("p"));
    auto moniker = boost::make_shared<QString>(QStringLiteral("m"));
    callback.setParentNode(parent);
    callback.setParentMoniker(moniker);
    EXPECT_EQ(callback.getParentNode(), parent);
    EXPECT_EQ(callback.getParentMoniker(), moniker);
    const ChildrenAtMonikerCB copy(callback);
    EXPECT_EQ(copy.getParentNode(), parent);
    EXPECT_EQ(copy.getParentMoniker(), moniker);
    EXPECT_EQ(parent.use_count(), 3);

    auto query = boost::make_shared<QueryCB>();
    EXPECT_FALSE(query->getQuerySpec());
    auto spec = boost::make_shared<Zel_QuerySpec>();
    boost::shared_ptr<Zel_QueryCB> asBase = query;
    asBase->setQuerySpec(spec);
    EXPECT_EQ(query->setCount, 1) << "setQuerySpec is virtual";
    EXPECT_EQ(query->getQuerySpec(), spec);
    const QueryCB queryCopy(*query);
    EXPECT_EQ(queryCopy.getQuerySpec(), spec);
}

TEST(Zel_CallbackCatalogueTest, MediaCallbacksShareTheirContextAndReleaseItWithTheLastCopy)
{
    boost::weak_ptr<void> watch;
    {
        MobBinaryCB callback;
        EXPECT_FALSE(callback.context());
        auto context = boost::make_shared<int>(5);
        watch = context;
        callback.context() = context;
        context.reset();
        MobBinaryCB copy(callback);
        EXPECT_EQ(copy.context(), callback.context());
        EXPECT_FALSE(watch.expired());
    }
    EXPECT_TRUE(watch.expired());

    MobHeadframeCB headframe;
    EXPECT_FALSE(headframe.context());
    EXPECT_EQ(headframe.getCallbackID().getValue(), -2);
}
