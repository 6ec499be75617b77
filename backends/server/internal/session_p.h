// Internal: what the requests of a memory session share, and the one piece of
// plumbing every request goes through.
//
// SessionState is the session's data, shared by the session and by every
// request it made (a request may outlive its session). Work is the context of
// one request's work in its transaction (WriteWork: a write transaction): it
// offers the lookups and checks every operation needs, each of which throws a
// Failure carrying the error record. runOperation() checks the connection and
// the login, builds the operation's result, begins the transaction, runs the
// operation, commits, and, when anything throws, lets the transaction roll
// back and replaces whatever was collected by a fresh result holding only the
// failure: a Failure's own record, Internal for every other exception.
// Operations validate everything before they change the first record, so a
// failure leaves the store unchanged. A request
// that is cancelled, or whose work could not even answer, still answers with
// a failure and the end notice (makeCanceledResult), so that no callback
// waits for ever.
#ifndef ZEL_SERVER_SESSION_P_H
#define ZEL_SERVER_SESSION_P_H

#include "rules_p.h"
#include "Zel_MemoryError.h"
#include "Zel_MemoryErrorCodes.h"

#include "Zel_Req.h"
#include "Orv_Request.h"
#include "Orv_ResultQ.h"

#include <QDateTime>
#include <QString>
#include <boost/make_shared.hpp>
#include <boost/shared_ptr.hpp>
#include <boost/weak_ptr.hpp>

#include <atomic>
#include <exception>
#include <functional>
#include <memory>
#include <mutex>
#include <type_traits>
#include <vector>

class Orv_EngineHandle;
class Zel_MemoryTree;
class Zel_Store;
class Zel_EventCB;
class Zel_Node;
class Zel_NodeListener;

namespace ZelMemory {

struct Failure {
    boost::shared_ptr<Zel_Error> error;
};

[[noreturn]] void fail(Zel_MemoryErrorCodes::Code code, const QString& message);

// The record of an exception no rule foresees: Internal, naming what (when
// there is a text).
boost::shared_ptr<Zel_Error> internalError(const char* what);
// The record of a request cancelled before it ran.
boost::shared_ptr<Zel_Error> cancelledError();

// Called before each request's work with the request's class name; what it
// throws is answered like an exception of the work (Zel_MemorySession::setFaultHook).
typedef std::function<void(const QString& requestName)> FaultHook;

// A request that can be cancelled by its session.
class Cancelable
{
public:
    virtual ~Cancelable();
    virtual void cancel() = 0;
};

class SessionState;

// Hands the tree's changes to one session's listeners: added and removed
// children through a Zel_NodeListener, updated children as child-updated
// events under the same rule (only when someone listens for the parent).
// Only changes under a parent that the session's user may read are passed
// on (judged when the change is published; a session without a user hears
// nothing, and a parent that is gone by then counts as unreadable except for
// an administrator), so events never name nodes the user may not see.
class SessionObserver : public Observer
{
public:
    SessionObserver(const boost::shared_ptr<Zel_EventCB>& hub, const boost::shared_ptr<Orv_ResultQ>& resultQ,
                    const boost::shared_ptr<SessionState>& session);
    ~SessionObserver() override;
    void treeChanged(const std::vector<Change>& changes) override;

private:
    boost::shared_ptr<Zel_EventCB> mHub;
    boost::shared_ptr<Orv_ResultQ> mResultQ;
    boost::shared_ptr<SessionState> mSession;
    std::unique_ptr<Zel_NodeListener> mNodeListener;
};

class SessionState
{
public:
    boost::shared_ptr<Zel_MemoryTree> tree; // the session's tree, for the session's own accessors (memory stores)
    boost::shared_ptr<Zel_Store> opened;    // the opened store the session works on
    QString serverName;
    // The store of the session's records; the rules reach them only through it.
    boost::shared_ptr<Store> storeRef;
    Store& store() const { return *storeRef; }
    boost::shared_ptr<Orv_EngineHandle> engine; // refuses requests once the engine is gone
    boost::shared_ptr<Orv_ResultQ> resultQ;
    QString applicationName;
    std::atomic<bool> connected{true};
    std::atomic<bool> closed{false};

    // The logged-in user and the login's identity.
    QString user() const;
    void setLogin(const QString& user, const QString& sessionID, const QDateTime& time);
    void clearLogin();
    QString sessionID() const;
    QDateTime loginTime() const;

    // Names are checked by the session's rule (Zel_Session::isValidName)
    // against the illegal characters the session gave when it last made a
    // request (setNameRules): the work never calls into the session, which
    // may be going or gone while a request runs. Once the session is closed
    // the checks throw NotConnected.
    void setNameRules(const QString& illegalAssetCharacters, const QString& illegalPropertyCharacters);
    bool isValidAssetName(const QString& name) const;
    bool isValidPropertyName(const QString& name) const;
    QString illegalAssetCharacters() const;

