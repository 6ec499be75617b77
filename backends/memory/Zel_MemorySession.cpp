#include "Zel_MemorySession.h"

#include "memory_ops_p.h"
#include "memory_session_p.h"
#include "Zel_MemoryPropertyManager.h"
#include "Zel_MemoryTree.h"

#include "Orv_Engine.h"
#include "Orv_Request.h"
#include "Zel_ChildrenAtMonikerCB.h"
#include "Zel_ConditionalSetPropertiesCB.h"
#include "Zel_ConnectionListener.h"
#include "Zel_Property.h"
#include "Zel_QueryCB.h"
#include "Zel_ResolutionID.h"
#include "Zel_StatusNotificationCB.h"

// Every callback and request class, for the factories.
#include "Zel_AnalyzeCB.h"
#include "Zel_AssociationsCB.h"
#include "Zel_CheckinCB.h"
#include "Zel_CheckinUpdateCB.h"
#include "Zel_ChildrenAtCB.h"
#include "Zel_ChildrenCB.h"
#include "Zel_CopyNodeCB.h"
#include "Zel_CreateFolderCB.h"
#include "Zel_CreateFolderUniqueCB.h"
#include "Zel_CreatePropertyCB.h"
#include "Zel_CreateReservationCB.h"
#include "Zel_DeleteCB.h"
#include "Zel_DependencyCB.h"
#include "Zel_DirCB.h"
#include "Zel_EventCB.h"
#include "Zel_FrameLocatorListCB.h"
#include "Zel_FrameRestrictionListCB.h"
#include "Zel_GetApplicationSettingsCB.h"
#include "Zel_GetChildrenCB.h"
#include "Zel_GetReservationsCB.h"
#include "Zel_GetSettingsCB.h"
#include "Zel_GetUserSettingsCB.h"
#include "Zel_LoginBriefCB.h"
#include "Zel_LoginCB.h"
#include "Zel_MediaResolutionsCB.h"
#include "Zel_MobBinaryCB.h"
#include "Zel_MobBinaryDnDCB.h"
#include "Zel_MobHeadframeCB.h"
#include "Zel_MobNodeCB.h"
#include "Zel_MonikerCB.h"
#include "Zel_MoveNodeCB.h"
#include "Zel_NodeCB.h"
#include "Zel_NodePermissionsCB.h"
#include "Zel_NodeResolutionsCB.h"
#include "Zel_PropertyListCB.h"
#include "Zel_RefreshNodeCB.h"
#include "Zel_RemoveReservationCB.h"
#include "Zel_RenameNodeCB.h"
#include "Zel_RenameUniqueCB.h"
#include "Zel_ResultBoolCB.h"
#include "Zel_ResultCB.h"
#include "Zel_RootNodeCB.h"
#include "Zel_SaveSettingsCB.h"
#include "Zel_ServerCheckCB.h"
#include "Zel_SetApplicationSettingsCB.h"
#include "Zel_SetPropertiesCB.h"
#include "Zel_SetUserSettingsCB.h"
#include "Zel_SettingsCB.h"
#include "Zel_StartupCB.h"

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

#include <iterator>
#include <mutex>
#include <vector>

namespace {

const char* const kRequestNames[] = {
    "Zel_AddDependencyReq", "Zel_AddFrameLocatorListReq", "Zel_AddFrameRestrictionListReq", "Zel_AnalyzeReq",
    "Zel_AssociationsReq", "Zel_CheckinLocalBinReq", "Zel_CheckinReq", "Zel_CheckinUpdateReq",
    "Zel_ChildrenAtMonikerReq", "Zel_ChildrenAtReq", "Zel_ChildrenReq", "Zel_CopyNodeReq", "Zel_CreateFolderReq",
    "Zel_CreateFolderUniqueReq", "Zel_CreateNodeUniqueReq", "Zel_CreatePropertyReq", "Zel_CreateReservationReq",
    "Zel_DeleteFrameLocatorListReq", "Zel_DeleteFrameRestrictionListReq", "Zel_DeleteNodeReq", "Zel_DeleteReq",
    "Zel_DirReq", "Zel_GetApplicationSettingsReq", "Zel_GetChildrenReq", "Zel_GetFrameLocatorListReq",
    "Zel_GetFrameRestrictionListReq", "Zel_GetLinkedProjectsReq", "Zel_GetNodeReq", "Zel_GetPropertiesReq",
    "Zel_GetReservationsReq", "Zel_GetSettingsReq", "Zel_GetSyncedProjRootReq", "Zel_GetUserPriviledgesReq",
    "Zel_GetUserSettingsReq", "Zel_GetWorkgroupSettingsReq", "Zel_LoginReq", "Zel_MediaResolutionsReq",
    "Zel_MobBinaryDnDReq", "Zel_MobBinaryReq", "Zel_MobHeadframeReq", "Zel_MobNodeReq", "Zel_MonikerReq",
    "Zel_MoveNodeReq", "Zel_NodePermissionsReq", "Zel_NodeReq", "Zel_NodeResolutionsReq", "Zel_PropertyListReq",
    "Zel_QueryReq", "Zel_Query", "Zel_RefreshNodeReq", "Zel_RemoveReservationReq", "Zel_RenameNodeReq",
    "Zel_RenameUniqueReq", "Zel_RootNodeReq", "Zel_SaveSettingsReq", "Zel_SetApplicationSettingsReq",
    "Zel_SetPropertiesReq", "Zel_SetUserSettingsReq", "Zel_StartupReq"};

Zel_ResolutionIDList resolutionsOf(const boost::shared_ptr<Zel_MemoryTree>& tree)
{
    Zel_ResolutionIDList list;
    if (tree) {
        ZelMemory::Tree& data = tree->data();
        ZelMemory::ReadHold hold(data);
        for (const ZelMemory::Resolution& r : data.resolutions)
            list.append(Zel_ResolutionID(r.label, r.id));
    }
    return list;
}

// The property managers of the live sessions, oldest first. The newest live
// session's manager is the registered one; when a session goes, the
// registration falls back to the newest session still alive, so that another
// session (on the same tree or another) keeps its key descriptions.
std::mutex gManagersMutex;

std::vector<boost::shared_ptr<Zel_PropertyManager>>& liveManagers()
{
    static std::vector<boost::shared_ptr<Zel_PropertyManager>> managers;
    return managers;
}

void registerManager(const boost::shared_ptr<Zel_PropertyManager>& manager)
{
    std::lock_guard<std::mutex> lock(gManagersMutex);
    liveManagers().push_back(manager);
    Zel_Property::setPropertyManagerSP(manager);
}

void unregisterManager(const boost::shared_ptr<Zel_PropertyManager>& manager)
{
    std::lock_guard<std::mutex> lock(gManagersMutex);
    std::vector<boost::shared_ptr<Zel_PropertyManager>>& managers = liveManagers();
    for (auto it = managers.rbegin(); it != managers.rend(); ++it) {
        if (*it == manager) {
            managers.erase(std::next(it).base());
            break;
        }
    }
    // An application's own manager, registered later, stays.
    if (Zel_Property::getPropertyManagerSP() == manager)
        Zel_Property::setPropertyManagerSP(managers.empty() ? boost::shared_ptr<Zel_PropertyManager>() : managers.back());
}

} // namespace

