// Zel_Dependency: a dependency of one asset on another.
//
// The moniker of the asset concerned (a shared text, may be empty), a usage
// text and a type. The type's values are defined by the server; the library
// only stores and renders them. Trace form:
// "Zel_Dependency(<moniker> <usage> <type>)", with "<no moniker>" for an
// empty moniker pointer. Plain value; copies share the moniker text.
#ifndef ZEL_DEPENDENCY_H
#define ZEL_DEPENDENCY_H

#include "zel_export.h"

#include <QString>
#include <QtGlobal>
#include <boost/shared_ptr.hpp>

class ZEL_EXPORT Zel_Dependency
{
public:
    // The kind of dependency, a signed 32-bit value defined by the server;
    // hold any value with static_cast<Zel_Dependency::Zel_DependencyType>(n).
    enum Zel_DependencyType : qint32
    {
    };

    // No moniker, empty usage, type 0.
    Zel_Dependency();
    Zel_Dependency(boost::shared_ptr<QString> moniker, QString usage, Zel_Dependency::Zel_DependencyType type);
    Zel_Dependency(const Zel_Dependency& other);
    Zel_Dependency& operator=(const Zel_Dependency& other);
    virtual ~Zel_Dependency();

    boost::shared_ptr<QString> getMoniker();
    const QString& getUsage() const;
    const Zel_Dependency::Zel_DependencyType& getType() const;
    const QString toZelString() const;

private:
    boost::shared_ptr<QString> mMoniker;
    QString mUsage;
    Zel_DependencyType mType;
};

#endif
