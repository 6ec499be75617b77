// Zel_Directory: a directory path split into its components.
//
// A QStringList of the path's components in order, and a rooted flag (the
// path began with the separator). Built from a path and a separator; empty
// components (leading, trailing or doubled separators) are dropped. Rendered
// with any separator, so a path can be rewritten for another platform:
//
//     Zel_Directory dir(QStringLiteral("/a//b/"), QStringLiteral("/"));   // a, b; rooted
//     dir.toZelString(QStringLiteral("\\"));                             // "\a\b"
//
// An empty separator makes a non-empty path one component, not rooted.
// Plain value.
#ifndef ZEL_DIRECTORY_H
#define ZEL_DIRECTORY_H

#include "zel_export.h"

#include <QString>
#include <QStringList>

class ZEL_EXPORT Zel_Directory : public QStringList
{
public:
    // No components, not rooted.
    Zel_Directory();
    Zel_Directory(const QString& path, const QString& separator);
    Zel_Directory(const Zel_Directory& other);
    Zel_Directory& operator=(const Zel_Directory& other);
    virtual ~Zel_Directory();

    // The separator when rooted, then the components joined by separator.
    virtual const QString toZelString(const QString& separator) const;

    // True when the path the directory was built from began with the separator.
    bool isRooted() const;

private:
    bool mRooted;
};

#endif
