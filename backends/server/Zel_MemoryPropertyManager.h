// Zel_MemoryPropertyManager: answers property-key questions for a memory tree.
//
// Built on a Zel_PropertyKeyInfoList of the keys the tree describes; every
// question (display name, internal name, modifiable, type, ...) is a lookup
// in that list. A session registers its tree's manager with
// Zel_Property::setPropertyManagerSP for the session's life. Keys created
// later (Zel_CreatePropertyReq) are added with addKey.
//
// Unknown keys get the library's fallback answers: empty names, true for
// modifiable, available, searchable and type, false for custom values.
// Thread-safe: questions may come from any thread while keys are added.
#ifndef ZEL_MEMORYPROPERTYMANAGER_H
#define ZEL_MEMORYPROPERTYMANAGER_H

#include "zel_memory_export.h"
#include "Zel_PropertyKeyInfoList.h"
#include "Zel_PropertyManager.h"

#include <shared_mutex>

class ZEL_MEMORY_EXPORT Zel_MemoryPropertyManager : public Zel_PropertyManager
{
public:
    explicit Zel_MemoryPropertyManager(const Zel_PropertyKeyInfoList& keys);
    virtual ~Zel_MemoryPropertyManager();

    virtual QString getDisplayName(const QString& key) override;
    virtual bool getIsModifiable(const QString& key) override;
    virtual bool getIsAvailable(const QString& key) override;
    virtual QString getInternalName(const QString& key) override;
    virtual bool getIsType(Zel_PropertyKeyType type, const QString& key) override;
    virtual bool getIsTextSearchable(const QString& key) override;
    virtual bool getHasCustomValues(const QString& key) override;
    virtual QStringList getKeys() override;
    virtual QString getKeyByDisplayName(const QString& displayName) override;

    // Adds a key description (ignored when the key is already described).
    void addKey(const Zel_PropertyKeyInfo& info);
    // A copy of the descriptions.
    Zel_PropertyKeyInfoList keys() const;

private:
    Zel_MemoryPropertyManager(const Zel_MemoryPropertyManager&) = delete;
    Zel_MemoryPropertyManager& operator=(const Zel_MemoryPropertyManager&) = delete;

    Zel_PropertyKeyInfo find(const QString& key) const;

    mutable std::shared_mutex mMutex;
    Zel_PropertyKeyInfoList mKeys;
};

#endif
