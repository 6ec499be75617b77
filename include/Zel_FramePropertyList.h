// Zel_FramePropertyList: the ordered key/value texts of a frame locator.
//
// A QList<Zel_FrameProperty> in insertion order. Keys need not be unique, but
// setValue() never adds a second entry for a key; lookups find the first
// property with the key. Two lists are equal when they hold the same
// properties (key and value) the same number of times, in any order.
// A plain value: no locks.
#ifndef ZEL_FRAMEPROPERTYLIST_H
#define ZEL_FRAMEPROPERTYLIST_H

#include "zel_export.h"
#include "Zel_FrameProperty.h"

#include <QList>
#include <QString>

class ZEL_EXPORT Zel_FramePropertyList : public QList<Zel_FrameProperty>
{
public:
    Zel_FramePropertyList();
    Zel_FramePropertyList(const Zel_FramePropertyList& other);
    Zel_FramePropertyList& operator=(const Zel_FramePropertyList& other);
    virtual ~Zel_FramePropertyList();

    // The same properties with the same multiplicities, order ignored.
    virtual bool operator==(const Zel_FramePropertyList& other) const;
    virtual bool operator!=(const Zel_FramePropertyList& other) const;
    // The properties' renderings joined by "\n"; empty for an empty list.
    virtual QString toZelString() const;

    // The value of the first property with this key; empty when there is none.
    QString getValue(QString key) const;
    // Sets the value of the first property with this key, or appends a new
    // property when there is none.
    void setValue(const QString& key, const QString& value);
};

#endif
