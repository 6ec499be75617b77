// Zel_ResolutionID: a media resolution identifier with its label.
//
// A pair: first is the label, second the identifier. Trace form
// "Zel_ResolutionID(<label>:<id>)". Plain value.
#ifndef ZEL_RESOLUTIONID_H
#define ZEL_RESOLUTIONID_H

#include "zel_export.h"

#include <QPair>
#include <QString>

class ZEL_EXPORT Zel_ResolutionID : public QPair<QString, QString>
{
public:
    Zel_ResolutionID(const QString& label = QString(), const QString& id = QString());
    Zel_ResolutionID(const Zel_ResolutionID& other);
    Zel_ResolutionID& operator=(const Zel_ResolutionID& other);
    virtual ~Zel_ResolutionID();

    const QString& label() const;
    const QString& id() const;
    const QString toZelString() const;
};

#endif
