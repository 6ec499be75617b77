// Zel_MemoryNode: a node of the in-memory backend's tree.
//
// Every request answers with nodes of this class. A node is a snapshot taken
// while its request held the tree: name, mime type, path, MobID, reservation
// and the predicates reflect the tree as the request saw it, so a node never
// changes under the application's feet. Properties are the exception the
// interface provides for: decacheProperties() drops them, and the next
// getProperties() or getPropertyValue() reads them afresh from the store the
// node came from (if the node still exists there).
//
// getProperties() lists "Name", "Mime Type" and "MobID" (media only), then the
// stored properties, then "Locked By" and "Locked On" while the node is
// reserved. Dates are ISO 8601 texts; getPropertyValueAsDateTime reads them.
//
// Threads: the snapshot is immutable; the property cache has its own mutex,
// so a node may be read from several threads. Node ordering takes no lock.
#ifndef ZEL_MEMORYNODE_H
#define ZEL_MEMORYNODE_H

#include "zel_memory_export.h"
#include "Zel_Node.h"

#include <QDateTime>
#include <QString>
#include <QStringList>
#include <boost/shared_ptr.hpp>
#include <boost/weak_ptr.hpp>

#include <mutex>

namespace ZelMemory {
class Store;
}

class ZEL_MEMORY_EXPORT Zel_MemoryNode : public Zel_Node
{
public:
    // The snapshot a request takes of one node.
    struct Snapshot {
        QString moniker;
        QString masterMoniker;
        QString nodeID;
        QString parentNodeID;
        unsigned long childrenCount = 0;
        QString name;
        QString mimeType;
        QString mobID;
        QStringList path; // names below the root, the node's own last
        QString reservedBy;
        QDateTime reservedSince;
        QDateTime reservedUntil;
        bool syncedProject = false; // below (or at) a synced project
        bool userPlaced = true;
        bool dropTarget = false; // a container the user may add to
        Zel_PropertyList properties;
    };

    Zel_MemoryNode(const Snapshot& snapshot, const boost::shared_ptr<ZelMemory::Store>& store);
    // The same, taking the snapshot over.
    Zel_MemoryNode(Snapshot&& snapshot, const boost::shared_ptr<ZelMemory::Store>& store);
    virtual ~Zel_MemoryNode();

    virtual bool isReserved() const override;
    virtual bool isSyncedBin() const override;
    virtual bool isSyncedFolder() const override;
    virtual QString getName() override;
    virtual Zel_Directory getPath() override;
    virtual Zel_MobID getMobID() override;
    virtual QString getMimeType() override;
    virtual bool isValidDropTarget() const override;
    virtual bool isUserPlaced() const override;
    virtual QString getPropertyValue(const QString& key) override;
    virtual QDateTime getPropertyValueAsDateTime(const QString& key) override;
    virtual Zel_PropertyList getProperties() override;
    virtual void decacheProperties() override;

    // The user holding the reservation (empty when not reserved) and its end.
    QString getReservedBy() const;
    QDateTime getReservedUntil() const;

private:
    Zel_MemoryNode(const Zel_MemoryNode&) = delete;
    Zel_MemoryNode& operator=(const Zel_MemoryNode&) = delete;

    Zel_PropertyList cachedProperties();

    const Snapshot mSnapshot;
    const boost::weak_ptr<ZelMemory::Store> mStore;
    mutable std::mutex mCacheMutex;
    Zel_PropertyList mProperties;
    bool mPropertiesStale = false;
};

#endif
