// Zel_Session: base class of the backend's connection object.
//
// One session stands for one connection of the application to the server.
// The backend derives its concrete session from this class and implements the
// pure operations below: the session's identity and state, and one factory per
// request class. The application obtains every request from its session,
// already constructed with the parameters of the operation and the callback
// that will receive the answers, and submits it to the engine:
//
//     boost::shared_ptr<Zel_GetNodeReq> req = session->makeGetNodeReqSP(moniker, myCallback);
//     session->submitRequest(req);            // or engine.Submit(req)
//
// This class supplies what every session shares: the connected and
// remote-client flags, the resolution identifiers the connection was opened
// with, the event hub with listener registration, and name validation.
//
// Listeners: RegisterListener files a listener in the session's hub (see
// Zel_EventCB); the hub holds it strongly until UnregisterListener. Copies of a
// session share one hub; the hub is emptied when the last session sharing it
// is destroyed, so no listener stays registered once every copy is gone.
//
// Threads: this class takes no lock of its own; registration is serialised by
// the hub's mutex and may come from any thread. The flags are plain values
// written by the backend. Factories return an empty pointer when the backend
// cannot make the request (for instance after close()).
#ifndef ZEL_SESSION_H
#define ZEL_SESSION_H

#include "zel_export.h"
#include "Orv_RequestID.h"
#include "Zel_GetUserSettingsCB.h"
#include "Zel_ResolutionIDList.h"

#include <QDateTime>
#include <QList>
#include <QString>
#include <QStringList>
#include <boost/shared_ptr.hpp>

class Orv_Request;
class Orv_ResultQ;
class Zel_EventCB;
class Zel_EventListener;
class Zel_StatusNotificationCB;

// Payloads of the request factories.
class Zel_DependencySPList;
class Zel_Directory;
class Zel_FrameLocator;
class Zel_LoginCredentials;
class Zel_MobDescList;
class Zel_MobID;
class Zel_MobIDList;
class Zel_Property;
class Zel_PropertyList;
class Zel_QuerySpec;

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

// Requests.
class Zel_AddDependencyReq;
class Zel_AddFrameLocatorListReq;
class Zel_AddFrameRestrictionListReq;
class Zel_AnalyzeReq;
class Zel_AssociationsReq;
class Zel_CheckinLocalBinReq;
class Zel_CheckinReq;
class Zel_CheckinUpdateReq;
class Zel_ChildrenAtMonikerReq;
class Zel_ChildrenAtReq;
class Zel_ChildrenReq;
class Zel_CopyNodeReq;
class Zel_CreateFolderReq;
class Zel_CreateFolderUniqueReq;
class Zel_CreateNodeUniqueReq;
class Zel_CreatePropertyReq;
class Zel_CreateReservationReq;
class Zel_DeleteFrameLocatorListReq;
class Zel_DeleteFrameRestrictionListReq;
class Zel_DeleteNodeReq;
class Zel_DeleteReq;
class Zel_DirReq;
class Zel_GetApplicationSettingsReq;
class Zel_GetChildrenReq;
class Zel_GetFrameLocatorListReq;
class Zel_GetFrameRestrictionListReq;
class Zel_GetLinkedProjectsReq;
class Zel_GetNodeReq;
class Zel_GetPropertiesReq;
class Zel_GetReservationsReq;
class Zel_GetSettingsReq;
class Zel_GetSyncedProjRootReq;
class Zel_GetUserPriviledgesReq;
class Zel_GetUserSettingsReq;
class Zel_GetWorkgroupSettingsReq;
class Zel_LoginReq;
class Zel_MediaResolutionsReq;
class Zel_MobBinaryDnDReq;
class Zel_MobBinaryReq;
class Zel_MobHeadframeReq;
class Zel_MobNodeReq;
class Zel_MonikerReq;
class Zel_MoveNodeReq;
class Zel_NodePermissionsReq;
class Zel_NodeReq;
class Zel_NodeResolutionsReq;
class Zel_PropertyListReq;
class Zel_QueryReq;
class Zel_RefreshNodeReq;
class Zel_RemoveReservationReq;
class Zel_RenameNodeReq;
class Zel_RenameUniqueReq;
class Zel_RootNodeReq;
class Zel_SaveSettingsReq;
class Zel_SetApplicationSettingsReq;
class Zel_SetPropertiesReq;
class Zel_SetUserSettingsReq;
class Zel_StartupReq;

