// Zel_MobAttr: a change of one named attribute of a media object.
//
// Names the media object by its Zel_MobID and display name, may carry the node
// that represents it, and holds the attribute key with its old and new value.
// The server value starts empty; the backend fills it with setServerValue()
// once the server has answered. The type is the backend's: this library stores
// it and never interprets it (0, AttrTypeDefault, is what
// Zel_MobAttrList::add gives). Trace rendering:
//
//     mobID: M1, key: k, old val : a, new val: b, server val : c
//
// Copies share the node. A plain value: no locks.
#ifndef ZEL_MOBATTR_H
#define ZEL_MOBATTR_H

#include "zel_export.h"
#include "Zel_MobID.h"

#include <QString>
#include <QtGlobal>
#include <boost/shared_ptr.hpp>

class Zel_Node;

class ZEL_EXPORT Zel_MobAttr
{
public:
    // The kind of attribute. Values other than 0 are defined by the backend;
    // the fixed 32-bit underlying type makes every such value a valid AttrType.
    enum AttrType : qint32
    {
        AttrTypeDefault = 0
    };

    // In this order: identifier, node, media object name, attribute key, old
    // value, new value, type. The server value is empty.
    Zel_MobAttr(const Zel_MobID& mobID,
                boost::shared_ptr<Zel_Node> node,
                const QString& mobName,
                const QString& attrKey,
                const QString& oldVal,
                const QString& newVal,
                Zel_MobAttr::AttrType type);
    Zel_MobAttr(const Zel_MobAttr& other);
    Zel_MobAttr& operator=(const Zel_MobAttr& other);
    virtual ~Zel_MobAttr();

    Zel_MobID getMobID() const;
    boost::shared_ptr<Zel_Node> getNodeSP() const;
    QString getMobName() const;
    QString getAttrKey() const;
    QString getOldVal() const;
    QString getNewVal() const;
    QString getServerVal() const;
    Zel_MobAttr::AttrType getType() const;

    void setServerValue(const QString& serverValue);

    // "mobID: <id>, key: <key>, old val : <old>, new val: <new>, server val : <server>";
    // the type, the node and the name are not rendered.
    const QString toZelString() const;

private:
    AttrType mType;
    Zel_MobID mMobID;
    boost::shared_ptr<Zel_Node> mNode;
    QString mAttrKey;
    QString mOldVal;
    QString mNewVal;
    QString mMobName;
    QString mServerVal;
};

#endif
