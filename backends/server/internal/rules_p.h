// Internal: the server rules that are derived from a store's records, built
// on the primitives of the storage interface (store_p.h), so that every
// store answers alike: paths, permissions inherited from above, reservations
// below a node, depth and height against the depth limit, unique names.
#ifndef ZEL_SERVER_RULES_P_H
#define ZEL_SERVER_RULES_P_H

#include "store_p.h"

#include "Zel_PropertyList.h"

#include <QByteArray>

namespace ZelMemory {

const Node* parentOf(ReadTxn& txn, const Node& node);
// Names from below the root to the node itself.
QStringList pathOf(ReadTxn& txn, const Node& node);
// The node at a path of names below the root; the root for no names; null
// when there is none.
const Node* nodeAtPath(ReadTxn& txn, const QStringList& names);
// True when ancestor is node or lies above it.
bool isSelfOrAncestor(ReadTxn& txn, const Node& ancestor, const Node& node);
// The user's rights on the node: admins hold all; otherwise the nearest
// node (this one, then upwards) with an entry for the user, or for "*",
// decides (the user's own entry wins over "*" on the same node).
std::uint32_t permissionsOf(ReadTxn& txn, const QString& user, const Node& node);
// The same answer for a node whose parent's answer is known
// (parentPermissions = permissionsOf(user, parent); 0 for the root), without
// walking up: the node's own entry, or else its parent's answer. account is
// txn.user(user), looked up once by the caller.
std::uint32_t permissionsBelow(const User* account, const Node& node, std::uint32_t parentPermissions);
// True when the node is a project that carries a synced project GUID.
bool isSyncedProject(const Node& node);
// The first node at (and, with below, under) node whose reservation, active
// at the transaction's time, is held by someone other than user.
const Node* reservedByOther(ReadTxn& txn, const Node& node, const QString& user, bool below = true);
// The levels above node: 0 for the root.
int depthOf(ReadTxn& txn, const Node& node);
// The levels of the subtree below node: 0 when it has no children.
int heightOf(ReadTxn& txn, const Node& node);
// name, or "name 2", "name 3", ... whichever no child of parent has; the
// name is shortened where the number would make it longer than the limit.
QString uniqueChildName(ReadTxn& txn, const Node& parent, const QString& name);
// The value of a stored property (Name, Mime Type and MobID included).
QString propertyValue(const Node& node, const QString& key);
// The records of the subtree at node: node first, then depth first with
// children in order (no recursion).
std::vector<const Node*> subtreeOf(ReadTxn& txn, const Node& node);
// A fresh media object ID.
QString newMobId();

// True when the reservation is held and not expired at the transaction's
// time (the clock is read only for a held one).
inline bool isReserved(ReadTxn& txn, const Reservation& reservation)
{
    return !reservation.user.isEmpty() && reservation.isActiveAt(txn.now());
}

// The properties a node shows: Name, Mime Type, MobID (media only), the
// stored properties, and Locked By / Locked On while it is reserved.
Zel_PropertyList nodeProperties(ReadTxn& txn, const Node& node);

// One node (and its subtree) in the form of the tree file (written by the
// tree file code, stores/memory/memory_json.cpp).
QByteArray nodeJson(ReadTxn& txn, const Node& node);

} // namespace ZelMemory

#endif
