#include "Zel_FrameProperty.h"

#include <utility>

Zel_FrameProperty::Zel_FrameProperty(QString key, QString value)
    : mKey(std::move(key))
    , mValue(std::move(value))
{
}

Zel_FrameProperty::Zel_FrameProperty(const Zel_FrameProperty& other) = default;
Zel_FrameProperty& Zel_FrameProperty::operator=(const Zel_FrameProperty& other) = default;
Zel_FrameProperty::~Zel_FrameProperty() = default;

QString Zel_FrameProperty::key() const
{
    return mKey;
}

QString Zel_FrameProperty::value() const
{
    return mValue;
}

void Zel_FrameProperty::setValue(const QString& value)
{
    mValue = value;
}

bool Zel_FrameProperty::operator==(const Zel_FrameProperty& other) const
{
    return mKey == other.mKey && mValue == other.mValue;
}

bool Zel_FrameProperty::operator!=(const Zel_FrameProperty& other) const
{
    return !(*this == other);
}

QString Zel_FrameProperty::toZelString() const
{
    return QLatin1String("Zel_FrameProperty - key(") + mKey + QLatin1String(") value(") + mValue
        + QLatin1Char(')');
}
