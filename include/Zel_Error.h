// Zel_Error: the error record that accompanies every answer of a result.
//
// A message and a signed 32-bit code. The code -1 (the default) means "no
// error"; every other code, 0 included, is an error. A backend may derive its
// own error class (for example to answer isPrivilegeError()). Plain value.
#ifndef ZEL_ERROR_H
#define ZEL_ERROR_H

#include "zel_export.h"

#include <QString>

class ZEL_EXPORT Zel_Error
{
public:
    Zel_Error();
    Zel_Error(int code, QString msg);
    Zel_Error(const Zel_Error& other);
    Zel_Error& operator=(const Zel_Error& other);
    virtual ~Zel_Error();

    virtual void setMsg(QString msg);
    virtual const QString& getMsg() const;
    virtual void setCode(int code);
    virtual const int getCode() const;
    // True when getCode() (through its virtual slot) is not -1.
    virtual bool isError() const;
    // False here; a derived error class may say otherwise.
    virtual bool isPrivilegeError() const;

private:
    QString mMsg;
    int mCode;
};

#endif
