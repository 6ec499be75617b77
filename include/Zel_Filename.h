// Zel_Filename: a file name, carried as text.
//
// Plain value; toZelString() is the name itself.
#ifndef ZEL_FILENAME_H
#define ZEL_FILENAME_H

#include "zel_export.h"

#include <QString>

class ZEL_EXPORT Zel_Filename
{
public:
    // An empty name.
    Zel_Filename();
    Zel_Filename(QString name);
    Zel_Filename(const Zel_Filename& other);
    virtual ~Zel_Filename();

    virtual Zel_Filename& operator=(const Zel_Filename& other);
    // The name itself.
    virtual const QString& toZelString();

private:
    QString mName;
};

#endif