Zel_MemorySession::Zel_MemorySession(const boost::shared_ptr<Zel_MemoryTree>& tree, Orv_Engine* engine,
                                     const QString& applicationName)
    : Zel_Session(resolutionsOf(tree))
    , mState(new ZelMemory::SessionState)
{
    mState->tree = tree ? tree : Zel_MemoryTree::sample();
    if (engine) {
        mState->engine = engine->getHandle();
        mState->resultQ = engine->getResultQ();
    }
    mState->applicationName = applicationName;
    // This class's rules until the first request is made (a derived session's
    // own are not reachable yet).
    mState->setNameRules(illegalAssetNameCharacters(), illegalPropertyNameCharacters());
    setBackendDataSP(mState);
    setRemoteClientStatus(false);

    mObserver.reset(new ZelMemory::SessionObserver(getEventCBSP(), mState->resultQ, mState));
    mState->tree->data().addObserver(mObserver);
    mPropertyManager = mState->tree->data().propertyManager;
    registerManager(mPropertyManager);
}

Zel_MemorySession::~Zel_MemorySession()
{
    // Requests that outlive the session fail with NotConnected from now on.
    mState->closed = true;
    mState->tree->data().removeObserver(mObserver.get());
    unregisterManager(mPropertyManager);
}

// --- The connection and the session's state -----------------------------------

QString Zel_MemorySession::getServerName() const
{
    return mState->tree->serverName();
}

QString Zel_MemorySession::getServerVersion() const
{
    return QStringLiteral("zel-memory 1.0");
}

QString Zel_MemorySession::getWorkgroupName() const
{
    ZelMemory::Tree& data = mState->tree->data();
    ZelMemory::ReadHold hold(data);
    for (const auto& setting : data.workgroupSettings) {
        if (setting.first == QLatin1String("Workgroup.Name"))
            return setting.second;
    }
    return QString();
}

QString Zel_MemorySession::getUserName() const
{
    return mState->user();
}

QString Zel_MemorySession::getApplicationName() const
{
    return mState->applicationName;
}

QString Zel_MemorySession::getSessionID() const
{
    return mState->sessionID();
}

bool Zel_MemorySession::isLoggedIn() const
{
    return !mState->user().isEmpty();
}

QDateTime Zel_MemorySession::getLoginTime() const
{
    return mState->loginTime();
}

void Zel_MemorySession::logout()
{
    mState->clearLogin();
}

Zel_Session::MonikerSP Zel_MemorySession::getRootMonikerSP() const
{
    return MonikerSP(new QString(mState->tree->rootMoniker()));
}

Zel_Session::MonikerSP Zel_MemorySession::getHomeMonikerSP() const
{
    // Every user's home is the root of the tree.
    if (!isLoggedIn())
        return MonikerSP();
    return getRootMonikerSP();
}

QString Zel_MemorySession::getPathSeparator() const
{
    return QStringLiteral("/");
}

bool Zel_MemorySession::isValidMoniker(const QString& moniker) const
{
    if (moniker.startsWith(QLatin1String("zel-mem://")) && moniker.size() > 10)
        return true;
    ZelMemory::Tree& data = mState->tree->data();
    ZelMemory::ReadHold hold(data);
    return data.idByMoniker.contains(moniker);
}

