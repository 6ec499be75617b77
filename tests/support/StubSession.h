// Test and benchmark support: a session whose backend operations do nothing, so that the
// shared part of Zel_Session (hub, registration, flags, name rules) can be tested.
#ifndef ZEL_TESTS_STUBSESSION_H
#define ZEL_TESTS_STUBSESSION_H

#include "Zel_Session.h"

#include <QDateTime>
#include <QString>
#include <QStringList>
#include <boost/shared_ptr.hpp>

class StubSession : public Zel_Session
{
public:
    explicit StubSession(const Zel_ResolutionIDList& ids = Zel_ResolutionIDList())
        : Zel_Session(ids)
    {
    }

    // The protected parts, for tests and node listeners.
    using Zel_Session::getEventCBSP;
    using Zel_Session::isValidName;
    using Zel_Session::setConnectedStatus;
    using Zel_Session::getBackendDataSP;
    using Zel_Session::setBackendDataSP;

    QString getServerName() const override { return QString(); }
    QString getServerVersion() const override { return QString(); }
    QString getWorkgroupName() const override { return QString(); }
    QString getUserName() const override { return QString(); }
    QString getApplicationName() const override { return QString(); }
    QString getSessionID() const override { return QString(); }
    bool isLoggedIn() const override { return false; }
    QDateTime getLoginTime() const override { return QDateTime(); }
    void logout() override {}
    MonikerSP getRootMonikerSP() const override { return MonikerSP(); }
    MonikerSP getHomeMonikerSP() const override { return MonikerSP(); }
    QString getPathSeparator() const override { return QString(); }
    bool isValidMoniker(const QString& moniker) const override { return false; }
    boost::shared_ptr<Orv_ResultQ> getResultQSP() const override { return boost::shared_ptr<Orv_ResultQ>(); }
    bool submitRequest(boost::shared_ptr<Orv_Request> request) override { return false; }
    void cancelAllRequests() override {}
    bool supportsRequest(const QString& requestName) const override { return false; }
    QDateTime getServerTime() const override { return QDateTime(); }
    bool isReadOnly() const override { return false; }
    int getMaxNameLength() const override { return 0; }
    void setStatusNotificationCB(boost::shared_ptr<Zel_StatusNotificationCB> callback) override {}
    boost::shared_ptr<Zel_StatusNotificationCB> getStatusNotificationCBSP() const override { return boost::shared_ptr<Zel_StatusNotificationCB>(); }
    boost::shared_ptr<Zel_AddDependencyReq> makeAddDependencyReqSP(MonikerSP moniker, const Zel_DependencySPList& dependencies, boost::shared_ptr<Zel_DependencyCB> callback) override { return boost::shared_ptr<Zel_AddDependencyReq>(); }
    boost::shared_ptr<Zel_AddFrameLocatorListReq> makeAddFrameLocatorListReqSP(MonikerSP moniker, const QList<Zel_FrameLocator>& locators, boost::shared_ptr<Zel_FrameLocatorListCB> callback) override { return boost::shared_ptr<Zel_AddFrameLocatorListReq>(); }
    boost::shared_ptr<Zel_AddFrameRestrictionListReq> makeAddFrameRestrictionListReqSP(MonikerSP moniker, const QList<Zel_FrameLocator>& restrictions, boost::shared_ptr<Zel_FrameRestrictionListCB> callback) override { return boost::shared_ptr<Zel_AddFrameRestrictionListReq>(); }
    boost::shared_ptr<Zel_AnalyzeReq> makeAnalyzeReqSP(const QStringList& filePaths, boost::shared_ptr<Zel_AnalyzeCB> callback) override { return boost::shared_ptr<Zel_AnalyzeReq>(); }
    boost::shared_ptr<Zel_AssociationsReq> makeAssociationsReqSP(MonikerSP moniker, boost::shared_ptr<Zel_AssociationsCB> callback) override { return boost::shared_ptr<Zel_AssociationsReq>(); }
    boost::shared_ptr<Zel_CheckinLocalBinReq> makeCheckinLocalBinReqSP(const QString& binFilePath, MonikerSP folderMoniker, boost::shared_ptr<Zel_CheckinCB> callback) override { return boost::shared_ptr<Zel_CheckinLocalBinReq>(); }
    boost::shared_ptr<Zel_CheckinReq> makeCheckinReqSP(const Zel_MobDescList& mobs, MonikerSP folderMoniker, boost::shared_ptr<Zel_CheckinCB> callback) override { return boost::shared_ptr<Zel_CheckinReq>(); }
    boost::shared_ptr<Zel_CheckinUpdateReq> makeCheckinUpdateReqSP(const Zel_MobDescList& mobs, boost::shared_ptr<Zel_CheckinUpdateCB> callback) override { return boost::shared_ptr<Zel_CheckinUpdateReq>(); }
    boost::shared_ptr<Zel_ChildrenAtMonikerReq> makeChildrenAtMonikerReqSP(MonikerSP parentMoniker, boost::shared_ptr<Zel_ChildrenAtMonikerCB> callback) override { return boost::shared_ptr<Zel_ChildrenAtMonikerReq>(); }
    boost::shared_ptr<Zel_ChildrenAtReq> makeChildrenAtReqSP(const Zel_Directory& path, boost::shared_ptr<Zel_ChildrenAtCB> callback) override { return boost::shared_ptr<Zel_ChildrenAtReq>(); }
    boost::shared_ptr<Zel_ChildrenReq> makeChildrenReqSP(MonikerSP parentMoniker, boost::shared_ptr<Zel_ChildrenCB> callback) override { return boost::shared_ptr<Zel_ChildrenReq>(); }
    boost::shared_ptr<Zel_CopyNodeReq> makeCopyNodeReqSP(MonikerSP moniker, MonikerSP destinationMoniker, boost::shared_ptr<Zel_CopyNodeCB> callback) override { return boost::shared_ptr<Zel_CopyNodeReq>(); }
    boost::shared_ptr<Zel_CreateFolderReq> makeCreateFolderReqSP(MonikerSP parentMoniker, const QString& name, boost::shared_ptr<Zel_CreateFolderCB> callback) override { return boost::shared_ptr<Zel_CreateFolderReq>(); }
    boost::shared_ptr<Zel_CreateFolderUniqueReq> makeCreateFolderUniqueReqSP(MonikerSP parentMoniker, const QString& name, boost::shared_ptr<Zel_CreateFolderUniqueCB> callback) override { return boost::shared_ptr<Zel_CreateFolderUniqueReq>(); }
    boost::shared_ptr<Zel_CreateNodeUniqueReq> makeCreateNodeUniqueReqSP(MonikerSP parentMoniker, const QString& name, const Zel_PropertyList& properties, boost::shared_ptr<Zel_ResultCB> callback) override { return boost::shared_ptr<Zel_CreateNodeUniqueReq>(); }
    boost::shared_ptr<Zel_CreatePropertyReq> makeCreatePropertyReqSP(MonikerSP moniker, const Zel_Property& property, boost::shared_ptr<Zel_CreatePropertyCB> callback) override { return boost::shared_ptr<Zel_CreatePropertyReq>(); }
    boost::shared_ptr<Zel_CreateReservationReq> makeCreateReservationReqSP(MonikerSP moniker, const QDateTime& expiry, boost::shared_ptr<Zel_CreateReservationCB> callback) override { return boost::shared_ptr<Zel_CreateReservationReq>(); }
    boost::shared_ptr<Zel_DeleteFrameLocatorListReq> makeDeleteFrameLocatorListReqSP(MonikerSP moniker, const QList<Zel_FrameLocator>& locators, boost::shared_ptr<Zel_FrameLocatorListCB> callback) override { return boost::shared_ptr<Zel_DeleteFrameLocatorListReq>(); }
    boost::shared_ptr<Zel_DeleteFrameRestrictionListReq> makeDeleteFrameRestrictionListReqSP(MonikerSP moniker, const QList<Zel_FrameLocator>& restrictions, boost::shared_ptr<Zel_FrameRestrictionListCB> callback) override { return boost::shared_ptr<Zel_DeleteFrameRestrictionListReq>(); }
    boost::shared_ptr<Zel_DeleteNodeReq> makeDeleteNodeReqSP(MonikerSP moniker, boost::shared_ptr<Zel_ResultBoolCB> callback) override { return boost::shared_ptr<Zel_DeleteNodeReq>(); }
    boost::shared_ptr<Zel_DeleteReq> makeDeleteReqSP(const QStringList& monikers, bool deleteRemoteMedia, bool deleteLocalMedia, boost::shared_ptr<Zel_DeleteCB> callback) override { return boost::shared_ptr<Zel_DeleteReq>(); }
    boost::shared_ptr<Zel_DirReq> makeDirReqSP(MonikerSP moniker, boost::shared_ptr<Zel_DirCB> callback) override { return boost::shared_ptr<Zel_DirReq>(); }
    boost::shared_ptr<Zel_GetApplicationSettingsReq> makeGetApplicationSettingsReqSP(const QString& applicationName, boost::shared_ptr<Zel_GetApplicationSettingsCB> callback) override { return boost::shared_ptr<Zel_GetApplicationSettingsReq>(); }
    boost::shared_ptr<Zel_GetChildrenReq> makeGetChildrenReqSP(MonikerSP parentMoniker, boost::shared_ptr<Zel_ResultCB> callback) override { return boost::shared_ptr<Zel_GetChildrenReq>(); }
    boost::shared_ptr<Zel_GetFrameLocatorListReq> makeGetFrameLocatorListReqSP(MonikerSP moniker, boost::shared_ptr<Zel_FrameLocatorListCB> callback) override { return boost::shared_ptr<Zel_GetFrameLocatorListReq>(); }
    boost::shared_ptr<Zel_GetFrameRestrictionListReq> makeGetFrameRestrictionListReqSP(MonikerSP moniker, boost::shared_ptr<Zel_FrameRestrictionListCB> callback) override { return boost::shared_ptr<Zel_GetFrameRestrictionListReq>(); }
    boost::shared_ptr<Zel_GetLinkedProjectsReq> makeGetLinkedProjectsReqSP(MonikerSP moniker, boost::shared_ptr<Zel_ResultCB> callback) override { return boost::shared_ptr<Zel_GetLinkedProjectsReq>(); }
    boost::shared_ptr<Zel_GetNodeReq> makeGetNodeReqSP(MonikerSP moniker, boost::shared_ptr<Zel_ResultCB> callback) override { return boost::shared_ptr<Zel_GetNodeReq>(); }
    boost::shared_ptr<Zel_GetPropertiesReq> makeGetPropertiesReqSP(MonikerSP moniker, const QStringList& keys, boost::shared_ptr<Zel_PropertyListCB> callback) override { return boost::shared_ptr<Zel_GetPropertiesReq>(); }
    boost::shared_ptr<Zel_GetReservationsReq> makeGetReservationsReqSP(MonikerSP moniker, boost::shared_ptr<Zel_GetReservationsCB> callback) override { return boost::shared_ptr<Zel_GetReservationsReq>(); }
    boost::shared_ptr<Zel_GetSettingsReq> makeGetSettingsReqSP(const QString& settingsName, boost::shared_ptr<Zel_GetSettingsCB> callback) override { return boost::shared_ptr<Zel_GetSettingsReq>(); }
    boost::shared_ptr<Zel_GetSyncedProjRootReq> makeGetSyncedProjRootReqSP(MonikerSP moniker, boost::shared_ptr<Zel_ResultCB> callback) override { return boost::shared_ptr<Zel_GetSyncedProjRootReq>(); }
    boost::shared_ptr<Zel_GetUserPriviledgesReq> makeGetUserPriviledgesReqSP(const QString& userName, MonikerSP moniker, boost::shared_ptr<Zel_NodePermissionsCB> callback) override { return boost::shared_ptr<Zel_GetUserPriviledgesReq>(); }
    boost::shared_ptr<Zel_GetUserSettingsReq> makeGetUserSettingsReqSP(Zel_GetUserSettingsCB::UserSettingsType settingsType, boost::shared_ptr<Zel_GetUserSettingsCB> callback) override { return boost::shared_ptr<Zel_GetUserSettingsReq>(); }
    boost::shared_ptr<Zel_GetWorkgroupSettingsReq> makeGetWorkgroupSettingsReqSP(boost::shared_ptr<Zel_SettingsCB> callback) override { return boost::shared_ptr<Zel_GetWorkgroupSettingsReq>(); }
    boost::shared_ptr<Zel_LoginReq> makeLoginReqSP(const QString& userName, const QString& password, boost::shared_ptr<Zel_LoginCredentials> credentials, boost::shared_ptr<Zel_LoginCB> callback) override { return boost::shared_ptr<Zel_LoginReq>(); }
    boost::shared_ptr<Zel_MediaResolutionsReq> makeMediaResolutionsReqSP(boost::shared_ptr<Zel_MediaResolutionsCB> callback) override { return boost::shared_ptr<Zel_MediaResolutionsReq>(); }
    boost::shared_ptr<Zel_MobBinaryDnDReq> makeMobBinaryDnDReqSP(const Zel_MobIDList& mobs, boost::shared_ptr<Zel_MobBinaryDnDCB> callback) override { return boost::shared_ptr<Zel_MobBinaryDnDReq>(); }
    boost::shared_ptr<Zel_MobBinaryReq> makeMobBinaryReqSP(boost::shared_ptr<Zel_MobID> mob, boost::shared_ptr<Zel_MobBinaryCB> callback) override { return boost::shared_ptr<Zel_MobBinaryReq>(); }
    boost::shared_ptr<Zel_MobHeadframeReq> makeMobHeadframeReqSP(boost::shared_ptr<Zel_MobID> mob, boost::shared_ptr<Zel_MobHeadframeCB> callback) override { return boost::shared_ptr<Zel_MobHeadframeReq>(); }
    boost::shared_ptr<Zel_MobNodeReq> makeMobNodeReqSP(boost::shared_ptr<Zel_MobID> mob, boost::shared_ptr<Zel_MobNodeCB> callback) override { return boost::shared_ptr<Zel_MobNodeReq>(); }
    boost::shared_ptr<Zel_MonikerReq> makeMonikerReqSP(const Zel_Directory& path, boost::shared_ptr<Zel_MonikerCB> callback) override { return boost::shared_ptr<Zel_MonikerReq>(); }
    boost::shared_ptr<Zel_MoveNodeReq> makeMoveNodeReqSP(MonikerSP moniker, MonikerSP destinationMoniker, boost::shared_ptr<Zel_MoveNodeCB> callback) override { return boost::shared_ptr<Zel_MoveNodeReq>(); }
    boost::shared_ptr<Zel_NodePermissionsReq> makeNodePermissionsReqSP(MonikerSP moniker, boost::shared_ptr<Zel_NodePermissionsCB> callback) override { return boost::shared_ptr<Zel_NodePermissionsReq>(); }
    boost::shared_ptr<Zel_NodeReq> makeNodeReqSP(const Zel_Directory& path, boost::shared_ptr<Zel_NodeCB> callback) override { return boost::shared_ptr<Zel_NodeReq>(); }
    boost::shared_ptr<Zel_NodeResolutionsReq> makeNodeResolutionsReqSP(MonikerSP moniker, boost::shared_ptr<Zel_NodeResolutionsCB> callback) override { return boost::shared_ptr<Zel_NodeResolutionsReq>(); }
    boost::shared_ptr<Zel_PropertyListReq> makePropertyListReqSP(MonikerSP moniker, boost::shared_ptr<Zel_PropertyListCB> callback) override { return boost::shared_ptr<Zel_PropertyListReq>(); }
    boost::shared_ptr<Zel_QueryReq> makeQueryReqSP(boost::shared_ptr<Zel_QuerySpec> query, boost::shared_ptr<Zel_QueryCB> callback) override { return boost::shared_ptr<Zel_QueryReq>(); }
    boost::shared_ptr<Zel_RefreshNodeReq> makeRefreshNodeReqSP(MonikerSP moniker, boost::shared_ptr<Zel_RefreshNodeCB> callback) override { return boost::shared_ptr<Zel_RefreshNodeReq>(); }
    boost::shared_ptr<Zel_RemoveReservationReq> makeRemoveReservationReqSP(MonikerSP moniker, boost::shared_ptr<Zel_RemoveReservationCB> callback) override { return boost::shared_ptr<Zel_RemoveReservationReq>(); }
    boost::shared_ptr<Zel_RenameNodeReq> makeRenameNodeReqSP(MonikerSP moniker, const QString& newName, boost::shared_ptr<Zel_RenameNodeCB> callback) override { return boost::shared_ptr<Zel_RenameNodeReq>(); }
    boost::shared_ptr<Zel_RenameUniqueReq> makeRenameUniqueReqSP(MonikerSP moniker, const QString& newName, boost::shared_ptr<Zel_RenameUniqueCB> callback) override { return boost::shared_ptr<Zel_RenameUniqueReq>(); }
    boost::shared_ptr<Zel_RootNodeReq> makeRootNodeReqSP(boost::shared_ptr<Zel_RootNodeCB> callback) override { return boost::shared_ptr<Zel_RootNodeReq>(); }
    boost::shared_ptr<Zel_SaveSettingsReq> makeSaveSettingsReqSP(const QString& settingsName, const QString& settingsXml, boost::shared_ptr<Zel_SaveSettingsCB> callback) override { return boost::shared_ptr<Zel_SaveSettingsReq>(); }
    boost::shared_ptr<Zel_SetApplicationSettingsReq> makeSetApplicationSettingsReqSP(const QString& applicationName, const QString& settingsXml, boost::shared_ptr<Zel_SetApplicationSettingsCB> callback) override { return boost::shared_ptr<Zel_SetApplicationSettingsReq>(); }
    boost::shared_ptr<Zel_SetPropertiesReq> makeSetPropertiesReqSP(MonikerSP moniker, const Zel_PropertyList& properties, boost::shared_ptr<Zel_SetPropertiesCB> callback) override { return boost::shared_ptr<Zel_SetPropertiesReq>(); }
    boost::shared_ptr<Zel_SetUserSettingsReq> makeSetUserSettingsReqSP(Zel_GetUserSettingsCB::UserSettingsType settingsType, const QString& settingsXml, boost::shared_ptr<Zel_SetUserSettingsCB> callback) override { return boost::shared_ptr<Zel_SetUserSettingsReq>(); }
    boost::shared_ptr<Zel_StartupReq> makeStartupReqSP(boost::shared_ptr<Zel_StartupCB> callback) override { return boost::shared_ptr<Zel_StartupReq>(); }
    void close() override {}
};

#endif
