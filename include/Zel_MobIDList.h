// Zel_MobIDList: an ordered list of media object identifiers.
//
// Holds shared pointers, in insertion order, duplicates allowed, never null.
// Copies share the identifier objects with their source; assignment replaces
// this list's entries with the other list's (shared). Plain value, no lock.
#ifndef ZEL_MOBIDLIST_H
#define ZEL_MOBIDLIST_H

#include "zel_export.h"
#include "Zel_MobID.h"

#include <boost/shared_ptr.hpp>

#include <vector>

class ZEL_EXPORT Zel_MobIDList
{
public:
    Zel_MobIDList();
    Zel_MobIDList(const Zel_MobIDList& other);
    // Replaces the entries with the other list's (shared); self-assignment does nothing.
    Zel_MobIDList& operator=(const Zel_MobIDList& other);
    virtual ~Zel_MobIDList();

    // Appends a new identifier equal to id.
    void add(Zel_MobID id);
    // Erases the first entry equal to id; no match leaves the list unchanged.
    void remove(Zel_MobID id);
    void clear();
    unsigned int size() const;
    // The entry at index (shared, not copied); empty when index >= size().
    boost::shared_ptr<Zel_MobID> getMobID(unsigned long long index) const;

private:
    std::vector<boost::shared_ptr<Zel_MobID>> mMobIDs;
};

#endif