class ZEL_EXPORT Zel_Session
{
public:
    // Monikers name nodes, as everywhere in the library.
    typedef boost::shared_ptr<QString> MonikerSP;

    // Starts connected, not a remote client, with a new empty event hub.
    explicit Zel_Session(const Zel_ResolutionIDList& resolutionIDs);
    // Copies share the hub (and the backend data).
    Zel_Session(const Zel_Session& other);
    Zel_Session& operator=(const Zel_Session& other);
    // Empties the hub when this is the last session sharing it.
    virtual ~Zel_Session();

    // --- Identity and state of the connection (backend) -------------------

    // Host name or address of the server this session is connected to.
    virtual QString getServerName() const = 0;
    // Version text the server reported at login.
    virtual QString getServerVersion() const = 0;
    // Name of the workgroup the server belongs to.
    virtual QString getWorkgroupName() const = 0;
    // Name of the logged-in user; empty before login.
    virtual QString getUserName() const = 0;
    // Name under which the application's settings are stored on the server.
    virtual QString getApplicationName() const = 0;
    // The server's identifier of this connection; empty before login.
    virtual QString getSessionID() const = 0;
    // True between a successful login and logout() or close().
    virtual bool isLoggedIn() const = 0;
    // Time of the successful login; a null date-time when not logged in.
    virtual QDateTime getLoginTime() const = 0;
    // Ends the user's login; the connection stays usable for a new login request.
    virtual void logout() = 0;
    // Moniker of the root node of the server's tree.
    virtual MonikerSP getRootMonikerSP() const = 0;
    // Moniker of the logged-in user's home folder; empty before login.
    virtual MonikerSP getHomeMonikerSP() const = 0;
    // Separator of the server's path texts (for Zel_Directory).
    virtual QString getPathSeparator() const = 0;
    // True when the text has the form of a moniker of this server (no server round trip).
    virtual bool isValidMoniker(const QString& moniker) const = 0;
    // The engine's result queue: the queue this session's listeners push onto.
    virtual boost::shared_ptr<Orv_ResultQ> getResultQSP() const = 0;
    // Hands a request made by this session to its engine; false if it was not accepted.
    virtual bool submitRequest(boost::shared_ptr<Orv_Request> request) = 0;
    // Cancels every request of this session that has not run yet.
    virtual void cancelAllRequests() = 0;
    // True when this backend implements the request class of that name ("Zel_GetNodeReq").
    virtual bool supportsRequest(const QString& requestName) const = 0;
    // The server's current date and time (reservations are in server time).
    virtual QDateTime getServerTime() const = 0;
    // True when the user may read but not change the server's tree.
    virtual bool isReadOnly() const = 0;
    // Longest asset or property name the server accepts, in characters.
    virtual int getMaxNameLength() const = 0;
    // Sets the callback that hears connection loss and reconnection; null stops it.
    virtual void setStatusNotificationCB(boost::shared_ptr<Zel_StatusNotificationCB> callback) = 0;
    // The callback set by setStatusNotificationCB.
    virtual boost::shared_ptr<Zel_StatusNotificationCB> getStatusNotificationCBSP() const = 0;

    // --- Request factories (backend), one per request class ----------------
    // Each returns a request constructed with the given callback, ready to be
    // submitted, or an empty pointer. Moniker lists are lists of moniker texts.

