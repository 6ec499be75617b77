#include "Zel_Setting.h"

Zel_Setting::Zel_Setting() = default;

Zel_Setting::Zel_Setting(const QString& key, const QString& value)
    : mKey(key)
    , mValue(value)
{
}

Zel_Setting::Zel_Setting(const Zel_Setting& other) = default;
Zel_Setting& Zel_Setting::operator=(const Zel_Setting& other) = default;
Zel_Setting::~Zel_Setting() = default;

QString Zel_Setting::key() const
{
    return mKey;
}

QString Zel_Setting::value() const
{
    return mValue;
}

bool Zel_Setting::operator==(const Zel_Setting& other) const
{
    return mKey == other.mKey && mValue == other.mValue;
}

bool Zel_Setting::operator!=(const Zel_Setting& other) const
{
    return !(*this == other);
}

Zel_Setting::operator QString() const
{
    return mKey + QLatin1Char(':') + mValue;
}
