// Internal: the catalogue of operations, one per request class.
//
// Each operation names the callback it answers, the result class it answers
// with (the library's where it defines one, MemoryRes otherwise), whether it
// needs a logged-in user, its arguments, and its work run(). execute() is
// runOperation() (session_p.h) instantiated in the operation's source
// file, so this header needs only the callback and result names.
#ifndef ZEL_SERVER_OPS_P_H
#define ZEL_SERVER_OPS_P_H

#include "results_p.h"
#include "session_p.h"

#include "Zel_DependencySPList.h"
#include "Zel_Directory.h"
#include "Zel_FrameLocator.h"
#include "Zel_GetUserSettingsCB.h"
#include "Zel_MobDescList.h"
#include "Zel_MobID.h"
#include "Zel_MobIDList.h"
#include "Zel_Property.h"
#include "Zel_PropertyList.h"
#include "Zel_QuerySpec.h"

#include <QDateTime>
#include <QList>
#include <QString>
#include <QStringList>
#include <boost/shared_ptr.hpp>

#include <type_traits>
#include <vector>

class Orv_Result;
class Zel_LoginCredentials;

// Callbacks.
class Zel_AnalyzeCB;
class Zel_AssociationsCB;
class Zel_ChildrenAtCB;
class Zel_ChildrenAtMonikerCB;
class Zel_ChildrenCB;
class Zel_CheckinCB;
class Zel_CheckinUpdateCB;
class Zel_CopyNodeCB;
class Zel_CreateFolderCB;
class Zel_CreateFolderUniqueCB;
class Zel_CreatePropertyCB;
class Zel_CreateReservationCB;
class Zel_DeleteCB;
class Zel_DependencyCB;
class Zel_DirCB;
class Zel_FrameLocatorListCB;
class Zel_FrameRestrictionListCB;
class Zel_GetApplicationSettingsCB;
class Zel_GetReservationsCB;
class Zel_GetSettingsCB;
class Zel_LoginCB;
class Zel_MediaResolutionsCB;
class Zel_MobBinaryCB;
class Zel_MobBinaryDnDCB;
class Zel_MobHeadframeCB;
class Zel_MobNodeCB;
class Zel_MonikerCB;
class Zel_MoveNodeCB;
class Zel_NodeCB;
class Zel_NodePermissionsCB;
class Zel_NodeResolutionsCB;
class Zel_PropertyListCB;
class Zel_QueryCB;
class Zel_RefreshNodeCB;
class Zel_RemoveReservationCB;
class Zel_RenameNodeCB;
class Zel_RenameUniqueCB;
class Zel_ResultBoolCB;
class Zel_ResultCB;
class Zel_RootNodeCB;
class Zel_SaveSettingsCB;
class Zel_SetApplicationSettingsCB;
class Zel_SetPropertiesCB;
class Zel_SetUserSettingsCB;
class Zel_SettingsCB;
class Zel_StartupCB;

// Results of the library.
class Zel_AddDependencyRes;
class Zel_AssociationsRes;
class Zel_CheckinRes;
class Zel_CheckinUpdateRes;
class Zel_ChildrenRes;
class Zel_CreateFolderUniqueRes;
class Zel_CreateNodeUniqueRes;
class Zel_CreateReservationRes;
class Zel_DeleteNodeRes;
class Zel_DeleteRes;
class Zel_GetApplicationSettingsRes;
class Zel_GetChildrenRes;
class Zel_GetLinkedProjectsRes;
class Zel_GetNodeRes;
class Zel_GetReservationsRes;
class Zel_GetSyncedProjRootRes;
class Zel_GetUserSettingsRes;
class Zel_MediaResolutionsRes;
class Zel_NodePermissionsRes;
class Zel_NodeResolutionsRes;
class Zel_RemoveReservationRes;
class Zel_RenameUniqueRes;
class Zel_SetApplicationSettingsRes;
class Zel_SetUserSettingsRes;
class Zel_SettingsRes;
class Zel_StartupRes;

