// The request catalogue: every request class has the same three members, so
// they are defined here once, with one macro line per class.

#include "Zel_AddDependencyReq.h"
#include "Zel_AddFrameLocatorListReq.h"
#include "Zel_AddFrameRestrictionListReq.h"
#include "Zel_AnalyzeReq.h"
#include "Zel_AssociationsReq.h"
#include "Zel_CheckinLocalBinReq.h"
#include "Zel_CheckinReq.h"
#include "Zel_CheckinUpdateReq.h"
#include "Zel_ChildrenAtMonikerReq.h"
#include "Zel_ChildrenAtReq.h"
#include "Zel_ChildrenReq.h"
#include "Zel_CopyNodeReq.h"
#include "Zel_CreateFolderReq.h"
#include "Zel_CreateFolderUniqueReq.h"
#include "Zel_CreateNodeUniqueReq.h"
#include "Zel_CreatePropertyReq.h"
#include "Zel_CreateReservationReq.h"
#include "Zel_DeleteFrameLocatorListReq.h"
#include "Zel_DeleteFrameRestrictionListReq.h"
#include "Zel_DeleteNodeReq.h"
#include "Zel_DeleteReq.h"
#include "Zel_DirReq.h"
#include "Zel_GetApplicationSettingsReq.h"
#include "Zel_GetChildrenReq.h"
#include "Zel_GetFrameLocatorListReq.h"
#include "Zel_GetFrameRestrictionListReq.h"
#include "Zel_GetLinkedProjectsReq.h"
#include "Zel_GetNodeReq.h"
#include "Zel_GetPropertiesReq.h"
#include "Zel_GetReservationsReq.h"
#include "Zel_GetSettingsReq.h"
#include "Zel_GetSyncedProjRootReq.h"
#include "Zel_GetUserPriviledgesReq.h"
#include "Zel_GetUserSettingsReq.h"
#include "Zel_GetWorkgroupSettingsReq.h"
#include "Zel_LoginReq.h"
#include "Zel_MediaResolutionsReq.h"
#include "Zel_MobBinaryDnDReq.h"
#include "Zel_MobBinaryReq.h"
#include "Zel_MobHeadframeReq.h"
#include "Zel_MobNodeReq.h"
#include "Zel_MonikerReq.h"
#include "Zel_MoveNodeReq.h"
#include "Zel_NodePermissionsReq.h"
#include "Zel_NodeReq.h"
#include "Zel_NodeResolutionsReq.h"
#include "Zel_PropertyListReq.h"
#include "Zel_QueryReq.h"
#include "Zel_RefreshNodeReq.h"
#include "Zel_RemoveReservationReq.h"
#include "Zel_RenameNodeReq.h"
#include "Zel_RenameUniqueReq.h"
#include "Zel_RootNodeReq.h"
#include "Zel_SaveSettingsReq.h"
#include "Zel_SetApplicationSettingsReq.h"
#include "Zel_SetPropertiesReq.h"
#include "Zel_SetUserSettingsReq.h"
#include "Zel_StartupReq.h"

#include "Orv_ResultsCB.h"

// A request on Zel_Req: the name goes through QString, as Zel_Req takes it.
#define ZEL_DEFINE_REQUEST(Class, Name)                                                \
    Class::Class(boost::shared_ptr<Orv_ResultsCB> callback)                            \
        : Zel_Req(QStringLiteral(Name), std::move(callback))                           \
    {                                                                                  \
    }                                                                                  \
    Class::Class(const Class& other) = default;                                        \
    Class::~Class() = default;