    // The session's fault hook, if any (read on the workers, set by the application).
    boost::shared_ptr<const FaultHook> faultHook() const;
    void setFaultHook(const boost::shared_ptr<const FaultHook>& hook);

    // Keeps a weak reference to the request, for cancelAll(). The references
    // of requests that are gone are dropped whenever the list has doubled
    // since it was last swept, so that making a request costs the same with
    // any number of requests in flight.
    void track(const boost::shared_ptr<Cancelable>& request);
    void cancelAll();

private:
    void requireOpen() const;

    mutable std::mutex mMutex;
    QString mUser;
    QString mSessionID;
    QDateTime mLoginTime;
    QString mIllegalAssetCharacters;
    QString mIllegalPropertyCharacters;
    std::vector<boost::weak_ptr<Cancelable>> mRequests;
    std::size_t mSweepAt = MinSweepSize; // sweep when mRequests reaches this size
    static constexpr std::size_t MinSweepSize = 64;
    boost::shared_ptr<const FaultHook> mFaultHook; // boost::atomic_load / atomic_store
};

// What the snapshots of one parent's children have in common, worked out
// once: a folder's children are snapshotted without walking up the tree for
// each of them.
struct SnapshotContext {
    const Node* parent = nullptr;  // null for the root
    const User* account = nullptr; // the requesting user's record
    QStringList path;              // pathOf(parent)
    bool syncedProject = false;    // the parent lies at or below a synced project
    std::uint32_t permissions = 0; // permissionsOf(user, parent)
};
// The context of parent's children (parent null: of the root).
SnapshotContext childContext(ReadTxn& txn, const Node* parent, const QString& user);

// Checks that the session may make a request: throws NotConnected when the
// connection is down or the session closed, NotLoggedIn when the operation
// needs a user and none is logged in. Answers the logged-in user.
QString checkSession(const SessionState& session, bool needsLogin);

// The context of one request's work in a read transaction.
class Work
{
public:
    Work(SessionState& session, ReadTxn& txn, const QString& user);

    SessionState& session;
    ReadTxn& txn;
    QString user;

    // --- Lookups and checks. ---
    const Node& node(const boost::shared_ptr<QString>& moniker);
    const Node& nodeAtPath(const QStringList& names, bool rooted);
    const Node& nodeOfMob(const QString& mobID);
    // The user's rights on the node.
    std::uint32_t permissions(const Node& node);
    void require(const Node& node, std::uint32_t permission, const QString& action);
    void requireNotReservedByOther(const Node& node, const QString& action, bool below = true);
    void requireFolder(const Node& node);
    void requireMedia(const Node& node);
    void requireAssetName(const QString& name);
    void requireFreeName(const Node& parent, const QString& name, const Node* except = nullptr);
    QString describe(const Node& node) const; // "\"Footage\" (zel-mem://B-FOOTAGE)"

    // A snapshot of the node for the application.
    boost::shared_ptr<Zel_Node> snapshot(const Node& node);
    // The same for a child of the context's parent.
    boost::shared_ptr<Zel_Node> snapshot(const Node& node, const SnapshotContext& context);

    // Where the operation's answer keeps its snapshots to release them in the
    // order they were taken (ReleaseInOrder); null when it does not.
    std::vector<boost::shared_ptr<Zel_Node>>* releasedInOrder = nullptr;
};

// The context of one request's work in a write transaction.
class WriteWork : public Work
{
public:
    WriteWork(SessionState& session, WriteTxn& txn, const QString& user);