boost::shared_ptr<Orv_ResultQ> Zel_MemorySession::getResultQSP() const
{
    return mState->resultQ;
}

bool Zel_MemorySession::submitRequest(boost::shared_ptr<Orv_Request> request)
{
    if (!request || !mState->engine || mState->closed.load())
        return false;
    // False when the engine is gone: the request is not run and its callback
    // hears nothing.
    return mState->engine->Submit(std::move(request));
}

void Zel_MemorySession::cancelAllRequests()
{
    mState->cancelAll();
}

bool Zel_MemorySession::supportsRequest(const QString& requestName) const
{
    for (const char* name : kRequestNames) {
        if (requestName == QLatin1String(name))
            return true;
    }
    return false;
}

QDateTime Zel_MemorySession::getServerTime() const
{
    return QDateTime::currentDateTimeUtc();
}

bool Zel_MemorySession::isReadOnly() const
{
    const QString user = mState->user();
    ZelMemory::Tree& data = mState->tree->data();
    ZelMemory::ReadHold hold(data);
    const ZelMemory::Node* root = data.byId(data.rootId);
    const std::uint32_t writing = ZelMemory::PermAddFiles | ZelMemory::PermAddFolders | ZelMemory::PermWriteAttributes
        | ZelMemory::PermDeleteAssets;
    return user.isEmpty() || !root || (data.permissionsOf(user, *root) & writing) == 0;
}

int Zel_MemorySession::getMaxNameLength() const
{
    return ZelMemory::MaxNameLength;
}

void Zel_MemorySession::setStatusNotificationCB(boost::shared_ptr<Zel_StatusNotificationCB> callback)
{
    std::lock_guard<std::mutex> lock(mStatusMutex);
    mStatusCB = callback;
    mConnectionListener.reset(callback ? new Zel_ConnectionListener(callback, mState->resultQ) : nullptr);
}

boost::shared_ptr<Zel_StatusNotificationCB> Zel_MemorySession::getStatusNotificationCBSP() const
{
    std::lock_guard<std::mutex> lock(mStatusMutex);
    return mStatusCB;
}

const QString Zel_MemorySession::illegalAssetNameCharacters() const
{
    return QStringLiteral("/\\:*?\"<>|");
}

void Zel_MemorySession::close()
{
    mState->closed = true;
    mState->cancelAll();
    mState->clearLogin();
}

boost::shared_ptr<Zel_MemoryTree> Zel_MemorySession::getTreeSP() const
{
    return mState->tree;
}

void Zel_MemorySession::simulateConnectionLoss()
{
    if (!mState->connected.exchange(false))
        return;
    setConnectedStatus(false);
    boost::shared_ptr<Zel_ConnectionListener> listener;
    {
        std::lock_guard<std::mutex> lock(mStatusMutex);
        listener = mConnectionListener;
    }
    if (listener)
        listener->ConnectionWillReconnect();
}

void Zel_MemorySession::simulateReconnect()
{
    if (mState->connected.exchange(true))
        return;
    setConnectedStatus(true);
    boost::shared_ptr<Zel_ConnectionListener> listener;
    {
        std::lock_guard<std::mutex> lock(mStatusMutex);
        listener = mConnectionListener;
    }
    if (listener)
        listener->ConnectionReconnected();
}

// --- Request factories ------------------------------------------------------------

template <class Req, class Concrete, class Callback, class Args>
boost::shared_ptr<Req> Zel_MemorySession::make(const boost::shared_ptr<Callback>& callback, const Args& args)
{
    if (mState->closed.load())
        return boost::shared_ptr<Req>();
    // The request's work checks names against the rules as they stand now,
    // taken here on the caller's thread: it never calls into the session.
    mState->setNameRules(illegalAssetNameCharacters(), illegalPropertyNameCharacters());
    boost::shared_ptr<Concrete> request(new Concrete(callback, mState, args));
    mState->track(request);
    return request;
}

boost::shared_ptr<Zel_AddDependencyReq> Zel_MemorySession::makeAddDependencyReqSP(MonikerSP moniker, const Zel_DependencySPList& dependencies, boost::shared_ptr<Zel_DependencyCB> callback)
{
    return make<Zel_AddDependencyReq, ZelMemory::Request<Zel_AddDependencyReq, ZelMemory::AddDependencyOp>>(callback, ZelMemory::AddDependencyOp::Args{moniker, dependencies});
}

boost::shared_ptr<Zel_AddFrameLocatorListReq> Zel_MemorySession::makeAddFrameLocatorListReqSP(MonikerSP moniker, const QList<Zel_FrameLocator>& locators, boost::shared_ptr<Zel_FrameLocatorListCB> callback)
{
    return make<Zel_AddFrameLocatorListReq, ZelMemory::Request<Zel_AddFrameLocatorListReq, ZelMemory::AddFrameLocatorListOp>>(callback, ZelMemory::AddFrameLocatorListOp::Args{moniker, locators});
}

boost::shared_ptr<Zel_AddFrameRestrictionListReq> Zel_MemorySession::makeAddFrameRestrictionListReqSP(MonikerSP moniker, const QList<Zel_FrameLocator>& restrictions, boost::shared_ptr<Zel_FrameRestrictionListCB> callback)
{
    return make<Zel_AddFrameRestrictionListReq, ZelMemory::Request<Zel_AddFrameRestrictionListReq, ZelMemory::AddFrameRestrictionListOp>>(callback, ZelMemory::AddFrameRestrictionListOp::Args{moniker, restrictions});
}

