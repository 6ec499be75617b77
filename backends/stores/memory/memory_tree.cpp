// The in-memory store: its tables, and its transactions over them.
#include "memory_tree_p.h"

#include <QSet>

#include <algorithm>
#include <memory>
#include <stdexcept>
#include <utility>

namespace ZelMemory {

Tree::Tree() = default;

Tree::~Tree() = default;

StoredNode* Tree::byId(const QString& id)
{
    auto it = nodes.find(id);
    return it == nodes.end() ? nullptr : &it->second;
}

const StoredNode* Tree::byId(const QString& id) const
{
    auto it = nodes.find(id);
    return it == nodes.end() ? nullptr : &it->second;
}

StoredNode* Tree::byMoniker(const QString& moniker)
{
    return const_cast<StoredNode*>(static_cast<const Tree*>(this)->byMoniker(moniker));
}

const StoredNode* Tree::byMoniker(const QString& moniker) const
{
    auto given = idByGivenMoniker.constFind(moniker);
    if (given != idByGivenMoniker.constEnd())
        return byId(given.value());
    // A moniker made from an ID names the node with that ID, unless that
    // node's moniker is another one.
    if (!moniker.startsWith(MonikerScheme))
        return nullptr;
    const StoredNode* node = byId(moniker.mid(MonikerScheme.size()));
    return node && node->moniker == moniker ? node : nullptr;
}

const User* Tree::user(const QString& name) const
{
    for (const User& u : users) {
        if (u.name == name)
            return &u;
    }
    return nullptr;
}

const KeyDesc* Tree::key(const QString& name) const
{
    for (const KeyDesc& k : keys) {
        if (k.key == name)
            return &k;
    }
    return nullptr;
}

const StoredNode* Tree::byPath(const QString& path) const
{
    const StoredNode* node = byId(rootId);
    const QStringList parts = path.split(QLatin1Char('/'), Qt::SkipEmptyParts);
    for (const QString& part : parts) {
        if (!node)
            return nullptr;
        auto it = node->childByName.constFind(part);
        node = it == node->childByName.constEnd() ? nullptr : byId(it.value());
    }
    return node;
}

QString Tree::nextNodeId()
{
    // "N" and the serial number, at least six digits with leading zeros.
    char digits[24];
    int start = sizeof digits;
    for (std::uint64_t n = ++serial; n > 0 || sizeof digits - start < 6; n /= 10)
        digits[--start] = static_cast<char>('0' + n % 10);
    digits[--start] = 'N';
    return QString::fromLatin1(digits + start, static_cast<int>(sizeof digits) - start);
}

QString Tree::newNodeId()
{
    for (;;) {
        const QString id = nextNodeId();
        if (!byId(id) && !byMoniker(monikerOfId(id)))
            return id;
    }
}

StoredNode& Tree::insertNode(StoredNode node, StoredNode& parent)
{
    StoredNode& stored = addNode(std::move(node));
    attach(stored, parent);
    return stored;
}

StoredNode& Tree::addNode(StoredNode node)
{
    if (node.moniker != monikerOfId(node.id))
        idByGivenMoniker.insert(node.moniker, node.id);
    const QString id = node.id;
    return nodes.emplace(id, std::move(node)).first->second;
}

int Tree::removeSubtree(const QString& id)
{
    return static_cast<int>(takeSubtree(id).records.size());
}

Tree::Taken Tree::takeSubtree(const QString& id)
{
    Taken taken;
    StoredNode* top = byId(id);
    if (!top)
        return taken;
    // Only the top leaves its parent's lists; the records below go with it.
    taken.parentId = top->parentId;
    taken.index = detach(*top);
    QStringList subtree{id};
    for (int i = 0; i < subtree.size(); ++i) {
        if (const StoredNode* node = byId(subtree.at(i)))
            subtree.append(node->children);
    }
    taken.records.reserve(static_cast<std::size_t>(subtree.size()));
    for (const QString& recordId : subtree) {
        auto it = nodes.find(recordId);
        if (it == nodes.end())
            continue;
        idByGivenMoniker.remove(it->second.moniker);
        taken.records.push_back(std::move(it->second));
        nodes.erase(it);
    }
    return taken;
}

void Tree::restoreSubtree(Taken taken)
{
    if (taken.records.empty())
        return;
    const QString topId = taken.records.front().id;
    for (StoredNode& record : taken.records)
        addNode(std::move(record));
    StoredNode* top = byId(topId);
    if (StoredNode* parent = byId(taken.parentId))
        attach(*top, *parent, taken.index);
}

int Tree::detach(StoredNode& node)
{
    int index = -1;
    if (StoredNode* parent = byId(node.parentId)) {
        index = parent->children.indexOf(node.id);
        if (index >= 0)
            parent->children.removeAt(index);
        auto it = parent->childByName.find(node.name);
        if (it != parent->childByName.end() && it.value() == node.id)
            parent->childByName.erase(it);
    }
    node.parentId.clear();
    return index;
}

void Tree::attach(StoredNode& node, StoredNode& parent, int index)
{
    node.parentId = parent.id;
    if (index < 0 || index > parent.children.size())
        parent.children.append(node.id);
    else
        parent.children.insert(index, node.id);
    parent.childByName.insert(node.name, node.id);
}

void Tree::rename(StoredNode& node, const QString& name)
{
    if (StoredNode* parent = byId(node.parentId)) {
        auto it = parent->childByName.find(node.name);
        if (it != parent->childByName.end() && it.value() == node.id)
            parent->childByName.erase(it);
        parent->childByName.insert(name, node.id);
    }
    node.name = name;
}

void Tree::addObserver(const boost::shared_ptr<Observer>& observer)
{
    std::lock_guard<std::mutex> lock(mObserverMutex);
    mObservers.push_back(observer);
}

void Tree::removeObserver(const Observer* observer)
{
    std::lock_guard<std::mutex> lock(mObserverMutex);
    for (auto it = mObservers.begin(); it != mObservers.end();) {
        boost::shared_ptr<Observer> held = it->lock();
        if (!held || held.get() == observer)
            it = mObservers.erase(it);
        else
            ++it;
    }
}

std::uint64_t Tree::takeTicket()
{
    std::lock_guard<std::mutex> lock(mTicketMutex);
    return mNextTicket++;
}

void Tree::publish(std::uint64_t ticket, const std::vector<Change>& changes)
{
    std::unique_lock<std::mutex> turn(mTicketMutex);
    mTicketTurn.wait(turn, [&] { return mServing == ticket; });
    turn.unlock();

    std::vector<boost::shared_ptr<Observer>> observers;
    {
        std::lock_guard<std::mutex> lock(mObserverMutex);
        for (const boost::weak_ptr<Observer>& weak : mObservers) {
            if (boost::shared_ptr<Observer> held = weak.lock())
                observers.push_back(held);
        }
    }
    struct PassTurn {
        Tree* tree;
        ~PassTurn()
        {
            {
                std::lock_guard<std::mutex> lock(tree->mTicketMutex);
                ++tree->mServing;
            }
            tree->mTicketTurn.notify_all();
        }
    } passTurn{this};
    if (!changes.empty()) {
        for (const boost::shared_ptr<Observer>& observer : observers)
            observer->treeChanged(changes);
    }
}


// --- Transactions -----------------------------------------------------------------

namespace {

// The records of a node handed out by this store are StoredNodes in the
// node table, which the holder of the exclusive lock may change.
const StoredNode& stored(const Node& node)
{
    return static_cast<const StoredNode&>(node);
}
StoredNode& mutableStored(const Node& node)
{
    return const_cast<StoredNode&>(stored(node));
}

// The primitives of both kinds of transaction, read from the tables while
// the transaction holds the tree's lock (Lock: shared or exclusive).
template <class Base, class Lock>
class MemoryTxn : public Base
{
public:
    explicit MemoryTxn(Tree& tree)
        : Base(tree)
        , mTree(tree)
        , mLock(tree.mutex)
    {
    }

