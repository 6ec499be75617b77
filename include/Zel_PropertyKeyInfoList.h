// Zel_PropertyKeyInfoList: property key descriptions indexed three ways.
//
// Each accepted description is stored in three maps: by key, by internal name
// and by display name (ordered by UTF-16 code unit, case-sensitive). The first
// valid description of a key wins: a later one with the same key is ignored,
// silently when its internal and display names agree with the stored one,
// otherwise with a "Duplicate" trace line. An invalid description is stored
// but replaced by the next description with the same key. The by-name maps
// hold the last accepted description that had each name.
//
//     Zel_PropertyKeyInfoList list;
//     list.addIfKeyNotInList(info);
//     Zel_PropertyKeyInfo found = list.findByDisplayName("Tape Name");
//
// Lookups never add entries and return an invalid description when the name
// is absent. Plain value; no lock.
#ifndef ZEL_PROPERTYKEYINFOLIST_H
#define ZEL_PROPERTYKEYINFOLIST_H

#include "zel_export.h"
#include "Zel_PropertyKeyInfo.h"

#include <QMap>
#include <QString>

class ZEL_EXPORT Zel_PropertyKeyInfoList
{
public:
    typedef QMap<QString, Zel_PropertyKeyInfo>::const_iterator const_iterator;

    Zel_PropertyKeyInfoList();
    Zel_PropertyKeyInfoList(const Zel_PropertyKeyInfoList& other);
    Zel_PropertyKeyInfoList& operator=(const Zel_PropertyKeyInfoList& other);
    virtual ~Zel_PropertyKeyInfoList();

    // Adds the description unless a valid one with the same key is stored.
    void addIfKeyNotInList(const Zel_PropertyKeyInfo& info);
    // The same as addIfKeyNotInList.
    void push_back(Zel_PropertyKeyInfo info);

    Zel_PropertyKeyInfo findByKey(const QString& key) const;
    Zel_PropertyKeyInfo findByInternalName(const QString& internalName) const;
    Zel_PropertyKeyInfo findByDisplayName(const QString& displayName) const;

    // Empties all three maps.
    void clear();
    // The number of keys described.
    int size() const;
    bool isEmpty() const;

    // Iterate the descriptions in ascending key order.
    QMap<QString, Zel_PropertyKeyInfo>::const_iterator begin() const;
    QMap<QString, Zel_PropertyKeyInfo>::const_iterator end() const;

    // The descriptions' trace forms in ascending key order, joined by "\n".
    QString toZelString() const;

private:
    QMap<QString, Zel_PropertyKeyInfo> mByKey;
    QMap<QString, Zel_PropertyKeyInfo> mByInternalName;
    QMap<QString, Zel_PropertyKeyInfo> mByDisplayName;
};

#endif
