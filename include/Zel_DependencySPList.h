// Zel_DependencySPList: a list of shared dependencies.
//
// A QList of boost::shared_ptr<Zel_Dependency>; copies share the dependencies.
#ifndef ZEL_DEPENDENCYSPLIST_H
#define ZEL_DEPENDENCYSPLIST_H

#include "zel_export.h"
#include "Zel_Dependency.h"

#include <QList>
#include <boost/shared_ptr.hpp>

class ZEL_EXPORT Zel_DependencySPList : public QList<boost::shared_ptr<Zel_Dependency>>
{
public:
    Zel_DependencySPList();
    Zel_DependencySPList(const Zel_DependencySPList& other);
    Zel_DependencySPList& operator=(const Zel_DependencySPList& other);
    virtual ~Zel_DependencySPList();
};

#endif
