// Zel_MobID: the identifier of a media object on the server.
//
// An opaque text (never parsed, normalised or validated). Equality is exact;
// ordering compares UTF-16 code units by value (no locale, no case folding),
// shorter prefix first, so equality and ordering agree and a Zel_MobID can key
// ordered maps and sets. Plain value.
#ifndef ZEL_MOBID_H
#define ZEL_MOBID_H

#include "zel_export.h"

#include <QString>

class ZEL_EXPORT Zel_MobID
{
public:
    // An identifier with empty text.
    Zel_MobID();
    Zel_MobID(const QString& id);
    Zel_MobID(const Zel_MobID& other);
    Zel_MobID& operator=(const Zel_MobID& other);
    virtual ~Zel_MobID();

    bool operator==(const Zel_MobID& other) const;
    bool operator!=(const Zel_MobID& other) const;
    bool operator<(const Zel_MobID& other) const;

    // True when the text has no characters (null or empty).
    bool isEmpty() const;
    // The identifier text itself.
    const QString& toZelString() const;

private:
    QString mID;
};

#endif
