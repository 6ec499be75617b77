// Zel_MemorySession: the session of the in-memory backend.
//
// A complete Zel_Session over a Zel_MemoryTree: every request factory makes a
// request whose work runs on the engine's worker threads against the tree, and
// answers through the library's result classes (or this backend's own, for
// the callbacks the library answers with none). Log in first (makeLoginReqSP);
// every other request fails with NotLoggedIn until then.
//
//     Orv_Engine engine;
//     boost::shared_ptr<Zel_MemorySession> session(
//         new Zel_MemorySession(Zel_MemoryTree::sample(), &engine, "my-app"));
//     session->submitRequest(session->makeLoginReqSP("editor", "editor", nullptr, loginCB));
//     engine.DeliverAll();
//
// Failures are data: each reaches the failure handler as a Zel_MemoryError
// with a stable code (Zel_MemoryErrorCodes.h) and a message naming what
// failed; a request that fails changes nothing in the tree. Changes to the
// tree (made by this or any other session on the same tree) reach the folder
// listeners registered with this session, in the order they were made:
// created, copied, checked-in, moved-in nodes as child added, deleted and
// moved-out nodes as child removed, renamed nodes and changes of properties,
// reservations, locators and media as child updated. A session hears only of
// changes under parents its logged-in user may read (judged when the change
// is reported); before login it hears nothing.
//
// The tree's property manager is registered (Zel_Property::setPropertyManagerSP)
// for the session's life; while several sessions live, the newest one's is.
// simulateConnectionLoss() and simulateReconnect()
// play a dropped connection: the status callback hears disconnected() and
// connected(), and requests fail with NotConnected in between.
//
// Threads: requests may run concurrently on any number of workers; the tree
// is guarded by one shared mutex, held by each request for its whole work, so
// every request sees a consistent tree. The session's own operations may be
// called from any thread; simulateConnectionLoss, simulateReconnect and close
// belong to the application's thread (they write the base class's plain
// connection flag). Name rules: asset names may not contain / \ : * ? " < > |
// and are at most 128 characters long. A derived session may change the
// illegal characters (illegalAssetNameCharacters, illegalPropertyNameCharacters):
// every request factory asks for them on its caller's thread, and requests
// check names against the latest answer. The work never calls into the
// session, so a session may go while its requests run (those that have not
// passed their checks yet then fail with NotConnected).
#ifndef ZEL_MEMORYSESSION_H
#define ZEL_MEMORYSESSION_H

#include "zel_memory_export.h"
#include "Zel_Session.h"

#include <boost/shared_ptr.hpp>

#include <mutex>

class Orv_Engine;
class Zel_ConnectionListener;
class Zel_MemoryPropertyManager;
class Zel_MemoryTree;

namespace ZelMemory {
class SessionObserver;
class SessionState;
}

class ZEL_MEMORY_EXPORT Zel_MemorySession : public Zel_Session
{
public:
    // A session on the tree (the bundled sample when tree is empty) whose
    // requests run on the engine. The session may outlive the engine: once
    // the engine's destruction has begun, submitRequest() answers false (the
    // request is not run and its callback hears nothing). Without an engine
    // submitRequest() answers false and no events are sent.
    // applicationName names the application's settings on the server.
    Zel_MemorySession(const boost::shared_ptr<Zel_MemoryTree>& tree, Orv_Engine* engine,
                      const QString& applicationName = QStringLiteral("zel"));
    virtual ~Zel_MemorySession();

    // --- The connection and the session's state ---------------------------
    virtual QString getServerName() const override;
    virtual QString getServerVersion() const override;
    virtual QString getWorkgroupName() const override;
    virtual QString getUserName() const override;
    virtual QString getApplicationName() const override;
    virtual QString getSessionID() const override;
    virtual bool isLoggedIn() const override;
    virtual QDateTime getLoginTime() const override;
    virtual void logout() override;
    virtual MonikerSP getRootMonikerSP() const override;
    virtual MonikerSP getHomeMonikerSP() const override;
    virtual QString getPathSeparator() const override;
    virtual bool isValidMoniker(const QString& moniker) const override;
    virtual boost::shared_ptr<Orv_ResultQ> getResultQSP() const override;
    virtual bool submitRequest(boost::shared_ptr<Orv_Request> request) override;
    virtual void cancelAllRequests() override;
    virtual bool supportsRequest(const QString& requestName) const override;
    virtual QDateTime getServerTime() const override;
    virtual bool isReadOnly() const override;
    virtual int getMaxNameLength() const override;
    virtual void setStatusNotificationCB(boost::shared_ptr<Zel_StatusNotificationCB> callback) override;
    virtual boost::shared_ptr<Zel_StatusNotificationCB> getStatusNotificationCBSP() const override;

