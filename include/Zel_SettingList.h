// Zel_SettingList: an ordered list of settings with an XML form.
//
// A QList<Zel_Setting> in insertion order, which is also the order of the XML
// form. toXML() renders the list as an XML document in which a dotted key
// becomes nested elements: intermediate levels are shared between keys with a
// common prefix, the last level is always a new element (a key given twice
// gives two sibling elements). The root carries "version" ("1.0"),
// "modifydate" (local time as Qt 5's Qt::TextDate writes it, with the system
// locale's short day and month names, in both Qt builds) and "modifydateInt"
// (seconds since 1970-01-01 00:00 UTC):
//
//     Zel_SettingList list;
//     list.append(Zel_Setting("General.Language", "en"));
//     list.append(Zel_Setting("Recent", QString()));
//     QString xml = list.toXML("Settings");
//     // <Settings version="1.0" modifydate="..." modifydateInt="...">
//     //  <General>
//     //   <Language>en</Language>
//     //  </General>
//     //  <Recent></Recent>
//     // </Settings>
//
// The output is always well-formed: a setting whose key is empty, has more
// than 64 levels (dot-separated parts) or yields an element name that is not
// a valid XML name is left out (the last two with a trace line), as is the
// value of a key ending in "."; characters that XML 1.0 cannot carry are
// removed from values; an invalid root name gives an empty text. Element names
// are limited to those that both Qt 5's and Qt 6's DOM read back unchanged:
// the XML 1.0 Appendix B letters, digits and marks of the Basic Multilingual
// Plane less five that Qt 5 refuses (U+00B7, U+0387, U+06DD, U+06DE, U+212E),
// '_', '-' and '.' (not first), never ':'. The process-wide QDom settings are
// untouched. The text is exactly what QDomDocument::toString(1) of this Qt
// build writes for the same tree (attribute order, escaping, layout), though
// it is written directly, in time linear in the size of the list however wide
// the tree. A plain value: no locks.
#ifndef ZEL_SETTINGLIST_H
#define ZEL_SETTINGLIST_H

#include "zel_export.h"
#include "Zel_Setting.h"

#include <QList>
#include <QString>

class QDateTime;

class ZEL_EXPORT Zel_SettingList : public QList<Zel_Setting>
{
public:
    Zel_SettingList();
    Zel_SettingList(const Zel_SettingList& other);
    Zel_SettingList& operator=(const Zel_SettingList& other);
    virtual ~Zel_SettingList();

    // A copy of the first element with this key (exact, case-sensitive); a
    // setting with empty key and value when there is none.
    Zel_Setting findByKey(const QString& key) const;
    // Appends the setting unless an element with the same key is present.
    void addIfKeyNotInList(Zel_Setting setting);

    // The elements' text forms (key:value) joined by "\n"; empty for an empty list.
    operator QString() const;

    // The XML document, stamped with the current time; indent of one blank
    // per level, no XML declaration. Empty when rootName is not a valid name.
    const QString toXML(const QString& rootName) const;
    // The same, stamped with the given moment (the current time when the
    // moment is invalid).
    const QString toXML(const QString& rootName, const QDateTime& modifyDate) const;
};

#endif