    const Node* root() override { return mTree.byId(mTree.rootId); }
    const Node* nodeById(const QString& id) override { return mTree.byId(id); }
    const Node* nodeByMoniker(const QString& moniker) override { return mTree.byMoniker(moniker); }
    const Node* nodeByMobId(const QString& mobId) override
    {
        // No index: media object IDs are looked up rarely (check-in, drag
        // and drop), and a scan keeps loading lean.
        if (mobId.isEmpty())
            return nullptr;
        for (const auto& entry : mTree.nodes) {
            if (entry.second.mobId == mobId)
                return &entry.second;
        }
        return nullptr;
    }
    void forEachChild(const Node& parent, const std::function<void(const Node&)>& visit) override
    {
        for (const QString& id : stored(parent).children) {
            if (const StoredNode* child = mTree.byId(id))
                visit(*child);
        }
    }
    int childCount(const Node& node) override { return stored(node).children.size(); }
    const Node* childNamed(const Node& parent, const QString& name) override
    {
        const QHash<QString, QString>& byName = stored(parent).childByName;
        auto it = byName.constFind(name);
        return it == byName.constEnd() ? nullptr : mTree.byId(it.value());
    }
    void allNodes(std::vector<const Node*>& out) override
    {
        out.reserve(out.size() + mTree.nodes.size());
        for (const auto& entry : mTree.nodes)
            out.push_back(&entry.second);
    }