    // --- Request factories --------------------------------------------------
    virtual boost::shared_ptr<Zel_AddDependencyReq> makeAddDependencyReqSP(MonikerSP moniker, const Zel_DependencySPList& dependencies, boost::shared_ptr<Zel_DependencyCB> callback) override;
    virtual boost::shared_ptr<Zel_AddFrameLocatorListReq> makeAddFrameLocatorListReqSP(MonikerSP moniker, const QList<Zel_FrameLocator>& locators, boost::shared_ptr<Zel_FrameLocatorListCB> callback) override;
    virtual boost::shared_ptr<Zel_AddFrameRestrictionListReq> makeAddFrameRestrictionListReqSP(MonikerSP moniker, const QList<Zel_FrameLocator>& restrictions, boost::shared_ptr<Zel_FrameRestrictionListCB> callback) override;
    virtual boost::shared_ptr<Zel_AnalyzeReq> makeAnalyzeReqSP(const QStringList& filePaths, boost::shared_ptr<Zel_AnalyzeCB> callback) override;
    virtual boost::shared_ptr<Zel_AssociationsReq> makeAssociationsReqSP(MonikerSP moniker, boost::shared_ptr<Zel_AssociationsCB> callback) override;
    virtual boost::shared_ptr<Zel_CheckinLocalBinReq> makeCheckinLocalBinReqSP(const QString& binFilePath, MonikerSP folderMoniker, boost::shared_ptr<Zel_CheckinCB> callback) override;
    virtual boost::shared_ptr<Zel_CheckinReq> makeCheckinReqSP(const Zel_MobDescList& mobs, MonikerSP folderMoniker, boost::shared_ptr<Zel_CheckinCB> callback) override;
    virtual boost::shared_ptr<Zel_CheckinUpdateReq> makeCheckinUpdateReqSP(const Zel_MobDescList& mobs, boost::shared_ptr<Zel_CheckinUpdateCB> callback) override;
    virtual boost::shared_ptr<Zel_ChildrenAtMonikerReq> makeChildrenAtMonikerReqSP(MonikerSP parentMoniker, boost::shared_ptr<Zel_ChildrenAtMonikerCB> callback) override;
    virtual boost::shared_ptr<Zel_ChildrenAtReq> makeChildrenAtReqSP(const Zel_Directory& path, boost::shared_ptr<Zel_ChildrenAtCB> callback) override;
    virtual boost::shared_ptr<Zel_ChildrenReq> makeChildrenReqSP(MonikerSP parentMoniker, boost::shared_ptr<Zel_ChildrenCB> callback) override;
    virtual boost::shared_ptr<Zel_CopyNodeReq> makeCopyNodeReqSP(MonikerSP moniker, MonikerSP destinationMoniker, boost::shared_ptr<Zel_CopyNodeCB> callback) override;
    virtual boost::shared_ptr<Zel_CreateFolderReq> makeCreateFolderReqSP(MonikerSP parentMoniker, const QString& name, boost::shared_ptr<Zel_CreateFolderCB> callback) override;
    virtual boost::shared_ptr<Zel_CreateFolderUniqueReq> makeCreateFolderUniqueReqSP(MonikerSP parentMoniker, const QString& name, boost::shared_ptr<Zel_CreateFolderUniqueCB> callback) override;
    virtual boost::shared_ptr<Zel_CreateNodeUniqueReq> makeCreateNodeUniqueReqSP(MonikerSP parentMoniker, const QString& name, const Zel_PropertyList& properties, boost::shared_ptr<Zel_ResultCB> callback) override;
    virtual boost::shared_ptr<Zel_CreatePropertyReq> makeCreatePropertyReqSP(MonikerSP moniker, const Zel_Property& property, boost::shared_ptr<Zel_CreatePropertyCB> callback) override;
    virtual boost::shared_ptr<Zel_CreateReservationReq> makeCreateReservationReqSP(MonikerSP moniker, const QDateTime& expiry, boost::shared_ptr<Zel_CreateReservationCB> callback) override;
    virtual boost::shared_ptr<Zel_DeleteFrameLocatorListReq> makeDeleteFrameLocatorListReqSP(MonikerSP moniker, const QList<Zel_FrameLocator>& locators, boost::shared_ptr<Zel_FrameLocatorListCB> callback) override;
    virtual boost::shared_ptr<Zel_DeleteFrameRestrictionListReq> makeDeleteFrameRestrictionListReqSP(MonikerSP moniker, const QList<Zel_FrameLocator>& restrictions, boost::shared_ptr<Zel_FrameRestrictionListCB> callback) override;
    virtual boost::shared_ptr<Zel_DeleteNodeReq> makeDeleteNodeReqSP(MonikerSP moniker, boost::shared_ptr<Zel_ResultBoolCB> callback) override;
    virtual boost::shared_ptr<Zel_DeleteReq> makeDeleteReqSP(const QStringList& monikers, bool deleteRemoteMedia, bool deleteLocalMedia, boost::shared_ptr<Zel_DeleteCB> callback) override;
    virtual boost::shared_ptr<Zel_DirReq> makeDirReqSP(MonikerSP moniker, boost::shared_ptr<Zel_DirCB> callback) override;
    virtual boost::shared_ptr<Zel_GetApplicationSettingsReq> makeGetApplicationSettingsReqSP(const QString& applicationName, boost::shared_ptr<Zel_GetApplicationSettingsCB> callback) override;
    virtual boost::shared_ptr<Zel_GetChildrenReq> makeGetChildrenReqSP(MonikerSP parentMoniker, boost::shared_ptr<Zel_ResultCB> callback) override;
    virtual boost::shared_ptr<Zel_GetFrameLocatorListReq> makeGetFrameLocatorListReqSP(MonikerSP moniker, boost::shared_ptr<Zel_FrameLocatorListCB> callback) override;
    virtual boost::shared_ptr<Zel_GetFrameRestrictionListReq> makeGetFrameRestrictionListReqSP(MonikerSP moniker, boost::shared_ptr<Zel_FrameRestrictionListCB> callback) override;
    virtual boost::shared_ptr<Zel_GetLinkedProjectsReq> makeGetLinkedProjectsReqSP(MonikerSP moniker, boost::shared_ptr<Zel_ResultCB> callback) override;
    virtual boost::shared_ptr<Zel_GetNodeReq> makeGetNodeReqSP(MonikerSP moniker, boost::shared_ptr<Zel_ResultCB> callback) override;
    virtual boost::shared_ptr<Zel_GetPropertiesReq> makeGetPropertiesReqSP(MonikerSP moniker, const QStringList& keys, boost::shared_ptr<Zel_PropertyListCB> callback) override;
    virtual boost::shared_ptr<Zel_GetReservationsReq> makeGetReservationsReqSP(MonikerSP moniker, boost::shared_ptr<Zel_GetReservationsCB> callback) override;
    virtual boost::shared_ptr<Zel_GetSettingsReq> makeGetSettingsReqSP(const QString& settingsName, boost::shared_ptr<Zel_GetSettingsCB> callback) override;
    virtual boost::shared_ptr<Zel_GetSyncedProjRootReq> makeGetSyncedProjRootReqSP(MonikerSP moniker, boost::shared_ptr<Zel_ResultCB> callback) override;
    virtual boost::shared_ptr<Zel_GetUserPriviledgesReq> makeGetUserPriviledgesReqSP(const QString& userName, MonikerSP moniker, boost::shared_ptr<Zel_NodePermissionsCB> callback) override;
    virtual boost::shared_ptr<Zel_GetUserSettingsReq> makeGetUserSettingsReqSP(Zel_GetUserSettingsCB::UserSettingsType settingsType, boost::shared_ptr<Zel_GetUserSettingsCB> callback) override;
    virtual boost::shared_ptr<Zel_GetWorkgroupSettingsReq> makeGetWorkgroupSettingsReqSP(boost::shared_ptr<Zel_SettingsCB> callback) override;
    virtual boost::shared_ptr<Zel_LoginReq> makeLoginReqSP(const QString& userName, const QString& password, boost::shared_ptr<Zel_LoginCredentials> credentials, boost::shared_ptr<Zel_LoginCB> callback) override;
    virtual boost::shared_ptr<Zel_MediaResolutionsReq> makeMediaResolutionsReqSP(boost::shared_ptr<Zel_MediaResolutionsCB> callback) override;
    virtual boost::shared_ptr<Zel_MobBinaryDnDReq> makeMobBinaryDnDReqSP(const Zel_MobIDList& mobs, boost::shared_ptr<Zel_MobBinaryDnDCB> callback) override;
    virtual boost::shared_ptr<Zel_MobBinaryReq> makeMobBinaryReqSP(boost::shared_ptr<Zel_MobID> mob, boost::shared_ptr<Zel_MobBinaryCB> callback) override;
    virtual boost::shared_ptr<Zel_MobHeadframeReq> makeMobHeadframeReqSP(boost::shared_ptr<Zel_MobID> mob, boost::shared_ptr<Zel_MobHeadframeCB> callback) override;
    virtual boost::shared_ptr<Zel_MobNodeReq> makeMobNodeReqSP(boost::shared_ptr<Zel_MobID> mob, boost::shared_ptr<Zel_MobNodeCB> callback) override;
    virtual boost::shared_ptr<Zel_MonikerReq> makeMonikerReqSP(const Zel_Directory& path, boost::shared_ptr<Zel_MonikerCB> callback) override;
    virtual boost::shared_ptr<Zel_MoveNodeReq> makeMoveNodeReqSP(MonikerSP moniker, MonikerSP destinationMoniker, boost::shared_ptr<Zel_MoveNodeCB> callback) override;
    virtual boost::shared_ptr<Zel_NodePermissionsReq> makeNodePermissionsReqSP(MonikerSP moniker, boost::shared_ptr<Zel_NodePermissionsCB> callback) override;
    virtual boost::shared_ptr<Zel_NodeReq> makeNodeReqSP(const Zel_Directory& path, boost::shared_ptr<Zel_NodeCB> callback) override;
    virtual boost::shared_ptr<Zel_NodeResolutionsReq> makeNodeResolutionsReqSP(MonikerSP moniker, boost::shared_ptr<Zel_NodeResolutionsCB> callback) override;
    virtual boost::shared_ptr<Zel_PropertyListReq> makePropertyListReqSP(MonikerSP moniker, boost::shared_ptr<Zel_PropertyListCB> callback) override;
    virtual boost::shared_ptr<Zel_QueryReq> makeQueryReqSP(boost::shared_ptr<Zel_QuerySpec> query, boost::shared_ptr<Zel_QueryCB> callback) override;
    virtual boost::shared_ptr<Zel_RefreshNodeReq> makeRefreshNodeReqSP(MonikerSP moniker, boost::shared_ptr<Zel_RefreshNodeCB> callback) override;
    virtual boost::shared_ptr<Zel_RemoveReservationReq> makeRemoveReservationReqSP(MonikerSP moniker, boost::shared_ptr<Zel_RemoveReservationCB> callback) override;
    virtual boost::shared_ptr<Zel_RenameNodeReq> makeRenameNodeReqSP(MonikerSP moniker, const QString& newName, boost::shared_ptr<Zel_RenameNodeCB> callback) override;
    virtual boost::shared_ptr<Zel_RenameUniqueReq> makeRenameUniqueReqSP(MonikerSP moniker, const QString& newName, boost::shared_ptr<Zel_RenameUniqueCB> callback) override;
    virtual boost::shared_ptr<Zel_RootNodeReq> makeRootNodeReqSP(boost::shared_ptr<Zel_RootNodeCB> callback) override;
    virtual boost::shared_ptr<Zel_SaveSettingsReq> makeSaveSettingsReqSP(const QString& settingsName, const QString& settingsXml, boost::shared_ptr<Zel_SaveSettingsCB> callback) override;
    virtual boost::shared_ptr<Zel_SetApplicationSettingsReq> makeSetApplicationSettingsReqSP(const QString& applicationName, const QString& settingsXml, boost::shared_ptr<Zel_SetApplicationSettingsCB> callback) override;
    virtual boost::shared_ptr<Zel_SetPropertiesReq> makeSetPropertiesReqSP(MonikerSP moniker, const Zel_PropertyList& properties, boost::shared_ptr<Zel_SetPropertiesCB> callback) override;
    virtual boost::shared_ptr<Zel_SetUserSettingsReq> makeSetUserSettingsReqSP(Zel_GetUserSettingsCB::UserSettingsType settingsType, const QString& settingsXml, boost::shared_ptr<Zel_SetUserSettingsCB> callback) override;
    virtual boost::shared_ptr<Zel_StartupReq> makeStartupReqSP(boost::shared_ptr<Zel_StartupCB> callback) override;

