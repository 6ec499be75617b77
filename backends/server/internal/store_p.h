// Internal: the storage interface of the backend's server rules.
//
// The rules of the requests (permissions, reservations, names, limits, which
// changes to announce) are written once against this interface; a store keeps
// the records (the in-memory tree today, databases later) and implements it.
//
// Transactions are the only way to the records:
// - A request runs in one transaction: a ReadTxn when it only reads, a
//   WriteTxn when it may change something. runOperation() begins it, runs the
//   operation and commits it after the operation returns; a transaction
//   destroyed without commit() rolls back (store destructors are noexcept).
// - Records are handed out as const references (or pointers, null when there
//   is none) that stay valid until the transaction ends; a removed subtree's
//   records end with removeSubtree(). A store may keep them in its own tables
//   (memory) or in an identity map of the records the transaction loaded.
// - Writes are explicit. edit(node) gives the record to change; the store
//   writes what was changed through it by the time the transaction commits.
//   An edited record's id, moniker, parentId and name are changed only
//   through insertNode, renameNode, moveNode and removeSubtree, which keep the
//   store's indexes (children in order, child by name) and constraints.
// - A transaction destroyed without commit() undoes every change it made
//   (the memory store keeps an undo log; a database rolls back). The rules
//   still validate a request completely before they change the first record,
//   so that an expected failure costs no undoing.
// - Per-item partial success (deleting several assets, updating several
//   media objects) takes a savepoint before each item and rolls back to it
//   when the item fails; the item's change reports and effects go with it.
// - Side effects happen only after commit: change reports (reportAdded, ...)
//   are published by the store to every observer in commit order; other
//   effects (login state, property-key registration, callback setters) are
//   registered with onCommit() and run once the data is committed, before
//   the change reports are handed out.
// - now() is the transaction's clock: the store's clock (settable, for tests
//   of reservation expiry), read when the transaction first asks and then
//   the same for its whole work.
#ifndef ZEL_SERVER_STORE_P_H
#define ZEL_SERVER_STORE_P_H

#include <QDateTime>
#include <QList>
#include <QMap>
#include <QPair>
#include <QString>
#include <QStringList>

#include "Zel_MemoryLimits.h"
#include "Zel_PropertyKeyInfo.h"

#include <boost/shared_ptr.hpp>

#include <algorithm>
#include <atomic>
#include <cstdint>
#include <exception>
#include <functional>
#include <memory>
#include <mutex>
#include <utility>
#include <vector>

class Zel_MemoryPropertyManager;

