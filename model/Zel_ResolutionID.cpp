#include "Zel_ResolutionID.h"

Zel_ResolutionID::Zel_ResolutionID(const QString& label, const QString& id)
    : QPair<QString, QString>(label, id)
{
}

Zel_ResolutionID::Zel_ResolutionID(const Zel_ResolutionID& other) = default;
Zel_ResolutionID& Zel_ResolutionID::operator=(const Zel_ResolutionID& other) = default;
Zel_ResolutionID::~Zel_ResolutionID() = default;

const QString& Zel_ResolutionID::label() const
{
    return first;
}

const QString& Zel_ResolutionID::id() const
{
    return second;
}

const QString Zel_ResolutionID::toZelString() const
{
    return QStringLiteral("Zel_ResolutionID(") + first + QLatin1Char(':') + second + QLatin1Char(')');
}
