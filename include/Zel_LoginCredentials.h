// Zel_LoginCredentials: the credentials of a login.
//
// Carries nothing itself: a backend derives from it to add what its server
// needs. Plain value.
#ifndef ZEL_LOGINCREDENTIALS_H
#define ZEL_LOGINCREDENTIALS_H

#include "zel_export.h"

class ZEL_EXPORT Zel_LoginCredentials
{
public:
    Zel_LoginCredentials();
    Zel_LoginCredentials(const Zel_LoginCredentials& other);
    Zel_LoginCredentials& operator=(const Zel_LoginCredentials& other);
    virtual ~Zel_LoginCredentials();
};

#endif
