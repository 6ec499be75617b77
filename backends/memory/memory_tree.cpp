#include "memory_tree_p.h"

#include <QUuid>

#include <algorithm>
#include <utility>

namespace ZelMemory {

namespace {

const char* const kPermissionNames[PermissionCount] = {
    "Owner", "Admin", "SendToPlayback", "ReadAllLogs", "UseHighResolution", "UseLowResolution",
    "ArchiveRestore", "UserAttributeManagement", "CanCreateColumns", "CanModifyColumns",
    "CanModifyPropertiesInAccess", "Read", "Copy", "AddFiles", "AddFolders", "WriteAttributes",
    "WriteUserAttributes", "WriteNewVersions", "CanWriteLocators", "CanWriteDRMs", "DeleteAssets",
    "DestroyAssets", "DestroyMedia", "Reserve", "OverrideReservation", "PermissionsManagement",
    "CanCreateLocators", "CanModifyLocators", "CanCreateRestrictions", "CanModifyRestrictions"};

} // namespace

const char* permissionName(int index)
{
    return index >= 0 && index < PermissionCount ? kPermissionNames[index] : "";
}

bool permissionsFromNames(const QStringList& names, std::uint32_t& bits, QString& unknown)
{
    std::uint32_t result = 0;
    for (const QString& name : names) {
        if (name == QLatin1String("All")) {
            result |= AllPermissions;
            continue;
        }
        int i = 0;
        while (i < PermissionCount && name != QLatin1String(kPermissionNames[i]))
            ++i;
        if (i == PermissionCount) {
            unknown = name;
            return false;
        }
        result |= 1u << i;
    }
    bits = result;
    return true;
}

QStringList permissionNames(std::uint32_t bits)
{
    if ((bits & AllPermissions) == AllPermissions)
        return QStringList(QStringLiteral("All"));
    QStringList names;
    for (int i = 0; i < PermissionCount; ++i) {
        if (bits & (1u << i))
            names << QLatin1String(kPermissionNames[i]);
    }
    return names;
}

Zel_PropertyKeyInfo keyInfo(const KeyDesc& k)
{
    return Zel_PropertyKeyInfo(k.key, k.displayName, k.modifiable, k.available, k.internalName,
                               static_cast<Zel_PropertyKeyType>(k.type), k.textSearchable, k.hasCustomValues);
}

const char* userSettingsTypeName(int type)
{
    switch (type) {
    case 0:
        return "general";
    case 1:
        return "project";
    case 2:
        return "site";
    default:
        return "";
    }
}

Zel_PropertyList nodeProperties(const Tree& tree, const Node& node)
{
    Q_UNUSED(tree);
    Zel_PropertyList list;
    const bool locked = node.reservation.isActive();
    list.reserve(2 + (node.mobId.isEmpty() ? 0 : 1) + node.properties.size() + (locked ? 2 : 0));
    list.append(Zel_Property(QStringLiteral("Name"), node.name, QString()));
    list.append(Zel_Property(QStringLiteral("Mime Type"), node.mimeType, QString()));
    if (!node.mobId.isEmpty())
        list.append(Zel_Property(QStringLiteral("MobID"), node.mobId, QString()));
    for (const Property& p : node.properties)
        list.append(Zel_Property(p.key, p.value, p.customValues));
    if (locked) {
        list.addIfKeyNotInList(Zel_Property(QStringLiteral("Locked By"), node.reservation.user, QString()));
        if (node.reservation.since.isValid())
            list.addIfKeyNotInList(Zel_Property(QStringLiteral("Locked On"), node.reservation.since.toString(Qt::ISODate), QString()));
    }
    return list;
}

Observer::~Observer() = default;

Tree::Tree() = default;

Node* Tree::byId(const QString& id)
{
    auto it = nodes.find(id);
    return it == nodes.end() ? nullptr : &it->second;
}

const Node* Tree::byId(const QString& id) const
{
    auto it = nodes.find(id);
    return it == nodes.end() ? nullptr : &it->second;
}

Node* Tree::byMoniker(const QString& moniker)
{
    return const_cast<Node*>(static_cast<const Tree*>(this)->byMoniker(moniker));
}

const Node* Tree::byMoniker(const QString& moniker) const
{
    auto given = idByGivenMoniker.constFind(moniker);
    if (given != idByGivenMoniker.constEnd())
        return byId(given.value());
    // A moniker made from an ID names the node with that ID, unless that
    // node's moniker is another one.
    if (!moniker.startsWith(MonikerScheme))
        return nullptr;
    const Node* node = byId(moniker.mid(MonikerScheme.size()));
    return node && node->moniker == moniker ? node : nullptr;
}

const Node* Tree::parentOf(const Node& node) const
{
    return node.parentId.isEmpty() ? nullptr : byId(node.parentId);
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

const Node* Tree::byPath(const QString& path) const
{
    const Node* node = byId(rootId);
    const QStringList parts = path.split(QLatin1Char('/'), Qt::SkipEmptyParts);
    for (const QString& part : parts) {
        if (!node)
            return nullptr;
        node = childNamed(*node, part);
    }
    return node;
}

QStringList Tree::pathOf(const Node& node) const
{
    QStringList names;
    for (const Node* n = &node; n && n->id != rootId; n = parentOf(*n))
        names.prepend(n->name);
    return names;
}

bool Tree::isSelfOrAncestor(const Node& ancestor, const Node& node) const
{
    for (const Node* n = &node; n; n = parentOf(*n)) {
        if (n->id == ancestor.id)
            return true;
    }
    return false;
}

std::uint32_t Tree::permissionsOf(const QString& userName, const Node& node) const
{
    const User* u = user(userName);
    if (!u)
        return 0;
    if (u->admin)
        return AllPermissions;
    const QString everyone = QStringLiteral("*");
    for (const Node* n = &node; n; n = parentOf(*n)) {
        auto own = n->permissions.constFind(userName);
        if (own != n->permissions.constEnd())
            return own.value();
        auto all = n->permissions.constFind(everyone);
        if (all != n->permissions.constEnd())
            return all.value();
    }
    return 0;
}

std::uint32_t Tree::permissionsBelow(const QString& userName, const Node& node, std::uint32_t parentPermissions) const
{
    const User* u = user(userName);
    if (!u)
        return 0;
    if (u->admin)
        return AllPermissions;
    auto own = node.permissions.constFind(userName);
    if (own != node.permissions.constEnd())
        return own.value();
    auto all = node.permissions.constFind(QStringLiteral("*"));
    if (all != node.permissions.constEnd())
        return all.value();
    return parentPermissions;
}

bool Tree::isSyncedProject(const Node& node) const
{
    return node.mimeType == QLatin1String("project")
        && !propertyValue(node, QStringLiteral("SyncedProject_GUID")).isEmpty();
}

const Node* Tree::reservedByOther(const Node& node, const QString& userName, bool below) const
{
    if (node.reservation.isActive() && node.reservation.user != userName)
        return &node;
    if (!below)
        return nullptr;
    // Depth first, children in order, without recursion.
    std::vector<const Node*> pending;
    for (int i = node.children.size() - 1; i >= 0; --i) {
        if (const Node* child = byId(node.children.at(i)))
            pending.push_back(child);
    }
    while (!pending.empty()) {
        const Node* n = pending.back();
        pending.pop_back();
        if (n->reservation.isActive() && n->reservation.user != userName)
            return n;
        for (int i = n->children.size() - 1; i >= 0; --i) {
            if (const Node* child = byId(n->children.at(i)))
                pending.push_back(child);
        }
    }
    return nullptr;
}

const Node* Tree::childNamed(const Node& parent, const QString& name) const
{
    auto it = parent.childByName.constFind(name);
    return it == parent.childByName.constEnd() ? nullptr : byId(it.value());
}

int Tree::depthOf(const Node& node) const
{
    int depth = 0;
    for (const Node* n = parentOf(node); n; n = parentOf(*n))
        ++depth;
    return depth;
}

int Tree::heightOf(const Node& node) const
{
    int height = 0;
    std::vector<std::pair<const Node*, int>> pending{{&node, 0}};
    while (!pending.empty()) {
        const std::pair<const Node*, int> entry = pending.back();
        pending.pop_back();
        height = std::max(height, entry.second);
        for (const QString& id : entry.first->children) {
            if (const Node* child = byId(id))
                pending.emplace_back(child, entry.second + 1);
        }
    }
    return height;
}

const Node* Tree::byMobId(const QString& mobId) const
{
    if (mobId.isEmpty())
        return nullptr;
    for (const auto& entry : nodes) {
        if (entry.second.mobId == mobId)
            return &entry.second;
    }
    return nullptr;
}

QString Tree::uniqueChildName(const Node& parent, const QString& name) const
{
    if (!childNamed(parent, name))
        return name;
    for (int n = 2;; ++n) {
        const QString suffix = QLatin1Char(' ') + QString::number(n);
        const QString candidate = name.left(qMax(0, MaxNameLength - static_cast<int>(suffix.size()))) + suffix;
        if (!childNamed(parent, candidate))
            return candidate;
    }
}

QString Tree::propertyValue(const Node& node, const QString& keyName) const
{
    if (keyName == QLatin1String("Name"))
        return node.name;
    if (keyName == QLatin1String("Mime Type"))
        return node.mimeType;
    if (keyName == QLatin1String("MobID"))
        return node.mobId;
    for (const Property& p : node.properties) {
        if (p.key == keyName)
            return p.value;
    }
    return QString();
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

QString Tree::newMobId()
{
    // Shaped like the AAF MobIDs of the sample tree: a fixed label, then a
    // unique part.
    return QStringLiteral("060a2b340101010101010f00.13000000.")
        + QUuid::createUuid().toString().remove(QLatin1Char('{')).remove(QLatin1Char('}')).remove(
            QLatin1Char('-'));
}

Node& Tree::insertNode(Node node, Node& parent)
{
    Node& stored = addNode(std::move(node));
    attach(stored, parent);
    return stored;
}

Node& Tree::addNode(Node node)
{
    if (node.moniker != monikerOfId(node.id))
        idByGivenMoniker.insert(node.moniker, node.id);
    const QString id = node.id;
    return nodes.emplace(id, std::move(node)).first->second;
}

Node& Tree::copySubtree(const Node& source, Node& target, const QString& name)
{
    // Depth first without recursion; each source's children are pushed in
    // reverse so that the copies are made (and numbered) in preorder and
    // every copied folder keeps its children's order. The source subtree is
    // not changed meanwhile: the target is not inside it.
    const QDateTime now = QDateTime::currentDateTimeUtc();
    auto copyOne = [&](const Node& from, Node& under, const QString& as) -> Node& {
        Node copy = from;
        copy.id = newNodeId();
        copy.moniker = monikerOfId(copy.id);
        copy.name = as;
        copy.children.clear();
        copy.childByName.clear();
        copy.reservation = Reservation();
        copy.created = copy.modified = now;
        if (!copy.mobId.isEmpty())
            copy.mobId = newMobId();
        return insertNode(std::move(copy), under);
    };
    struct Pending {
        QString sourceId;
        QString targetId;
    };
    Node& top = copyOne(source, target, name);
    const QString topId = top.id;
    std::vector<Pending> pending;
    for (int i = source.children.size() - 1; i >= 0; --i)
        pending.push_back(Pending{source.children.at(i), topId});
    while (!pending.empty()) {
        const Pending next = pending.back();
        pending.pop_back();
        const Node* from = byId(next.sourceId);
        Node* under = byId(next.targetId);
        if (!from || !under)
            continue;
        const QStringList fromChildren = from->children;
        const QString copiedId = copyOne(*from, *under, from->name).id;
        for (int i = fromChildren.size() - 1; i >= 0; --i)
            pending.push_back(Pending{fromChildren.at(i), copiedId});
    }
    return *byId(topId);
}

void Tree::removeSubtree(const QString& id, QStringList* removed)
{
    Node* top = byId(id);
    if (!top)
        return;
    // Only the top leaves its parent's lists; the records below go with it.
    detach(*top);
    QStringList subtree{id};
    for (int i = 0; i < subtree.size(); ++i) {
        if (const Node* node = byId(subtree.at(i)))
            subtree.append(node->children);
    }
    // Deepest first, as children before their parents.
    for (int i = subtree.size() - 1; i >= 0; --i) {
        auto it = nodes.find(subtree.at(i));
        if (it == nodes.end())
            continue;
        idByGivenMoniker.remove(it->second.moniker);
        if (removed)
            removed->append(it->first);
        nodes.erase(it);
    }
}

void Tree::detach(Node& node)
{
    if (Node* parent = byId(node.parentId)) {
        parent->children.removeOne(node.id);
        auto it = parent->childByName.find(node.name);
        if (it != parent->childByName.end() && it.value() == node.id)
            parent->childByName.erase(it);
    }
    node.parentId.clear();
}

void Tree::attach(Node& node, Node& parent)
{
    node.parentId = parent.id;
    parent.children.append(node.id);
    parent.childByName.insert(node.name, node.id);
}

void Tree::rename(Node& node, const QString& name)
{
    if (Node* parent = byId(node.parentId)) {
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

WriteHold::WriteHold(Tree& tree)
    : mTree(tree)
    , mLock(tree.mutex)
{
}

WriteHold::~WriteHold()
{
    release();
}

void WriteHold::added(const QString& parentMoniker, const QString& childMoniker)
{
    mChanges.push_back(Change{Change::Added, parentMoniker, childMoniker});
}

void WriteHold::removed(const QString& parentMoniker, const QString& childMoniker)
{
    mChanges.push_back(Change{Change::Removed, parentMoniker, childMoniker});
}

void WriteHold::updated(const QString& parentMoniker, const QString& childMoniker)
{
    mChanges.push_back(Change{Change::Updated, parentMoniker, childMoniker});
}

void WriteHold::release()
{
    if (mReleased)
        return;
    mReleased = true;
    if (mChanges.empty()) {
        mLock.unlock();
        return;
    }
    const std::uint64_t ticket = mTree.takeTicket();
    mLock.unlock();
    mTree.publish(ticket, mChanges);
}

} // namespace ZelMemory
