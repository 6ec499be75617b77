// Internal: the records of the in-memory asset tree and the operations on them.
//
// The tree is a map of node records by node ID plus an index by moniker. One
// shared mutex guards all of it: read-only work holds it shared, changes hold
// it exclusively, each for a whole request, so a request sees and leaves a
// consistent tree. Changes are validated completely before the first record
// is touched, so a failing request changes nothing.
//
// Change reports (child added / removed / updated) are collected while the
// lock is held and numbered there; they are handed to the observers (the
// sessions' node listeners) after the lock is released, strictly in number
// order. Holding no tree lock while calling into the event hub keeps the hub's
// lock and the tree's lock from ever being waited for in opposite orders.
#ifndef MEMORY_TREE_P_H
#define MEMORY_TREE_P_H

#include <QDateTime>
#include <QHash>
#include <QList>
#include <QMap>
#include <QPair>
#include <QString>
#include <QStringList>

#include "Zel_MemoryLimits.h"
#include "Zel_PropertyKeyInfo.h"
#include "Zel_PropertyList.h"

#include <boost/shared_ptr.hpp>
#include <boost/weak_ptr.hpp>

#include <condition_variable>
#include <cstdint>
#include <functional>
#include <mutex>
#include <shared_mutex>
#include <unordered_map>
#include <vector>

class Zel_MemoryPropertyManager;

namespace ZelMemory {

// The server's limits (Zel_MemoryLimits.h), by their short names.
using Zel_MemoryLimits::MaxDepth;
using Zel_MemoryLimits::MaxNameLength;
using Zel_MemoryLimits::MaxSettingsCount;
using Zel_MemoryLimits::MaxSettingsKeyLength;
using Zel_MemoryLimits::MaxSettingsLevels;
using Zel_MemoryLimits::MaxSettingsSize;

// Monikers of this server: the scheme followed by the node's ID.
const QLatin1String MonikerScheme("zel-mem://");
inline QString monikerOfId(const QString& id)
{
    return MonikerScheme + id;
}

// The version of the tree file format that saveTree writes and loadTree reads.
const int TreeFileVersion = 1;

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
    // Held by someone and not yet expired.
    bool isActive() const { return !user.isEmpty() && (!until.isValid() || until > QDateTime::currentDateTimeUtc()); }
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
    QStringList children; // node IDs, in the order they were added
    // The same children by name (names are unique among siblings). Kept by
    // the tree's insertNode, attach, detach and rename.
    QHash<QString, QString> childByName;
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

// The hash of the node table. The IDs the server makes ("N" and a serial
// number, Tree::nextNodeId) hash to their number, so that nodes made one
// after another fall into neighbouring buckets: loading or building a large
// tree then walks the bucket table in order instead of at random. Any other
// text hashes as Qt hashes it.
struct NodeIdHash {
    std::size_t operator()(const QString& id) const
    {
        const int size = id.size();
        if (size >= 2 && size <= 20 && id.at(0) == QLatin1Char('N')) {
            std::size_t number = 0;
            int i = 1;
            for (; i < size; ++i) {
                const ushort unit = id.at(i).unicode();
                if (unit < '0' || unit > '9')
                    break;
                number = number * 10 + (unit - '0');
            }
            if (i == size)
                return number;
        }
        return qHash(id);
    }
};

// One change for the observers: a child of parentMoniker was added, removed
// or updated.
struct Change {
    enum Kind { Added, Removed, Updated };
    Kind kind;
    QString parentMoniker;
    QString childMoniker;
};

// Receives the changes of the tree, in order (a session's node listener).
class Observer
{
public:
    virtual ~Observer();
    virtual void treeChanged(const std::vector<Change>& changes) = 0;
};

class Tree
{
public:
    Tree();

    // --- The data; guarded by mutex. ---
    mutable std::shared_mutex mutex;
    QString serverName;
    std::unordered_map<QString, Node, NodeIdHash> nodes; // references stay valid on insertion
    // The nodes whose moniker is not the one made from their ID
    // (monikerOfId): moniker -> ID. Every other node is found by its
    // moniker through its ID (byMoniker), so a large tree of the server's own
    // monikers keeps no second table of them.
    QHash<QString, QString> idByGivenMoniker;
    QString rootId;
    QList<User> users;
    QList<KeyDesc> keys;
    QList<Resolution> resolutions;
    QMap<QString, SettingPairs> applicationSettings; // application -> settings
    QMap<QString, QMap<int, SettingPairs>> userSettings; // user -> settings type -> settings
    QMap<QString, QString> documents;                   // named settings documents (XML)
    SettingPairs workgroupSettings;
    QStringList linkedProjects; // monikers
    std::uint64_t serial = 0;  // for new node IDs

