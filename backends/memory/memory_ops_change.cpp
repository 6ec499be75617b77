// Operations that change the tree: create, rename, move, copy, delete,
// properties, dependencies, reservations, frame locators and restrictions.
//
// Each validates everything under the exclusive hold before it changes the
// first record, reports its changes through the hold (published to the
// sessions' listeners after the hold is released), and answers with snapshots
// taken after the change.
#include "memory_ops_p.h"

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
    const Node* parent = work.tree.parentOf(node);
    if (!parent)
        fail(Zel_MemoryErrorCodes::InvalidTarget, QStringLiteral("The root %1 cannot be %2.").arg(work.describe(node), action));
    return *parent;
}

// A fresh node record (not yet in the tree).
Node newNode(Work& work, const QString& name, const QString& mimeType)
{
    Node node;
    node.id = work.tree.newNodeId();
    node.moniker = monikerOfId(node.id);
    node.name = name;
    node.mimeType = mimeType;
    node.created = node.modified = QDateTime::currentDateTimeUtc();
    node.properties.append(Property{QStringLiteral("Created By"), work.user, QString()});
    if (Zel_MimeTypeSpec(Zel_MimeTypes_Media).isType(mimeType))
        node.mobId = work.tree.newMobId();
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

Node& createFolder(Work& work, WriteHold& hold, const boost::shared_ptr<QString>& parentMoniker, QString name, bool unique)
{
    Node& parent = work.node(parentMoniker);
    work.requireFolder(parent);
    work.require(parent, PermAddFolders, QStringLiteral("add folders to"));
    work.requireNotReservedByOther(parent, QStringLiteral("add to"), false);
    work.requireAssetName(name);
    requireDepth(work, parent, 0);
    if (unique)
        name = work.tree.uniqueChildName(parent, name);
    else
        work.requireFreeName(parent, name);
    Node& created = work.tree.insertNode(newNode(work, name, folderTypeFor(parent)), parent);
    hold.added(parent.moniker, created.moniker);
    return created;
}

Node& renameNode(Work& work, WriteHold& hold, const boost::shared_ptr<QString>& moniker, QString name, bool unique)
{
    Node& node = work.node(moniker);
    const Node& parent = parentOrFail(work, node, QStringLiteral("renamed"));
    work.require(node, PermWriteAttributes, QStringLiteral("rename"));
    work.requireNotReservedByOther(node, QStringLiteral("rename"), false);
    work.requireAssetName(name);
    if (name == node.name)
        return node;
    if (unique)
        name = work.tree.uniqueChildName(parent, name);
    else
        work.requireFreeName(parent, name, &node);
    work.tree.rename(node, name);
    node.modified = QDateTime::currentDateTimeUtc();
    hold.updated(parent.moniker, node.moniker);
    return node;
}

// The records of the subtree at node, node first, then depth first with
// children in order (no recursion).
void collectSubtree(const Tree& tree, const Node& node, QList<const Node*>& out)
{
    std::vector<const Node*> pending{&node};
    while (!pending.empty()) {
        const Node* n = pending.back();
        pending.pop_back();
        out.append(n);
        for (int i = n->children.size() - 1; i >= 0; --i) {
            if (const Node* child = tree.byId(n->children.at(i)))
                pending.push_back(child);
        }
    }
}

// Adds or removes frame locators (restrictions = false) or restrictions.
QList<Zel_FrameLocator> changeMarkers(Work& work, const boost::shared_ptr<QString>& moniker,
                                      const QList<Zel_FrameLocator>& given, bool restrictions, bool add)
{
    WriteHold hold(work.tree);
    Node& node = work.node(moniker);
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

    QList<Marker>& markers = restrictions ? node.restrictions : node.locators;
    QList<Marker> updated = markers;
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
    markers = updated;
    node.modified = QDateTime::currentDateTimeUtc();
    if (const Node* parent = work.tree.parentOf(node))
        hold.updated(parent->moniker, node.moniker);
    return markersOf(node, restrictions);
}

} // namespace