    // Asset names may not contain / \\ : * ? " < > |
    virtual const QString illegalAssetNameCharacters() const override;

    virtual void close() override;

    // --- The in-memory backend's own -----------------------------------------

    // The tree this session works on.
    boost::shared_ptr<Zel_MemoryTree> getTreeSP() const;
    // The connection drops: requests fail with NotConnected and the status
    // callback hears disconnected(). Nothing happens when it is already down.
    void simulateConnectionLoss();
    // The connection is back: requests run again and the status callback
    // hears connected(). Nothing happens when it is up.
    void simulateReconnect();

private:
    Zel_MemorySession(const Zel_MemorySession&) = delete;
    Zel_MemorySession& operator=(const Zel_MemorySession&) = delete;

    template <class Req, class Concrete, class Callback, class Args>
    boost::shared_ptr<Req> make(const boost::shared_ptr<Callback>& callback, const Args& args);

    boost::shared_ptr<ZelMemory::SessionState> mState;
    boost::shared_ptr<ZelMemory::SessionObserver> mObserver;
    boost::shared_ptr<Zel_MemoryPropertyManager> mPropertyManager;
    mutable std::mutex mStatusMutex;
    boost::shared_ptr<Zel_StatusNotificationCB> mStatusCB;
    boost::shared_ptr<Zel_ConnectionListener> mConnectionListener;
};

#endif