namespace ZelMemory {

class Store;

// The server's limits (Zel_MemoryLimits.h), by their short names.
using Zel_MemoryLimits::MaxDepth;
using Zel_MemoryLimits::MaxNameLength;
using Zel_MemoryLimits::MaxSettingsCount;
using Zel_MemoryLimits::MaxSettingsKeyLength;
using Zel_MemoryLimits::MaxSettingsLevels;
using Zel_MemoryLimits::MaxSettingsSize;

// The property key types this server defines. The library gives meaning only
// to the two resolution types; the others describe the values' form.
enum KeyType {
    KeyTypeText = 1,
    KeyTypeVideoResolution = 2,
    KeyTypeAudioResolution = 3,
    KeyTypeTimecode = 4,
    KeyTypeDate = 5,
    KeyTypeNumber = 6
};
inline bool isKnownKeyType(int type) { return type >= KeyTypeText && type <= KeyTypeNumber; }

// The thirty permission flags of Zel_NodePermissions, one bit each, in the
// order of that class.
enum Permission : std::uint32_t {
    PermOwner = 1u << 0,
    PermAdmin = 1u << 1,
    PermSendToPlayback = 1u << 2,
    PermReadAllLogs = 1u << 3,
    PermUseHighResolution = 1u << 4,
    PermUseLowResolution = 1u << 5,
    PermArchiveRestore = 1u << 6,
    PermUserAttributeManagement = 1u << 7,
    PermCanCreateColumns = 1u << 8,
    PermCanModifyColumns = 1u << 9,
    PermCanModifyPropertiesInAccess = 1u << 10,
    PermRead = 1u << 11,
    PermCopy = 1u << 12,
    PermAddFiles = 1u << 13,
    PermAddFolders = 1u << 14,
    PermWriteAttributes = 1u << 15,
    PermWriteUserAttributes = 1u << 16,
    PermWriteNewVersions = 1u << 17,
    PermCanWriteLocators = 1u << 18,
    PermCanWriteDRMs = 1u << 19,
    PermDeleteAssets = 1u << 20,
    PermDestroyAssets = 1u << 21,
    PermDestroyMedia = 1u << 22,
    PermReserve = 1u << 23,
    PermOverrideReservation = 1u << 24,
    PermPermissionsManagement = 1u << 25,
    PermCanCreateLocators = 1u << 26,
    PermCanModifyLocators = 1u << 27,
    PermCanCreateRestrictions = 1u << 28,
    PermCanModifyRestrictions = 1u << 29
};
const std::uint32_t AllPermissions = (1u << 30) - 1;
const int PermissionCount = 30;

// The name of a permission bit in tree files ("Read", "AddFolders", ...), the
// flag's name without its Is/Has prefix; index i names bit 1 << i.
const char* permissionName(int index);
// The bits of a name list; false (and the unknown name) when one is unknown.
// "All" stands for every permission.
bool permissionsFromNames(const QStringList& names, std::uint32_t& bits, QString& unknown);
QStringList permissionNames(std::uint32_t bits);

struct Property {
    QString key;
    QString value;
    QString customValues;
};

struct Reservation {
    QString user; // empty: not reserved
    QDateTime since;
    QDateTime until; // null: no end
    // Held by someone and not expired at the time now (a transaction's clock).
    bool isActiveAt(const QDateTime& now) const { return !user.isEmpty() && (!until.isValid() || until > now); }
};

// A frame locator or a frame restriction: an identifier and ordered properties.
struct Marker {
    QString id;
    QList<QPair<QString, QString>> properties;
};

struct Dependency {
    QString moniker;
    QString usage;
    int type = 0;
};

struct Media {
    QString path;       // the media file's path
    QString resolution; // the resolution identifier it is stored in
};

struct Node {
    QString id;
    QString moniker;
    QString parentId; // empty for the root
    QString name;
    QString mimeType;
    QString masterMoniker;
    QString mobId;
    QList<Property> properties; // server order; Name and Mime Type live above
    Reservation reservation;
    QMap<QString, std::uint32_t> permissions; // user (or "*") -> bits
    QList<Marker> locators;
    QList<Marker> restrictions;
    QList<Dependency> dependencies;
    QList<Media> media;
    bool userPlaced = true;
    QDateTime created;
    QDateTime modified;
};

struct User {
    QString name;
    QString password;
    QString fullName;
    bool admin = false;
};

struct KeyDesc {
    QString key;
    QString displayName;
    QString internalName;
    bool modifiable = true;
    bool available = true;
    int type = 1;
    bool textSearchable = true;
    bool hasCustomValues = false;
};

// The library's description of a key.
Zel_PropertyKeyInfo keyInfo(const KeyDesc& key);

struct Resolution {
    QString label;
    QString id;
    int type = 2; // 2 video, 3 audio (the two resolution key types)
};

typedef QList<QPair<QString, QString>> SettingPairs;

// The names of the user settings types in tree files ("general", "project",
// "site"), by Zel_GetUserSettingsCB::UserSettingsType value 0, 1, 2.
const char* userSettingsTypeName(int type);

// Everything a store holds besides its nodes, for copying a whole store.
struct ServerTables {
    QString serverName;
    QList<User> users;
    QList<KeyDesc> keys;
    QList<Resolution> resolutions;
    SettingPairs workgroupSettings;
    QMap<QString, SettingPairs> applicationSettings;          // application -> settings
    QMap<QString, QMap<int, SettingPairs>> userSettings;     // user -> settings type -> settings
    QMap<QString, QString> documents;                        // named settings documents (XML)
    QStringList linkedProjects;                              // monikers
};

// One change for the observers: a child of parentMoniker was added, removed
// or updated.
struct Change {
    enum Kind { Added, Removed, Updated };
    Kind kind;
    QString parentMoniker;
    QString childMoniker;
};

// Receives the committed changes of a store, in commit order (a session's
// node listener).
class Observer
{
public:
    virtual ~Observer() = default;
    virtual void treeChanged(const std::vector<Change>& changes) = 0;
};

// A read-only transaction.
class ReadTxn
{
public:
    virtual ~ReadTxn() = default;

    // The transaction's clock.
    inline const QDateTime& now() const;

