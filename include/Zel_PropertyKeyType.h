// Zel_PropertyKeyType: the type of a property key, a 32-bit value.
//
// The library gives meaning to three values only: 0 is the type of a
// default-constructed key description (Zel_PropertyKeyInfo), and 2 and 3 are
// the two resolution types (Zel_Property::isResolution is true for either).
// Every other value is defined by the server and passed through unchanged:
// the enumeration has a fixed 32-bit underlying type, so any such value can
// be held with static_cast<Zel_PropertyKeyType>(n).
#ifndef ZEL_PROPERTYKEYTYPE_H
#define ZEL_PROPERTYKEYTYPE_H

#include <QtGlobal>

enum Zel_PropertyKeyType : qint32
{
    Zel_PropertyKeyType_None = 0,
    Zel_PropertyKeyType_Resolution = 2,
    Zel_PropertyKeyType_AlternateResolution = 3
};

#endif
