// Operations that change the tree: create, rename, move, copy, delete,
// properties, dependencies, reservations, frame locators and restrictions.
//
// Each runs in a write transaction, validates everything before it changes
// the first record, reports its changes through the transaction (published
// to the sessions' listeners after commit), and answers with snapshots taken
// after the change.
#include "ops_p.h"

#include "Zel_AddDependencyRes.h"
#include "Zel_ConditionalSetPropertiesCB.h"
#include "Zel_CopyNodeCB.h"
#include "Zel_CreateFolderCB.h"
#include "Zel_CreateFolderUniqueRes.h"
#include "Zel_CreateNodeUniqueRes.h"
#include "Zel_CreatePropertyCB.h"
#include "Zel_CreateReservationRes.h"
#include "Zel_DeleteNodeRes.h"
#include "Zel_DeleteRes.h"
#include "Zel_Dependency.h"
#include "Zel_FrameLocatorListCB.h"
#include "Zel_FrameRestrictionListCB.h"
#include "Zel_MemoryPropertyManager.h"
#include "Zel_MimeTypeSpec.h"
#include "Zel_MoveNodeCB.h"
#include "Zel_RemoveReservationRes.h"
#include "Zel_RenameNodeCB.h"
#include "Zel_RenameUniqueRes.h"
#include "Zel_SetPropertiesCB.h"

#include "Zel_Node.h"

