// Operations that read the tree: nodes, children, paths, properties,
// permissions, reservations, frame locators and restrictions, search.
#include "ops_p.h"

#include "Zel_AssociationsRes.h"
#include "Zel_ChildrenAtCB.h"
#include "Zel_ChildrenAtMonikerCB.h"
#include "Zel_ChildrenRes.h"
#include "Zel_DirCB.h"
#include "Zel_FrameLocatorListCB.h"
#include "Zel_FrameRestrictionListCB.h"
#include "Zel_GetChildrenRes.h"
#include "Zel_GetLinkedProjectsRes.h"
#include "Zel_GetNodeRes.h"
#include "Zel_GetReservationsRes.h"
#include "Zel_GetSyncedProjRootRes.h"
#include "Zel_MediaResolutionsRes.h"
#include "Zel_MonikerCB.h"
#include "Zel_NodeCB.h"
#include "Zel_NodePermissions.h"
#include "Zel_NodePermissionsRes.h"
#include "Zel_NodeResolutionsRes.h"
#include "Zel_PropertyKeyInfoList.h"
#include "Zel_PropertyListCB.h"
#include "Zel_QueryCB.h"
#include "Zel_RefreshNodeCB.h"
#include "Zel_RootNodeCB.h"

#include "Zel_MimeTypeSpec.h"
#include "Zel_Node.h"
#include "Zel_NodeList.h"

#include <QFileInfo>
#include <boost/make_shared.hpp>
#include <QSet>

#include <vector>