    // Adds the dependencies to the node; answers its node and dependency list.
    virtual boost::shared_ptr<Zel_AddDependencyReq> makeAddDependencyReqSP(MonikerSP moniker, const Zel_DependencySPList& dependencies, boost::shared_ptr<Zel_DependencyCB> callback) = 0;
    // Adds frame locators to the media asset.
    virtual boost::shared_ptr<Zel_AddFrameLocatorListReq> makeAddFrameLocatorListReqSP(MonikerSP moniker, const QList<Zel_FrameLocator>& locators, boost::shared_ptr<Zel_FrameLocatorListCB> callback) = 0;
    // Adds frame restrictions (given as locators of the restricted frames) to the media asset.
    virtual boost::shared_ptr<Zel_AddFrameRestrictionListReq> makeAddFrameRestrictionListReqSP(MonikerSP moniker, const QList<Zel_FrameLocator>& restrictions, boost::shared_ptr<Zel_FrameRestrictionListCB> callback) = 0;
    // Analyses local media files before their check-in.
    virtual boost::shared_ptr<Zel_AnalyzeReq> makeAnalyzeReqSP(const QStringList& filePaths, boost::shared_ptr<Zel_AnalyzeCB> callback) = 0;
    // Reads the locations (directories) associated with the node.
    virtual boost::shared_ptr<Zel_AssociationsReq> makeAssociationsReqSP(MonikerSP moniker, boost::shared_ptr<Zel_AssociationsCB> callback) = 0;
    // Checks in the media of a local bin file under the folder; answered like a check-in (Zel_CheckinCB).
    virtual boost::shared_ptr<Zel_CheckinLocalBinReq> makeCheckinLocalBinReqSP(const QString& binFilePath, MonikerSP folderMoniker, boost::shared_ptr<Zel_CheckinCB> callback) = 0;
    // Checks in the described media objects under the folder, one answer per object.
    virtual boost::shared_ptr<Zel_CheckinReq> makeCheckinReqSP(const Zel_MobDescList& mobs, MonikerSP folderMoniker, boost::shared_ptr<Zel_CheckinCB> callback) = 0;
    // Updates the server's copy of media objects checked in before.
    virtual boost::shared_ptr<Zel_CheckinUpdateReq> makeCheckinUpdateReqSP(const Zel_MobDescList& mobs, boost::shared_ptr<Zel_CheckinUpdateCB> callback) = 0;
    // Lists the children of the node named by the moniker (the callback's parent moniker is set).
    virtual boost::shared_ptr<Zel_ChildrenAtMonikerReq> makeChildrenAtMonikerReqSP(MonikerSP parentMoniker, boost::shared_ptr<Zel_ChildrenAtMonikerCB> callback) = 0;
    // Lists the children of the node at the path.
    virtual boost::shared_ptr<Zel_ChildrenAtReq> makeChildrenAtReqSP(const Zel_Directory& path, boost::shared_ptr<Zel_ChildrenAtCB> callback) = 0;
    // Lists the children of the node with their has-children flags.
    virtual boost::shared_ptr<Zel_ChildrenReq> makeChildrenReqSP(MonikerSP parentMoniker, boost::shared_ptr<Zel_ChildrenCB> callback) = 0;
    // Copies the node into the destination folder.
    virtual boost::shared_ptr<Zel_CopyNodeReq> makeCopyNodeReqSP(MonikerSP moniker, MonikerSP destinationMoniker, boost::shared_ptr<Zel_CopyNodeCB> callback) = 0;
    // Creates a folder of that name in the parent; fails if the name is taken.
    virtual boost::shared_ptr<Zel_CreateFolderReq> makeCreateFolderReqSP(MonikerSP parentMoniker, const QString& name, boost::shared_ptr<Zel_CreateFolderCB> callback) = 0;
    // Creates a folder in the parent, made unique from the name; answers the new node.
    virtual boost::shared_ptr<Zel_CreateFolderUniqueReq> makeCreateFolderUniqueReqSP(MonikerSP parentMoniker, const QString& name, boost::shared_ptr<Zel_CreateFolderUniqueCB> callback) = 0;
    // Creates a node with the properties (its type among them) in the parent, made unique from the name.
    virtual boost::shared_ptr<Zel_CreateNodeUniqueReq> makeCreateNodeUniqueReqSP(MonikerSP parentMoniker, const QString& name, const Zel_PropertyList& properties, boost::shared_ptr<Zel_ResultCB> callback) = 0;
    // Adds a new property to the node; its key must pass isValidPropertyName.
    virtual boost::shared_ptr<Zel_CreatePropertyReq> makeCreatePropertyReqSP(MonikerSP moniker, const Zel_Property& property, boost::shared_ptr<Zel_CreatePropertyCB> callback) = 0;
    // Reserves the node for the user until the expiry time (server time).
    virtual boost::shared_ptr<Zel_CreateReservationReq> makeCreateReservationReqSP(MonikerSP moniker, const QDateTime& expiry, boost::shared_ptr<Zel_CreateReservationCB> callback) = 0;
    // Removes the frame locators (matched by identifier) from the media asset.
    virtual boost::shared_ptr<Zel_DeleteFrameLocatorListReq> makeDeleteFrameLocatorListReqSP(MonikerSP moniker, const QList<Zel_FrameLocator>& locators, boost::shared_ptr<Zel_FrameLocatorListCB> callback) = 0;
    // Removes the frame restrictions (matched by identifier) from the media asset.
    virtual boost::shared_ptr<Zel_DeleteFrameRestrictionListReq> makeDeleteFrameRestrictionListReqSP(MonikerSP moniker, const QList<Zel_FrameLocator>& restrictions, boost::shared_ptr<Zel_FrameRestrictionListCB> callback) = 0;
    // Deletes one node from the tree; answers true when it is gone.
    virtual boost::shared_ptr<Zel_DeleteNodeReq> makeDeleteNodeReqSP(MonikerSP moniker, boost::shared_ptr<Zel_ResultBoolCB> callback) = 0;
    // Deletes the assets and, when asked, their media on the server and on this machine.
    virtual boost::shared_ptr<Zel_DeleteReq> makeDeleteReqSP(const QStringList& monikers, bool deleteRemoteMedia, bool deleteLocalMedia, boost::shared_ptr<Zel_DeleteCB> callback) = 0;
    // Reads the path of the node.
    virtual boost::shared_ptr<Zel_DirReq> makeDirReqSP(MonikerSP moniker, boost::shared_ptr<Zel_DirCB> callback) = 0;
    // Reads the settings text stored for the application.
    virtual boost::shared_ptr<Zel_GetApplicationSettingsReq> makeGetApplicationSettingsReqSP(const QString& applicationName, boost::shared_ptr<Zel_GetApplicationSettingsCB> callback) = 0;
    // Reads the children of the node, one node per answer.
    virtual boost::shared_ptr<Zel_GetChildrenReq> makeGetChildrenReqSP(MonikerSP parentMoniker, boost::shared_ptr<Zel_ResultCB> callback) = 0;
    // Reads the frame locators of the media asset.
    virtual boost::shared_ptr<Zel_GetFrameLocatorListReq> makeGetFrameLocatorListReqSP(MonikerSP moniker, boost::shared_ptr<Zel_FrameLocatorListCB> callback) = 0;
    // Reads the frame restrictions of the media asset.
    virtual boost::shared_ptr<Zel_GetFrameRestrictionListReq> makeGetFrameRestrictionListReqSP(MonikerSP moniker, boost::shared_ptr<Zel_FrameRestrictionListCB> callback) = 0;
    // Reads the projects linked to the node, one node per answer.
    virtual boost::shared_ptr<Zel_GetLinkedProjectsReq> makeGetLinkedProjectsReqSP(MonikerSP moniker, boost::shared_ptr<Zel_ResultCB> callback) = 0;
    // Reads the node named by the moniker.
    virtual boost::shared_ptr<Zel_GetNodeReq> makeGetNodeReqSP(MonikerSP moniker, boost::shared_ptr<Zel_ResultCB> callback) = 0;
    // Reads the named properties of the node (all when the list is empty); answered through Zel_PropertyListCB.
    virtual boost::shared_ptr<Zel_GetPropertiesReq> makeGetPropertiesReqSP(MonikerSP moniker, const QStringList& keys, boost::shared_ptr<Zel_PropertyListCB> callback) = 0;
    // Reads the reservations of the node (holder and expiry).
    virtual boost::shared_ptr<Zel_GetReservationsReq> makeGetReservationsReqSP(MonikerSP moniker, boost::shared_ptr<Zel_GetReservationsCB> callback) = 0;
    // Reads the settings document stored under the name.
    virtual boost::shared_ptr<Zel_GetSettingsReq> makeGetSettingsReqSP(const QString& settingsName, boost::shared_ptr<Zel_GetSettingsCB> callback) = 0;
    // Reads the root node of the synced project that holds the node.
    virtual boost::shared_ptr<Zel_GetSyncedProjRootReq> makeGetSyncedProjRootReqSP(MonikerSP moniker, boost::shared_ptr<Zel_ResultCB> callback) = 0;
    // Reads the privileges of the user on the node; answered through Zel_NodePermissionsCB.
    virtual boost::shared_ptr<Zel_GetUserPriviledgesReq> makeGetUserPriviledgesReqSP(const QString& userName, MonikerSP moniker, boost::shared_ptr<Zel_NodePermissionsCB> callback) = 0;
    // Reads the logged-in user's settings of the type.
    virtual boost::shared_ptr<Zel_GetUserSettingsReq> makeGetUserSettingsReqSP(Zel_GetUserSettingsCB::UserSettingsType settingsType, boost::shared_ptr<Zel_GetUserSettingsCB> callback) = 0;
    // Reads the workgroup's settings text; answered through Zel_SettingsCB.
    virtual boost::shared_ptr<Zel_GetWorkgroupSettingsReq> makeGetWorkgroupSettingsReqSP(boost::shared_ptr<Zel_SettingsCB> callback) = 0;
    // Logs the user in; credentials may carry backend-specific extras or be null.
    virtual boost::shared_ptr<Zel_LoginReq> makeLoginReqSP(const QString& userName, const QString& password, boost::shared_ptr<Zel_LoginCredentials> credentials, boost::shared_ptr<Zel_LoginCB> callback) = 0;
    // Reads the descriptions of the media resolutions the server knows.
    virtual boost::shared_ptr<Zel_MediaResolutionsReq> makeMediaResolutionsReqSP(boost::shared_ptr<Zel_MediaResolutionsCB> callback) = 0;
    // Reads the binary form of the media objects for a drag-and-drop.
    virtual boost::shared_ptr<Zel_MobBinaryDnDReq> makeMobBinaryDnDReqSP(const Zel_MobIDList& mobs, boost::shared_ptr<Zel_MobBinaryDnDCB> callback) = 0;
    // Reads the binary form of the media object.
    virtual boost::shared_ptr<Zel_MobBinaryReq> makeMobBinaryReqSP(boost::shared_ptr<Zel_MobID> mob, boost::shared_ptr<Zel_MobBinaryCB> callback) = 0;
    // Reads the head frame of the media object.
    virtual boost::shared_ptr<Zel_MobHeadframeReq> makeMobHeadframeReqSP(boost::shared_ptr<Zel_MobID> mob, boost::shared_ptr<Zel_MobHeadframeCB> callback) = 0;
    // Reads the node of the media object.
    virtual boost::shared_ptr<Zel_MobNodeReq> makeMobNodeReqSP(boost::shared_ptr<Zel_MobID> mob, boost::shared_ptr<Zel_MobNodeCB> callback) = 0;
    // Reads the moniker of the node at the path.
    virtual boost::shared_ptr<Zel_MonikerReq> makeMonikerReqSP(const Zel_Directory& path, boost::shared_ptr<Zel_MonikerCB> callback) = 0;
    // Moves the node into the destination folder.
    virtual boost::shared_ptr<Zel_MoveNodeReq> makeMoveNodeReqSP(MonikerSP moniker, MonikerSP destinationMoniker, boost::shared_ptr<Zel_MoveNodeCB> callback) = 0;
    // Reads the logged-in user's permissions on the node.
    virtual boost::shared_ptr<Zel_NodePermissionsReq> makeNodePermissionsReqSP(MonikerSP moniker, boost::shared_ptr<Zel_NodePermissionsCB> callback) = 0;
    // Reads the node at the path.
    virtual boost::shared_ptr<Zel_NodeReq> makeNodeReqSP(const Zel_Directory& path, boost::shared_ptr<Zel_NodeCB> callback) = 0;
    // Reads the media resolutions held for the node, one media object per answer.
    virtual boost::shared_ptr<Zel_NodeResolutionsReq> makeNodeResolutionsReqSP(MonikerSP moniker, boost::shared_ptr<Zel_NodeResolutionsCB> callback) = 0;
    // Reads every property of the node.
    virtual boost::shared_ptr<Zel_PropertyListReq> makePropertyListReqSP(MonikerSP moniker, boost::shared_ptr<Zel_PropertyListCB> callback) = 0;
    // Searches the tree; the callback is given the query specification.
    virtual boost::shared_ptr<Zel_QueryReq> makeQueryReqSP(boost::shared_ptr<Zel_QuerySpec> query, boost::shared_ptr<Zel_QueryCB> callback) = 0;
    // Reads the node again from the server, bypassing caches.
    virtual boost::shared_ptr<Zel_RefreshNodeReq> makeRefreshNodeReqSP(MonikerSP moniker, boost::shared_ptr<Zel_RefreshNodeCB> callback) = 0;
    // Removes the user's reservation of the node.
    virtual boost::shared_ptr<Zel_RemoveReservationReq> makeRemoveReservationReqSP(MonikerSP moniker, boost::shared_ptr<Zel_RemoveReservationCB> callback) = 0;
    // Renames the node; fails if the name is taken.
    virtual boost::shared_ptr<Zel_RenameNodeReq> makeRenameNodeReqSP(MonikerSP moniker, const QString& newName, boost::shared_ptr<Zel_RenameNodeCB> callback) = 0;
    // Renames the node to a name made unique from the given one; answers the node.
    virtual boost::shared_ptr<Zel_RenameUniqueReq> makeRenameUniqueReqSP(MonikerSP moniker, const QString& newName, boost::shared_ptr<Zel_RenameUniqueCB> callback) = 0;
    // Reads the root node of the server's tree.
    virtual boost::shared_ptr<Zel_RootNodeReq> makeRootNodeReqSP(boost::shared_ptr<Zel_RootNodeCB> callback) = 0;
    // Stores the settings document (XML text, see Zel_SettingList::toXML) under the name.
    virtual boost::shared_ptr<Zel_SaveSettingsReq> makeSaveSettingsReqSP(const QString& settingsName, const QString& settingsXml, boost::shared_ptr<Zel_SaveSettingsCB> callback) = 0;
    // Stores the settings text for the application.
    virtual boost::shared_ptr<Zel_SetApplicationSettingsReq> makeSetApplicationSettingsReqSP(const QString& applicationName, const QString& settingsXml, boost::shared_ptr<Zel_SetApplicationSettingsCB> callback) = 0;
    // Sets property values of the node; pass a Zel_ConditionalSetPropertiesCB for a conditional set.
    virtual boost::shared_ptr<Zel_SetPropertiesReq> makeSetPropertiesReqSP(MonikerSP moniker, const Zel_PropertyList& properties, boost::shared_ptr<Zel_SetPropertiesCB> callback) = 0;
    // Stores the logged-in user's settings of the type.
    virtual boost::shared_ptr<Zel_SetUserSettingsReq> makeSetUserSettingsReqSP(Zel_GetUserSettingsCB::UserSettingsType settingsType, const QString& settingsXml, boost::shared_ptr<Zel_SetUserSettingsCB> callback) = 0;
    // Prepares the session for work after login (caches, server checks).
    virtual boost::shared_ptr<Zel_StartupReq> makeStartupReqSP(boost::shared_ptr<Zel_StartupCB> callback) = 0;

