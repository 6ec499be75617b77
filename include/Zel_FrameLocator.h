// Zel_FrameLocator: a marker on a frame of a media asset.
//
// Its content is an open set of key/value texts (the inherited frame
// properties) plus an identifier. Locators compare two ways:
//   - operator== is identity: the identifiers are equal, properties ignored;
//   - isEquivalent() is content: every key of either locator has the same
//     value in the other (a missing key reads as an empty value, and a key
//     held twice with different values is never equivalent), identifiers
//     ignored.
//
//     Zel_FrameLocator marker;
//     marker.setID("L1");
//     marker.setValue("Color", "red");
//
// A plain value: no locks.
#ifndef ZEL_FRAMELOCATOR_H
#define ZEL_FRAMELOCATOR_H

#include "zel_export.h"
#include "Zel_FramePropertyList.h"

#include <QString>

class ZEL_EXPORT Zel_FrameLocator : public Zel_FramePropertyList
{
public:
    // No properties, empty identifier.
    Zel_FrameLocator();
    Zel_FrameLocator(const Zel_FrameLocator& other);
    Zel_FrameLocator& operator=(const Zel_FrameLocator& other);
    virtual ~Zel_FrameLocator();

    // Comparing with a plain property list compares the properties.
    using Zel_FramePropertyList::operator==;
    using Zel_FramePropertyList::operator!=;
    // Identifiers equal; the properties are not compared.
    virtual bool operator==(const Zel_FrameLocator& other) const;
    // The negation of other == *this.
    virtual bool operator!=(const Zel_FrameLocator& other) const;

    const QString& getID() const;
    void setID(const QString& id);

    // Same content: identifiers are not compared.
    bool isEquivalent(const Zel_FrameLocator& other) const;

private:
    QString mID;
};

#endif