// A request on Orv_Request: the engine's name is built from the literal directly.
#define ZEL_DEFINE_ENGINE_REQUEST(Class)                                               \
    Class::Class(boost::shared_ptr<Orv_ResultsCB> callback)                            \
        : Orv_Request(std::string(#Class), std::move(callback))                        \
    {                                                                                  \
    }                                                                                  \
    Class::Class(const Class& other) = default;                                        \
    Class::~Class() = default;

ZEL_DEFINE_REQUEST(Zel_AddDependencyReq, "Zel_AddDependencyReq")
ZEL_DEFINE_REQUEST(Zel_AddFrameLocatorListReq, "Zel_AddFrameLocatorListReq")
ZEL_DEFINE_REQUEST(Zel_AddFrameRestrictionListReq, "Zel_AddFrameRestrictionListReq")
ZEL_DEFINE_REQUEST(Zel_AnalyzeReq, "Zel_AnalyzeReq")
ZEL_DEFINE_REQUEST(Zel_AssociationsReq, "Zel_AssociationsReq")
ZEL_DEFINE_REQUEST(Zel_CheckinLocalBinReq, "Zel_CheckinLocalBinReq")
ZEL_DEFINE_REQUEST(Zel_CheckinReq, "Zel_CheckinReq")
ZEL_DEFINE_REQUEST(Zel_CheckinUpdateReq, "Zel_CheckinUpdateReq")
ZEL_DEFINE_REQUEST(Zel_ChildrenAtMonikerReq, "Zel_ChildrenAtMonikerReq")
ZEL_DEFINE_REQUEST(Zel_ChildrenAtReq, "Zel_ChildrenAtReq")
ZEL_DEFINE_REQUEST(Zel_ChildrenReq, "Zel_ChildrenReq")
ZEL_DEFINE_REQUEST(Zel_CopyNodeReq, "Zel_CopyNodeReq")
ZEL_DEFINE_REQUEST(Zel_CreateFolderReq, "Zel_CreateFolderReq")
ZEL_DEFINE_REQUEST(Zel_CreateFolderUniqueReq, "Zel_CreateFolderUniqueReq")
ZEL_DEFINE_REQUEST(Zel_CreateNodeUniqueReq, "Zel_CreateNodeUniqueReq")
ZEL_DEFINE_REQUEST(Zel_CreatePropertyReq, "Zel_CreatePropertyReq")
ZEL_DEFINE_REQUEST(Zel_CreateReservationReq, "Zel_CreateReservationReq")
ZEL_DEFINE_REQUEST(Zel_DeleteFrameLocatorListReq, "Zel_DeleteFrameLocatorListReq")
ZEL_DEFINE_REQUEST(Zel_DeleteFrameRestrictionListReq, "Zel_DeleteFrameRestrictionListReq")
ZEL_DEFINE_REQUEST(Zel_DeleteNodeReq, "Zel_DeleteNodeReq")
ZEL_DEFINE_REQUEST(Zel_DeleteReq, "Zel_DeleteReq")
ZEL_DEFINE_REQUEST(Zel_DirReq, "Zel_DirReq")
ZEL_DEFINE_REQUEST(Zel_GetApplicationSettingsReq, "Zel_GetApplicationSettingsReq")
ZEL_DEFINE_REQUEST(Zel_GetChildrenReq, "Zel_GetChildrenReq")
ZEL_DEFINE_REQUEST(Zel_GetFrameLocatorListReq, "Zel_GetFrameLocatorListReq")
ZEL_DEFINE_REQUEST(Zel_GetFrameRestrictionListReq, "Zel_GetFrameRestrictionListReq")
ZEL_DEFINE_REQUEST(Zel_GetLinkedProjectsReq, "Zel_GetLinkedProjectsReq")
ZEL_DEFINE_REQUEST(Zel_GetNodeReq, "Zel_GetNodeReq")
ZEL_DEFINE_ENGINE_REQUEST(Zel_GetPropertiesReq)
ZEL_DEFINE_REQUEST(Zel_GetReservationsReq, "Zel_GetReservationsReq")
ZEL_DEFINE_REQUEST(Zel_GetSettingsReq, "Zel_GetSettingsReq")
ZEL_DEFINE_REQUEST(Zel_GetSyncedProjRootReq, "Zel_GetSyncedProjRootReq")
ZEL_DEFINE_REQUEST(Zel_GetUserPriviledgesReq, "Zel_GetUserPriviledgesReq")
ZEL_DEFINE_REQUEST(Zel_GetUserSettingsReq, "Zel_GetUserSettingsReq")
ZEL_DEFINE_REQUEST(Zel_GetWorkgroupSettingsReq, "Zel_GetWorkgroupSettingsReq")
ZEL_DEFINE_ENGINE_REQUEST(Zel_LoginReq)
ZEL_DEFINE_REQUEST(Zel_MediaResolutionsReq, "Zel_MediaResolutionsReq")
ZEL_DEFINE_REQUEST(Zel_MobBinaryDnDReq, "Zel_MobBinaryDnDReq")
ZEL_DEFINE_REQUEST(Zel_MobBinaryReq, "Zel_MobBinaryReq")
ZEL_DEFINE_REQUEST(Zel_MobHeadframeReq, "Zel_MobHeadframeReq")
ZEL_DEFINE_REQUEST(Zel_MobNodeReq, "Zel_MobNodeReq")
ZEL_DEFINE_REQUEST(Zel_MonikerReq, "Zel_MonikerReq")
ZEL_DEFINE_REQUEST(Zel_MoveNodeReq, "Zel_MoveNodeReq")
ZEL_DEFINE_REQUEST(Zel_NodePermissionsReq, "Zel_NodePermissionsReq")
ZEL_DEFINE_REQUEST(Zel_NodeReq, "Zel_NodeReq")
ZEL_DEFINE_REQUEST(Zel_NodeResolutionsReq, "Zel_NodeResolutionsReq")
ZEL_DEFINE_REQUEST(Zel_PropertyListReq, "Zel_PropertyListReq")
ZEL_DEFINE_REQUEST(Zel_QueryReq, "Zel_Query")
ZEL_DEFINE_REQUEST(Zel_RefreshNodeReq, "Zel_RefreshNodeReq")
ZEL_DEFINE_REQUEST(Zel_RemoveReservationReq, "Zel_RemoveReservationReq")
ZEL_DEFINE_REQUEST(Zel_RenameNodeReq, "Zel_RenameNodeReq")
ZEL_DEFINE_REQUEST(Zel_RenameUniqueReq, "Zel_RenameUniqueReq")
ZEL_DEFINE_ENGINE_REQUEST(Zel_RootNodeReq)
ZEL_DEFINE_REQUEST(Zel_SaveSettingsReq, "Zel_SaveSettingsReq")
ZEL_DEFINE_REQUEST(Zel_SetApplicationSettingsReq, "Zel_SetApplicationSettingsReq")
ZEL_DEFINE_REQUEST(Zel_SetPropertiesReq, "Zel_SetPropertiesReq")
ZEL_DEFINE_REQUEST(Zel_SetUserSettingsReq, "Zel_SetUserSettingsReq")
ZEL_DEFINE_REQUEST(Zel_StartupReq, "Zel_StartupReq")
