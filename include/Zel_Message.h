// Zel_Message: a single text, as a value.
#ifndef ZEL_MESSAGE_H
#define ZEL_MESSAGE_H

#include "zel_export.h"

#include <QString>

class ZEL_EXPORT Zel_Message
{
public:
    Zel_Message(QString text = QString());
    Zel_Message(const Zel_Message& other);
    Zel_Message& operator=(const Zel_Message& other);
    virtual ~Zel_Message();

    operator QString() const;

private:
    QString mText;
};

#endif
