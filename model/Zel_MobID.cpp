#include "Zel_MobID.h"

Zel_MobID::Zel_MobID() = default;

Zel_MobID::Zel_MobID(const QString& id)
    : mID(id)
{
}

Zel_MobID::Zel_MobID(const Zel_MobID& other) = default;
Zel_MobID& Zel_MobID::operator=(const Zel_MobID& other) = default;
Zel_MobID::~Zel_MobID() = default;

bool Zel_MobID::operator==(const Zel_MobID& other) const
{
    // A null and an empty text are equal here as well.
    return mID == other.mID;
}

bool Zel_MobID::operator!=(const Zel_MobID& other) const
{
    return !(*this == other);
}

bool Zel_MobID::operator<(const Zel_MobID& other) const
{
    // QString's operator< compares UTF-16 code units by value.
    return mID < other.mID;
}

bool Zel_MobID::isEmpty() const
{
    return mID.isEmpty();
}

const QString& Zel_MobID::toZelString() const
{
    return mID;
}