    // --- Nodes. ---
    virtual const Node* root() = 0;
    virtual const Node* nodeById(const QString& id) = 0;
    virtual const Node* nodeByMoniker(const QString& moniker) = 0;
    // The node whose media object ID is mobId (not empty), or null.
    virtual const Node* nodeByMobId(const QString& mobId) = 0;
    // Calls visit with each child of parent, in the order they were added
    // (one pass: a large folder's records are visited where they lie).
    virtual void forEachChild(const Node& parent, const std::function<void(const Node&)>& visit) = 0;
    // Appends the children of parent to out, in the order they were added.
    void children(const Node& parent, std::vector<const Node*>& out)
    {
        out.reserve(out.size() + static_cast<std::size_t>(childCount(parent)));
        forEachChild(parent, [&out](const Node& child) { out.push_back(&child); });
    }
    virtual int childCount(const Node& node) = 0;
    // The child of parent named name (exact), or null.
    virtual const Node* childNamed(const Node& parent, const QString& name) = 0;
    // Appends every node to out, in no particular order (searches).
    virtual void allNodes(std::vector<const Node*>& out) = 0;

    // --- The server's tables. ---
    virtual const User* user(const QString& name) = 0;
    virtual const KeyDesc* key(const QString& key) = 0;
    virtual QList<Resolution> resolutions() = 0;
    virtual SettingPairs applicationSettings(const QString& application) = 0;
    // type: a Zel_GetUserSettingsCB::UserSettingsType value.
    virtual SettingPairs userSettings(const QString& user, int type) = 0;
    virtual SettingPairs workgroupSettings() = 0;
    // The named settings document; false when none is stored under name.
    virtual bool document(const QString& name, QString& xml) = 0;
    // The monikers of the linked projects.
    virtual QStringList linkedProjects() = 0;
    // Every table besides the nodes (copying a whole store).
    virtual ServerTables serverTables() = 0;

    // --- Ending. ---
    // Runs effect once the transaction has committed (never after a rollback).
    void onCommit(std::function<void()> effect) { mEffects.push_back(std::move(effect)); }
    // Commits: the store makes the work durable (or, for reading, ends it),
    // then the registered effects run in order, then the change reports go
    // out. A transaction is committed at most once; a failure to commit
    // throws and leaves it rolled back. An effect's exception is thrown once
    // the change reports are out (the data stays committed).
    inline void commit();
    bool isCommitted() const { return mCommitted; }

protected:
    explicit ReadTxn(const Store& store)
        : mStore(store)
    {
    }
    // The store's commit; throws on failure (the transaction then rolls back).
    virtual void commitData() = 0;
    std::size_t effectCount() const { return mEffects.size(); }
    void dropEffectsFrom(std::size_t count) { mEffects.resize(std::min(count, mEffects.size())); }
    // After the effects: a write transaction hands out its change reports.
    virtual void publishCommitted() {}

private:
    ReadTxn(const ReadTxn&) = delete;
    ReadTxn& operator=(const ReadTxn&) = delete;

    const Store& mStore;
    mutable QDateTime mNow; // read from the store's clock on first use
    mutable bool mHasNow = false;
    std::vector<std::function<void()>> mEffects;
    bool mCommitted = false;
};

// A transaction that may change the records.
class WriteTxn : public ReadTxn
{
public:
    // The record of node to change in place (node comes from this transaction).
    virtual Node& edit(const Node& node) = 0;
    // Inserts node at the end of parent's children. The store mints the new
    // node's ID and moniker (those of the argument are ignored) and sets its
    // parentId; the name must be free among parent's children.
    virtual const Node& insertNode(Node node, const Node& parent) = 0;
    // Renames node (the name must be free among its siblings).
    virtual void renameNode(const Node& node, const QString& name) = 0;
    // Moves node (with its subtree) to the end of parent's children.
    virtual void moveNode(const Node& node, const Node& parent) = 0;
    // Removes node and its subtree; answers how many records went.
    virtual int removeSubtree(const Node& node) = 0;
    virtual void insertKey(const KeyDesc& key) = 0;
    virtual void setApplicationSettings(const QString& application, const SettingPairs& settings) = 0;
    virtual void setUserSettings(const QString& user, int type, const SettingPairs& settings) = 0;
    virtual void setDocument(const QString& name, const QString& xml) = 0;