// A failure as the only answer of a library result (failures.cpp).
void failInto(Zel_AddDependencyRes& result, const boost::shared_ptr<Zel_Error>& error);
void failInto(Zel_AssociationsRes& result, const boost::shared_ptr<Zel_Error>& error);
void failInto(Zel_CheckinRes& result, const boost::shared_ptr<Zel_Error>& error);
void failInto(Zel_CheckinUpdateRes& result, const boost::shared_ptr<Zel_Error>& error);
void failInto(Zel_ChildrenRes& result, const boost::shared_ptr<Zel_Error>& error);
void failInto(Zel_CreateFolderUniqueRes& result, const boost::shared_ptr<Zel_Error>& error);
void failInto(Zel_CreateNodeUniqueRes& result, const boost::shared_ptr<Zel_Error>& error);
void failInto(Zel_CreateReservationRes& result, const boost::shared_ptr<Zel_Error>& error);
void failInto(Zel_DeleteNodeRes& result, const boost::shared_ptr<Zel_Error>& error);
void failInto(Zel_DeleteRes& result, const boost::shared_ptr<Zel_Error>& error);
void failInto(Zel_GetApplicationSettingsRes& result, const boost::shared_ptr<Zel_Error>& error);
void failInto(Zel_GetChildrenRes& result, const boost::shared_ptr<Zel_Error>& error);
void failInto(Zel_GetLinkedProjectsRes& result, const boost::shared_ptr<Zel_Error>& error);
void failInto(Zel_GetNodeRes& result, const boost::shared_ptr<Zel_Error>& error);
void failInto(Zel_GetReservationsRes& result, const boost::shared_ptr<Zel_Error>& error);
void failInto(Zel_GetSyncedProjRootRes& result, const boost::shared_ptr<Zel_Error>& error);
void failInto(Zel_GetUserSettingsRes& result, const boost::shared_ptr<Zel_Error>& error);
void failInto(Zel_MediaResolutionsRes& result, const boost::shared_ptr<Zel_Error>& error);
void failInto(Zel_NodePermissionsRes& result, const boost::shared_ptr<Zel_Error>& error);
void failInto(Zel_NodeResolutionsRes& result, const boost::shared_ptr<Zel_Error>& error);
void failInto(Zel_RemoveReservationRes& result, const boost::shared_ptr<Zel_Error>& error);
void failInto(Zel_RenameUniqueRes& result, const boost::shared_ptr<Zel_Error>& error);
void failInto(Zel_SetApplicationSettingsRes& result, const boost::shared_ptr<Zel_Error>& error);
void failInto(Zel_SetUserSettingsRes& result, const boost::shared_ptr<Zel_Error>& error);
void failInto(Zel_SettingsRes& result, const boost::shared_ptr<Zel_Error>& error);
void failInto(Zel_StartupRes& result, const boost::shared_ptr<Zel_Error>& error);

