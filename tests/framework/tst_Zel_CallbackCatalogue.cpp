// The callback catalogue: handler slot order of every callback and the setter
// slots of the results. (Each result header brings in the callback it answers.)
#include "VtableSlot.h"

#include "Zel_AddDependencyRes.h"
#include "Zel_AnalyzeCB.h"
#include "Zel_AssociationsRes.h"
#include "Zel_CheckinRes.h"
#include "Zel_CheckinUpdateRes.h"
#include "Zel_ChildrenAtCB.h"
#include "Zel_ChildrenAtMonikerCB.h"
#include "Zel_ChildrenRes.h"
#include "Zel_ConditionalSetPropertiesCB.h"
#include "Zel_CopyNodeCB.h"
#include "Zel_CreateFolderCB.h"
#include "Zel_CreateFolderUniqueRes.h"
#include "Zel_CreateNodeUniqueRes.h"
#include "Zel_CreatePropertyCB.h"
#include "Zel_CreateReservationRes.h"
#include "Zel_DeleteNodeRes.h"
#include "Zel_DeleteRes.h"
#include "Zel_DirCB.h"
#include "Zel_FrameLocatorListCB.h"
#include "Zel_FrameRestrictionListCB.h"
#include "Zel_GetApplicationSettingsRes.h"
#include "Zel_GetChildrenCB.h"
#include "Zel_GetChildrenRes.h"
#include "Zel_GetLinkedProjectsRes.h"
#include "Zel_GetNodeRes.h"
#include "Zel_GetReservationsRes.h"
#include "Zel_GetSettingsCB.h"
#include "Zel_GetSyncedProjRootRes.h"
#include "Zel_GetUserSettingsRes.h"
#include "Zel_LoginBriefCB.h"
#include "Zel_LoginCB.h"
#include "Zel_MediaResolutionsRes.h"
#include "Zel_MobBinaryCB.h"
#include "Zel_MobBinaryDnDCB.h"
#include "Zel_MobHeadframeCB.h"
#include "Zel_MobNodeCB.h"
#include "Zel_MonikerCB.h"
#include "Zel_MoveNodeCB.h"
#include "Zel_Node.h"
#include "Zel_NodeCB.h"
#include "Zel_NodePermissionsRes.h"
#include "Zel_NodeResolutionsRes.h"
#include "Zel_PropertyListCB.h"
#include "Zel_QueryCB.h"
#include "Zel_RefreshNodeCB.h"
#include "Zel_RemoveReservationRes.h"
#include "Zel_RenameNodeCB.h"
#include "Zel_RenameUniqueRes.h"
#include "Zel_RootNodeCB.h"
#include "Zel_SaveSettingsCB.h"
#include "Zel_ServerCheckCB.h"
#include "Zel_SetApplicationSettingsRes.h"
#include "Zel_SetPropertiesCB.h"
#include "Zel_SetUserSettingsRes.h"
#include "Zel_SettingsRes.h"
#include "Zel_StartupRes.h"

#include <gtest/gtest.h>

#include <type_traits>

// The slot of an overloaded member, picked by its signature.
#define ZEL_SLOT(Class, Method, Signature) vtableSlot(static_cast<void(Class::*) Signature>(&Class::Method))

namespace {

using NodeSP = boost::shared_ptr<Zel_Node>;
using ErrorSP = boost::shared_ptr<Zel_Error>;

// After the destructor (0, 1), cancelRequest (2) and isFinished (3), the
// handlers start at slot 4.
constexpr std::ptrdiff_t kFirstHandler = 4;
// After Zel_Res's operations, a result's own filling operations start at 10.
constexpr std::ptrdiff_t kFirstFiller = 10;

// succeeded, failed, finished after the engine's two slots.
template <class... CB>
void expectThreeSlots()
{
    const auto one = [](auto* probe) {
        using T = std::remove_pointer_t<decltype(probe)>;
        SCOPED_TRACE(typeid(T).name());
        EXPECT_EQ(slotsOutOfOrder(2, {ZEL_SLOT_ROW(T, cancelRequest), ZEL_SLOT_ROW(T, isFinished),
                                      ZEL_SLOT_ROW(T, succeeded), ZEL_SLOT_ROW(T, failed), ZEL_SLOT_ROW(T, finished)}),
                  "");
        EXPECT_TRUE(std::is_abstract<T>::value);
        EXPECT_TRUE((std::is_base_of<Orv_ResultsCB, T>::value));
        EXPECT_FALSE(std::is_copy_assignable<T>::value);
    };
    (one(static_cast<CB*>(nullptr)), ...);
}

// Zel_Res's delivery operations, then setResult.
template <class... Res>
void expectSetResultSlot()
{
    const auto one = [](auto* probe) {
        using T = std::remove_pointer_t<decltype(probe)>;
        SCOPED_TRACE(typeid(T).name());
        EXPECT_EQ(slotsOutOfOrder(4, {ZEL_SLOT_ROW(T, deliverNext), ZEL_SLOT_ROW(T, haveResults),
                                      ZEL_SLOT_ROW(T, isCurrentResultError), ZEL_SLOT_ROW(T, doFailed),
                                      ZEL_SLOT_ROW(T, doSucceeded), ZEL_SLOT_ROW(T, doFinished), ZEL_SLOT_ROW(T, setResult)}),
                  "");
        EXPECT_TRUE((std::is_base_of<Zel_Res, T>::value));
    };
    (one(static_cast<Res*>(nullptr)), ...);
}

} // namespace