    const User* user(const QString& name) override { return mTree.user(name); }
    const KeyDesc* key(const QString& name) override { return mTree.key(name); }
    QList<Resolution> resolutions() override { return mTree.resolutions; }
    SettingPairs applicationSettings(const QString& application) override
    {
        return mTree.applicationSettings.value(application);
    }
    SettingPairs userSettings(const QString& user, int type) override
    {
        return mTree.userSettings.value(user).value(type);
    }
    SettingPairs workgroupSettings() override { return mTree.workgroupSettings; }
    bool document(const QString& name, QString& xml) override
    {
        auto it = mTree.documents.constFind(name);
        if (it == mTree.documents.constEnd())
            return false;
        xml = it.value();
        return true;
    }
    QStringList linkedProjects() override { return mTree.linkedProjects; }
    ServerTables serverTables() override
    {
        ServerTables tables;
        tables.serverName = mTree.serverName;
        tables.users = mTree.users;
        tables.keys = mTree.keys;
        tables.resolutions = mTree.resolutions;
        tables.workgroupSettings = mTree.workgroupSettings;
        tables.applicationSettings = mTree.applicationSettings;
        tables.userSettings = mTree.userSettings;
        tables.documents = mTree.documents;
        tables.linkedProjects = mTree.linkedProjects;
        return tables;
    }

protected:
    Tree& mTree;
    Lock mLock;
};

class MemoryReadTxn final : public MemoryTxn<ReadTxn, std::shared_lock<std::shared_mutex>>
{
public:
    using MemoryTxn::MemoryTxn;

protected:
    void commitData() override { mLock.unlock(); }
};

// Changes are made in place, each with its undo step in a log: a rollback
// (to a savepoint, or of the whole transaction when it ends without commit)
// runs the steps back, newest first. An edited record's former state is kept
// once per transaction (until a rollback undoes that edit).
class MemoryWriteTxn final : public MemoryTxn<WriteTxn, std::unique_lock<std::shared_mutex>>
{
public:
    using MemoryTxn::MemoryTxn;

    ~MemoryWriteTxn() override
    {
        if (!isCommitted())
            undoTo(0);
        // A ticket taken is published exactly once, or every later batch
        // would wait for it for ever.
        if (mHasTicket && !mPublished) {
            try {
                mTree.publish(mTicket, std::vector<Change>());
            } catch (...) {
            }
        }
    }