    // --- Lookups (lock held). ---
    Node* byId(const QString& id);
    const Node* byId(const QString& id) const;
    Node* byMoniker(const QString& moniker);
    const Node* byMoniker(const QString& moniker) const;
    const Node* parentOf(const Node& node) const;
    const User* user(const QString& name) const;
    const KeyDesc* key(const QString& key) const;
    // The node at a path of names below the root ("/Project/Bin"); null if none.
    const Node* byPath(const QString& path) const;
    // Names from below the root to the node itself.
    QStringList pathOf(const Node& node) const;
    // True when ancestor is node or lies above it.
    bool isSelfOrAncestor(const Node& ancestor, const Node& node) const;
    // The user's rights on the node: admins hold all; otherwise the nearest
    // node (this one, then upwards) with an entry for the user, or for "*",
    // decides (the user's own entry wins over "*" on the same node).
    std::uint32_t permissionsOf(const QString& user, const Node& node) const;
    // The same answer for a node whose parent's answer is known
    // (parentPermissions = permissionsOf(user, parent); 0 for the root),
    // without walking up: the node's own entry, or else its parent's answer.
    std::uint32_t permissionsBelow(const QString& user, const Node& node, std::uint32_t parentPermissions) const;
    // True when the node is a project that carries a synced project GUID.
    bool isSyncedProject(const Node& node) const;
    // The first node at (and, with below, under) node whose active
    // reservation is held by someone other than user.
    const Node* reservedByOther(const Node& node, const QString& user, bool below = true) const;
    // The child of parent named name (exact), or null.
    const Node* childNamed(const Node& parent, const QString& name) const;
    // The levels above node: 0 for the root.
    int depthOf(const Node& node) const;
    // The levels of the subtree below node: 0 when it has no children.
    int heightOf(const Node& node) const;
    // The node whose media object ID is mobId, or null.
    const Node* byMobId(const QString& mobId) const;
    // name, or "name 2", "name 3", ... whichever no child of parent has; the
    // name is shortened where the number would make it longer than the limit.
    QString uniqueChildName(const Node& parent, const QString& name) const;
    // The value of a stored property (Name and Mime Type included).
    QString propertyValue(const Node& node, const QString& key) const;

    // --- Changes (exclusive lock held). ---
    QString newNodeId();
    // The next serial node ID, whether a node has it or not (newNodeId skips
    // those in use).
    QString nextNodeId();
    QString newMobId();
    // Inserts a fresh node under parent at the end of its children.
    Node& insertNode(Node node, Node& parent);
    // Adds a fresh node to the tables without a parent (the root).
    Node& addNode(Node node);
    // Deep copy of source (and its subtree) under target, named name.
    Node& copySubtree(const Node& source, Node& target, const QString& name);
    // Removes node and its subtree; the node IDs removed are appended to removed.
    void removeSubtree(const QString& id, QStringList* removed);
    // Takes node out of its parent's children (it keeps its subtree).
    void detach(Node& node);
    // Puts a detached node at the end of parent's children.
    void attach(Node& node, Node& parent);
    // Renames node, keeping its parent's index of names current.
    void rename(Node& node, const QString& name);

    // --- Change reports. ---
    void addObserver(const boost::shared_ptr<Observer>& observer);
    void removeObserver(const Observer* observer);
    // Called with the exclusive lock held: numbers the batch.
    std::uint64_t takeTicket();
    // Called without the tree lock: waits for the batch's turn, hands it to
    // every observer, then lets the next batch go. Every ticket taken must be
    // published exactly once (an empty batch just passes its turn on).
    void publish(std::uint64_t ticket, const std::vector<Change>& changes);

    // The property manager that answers for this tree's keys (shared with the
    // sessions that register it).
    boost::shared_ptr<Zel_MemoryPropertyManager> propertyManager;

private:
    std::mutex mObserverMutex;
    std::vector<boost::weak_ptr<Observer>> mObservers;
    std::mutex mTicketMutex;
    std::condition_variable mTicketTurn;
    std::uint64_t mNextTicket = 0;
    std::uint64_t mServing = 0;
};

// A read (shared) or write (exclusive) hold on the tree for one request. A
// write hold collects changes; on release it numbers them, unlocks, and
// publishes them in order.
class ReadHold
{
public:
    explicit ReadHold(const Tree& tree) : mLock(tree.mutex) {}

private:
    std::shared_lock<std::shared_mutex> mLock;
};

class WriteHold
{
public:
    explicit WriteHold(Tree& tree);
    ~WriteHold();
    void added(const QString& parentMoniker, const QString& childMoniker);
    void removed(const QString& parentMoniker, const QString& childMoniker);
    void updated(const QString& parentMoniker, const QString& childMoniker);
    // Releases the lock and publishes the collected changes now.
    void release();

private:
    WriteHold(const WriteHold&) = delete;
    WriteHold& operator=(const WriteHold&) = delete;

    Tree& mTree;
    std::unique_lock<std::shared_mutex> mLock;
    std::vector<Change> mChanges;
    bool mReleased = false;
};

// The properties a node shows: Name, Mime Type, MobID (media only), the
// stored properties, and Locked By / Locked On while it is reserved.
Zel_PropertyList nodeProperties(const Tree& tree, const Node& node);

// Loading and saving (memory_json.cpp). load() answers false with a message
// that names the source and the position (line and column for syntax errors,
// the path of the offending value for everything else).
bool loadTree(Tree& tree, const QByteArray& json, const QString& sourceName, QString& error);
QByteArray saveTree(const Tree& tree);
// One node (and its subtree) in the form of the tree file.
QByteArray nodeJson(const Tree& tree, const Node& node);

} // namespace ZelMemory

#endif