namespace ZelMemory {

typedef boost::shared_ptr<QString> MonikerSP;

// Shared by the operations (ops/browse.cpp).
boost::shared_ptr<Zel_Error> ok();
boost::shared_ptr<QString> sharedText(const QString& text);
// The children of the node the user may read, as snapshots in node order
// (the order of Zel_Node::operator<).
std::vector<boost::shared_ptr<Zel_Node>> readableChildren(Work& work, const Node& parent);
// The node's locators (restrictions = false) or restrictions (true).
QList<Zel_FrameLocator> markersOf(const Node& node, bool restrictions);
// Fails with TooDeep unless a subtree of the given height (0: one node) fits
// below parent within MaxDepth (ops/change.cpp).
void requireDepth(Work& work, const Node& parent, int height);
// Reports node as updated under its parent (none for the root).
void reportUpdated(WriteWork& work, const Node& node);

#define ZEL_MEMORY_OPERATION_STRUCT(Name, WorkClass, CallbackClass, ResultClass, needsLogin, Extra, ...)        \
    struct Name {                                                                                                  \
        typedef CallbackClass Callback;                                                                            \
        typedef ResultClass Result;                                                                                \
        typedef WorkClass WorkType;                                                                                \
        static const bool NeedsLogin = needsLogin;                                                                 \
        struct Args {                                                                                              \
            __VA_ARGS__                                                                                            \
        };                                                                                                         \
        static constexpr const char* OperationName = #Name;                                                        \
        static void run(WorkClass& work, const Args& args, Result& result);                                        \
        static boost::shared_ptr<Orv_Result> execute(SessionState& session,                                       \
                                                     const boost::shared_ptr<Callback>& callback, const Args& args); \
        static boost::shared_ptr<Orv_Result> failure(const boost::shared_ptr<Callback>& callback,                 \
                                                     const boost::shared_ptr<Zel_Error>& error);                   \
        Extra                                                                                                      \
    };

// An operation: its callback, its result, whether it needs a login, and its
// arguments, which the request factory fills from its own parameters in order
// (zel_requests.def); members past those start value-initialised. It runs in
// a read transaction (Work); the WRITE forms run in a write transaction
// (WriteWork).
#define ZEL_MEMORY_OPERATION(Name, CallbackClass, ResultClass, needsLogin, ...)                                   \
    ZEL_MEMORY_OPERATION_STRUCT(Name, Work, CallbackClass, ResultClass, needsLogin, , __VA_ARGS__)
#define ZEL_MEMORY_WRITE_OPERATION(Name, CallbackClass, ResultClass, needsLogin, ...)                             \
    ZEL_MEMORY_OPERATION_STRUCT(Name, WriteWork, CallbackClass, ResultClass, needsLogin, , __VA_ARGS__)

// The same for an operation that also sets up its arguments or callback when
// its request is made, on the caller's thread (prepare()).
#define ZEL_MEMORY_PREPARED_OPERATION(Name, CallbackClass, ResultClass, needsLogin, ...)                          \
    ZEL_MEMORY_OPERATION_STRUCT(Name, Work, CallbackClass, ResultClass, needsLogin,                               \
                                static void prepare(const boost::shared_ptr<Callback>& callback, Args& args);,     \
                                __VA_ARGS__)
#define ZEL_MEMORY_PREPARED_WRITE_OPERATION(Name, CallbackClass, ResultClass, needsLogin, ...)                    \
    ZEL_MEMORY_OPERATION_STRUCT(Name, WriteWork, CallbackClass, ResultClass, needsLogin,                          \
                                static void prepare(const boost::shared_ptr<Callback>& callback, Args& args);,     \
                                __VA_ARGS__)

template <class Op, class = void>
struct HasPrepare : std::false_type {
};
template <class Op>
struct HasPrepare<Op, std::void_t<decltype(&Op::prepare)>> : std::true_type {
};

// Runs the operation's prepare(), where it has one.
template <class Op>
void prepareOperation(const boost::shared_ptr<typename Op::Callback>& callback, typename Op::Args& args)
{
    if constexpr (HasPrepare<Op>::value)
        Op::prepare(callback, args);
}

// Defines execute() and failure() in the operation's source file, where its
// result class is complete.
#define ZEL_MEMORY_EXECUTE(Name)                                                                                   \
    boost::shared_ptr<Orv_Result> Name::execute(SessionState& session, const boost::shared_ptr<Callback>& callback, \
                                                const Args& args)                                                  \
    {                                                                                                              \
        return runOperation<Name>(session, callback, args);                                                        \
    }                                                                                                              \
    boost::shared_ptr<Orv_Result> Name::failure(const boost::shared_ptr<Callback>& callback,                       \
                                                const boost::shared_ptr<Zel_Error>& error)                         \
    {                                                                                                              \
        return failureResult<Name>(callback, error);                                                               \
    }

// --- Browsing -------------------------------------------------------------
ZEL_MEMORY_OPERATION(RootNodeOp, Zel_RootNodeCB, MemoryRes<Zel_RootNodeCB>, true, int unused;)
ZEL_MEMORY_OPERATION(GetNodeOp, Zel_ResultCB, Zel_GetNodeRes, true, MonikerSP moniker;)
ZEL_MEMORY_OPERATION(RefreshNodeOp, Zel_RefreshNodeCB, MemoryRes<Zel_RefreshNodeCB>, true, MonikerSP moniker;)
ZEL_MEMORY_OPERATION(NodeOp, Zel_NodeCB, MemoryRes<Zel_NodeCB>, true, Zel_Directory path;)
ZEL_MEMORY_OPERATION(MonikerOp, Zel_MonikerCB, MemoryRes<Zel_MonikerCB>, true, Zel_Directory path;)
ZEL_MEMORY_OPERATION(DirOp, Zel_DirCB, MemoryRes<Zel_DirCB>, true, MonikerSP moniker;)
ZEL_MEMORY_OPERATION(GetChildrenOp, Zel_ResultCB, Zel_GetChildrenRes, true, MonikerSP moniker;)
ZEL_MEMORY_OPERATION(ChildrenOp, Zel_ChildrenCB, Zel_ChildrenRes, true, MonikerSP moniker;)
ZEL_MEMORY_OPERATION(ChildrenAtOp, Zel_ChildrenAtCB, MemoryRes<Zel_ChildrenAtCB>, true, Zel_Directory path;)
// The callback is told the parent node (setParentNode) once it is found.
ZEL_MEMORY_PREPARED_OPERATION(ChildrenAtMonikerOp, Zel_ChildrenAtMonikerCB, MemoryRes<Zel_ChildrenAtMonikerCB>,
                              true, MonikerSP moniker; boost::shared_ptr<Zel_ChildrenAtMonikerCB> callback;)
ZEL_MEMORY_OPERATION(GetLinkedProjectsOp, Zel_ResultCB, Zel_GetLinkedProjectsRes, true, MonikerSP moniker;)
ZEL_MEMORY_OPERATION(GetSyncedProjRootOp, Zel_ResultCB, Zel_GetSyncedProjRootRes, true, MonikerSP moniker;)
ZEL_MEMORY_OPERATION(AssociationsOp, Zel_AssociationsCB, Zel_AssociationsRes, true, MonikerSP moniker;)
// The callback is told the query specification when the request is made.
ZEL_MEMORY_PREPARED_OPERATION(QueryOp, Zel_QueryCB, MemoryRes<Zel_QueryCB>, true,
                              boost::shared_ptr<Zel_QuerySpec> query;)

// --- Properties -----------------------------------------------------------
ZEL_MEMORY_OPERATION(PropertyListOp, Zel_PropertyListCB, MemoryRes<Zel_PropertyListCB>, true, MonikerSP moniker;)
ZEL_MEMORY_OPERATION(GetPropertiesOp, Zel_PropertyListCB, MemoryRes<Zel_PropertyListCB>, true, MonikerSP moniker;
                     QStringList keys;)
// conditional: the callback is a Zel_ConditionalSetPropertiesCB; each
// property's custom values text then holds the value the application expects
// the property to have now.
ZEL_MEMORY_PREPARED_WRITE_OPERATION(SetPropertiesOp, Zel_SetPropertiesCB, MemoryRes<Zel_SetPropertiesCB>, true,
                              MonikerSP moniker; Zel_PropertyList properties; bool conditional;)
ZEL_MEMORY_WRITE_OPERATION(CreatePropertyOp, Zel_CreatePropertyCB, MemoryRes<Zel_CreatePropertyCB>, true,
                     MonikerSP moniker; Zel_Property property;)
ZEL_MEMORY_OPERATION(MediaResolutionsOp, Zel_MediaResolutionsCB, Zel_MediaResolutionsRes, true, int unused;)
ZEL_MEMORY_OPERATION(NodeResolutionsOp, Zel_NodeResolutionsCB, Zel_NodeResolutionsRes, true, MonikerSP moniker;)

// --- Changing the tree ----------------------------------------------------
ZEL_MEMORY_WRITE_OPERATION(CreateFolderOp, Zel_CreateFolderCB, MemoryRes<Zel_CreateFolderCB>, true, MonikerSP parent;
                     QString name;)
ZEL_MEMORY_WRITE_OPERATION(CreateFolderUniqueOp, Zel_CreateFolderUniqueCB, Zel_CreateFolderUniqueRes, true,
                     MonikerSP parent; QString name;)
ZEL_MEMORY_WRITE_OPERATION(CreateNodeUniqueOp, Zel_ResultCB, Zel_CreateNodeUniqueRes, true, MonikerSP parent;
                     QString name; Zel_PropertyList properties;)
ZEL_MEMORY_WRITE_OPERATION(RenameNodeOp, Zel_RenameNodeCB, MemoryRes<Zel_RenameNodeCB>, true, MonikerSP moniker;
                     QString name;)
ZEL_MEMORY_WRITE_OPERATION(RenameUniqueOp, Zel_RenameUniqueCB, Zel_RenameUniqueRes, true, MonikerSP moniker;
                     QString name;)
ZEL_MEMORY_WRITE_OPERATION(MoveNodeOp, Zel_MoveNodeCB, MemoryRes<Zel_MoveNodeCB>, true, MonikerSP moniker;
                     MonikerSP destination;)
ZEL_MEMORY_WRITE_OPERATION(CopyNodeOp, Zel_CopyNodeCB, MemoryRes<Zel_CopyNodeCB>, true, MonikerSP moniker;
                     MonikerSP destination;)
ZEL_MEMORY_WRITE_OPERATION(DeleteNodeOp, Zel_ResultBoolCB, Zel_DeleteNodeRes, true, MonikerSP moniker;)
ZEL_MEMORY_WRITE_OPERATION(DeleteOp, Zel_DeleteCB, Zel_DeleteRes, true, QStringList monikers; bool remoteMedia;
                     bool localMedia;)
ZEL_MEMORY_WRITE_OPERATION(AddDependencyOp, Zel_DependencyCB, Zel_AddDependencyRes, true, MonikerSP moniker;
                     Zel_DependencySPList dependencies;)

// --- Reservations and permissions -----------------------------------------
ZEL_MEMORY_WRITE_OPERATION(CreateReservationOp, Zel_CreateReservationCB, Zel_CreateReservationRes, true,
                     MonikerSP moniker; QDateTime expiry;)
ZEL_MEMORY_WRITE_OPERATION(RemoveReservationOp, Zel_RemoveReservationCB, Zel_RemoveReservationRes, true,
                     MonikerSP moniker;)
ZEL_MEMORY_OPERATION(GetReservationsOp, Zel_GetReservationsCB, Zel_GetReservationsRes, true, MonikerSP moniker;)
ZEL_MEMORY_OPERATION(NodePermissionsOp, Zel_NodePermissionsCB, Zel_NodePermissionsRes, true, MonikerSP moniker;)
ZEL_MEMORY_OPERATION(GetUserPriviledgesOp, Zel_NodePermissionsCB, Zel_NodePermissionsRes, true, QString user;
                     MonikerSP moniker;)

// --- Frame locators and restrictions ----------------------------------------
// kind: false for locators, true for restrictions.
ZEL_MEMORY_OPERATION(GetFrameLocatorListOp, Zel_FrameLocatorListCB, MemoryRes<Zel_FrameLocatorListCB>, true,
                     MonikerSP moniker;)
ZEL_MEMORY_WRITE_OPERATION(AddFrameLocatorListOp, Zel_FrameLocatorListCB, MemoryRes<Zel_FrameLocatorListCB>, true,
                     MonikerSP moniker; QList<Zel_FrameLocator> markers;)
ZEL_MEMORY_WRITE_OPERATION(DeleteFrameLocatorListOp, Zel_FrameLocatorListCB, MemoryRes<Zel_FrameLocatorListCB>, true,
                     MonikerSP moniker; QList<Zel_FrameLocator> markers;)
ZEL_MEMORY_OPERATION(GetFrameRestrictionListOp, Zel_FrameRestrictionListCB, MemoryRes<Zel_FrameRestrictionListCB>,
                     true, MonikerSP moniker;)
ZEL_MEMORY_WRITE_OPERATION(AddFrameRestrictionListOp, Zel_FrameRestrictionListCB, MemoryRes<Zel_FrameRestrictionListCB>,
                     true, MonikerSP moniker; QList<Zel_FrameLocator> markers;)
ZEL_MEMORY_WRITE_OPERATION(DeleteFrameRestrictionListOp, Zel_FrameRestrictionListCB,
                     MemoryRes<Zel_FrameRestrictionListCB>, true, MonikerSP moniker; QList<Zel_FrameLocator> markers;)

// --- Media objects ----------------------------------------------------------
ZEL_MEMORY_OPERATION(AnalyzeOp, Zel_AnalyzeCB, MemoryRes<Zel_AnalyzeCB>, true, QStringList files;)
ZEL_MEMORY_WRITE_OPERATION(CheckinOp, Zel_CheckinCB, Zel_CheckinRes, true, Zel_MobDescList mobs; MonikerSP folder;)
ZEL_MEMORY_WRITE_OPERATION(CheckinLocalBinOp, Zel_CheckinCB, Zel_CheckinRes, true, QString binFile; MonikerSP folder;)
ZEL_MEMORY_WRITE_OPERATION(CheckinUpdateOp, Zel_CheckinUpdateCB, Zel_CheckinUpdateRes, true, Zel_MobDescList mobs;)
ZEL_MEMORY_OPERATION(MobNodeOp, Zel_MobNodeCB, MemoryRes<Zel_MobNodeCB>, true, boost::shared_ptr<Zel_MobID> mob;)
ZEL_MEMORY_OPERATION(MobBinaryOp, Zel_MobBinaryCB, MemoryRes<Zel_MobBinaryCB>, true, boost::shared_ptr<Zel_MobID> mob;)
ZEL_MEMORY_OPERATION(MobBinaryDnDOp, Zel_MobBinaryDnDCB, MemoryRes<Zel_MobBinaryDnDCB>, true, Zel_MobIDList mobs;)
ZEL_MEMORY_OPERATION(MobHeadframeOp, Zel_MobHeadframeCB, MemoryRes<Zel_MobHeadframeCB>, true,
                     boost::shared_ptr<Zel_MobID> mob;)

// --- Session and settings -------------------------------------------------
ZEL_MEMORY_OPERATION(LoginOp, Zel_LoginCB, MemoryRes<Zel_LoginCB>, false, QString user; QString password;
                     boost::shared_ptr<Zel_LoginCredentials> credentials;)
ZEL_MEMORY_OPERATION(StartupOp, Zel_StartupCB, Zel_StartupRes, true, int unused;)
ZEL_MEMORY_OPERATION(GetApplicationSettingsOp, Zel_GetApplicationSettingsCB, Zel_GetApplicationSettingsRes, true,
                     QString application;)
ZEL_MEMORY_WRITE_OPERATION(SetApplicationSettingsOp, Zel_SetApplicationSettingsCB, Zel_SetApplicationSettingsRes, true,
                     QString application; QString xml;)
ZEL_MEMORY_OPERATION(GetUserSettingsOp, Zel_GetUserSettingsCB, Zel_GetUserSettingsRes, true,
                     Zel_GetUserSettingsCB::UserSettingsType type;)
ZEL_MEMORY_WRITE_OPERATION(SetUserSettingsOp, Zel_SetUserSettingsCB, Zel_SetUserSettingsRes, true,
                     Zel_GetUserSettingsCB::UserSettingsType type; QString xml;)
ZEL_MEMORY_OPERATION(GetWorkgroupSettingsOp, Zel_SettingsCB, Zel_SettingsRes, true, int unused;)
ZEL_MEMORY_OPERATION(GetSettingsOp, Zel_GetSettingsCB, MemoryRes<Zel_GetSettingsCB>, true, QString name;)
ZEL_MEMORY_WRITE_OPERATION(SaveSettingsOp, Zel_SaveSettingsCB, MemoryRes<Zel_SaveSettingsCB>, true, QString name;
                     QString xml;)

// The operations that answer a folder's children release their snapshots in
// the order they were taken (ReleaseInOrder).
template <>
struct ReleasesInOrder<GetChildrenOp> : std::true_type {
};
template <>
struct ReleasesInOrder<ChildrenOp> : std::true_type {
};
template <>
struct ReleasesInOrder<ChildrenAtOp> : std::true_type {
};
template <>
struct ReleasesInOrder<ChildrenAtMonikerOp> : std::true_type {
};

// Every backend result: an error answer is a failure.
template <class CB>
void failInto(MemoryRes<CB>& result, const boost::shared_ptr<Zel_Error>& error)
{
    result.fail(error);
}

} // namespace ZelMemory

#endif
