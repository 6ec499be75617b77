#include "Zel_Property.h"

#include "Zel_PropertyManager.h"

#include <boost/smart_ptr/detail/spinlock_pool.hpp>

boost::weak_ptr<Zel_PropertyManager> Zel_Property::mPropertyManagerWP;

namespace {

// The manager to ask: the argument when given, else the registered one (held
// strongly only while the caller's question runs); empty means "fall back".
inline boost::shared_ptr<Zel_PropertyManager> resolve(boost::shared_ptr<Zel_PropertyManager>& manager)
{
    if (manager)
        return std::move(manager);
    return Zel_Property::getPropertyManagerSP();
}

} // namespace

Zel_Property::Zel_Property() = default;

Zel_Property::Zel_Property(const QString& key, const QString& value, const QString& customValues)
    : mKey(key)
    , mValue(value)
    , mCustomValues(customValues)
{
}

Zel_Property::Zel_Property(const Zel_Property& other) = default;
Zel_Property& Zel_Property::operator=(const Zel_Property& other) = default;
Zel_Property::~Zel_Property() = default;

QString Zel_Property::key() const
{
    return mKey;
}

QString Zel_Property::value() const
{
    return mValue;
}

QString Zel_Property::customValues() const
{
    return mCustomValues;
}

void Zel_Property::setValue(const QString& value)
{
    mValue = value;
}

bool Zel_Property::isEmpty() const
{
    return mKey.isEmpty() && mValue.isEmpty();
}

bool Zel_Property::operator==(const Zel_Property& other) const
{
    return mKey == other.mKey && mValue == other.mValue;
}

bool Zel_Property::operator!=(const Zel_Property& other) const
{
    return !(*this == other);
}

Zel_Property::operator QString() const
{
    // Ask in a fixed order: display name, then internal name.
    const QString display = displayName(boost::shared_ptr<Zel_PropertyManager>());
    const QString internal = internalName(boost::shared_ptr<Zel_PropertyManager>());
    return QStringLiteral("Zel_Property(") + mKey + QLatin1Char(':') + mValue + QLatin1Char(':') + display
        + QLatin1Char(':') + internal + QLatin1Char(')');
}

QString Zel_Property::displayName(boost::shared_ptr<Zel_PropertyManager> manager) const
{
    if (const boost::shared_ptr<Zel_PropertyManager> m = resolve(manager))
        return m->getDisplayName(mKey);
    return QString();
}

QString Zel_Property::internalName(boost::shared_ptr<Zel_PropertyManager> manager) const
{
    if (const boost::shared_ptr<Zel_PropertyManager> m = resolve(manager))
        return m->getInternalName(mKey);
    return QString();
}

bool Zel_Property::isAvailable(boost::shared_ptr<Zel_PropertyManager> manager) const
{
    if (const boost::shared_ptr<Zel_PropertyManager> m = resolve(manager))
        return m->getIsAvailable(mKey);
    return true;
}

bool Zel_Property::isModifiable(boost::shared_ptr<Zel_PropertyManager> manager) const
{
    if (const boost::shared_ptr<Zel_PropertyManager> m = resolve(manager))
        return m->getIsModifiable(mKey);
    return true;
}

bool Zel_Property::isTextSearchable(boost::shared_ptr<Zel_PropertyManager> manager) const
{
    if (const boost::shared_ptr<Zel_PropertyManager> m = resolve(manager))
        return m->getIsTextSearchable(mKey);
    return true;
}

bool Zel_Property::isType(Zel_PropertyKeyType type, boost::shared_ptr<Zel_PropertyManager> manager) const
{
    if (const boost::shared_ptr<Zel_PropertyManager> m = resolve(manager))
        return m->getIsType(type, mKey);
    return true;
}

bool Zel_Property::isResolution(boost::shared_ptr<Zel_PropertyManager> manager) const
{
    return isType(Zel_PropertyKeyType_Resolution, manager)
        || isType(Zel_PropertyKeyType_AlternateResolution, manager);
}

QString Zel_Property::getDisplayName(const QString& key)
{
    if (const boost::shared_ptr<Zel_PropertyManager> m = getPropertyManagerSP())
        return m->getDisplayName(key);
    return QString();
}

QString Zel_Property::getKeyByDisplayName(const QString& displayName)
{
    if (const boost::shared_ptr<Zel_PropertyManager> m = getPropertyManagerSP())
        return m->getKeyByDisplayName(displayName);
    return QString();
}

bool Zel_Property::getHasCustomValues(const QString& key)
{
    if (const boost::shared_ptr<Zel_PropertyManager> m = getPropertyManagerSP())
        return m->getHasCustomValues(key);
    return false;
}

bool Zel_Property::getIsModifiable(const QString& key)
{
    if (const boost::shared_ptr<Zel_PropertyManager> m = getPropertyManagerSP())
        return m->getIsModifiable(key);
    return true;
}

bool Zel_Property::getIsType(Zel_PropertyKeyType type, const QString& key)
{
    if (const boost::shared_ptr<Zel_PropertyManager> m = getPropertyManagerSP())
        return m->getIsType(type, key);
    return true;
}

// Sessions register and clear their managers on their own threads while
// other threads ask questions, so the registration is read and written under
// the spin lock that boost's atomic shared-pointer operations use for the
// same address: a few instructions, no user code and no allocation inside.
void Zel_Property::setPropertyManagerSP(boost::shared_ptr<Zel_PropertyManager> manager)
{
    boost::weak_ptr<Zel_PropertyManager> registration(manager);
    {
        boost::detail::spinlock_pool<2>::scoped_lock lock(&mPropertyManagerWP);
        mPropertyManagerWP.swap(registration);
    }
    // The previous registration is released here, outside the lock.
}

boost::shared_ptr<Zel_PropertyManager> Zel_Property::getPropertyManagerSP()
{
    boost::detail::spinlock_pool<2>::scoped_lock lock(&mPropertyManagerWP);
    return mPropertyManagerWP.lock();
}
