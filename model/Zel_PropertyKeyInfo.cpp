#include "Zel_PropertyKeyInfo.h"

namespace {

inline QLatin1Char flag(bool value)
{
    return QLatin1Char(value ? 'T' : 'F');
}

} // namespace

Zel_PropertyKeyInfo::Zel_PropertyKeyInfo()
    : mModifiable(false)
    , mAvailable(false)
    , mType(Zel_PropertyKeyType_None)
    , mTextSearchable(false)
    , mHasCustomValues(false)
{
}

Zel_PropertyKeyInfo::Zel_PropertyKeyInfo(const QString& key, const QString& displayName, bool modifiable,
                                         bool available, const QString& internalName, Zel_PropertyKeyType type,
                                         bool textSearchable, bool hasCustomValues)
    : mKey(key)
    , mDisplayName(displayName)
    , mModifiable(modifiable)
    , mAvailable(available)
    , mInternalName(internalName)
    , mType(type)
    , mTextSearchable(textSearchable)
    , mHasCustomValues(hasCustomValues)
{
}

Zel_PropertyKeyInfo::Zel_PropertyKeyInfo(const Zel_PropertyKeyInfo& other) = default;
Zel_PropertyKeyInfo& Zel_PropertyKeyInfo::operator=(const Zel_PropertyKeyInfo& other) = default;
Zel_PropertyKeyInfo::~Zel_PropertyKeyInfo() = default;

QString Zel_PropertyKeyInfo::toZelString() const
{
    return QStringLiteral("Zel_PropertyKeyInfo(") + mKey + QLatin1Char(':') + mDisplayName + QLatin1Char(':')
        + mInternalName + QLatin1Char(':') + flag(mModifiable) + QLatin1Char(':') + flag(mAvailable)
        + QLatin1Char(':') + QString::number(static_cast<qint32>(mType)) + QLatin1Char(':')
        + flag(mTextSearchable) + QLatin1Char(':') + flag(mHasCustomValues) + QLatin1Char(')');
}

const QString& Zel_PropertyKeyInfo::key() const
{
    return mKey;
}

const QString& Zel_PropertyKeyInfo::displayName() const
{
    return mDisplayName;
}

const QString& Zel_PropertyKeyInfo::internalName() const
{
    return mInternalName;
}

bool Zel_PropertyKeyInfo::isModifiable() const
{
    return mModifiable;
}

bool Zel_PropertyKeyInfo::isAvailable() const
{
    return mAvailable;
}

bool Zel_PropertyKeyInfo::isTextSearchable() const
{
    return mTextSearchable;
}

bool Zel_PropertyKeyInfo::hasCustomValues() const
{
    return mHasCustomValues;
}

bool Zel_PropertyKeyInfo::isType(Zel_PropertyKeyType type) const
{
    return mType == type;
}

Zel_PropertyKeyType Zel_PropertyKeyInfo::type() const
{
    return mType;
}

bool Zel_PropertyKeyInfo::isValid() const
{
    return !mKey.isEmpty() && !mDisplayName.isEmpty() && !mInternalName.isEmpty();
}

bool Zel_PropertyKeyInfo::operator==(const Zel_PropertyKeyInfo& other) const
{
    return mKey == other.mKey && mDisplayName == other.mDisplayName && mModifiable == other.mModifiable
        && mAvailable == other.mAvailable && mInternalName == other.mInternalName && mType == other.mType
        && mTextSearchable == other.mTextSearchable && mHasCustomValues == other.mHasCustomValues;
}

bool Zel_PropertyKeyInfo::operator!=(const Zel_PropertyKeyInfo& other) const
{
    return !(*this == other);
}