boost::shared_ptr<Zel_AnalyzeReq> Zel_MemorySession::makeAnalyzeReqSP(const QStringList& filePaths, boost::shared_ptr<Zel_AnalyzeCB> callback)
{
    return make<Zel_AnalyzeReq, ZelMemory::Request<Zel_AnalyzeReq, ZelMemory::AnalyzeOp>>(callback, ZelMemory::AnalyzeOp::Args{filePaths});
}

boost::shared_ptr<Zel_AssociationsReq> Zel_MemorySession::makeAssociationsReqSP(MonikerSP moniker, boost::shared_ptr<Zel_AssociationsCB> callback)
{
    return make<Zel_AssociationsReq, ZelMemory::Request<Zel_AssociationsReq, ZelMemory::AssociationsOp>>(callback, ZelMemory::AssociationsOp::Args{moniker});
}

boost::shared_ptr<Zel_CheckinLocalBinReq> Zel_MemorySession::makeCheckinLocalBinReqSP(const QString& binFilePath, MonikerSP folderMoniker, boost::shared_ptr<Zel_CheckinCB> callback)
{
    return make<Zel_CheckinLocalBinReq, ZelMemory::Request<Zel_CheckinLocalBinReq, ZelMemory::CheckinLocalBinOp>>(callback, ZelMemory::CheckinLocalBinOp::Args{binFilePath, folderMoniker});
}

boost::shared_ptr<Zel_CheckinReq> Zel_MemorySession::makeCheckinReqSP(const Zel_MobDescList& mobs, MonikerSP folderMoniker, boost::shared_ptr<Zel_CheckinCB> callback)
{
    return make<Zel_CheckinReq, ZelMemory::Request<Zel_CheckinReq, ZelMemory::CheckinOp>>(callback, ZelMemory::CheckinOp::Args{mobs, folderMoniker});
}

boost::shared_ptr<Zel_CheckinUpdateReq> Zel_MemorySession::makeCheckinUpdateReqSP(const Zel_MobDescList& mobs, boost::shared_ptr<Zel_CheckinUpdateCB> callback)
{
    return make<Zel_CheckinUpdateReq, ZelMemory::Request<Zel_CheckinUpdateReq, ZelMemory::CheckinUpdateOp>>(callback, ZelMemory::CheckinUpdateOp::Args{mobs});
}

boost::shared_ptr<Zel_ChildrenAtMonikerReq> Zel_MemorySession::makeChildrenAtMonikerReqSP(MonikerSP parentMoniker, boost::shared_ptr<Zel_ChildrenAtMonikerCB> callback)
{
    if (callback)
        callback->setParentMoniker(parentMoniker);
    return make<Zel_ChildrenAtMonikerReq, ZelMemory::Request<Zel_ChildrenAtMonikerReq, ZelMemory::ChildrenAtMonikerOp>>(callback, ZelMemory::ChildrenAtMonikerOp::Args{parentMoniker, callback});
}

boost::shared_ptr<Zel_ChildrenAtReq> Zel_MemorySession::makeChildrenAtReqSP(const Zel_Directory& path, boost::shared_ptr<Zel_ChildrenAtCB> callback)
{
    return make<Zel_ChildrenAtReq, ZelMemory::Request<Zel_ChildrenAtReq, ZelMemory::ChildrenAtOp>>(callback, ZelMemory::ChildrenAtOp::Args{path});
}

boost::shared_ptr<Zel_ChildrenReq> Zel_MemorySession::makeChildrenReqSP(MonikerSP parentMoniker, boost::shared_ptr<Zel_ChildrenCB> callback)
{
    return make<Zel_ChildrenReq, ZelMemory::Request<Zel_ChildrenReq, ZelMemory::ChildrenOp>>(callback, ZelMemory::ChildrenOp::Args{parentMoniker});
}

boost::shared_ptr<Zel_CopyNodeReq> Zel_MemorySession::makeCopyNodeReqSP(MonikerSP moniker, MonikerSP destinationMoniker, boost::shared_ptr<Zel_CopyNodeCB> callback)
{
    return make<Zel_CopyNodeReq, ZelMemory::Request<Zel_CopyNodeReq, ZelMemory::CopyNodeOp>>(callback, ZelMemory::CopyNodeOp::Args{moniker, destinationMoniker});
}

boost::shared_ptr<Zel_CreateFolderReq> Zel_MemorySession::makeCreateFolderReqSP(MonikerSP parentMoniker, const QString& name, boost::shared_ptr<Zel_CreateFolderCB> callback)
{
    return make<Zel_CreateFolderReq, ZelMemory::Request<Zel_CreateFolderReq, ZelMemory::CreateFolderOp>>(callback, ZelMemory::CreateFolderOp::Args{parentMoniker, name});
}

