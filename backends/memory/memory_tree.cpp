// The in-memory store: its tables, and its transactions over them.
#include "memory_tree_p.h"

#include <algorithm>
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
    StoredNode* top = byId(id);
    if (!top)
        return 0;
    // Only the top leaves its parent's lists; the records below go with it.
    detach(*top);
    QStringList subtree{id};
    for (int i = 0; i < subtree.size(); ++i) {
        if (const StoredNode* node = byId(subtree.at(i)))
            subtree.append(node->children);
    }
    // Deepest first, as children before their parents.
    int removed = 0;
    for (int i = subtree.size() - 1; i >= 0; --i) {
        auto it = nodes.find(subtree.at(i));
        if (it == nodes.end())
            continue;
        idByGivenMoniker.remove(it->second.moniker);
        nodes.erase(it);
        ++removed;
    }
    return removed;
}

void Tree::detach(StoredNode& node)
{
    if (StoredNode* parent = byId(node.parentId)) {
        parent->children.removeOne(node.id);
        auto it = parent->childByName.find(node.name);
        if (it != parent->childByName.end() && it.value() == node.id)
            parent->childByName.erase(it);
    }
    node.parentId.clear();
}

void Tree::attach(StoredNode& node, StoredNode& parent)
{
    node.parentId = parent.id;
    parent.children.append(node.id);
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
    void children(const Node& parent, std::vector<const Node*>& out) override
    {
        const QStringList& ids = stored(parent).children;
        out.reserve(out.size() + static_cast<std::size_t>(ids.size()));
        for (const QString& id : ids) {
            if (const StoredNode* child = mTree.byId(id))
                out.push_back(child);
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

// Changes are made in place: the rules validate before they change the
// first record, so a rollback only drops the change reports and effects.
class MemoryWriteTxn final : public MemoryTxn<WriteTxn, std::unique_lock<std::shared_mutex>>
{
public:
    using MemoryTxn::MemoryTxn;

    ~MemoryWriteTxn() override
    {
        // A ticket taken is published exactly once, or every later batch
        // would wait for it for ever.
        if (mHasTicket && !mPublished) {
            try {
                mTree.publish(mTicket, std::vector<Change>());
            } catch (...) {
            }
        }
    }

    Node& edit(const Node& node) override { return mutableStored(node); }
    const Node& insertNode(Node node, const Node& parent) override
    {
        StoredNode record;
        static_cast<Node&>(record) = std::move(node);
        record.id = mTree.newNodeId();
        record.moniker = monikerOfId(record.id);
        return mTree.insertNode(std::move(record), mutableStored(parent));
    }
    void renameNode(const Node& node, const QString& name) override { mTree.rename(mutableStored(node), name); }
    void moveNode(const Node& node, const Node& parent) override
    {
        StoredNode& record = mutableStored(node);
        mTree.detach(record);
        mTree.attach(record, mutableStored(parent));
    }
    int removeSubtree(const Node& node) override { return mTree.removeSubtree(node.id); }
    void insertKey(const KeyDesc& key) override { mTree.keys.append(key); }
    void setApplicationSettings(const QString& application, const SettingPairs& settings) override
    {
        mTree.applicationSettings.insert(application, settings);
    }
    void setUserSettings(const QString& user, int type, const SettingPairs& settings) override
    {
        mTree.userSettings[user].insert(type, settings);
    }
    void setDocument(const QString& name, const QString& xml) override { mTree.documents.insert(name, xml); }

protected:
    void commitData() override
    {
        if (!mChanges.empty()) {
            mTicket = mTree.takeTicket();
            mHasTicket = true;
        }
        mLock.unlock();
    }
    void publishCommitted() override
    {
        if (!mHasTicket)
            return;
        mPublished = true;
        mTree.publish(mTicket, mChanges);
    }

private:
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