namespace ZelMemory {

namespace {


const Node& parentOrFail(Work& work, const Node& node, const QString& action)
{
    const Node* parent = parentOf(work.txn, node);
    if (!parent)
        fail(Zel_MemoryErrorCodes::InvalidTarget, QStringLiteral("The root %1 cannot be %2.").arg(work.describe(node), action));
    return *parent;
}

// A fresh node record (not yet in the store, which gives it its ID and
// moniker).
Node newNode(Work& work, const QString& name, const QString& mimeType)
{
    Node node;
    node.name = name;
    node.mimeType = mimeType;
    node.created = node.modified = work.txn.now();
    node.properties.append(Property{QStringLiteral("Created By"), work.user, QString()});
    if (Zel_MimeTypeSpec(Zel_MimeTypes_Media).isType(mimeType))
        node.mobId = newMobId();
    return node;
}

// What a new container under parent is: a project under the workspace, a bin elsewhere.
QString folderTypeFor(const Node& parent)
{
    return parent.mimeType == QLatin1String("workspace") ? QStringLiteral("project") : QStringLiteral("bin");
}

// The permission that adding a node of that mime type to a folder needs.
std::uint32_t addPermissionFor(const QString& mimeType)
{
    return Zel_MimeTypeSpec(Zel_MimeTypes_Containers).isType(mimeType) ? PermAddFolders : PermAddFiles;
}

const Node& createFolder(WriteWork& work, const boost::shared_ptr<QString>& parentMoniker, QString name, bool unique)
{
    const Node& parent = work.node(parentMoniker);
    work.requireFolder(parent);
    work.require(parent, PermAddFolders, QStringLiteral("add folders to"));
    work.requireNotReservedByOther(parent, QStringLiteral("add to"), false);
    work.requireAssetName(name);
    requireDepth(work, parent, 0);
    if (unique)
        name = uniqueChildName(work.txn, parent, name);
    else
        work.requireFreeName(parent, name);
    const Node& created = work.write.insertNode(newNode(work, name, folderTypeFor(parent)), parent);
    work.write.reportAdded(parent.moniker, created.moniker);
    return created;
}

const Node& renameNode(WriteWork& work, const boost::shared_ptr<QString>& moniker, QString name, bool unique)
{
    const Node& node = work.node(moniker);
    const Node& parent = parentOrFail(work, node, QStringLiteral("renamed"));
    work.require(node, PermWriteAttributes, QStringLiteral("rename"));
    work.requireNotReservedByOther(node, QStringLiteral("rename"), false);
    work.requireAssetName(name);
    if (name == node.name)
        return node;
    if (unique)
        name = uniqueChildName(work.txn, parent, name);
    else
        work.requireFreeName(parent, name, &node);
    work.write.renameNode(node, name);
    work.write.edit(node).modified = work.txn.now();
    work.write.reportUpdated(parent.moniker, node.moniker);
    return node;
}

// Adds or removes frame locators (restrictions = false) or restrictions.
QList<Zel_FrameLocator> changeMarkers(WriteWork& work, const boost::shared_ptr<QString>& moniker,
                                      const QList<Zel_FrameLocator>& given, bool restrictions, bool add)
{
    const Node& node = work.node(moniker);
    work.requireMedia(node);
    const QString what = restrictions ? QStringLiteral("restriction") : QStringLiteral("locator");
    if (add)
        work.require(node, restrictions ? PermCanCreateRestrictions : PermCanCreateLocators,
                     QStringLiteral("add frame %1s to").arg(what));
    else
        work.require(node, restrictions ? PermCanModifyRestrictions : PermCanModifyLocators,
                     QStringLiteral("remove frame %1s from").arg(what));
    work.requireNotReservedByOther(node, QStringLiteral("change"), false);
    if (given.isEmpty())
        fail(Zel_MemoryErrorCodes::InvalidArgument, QStringLiteral("No frame %1s were given.").arg(what));

    QList<Marker> updated = restrictions ? node.restrictions : node.locators;
    auto indexOf = [&updated](const QString& id) {
        for (int i = 0; i < updated.size(); ++i) {
            if (updated.at(i).id == id)
                return i;
        }
        return -1;
    };
    const QString prefix = restrictions ? QStringLiteral("R-") : QStringLiteral("L-");
    for (const Zel_FrameLocator& locator : given) {
        if (add) {
            Marker marker;
            marker.id = locator.getID();
            if (marker.id.isEmpty()) {
                int n = updated.size() + 1;
                while (indexOf(prefix + QString::number(n)) >= 0)
                    ++n;
                marker.id = prefix + QString::number(n);
            } else if (indexOf(marker.id) >= 0) {
                fail(Zel_MemoryErrorCodes::InvalidArgument,
                     QStringLiteral("%1 already has a frame %2 \"%3\".").arg(work.describe(node), what, marker.id));
            }
            for (const Zel_FrameProperty& property : locator)
                marker.properties.append(qMakePair(property.key(), property.value()));
            updated.append(marker);
        } else {
            const int index = indexOf(locator.getID());
            if (index < 0)
                fail(Zel_MemoryErrorCodes::NotFound,
                     QStringLiteral("%1 has no frame %2 \"%3\".").arg(work.describe(node), what, locator.getID()));
            updated.removeAt(index);
        }
    }
    Node& record = work.write.edit(node);
    (restrictions ? record.restrictions : record.locators) = updated;
    record.modified = work.txn.now();
    reportUpdated(work, node);
    return markersOf(node, restrictions);
}

// Deep copy of source (and its subtree) under target, the top named name.
// Depth first; each source's children are pushed in reverse so that the
// copies are made (and numbered) in preorder and every copied folder keeps
// its children's order. The source subtree does not change meanwhile: the
// target is not inside it. A copy is a new asset: no reservation, new dates,
// and a new media object ID where the source has one.
const Node& copySubtree(WriteWork& work, const Node& source, const Node& target, const QString& name)
{
    const QDateTime now = work.txn.now();
    auto copyOne = [&](const Node& from, const Node& under, const QString& as) -> const Node& {
        Node copy = from;
        copy.name = as;
        copy.reservation = Reservation();
        copy.created = copy.modified = now;
        if (!copy.mobId.isEmpty())
            copy.mobId = newMobId();
        return work.write.insertNode(std::move(copy), under);
    };
    struct Pending {
        const Node* source;
        const Node* target;
    };
    const Node& top = copyOne(source, target, name);
    std::vector<Pending> pending;
    std::vector<const Node*> children;
    auto pushChildren = [&](const Node& from, const Node& copied) {
        children.clear();
        work.txn.children(from, children);
        for (auto it = children.rbegin(); it != children.rend(); ++it)
            pending.push_back(Pending{*it, &copied});
    };
    pushChildren(source, top);
    while (!pending.empty()) {
        const Pending next = pending.back();
        pending.pop_back();
        const Node& copied = copyOne(*next.source, *next.target, next.source->name);
        pushChildren(*next.source, copied);
    }
    return top;
}

} // namespace

void reportUpdated(WriteWork& work, const Node& node)
{
    if (const Node* parent = parentOf(work.txn, node))
        work.write.reportUpdated(parent->moniker, node.moniker);
}

void requireDepth(Work& work, const Node& parent, int height)
{
    const int deepest = depthOf(work.txn, parent) + 1 + height;
    if (deepest > MaxDepth)
        fail(Zel_MemoryErrorCodes::TooDeep,
             QStringLiteral("Nodes added to %1 would lie %2 levels below the root; the server allows at most %3.")
                 .arg(work.describe(parent))
                 .arg(deepest)
                 .arg(MaxDepth));
}

// --- Creating -------------------------------------------------------------------

void CreateFolderOp::run(WriteWork& work, const Args& args, Result& result)
{
    result.succeed(work.snapshot(createFolder(work, args.parent, args.name, false)));
}
ZEL_MEMORY_EXECUTE(CreateFolderOp)

void CreateFolderUniqueOp::run(WriteWork& work, const Args& args, Result& result)
{
    result.setResult(work.snapshot(createFolder(work, args.parent, args.name, true)), ok());
}
ZEL_MEMORY_EXECUTE(CreateFolderUniqueOp)

void CreateNodeUniqueOp::run(WriteWork& work, const Args& args, Result& result)
{
    const Node& parent = work.node(args.parent);
    work.requireFolder(parent);
    // The node's type comes with its properties; a master clip by default.
    QString mimeType = args.properties.findByKey(QStringLiteral("Mime Type")).value();
    if (mimeType.isEmpty())
        mimeType = QStringLiteral("masterclip");
    Zel_MimeTypeValue value;
    if (!Zel_MimeTypeSpec::getType(mimeType, value))
        fail(Zel_MemoryErrorCodes::InvalidArgument, QStringLiteral("Unknown mime type \"%1\".").arg(mimeType));
    work.require(parent, addPermissionFor(mimeType), QStringLiteral("add to"));
    work.requireNotReservedByOther(parent, QStringLiteral("add to"), false);
    work.requireAssetName(args.name);
    requireDepth(work, parent, 0);
    Node node = newNode(work, uniqueChildName(work.txn, parent, args.name), mimeType);
    for (const Zel_Property& property : args.properties) {
        const QString key = property.key();
        if (key == QLatin1String("Mime Type") || key == QLatin1String("Name"))
            continue;
        if (key == QLatin1String("MobID")) {
            if (!property.value().isEmpty()) {
                // A media object ID names one node on the server.
                if (const Node* owner = work.txn.nodeByMobId(property.value()))
                    fail(Zel_MemoryErrorCodes::MobIDExists,
                         QStringLiteral("The media object ID \"%1\" belongs to %2 already.")
                             .arg(property.value(), work.describe(*owner)));
                node.mobId = property.value();
            }
            continue;
        }
        if (!work.session.isValidPropertyName(key))
            fail(Zel_MemoryErrorCodes::InvalidName, QStringLiteral("The session rejects the property name \"%1\".").arg(key));
        bool replaced = false;
        for (Property& existing : node.properties) {
            if (existing.key == key) {
                existing.value = property.value();
                replaced = true;
            }
        }
        if (!replaced)
            node.properties.append(Property{key, property.value(), property.customValues()});
    }
    const Node& created = work.write.insertNode(std::move(node), parent);
    work.write.reportAdded(parent.moniker, created.moniker);
    result.setResult(work.snapshot(created), ok());
}
ZEL_MEMORY_EXECUTE(CreateNodeUniqueOp)

// --- Renaming, moving, copying ------------------------------------------------------

void RenameNodeOp::run(WriteWork& work, const Args& args, Result& result)
{
    result.succeed(work.snapshot(renameNode(work, args.moniker, args.name, false)));
}
ZEL_MEMORY_EXECUTE(RenameNodeOp)

void RenameUniqueOp::run(WriteWork& work, const Args& args, Result& result)
{
    result.setResult(work.snapshot(renameNode(work, args.moniker, args.name, true)), ok());
}
ZEL_MEMORY_EXECUTE(RenameUniqueOp)

void MoveNodeOp::run(WriteWork& work, const Args& args, Result& result)
{
    const Node& node = work.node(args.moniker);
    const Node& oldParent = parentOrFail(work, node, QStringLiteral("moved"));
    const Node& destination = work.node(args.destination);
    work.requireFolder(destination);
    if (isSelfOrAncestor(work.txn, node, destination))
        fail(Zel_MemoryErrorCodes::InvalidTarget,
             QStringLiteral("%1 cannot be moved into itself or below itself.").arg(work.describe(node)));
    work.require(node, PermDeleteAssets, QStringLiteral("move"));
    work.require(destination, addPermissionFor(node.mimeType), QStringLiteral("move nodes into"));
    work.requireNotReservedByOther(node, QStringLiteral("move"));
    work.requireNotReservedByOther(destination, QStringLiteral("move into"), false);
    if (oldParent.id != destination.id) {
        work.requireFreeName(destination, node.name);
        requireDepth(work, destination, heightOf(work.txn, node));
        const QString oldParentMoniker = oldParent.moniker;
        work.write.moveNode(node, destination);
        work.write.edit(node).modified = work.txn.now();
        work.write.reportRemoved(oldParentMoniker, node.moniker);
        work.write.reportAdded(destination.moniker, node.moniker);
    }
    result.succeed(work.snapshot(node));
}
ZEL_MEMORY_EXECUTE(MoveNodeOp)

void CopyNodeOp::run(WriteWork& work, const Args& args, Result& result)
{
    const Node& source = work.node(args.moniker);
    parentOrFail(work, source, QStringLiteral("copied"));
    const Node& destination = work.node(args.destination);
    work.requireFolder(destination);
    if (isSelfOrAncestor(work.txn, source, destination))
        fail(Zel_MemoryErrorCodes::InvalidTarget,
             QStringLiteral("%1 cannot be copied into itself or below itself.").arg(work.describe(source)));
    work.require(source, PermCopy, QStringLiteral("copy"));
    work.require(destination, addPermissionFor(source.mimeType), QStringLiteral("copy nodes into"));
    work.requireNotReservedByOther(destination, QStringLiteral("copy into"), false);
    requireDepth(work, destination, heightOf(work.txn, source));
    const unsigned long total = static_cast<unsigned long>(subtreeOf(work.txn, source).size());
    const QString name = uniqueChildName(work.txn, destination, source.name);
    const Node& copy = copySubtree(work, source, destination, name);
    work.write.reportAdded(destination.moniker, copy.moniker);
    result.call([total](Zel_CopyNodeCB& cb) { cb.progress(total, total); });
    result.succeed(work.snapshot(source), work.snapshot(copy));
}
ZEL_MEMORY_EXECUTE(CopyNodeOp)

// --- Deleting --------------------------------------------------------------------

void DeleteNodeOp::run(WriteWork& work, const Args& args, Result& result)
{
    const Node& node = work.node(args.moniker);
    const Node& parent = parentOrFail(work, node, QStringLiteral("deleted"));
    work.require(node, PermDeleteAssets, QStringLiteral("delete"));
    work.requireNotReservedByOther(node, QStringLiteral("delete"));
    const QString parentMoniker = parent.moniker;
    const QString moniker = node.moniker;
    work.write.removeSubtree(node);
    work.write.reportRemoved(parentMoniker, moniker);
    result.setResult(true, ok());
}
ZEL_MEMORY_EXECUTE(DeleteNodeOp)

void DeleteOp::run(WriteWork& work, const Args& args, Result& result)
{
    if (args.monikers.isEmpty())
        fail(Zel_MemoryErrorCodes::InvalidArgument, QStringLiteral("No assets to delete were given."));
    long assets = 0;
    long records = 0;
    // Each asset on its own: one that cannot be deleted is reported and left
    // as it is (its savepoint rolled back to), the others go.
    for (const QString& moniker : args.monikers) {
        const WriteTxn::Savepoint point = work.write.savepoint();
        try {
            const Node& node = work.node(sharedText(moniker));
            const Node& parent = parentOrFail(work, node, QStringLiteral("deleted"));
            work.require(node, PermDeleteAssets, QStringLiteral("delete"));
            work.requireNotReservedByOther(node, QStringLiteral("delete"));

            for (const Node* n : subtreeOf(work.txn, node)) {
                if (n->mobId.isEmpty())
                    continue;
                const boost::shared_ptr<Zel_MobID> mob(new Zel_MobID(n->mobId));
                if (args.remoteMedia && !n->media.isEmpty()) {
                    if (work.permissions(*n) & PermDestroyMedia) {
                        result.setRemoteMediaDeleteSuccessPartialResult(mob, ok());
                    } else {
                        for (const Media& media : n->media) {
                            const QString reason = QStringLiteral("User \"%1\" may not destroy media; the file is kept.").arg(work.user);
                            result.setRemoteMediaDeleteErrorPartialResult(
                                sharedText(n->mobId), sharedText(n->name), sharedText(media.path),
                                sharedText(media.resolution), sharedText(reason),
                                Zel_MemoryError::make(Zel_MemoryErrorCodes::PermissionDenied, reason));
                        }
                    }
                }
                if (args.localMedia) {
                    if (!n->media.isEmpty())
                        result.setLocalDeleteMediaSuccessPartialResult(mob, ok());
                    else if (Zel_MimeTypeSpec(Zel_MimeTypes_Media).isType(n->mimeType))
                        result.setLocalDeleteMobNotFoundErrorPartialResult(
                            mob, Zel_MemoryError::make(Zel_MemoryErrorCodes::NotFound,
                                                       QStringLiteral("No local media of %1.").arg(work.describe(*n))));
                }
            }
            const QString parentMoniker = parent.moniker;
            const QString nodeMoniker = node.moniker;
            records += work.write.removeSubtree(node);
            work.write.reportRemoved(parentMoniker, nodeMoniker);
            ++assets;
        } catch (const Failure& failure) {
            work.write.rollbackTo(point);
            result.setErrorResult(failure.error);
        }
    }
    result.setRemoteAssetDeleteSuccessTotalResult(assets, ok());
    result.setRemoteMetadataDeleteSuccessTotalResult(records, ok());
}
ZEL_MEMORY_EXECUTE(DeleteOp)

// --- Properties and dependencies ----------------------------------------------------

// A Zel_ConditionalSetPropertiesCB makes the set conditional.
void SetPropertiesOp::prepare(const boost::shared_ptr<Callback>& callback, Args& args)
{
    args.conditional = boost::dynamic_pointer_cast<Zel_ConditionalSetPropertiesCB>(callback) != nullptr;
}

void SetPropertiesOp::run(WriteWork& work, const Args& args, Result& result)
{
    const Node& node = work.node(args.moniker);
    work.require(node, PermWriteAttributes, QStringLiteral("change the properties of"));
    work.requireNotReservedByOther(node, QStringLiteral("change"), false);
    if (args.properties.isEmpty())
        fail(Zel_MemoryErrorCodes::InvalidArgument, QStringLiteral("No properties to set were given."));
    for (const Zel_Property& property : args.properties) {
        const QString key = property.key();
        if (key.isEmpty())
            fail(Zel_MemoryErrorCodes::InvalidArgument, QStringLiteral("A property without a key was given."));
        if (key == QLatin1String("Name") || key == QLatin1String("Mime Type") || key == QLatin1String("MobID"))
            fail(Zel_MemoryErrorCodes::PropertyNotModifiable,
                 QStringLiteral("The property \"%1\" cannot be set (rename the node to change its name).").arg(key));
        const KeyDesc* desc = work.txn.key(key);
        bool onNode = false;
        for (const Property& p : node.properties)
            onNode = onNode || p.key == key;
        if (!desc && !onNode)
            fail(Zel_MemoryErrorCodes::UnknownProperty,
                 QStringLiteral("The server knows no property \"%1\" (create it first).").arg(key));
        if (desc && !desc->modifiable)
            fail(Zel_MemoryErrorCodes::PropertyNotModifiable, QStringLiteral("The property \"%1\" cannot be changed.").arg(key));
    }
    if (args.conditional) {
        Zel_PropertyList current;
        bool matches = true;
        for (const Zel_Property& property : args.properties) {
            const QString now = propertyValue(node, property.key());
            current.append(Zel_Property(property.key(), now, QString()));
            matches = matches && now == property.customValues();
        }
        if (!matches) {
            const boost::shared_ptr<Zel_Node> snapshot = work.snapshot(node);
            result.call([snapshot, current](Zel_SetPropertiesCB& cb) {
                if (Zel_ConditionalSetPropertiesCB* conditional = dynamic_cast<Zel_ConditionalSetPropertiesCB*>(&cb))
                    conditional->conditionFailed(snapshot, current);
            });
            return;
        }
    }
    Node& record = work.write.edit(node);
    for (const Zel_Property& property : args.properties) {
        bool replaced = false;
        for (Property& p : record.properties) {
            if (p.key == property.key()) {
                p.value = property.value();
                replaced = true;
            }
        }
        if (!replaced)
            record.properties.append(Property{property.key(), property.value(), QString()});
    }
    record.modified = work.txn.now();
    reportUpdated(work, node);
    result.succeed(work.snapshot(node));
}
ZEL_MEMORY_EXECUTE(SetPropertiesOp)

void CreatePropertyOp::run(WriteWork& work, const Args& args, Result& result)
{
    const Node& node = work.node(args.moniker);
    const QString key = args.property.key();
    if (!work.session.isValidPropertyName(key))
        fail(Zel_MemoryErrorCodes::InvalidName,
             QStringLiteral("The session rejects the property name \"%1\": it needs a letter, digit or underscore.").arg(key));
    if (key == QLatin1String("Name") || key == QLatin1String("Mime Type") || key == QLatin1String("MobID")
        || !propertyValue(node, key).isNull())
        fail(Zel_MemoryErrorCodes::PropertyExists, QStringLiteral("%1 already has the property \"%2\".").arg(work.describe(node), key));
    work.require(node, PermWriteUserAttributes, QStringLiteral("add properties to"));
    const bool newKey = work.txn.key(key) == nullptr;
    if (newKey)
        work.require(node, PermCanCreateColumns, QStringLiteral("create the new property key \"%1\" on").arg(key));
    work.requireNotReservedByOther(node, QStringLiteral("change"), false);
    if (newKey) {
        KeyDesc desc;
        desc.key = key;
        desc.displayName = key;
        desc.internalName = key.toLower().replace(QLatin1Char(' '), QLatin1Char('_'));
        desc.hasCustomValues = !args.property.customValues().isEmpty();
        work.write.insertKey(desc);
        // The sessions' property manager learns the key once it is stored.
        const boost::shared_ptr<Zel_MemoryPropertyManager> manager = work.session.store().propertyManager;
        const Zel_PropertyKeyInfo info = keyInfo(desc);
        if (manager)
            work.txn.onCommit([manager, info] { manager->addKey(info); });
    }
    Node& record = work.write.edit(node);
    record.properties.append(Property{key, args.property.value(), args.property.customValues()});
    record.modified = work.txn.now();
    reportUpdated(work, node);
    result.succeed(keyInfo(*work.txn.key(key)));
}
ZEL_MEMORY_EXECUTE(CreatePropertyOp)

void AddDependencyOp::run(WriteWork& work, const Args& args, Result& result)
{
    const Node& node = work.node(args.moniker);
    work.require(node, PermWriteAttributes, QStringLiteral("add dependencies to"));
    work.requireNotReservedByOther(node, QStringLiteral("change"), false);
    QList<Dependency> added;
    for (const boost::shared_ptr<Zel_Dependency>& dependency : args.dependencies) {
        if (!dependency || !dependency->getMoniker() || dependency->getMoniker()->isEmpty())
            fail(Zel_MemoryErrorCodes::InvalidArgument, QStringLiteral("A dependency without a moniker was given."));
        const QString moniker = *dependency->getMoniker();
        if (!work.txn.nodeByMoniker(moniker))
            fail(Zel_MemoryErrorCodes::UnknownMoniker,
                 QStringLiteral("No node has the moniker \"%1\" (named as a dependency).").arg(moniker));
        added.append(Dependency{moniker, dependency->getUsage(), static_cast<int>(dependency->getType())});
    }
    QList<Dependency> dependencies = node.dependencies;
    for (const Dependency& dependency : added) {
        bool known = false;
        for (const Dependency& existing : dependencies)
            known = known || (existing.moniker == dependency.moniker && existing.usage == dependency.usage);
        if (!known)
            dependencies.append(dependency);
    }
    Zel_DependencySPList all;
    for (const Dependency& d : dependencies)
        all.append(boost::shared_ptr<Zel_Dependency>(new Zel_Dependency(
            sharedText(d.moniker), d.usage, static_cast<Zel_Dependency::Zel_DependencyType>(d.type))));
    if (!added.isEmpty()) {
        Node& record = work.write.edit(node);
        record.dependencies = dependencies;
        record.modified = work.txn.now();
        reportUpdated(work, node);
    }
    result.setResult(work.snapshot(node), all, ok());
}
ZEL_MEMORY_EXECUTE(AddDependencyOp)

// --- Reservations ----------------------------------------------------------------

void CreateReservationOp::run(WriteWork& work, const Args& args, Result& result)
{
    const Node& node = work.node(args.moniker);
    work.require(node, PermReserve, QStringLiteral("reserve"));
    work.requireNotReservedByOther(node, QStringLiteral("reserve"), false);
    const QDateTime now = work.txn.now();
    if (args.expiry.isValid() && args.expiry <= now)
        fail(Zel_MemoryErrorCodes::InvalidArgument,
             QStringLiteral("The reservation would end in the past (%1).").arg(args.expiry.toUTC().toString(Qt::ISODate)));
    Reservation& reservation = work.write.edit(node).reservation;
    if (!reservation.isActiveAt(now) || reservation.user != work.user)
        reservation.since = now;
    reservation.user = work.user;
    reservation.until = args.expiry.isValid() ? args.expiry.toUTC() : QDateTime();
    reportUpdated(work, node);
    result.setResult(ok());
}
ZEL_MEMORY_EXECUTE(CreateReservationOp)

void RemoveReservationOp::run(WriteWork& work, const Args& args, Result& result)
{
    const Node& node = work.node(args.moniker);
    if (!isReserved(work.txn, node.reservation))
        fail(Zel_MemoryErrorCodes::NotReserved, QStringLiteral("%1 is not reserved.").arg(work.describe(node)));
    if (node.reservation.user != work.user
        && !(work.permissions(node) & PermOverrideReservation))
        fail(Zel_MemoryErrorCodes::ReservedByOtherUser,
             QStringLiteral("%1 is reserved by \"%2\"; only they (or a user who may override reservations) can release it.")
                 .arg(work.describe(node), node.reservation.user));
    work.write.edit(node).reservation = Reservation();
    reportUpdated(work, node);
    result.setResult(ok());
}
ZEL_MEMORY_EXECUTE(RemoveReservationOp)

// --- Frame locators and restrictions ------------------------------------------

void AddFrameLocatorListOp::run(WriteWork& work, const Args& args, Result& result)
{
    result.succeed(changeMarkers(work, args.moniker, args.markers, false, true));
}
ZEL_MEMORY_EXECUTE(AddFrameLocatorListOp)

void DeleteFrameLocatorListOp::run(WriteWork& work, const Args& args, Result& result)
{
    result.succeed(changeMarkers(work, args.moniker, args.markers, false, false));
}
ZEL_MEMORY_EXECUTE(DeleteFrameLocatorListOp)

void AddFrameRestrictionListOp::run(WriteWork& work, const Args& args, Result& result)
{
    result.succeed(changeMarkers(work, args.moniker, args.markers, true, true));
}
ZEL_MEMORY_EXECUTE(AddFrameRestrictionListOp)

void DeleteFrameRestrictionListOp::run(WriteWork& work, const Args& args, Result& result)
{
    result.succeed(changeMarkers(work, args.moniker, args.markers, true, false));
}
ZEL_MEMORY_EXECUTE(DeleteFrameRestrictionListOp)

} // namespace ZelMemory
