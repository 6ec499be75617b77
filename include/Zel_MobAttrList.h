// Zel_MobAttrList: an ordered list of attribute changes.
//
// Holds shared pointers to Zel_MobAttr in insertion order, duplicates allowed.
// Copies share the entries with their source; assignment replaces this list's
// entries with the other list's (shared), and assigning a list to itself does
// nothing. A plain value: no locks.
#ifndef ZEL_MOBATTRLIST_H
#define ZEL_MOBATTRLIST_H

#include "zel_export.h"
#include "Zel_MobAttr.h"

#include <QString>
#include <boost/shared_ptr.hpp>

#include <vector>

class Zel_Node;

class ZEL_EXPORT Zel_MobAttrList
{
public:
    Zel_MobAttrList();
    Zel_MobAttrList(const Zel_MobAttrList& other);
    Zel_MobAttrList& operator=(const Zel_MobAttrList& other);
    virtual ~Zel_MobAttrList();

    // Appends a new change made of identifier, node, media object name,
    // attribute key, old value and new value, with type 0.
    void add(const Zel_MobID& mobID,
             boost::shared_ptr<Zel_Node> node,
             const QString& mobName,
             const QString& attrKey,
             const QString& oldVal,
             const QString& newVal);
    unsigned int size() const;
    // The entry at index (shared, not copied); empty when index >= size().
    boost::shared_ptr<Zel_MobAttr> getMobAttr(unsigned long long index) const;

private:
    std::vector<boost::shared_ptr<Zel_MobAttr>> mMobAttrs;
};

#endif
