// Internal: the in-memory store, the first store behind the server rules'
// storage interface (store_p.h).
//
// The tree is a map of node records by node ID plus an index by moniker. One
// shared mutex guards all of it: a read transaction holds it shared, a write
// transaction exclusively, each for a whole request, so a request sees and
// leaves a consistent tree. Changes are made in place; the rules validate a
// request completely before they touch the first record, so a failing request
// changes nothing.
//
// Change reports (child added / removed / updated) are collected while the
// lock is held and numbered there at commit; they are handed to the observers
// (the sessions' node listeners) after the lock is released, strictly in
// number order. Holding no tree lock while calling into the event hub keeps
// the hub's lock and the tree's lock from ever being waited for in opposite
// orders.
#ifndef MEMORY_TREE_P_H
#define MEMORY_TREE_P_H

#include "store_p.h"

#include <QByteArray>
#include <QHash>

#include <boost/weak_ptr.hpp>

#include <condition_variable>
#include <shared_mutex>
#include <unordered_map>

namespace ZelMemory {

// Monikers of this server: the scheme followed by the node's ID.
const QLatin1String MonikerScheme("zel-mem://");
inline QString monikerOfId(const QString& id)
{
    return MonikerScheme + id;
}

// The version of the tree file format that saveTree writes and loadTree reads.
const int TreeFileVersion = 1;

// A node record as the memory store keeps it: with its children, in order
// and by name.
struct StoredNode : Node {
    QStringList children; // node IDs, in the order they were added
    // The same children by name (names are unique among siblings). Kept by
    // the tree's insertNode, attach, detach and rename.
    QHash<QString, QString> childByName;
};

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

class Tree : public Store
{
public:
    Tree();
    ~Tree() override;

    // --- The data; guarded by mutex. ---
    mutable std::shared_mutex mutex;
    QString serverName;
    std::unordered_map<QString, StoredNode, NodeIdHash> nodes; // references stay valid on insertion
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
    StoredNode* byId(const QString& id);
    const StoredNode* byId(const QString& id) const;
    StoredNode* byMoniker(const QString& moniker);
    const StoredNode* byMoniker(const QString& moniker) const;
    const User* user(const QString& name) const;
    const KeyDesc* key(const QString& key) const;
    // The node at a path of names below the root ("/Project/Bin"); null if none.
    const StoredNode* byPath(const QString& path) const;

    // --- Changes (exclusive lock held). ---
    QString newNodeId();
    // The next serial node ID, whether a node has it or not (newNodeId skips
    // those in use).
    QString nextNodeId();
    // Inserts a fresh node under parent at the end of its children.
    StoredNode& insertNode(StoredNode node, StoredNode& parent);
    // Adds a fresh node to the tables without a parent (the root).
    StoredNode& addNode(StoredNode node);
    // Removes node and its subtree; answers the number of records removed.
    int removeSubtree(const QString& id);
    // A subtree taken out of the tables: its records, the top first, and
    // where the top was among its parent's children.
    struct Taken {
        QString parentId;
        int index = -1;
        std::vector<StoredNode> records;
    };
    Taken takeSubtree(const QString& id);
    // Puts a taken subtree back where it was.
    void restoreSubtree(Taken taken);
    // Takes node out of its parent's children (it keeps its subtree);
    // answers where it was among them (-1: nowhere).
    int detach(StoredNode& node);
    // Puts a detached node among parent's children at index (at the end for
    // -1).
    void attach(StoredNode& node, StoredNode& parent, int index = -1);
    // Renames node, keeping its parent's index of names current.
    void rename(StoredNode& node, const QString& name);

    // --- The store. ---
    std::unique_ptr<ReadTxn> beginRead() override;
    std::unique_ptr<WriteTxn> beginWrite() override;
    void addObserver(const boost::shared_ptr<Observer>& observer) override;
    void removeObserver(const Observer* observer) override;

    // Called with the exclusive lock held: numbers the batch.
    std::uint64_t takeTicket();
    // Called without the tree lock: waits for the batch's turn, hands it to
    // every observer, then lets the next batch go. Every ticket taken must be
    // published exactly once (an empty batch just passes its turn on).
    void publish(std::uint64_t ticket, const std::vector<Change>& changes);

private:
    std::mutex mObserverMutex;
    std::vector<boost::weak_ptr<Observer>> mObservers;
    std::mutex mTicketMutex;
    std::condition_variable mTicketTurn;
    std::uint64_t mNextTicket = 0;
    std::uint64_t mServing = 0;
};

// A shared hold on the tree, for the memory store's own readers
// (Zel_MemoryTree's accessors, saving); requests use transactions.
class ReadHold
{
public:
    explicit ReadHold(const Tree& tree) : mLock(tree.mutex) {}

private:
    std::shared_lock<std::shared_mutex> mLock;
};

// Loading and saving (memory_json.cpp). load() answers false with a message
// that names the source and the position (line and column for syntax errors,
// the path of the offending value for everything else).
bool loadTree(Tree& tree, const QByteArray& json, const QString& sourceName, QString& error);
QByteArray saveTree(const Tree& tree);

} // namespace ZelMemory

#endif