boost::shared_ptr<Zel_CreateFolderUniqueReq> Zel_MemorySession::makeCreateFolderUniqueReqSP(MonikerSP parentMoniker, const QString& name, boost::shared_ptr<Zel_CreateFolderUniqueCB> callback)
{
    return make<Zel_CreateFolderUniqueReq, ZelMemory::Request<Zel_CreateFolderUniqueReq, ZelMemory::CreateFolderUniqueOp>>(callback, ZelMemory::CreateFolderUniqueOp::Args{parentMoniker, name});
}

boost::shared_ptr<Zel_CreateNodeUniqueReq> Zel_MemorySession::makeCreateNodeUniqueReqSP(MonikerSP parentMoniker, const QString& name, const Zel_PropertyList& properties, boost::shared_ptr<Zel_ResultCB> callback)
{
    return make<Zel_CreateNodeUniqueReq, ZelMemory::Request<Zel_CreateNodeUniqueReq, ZelMemory::CreateNodeUniqueOp>>(callback, ZelMemory::CreateNodeUniqueOp::Args{parentMoniker, name, properties});
}

boost::shared_ptr<Zel_CreatePropertyReq> Zel_MemorySession::makeCreatePropertyReqSP(MonikerSP moniker, const Zel_Property& property, boost::shared_ptr<Zel_CreatePropertyCB> callback)
{
    return make<Zel_CreatePropertyReq, ZelMemory::Request<Zel_CreatePropertyReq, ZelMemory::CreatePropertyOp>>(callback, ZelMemory::CreatePropertyOp::Args{moniker, property});
}

boost::shared_ptr<Zel_CreateReservationReq> Zel_MemorySession::makeCreateReservationReqSP(MonikerSP moniker, const QDateTime& expiry, boost::shared_ptr<Zel_CreateReservationCB> callback)
{
    return make<Zel_CreateReservationReq, ZelMemory::Request<Zel_CreateReservationReq, ZelMemory::CreateReservationOp>>(callback, ZelMemory::CreateReservationOp::Args{moniker, expiry});
}

boost::shared_ptr<Zel_DeleteFrameLocatorListReq> Zel_MemorySession::makeDeleteFrameLocatorListReqSP(MonikerSP moniker, const QList<Zel_FrameLocator>& locators, boost::shared_ptr<Zel_FrameLocatorListCB> callback)
{
    return make<Zel_DeleteFrameLocatorListReq, ZelMemory::Request<Zel_DeleteFrameLocatorListReq, ZelMemory::DeleteFrameLocatorListOp>>(callback, ZelMemory::DeleteFrameLocatorListOp::Args{moniker, locators});
}

boost::shared_ptr<Zel_DeleteFrameRestrictionListReq> Zel_MemorySession::makeDeleteFrameRestrictionListReqSP(MonikerSP moniker, const QList<Zel_FrameLocator>& restrictions, boost::shared_ptr<Zel_FrameRestrictionListCB> callback)
{
    return make<Zel_DeleteFrameRestrictionListReq, ZelMemory::Request<Zel_DeleteFrameRestrictionListReq, ZelMemory::DeleteFrameRestrictionListOp>>(callback, ZelMemory::DeleteFrameRestrictionListOp::Args{moniker, restrictions});
}

boost::shared_ptr<Zel_DeleteNodeReq> Zel_MemorySession::makeDeleteNodeReqSP(MonikerSP moniker, boost::shared_ptr<Zel_ResultBoolCB> callback)
{
    return make<Zel_DeleteNodeReq, ZelMemory::Request<Zel_DeleteNodeReq, ZelMemory::DeleteNodeOp>>(callback, ZelMemory::DeleteNodeOp::Args{moniker});
}

boost::shared_ptr<Zel_DeleteReq> Zel_MemorySession::makeDeleteReqSP(const QStringList& monikers, bool deleteRemoteMedia, bool deleteLocalMedia, boost::shared_ptr<Zel_DeleteCB> callback)
{
    return make<Zel_DeleteReq, ZelMemory::Request<Zel_DeleteReq, ZelMemory::DeleteOp>>(callback, ZelMemory::DeleteOp::Args{monikers, deleteRemoteMedia, deleteLocalMedia});
}

boost::shared_ptr<Zel_DirReq> Zel_MemorySession::makeDirReqSP(MonikerSP moniker, boost::shared_ptr<Zel_DirCB> callback)
{
    return make<Zel_DirReq, ZelMemory::Request<Zel_DirReq, ZelMemory::DirOp>>(callback, ZelMemory::DirOp::Args{moniker});
}

boost::shared_ptr<Zel_GetApplicationSettingsReq> Zel_MemorySession::makeGetApplicationSettingsReqSP(const QString& applicationName, boost::shared_ptr<Zel_GetApplicationSettingsCB> callback)
{
    return make<Zel_GetApplicationSettingsReq, ZelMemory::Request<Zel_GetApplicationSettingsReq, ZelMemory::GetApplicationSettingsOp>>(callback, ZelMemory::GetApplicationSettingsOp::Args{applicationName});
}

boost::shared_ptr<Zel_GetChildrenReq> Zel_MemorySession::makeGetChildrenReqSP(MonikerSP parentMoniker, boost::shared_ptr<Zel_ResultCB> callback)
{
    return make<Zel_GetChildrenReq, ZelMemory::Request<Zel_GetChildrenReq, ZelMemory::GetChildrenOp>>(callback, ZelMemory::GetChildrenOp::Args{parentMoniker});
}

