#include "Zel_MobPropertyChange.h"

#include <utility>

Zel_MobPropertyChange::Zel_MobPropertyChange() = default;

Zel_MobPropertyChange::Zel_MobPropertyChange(const Zel_MobID& mobID,
                                             boost::shared_ptr<Zel_Node> node,
                                             const QString& mobName,
                                             Zel_Property property,
                                             const QString& newVal,
                                             Zel_PropertyList returnPropertyList)
    : mMobName(mobName)
    , mMobID(mobID)
    , mNode(std::move(node))
    , mProperty(std::move(property))
    , mNewVal(newVal)
    , mReturnPropertyList(std::move(returnPropertyList))
{
}

Zel_MobPropertyChange::Zel_MobPropertyChange(const Zel_MobPropertyChange& other) = default;
Zel_MobPropertyChange& Zel_MobPropertyChange::operator=(const Zel_MobPropertyChange& other) = default;
Zel_MobPropertyChange::~Zel_MobPropertyChange() = default;

Zel_MobID Zel_MobPropertyChange::getMobID() const
{
    return mMobID;
}

boost::shared_ptr<Zel_Node> Zel_MobPropertyChange::getNodeSP() const
{
    return mNode;
}

QString Zel_MobPropertyChange::getMobName() const
{
    return mMobName;
}

Zel_Property Zel_MobPropertyChange::getProperty() const
{
    return mProperty;
}

QString Zel_MobPropertyChange::getNewVal() const
{
    return mNewVal;
}

Zel_PropertyList Zel_MobPropertyChange::getReturnPropertyList() const
{
    return mReturnPropertyList;
}

QString Zel_MobPropertyChange::getServerVal() const
{
    return mServerVal;
}

void Zel_MobPropertyChange::setServerValue(const QString& serverValue)
{
    mServerVal = serverValue;
}

const QString Zel_MobPropertyChange::toZelString() const
{
    return QLatin1String("mobID: ") + mMobID.toZelString() + QLatin1String(", prop: ")
        + static_cast<QString>(mProperty) + QLatin1String(", new val: ") + mNewVal
        + QLatin1String(", server val : ") + mServerVal;
}
