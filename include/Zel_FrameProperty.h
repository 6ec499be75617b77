// Zel_FrameProperty: one key/value text of a frame locator.
//
// The key is fixed at construction (only assignment changes it); the value can
// be replaced. Comparisons are exact and case-sensitive. A plain value: no locks.
#ifndef ZEL_FRAMEPROPERTY_H
#define ZEL_FRAMEPROPERTY_H

#include "zel_export.h"

#include <QString>

class ZEL_EXPORT Zel_FrameProperty
{
public:
    explicit Zel_FrameProperty(QString key = QString(), QString value = QString());
    Zel_FrameProperty(const Zel_FrameProperty& other);
    Zel_FrameProperty& operator=(const Zel_FrameProperty& other);
    virtual ~Zel_FrameProperty();

    QString key() const;
    QString value() const;
    void setValue(const QString& value);

    // Keys equal and values equal.
    bool operator==(const Zel_FrameProperty& other) const;
    bool operator!=(const Zel_FrameProperty& other) const;

    // "Zel_FrameProperty - key(<key>) value(<value>)".
    QString toZelString() const;

private:
    QString mKey;
    QString mValue;
};

#endif