boost::shared_ptr<Zel_GetFrameLocatorListReq> Zel_MemorySession::makeGetFrameLocatorListReqSP(MonikerSP moniker, boost::shared_ptr<Zel_FrameLocatorListCB> callback)
{
    return make<Zel_GetFrameLocatorListReq, ZelMemory::Request<Zel_GetFrameLocatorListReq, ZelMemory::GetFrameLocatorListOp>>(callback, ZelMemory::GetFrameLocatorListOp::Args{moniker});
}

boost::shared_ptr<Zel_GetFrameRestrictionListReq> Zel_MemorySession::makeGetFrameRestrictionListReqSP(MonikerSP moniker, boost::shared_ptr<Zel_FrameRestrictionListCB> callback)
{
    return make<Zel_GetFrameRestrictionListReq, ZelMemory::Request<Zel_GetFrameRestrictionListReq, ZelMemory::GetFrameRestrictionListOp>>(callback, ZelMemory::GetFrameRestrictionListOp::Args{moniker});
}

boost::shared_ptr<Zel_GetLinkedProjectsReq> Zel_MemorySession::makeGetLinkedProjectsReqSP(MonikerSP moniker, boost::shared_ptr<Zel_ResultCB> callback)
{
    return make<Zel_GetLinkedProjectsReq, ZelMemory::Request<Zel_GetLinkedProjectsReq, ZelMemory::GetLinkedProjectsOp>>(callback, ZelMemory::GetLinkedProjectsOp::Args{moniker});
}

boost::shared_ptr<Zel_GetNodeReq> Zel_MemorySession::makeGetNodeReqSP(MonikerSP moniker, boost::shared_ptr<Zel_ResultCB> callback)
{
    return make<Zel_GetNodeReq, ZelMemory::Request<Zel_GetNodeReq, ZelMemory::GetNodeOp>>(callback, ZelMemory::GetNodeOp::Args{moniker});
}

boost::shared_ptr<Zel_GetPropertiesReq> Zel_MemorySession::makeGetPropertiesReqSP(MonikerSP moniker, const QStringList& keys, boost::shared_ptr<Zel_PropertyListCB> callback)
{
    return make<Zel_GetPropertiesReq, ZelMemory::DirectRequest<Zel_GetPropertiesReq, ZelMemory::GetPropertiesOp>>(callback, ZelMemory::GetPropertiesOp::Args{moniker, keys});
}

boost::shared_ptr<Zel_GetReservationsReq> Zel_MemorySession::makeGetReservationsReqSP(MonikerSP moniker, boost::shared_ptr<Zel_GetReservationsCB> callback)
{
    return make<Zel_GetReservationsReq, ZelMemory::Request<Zel_GetReservationsReq, ZelMemory::GetReservationsOp>>(callback, ZelMemory::GetReservationsOp::Args{moniker});
}

boost::shared_ptr<Zel_GetSettingsReq> Zel_MemorySession::makeGetSettingsReqSP(const QString& settingsName, boost::shared_ptr<Zel_GetSettingsCB> callback)
{
    return make<Zel_GetSettingsReq, ZelMemory::Request<Zel_GetSettingsReq, ZelMemory::GetSettingsOp>>(callback, ZelMemory::GetSettingsOp::Args{settingsName});
}

boost::shared_ptr<Zel_GetSyncedProjRootReq> Zel_MemorySession::makeGetSyncedProjRootReqSP(MonikerSP moniker, boost::shared_ptr<Zel_ResultCB> callback)
{
    return make<Zel_GetSyncedProjRootReq, ZelMemory::Request<Zel_GetSyncedProjRootReq, ZelMemory::GetSyncedProjRootOp>>(callback, ZelMemory::GetSyncedProjRootOp::Args{moniker});
}

boost::shared_ptr<Zel_GetUserPriviledgesReq> Zel_MemorySession::makeGetUserPriviledgesReqSP(const QString& userName, MonikerSP moniker, boost::shared_ptr<Zel_NodePermissionsCB> callback)
{
    return make<Zel_GetUserPriviledgesReq, ZelMemory::Request<Zel_GetUserPriviledgesReq, ZelMemory::GetUserPriviledgesOp>>(callback, ZelMemory::GetUserPriviledgesOp::Args{userName, moniker});
}

boost::shared_ptr<Zel_GetUserSettingsReq> Zel_MemorySession::makeGetUserSettingsReqSP(Zel_GetUserSettingsCB::UserSettingsType settingsType, boost::shared_ptr<Zel_GetUserSettingsCB> callback)
{
    return make<Zel_GetUserSettingsReq, ZelMemory::Request<Zel_GetUserSettingsReq, ZelMemory::GetUserSettingsOp>>(callback, ZelMemory::GetUserSettingsOp::Args{settingsType});
}

boost::shared_ptr<Zel_GetWorkgroupSettingsReq> Zel_MemorySession::makeGetWorkgroupSettingsReqSP(boost::shared_ptr<Zel_SettingsCB> callback)
{
    return make<Zel_GetWorkgroupSettingsReq, ZelMemory::Request<Zel_GetWorkgroupSettingsReq, ZelMemory::GetWorkgroupSettingsOp>>(callback, ZelMemory::GetWorkgroupSettingsOp::Args{0});
}