TEST(Zel_CallbackCatalogueTest, CallbacksAnsweredByLibraryResultsKeepTheirHandlerSlots)
{
    expectThreeSlots<Zel_ResultCB, Zel_ResultBoolCB, Zel_AssociationsCB, Zel_CreateFolderUniqueCB, Zel_RenameUniqueCB,
                     Zel_CreateReservationCB, Zel_RemoveReservationCB, Zel_SetApplicationSettingsCB,
                     Zel_SetUserSettingsCB, Zel_GetApplicationSettingsCB, Zel_SettingsCB, Zel_GetReservationsCB,
                     Zel_GetUserSettingsCB, Zel_MediaResolutionsCB, Zel_NodePermissionsCB, Zel_NodeResolutionsCB,
                     Zel_CheckinCB, Zel_CheckinUpdateCB, Zel_DependencyCB>();

    // Two success handlers come before failed.
    EXPECT_EQ(slotsOutOfOrder(kFirstHandler, {{"succeeded(node,flag)", ZEL_SLOT(Zel_ChildrenCB, succeeded, (NodeSP, bool))},
                                              {"succeeded(node,node)", ZEL_SLOT(Zel_ChildrenCB, succeeded, (NodeSP, NodeSP))},
                                              ZEL_SLOT_ROW(Zel_ChildrenCB, failed), ZEL_SLOT_ROW(Zel_ChildrenCB, finished)}),
              "");
    // Start-up: no finished handler.
    EXPECT_EQ(slotsOutOfOrder(kFirstHandler, {ZEL_SLOT_ROW(Zel_StartupCB, succeeded), ZEL_SLOT_ROW(Zel_StartupCB, failed)}),
              "");

    EXPECT_EQ(slotsOutOfOrder(2, {ZEL_SLOT_ROW(Zel_DeleteCB, cancelRequest),
                                  ZEL_SLOT_ROW(Zel_DeleteCB, isFinished),
                                  ZEL_SLOT_ROW(Zel_DeleteCB, remoteAssetDeleteSuccessTotalResult),
                                  ZEL_SLOT_ROW(Zel_DeleteCB, remoteMetadataDeleteSuccessTotalResult),
                                  ZEL_SLOT_ROW(Zel_DeleteCB, remoteMetadataDeleteErrorPartialResult),
                                  ZEL_SLOT_ROW(Zel_DeleteCB, remoteMediaDeleteSuccessPartialResult),
                                  ZEL_SLOT_ROW(Zel_DeleteCB, remoteMediaDeleteErrorPartialResult),
                                  ZEL_SLOT_ROW(Zel_DeleteCB, localDeleteMediaSuccessPartialResult),
                                  ZEL_SLOT_ROW(Zel_DeleteCB, localDeleteMediaErrorPartialResult),
                                  ZEL_SLOT_ROW(Zel_DeleteCB, localDeleteMobNotFoundErrorPartialResult),
                                  ZEL_SLOT_ROW(Zel_DeleteCB, errorResult),
                                  ZEL_SLOT_ROW(Zel_DeleteCB, finished)}),
              "");
    static_assert(std::is_same<void (Zel_DeleteCB::*)(long), decltype(&Zel_DeleteCB::remoteAssetDeleteSuccessTotalResult)>::value,
                  "totals are passed as long");
}

TEST(Zel_CallbackCatalogueTest, CallbacksAnsweredByBackendResultsHaveTheirSlotCounts)
{
    expectThreeSlots<Zel_AnalyzeCB, Zel_ChildrenAtCB, Zel_ChildrenAtMonikerCB, Zel_CreateFolderCB, Zel_CreatePropertyCB,
                     Zel_DirCB, Zel_FrameLocatorListCB, Zel_FrameRestrictionListCB, Zel_GetSettingsCB, Zel_MobBinaryCB,
                     Zel_MobBinaryDnDCB, Zel_MobHeadframeCB, Zel_MobNodeCB, Zel_MonikerCB, Zel_MoveNodeCB, Zel_NodeCB,
                     Zel_PropertyListCB, Zel_QueryCB, Zel_RefreshNodeCB, Zel_RenameNodeCB, Zel_SaveSettingsCB,
                     Zel_ServerCheckCB, Zel_SetPropertiesCB, Zel_CopyNodeCB, Zel_GetChildrenCB,
                     Zel_ConditionalSetPropertiesCB>();

    // A fourth slot after the common three.
    EXPECT_EQ(vtableSlot(&Zel_QueryCB::setQuerySpec), kFirstHandler + 3);
    EXPECT_EQ(vtableSlot(&Zel_CopyNodeCB::progress), kFirstHandler + 3);
    EXPECT_EQ(vtableSlot(&Zel_GetChildrenCB::childrenCount), kFirstHandler + 3);
    EXPECT_EQ(vtableSlot(&Zel_ConditionalSetPropertiesCB::conditionFailed), kFirstHandler + 3);
    EXPECT_TRUE((std::is_base_of<Zel_SetPropertiesCB, Zel_ConditionalSetPropertiesCB>::value));

    // Two slots.
    EXPECT_EQ(slotsOutOfOrder(kFirstHandler, {ZEL_SLOT_ROW(Zel_LoginCB, succeeded), ZEL_SLOT_ROW(Zel_LoginCB, failed)}), "");
    EXPECT_EQ(slotsOutOfOrder(kFirstHandler,
                              {ZEL_SLOT_ROW(Zel_LoginBriefCB, succeeded), ZEL_SLOT_ROW(Zel_LoginBriefCB, failed)}),
              "");
    EXPECT_EQ(slotsOutOfOrder(kFirstHandler, {ZEL_SLOT_ROW(Zel_RootNodeCB, succeeded), ZEL_SLOT_ROW(Zel_RootNodeCB, failed)}),
              "");
}

