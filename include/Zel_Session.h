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

// Requests: one class per line of the catalogue.
#define ZEL_REQUEST(Stem, Base, Name, Params, ArgNames) class Zel_##Stem##Req;
#include "zel_requests.def"
#undef ZEL_REQUEST

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
    // The factories are declared from the catalogue, zel_requests.def, which
    // says what each request does; make<Stem>ReqSP makes a Zel_<Stem>Req.
    // Include zel_request_headers.h (or the request's own header, such as
    // Zel_GetNodeReq.h) to hand the request to submitRequest.
#define ZEL_REQUEST(Stem, Base, Name, Params, ArgNames) \
    virtual boost::shared_ptr<Zel_##Stem##Req> make##Stem##ReqSP Params = 0;
#include "zel_requests.def"
#undef ZEL_REQUEST

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