boost::shared_ptr<Zel_LoginReq> Zel_MemorySession::makeLoginReqSP(const QString& userName, const QString& password, boost::shared_ptr<Zel_LoginCredentials> credentials, boost::shared_ptr<Zel_LoginCB> callback)
{
    return make<Zel_LoginReq, ZelMemory::DirectRequest<Zel_LoginReq, ZelMemory::LoginOp>>(callback, ZelMemory::LoginOp::Args{userName, password, credentials});
}

boost::shared_ptr<Zel_MediaResolutionsReq> Zel_MemorySession::makeMediaResolutionsReqSP(boost::shared_ptr<Zel_MediaResolutionsCB> callback)
{
    return make<Zel_MediaResolutionsReq, ZelMemory::Request<Zel_MediaResolutionsReq, ZelMemory::MediaResolutionsOp>>(callback, ZelMemory::MediaResolutionsOp::Args{0});
}

boost::shared_ptr<Zel_MobBinaryDnDReq> Zel_MemorySession::makeMobBinaryDnDReqSP(const Zel_MobIDList& mobs, boost::shared_ptr<Zel_MobBinaryDnDCB> callback)
{
    return make<Zel_MobBinaryDnDReq, ZelMemory::Request<Zel_MobBinaryDnDReq, ZelMemory::MobBinaryDnDOp>>(callback, ZelMemory::MobBinaryDnDOp::Args{mobs});
}

boost::shared_ptr<Zel_MobBinaryReq> Zel_MemorySession::makeMobBinaryReqSP(boost::shared_ptr<Zel_MobID> mob, boost::shared_ptr<Zel_MobBinaryCB> callback)
{
    return make<Zel_MobBinaryReq, ZelMemory::Request<Zel_MobBinaryReq, ZelMemory::MobBinaryOp>>(callback, ZelMemory::MobBinaryOp::Args{mob});
}

boost::shared_ptr<Zel_MobHeadframeReq> Zel_MemorySession::makeMobHeadframeReqSP(boost::shared_ptr<Zel_MobID> mob, boost::shared_ptr<Zel_MobHeadframeCB> callback)
{
    return make<Zel_MobHeadframeReq, ZelMemory::Request<Zel_MobHeadframeReq, ZelMemory::MobHeadframeOp>>(callback, ZelMemory::MobHeadframeOp::Args{mob});
}

boost::shared_ptr<Zel_MobNodeReq> Zel_MemorySession::makeMobNodeReqSP(boost::shared_ptr<Zel_MobID> mob, boost::shared_ptr<Zel_MobNodeCB> callback)
{
    return make<Zel_MobNodeReq, ZelMemory::Request<Zel_MobNodeReq, ZelMemory::MobNodeOp>>(callback, ZelMemory::MobNodeOp::Args{mob});
}

boost::shared_ptr<Zel_MonikerReq> Zel_MemorySession::makeMonikerReqSP(const Zel_Directory& path, boost::shared_ptr<Zel_MonikerCB> callback)
{
    return make<Zel_MonikerReq, ZelMemory::Request<Zel_MonikerReq, ZelMemory::MonikerOp>>(callback, ZelMemory::MonikerOp::Args{path});
}

boost::shared_ptr<Zel_MoveNodeReq> Zel_MemorySession::makeMoveNodeReqSP(MonikerSP moniker, MonikerSP destinationMoniker, boost::shared_ptr<Zel_MoveNodeCB> callback)
{
    return make<Zel_MoveNodeReq, ZelMemory::Request<Zel_MoveNodeReq, ZelMemory::MoveNodeOp>>(callback, ZelMemory::MoveNodeOp::Args{moniker, destinationMoniker});
}

boost::shared_ptr<Zel_NodePermissionsReq> Zel_MemorySession::makeNodePermissionsReqSP(MonikerSP moniker, boost::shared_ptr<Zel_NodePermissionsCB> callback)
{
    return make<Zel_NodePermissionsReq, ZelMemory::Request<Zel_NodePermissionsReq, ZelMemory::NodePermissionsOp>>(callback, ZelMemory::NodePermissionsOp::Args{moniker});
}

boost::shared_ptr<Zel_NodeReq> Zel_MemorySession::makeNodeReqSP(const Zel_Directory& path, boost::shared_ptr<Zel_NodeCB> callback)
{
    return make<Zel_NodeReq, ZelMemory::Request<Zel_NodeReq, ZelMemory::NodeOp>>(callback, ZelMemory::NodeOp::Args{path});
}

boost::shared_ptr<Zel_NodeResolutionsReq> Zel_MemorySession::makeNodeResolutionsReqSP(MonikerSP moniker, boost::shared_ptr<Zel_NodeResolutionsCB> callback)
{
    return make<Zel_NodeResolutionsReq, ZelMemory::Request<Zel_NodeResolutionsReq, ZelMemory::NodeResolutionsOp>>(callback, ZelMemory::NodeResolutionsOp::Args{moniker});
}

boost::shared_ptr<Zel_PropertyListReq> Zel_MemorySession::makePropertyListReqSP(MonikerSP moniker, boost::shared_ptr<Zel_PropertyListCB> callback)
{
    return make<Zel_PropertyListReq, ZelMemory::Request<Zel_PropertyListReq, ZelMemory::PropertyListOp>>(callback, ZelMemory::PropertyListOp::Args{moniker});
}