    Node& edit(const Node& node) override
    {
        StoredNode& record = mutableStored(node);
        if (!mEdited.contains(record.id)) {
            mEdited.insert(record.id);
            const QString id = record.id;
            const Node before = record;
            mUndo.push_back([this, id, before] {
                if (StoredNode* current = mTree.byId(id))
                    static_cast<Node&>(*current) = before;
                mEdited.remove(id);
            });
        }
        return record;
    }
    const Node& insertNode(Node node, const Node& parent) override
    {
        const std::uint64_t serialBefore = mTree.serial;
        StoredNode record;
        static_cast<Node&>(record) = std::move(node);
        record.id = mTree.newNodeId();
        record.moniker = monikerOfId(record.id);
        StoredNode& inserted = mTree.insertNode(std::move(record), mutableStored(parent));
        const QString id = inserted.id;
        mUndo.push_back([this, id, serialBefore] {
            mTree.removeSubtree(id);
            mTree.serial = serialBefore;
        });
        return inserted;
    }
    void renameNode(const Node& node, const QString& name) override
    {
        StoredNode& record = mutableStored(node);
        const QString id = record.id;
        const QString before = record.name;
        mTree.rename(record, name);
        mUndo.push_back([this, id, before] {
            if (StoredNode* current = mTree.byId(id))
                mTree.rename(*current, before);
        });
    }
    void moveNode(const Node& node, const Node& parent) override
    {
        StoredNode& record = mutableStored(node);
        const QString id = record.id;
        const QString parentBefore = record.parentId;
        const int index = mTree.detach(record);
        mTree.attach(record, mutableStored(parent));
        mUndo.push_back([this, id, parentBefore, index] {
            StoredNode* current = mTree.byId(id);
            StoredNode* oldParent = mTree.byId(parentBefore);
            if (!current || !oldParent)
                return;
            mTree.detach(*current);
            mTree.attach(*current, *oldParent, index);
        });
    }
    int removeSubtree(const Node& node) override
    {
        auto taken = std::make_shared<Tree::Taken>(mTree.takeSubtree(node.id));
        const int count = static_cast<int>(taken->records.size());
        mUndo.push_back([this, taken] { mTree.restoreSubtree(std::move(*taken)); });
        return count;
    }
    void insertKey(const KeyDesc& key) override
    {
        mTree.keys.append(key);
        mUndo.push_back([this] { mTree.keys.removeLast(); });
    }
    void setApplicationSettings(const QString& application, const SettingPairs& settings) override
    {
        auto& table = mTree.applicationSettings;
        keepEntry(table, application);
        table.insert(application, settings);
    }
    void setUserSettings(const QString& user, int type, const SettingPairs& settings) override
    {
        const bool hadUser = mTree.userSettings.contains(user);
        auto& types = mTree.userSettings[user];
        const bool hadType = types.contains(type);
        const SettingPairs before = types.value(type);
        types.insert(type, settings);
        mUndo.push_back([this, user, type, hadUser, hadType, before] {
            if (!hadUser) {
                mTree.userSettings.remove(user);
                return;
            }
            auto& current = mTree.userSettings[user];
            if (hadType)
                current.insert(type, before);
            else
                current.remove(type);
        });
    }
    void setDocument(const QString& name, const QString& xml) override
    {
        keepEntry(mTree.documents, name);
        mTree.documents.insert(name, xml);
    }

