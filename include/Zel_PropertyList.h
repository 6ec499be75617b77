// Zel_PropertyList: an ordered list of properties.
//
// A QList<Zel_Property> in insertion order. Its own adding operations
// (addIfKeyNotInList, addOrUpdate, +=) never add a second element with a key
// already present; the inherited QList operations (append, insert, indexing)
// do not check. Key comparisons are exact and case-sensitive. Plain value.
#ifndef ZEL_PROPERTYLIST_H
#define ZEL_PROPERTYLIST_H

#include "zel_export.h"
#include "Zel_Property.h"

#include <QList>
#include <QString>

class ZEL_EXPORT Zel_PropertyList : public QList<Zel_Property>
{
public:
    Zel_PropertyList();
    Zel_PropertyList(const Zel_PropertyList& other);
    Zel_PropertyList& operator=(const Zel_PropertyList& other);
    virtual ~Zel_PropertyList();

    // A copy of the first element with this key; all-null when there is none.
    Zel_Property findByKey(const QString& key) const;
    // Removes the first element with this key; false when there is none.
    bool eraseByKey(const QString& key);
    // Appends a copy unless an element with the same key is present.
    void addIfKeyNotInList(const Zel_Property& property);
    // Replaces the value of the element with the same key (its custom values
    // and position stay), or appends a copy when there is none.
    void addOrUpdate(const Zel_Property& property);
    // The same as addIfKeyNotInList.
    QList<Zel_Property>& operator+=(const Zel_Property& property);

    // The elements' trace forms joined by "\n"; empty for an empty list.
    operator QString() const;
};

#endif
