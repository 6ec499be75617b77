// Zel_Node: one asset in the server's tree (project, bin, clip, sequence, ...).
//
// The base class through which the library and the application see nodes,
// always shared as boost::shared_ptr<Zel_Node>. It stores the node's identity
// (moniker, master moniker, node ID, parent node ID), its child count and a
// validity flag, and answers the predicates and comparisons that follow from
// them and from the mime type. Everything that depends on the server's data
// (name, mime type, properties, path, MobID, dates) is virtual with an empty
// base answer: the backend derives its node class and overrides it. The
// predicates and comparisons call getMimeType, getName, getMoniker, getNodeID
// and sameNode virtually, so the overrides take part.
//
// Identity: two nodes are the same when this node's own ID is non-empty and
// equals the other's, or else when their monikers are equal. Ordering: by
// mime type rank (media, then containers, then the rest), then by name
// ignoring case (toLower), then by exact name, then by moniker.
//
// A node is not synchronised: share it between threads only for reading.
#ifndef ZEL_NODE_H
#define ZEL_NODE_H

#include "zel_export.h"
#include "Zel_Directory.h"
#include "Zel_MobID.h"
#include "Zel_PropertyList.h"

#include <QDateTime>
#include <QString>

class ZEL_EXPORT Zel_Node
{
public:
    // Empty texts, no children, not valid.
    Zel_Node();
    explicit Zel_Node(const QString& nodeID);
    Zel_Node(const Zel_Node& other);
    Zel_Node& operator=(const Zel_Node& other);
    virtual ~Zel_Node();

    // Kind of node, from the mime type: containers ("project", "bin",
    // "folder", "catalog", "workspace", "playbackdevices"), media ("masterclip",
    // "clip", "sequence", ... "stereosubclip") and "Asset".
    virtual bool isFolder() const;
    virtual bool isMedia() const;
    virtual bool isAbstractAsset() const;
    // False here; the backend's node says otherwise.
    virtual bool isReserved() const;
    virtual bool isSyncedBin() const;
    // True when other names the same node (see above); false for a null pointer.
    virtual bool sameNode(const Zel_Node* other) const;
    // False here; the backend's node says otherwise.
    virtual bool isSyncedFolder() const;
    virtual bool isValid() const;

    // Server data: empty here.
    virtual QString getName();
    virtual Zel_Directory getPath();
    virtual Zel_MobID getMobID();
    virtual QString getMimeType();
    // False here; the backend's node says otherwise.
    virtual bool isValidDropTarget() const;
    // True here.
    virtual bool isUserPlaced() const;
    virtual QString getPropertyValue(const QString& key);
    virtual QDateTime getPropertyValueAsDateTime(const QString& key);
    virtual Zel_PropertyList getProperties();
    // Drops cached server data; does nothing here.
    virtual void decacheProperties();

    // Stored identity.
    virtual unsigned long getChildrenCount() const;
    virtual QString getMoniker();
    virtual QString getMasterMoniker();
    virtual QString getNodeID();
    virtual QString getParentNodeID();
    virtual void setNodeID(const QString& nodeID);
    virtual void setParentNodeID(const QString& parentNodeID);
    virtual void setValid(bool valid);

    // sameNode(&other).
    bool operator==(const Zel_Node& other) const;
    bool operator!=(const Zel_Node& other) const;
    // Strict weak ordering: mime type rank, then name without regard to case,
    // then exact name, then moniker.
    bool operator<(const Zel_Node& other) const;
    // Built from < and ==; == is identity, so these need not agree with <.
    bool operator<=(const Zel_Node& other) const;
    bool operator>(const Zel_Node& other) const;
    bool operator>=(const Zel_Node& other) const;

    // The RGB value (0xRRGGBB) of a colour name ("black", "darkred", ...),
    // ignoring case; -1 for an unknown name or a null pointer.
    static int colorFromName(const char* name);

protected:
    virtual void setChildrenCount(unsigned long childrenCount);
    virtual void setMoniker(const QString& moniker);
    virtual void setMasterMoniker(const QString& masterMoniker);

private:
    unsigned long mChildrenCount;
    QString mMoniker;
    QString mMasterMoniker;
    QString mNodeID;
    QString mParentNodeID;
    bool mValid;
};

#endif