    void setServerTables(const ServerTables& tables) override
    {
        const ServerTables before = serverTables();
        assignTables(tables);
        mUndo.push_back([this, before] { assignTables(before); });
    }
    const Node& insertRecord(const Node& node, const Node* parent) override
    {
        StoredNode record;
        static_cast<Node&>(record) = node;
        record.parentId.clear();
        const QString id = record.id;
        if (!parent) {
            if (!mTree.rootId.isEmpty())
                throw std::logic_error("insertRecord: the store already holds a root");
            StoredNode& inserted = mTree.addNode(std::move(record));
            mTree.rootId = id;
            mUndo.push_back([this, id] {
                mTree.removeSubtree(id);
                mTree.rootId.clear();
            });
            return inserted;
        }
        if (mTree.byId(id))
            throw std::logic_error("insertRecord: a node with this ID is stored already");
        StoredNode& inserted = mTree.insertNode(std::move(record), mutableStored(*parent));
        mUndo.push_back([this, id] { mTree.removeSubtree(id); });
        return inserted;
    }
    void removeEverything() override
    {
        struct Everything {
            ServerTables tables;
            std::unordered_map<QString, StoredNode, NodeIdHash> nodes;
            QHash<QString, QString> idByGivenMoniker;
            QString rootId;
            std::uint64_t serial;
        };
        auto kept = std::make_shared<Everything>();
        kept->tables = serverTables();
        kept->nodes.swap(mTree.nodes);
        kept->idByGivenMoniker.swap(mTree.idByGivenMoniker);
        kept->rootId = mTree.rootId;
        kept->serial = mTree.serial;
        mTree.rootId.clear();
        assignTables(ServerTables());
        mEdited.clear();
        mUndo.push_back([this, kept] {
            assignTables(kept->tables);
            mTree.nodes.swap(kept->nodes);
            mTree.idByGivenMoniker.swap(kept->idByGivenMoniker);
            mTree.rootId = kept->rootId;
            mTree.serial = kept->serial;
        });
    }

protected:
    void commitData() override
    {
        if (!mChanges.empty()) {
            mTicket = mTree.takeTicket();
            mHasTicket = true;
        }
        mUndo.clear();
        mLock.unlock();
    }
    void publishCommitted() override
    {
        if (!mHasTicket)
            return;
        mPublished = true;
        mTree.publish(mTicket, mChanges);
    }
    int setSavepoint() override { return static_cast<int>(mUndo.size()); }
    void rollbackToSavepoint(int mark) override { undoTo(static_cast<std::size_t>(mark)); }

private:
    void assignTables(const ServerTables& tables)
    {
        mTree.serverName = tables.serverName;
        mTree.users = tables.users;
        mTree.keys = tables.keys;
        mTree.resolutions = tables.resolutions;
        mTree.workgroupSettings = tables.workgroupSettings;
        mTree.applicationSettings = tables.applicationSettings;
        mTree.userSettings = tables.userSettings;
        mTree.documents = tables.documents;
        mTree.linkedProjects = tables.linkedProjects;
    }
    // Runs the undo steps after the first count, newest first.
    void undoTo(std::size_t count) noexcept
    {
        while (mUndo.size() > count) {
            const std::function<void()> step = std::move(mUndo.back());
            mUndo.pop_back();
            step();
        }
    }
    // Logs how to put back the entry key of table (or take it out again).
    template <class Table>
    void keepEntry(Table& table, const QString& key)
    {
        auto it = table.constFind(key);
        const bool had = it != table.constEnd();
        const typename Table::mapped_type before = had ? it.value() : typename Table::mapped_type();
        mUndo.push_back([&table, key, had, before] {
            if (had)
                table.insert(key, before);
            else
                table.remove(key);
        });
    }

    std::vector<std::function<void()>> mUndo;
    QSet<QString> mEdited;
    std::uint64_t mTicket = 0;
    bool mHasTicket = false;
    bool mPublished = false;
};

} // namespace

std::unique_ptr<ReadTxn> Tree::beginRead()
{
    return std::unique_ptr<ReadTxn>(new MemoryReadTxn(*this));
}

std::unique_ptr<WriteTxn> Tree::beginWrite()
{
    return std::unique_ptr<WriteTxn>(new MemoryWriteTxn(*this));
}

} // namespace ZelMemory
