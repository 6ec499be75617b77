// Zel_PropertyKeyInfo: the server's description of one property key.
//
// Key, display name, internal name, type and four flags (modifiable,
// available, text-searchable, has custom values). A description is valid when
// its key, display name and internal name are all non-empty; a
// default-constructed one is not. Plain value, no setters.
//
// Trace form: "Zel_PropertyKeyInfo(key:display:internal:M:A:type:S:C)" with
// T/F for the flags, e.g. Zel_PropertyKeyInfo(Tape:Tape Name:tape:T:F:3:T:F).
#ifndef ZEL_PROPERTYKEYINFO_H
#define ZEL_PROPERTYKEYINFO_H

#include "zel_export.h"
#include "Zel_PropertyKeyType.h"

#include <QString>

class ZEL_EXPORT Zel_PropertyKeyInfo
{
public:
    // Empty texts, all flags false, type 0: not valid.
    Zel_PropertyKeyInfo();
    Zel_PropertyKeyInfo(const QString& key, const QString& displayName, bool modifiable, bool available,
                        const QString& internalName, Zel_PropertyKeyType type, bool textSearchable,
                        bool hasCustomValues);
    Zel_PropertyKeyInfo(const Zel_PropertyKeyInfo& other);
    Zel_PropertyKeyInfo& operator=(const Zel_PropertyKeyInfo& other);
    virtual ~Zel_PropertyKeyInfo();

    virtual QString toZelString() const;

    const QString& key() const;
    const QString& displayName() const;
    const QString& internalName() const;
    bool isModifiable() const;
    bool isAvailable() const;
    bool isTextSearchable() const;
    bool hasCustomValues() const;
    // True when the stored type equals type.
    bool isType(Zel_PropertyKeyType type) const;
    // The stored type.
    Zel_PropertyKeyType type() const;

    // Key, display name and internal name all non-empty.
    bool isValid() const;

    // All eight fields equal (texts exact, case-sensitive).
    bool operator==(const Zel_PropertyKeyInfo& other) const;
    bool operator!=(const Zel_PropertyKeyInfo& other) const;

private:
    QString mKey;
    QString mDisplayName;
    bool mModifiable;
    bool mAvailable;
    QString mInternalName;
    Zel_PropertyKeyType mType;
    bool mTextSearchable;
    bool mHasCustomValues;
};

#endif
