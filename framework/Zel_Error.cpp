#include "Zel_Error.h"

Zel_Error::Zel_Error()
    : mCode(-1)
{
}

Zel_Error::Zel_Error(int code, QString msg)
    : mMsg(std::move(msg))
    , mCode(code)
{
}

Zel_Error::Zel_Error(const Zel_Error& other) = default;

Zel_Error& Zel_Error::operator=(const Zel_Error& other)
{
    if (this != &other) {
        mMsg = other.mMsg;
        mCode = other.mCode;
    }
    return *this;
}

Zel_Error::~Zel_Error() = default;

void Zel_Error::setMsg(QString msg)
{
    mMsg = std::move(msg);
}

const QString& Zel_Error::getMsg() const
{
    return mMsg;
}

void Zel_Error::setCode(int code)
{
    mCode = code;
}

const int Zel_Error::getCode() const
{
    return mCode;
}

bool Zel_Error::isError() const
{
    return getCode() != -1;
}

bool Zel_Error::isPrivilegeError() const
{
    return false;
}
