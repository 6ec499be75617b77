#include "Zel_FrameLocator.h"

Zel_FrameLocator::Zel_FrameLocator() = default;
Zel_FrameLocator::Zel_FrameLocator(const Zel_FrameLocator& other) = default;
Zel_FrameLocator& Zel_FrameLocator::operator=(const Zel_FrameLocator& other) = default;
Zel_FrameLocator::~Zel_FrameLocator() = default;

bool Zel_FrameLocator::operator==(const Zel_FrameLocator& other) const
{
    return mID == other.mID;
}

bool Zel_FrameLocator::operator!=(const Zel_FrameLocator& other) const
{
    return !(other == *this);
}

const QString& Zel_FrameLocator::getID() const
{
    return mID;
}

void Zel_FrameLocator::setID(const QString& id)
{
    mID = id;
}

bool Zel_FrameLocator::isEquivalent(const Zel_FrameLocator& other) const
{
    for (const Zel_FrameProperty& property : *this) {
        if (other.getValue(property.key()) != property.value())
            return false;
    }
    for (const Zel_FrameProperty& property : other) {
        if (getValue(property.key()) != property.value())
            return false;
    }
    return true;
}
