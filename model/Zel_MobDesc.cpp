#include "Zel_MobDesc.h"

Zel_MobDesc::Zel_MobDesc()
    : mGenerateFexSpaaf(false)
{
}

Zel_MobDesc::Zel_MobDesc(const QString& mobID, const QString& aafFilePath, const QString& headFrameFilePath)
    : mMobID(mobID)
    , mAAFFilePath(aafFilePath)
    , mHeadFrameFilePath(headFrameFilePath)
    , mGenerateFexSpaaf(false)
{
}

Zel_MobDesc::Zel_MobDesc(const Zel_MobDesc& other) = default;
Zel_MobDesc& Zel_MobDesc::operator=(const Zel_MobDesc& other) = default;
Zel_MobDesc::~Zel_MobDesc() = default;

const QString& Zel_MobDesc::getMobID() const
{
    return mMobID;
}

void Zel_MobDesc::setMobID(const QString& mobID)
{
    mMobID = mobID;
}

const QString& Zel_MobDesc::getAAFFilePath() const
{
    return mAAFFilePath;
}

void Zel_MobDesc::setAAFFilePath(const QString& path)
{
    mAAFFilePath = path;
}

const QString& Zel_MobDesc::getOMAAFFilePath() const
{
    return mOMAAFFilePath;
}

void Zel_MobDesc::setOMAAFFilePath(const QString& path)
{
    mOMAAFFilePath = path;
}

const QString& Zel_MobDesc::getOMF2FilePath() const
{
    return mOMF2FilePath;
}

void Zel_MobDesc::setOMF2FilePath(const QString& path)
{
    mOMF2FilePath = path;
}

const QString& Zel_MobDesc::getHeadFrameFilePath() const
{
    return mHeadFrameFilePath;
}

void Zel_MobDesc::setHeadFrameFilePath(const QString& path)
{
    mHeadFrameFilePath = path;
}

bool Zel_MobDesc::getGenerateFexSpaaf() const
{
    return mGenerateFexSpaaf;
}

void Zel_MobDesc::setGenerateFexSpaaf(bool generate)
{
    mGenerateFexSpaaf = generate;
}

bool Zel_MobDesc::isNull() const
{
    // The OM-AAF path and the flag do not count.
    return mMobID.isEmpty() && mAAFFilePath.isEmpty() && mOMF2FilePath.isEmpty() && mHeadFrameFilePath.isEmpty();
}
