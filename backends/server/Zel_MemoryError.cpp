#include "Zel_MemoryError.h"

Zel_MemoryError::Zel_MemoryError(Zel_MemoryErrorCodes::Code code, const QString& msg)
    : Zel_Error(static_cast<int>(code), msg)
{
}

Zel_MemoryError::Zel_MemoryError(const Zel_MemoryError& other) = default;
Zel_MemoryError& Zel_MemoryError::operator=(const Zel_MemoryError& other) = default;
Zel_MemoryError::~Zel_MemoryError() = default;

bool Zel_MemoryError::isPrivilegeError() const
{
    return getCode() == Zel_MemoryErrorCodes::PermissionDenied;
}

boost::shared_ptr<Zel_Error> Zel_MemoryError::make(Zel_MemoryErrorCodes::Code code, const QString& msg)
{
    return boost::shared_ptr<Zel_Error>(new Zel_MemoryError(code, msg));
}

boost::shared_ptr<Zel_Error> Zel_MemoryError::none()
{
    return boost::shared_ptr<Zel_Error>(new Zel_Error());
}