boost::shared_ptr<Zel_QueryReq> Zel_MemorySession::makeQueryReqSP(boost::shared_ptr<Zel_QuerySpec> query, boost::shared_ptr<Zel_QueryCB> callback)
{
    if (callback)
        callback->setQuerySpec(query);
    return make<Zel_QueryReq, ZelMemory::Request<Zel_QueryReq, ZelMemory::QueryOp>>(callback, ZelMemory::QueryOp::Args{query});
}

boost::shared_ptr<Zel_RefreshNodeReq> Zel_MemorySession::makeRefreshNodeReqSP(MonikerSP moniker, boost::shared_ptr<Zel_RefreshNodeCB> callback)
{
    return make<Zel_RefreshNodeReq, ZelMemory::Request<Zel_RefreshNodeReq, ZelMemory::RefreshNodeOp>>(callback, ZelMemory::RefreshNodeOp::Args{moniker});
}

boost::shared_ptr<Zel_RemoveReservationReq> Zel_MemorySession::makeRemoveReservationReqSP(MonikerSP moniker, boost::shared_ptr<Zel_RemoveReservationCB> callback)
{
    return make<Zel_RemoveReservationReq, ZelMemory::Request<Zel_RemoveReservationReq, ZelMemory::RemoveReservationOp>>(callback, ZelMemory::RemoveReservationOp::Args{moniker});
}

boost::shared_ptr<Zel_RenameNodeReq> Zel_MemorySession::makeRenameNodeReqSP(MonikerSP moniker, const QString& newName, boost::shared_ptr<Zel_RenameNodeCB> callback)
{
    return make<Zel_RenameNodeReq, ZelMemory::Request<Zel_RenameNodeReq, ZelMemory::RenameNodeOp>>(callback, ZelMemory::RenameNodeOp::Args{moniker, newName});
}

boost::shared_ptr<Zel_RenameUniqueReq> Zel_MemorySession::makeRenameUniqueReqSP(MonikerSP moniker, const QString& newName, boost::shared_ptr<Zel_RenameUniqueCB> callback)
{
    return make<Zel_RenameUniqueReq, ZelMemory::Request<Zel_RenameUniqueReq, ZelMemory::RenameUniqueOp>>(callback, ZelMemory::RenameUniqueOp::Args{moniker, newName});
}

boost::shared_ptr<Zel_RootNodeReq> Zel_MemorySession::makeRootNodeReqSP(boost::shared_ptr<Zel_RootNodeCB> callback)
{
    return make<Zel_RootNodeReq, ZelMemory::DirectRequest<Zel_RootNodeReq, ZelMemory::RootNodeOp>>(callback, ZelMemory::RootNodeOp::Args{0});
}

boost::shared_ptr<Zel_SaveSettingsReq> Zel_MemorySession::makeSaveSettingsReqSP(const QString& settingsName, const QString& settingsXml, boost::shared_ptr<Zel_SaveSettingsCB> callback)
{
    return make<Zel_SaveSettingsReq, ZelMemory::Request<Zel_SaveSettingsReq, ZelMemory::SaveSettingsOp>>(callback, ZelMemory::SaveSettingsOp::Args{settingsName, settingsXml});
}

boost::shared_ptr<Zel_SetApplicationSettingsReq> Zel_MemorySession::makeSetApplicationSettingsReqSP(const QString& applicationName, const QString& settingsXml, boost::shared_ptr<Zel_SetApplicationSettingsCB> callback)
{
    return make<Zel_SetApplicationSettingsReq, ZelMemory::Request<Zel_SetApplicationSettingsReq, ZelMemory::SetApplicationSettingsOp>>(callback, ZelMemory::SetApplicationSettingsOp::Args{applicationName, settingsXml});
}

boost::shared_ptr<Zel_SetPropertiesReq> Zel_MemorySession::makeSetPropertiesReqSP(MonikerSP moniker, const Zel_PropertyList& properties, boost::shared_ptr<Zel_SetPropertiesCB> callback)
{
    return make<Zel_SetPropertiesReq, ZelMemory::Request<Zel_SetPropertiesReq, ZelMemory::SetPropertiesOp>>(callback, ZelMemory::SetPropertiesOp::Args{moniker, properties, boost::dynamic_pointer_cast<Zel_ConditionalSetPropertiesCB>(callback) != nullptr});
}

boost::shared_ptr<Zel_SetUserSettingsReq> Zel_MemorySession::makeSetUserSettingsReqSP(Zel_GetUserSettingsCB::UserSettingsType settingsType, const QString& settingsXml, boost::shared_ptr<Zel_SetUserSettingsCB> callback)
{
    return make<Zel_SetUserSettingsReq, ZelMemory::Request<Zel_SetUserSettingsReq, ZelMemory::SetUserSettingsOp>>(callback, ZelMemory::SetUserSettingsOp::Args{settingsType, settingsXml});
}

boost::shared_ptr<Zel_StartupReq> Zel_MemorySession::makeStartupReqSP(boost::shared_ptr<Zel_StartupCB> callback)
{
    return make<Zel_StartupReq, ZelMemory::Request<Zel_StartupReq, ZelMemory::StartupOp>>(callback, ZelMemory::StartupOp::Args{0});
}
