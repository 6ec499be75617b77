// Zel_ResolutionIDList: a list of resolution identifiers, held by value.
//
// toZelString() joins the elements' trace forms with "\n" (none at the end;
// an empty list renders as an empty text). Plain value.
#ifndef ZEL_RESOLUTIONIDLIST_H
#define ZEL_RESOLUTIONIDLIST_H

#include "zel_export.h"
#include "Zel_ResolutionID.h"

#include <QList>
#include <QString>

class ZEL_EXPORT Zel_ResolutionIDList : public QList<Zel_ResolutionID>
{
public:
    Zel_ResolutionIDList();
    Zel_ResolutionIDList(const Zel_ResolutionIDList& other);
    Zel_ResolutionIDList& operator=(const Zel_ResolutionIDList& other);
    virtual ~Zel_ResolutionIDList();

    const QString toZelString() const;
};

#endif
