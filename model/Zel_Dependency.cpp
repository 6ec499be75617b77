#include "Zel_Dependency.h"

Zel_Dependency::Zel_Dependency()
    : mType(static_cast<Zel_DependencyType>(0))
{
}

Zel_Dependency::Zel_Dependency(boost::shared_ptr<QString> moniker, QString usage,
                               Zel_Dependency::Zel_DependencyType type)
    : mMoniker(std::move(moniker))
    , mUsage(std::move(usage))
    , mType(type)
{
}

Zel_Dependency::Zel_Dependency(const Zel_Dependency& other) = default;
Zel_Dependency& Zel_Dependency::operator=(const Zel_Dependency& other) = default;
Zel_Dependency::~Zel_Dependency() = default;

boost::shared_ptr<QString> Zel_Dependency::getMoniker()
{
    return mMoniker;
}

const QString& Zel_Dependency::getUsage() const
{
    return mUsage;
}

const Zel_Dependency::Zel_DependencyType& Zel_Dependency::getType() const
{
    return mType;
}

const QString Zel_Dependency::toZelString() const
{
    return QStringLiteral("Zel_Dependency(") + (mMoniker ? *mMoniker : QStringLiteral("<no moniker>"))
        + QLatin1Char(' ') + mUsage + QLatin1Char(' ') + QString::number(static_cast<qint32>(mType))
        + QLatin1Char(')');
}
