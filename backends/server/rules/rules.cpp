// The server rules derived from the records, and the records' helpers.
#include "rules_p.h"

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

Zel_PropertyList nodeProperties(ReadTxn& txn, const Node& node)
{
    Zel_PropertyList list;
    const bool locked = isReserved(txn, node.reservation);
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

const Node* parentOf(ReadTxn& txn, const Node& node)
{
    return node.parentId.isEmpty() ? nullptr : txn.nodeById(node.parentId);
}

QStringList pathOf(ReadTxn& txn, const Node& node)
{
    QStringList names;
    for (const Node* n = &node; n && !n->parentId.isEmpty(); n = parentOf(txn, *n))
        names.prepend(n->name);
    return names;
}

const Node* nodeAtPath(ReadTxn& txn, const QStringList& names)
{
    const Node* node = txn.root();
    for (const QString& name : names) {
        if (!node)
            return nullptr;
        node = txn.childNamed(*node, name);
    }
    return node;
}

bool isSelfOrAncestor(ReadTxn& txn, const Node& ancestor, const Node& node)
{
    for (const Node* n = &node; n; n = parentOf(txn, *n)) {
        if (n->id == ancestor.id)
            return true;
    }
    return false;
}

std::uint32_t permissionsOf(ReadTxn& txn, const QString& userName, const Node& node)
{
    const User* u = txn.user(userName);
    if (!u)
        return 0;
    if (u->admin)
        return AllPermissions;
    const QString everyone = QStringLiteral("*");
    for (const Node* n = &node; n; n = parentOf(txn, *n)) {
        auto own = n->permissions.constFind(userName);
        if (own != n->permissions.constEnd())
            return own.value();
        auto all = n->permissions.constFind(everyone);
        if (all != n->permissions.constEnd())
            return all.value();
    }
    return 0;
}

std::uint32_t permissionsBelow(const User* account, const Node& node, std::uint32_t parentPermissions)
{
    if (!account)
        return 0;
    if (account->admin)
        return AllPermissions;
    if (node.permissions.isEmpty())
        return parentPermissions;
    auto own = node.permissions.constFind(account->name);
    if (own != node.permissions.constEnd())
        return own.value();
    auto all = node.permissions.constFind(QStringLiteral("*"));
    if (all != node.permissions.constEnd())
        return all.value();
    return parentPermissions;
}

bool isSyncedProject(const Node& node)
{
    return node.mimeType == QLatin1String("project")
        && !propertyValue(node, QStringLiteral("SyncedProject_GUID")).isEmpty();
}

const Node* reservedByOther(ReadTxn& txn, const Node& node, const QString& userName, bool below)
{
    if (isReserved(txn, node.reservation) && node.reservation.user != userName)
        return &node;
    if (!below)
        return nullptr;
    // Depth first, children in order, without recursion.
    std::vector<const Node*> pending;
    std::vector<const Node*> children;
    auto pushChildren = [&](const Node& n) {
        children.clear();
        txn.children(n, children);
        pending.insert(pending.end(), children.rbegin(), children.rend());
    };
    pushChildren(node);
    while (!pending.empty()) {
        const Node* n = pending.back();
        pending.pop_back();
        if (isReserved(txn, n->reservation) && n->reservation.user != userName)
            return n;
        pushChildren(*n);
    }
    return nullptr;
}

int depthOf(ReadTxn& txn, const Node& node)
{
    int depth = 0;
    for (const Node* n = parentOf(txn, node); n; n = parentOf(txn, *n))
        ++depth;
    return depth;
}

int heightOf(ReadTxn& txn, const Node& node)
{
    int height = 0;
    std::vector<std::pair<const Node*, int>> pending{{&node, 0}};
    std::vector<const Node*> children;
    while (!pending.empty()) {
        const std::pair<const Node*, int> entry = pending.back();
        pending.pop_back();
        height = std::max(height, entry.second);
        children.clear();
        txn.children(*entry.first, children);
        for (const Node* child : children)
            pending.emplace_back(child, entry.second + 1);
    }
    return height;
}

QString uniqueChildName(ReadTxn& txn, const Node& parent, const QString& name)
{
    if (!txn.childNamed(parent, name))
        return name;
    for (int n = 2;; ++n) {
        const QString suffix = QLatin1Char(' ') + QString::number(n);
        const QString candidate = name.left(qMax(0, MaxNameLength - static_cast<int>(suffix.size()))) + suffix;
        if (!txn.childNamed(parent, candidate))
            return candidate;
    }
}

QString propertyValue(const Node& node, const QString& keyName)
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

std::vector<const Node*> subtreeOf(ReadTxn& txn, const Node& node)
{
    std::vector<const Node*> out;
    std::vector<const Node*> pending{&node};
    std::vector<const Node*> children;
    while (!pending.empty()) {
        const Node* n = pending.back();
        pending.pop_back();
        out.push_back(n);
        children.clear();
        txn.children(*n, children);
        pending.insert(pending.end(), children.rbegin(), children.rend());
    }
    return out;
}

QString newMobId()
{
    // Shaped like the AAF MobIDs of the sample tree: a fixed label, then a
    // unique part.
    return QStringLiteral("060a2b340101010101010f00.13000000.")
        + QUuid::createUuid().toString().remove(QLatin1Char('{')).remove(QLatin1Char('}')).remove(
            QLatin1Char('-'));
}

} // namespace ZelMemory
