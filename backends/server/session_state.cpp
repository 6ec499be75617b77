#include "session_p.h"

#include "Zel_MemoryNode.h"

#include "Zel_EventCB.h"
#include "Zel_EventChildUpdated.h"
#include "Zel_EventRes.h"
#include "Zel_MimeTypeSpec.h"
#include "Zel_NodeListener.h"

#include <boost/make_shared.hpp>

#include <algorithm>

namespace ZelMemory {

namespace {


boost::shared_ptr<QString> shared(const QString& text)
{
    return boost::shared_ptr<QString>(new QString(text));
}

// The session's rule for names, as Zel_Session::isValidName states it: at
// least one word character (a letter, a digit, a mark or the underscore) and
// none of the illegal characters.
bool followsNameRule(const QString& name, const QString& illegalCharacters)
{
    bool hasWordCharacter = false;
    for (const QChar c : name) {
        if (c.isLetterOrNumber() || c.isMark() || c == QLatin1Char('_')) {
            hasWordCharacter = true;
            break;
        }
    }
    if (!hasWordCharacter)
        return false;
    for (const QChar c : illegalCharacters) {
        if (name.contains(c))
            return false;
    }
    return true;
}

} // namespace

void fail(Zel_MemoryErrorCodes::Code code, const QString& message)
{
    throw Failure{Zel_MemoryError::make(code, message)};
}

boost::shared_ptr<Zel_Error> internalError(const char* what)
{
    QString message = QStringLiteral("The server failed");
    if (what && *what)
        message += QStringLiteral(": ") + QString::fromUtf8(what);
    return Zel_MemoryError::make(Zel_MemoryErrorCodes::Internal, message + QLatin1Char('.'));
}

boost::shared_ptr<Zel_Error> cancelledError()
{
    return Zel_MemoryError::make(Zel_MemoryErrorCodes::Cancelled, QStringLiteral("The request was cancelled before it ran."));
}

void runFaultHook(const SessionState& session, const char* operationName)
{
    const boost::shared_ptr<const FaultHook> hook = session.faultHook();
    if (!hook || !*hook)
        return;
    // "GetNodeOp" answers the request class Zel_GetNodeReq.
    QString name = QString::fromLatin1(operationName);
    name.chop(2);
    (*hook)(QStringLiteral("Zel_") + name + QStringLiteral("Req"));
}

Cancelable::~Cancelable() = default;

// --- SessionObserver --------------------------------------------------------

SessionObserver::SessionObserver(const boost::shared_ptr<Zel_EventCB>& hub,
                                 const boost::shared_ptr<Orv_ResultQ>& resultQ,
                                 const boost::shared_ptr<SessionState>& session)
    : mHub(hub)
    , mResultQ(resultQ)
    , mSession(session)
    , mNodeListener(new Zel_NodeListener(hub, resultQ))
{
}

SessionObserver::~SessionObserver() = default;

void SessionObserver::treeChanged(const std::vector<Change>& changes)
{
    // Which changes the user may hear of: decided under one shared hold of
    // the tree for the whole batch, which is released before the hub is
    // called (the tree's lock is never held while waiting for the hub's).
    const QString user = mSession->user();
    if (user.isEmpty())
        return;
    std::vector<const Change*> readable;
    readable.reserve(changes.size());
    {
        const std::unique_ptr<ReadTxn> txn = mSession->store().beginRead();
        if (!txn->user(user))
            return;
        const bool admin = txn->user(user)->admin;
        const QString* lastParent = nullptr;
        bool lastReadable = false;
        for (const Change& change : changes) {
            if (!lastParent || *lastParent != change.parentMoniker) {
                const Node* parent = txn->nodeByMoniker(change.parentMoniker);
                lastReadable = parent ? (permissionsOf(*txn, user, *parent) & PermRead) != 0 : admin;
                lastParent = &change.parentMoniker;
            }
            if (lastReadable)
                readable.push_back(&change);
        }
        txn->commit();
    }
    for (const Change* readableChange : readable) {
        const Change& change = *readableChange;
        const boost::shared_ptr<QString> parent = shared(change.parentMoniker);
        const boost::shared_ptr<QString> child = shared(change.childMoniker);
        switch (change.kind) {
        case Change::Added:
            mNodeListener->NodeAdded(parent, child);
            break;
        case Change::Removed:
            mNodeListener->NodeRemoved(parent, child);
            break;
        case Change::Updated:
            // The node listener has no report for an updated child; the same
            // rule by hand: an event only when someone listens for the parent.
            if (mHub && mResultQ && mHub->hasRegisteredListener(parent)) {
                boost::shared_ptr<Zel_Event> event(new Zel_EventChildUpdated(parent, child));
                mResultQ->Push(boost::shared_ptr<Orv_Result>(new Zel_EventRes(mHub, event)));
            }
            break;
        }
    }
}

// --- SessionState -------------------------------------------------------------

QString SessionState::user() const
{
    std::lock_guard<std::mutex> lock(mMutex);
    return mUser;
}

void SessionState::setLogin(const QString& user, const QString& sessionID, const QDateTime& time)
{
    std::lock_guard<std::mutex> lock(mMutex);
    mUser = user;
    mSessionID = sessionID;
    mLoginTime = time;
}

void SessionState::clearLogin()
{
    std::lock_guard<std::mutex> lock(mMutex);
    mUser.clear();
    mSessionID.clear();
    mLoginTime = QDateTime();
}

QString SessionState::sessionID() const
{
    std::lock_guard<std::mutex> lock(mMutex);
    return mSessionID;
}

QDateTime SessionState::loginTime() const
{
    std::lock_guard<std::mutex> lock(mMutex);
    return mLoginTime;
}

void SessionState::setNameRules(const QString& illegalAssetCharacters, const QString& illegalPropertyCharacters)
{
    std::lock_guard<std::mutex> lock(mMutex);
    mIllegalAssetCharacters = illegalAssetCharacters;
    mIllegalPropertyCharacters = illegalPropertyCharacters;
}

void SessionState::requireOpen() const
{
    if (closed.load())
        fail(Zel_MemoryErrorCodes::NotConnected, QStringLiteral("The session is closed."));
}

bool SessionState::isValidAssetName(const QString& name) const
{
    requireOpen();
    return followsNameRule(name, illegalAssetCharacters());
}

bool SessionState::isValidPropertyName(const QString& name) const
{
    requireOpen();
    QString illegal;
    {
        std::lock_guard<std::mutex> lock(mMutex);
        illegal = mIllegalPropertyCharacters;
    }
    return followsNameRule(name, illegal);
}

QString SessionState::illegalAssetCharacters() const
{
    std::lock_guard<std::mutex> lock(mMutex);
    return mIllegalAssetCharacters;
}

boost::shared_ptr<const FaultHook> SessionState::faultHook() const
{
    return boost::atomic_load(&mFaultHook);
}

void SessionState::setFaultHook(const boost::shared_ptr<const FaultHook>& hook)
{
    boost::atomic_store(&mFaultHook, hook);
}

void SessionState::track(const boost::shared_ptr<Cancelable>& request)
{
    std::lock_guard<std::mutex> lock(mMutex);
    if (mRequests.size() >= mSweepAt) {
        mRequests.erase(std::remove_if(mRequests.begin(), mRequests.end(),
                                       [](const boost::weak_ptr<Cancelable>& weak) { return weak.expired(); }),
                        mRequests.end());
        // Twice what is left: a sweep costs at most as many steps as there
        // were requests made since the last one.
        mSweepAt = std::max(MinSweepSize, 2 * mRequests.size());
    }
    mRequests.push_back(request);
}

void SessionState::cancelAll()
{
    std::vector<boost::shared_ptr<Cancelable>> live;
    {
        std::lock_guard<std::mutex> lock(mMutex);
        for (const boost::weak_ptr<Cancelable>& weak : mRequests) {
            if (boost::shared_ptr<Cancelable> request = weak.lock())
                live.push_back(request);
        }
        mRequests.clear();
    }
    for (const boost::shared_ptr<Cancelable>& request : live)
        request->cancel();
}

// --- Work -----------------------------------------------------------------------

QString checkSession(const SessionState& session, bool needsLogin)
{
    if (session.closed.load())
        fail(Zel_MemoryErrorCodes::NotConnected, QStringLiteral("The session is closed."));
    if (!session.connected.load())
        fail(Zel_MemoryErrorCodes::NotConnected,
             QStringLiteral("The connection to the server is lost; the request was not carried out."));
    QString user = session.user();
    if (needsLogin && user.isEmpty())
        fail(Zel_MemoryErrorCodes::NotLoggedIn, QStringLiteral("Log in first: the request needs a user."));
    return user;
}

Work::Work(SessionState& s, ReadTxn& t, const QString& u)
    : session(s)
    , txn(t)
    , user(u)
{
}

WriteWork::WriteWork(SessionState& s, WriteTxn& t, const QString& u)
    : Work(s, t, u)
    , write(t)
{
}

QString Work::describe(const Node& n) const
{
    return QStringLiteral("\"%1\" (%2)").arg(n.name, n.moniker);
}

const Node& Work::node(const boost::shared_ptr<QString>& moniker)
{
    if (!moniker || moniker->isEmpty())
        fail(Zel_MemoryErrorCodes::InvalidArgument, QStringLiteral("No moniker was given."));
    const Node* found = txn.nodeByMoniker(*moniker);
    if (!found)
        fail(Zel_MemoryErrorCodes::UnknownMoniker, QStringLiteral("No node has the moniker \"%1\".").arg(*moniker));
    require(*found, PermRead, QStringLiteral("read"));
    return *found;
}

const Node& Work::nodeAtPath(const QStringList& names, bool rooted)
{
    Q_UNUSED(rooted); // paths are always taken from the root
    const Node* found = ZelMemory::nodeAtPath(txn, names);
    if (!found)
        fail(Zel_MemoryErrorCodes::UnknownMoniker,
             QStringLiteral("No node is at the path \"%1\".").arg(QLatin1Char('/') + names.join(QLatin1Char('/'))));
    require(*found, PermRead, QStringLiteral("read"));
    return *found;
}

const Node& Work::nodeOfMob(const QString& mobID)
{
    if (mobID.isEmpty())
        fail(Zel_MemoryErrorCodes::InvalidArgument, QStringLiteral("No media object ID was given."));
    const Node* found = txn.nodeByMobId(mobID);
    if (!found)
        fail(Zel_MemoryErrorCodes::NotFound, QStringLiteral("No media object has the ID \"%1\".").arg(mobID));
    require(*found, PermRead, QStringLiteral("read"));
    return *found;
}

std::uint32_t Work::permissions(const Node& n)
{
    return permissionsOf(txn, user, n);
}

void Work::require(const Node& n, std::uint32_t permission, const QString& action)
{
    if ((permissions(n) & permission) == permission)
        return;
    QStringList names = permissionNames(permission);
    fail(Zel_MemoryErrorCodes::PermissionDenied,
         QStringLiteral("User \"%1\" may not %2 %3 (missing permission: %4).")
             .arg(user, action, describe(n), names.join(QStringLiteral(", "))));
}

void Work::requireNotReservedByOther(const Node& n, const QString& action, bool below)
{
    const Node* reserved = reservedByOther(txn, n, user, below);
    if (!reserved)
        return;
    if (reserved->id == n.id)
        fail(Zel_MemoryErrorCodes::ReservedByOtherUser,
             QStringLiteral("Cannot %1 %2: it is reserved by \"%3\".").arg(action, describe(n), reserved->reservation.user));
    fail(Zel_MemoryErrorCodes::ReservedByOtherUser,
         QStringLiteral("Cannot %1 %2: %3 below it is reserved by \"%4\".")
             .arg(action, describe(n), describe(*reserved), reserved->reservation.user));
}

void Work::requireFolder(const Node& n)
{
    if (!Zel_MimeTypeSpec(Zel_MimeTypes_Containers).isType(n.mimeType))
        fail(Zel_MemoryErrorCodes::NotAFolder,
             QStringLiteral("%1 is a %2, not a folder.").arg(describe(n), n.mimeType));
}

void Work::requireMedia(const Node& n)
{
    if (!Zel_MimeTypeSpec(Zel_MimeTypes_Media).isType(n.mimeType))
        fail(Zel_MemoryErrorCodes::NotMedia, QStringLiteral("%1 is a %2, not a media asset.").arg(describe(n), n.mimeType));
}

void Work::requireAssetName(const QString& name)
{
    if (name.size() > MaxNameLength)
        fail(Zel_MemoryErrorCodes::InvalidName,
             QStringLiteral("The name \"%1...\" is longer than %2 characters.").arg(name.left(20)).arg(MaxNameLength));
    if (!session.isValidAssetName(name))
        fail(Zel_MemoryErrorCodes::InvalidName,
             QStringLiteral("The session rejects the name \"%1\": it needs a letter, digit or underscore and none of "
                            "the characters %2.")
                 .arg(name, session.illegalAssetCharacters()));
}

void Work::requireFreeName(const Node& parent, const QString& name, const Node* except)
{
    const Node* existing = txn.childNamed(parent, name);
    if (existing && (!except || existing->id != except->id))
        fail(Zel_MemoryErrorCodes::NameExists,
             QStringLiteral("%1 already holds a node named \"%2\".").arg(describe(parent), name));
}

boost::shared_ptr<Zel_Node> Work::snapshot(const Node& n)
{
    return snapshotOf(txn, n, user, session.storeRef);
}

boost::shared_ptr<Zel_Node> Work::snapshot(const Node& n, const SnapshotContext& context)
{
    return snapshotOf(txn, n, context, session.storeRef);
}

SnapshotContext childContext(ReadTxn& txn, const Node* parent, const QString& user)
{
    SnapshotContext context;
    context.parent = parent;
    context.account = txn.user(user);
    if (!parent)
        return context;
    context.path = pathOf(txn, *parent);
    for (const Node* p = parent; p && !context.syncedProject; p = parentOf(txn, *p))
        context.syncedProject = isSyncedProject(*p);
    context.permissions = permissionsOf(txn, user, *parent);
    return context;
}

boost::shared_ptr<Zel_Node> snapshotOf(ReadTxn& txn, const Node& n, const QString& user,
                                       const boost::shared_ptr<Store>& owner)
{
    return snapshotOf(txn, n, childContext(txn, parentOf(txn, n), user), owner);
}

boost::shared_ptr<Zel_Node> snapshotOf(ReadTxn& txn, const Node& n, const SnapshotContext& context,
                                       const boost::shared_ptr<Store>& owner)
{
    Zel_MemoryNode::Snapshot s;
    s.moniker = n.moniker;
    s.masterMoniker = n.masterMoniker;
    s.nodeID = n.id;
    if (context.parent) {
        s.parentNodeID = context.parent->id;
        s.path = context.path; // the root's own path is empty
        s.path.append(n.name);
    }
    s.childrenCount = static_cast<unsigned long>(txn.childCount(n));
    s.name = n.name;
    s.mimeType = n.mimeType;
    s.mobID = n.mobId;
    if (isReserved(txn, n.reservation)) { // an expired reservation holds nothing
        s.reservedBy = n.reservation.user;
        s.reservedSince = n.reservation.since;
        s.reservedUntil = n.reservation.until;
    }
    s.syncedProject = context.syncedProject || isSyncedProject(n);
    s.userPlaced = n.userPlaced;
    s.dropTarget = Zel_MimeTypeSpec(Zel_MimeTypes_Containers).isType(n.mimeType)
        && (permissionsBelow(context.account, n, context.permissions) & (PermAddFiles | PermAddFolders)) != 0;
    s.properties = nodeProperties(txn, n);
    return boost::make_shared<Zel_MemoryNode>(std::move(s), owner);
}

} // namespace ZelMemory