namespace ZelMemory {

boost::shared_ptr<Zel_Error> ok()
{
    return boost::make_shared<Zel_Error>();
}

boost::shared_ptr<QString> sharedText(const QString& text)
{
    return boost::shared_ptr<QString>(new QString(text));
}


std::vector<boost::shared_ptr<Zel_Node>> readableChildren(Work& work, const Node& parent)
{
    // The snapshots are taken in the order the records are stored, then put
    // in node order by keys read once per snapshot (Zel_NodeList::sortByOrder).
    // Where the answer releases its snapshots in order, it gets them in the
    // order taken.
    const SnapshotContext context = childContext(work.txn, &parent, work.user);
    const std::size_t count = static_cast<std::size_t>(work.txn.childCount(parent));
    std::vector<boost::shared_ptr<Zel_Node>> children;
    children.reserve(count);
    if (work.releasedInOrder)
        work.releasedInOrder->reserve(work.releasedInOrder->size() + count);
    work.txn.forEachChild(parent, [&](const Node& child) {
        if (permissionsBelow(context.account, child, context.permissions) & PermRead) {
            children.push_back(work.snapshot(child, context));
            if (work.releasedInOrder)
                work.releasedInOrder->push_back(children.back());
        }
    });
    Zel_NodeList::sortByOrder(children);
    return children;
}

QList<Zel_FrameLocator> markersOf(const Node& node, bool restrictions)
{
    QList<Zel_FrameLocator> list;
    for (const Marker& marker : restrictions ? node.restrictions : node.locators) {
        Zel_FrameLocator locator;
        locator.setID(marker.id);
        for (const auto& property : marker.properties)
            locator.setValue(property.first, property.second);
        list.append(locator);
    }
    return list;
}

namespace {

Zel_NodePermissions permissionsObject(const QString& moniker, std::uint32_t bits)
{
    Zel_NodePermissions p;
    p.setMoniker(sharedText(moniker));
    auto flag = [bits](std::uint32_t bit) { return (bits & bit) != 0; };
    p.setIsOwner(flag(PermOwner));
    p.setIsAdmin(flag(PermAdmin));
    p.setHasSendToPlayback(flag(PermSendToPlayback));
    p.setHasReadAllLogs(flag(PermReadAllLogs));
    p.setHasUseHighResolution(flag(PermUseHighResolution));
    p.setHasUseLowResolution(flag(PermUseLowResolution));
    p.setHasArchiveRestore(flag(PermArchiveRestore));
    p.setHasUserAttributeManagement(flag(PermUserAttributeManagement));
    p.setHasCanCreateColumns(flag(PermCanCreateColumns));
    p.setHasCanModifyColumns(flag(PermCanModifyColumns));
    p.setHasCanModifyPropertiesInAccess(flag(PermCanModifyPropertiesInAccess));
    p.setHasRead(flag(PermRead));
    p.setHasCopy(flag(PermCopy));
    p.setHasAddFiles(flag(PermAddFiles));
    p.setHasAddFolders(flag(PermAddFolders));
    p.setHasWriteAttributes(flag(PermWriteAttributes));
    p.setHasWriteUserAttributes(flag(PermWriteUserAttributes));
    p.setHasWriteNewVersions(flag(PermWriteNewVersions));
    p.setHasCanWriteLocators(flag(PermCanWriteLocators));
    p.setHasCanWriteDRMs(flag(PermCanWriteDRMs));
    p.setHasDeleteAssets(flag(PermDeleteAssets));
    p.setHasDestroyAssets(flag(PermDestroyAssets));
    p.setHasDestroyMedia(flag(PermDestroyMedia));
    p.setHasReserve(flag(PermReserve));
    p.setHasOverrideReservation(flag(PermOverrideReservation));
    p.setHasPermissionsManagement(flag(PermPermissionsManagement));
    p.setHasCanCreateLocators(flag(PermCanCreateLocators));
    p.setHasCanModifyLocators(flag(PermCanModifyLocators));
    p.setHasCanCreateRestrictions(flag(PermCanCreateRestrictions));
    p.setHasCanModifyRestrictions(flag(PermCanModifyRestrictions));
    return p;
}

// The project (or other container) at or above the node that carries a
// synced project GUID, or null.
const Node* syncedProjectOf(ReadTxn& txn, const Node& node)
{
    for (const Node* n = &node; n; n = parentOf(txn, *n)) {
        if (!propertyValue(*n, QStringLiteral("SyncedProject_GUID")).isEmpty())
            return n;
    }
    return nullptr;
}

bool containsText(const QString& haystack, const QString& needle)
{
    return haystack.contains(needle, Qt::CaseInsensitive);
}

bool matchesQuery(ReadTxn& txn, const Node& node, const Zel_QuerySpec& query)
{
    if (node.parentId.isEmpty()) // the root
        return false;
    if (!query.getSelectedTypes().isEmpty() && !query.getSelectedTypes().contains(node.mimeType))
        return false;
    if (!query.getCategories().isEmpty()) {
        const QStringList categories = propertyValue(node, QStringLiteral("Category")).split(QLatin1Char(';'), Qt::SkipEmptyParts);
        bool any = false;
        for (const QString& category : query.getCategories())
            any = any || categories.contains(category, Qt::CaseInsensitive);
        if (!any)
            return false;
    }
    for (const Zel_Property& condition : query.getProperties()) {
        if (!containsText(propertyValue(node, condition.key()), condition.value()))
            return false;
    }
    if (query.getTimeParamAsSeconds() > 0) {
        const QDateTime changed = node.modified.isValid() ? node.modified : node.created;
        if (!changed.isValid() || changed.secsTo(txn.now()) > query.getTimeParamAsSeconds())
            return false;
    }
    const QString text = query.getTextParam();
    if (text.isEmpty())
        return true;
    if (containsText(node.name, text))
        return true;
    for (const Property& p : node.properties) {
        const KeyDesc* key = txn.key(p.key);
        if ((!key || key->textSearchable) && containsText(p.value, text))
            return true;
    }
    auto inMarkers = [&](const QList<Marker>& markers) {
        for (const Marker& m : markers) {
            for (const auto& property : m.properties) {
                if (containsText(property.second, text))
                    return true;
            }
        }
        return false;
    };
    if (query.getSearchTextInLocatorsAndAnnotations() && inMarkers(node.locators))
        return true;
    if (query.getSearchTextInRestrictions() && inMarkers(node.restrictions))
        return true;
    return false;
}

} // namespace

// --- Nodes ----------------------------------------------------------------------

void RootNodeOp::run(Work& work, const Args&, Result& result)
{
    const Node* root = work.txn.root();
    if (!root)
        fail(Zel_MemoryErrorCodes::NotFound, QStringLiteral("The tree has no root."));
    work.require(*root, PermRead, QStringLiteral("read"));
    result.succeed(work.snapshot(*root));
}
ZEL_MEMORY_EXECUTE(RootNodeOp)

void GetNodeOp::run(Work& work, const Args& args, Result& result)
{
    result.setResult(work.snapshot(work.node(args.moniker)), ok());
}
ZEL_MEMORY_EXECUTE(GetNodeOp)

void RefreshNodeOp::run(Work& work, const Args& args, Result& result)
{
    result.succeed(work.snapshot(work.node(args.moniker)));
}
ZEL_MEMORY_EXECUTE(RefreshNodeOp)

void NodeOp::run(Work& work, const Args& args, Result& result)
{
    result.succeed(work.snapshot(work.nodeAtPath(args.path, args.path.isRooted())));
}
ZEL_MEMORY_EXECUTE(NodeOp)

void MonikerOp::run(Work& work, const Args& args, Result& result)
{
    result.succeed(sharedText(work.nodeAtPath(args.path, args.path.isRooted()).moniker));
}
ZEL_MEMORY_EXECUTE(MonikerOp)

void DirOp::run(Work& work, const Args& args, Result& result)
{
    const Node& node = work.node(args.moniker);
    boost::shared_ptr<Zel_Directory> dir(
        new Zel_Directory(QLatin1Char('/') + pathOf(work.txn, node).join(QLatin1Char('/')), QStringLiteral("/")));
    result.succeed(dir);
}
ZEL_MEMORY_EXECUTE(DirOp)

// --- Children ---------------------------------------------------------------------

void GetChildrenOp::run(Work& work, const Args& args, Result& result)
{
    const Node& parent = work.node(args.moniker);
    work.requireFolder(parent);
    // One "no error" record serves every answer: it never reaches a handler.
    const boost::shared_ptr<Zel_Error> success = ok();
    std::vector<boost::shared_ptr<Zel_Node>> children = readableChildren(work, parent);
    result.reserveResults(children.size());
    for (boost::shared_ptr<Zel_Node>& child : children)
        result.setResult(std::move(child), success);
}
ZEL_MEMORY_EXECUTE(GetChildrenOp)

void ChildrenOp::run(Work& work, const Args& args, Result& result)
{
    const Node& parent = work.node(args.moniker);
    work.requireFolder(parent);
    // Each child with its has-children flag.
    const boost::shared_ptr<Zel_Error> success = ok(); // shared, as in GetChildrenOp
    std::vector<boost::shared_ptr<Zel_Node>> children = readableChildren(work, parent);
    result.reserveResults(children.size());
    for (boost::shared_ptr<Zel_Node>& child : children) {
        const bool hasChildren = child->getChildrenCount() > 0;
        result.setResult(std::move(child), false, hasChildren, success);
    }
}
ZEL_MEMORY_EXECUTE(ChildrenOp)

void ChildrenAtOp::run(Work& work, const Args& args, Result& result)
{
    const Node& parent = work.nodeAtPath(args.path, args.path.isRooted());
    work.requireFolder(parent);
    for (const boost::shared_ptr<Zel_Node>& child : readableChildren(work, parent))
        result.succeed(child);
}
ZEL_MEMORY_EXECUTE(ChildrenAtOp)

void ChildrenAtMonikerOp::prepare(const boost::shared_ptr<Callback>& callback, Args& args)
{
    args.callback = callback;
    if (callback)
        callback->setParentMoniker(args.moniker);
}

void ChildrenAtMonikerOp::run(Work& work, const Args& args, Result& result)
{
    const Node& parent = work.node(args.moniker);
    work.requireFolder(parent);
    if (args.callback) {
        const boost::shared_ptr<Zel_ChildrenAtMonikerCB> callback = args.callback;
        const boost::shared_ptr<Zel_Node> snapshot = work.snapshot(parent);
        work.txn.onCommit([callback, snapshot] { callback->setParentNode(snapshot); });
    }
    for (const boost::shared_ptr<Zel_Node>& child : readableChildren(work, parent))
        result.succeed(child);
}
ZEL_MEMORY_EXECUTE(ChildrenAtMonikerOp)

void GetLinkedProjectsOp::run(Work& work, const Args& args, Result& result)
{
    const Node& node = work.node(args.moniker);
    // The linked projects other than the one the node belongs to.
    const Node* own = &node;
    while (own && own->mimeType != QLatin1String("project"))
        own = parentOf(work.txn, *own);
    for (const QString& moniker : work.txn.linkedProjects()) {
        const Node* project = work.txn.nodeByMoniker(moniker);
        if (project && project != own && (work.permissions(*project) & PermRead))
            result.setResult(work.snapshot(*project), ok());
    }
}
ZEL_MEMORY_EXECUTE(GetLinkedProjectsOp)

void GetSyncedProjRootOp::run(Work& work, const Args& args, Result& result)
{
    const Node& node = work.node(args.moniker);
    const Node* root = syncedProjectOf(work.txn, node);
    if (!root)
        fail(Zel_MemoryErrorCodes::NotFound, QStringLiteral("%1 is not in a synced project.").arg(work.describe(node)));
    result.setResult(work.snapshot(*root), ok());
}
ZEL_MEMORY_EXECUTE(GetSyncedProjRootOp)

void AssociationsOp::run(Work& work, const Args& args, Result& result)
{
    const Node& node = work.node(args.moniker);
    // The directories that hold the node's media files, each once.
    QStringList seen;
    for (const Media& media : node.media) {
        const QString dir = QFileInfo(media.path).path();
        if (seen.contains(dir))
            continue;
        seen << dir;
        result.setResult(boost::shared_ptr<Zel_Directory>(new Zel_Directory(dir, QStringLiteral("/"))), ok());
    }
}
ZEL_MEMORY_EXECUTE(AssociationsOp)

void QueryOp::prepare(const boost::shared_ptr<Callback>& callback, Args& args)
{
    if (callback)
        callback->setQuerySpec(args.query);
}

void QueryOp::run(Work& work, const Args& args, Result& result)
{
    if (!args.query)
        fail(Zel_MemoryErrorCodes::InvalidArgument, QStringLiteral("No query specification was given."));
    const Zel_QuerySpec& query = *args.query;
    if (query.getTextParam().isEmpty() && query.getSelectedTypes().isEmpty() && query.getCategories().isEmpty()
        && query.getProperties().isEmpty() && query.getTimeParamAsSeconds() <= 0)
        fail(Zel_MemoryErrorCodes::InvalidArgument, QStringLiteral("The query is empty: give a text, types, categories, properties or a time."));
    QList<boost::shared_ptr<Zel_Node>> found;
    std::vector<const Node*> nodes;
    work.txn.allNodes(nodes);
    for (const Node* node : nodes) {
        if ((work.permissions(*node) & PermRead) && matchesQuery(work.txn, *node, query))
            found.append(work.snapshot(*node));
    }
    Zel_NodeList::sortByOrder(found);
    for (const boost::shared_ptr<Zel_Node>& node : found)
        result.succeed(node);
}
ZEL_MEMORY_EXECUTE(QueryOp)

// --- Properties -------------------------------------------------------------------

void PropertyListOp::run(Work& work, const Args& args, Result& result)
{
    result.succeed(nodeProperties(work.txn, work.node(args.moniker)));
}
ZEL_MEMORY_EXECUTE(PropertyListOp)

void GetPropertiesOp::run(Work& work, const Args& args, Result& result)
{
    const Node& node = work.node(args.moniker);
    const Zel_PropertyList all = nodeProperties(work.txn, node);
    if (args.keys.isEmpty()) {
        result.succeed(all);
        return;
    }
    Zel_PropertyList chosen;
    for (const QString& key : args.keys) {
        const Zel_Property property = all.findByKey(key);
        if (!property.key().isNull())
            chosen.addIfKeyNotInList(property);
        else if (!work.txn.key(key))
            fail(Zel_MemoryErrorCodes::UnknownProperty, QStringLiteral("The server knows no property \"%1\".").arg(key));
        else
            chosen.addIfKeyNotInList(Zel_Property(key, QString(), QString()));
    }
    result.succeed(chosen);
}
ZEL_MEMORY_EXECUTE(GetPropertiesOp)

void MediaResolutionsOp::run(Work& work, const Args&, Result& result)
{
    Zel_PropertyKeyInfoList list;
    for (const Resolution& r : work.txn.resolutions())
        list.addIfKeyNotInList(Zel_PropertyKeyInfo(r.id, r.label, false, true, r.label,
                                                   static_cast<Zel_PropertyKeyType>(r.type), false, false));
    result.setResult(list, ok());
}
ZEL_MEMORY_EXECUTE(MediaResolutionsOp)

void NodeResolutionsOp::run(Work& work, const Args& args, Result& result)
{
    const Node& node = work.node(args.moniker);
    work.requireMedia(node);
    // One answer per media file: the media object and the resolution's label.
    const QList<Resolution> resolutions = work.txn.resolutions();
    for (const Media& media : node.media) {
        QString label = media.resolution;
        for (const Resolution& r : resolutions) {
            if (r.id == media.resolution)
                label = r.label;
        }
        result.setResult(boost::shared_ptr<Zel_MobID>(new Zel_MobID(node.mobId)), sharedText(label), ok());
    }
}
ZEL_MEMORY_EXECUTE(NodeResolutionsOp)

// --- Permissions and reservations -------------------------------------------------

void NodePermissionsOp::run(Work& work, const Args& args, Result& result)
{
    const Node& node = work.node(args.moniker);
    result.setResult(boost::shared_ptr<Zel_NodePermissions>(new Zel_NodePermissions(
                         permissionsObject(node.moniker, work.permissions(node)))),
                     ok());
}
ZEL_MEMORY_EXECUTE(NodePermissionsOp)

void GetUserPriviledgesOp::run(Work& work, const Args& args, Result& result)
{
    const Node& node = work.node(args.moniker);
    if (!work.txn.user(args.user))
        fail(Zel_MemoryErrorCodes::NotFound, QStringLiteral("The server knows no user \"%1\".").arg(args.user));
    if (args.user != work.user)
        work.require(node, PermPermissionsManagement, QStringLiteral("read the privileges of other users on"));
    result.setResult(boost::shared_ptr<Zel_NodePermissions>(new Zel_NodePermissions(
                         permissionsObject(node.moniker, permissionsOf(work.txn, args.user, node)))),
                     ok());
}
ZEL_MEMORY_EXECUTE(GetUserPriviledgesOp)

void GetReservationsOp::run(Work& work, const Args& args, Result& result)
{
    const Node& node = work.node(args.moniker);
    // The holder and the end of the node's reservation; no answer when free
    // (never reserved, released, or expired).
    if (isReserved(work.txn, node.reservation))
        result.setResult(node.reservation.user, node.reservation.until, ok());
}
ZEL_MEMORY_EXECUTE(GetReservationsOp)

// --- Frame locators and restrictions ------------------------------------------

void GetFrameLocatorListOp::run(Work& work, const Args& args, Result& result)
{
    const Node& node = work.node(args.moniker);
    work.requireMedia(node);
    result.succeed(markersOf(node, false));
}
ZEL_MEMORY_EXECUTE(GetFrameLocatorListOp)

void GetFrameRestrictionListOp::run(Work& work, const Args& args, Result& result)
{
    const Node& node = work.node(args.moniker);
    work.requireMedia(node);
    result.succeed(markersOf(node, true));
}
ZEL_MEMORY_EXECUTE(GetFrameRestrictionListOp)

} // namespace ZelMemory