    // --- Name rules -------------------------------------------------------

    // Characters that may not appear in an asset name; none here.
    virtual const QString illegalAssetNameCharacters() const;
    // Characters that may not appear in a property name; none here.
    virtual const QString illegalPropertyNameCharacters() const;

    // --- End of the connection (backend) ----------------------------------

    // Ends the connection: cancels pending requests and logs out; factories answer empty afterwards.
    virtual void close() = 0;

    // --- Shared part --------------------------------------------------------

    // Files the listener in the session's hub (once; see Zel_EventCB::Register).
    void RegisterListener(boost::shared_ptr<Zel_EventListener> listener);
    // Removes the listener from the session's hub.
    void UnregisterListener(boost::shared_ptr<Zel_EventListener> listener);

    bool getConnectionStatus() const;
    bool getRemoteClientStatus() const;
    void setRemoteClientStatus(bool remoteClient);
    const Zel_ResolutionIDList& getResolutionIDList() const;

    // A name with at least one word character (letter, digit, mark or '_')
    // and none of the illegal characters of its kind.
    bool isValidAssetName(const QString& name) const;
    bool isValidPropertyName(const QString& name) const;

protected:
    // The hub, for the derived session: node listeners are built from it.
    boost::shared_ptr<Zel_EventCB> getEventCBSP();
    void setConnectedStatus(bool connected);
    // True when the name holds a word character and none of the characters of
    // illegalCharacters, each taken literally.
    bool isValidName(const QString& name, const QString& illegalCharacters) const;

    // Data of the backend's session, shared by copies; never read by this class.
    const boost::shared_ptr<void>& getBackendDataSP() const { return mBackendData; }
    void setBackendDataSP(const boost::shared_ptr<void>& data) { mBackendData = data; }

private:
    // Remembers the hub it is filed in (folder facades).
    friend class Zel_EventListenerFolderImpl;

    class HubLease;

    boost::shared_ptr<void> mBackendData;
    Orv_RequestID mID;
    bool mConnected;
    bool mRemoteClient;
    Zel_ResolutionIDList mResolutionIDs;
    boost::shared_ptr<Zel_EventCB> mHub;
    // Shared by the sessions that share the hub; the last one empties the hub.
    boost::shared_ptr<HubLease> mHubLease;
};

#endif