    // --- Copying a whole store (importing a tree file, exporting one). ---
    // Replaces every table besides the nodes.
    virtual void setServerTables(const ServerTables& tables) = 0;
    // Inserts a copy of node with its ID and moniker as they are, at the end
    // of parent's children, or as the root when parent is null (the store
    // then holds no root). Reports no change.
    virtual const Node& insertRecord(const Node& node, const Node* parent) = 0;
    // Removes every node and empties every table. Reports no change.
    virtual void removeEverything() = 0;

    // Change reports, published to the store's observers after commit, in
    // commit order; dropped on rollback.
    void reportAdded(const QString& parentMoniker, const QString& childMoniker)
    {
        mChanges.push_back(Change{Change::Added, parentMoniker, childMoniker});
    }
    void reportRemoved(const QString& parentMoniker, const QString& childMoniker)
    {
        mChanges.push_back(Change{Change::Removed, parentMoniker, childMoniker});
    }
    void reportUpdated(const QString& parentMoniker, const QString& childMoniker)
    {
        mChanges.push_back(Change{Change::Updated, parentMoniker, childMoniker});
    }

    // A point to roll back to without ending the transaction.
    struct Savepoint {
        int store;            // the store's own mark (setSavepoint)
        std::size_t changes;  // change reports before it
        std::size_t effects;  // effects before it
    };
    Savepoint savepoint() { return Savepoint{setSavepoint(), mChanges.size(), effectCount()}; }
    // Undoes every change, report and effect made since the savepoint; the
    // savepoint stays usable. Records removed and put back by the rollback
    // are new records: look them up again.
    void rollbackTo(const Savepoint& point)
    {
        rollbackToSavepoint(point.store);
        if (mChanges.size() > point.changes)
            mChanges.erase(mChanges.begin() + static_cast<std::ptrdiff_t>(point.changes), mChanges.end());
        dropEffectsFrom(point.effects);
    }

protected:
    explicit WriteTxn(const Store& store)
        : ReadTxn(store)
    {
    }
    // The store's part of savepoint() and rollbackTo().
    virtual int setSavepoint() = 0;
    virtual void rollbackToSavepoint(int mark) = 0;

    std::vector<Change> mChanges;
};

// A store of records: begins transactions and hands committed changes to
// its observers.
class Store
{
public:
    typedef std::function<QDateTime()> Clock;

    Store() = default;
    virtual ~Store() = default;

    virtual std::unique_ptr<ReadTxn> beginRead() = 0;
    virtual std::unique_ptr<WriteTxn> beginWrite() = 0;

    virtual void addObserver(const boost::shared_ptr<Observer>& observer) = 0;
    virtual void removeObserver(const Observer* observer) = 0;

    // The clock of new transactions: QDateTime::currentDateTimeUtc() unless
    // set (tests).
    void setClock(Clock clock)
    {
        std::lock_guard<std::mutex> lock(mClockMutex);
        mClock = std::move(clock);
        mClockSet.store(static_cast<bool>(mClock));
    }
    QDateTime now() const
    {
        if (mClockSet.load(std::memory_order_relaxed)) {
            std::lock_guard<std::mutex> lock(mClockMutex);
            if (mClock)
                return mClock();
        }
        return QDateTime::currentDateTimeUtc();
    }

    // The property manager that answers for this store's keys (shared with
    // the sessions that register it).
    boost::shared_ptr<Zel_MemoryPropertyManager> propertyManager;

private:
    mutable std::mutex mClockMutex;
    Clock mClock;
    std::atomic<bool> mClockSet{false}; // read without the lock on every transaction
};

// --- Inline parts that need Store complete ---------------------------------

const QDateTime& ReadTxn::now() const
{
    if (!mHasNow) {
        mNow = mStore.now();
        mHasNow = true;
    }
    return mNow;
}

void ReadTxn::commit()
{
    if (mCommitted)
        return;
    commitData();
    mCommitted = true;
    // The effects, then the change reports: an application that hears of a
    // change finds its effects (a registered property key, ...) in place.
    // An effect that throws stops neither the others nor the reports of what
    // is committed; the first exception is thrown on afterwards.
    const std::vector<std::function<void()>> effects = std::move(mEffects);
    mEffects.clear();
    std::exception_ptr failure;
    for (const std::function<void()>& effect : effects) {
        try {
            effect();
        } catch (...) {
            if (!std::current_exception())
                throw; // the unwinding that ends a thread goes on
            if (!failure)
                failure = std::current_exception();
        }
    }
    publishCommitted();
    if (failure)
        std::rethrow_exception(failure);
}

} // namespace ZelMemory

#endif
