// Zel_MobPropertyChange: a new value for one property of a media object.
//
// Names the media object by its Zel_MobID and display name, may carry the node
// that represents it, and holds the property (Zel_Property), its new value and
// a return property list. The server value starts empty; the backend fills it
// with setServerValue() once the server has answered. Trace rendering:
//
//     mobID: M1, prop: Zel_Property(Tape:T1::), new val: T2, server val : T2
//
// Copies share the node. A plain value: no locks.
#ifndef ZEL_MOBPROPERTYCHANGE_H
#define ZEL_MOBPROPERTYCHANGE_H

#include "zel_export.h"
#include "Zel_MobID.h"
#include "Zel_Property.h"
#include "Zel_PropertyList.h"

#include <QString>
#include <boost/shared_ptr.hpp>

class Zel_Node;

class ZEL_EXPORT Zel_MobPropertyChange
{
public:
    // Empty texts, empty identifier, no node, default property, empty list.
    Zel_MobPropertyChange();
    // In this order: identifier, node, media object name, property, new value,
    // return property list. The server value is empty.
    Zel_MobPropertyChange(const Zel_MobID& mobID,
                          boost::shared_ptr<Zel_Node> node,
                          const QString& mobName,
                          Zel_Property property,
                          const QString& newVal,
                          Zel_PropertyList returnPropertyList);
    Zel_MobPropertyChange(const Zel_MobPropertyChange& other);
    Zel_MobPropertyChange& operator=(const Zel_MobPropertyChange& other);
    virtual ~Zel_MobPropertyChange();

    Zel_MobID getMobID() const;
    boost::shared_ptr<Zel_Node> getNodeSP() const;
    QString getMobName() const;
    Zel_Property getProperty() const;
    QString getNewVal() const;
    Zel_PropertyList getReturnPropertyList() const;
    QString getServerVal() const;

    void setServerValue(const QString& serverValue);

    // "mobID: <id>, prop: <property's text form>, new val: <new>, server val : <server>";
    // the node, the name and the return list are not rendered.
    const QString toZelString() const;

private:
    QString mMobName;
    Zel_MobID mMobID;
    boost::shared_ptr<Zel_Node> mNode;
    Zel_Property mProperty;
    QString mNewVal;
    Zel_PropertyList mReturnPropertyList;
    QString mServerVal;
};

#endif