    WriteTxn& write;
};

// The deleter of a result whose operation answers many snapshots taken in one
// order and answered in another (a folder's children: taken in the order the
// records are stored, answered in node order). It keeps a second reference
// to each, in the order taken, and drops them after the result: the snapshots
// are then destroyed in the order they lie in memory, and the records' texts
// they share are released in the order the records lie in memory, rather
// than in node order, which in a large folder waits for memory at every step.
template <class Result>
struct ReleaseInOrder {
    std::vector<boost::shared_ptr<Zel_Node>> snapshots;
    void operator()(Result* result)
    {
        delete result;
        snapshots.clear(); // front to back
    }
};

// Operations whose results release their snapshots in order (ops_p.h).
template <class Op>
struct ReleasesInOrder : std::false_type {
};

// The snapshot of node that the requests of user answer with (owner: the
// store the snapshot reads its properties from afresh); context is that of
// node's parent.
boost::shared_ptr<Zel_Node> snapshotOf(ReadTxn& txn, const Node& node, const SnapshotContext& context,
                                       const boost::shared_ptr<Store>& owner);
// The same, working the context out.
boost::shared_ptr<Zel_Node> snapshotOf(ReadTxn& txn, const Node& node, const QString& user,
                                       const boost::shared_ptr<Store>& owner);

// A final result of the operation's result class holding only the failure.
template <class Op>
boost::shared_ptr<Orv_Result> failureResult(const boost::shared_ptr<typename Op::Callback>& callback,
                                            const boost::shared_ptr<Zel_Error>& error)
{
    const boost::shared_ptr<typename Op::Result> result = boost::make_shared<typename Op::Result>(callback, true);
    failInto(*result, error);
    return result;
}

// Runs the session's fault hook, if it has one, for the operation's request.
void runFaultHook(const SessionState& session, const char* operationName);

// Runs an operation into a new final result of its result class, in one
// transaction of the session's store. Every exception becomes a failure
// answer (the transaction then rolls back); only the unwinding that ends a
// thread (which carries no C++ exception object) goes on.
template <class Op>
boost::shared_ptr<Orv_Result> runOperation(SessionState& session, const boost::shared_ptr<typename Op::Callback>& callback,
                                           const typename Op::Args& args)
{
    typedef typename Op::Result Result;
    boost::shared_ptr<Zel_Error> error;
    try {
        boost::shared_ptr<Result> result;
        if constexpr (ReleasesInOrder<Op>::value)
            result.reset(new Result(callback, true), ReleaseInOrder<Result>());
        else
            result = boost::make_shared<Result>(callback, true);
        const QString user = checkSession(session, Op::NeedsLogin);
        runFaultHook(session, Op::OperationName);
        auto run = [&](typename Op::WorkType& work, ReadTxn& txn) {
            if constexpr (ReleasesInOrder<Op>::value)
                work.releasedInOrder = &boost::get_deleter<ReleaseInOrder<Result>>(result)->snapshots;
            Op::run(work, args, *result);
            txn.commit();
        };
        if constexpr (std::is_same<typename Op::WorkType, WriteWork>::value) {
            const std::unique_ptr<WriteTxn> txn = session.store().beginWrite();
            WriteWork work(session, *txn, user);
            run(work, *txn);
        } else {
            const std::unique_ptr<ReadTxn> txn = session.store().beginRead();
            Work work(session, *txn, user);
            run(work, *txn);
        }
        return result;
    } catch (const Failure& failure) {
        error = failure.error;
    } catch (const std::exception& e) {
        error = internalError(e.what());
    } catch (...) {
        if (!std::current_exception())
            throw;
        error = internalError(nullptr);
    }
    return failureResult<Op>(callback, error);
}

// A concrete request of the request class Base, doing Op's work.
template <class Base, class Op>
class Request : public Base, public Cancelable
{
public:
    Request(const boost::shared_ptr<typename Op::Callback>& callback, const boost::shared_ptr<SessionState>& session,
            const typename Op::Args& args)
        : Base(callback)
        , mCallback(callback)
        , mSession(session)
        , mArgs(args)
    {
    }

    bool doProcess(boost::shared_ptr<Orv_Result>& result) override
    {
        result = Op::execute(*mSession, mCallback, mArgs);
        return true;
    }
    void cancel() override { this->setCanceled(true); }

protected:
    // The engine's answer for a request it did not run, or whose process() threw.
    boost::shared_ptr<Orv_Result> makeCanceledResult() override
    {
        return Op::failure(mCallback, this->isCanceled() ? cancelledError() : internalError(nullptr));
    }

private:
    boost::shared_ptr<typename Op::Callback> mCallback;
    boost::shared_ptr<SessionState> mSession;
    typename Op::Args mArgs;
};

// The same for the three request classes on Orv_Request, which implement
// process themselves: run the work and push its result.
template <class Base, class Op>
class DirectRequest : public Base, public Cancelable
{
public:
    DirectRequest(const boost::shared_ptr<typename Op::Callback>& callback,
                  const boost::shared_ptr<SessionState>& session, const typename Op::Args& args)
        : Base(callback)
        , mCallback(callback)
        , mSession(session)
        , mArgs(args)
    {
    }

    bool process(boost::shared_ptr<Orv_ResultQ> resultQ) override
    {
        if (!resultQ)
            return false;
        const boost::shared_ptr<Orv_Result> result = Op::execute(*mSession, mCallback, mArgs);
        if (result)
            resultQ->Push(result);
        return true;
    }
    void cancel() override { this->setCanceled(true); }

protected:
    boost::shared_ptr<Orv_Result> makeCanceledResult() override
    {
        return Op::failure(mCallback, this->isCanceled() ? cancelledError() : internalError(nullptr));
    }

private:
    boost::shared_ptr<typename Op::Callback> mCallback;
    boost::shared_ptr<SessionState> mSession;
    typename Op::Args mArgs;
};

} // namespace ZelMemory

#endif
