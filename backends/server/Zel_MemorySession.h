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

#include <functional>
#include <mutex>

class Orv_Engine;
class Zel_ConnectionListener;
class Zel_MemoryPropertyManager;
class Zel_MemoryTree;
class Zel_Store;

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
    // A session on an opened store (Zel_Store::open; the bundled sample when
    // store is empty), otherwise as above.
    Zel_MemorySession(const boost::shared_ptr<Zel_Store>& store, Orv_Engine* engine,
                      const QString& applicationName = QStringLiteral("zel"));
    // A session on the store the URL names (Zel_Store.h lists the forms:
    // memory:, memory:FILE.json, sqlite:PATH, postgresql://...); empty on
    // failure, with *error (when given) naming what was wrong.
    static boost::shared_ptr<Zel_MemorySession> open(const QString& url, Orv_Engine* engine,
                                                     const QString& applicationName = QStringLiteral("zel"),
                                                     QString* error = nullptr);
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
    // One factory per line of zel_requests.def.
#define ZEL_REQUEST(Stem, Base, Name, Params, ArgNames) \
    virtual boost::shared_ptr<Zel_##Stem##Req> make##Stem##ReqSP Params override;
#include "zel_requests.def"
#undef ZEL_REQUEST

    // Asset names may not contain / \\ : * ? " < > |
    virtual const QString illegalAssetNameCharacters() const override;

    virtual void close() override;

    // --- The in-memory backend's own -----------------------------------------

    // The tree this session works on; empty when its store is not kept in
    // memory.
    boost::shared_ptr<Zel_MemoryTree> getTreeSP() const;
    // The store this session works on.
    boost::shared_ptr<Zel_Store> getStoreSP() const;
    // The connection drops: requests fail with NotConnected and the status
    // callback hears disconnected(). Nothing happens when it is already down.
    void simulateConnectionLoss();
    // The connection is back: requests run again and the status callback
    // hears connected(). Nothing happens when it is up.
    void simulateReconnect();

    // For testing how an application copes with a failing server: hook is
    // called on the worker before the work of every request this session
    // makes, with the request's class name ("Zel_GetNodeReq"), after the
    // connection and login checks. An exception it throws is answered as any
    // unforeseen exception of the server is: the callback hears failed()
    // with Zel_MemoryErrorCodes::Internal (the message names the exception's
    // text) and then finished(). An empty hook removes it. Thread-safe.
    void setFaultHook(std::function<void(const QString& requestName)> hook);

private:
    Zel_MemorySession(const Zel_MemorySession&) = delete;
    Zel_MemorySession& operator=(const Zel_MemorySession&) = delete;

    void init(const boost::shared_ptr<Zel_Store>& store, Orv_Engine* engine, const QString& applicationName);

    template <class Req, class Op>
    boost::shared_ptr<Req> make(const boost::shared_ptr<typename Op::Callback>& callback, typename Op::Args args);

    boost::shared_ptr<ZelMemory::SessionState> mState;
    boost::shared_ptr<ZelMemory::SessionObserver> mObserver;
    boost::shared_ptr<Zel_MemoryPropertyManager> mPropertyManager;
    mutable std::mutex mStatusMutex;
    boost::shared_ptr<Zel_StatusNotificationCB> mStatusCB;
    boost::shared_ptr<Zel_ConnectionListener> mConnectionListener;
};

#endif
