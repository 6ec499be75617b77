#include "Zel_MobAttr.h"

#include <utility>

Zel_MobAttr::Zel_MobAttr(const Zel_MobID& mobID,
                         boost::shared_ptr<Zel_Node> node,
                         const QString& mobName,
                         const QString& attrKey,
                         const QString& oldVal,
                         const QString& newVal,
                         Zel_MobAttr::AttrType type)
    : mType(type)
    , mMobID(mobID)
    , mNode(std::move(node))
    , mAttrKey(attrKey)
    , mOldVal(oldVal)
    , mNewVal(newVal)
    , mMobName(mobName)
{
}

Zel_MobAttr::Zel_MobAttr(const Zel_MobAttr& other) = default;
Zel_MobAttr& Zel_MobAttr::operator=(const Zel_MobAttr& other) = default;
Zel_MobAttr::~Zel_MobAttr() = default;

Zel_MobID Zel_MobAttr::getMobID() const
{
    return mMobID;
}

boost::shared_ptr<Zel_Node> Zel_MobAttr::getNodeSP() const
{
    return mNode;
}

QString Zel_MobAttr::getMobName() const
{
    return mMobName;
}

QString Zel_MobAttr::getAttrKey() const
{
    return mAttrKey;
}

QString Zel_MobAttr::getOldVal() const
{
    return mOldVal;
}

QString Zel_MobAttr::getNewVal() const
{
    return mNewVal;
}

QString Zel_MobAttr::getServerVal() const
{
    return mServerVal;
}

Zel_MobAttr::AttrType Zel_MobAttr::getType() const
{
    return mType;
}

void Zel_MobAttr::setServerValue(const QString& serverValue)
{
    mServerVal = serverValue;
}

const QString Zel_MobAttr::toZelString() const
{
    // The blanks before the colons of "old val :" and "server val :" are part
    // of the established trace format.
    return QLatin1String("mobID: ") + mMobID.toZelString() + QLatin1String(", key: ") + mAttrKey
        + QLatin1String(", old val : ") + mOldVal + QLatin1String(", new val: ") + mNewVal
        + QLatin1String(", server val : ") + mServerVal;
}
