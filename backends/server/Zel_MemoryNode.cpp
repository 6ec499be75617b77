#include "Zel_MemoryNode.h"

#include "rules_p.h"

#include "Zel_MimeTypeSpec.h"

#include <utility>

Zel_MemoryNode::Zel_MemoryNode(const Snapshot& snapshot, const boost::shared_ptr<ZelMemory::Store>& store)
    : Zel_Node(snapshot.nodeID)
    , mSnapshot(snapshot)
    , mStore(store)
    , mProperties(snapshot.properties)
{
    setMoniker(snapshot.moniker);
    setMasterMoniker(snapshot.masterMoniker);
    setParentNodeID(snapshot.parentNodeID);
    setChildrenCount(snapshot.childrenCount);
    setValid(true);
}

Zel_MemoryNode::Zel_MemoryNode(Snapshot&& snapshot, const boost::shared_ptr<ZelMemory::Store>& store)
    : Zel_Node(snapshot.nodeID)
    , mSnapshot(std::move(snapshot))
    , mStore(store)
    , mProperties(mSnapshot.properties)
{
    setMoniker(mSnapshot.moniker);
    setMasterMoniker(mSnapshot.masterMoniker);
    setParentNodeID(mSnapshot.parentNodeID);
    setChildrenCount(mSnapshot.childrenCount);
    setValid(true);
}

Zel_MemoryNode::~Zel_MemoryNode() = default;

bool Zel_MemoryNode::isReserved() const
{
    return !mSnapshot.reservedBy.isEmpty();
}

bool Zel_MemoryNode::isSyncedBin() const
{
    return mSnapshot.syncedProject && mSnapshot.mimeType == QLatin1String("bin");
}

bool Zel_MemoryNode::isSyncedFolder() const
{
    return mSnapshot.syncedProject && Zel_MimeTypeSpec(Zel_MimeTypes_Containers).isType(mSnapshot.mimeType);
}

QString Zel_MemoryNode::getName()
{
    return mSnapshot.name;
}

Zel_Directory Zel_MemoryNode::getPath()
{
    return Zel_Directory(QLatin1Char('/') + mSnapshot.path.join(QLatin1Char('/')), QStringLiteral("/"));
}

Zel_MobID Zel_MemoryNode::getMobID()
{
    return Zel_MobID(mSnapshot.mobID);
}

QString Zel_MemoryNode::getMimeType()
{
    return mSnapshot.mimeType;
}

bool Zel_MemoryNode::isValidDropTarget() const
{
    return mSnapshot.dropTarget;
}

bool Zel_MemoryNode::isUserPlaced() const
{
    return mSnapshot.userPlaced;
}

QString Zel_MemoryNode::getPropertyValue(const QString& key)
{
    return cachedProperties().findByKey(key).value();
}

QDateTime Zel_MemoryNode::getPropertyValueAsDateTime(const QString& key)
{
    const QString text = getPropertyValue(key);
    if (text.isEmpty())
        return QDateTime();
    QDateTime date = QDateTime::fromString(text, Qt::ISODate);
    return date.isValid() ? date : QDateTime();
}

Zel_PropertyList Zel_MemoryNode::getProperties()
{
    return cachedProperties();
}

void Zel_MemoryNode::decacheProperties()
{
    std::lock_guard<std::mutex> lock(mCacheMutex);
    mPropertiesStale = true;
}

QString Zel_MemoryNode::getReservedBy() const
{
    return mSnapshot.reservedBy;
}

QDateTime Zel_MemoryNode::getReservedUntil() const
{
    return mSnapshot.reservedUntil;
}

Zel_PropertyList Zel_MemoryNode::cachedProperties()
{
    {
        std::lock_guard<std::mutex> lock(mCacheMutex);
        if (!mPropertiesStale)
            return mProperties;
    }
    // Read afresh without holding the cache lock while the tree is locked.
    Zel_PropertyList fresh;
    bool found = false;
    if (boost::shared_ptr<ZelMemory::Store> store = mStore.lock()) {
        const std::unique_ptr<ZelMemory::ReadTxn> txn = store->beginRead();
        if (const ZelMemory::Node* node = txn->nodeByMoniker(mSnapshot.moniker)) {
            fresh = ZelMemory::nodeProperties(*txn, *node);
            found = true;
        }
        txn->commit();
    }
    std::lock_guard<std::mutex> lock(mCacheMutex);
    if (found) {
        mProperties = fresh;
        mPropertiesStale = false;
    }
    return mProperties;
}