TEST(Zel_CallbackCatalogueTest, ResultsKeepTheirFillingSlotsAfterTheDeliveryOperations)
{
    expectSetResultSlot<Zel_AssociationsRes, Zel_CreateFolderUniqueRes, Zel_CreateNodeUniqueRes, Zel_CreateReservationRes,
                        Zel_GetApplicationSettingsRes, Zel_GetChildrenRes, Zel_GetLinkedProjectsRes, Zel_GetNodeRes,
                        Zel_GetReservationsRes, Zel_GetSyncedProjRootRes, Zel_GetUserSettingsRes, Zel_MediaResolutionsRes,
                        Zel_NodePermissionsRes, Zel_NodeResolutionsRes, Zel_RemoveReservationRes, Zel_RenameUniqueRes,
                        Zel_SetApplicationSettingsRes, Zel_SetUserSettingsRes, Zel_SettingsRes, Zel_DeleteNodeRes,
                        Zel_AddDependencyRes>();

    EXPECT_EQ(ZEL_SLOT(Zel_ChildrenRes, setResult, (NodeSP, bool, bool, ErrorSP)), kFirstFiller);
    EXPECT_EQ(ZEL_SLOT(Zel_ChildrenRes, setResult, (NodeSP, NodeSP, ErrorSP)), kFirstFiller + 1);

    // The three results on the engine base add one slot after deliverNext.
    EXPECT_EQ(slotsOutOfOrder(4, {ZEL_SLOT_ROW(Zel_CheckinRes, deliverNext), ZEL_SLOT_ROW(Zel_CheckinRes, addItem)}), "");
    EXPECT_EQ(slotsOutOfOrder(4, {ZEL_SLOT_ROW(Zel_CheckinUpdateRes, deliverNext),
                                  ZEL_SLOT_ROW(Zel_CheckinUpdateRes, addItem)}),
              "");
    EXPECT_EQ(slotsOutOfOrder(4, {ZEL_SLOT_ROW(Zel_StartupRes, deliverNext), ZEL_SLOT_ROW(Zel_StartupRes, setError)}), "");
    EXPECT_FALSE((std::is_base_of<Zel_Res, Zel_CheckinRes>::value));

    EXPECT_EQ(slotsOutOfOrder(9, {ZEL_SLOT_ROW(Zel_DeleteRes, doFinished),
                                  ZEL_SLOT_ROW(Zel_DeleteRes, setRemoteAssetDeleteSuccessTotalResult),
                                  ZEL_SLOT_ROW(Zel_DeleteRes, setRemoteMetadataDeleteSuccessTotalResult),
                                  ZEL_SLOT_ROW(Zel_DeleteRes, setRemoteMetadataDeleteErrorPartialResult),
                                  ZEL_SLOT_ROW(Zel_DeleteRes, setRemoteMediaDeleteSuccessPartialResult),
                                  ZEL_SLOT_ROW(Zel_DeleteRes, setRemoteMediaDeleteErrorPartialResult),
                                  ZEL_SLOT_ROW(Zel_DeleteRes, setLocalDeleteMediaSuccessPartialResult),
                                  ZEL_SLOT_ROW(Zel_DeleteRes, setLocalDeleteMediaErrorPartialResult),
                                  ZEL_SLOT_ROW(Zel_DeleteRes, setLocalDeleteMobNotFoundErrorPartialResult),
                                  ZEL_SLOT_ROW(Zel_DeleteRes, setErrorResult)}),
              "");
    // Items: destructor, then deliver.
    EXPECT_EQ(vtableSlot(&Zel_DeleteRes::ResultItem::deliver), 2);
    EXPECT_EQ(vtableSlot(&Zel_DeleteRes::LocalDeleteMobNotFoundErrorPartialResultItem::deliver), 2);
    EXPECT_TRUE((std::is_base_of<Zel_DeleteRes::ResultItem, Zel_DeleteRes::RemoteMediaDeleteErrorPartialResultItem>::value));
}
