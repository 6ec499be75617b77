#include "Zel_MemoryPropertyManager.h"

#include <mutex>

Zel_MemoryPropertyManager::Zel_MemoryPropertyManager(const Zel_PropertyKeyInfoList& keys)
    : mKeys(keys)
{
}

Zel_MemoryPropertyManager::~Zel_MemoryPropertyManager() = default;

Zel_PropertyKeyInfo Zel_MemoryPropertyManager::find(const QString& key) const
{
    std::shared_lock<std::shared_mutex> lock(mMutex);
    return mKeys.findByKey(key);
}

QString Zel_MemoryPropertyManager::getDisplayName(const QString& key)
{
    return find(key).displayName();
}

bool Zel_MemoryPropertyManager::getIsModifiable(const QString& key)
{
    const Zel_PropertyKeyInfo info = find(key);
    return info.isValid() ? info.isModifiable() : true;
}

bool Zel_MemoryPropertyManager::getIsAvailable(const QString& key)
{
    const Zel_PropertyKeyInfo info = find(key);
    return info.isValid() ? info.isAvailable() : true;
}

QString Zel_MemoryPropertyManager::getInternalName(const QString& key)
{
    return find(key).internalName();
}

bool Zel_MemoryPropertyManager::getIsType(Zel_PropertyKeyType type, const QString& key)
{
    const Zel_PropertyKeyInfo info = find(key);
    return info.isValid() ? info.isType(type) : true;
}

bool Zel_MemoryPropertyManager::getIsTextSearchable(const QString& key)
{
    const Zel_PropertyKeyInfo info = find(key);
    return info.isValid() ? info.isTextSearchable() : true;
}

bool Zel_MemoryPropertyManager::getHasCustomValues(const QString& key)
{
    const Zel_PropertyKeyInfo info = find(key);
    return info.isValid() && info.hasCustomValues();
}

QStringList Zel_MemoryPropertyManager::getKeys()
{
    std::shared_lock<std::shared_mutex> lock(mMutex);
    QStringList keys;
    for (auto it = mKeys.begin(); it != mKeys.end(); ++it)
        keys << it.key();
    return keys;
}

QString Zel_MemoryPropertyManager::getKeyByDisplayName(const QString& displayName)
{
    std::shared_lock<std::shared_mutex> lock(mMutex);
    return mKeys.findByDisplayName(displayName).key();
}

void Zel_MemoryPropertyManager::addKey(const Zel_PropertyKeyInfo& info)
{
    std::unique_lock<std::shared_mutex> lock(mMutex);
    mKeys.addIfKeyNotInList(info);
}

Zel_PropertyKeyInfoList Zel_MemoryPropertyManager::keys() const
{
    std::shared_lock<std::shared_mutex> lock(mMutex);
    return mKeys;
}