void requireDepth(Work& work, const Node& parent, int height)
{
    const int deepest = work.tree.depthOf(parent) + 1 + height;
    if (deepest > MaxDepth)
        fail(Zel_MemoryErrorCodes::TooDeep,
             QStringLiteral("Nodes added to %1 would lie %2 levels below the root; the server allows at most %3.")
                 .arg(work.describe(parent))
                 .arg(deepest)
                 .arg(MaxDepth));
}

// --- Creating -------------------------------------------------------------------

void CreateFolderOp::run(Work& work, const Args& args, Result& result)
{
    WriteHold hold(work.tree);
    result.succeed(work.snapshot(createFolder(work, hold, args.parent, args.name, false)));
}
ZEL_MEMORY_EXECUTE(CreateFolderOp)

void CreateFolderUniqueOp::run(Work& work, const Args& args, Result& result)
{
    WriteHold hold(work.tree);
    result.setResult(work.snapshot(createFolder(work, hold, args.parent, args.name, true)), ok());
}
ZEL_MEMORY_EXECUTE(CreateFolderUniqueOp)

void CreateNodeUniqueOp::run(Work& work, const Args& args, Result& result)
{
    WriteHold hold(work.tree);
    Node& parent = work.node(args.parent);
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
    Node node = newNode(work, work.tree.uniqueChildName(parent, args.name), mimeType);
    for (const Zel_Property& property : args.properties) {
        const QString key = property.key();
        if (key == QLatin1String("Mime Type") || key == QLatin1String("Name"))
            continue;
        if (key == QLatin1String("MobID")) {
            if (!property.value().isEmpty()) {
                // A media object ID names one node on the server.
                if (const Node* owner = work.tree.byMobId(property.value()))
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
    Node& created = work.tree.insertNode(std::move(node), parent);
    hold.added(parent.moniker, created.moniker);
    result.setResult(work.snapshot(created), ok());
}
ZEL_MEMORY_EXECUTE(CreateNodeUniqueOp)

// --- Renaming, moving, copying ------------------------------------------------------

void RenameNodeOp::run(Work& work, const Args& args, Result& result)
{
    WriteHold hold(work.tree);
    result.succeed(work.snapshot(renameNode(work, hold, args.moniker, args.name, false)));
}
ZEL_MEMORY_EXECUTE(RenameNodeOp)

void RenameUniqueOp::run(Work& work, const Args& args, Result& result)
{
    WriteHold hold(work.tree);
    result.setResult(work.snapshot(renameNode(work, hold, args.moniker, args.name, true)), ok());
}
ZEL_MEMORY_EXECUTE(RenameUniqueOp)

void MoveNodeOp::run(Work& work, const Args& args, Result& result)
{
    WriteHold hold(work.tree);
    Node& node = work.node(args.moniker);
    const Node& oldParent = parentOrFail(work, node, QStringLiteral("moved"));
    Node& destination = work.node(args.destination);
    work.requireFolder(destination);
    if (work.tree.isSelfOrAncestor(node, destination))
        fail(Zel_MemoryErrorCodes::InvalidTarget,
             QStringLiteral("%1 cannot be moved into itself or below itself.").arg(work.describe(node)));
    work.require(node, PermDeleteAssets, QStringLiteral("move"));
    work.require(destination, addPermissionFor(node.mimeType), QStringLiteral("move nodes into"));
    work.requireNotReservedByOther(node, QStringLiteral("move"));
    work.requireNotReservedByOther(destination, QStringLiteral("move into"), false);
    if (oldParent.id != destination.id) {
        work.requireFreeName(destination, node.name);
        requireDepth(work, destination, work.tree.heightOf(node));
        const QString oldParentMoniker = oldParent.moniker;
        work.tree.detach(node);
        work.tree.attach(node, destination);
        node.modified = QDateTime::currentDateTimeUtc();
        hold.removed(oldParentMoniker, node.moniker);
        hold.added(destination.moniker, node.moniker);
    }
    result.succeed(work.snapshot(node));
}
ZEL_MEMORY_EXECUTE(MoveNodeOp)

void CopyNodeOp::run(Work& work, const Args& args, Result& result)
{
    WriteHold hold(work.tree);
    const Node& source = work.node(args.moniker);
    parentOrFail(work, source, QStringLiteral("copied"));
    Node& destination = work.node(args.destination);
    work.requireFolder(destination);
    if (work.tree.isSelfOrAncestor(source, destination))
        fail(Zel_MemoryErrorCodes::InvalidTarget,
             QStringLiteral("%1 cannot be copied into itself or below itself.").arg(work.describe(source)));
    work.require(source, PermCopy, QStringLiteral("copy"));
    work.require(destination, addPermissionFor(source.mimeType), QStringLiteral("copy nodes into"));
    work.requireNotReservedByOther(destination, QStringLiteral("copy into"), false);
    requireDepth(work, destination, work.tree.heightOf(source));
    QList<const Node*> subtree;
    collectSubtree(work.tree, source, subtree);
    const unsigned long total = static_cast<unsigned long>(subtree.size());
    const QString name = work.tree.uniqueChildName(destination, source.name);
    const Node& copy = work.tree.copySubtree(source, destination, name);
    hold.added(destination.moniker, copy.moniker);
    result.call([total](Zel_CopyNodeCB& cb) { cb.progress(total, total); });
    result.succeed(work.snapshot(source), work.snapshot(copy));
}
ZEL_MEMORY_EXECUTE(CopyNodeOp)

// --- Deleting --------------------------------------------------------------------

void DeleteNodeOp::run(Work& work, const Args& args, Result& result)
{
    WriteHold hold(work.tree);
    const Node& node = work.node(args.moniker);
    const Node& parent = parentOrFail(work, node, QStringLiteral("deleted"));
    work.require(node, PermDeleteAssets, QStringLiteral("delete"));
    work.requireNotReservedByOther(node, QStringLiteral("delete"));
    const QString parentMoniker = parent.moniker;
    const QString moniker = node.moniker;
    work.tree.removeSubtree(node.id, nullptr);
    hold.removed(parentMoniker, moniker);
    result.setResult(true, ok());
}
ZEL_MEMORY_EXECUTE(DeleteNodeOp)

void DeleteOp::run(Work& work, const Args& args, Result& result)
{
    if (args.monikers.isEmpty())
        fail(Zel_MemoryErrorCodes::InvalidArgument, QStringLiteral("No assets to delete were given."));
    WriteHold hold(work.tree);
    long assets = 0;
    long records = 0;
    // Each asset on its own: one that cannot be deleted is reported and left
    // as it is, the others go.
    for (const QString& moniker : args.monikers) {
        try {
            const Node& node = work.node(sharedText(moniker));
            const Node& parent = parentOrFail(work, node, QStringLiteral("deleted"));
            work.require(node, PermDeleteAssets, QStringLiteral("delete"));
            work.requireNotReservedByOther(node, QStringLiteral("delete"));

            QList<const Node*> subtree;
            collectSubtree(work.tree, node, subtree);
            for (const Node* n : subtree) {
                if (n->mobId.isEmpty())
                    continue;
                const boost::shared_ptr<Zel_MobID> mob(new Zel_MobID(n->mobId));
                if (args.remoteMedia && !n->media.isEmpty()) {
                    if (work.tree.permissionsOf(work.user, *n) & PermDestroyMedia) {
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
            QStringList removed;
            work.tree.removeSubtree(node.id, &removed);
            hold.removed(parentMoniker, nodeMoniker);
            ++assets;
            records += removed.size();
        } catch (const Failure& failure) {
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

void SetPropertiesOp::run(Work& work, const Args& args, Result& result)
{
    WriteHold hold(work.tree);
    Node& node = work.node(args.moniker);
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
        const KeyDesc* desc = work.tree.key(key);
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
            const QString now = work.tree.propertyValue(node, property.key());
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
    for (const Zel_Property& property : args.properties) {
        bool replaced = false;
        for (Property& p : node.properties) {
            if (p.key == property.key()) {
                p.value = property.value();
                replaced = true;
            }
        }
        if (!replaced)
            node.properties.append(Property{property.key(), property.value(), QString()});
    }
    node.modified = QDateTime::currentDateTimeUtc();
    if (const Node* parent = work.tree.parentOf(node))
        hold.updated(parent->moniker, node.moniker);
    result.succeed(work.snapshot(node));
}
ZEL_MEMORY_EXECUTE(SetPropertiesOp)

void CreatePropertyOp::run(Work& work, const Args& args, Result& result)
{
    WriteHold hold(work.tree);
    Node& node = work.node(args.moniker);
    const QString key = args.property.key();
    if (!work.session.isValidPropertyName(key))
        fail(Zel_MemoryErrorCodes::InvalidName,
             QStringLiteral("The session rejects the property name \"%1\": it needs a letter, digit or underscore.").arg(key));
    if (key == QLatin1String("Name") || key == QLatin1String("Mime Type") || key == QLatin1String("MobID")
        || !work.tree.propertyValue(node, key).isNull())
        fail(Zel_MemoryErrorCodes::PropertyExists, QStringLiteral("%1 already has the property \"%2\".").arg(work.describe(node), key));
    work.require(node, PermWriteUserAttributes, QStringLiteral("add properties to"));
    const bool newKey = work.tree.key(key) == nullptr;
    if (newKey)
        work.require(node, PermCanCreateColumns, QStringLiteral("create the new property key \"%1\" on").arg(key));
    work.requireNotReservedByOther(node, QStringLiteral("change"), false);
    if (newKey) {
        KeyDesc desc;
        desc.key = key;
        desc.displayName = key;
        desc.internalName = key.toLower().replace(QLatin1Char(' '), QLatin1Char('_'));
        desc.hasCustomValues = !args.property.customValues().isEmpty();
        work.tree.keys.append(desc);
        work.tree.propertyManager->addKey(keyInfo(desc));
    }
    node.properties.append(Property{key, args.property.value(), args.property.customValues()});
    node.modified = QDateTime::currentDateTimeUtc();
    if (const Node* parent = work.tree.parentOf(node))
        hold.updated(parent->moniker, node.moniker);
    result.succeed(keyInfo(*work.tree.key(key)));
}
ZEL_MEMORY_EXECUTE(CreatePropertyOp)

void AddDependencyOp::run(Work& work, const Args& args, Result& result)
{
    WriteHold hold(work.tree);
    Node& node = work.node(args.moniker);
    work.require(node, PermWriteAttributes, QStringLiteral("add dependencies to"));
    work.requireNotReservedByOther(node, QStringLiteral("change"), false);
    QList<Dependency> added;
    for (const boost::shared_ptr<Zel_Dependency>& dependency : args.dependencies) {
        if (!dependency || !dependency->getMoniker() || dependency->getMoniker()->isEmpty())
            fail(Zel_MemoryErrorCodes::InvalidArgument, QStringLiteral("A dependency without a moniker was given."));
        const QString moniker = *dependency->getMoniker();
        if (!work.tree.byMoniker(moniker))
            fail(Zel_MemoryErrorCodes::UnknownMoniker,
                 QStringLiteral("No node has the moniker \"%1\" (named as a dependency).").arg(moniker));
        added.append(Dependency{moniker, dependency->getUsage(), static_cast<int>(dependency->getType())});
    }
    for (const Dependency& dependency : added) {
        bool known = false;
        for (const Dependency& existing : node.dependencies)
            known = known || (existing.moniker == dependency.moniker && existing.usage == dependency.usage);
        if (!known)
            node.dependencies.append(dependency);
    }
    Zel_DependencySPList all;
    for (const Dependency& d : node.dependencies)
        all.append(boost::shared_ptr<Zel_Dependency>(new Zel_Dependency(
            sharedText(d.moniker), d.usage, static_cast<Zel_Dependency::Zel_DependencyType>(d.type))));
    if (!added.isEmpty()) {
        node.modified = QDateTime::currentDateTimeUtc();
        if (const Node* parent = work.tree.parentOf(node))
            hold.updated(parent->moniker, node.moniker);
    }
    result.setResult(work.snapshot(node), all, ok());
}
ZEL_MEMORY_EXECUTE(AddDependencyOp)

// --- Reservations ----------------------------------------------------------------

void CreateReservationOp::run(Work& work, const Args& args, Result& result)
{
    WriteHold hold(work.tree);
    Node& node = work.node(args.moniker);
    work.require(node, PermReserve, QStringLiteral("reserve"));
    work.requireNotReservedByOther(node, QStringLiteral("reserve"), false);
    const QDateTime now = QDateTime::currentDateTimeUtc();
    if (args.expiry.isValid() && args.expiry <= now)
        fail(Zel_MemoryErrorCodes::InvalidArgument,
             QStringLiteral("The reservation would end in the past (%1).").arg(args.expiry.toUTC().toString(Qt::ISODate)));
    if (!node.reservation.isActive() || node.reservation.user != work.user)
        node.reservation.since = now;
    node.reservation.user = work.user;
    node.reservation.until = args.expiry.isValid() ? args.expiry.toUTC() : QDateTime();
    if (const Node* parent = work.tree.parentOf(node))
        hold.updated(parent->moniker, node.moniker);
    result.setResult(ok());
}
ZEL_MEMORY_EXECUTE(CreateReservationOp)

void RemoveReservationOp::run(Work& work, const Args& args, Result& result)
{
    WriteHold hold(work.tree);
    Node& node = work.node(args.moniker);
    if (!node.reservation.isActive())
        fail(Zel_MemoryErrorCodes::NotReserved, QStringLiteral("%1 is not reserved.").arg(work.describe(node)));
    if (node.reservation.user != work.user
        && !(work.tree.permissionsOf(work.user, node) & PermOverrideReservation))
        fail(Zel_MemoryErrorCodes::ReservedByOtherUser,
             QStringLiteral("%1 is reserved by \"%2\"; only they (or a user who may override reservations) can release it.")
                 .arg(work.describe(node), node.reservation.user));
    node.reservation = Reservation();
    if (const Node* parent = work.tree.parentOf(node))
        hold.updated(parent->moniker, node.moniker);
    result.setResult(ok());
}
ZEL_MEMORY_EXECUTE(RemoveReservationOp)

// --- Frame locators and restrictions ------------------------------------------

void AddFrameLocatorListOp::run(Work& work, const Args& args, Result& result)
{
    result.succeed(changeMarkers(work, args.moniker, args.markers, false, true));
}
ZEL_MEMORY_EXECUTE(AddFrameLocatorListOp)

void DeleteFrameLocatorListOp::run(Work& work, const Args& args, Result& result)
{
    result.succeed(changeMarkers(work, args.moniker, args.markers, false, false));
}
ZEL_MEMORY_EXECUTE(DeleteFrameLocatorListOp)

void AddFrameRestrictionListOp::run(Work& work, const Args& args, Result& result)
{
    result.succeed(changeMarkers(work, args.moniker, args.markers, true, true));
}
ZEL_MEMORY_EXECUTE(AddFrameRestrictionListOp)

void DeleteFrameRestrictionListOp::run(Work& work, const Args& args, Result& result)
{
    result.succeed(changeMarkers(work, args.moniker, args.markers, true, false));
}
ZEL_MEMORY_EXECUTE(DeleteFrameRestrictionListOp)

} // namespace ZelMemory
