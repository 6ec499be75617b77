#include "Zel_Filename.h"

Zel_Filename::Zel_Filename() = default;

Zel_Filename::Zel_Filename(QString name)
    : mName(std::move(name))
{
}

Zel_Filename::Zel_Filename(const Zel_Filename& other) = default;
Zel_Filename::~Zel_Filename() = default;

Zel_Filename& Zel_Filename::operator=(const Zel_Filename& other)
{
    if (this != &other)
        mName = other.mName;
    return *this;
}

const QString& Zel_Filename::toZelString()
{
    return mName;
}
