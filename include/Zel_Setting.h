// Zel_Setting: one setting, a key/value pair of text.
//
// Dots in the key separate the levels of the settings' XML form (see
// Zel_SettingList::toXML): "General.Language" becomes an element Language
// inside an element General. Comparisons are exact and case-sensitive.
// A plain value: no locks.
#ifndef ZEL_SETTING_H
#define ZEL_SETTING_H

#include "zel_export.h"

#include <QString>

class ZEL_EXPORT Zel_Setting
{
public:
    // Key and value empty.
    Zel_Setting();
    Zel_Setting(const QString& key, const QString& value);
    Zel_Setting(const Zel_Setting& other);
    Zel_Setting& operator=(const Zel_Setting& other);
    virtual ~Zel_Setting();

    QString key() const;
    QString value() const;

    // Keys equal and values equal.
    bool operator==(const Zel_Setting& other) const;
    bool operator!=(const Zel_Setting& other) const;

    // key + ":" + value.
    operator QString() const;

private:
    // The list reads the fields in place while it writes its XML form.
    friend class Zel_SettingList;

    QString mKey;
    QString mValue;
};

#endif
