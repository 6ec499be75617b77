#include "Zel_MemorySession.h"
#include "zel_version.h"

#include "ops_p.h"
#include "session_p.h"
#include "memory_tree_p.h"
#include "Zel_MemoryPropertyManager.h"
#include "Zel_MemoryTree.h"
#include "Zel_Store.h"

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

#include "zel_request_headers.h"

#include <boost/make_shared.hpp>

#include <iterator>
#include <mutex>
#include <vector>

namespace {

// The request classes this backend makes, by class name and by the name the
// request itself goes by ("Zel_Query" for Zel_QueryReq).
const char* const kRequestNames[] = {
#define ZEL_REQUEST(Stem, Base, Name, Params, ArgNames) "Zel_" #Stem "Req", Name,
#include "zel_requests.def"
#undef ZEL_REQUEST
};

// The concrete request of a catalogue class: its work runs from doProcess(),
// or, for the classes on Orv_Request, from process() directly.
template <class Req, class Op>
using ConcreteRequest = typename std::conditional<std::is_base_of<Zel_Req, Req>::value, ZelMemory::Request<Req, Op>,
                                                  ZelMemory::DirectRequest<Req, Op>>::type;

Zel_ResolutionIDList resolutionsOf(const boost::shared_ptr<ZelMemory::Store>& store)
{
    Zel_ResolutionIDList list;
    if (store) {
        const std::unique_ptr<ZelMemory::ReadTxn> txn = store->beginRead();
        for (const ZelMemory::Resolution& r : txn->resolutions())
            list.append(Zel_ResolutionID(r.label, r.id));
        txn->commit();
    }
    return list;
}

boost::shared_ptr<ZelMemory::Store> recordsOf(const boost::shared_ptr<Zel_MemoryTree>& tree)
{
    return tree ? boost::shared_ptr<ZelMemory::Store>(tree, &tree->data()) : boost::shared_ptr<ZelMemory::Store>();
}

boost::shared_ptr<ZelMemory::Store> recordsOf(const boost::shared_ptr<Zel_Store>& store)
{
    return store ? store->dataSP() : boost::shared_ptr<ZelMemory::Store>();
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
    : Zel_Session(resolutionsOf(recordsOf(tree)))
    , mState(new ZelMemory::SessionState)
{
    init(Zel_Store::ofTree(tree), engine, applicationName);
}

Zel_MemorySession::Zel_MemorySession(const boost::shared_ptr<Zel_Store>& store, Orv_Engine* engine,
                                     const QString& applicationName)
    : Zel_Session(resolutionsOf(recordsOf(store)))
    , mState(new ZelMemory::SessionState)
{
    init(store ? store : Zel_Store::ofTree(boost::shared_ptr<Zel_MemoryTree>()), engine, applicationName);
}

boost::shared_ptr<Zel_MemorySession> Zel_MemorySession::open(const QString& url, Orv_Engine* engine,
                                                             const QString& applicationName, QString* error)
{
    const boost::shared_ptr<Zel_Store> store = Zel_Store::open(url, error);
    if (!store)
        return boost::shared_ptr<Zel_MemorySession>();
    return boost::shared_ptr<Zel_MemorySession>(new Zel_MemorySession(store, engine, applicationName));
}

void Zel_MemorySession::init(const boost::shared_ptr<Zel_Store>& store, Orv_Engine* engine,
                             const QString& applicationName)
{
    mState->opened = store;
    mState->tree = store->memoryTree();
    mState->serverName = store->serverName();
    // The records, kept alive by the opened store.
    mState->storeRef = boost::shared_ptr<ZelMemory::Store>(store, store->dataSP().get());
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
    mState->store().addObserver(mObserver);
    mPropertyManager = mState->store().propertyManager;
    registerManager(mPropertyManager);
}

Zel_MemorySession::~Zel_MemorySession()
{
    // Requests that outlive the session fail with NotConnected from now on.
    mState->closed = true;
    mState->store().removeObserver(mObserver.get());
    unregisterManager(mPropertyManager);
}

// --- The connection and the session's state -----------------------------------

QString Zel_MemorySession::getServerName() const
{
    return mState->serverName;
}

QString Zel_MemorySession::getServerVersion() const
{
    return QStringLiteral("zel-memory " ZEL_VERSION_STRING);
}

QString Zel_MemorySession::getWorkgroupName() const
{
    const std::unique_ptr<ZelMemory::ReadTxn> txn = mState->store().beginRead();
    for (const auto& setting : txn->workgroupSettings()) {
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
    if (mState->tree)
        return MonikerSP(new QString(mState->tree->rootMoniker()));
    const std::unique_ptr<ZelMemory::ReadTxn> txn = mState->store().beginRead();
    const ZelMemory::Node* root = txn->root();
    return MonikerSP(new QString(root ? root->moniker : QString()));
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
    if (moniker.startsWith(ZelMemory::MonikerScheme) && moniker.size() > ZelMemory::MonikerScheme.size())
        return true;
    const std::unique_ptr<ZelMemory::ReadTxn> txn = mState->store().beginRead();
    return txn->nodeByMoniker(moniker) != nullptr;
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
    const std::unique_ptr<ZelMemory::ReadTxn> txn = mState->store().beginRead();
    const ZelMemory::Node* root = txn->root();
    const std::uint32_t writing = ZelMemory::PermAddFiles | ZelMemory::PermAddFolders | ZelMemory::PermWriteAttributes
        | ZelMemory::PermDeleteAssets;
    return user.isEmpty() || !root || (ZelMemory::permissionsOf(*txn, user, *root) & writing) == 0;
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

boost::shared_ptr<Zel_Store> Zel_MemorySession::getStoreSP() const
{
    return mState->opened;
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

void Zel_MemorySession::setFaultHook(std::function<void(const QString& requestName)> hook)
{
    mState->setFaultHook(hook ? boost::make_shared<const ZelMemory::FaultHook>(std::move(hook))
                              : boost::shared_ptr<const ZelMemory::FaultHook>());
}

// --- Request factories ------------------------------------------------------------

template <class Req, class Op>
boost::shared_ptr<Req> Zel_MemorySession::make(const boost::shared_ptr<typename Op::Callback>& callback,
                                               typename Op::Args args)
{
    if (mState->closed.load())
        return boost::shared_ptr<Req>();
    // The request's work checks names against the rules as they stand now,
    // taken here on the caller's thread: it never calls into the session.
    mState->setNameRules(illegalAssetNameCharacters(), illegalPropertyNameCharacters());
    ZelMemory::prepareOperation<Op>(callback, args);
    boost::shared_ptr<ConcreteRequest<Req, Op>> request(new ConcreteRequest<Req, Op>(callback, mState, args));
    mState->track(request);
    return request;
}

// The factories: the operation's arguments are the factory's parameters in
// order (ZelMemory::<Stem>Op::Args).
// Arguments past the factory's parameters are set by the operation's prepare().
#pragma GCC diagnostic push
#pragma GCC diagnostic ignored "-Wmissing-field-initializers"
#define ZEL_UNPAREN(...) __VA_ARGS__
#define ZEL_REQUEST(Stem, Base, Name, Params, ArgNames)                                                   \
    boost::shared_ptr<Zel_##Stem##Req> Zel_MemorySession::make##Stem##ReqSP Params                        \
    {                                                                                                     \
        return make<Zel_##Stem##Req, ZelMemory::Stem##Op>(callback,                                       \
                                                          ZelMemory::Stem##Op::Args{ZEL_UNPAREN ArgNames}); \
    }
#include "zel_requests.def"
#undef ZEL_REQUEST
#undef ZEL_UNPAREN
#pragma GCC diagnostic pop
