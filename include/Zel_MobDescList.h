// Zel_MobDescList: an ordered list of media object descriptors.
//
// Holds shared pointers in insertion order, duplicates allowed. Copies share
// the descriptor objects with their source; assignment replaces this list's
// entries with the other list's (shared). Plain value, no lock.
#ifndef ZEL_MOBDESCLIST_H
#define ZEL_MOBDESCLIST_H

#include "zel_export.h"
#include "Zel_MobDesc.h"

#include <boost/shared_ptr.hpp>

#include <vector>

class ZEL_EXPORT Zel_MobDescList
{
public:
    Zel_MobDescList();
    Zel_MobDescList(const Zel_MobDescList& other);
    // Replaces the entries with the other list's (shared); self-assignment does nothing.
    Zel_MobDescList& operator=(const Zel_MobDescList& other);
    virtual ~Zel_MobDescList();

    // Appends a new descriptor equal to desc.
    void add(const Zel_MobDesc& desc);
    // Appends desc itself (shared, not copied).
    void add(boost::shared_ptr<Zel_MobDesc> desc);
    unsigned int size() const;
    // The entry at index; empty when index >= size().
    boost::shared_ptr<Zel_MobDesc> getMobDesc(unsigned long long index) const;

private:
    std::vector<boost::shared_ptr<Zel_MobDesc>> mMobDescs;
};

#endif
