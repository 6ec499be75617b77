// Zel_MemoryError: the error record of the in-memory backend.
//
// A Zel_Error whose code is one of Zel_MemoryErrorCodes. isPrivilegeError()
// is true exactly for PermissionDenied, so an application can tell "you may
// not" from every other failure. Plain value, like Zel_Error.
#ifndef ZEL_MEMORYERROR_H
#define ZEL_MEMORYERROR_H

#include "zel_memory_export.h"
#include "Zel_Error.h"
#include "Zel_MemoryErrorCodes.h"

#include <QString>
#include <boost/shared_ptr.hpp>

class ZEL_MEMORY_EXPORT Zel_MemoryError : public Zel_Error
{
public:
    Zel_MemoryError(Zel_MemoryErrorCodes::Code code, const QString& msg);
    Zel_MemoryError(const Zel_MemoryError& other);
    Zel_MemoryError& operator=(const Zel_MemoryError& other);
    virtual ~Zel_MemoryError();

    virtual bool isPrivilegeError() const override;

    // A shared error record, as results store them.
    static boost::shared_ptr<Zel_Error> make(Zel_MemoryErrorCodes::Code code, const QString& msg);
    // A shared "no error" record (code -1).
    static boost::shared_ptr<Zel_Error> none();
};

#endif
