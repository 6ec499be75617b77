// The stores the backend's end-to-end tests run against.
//
// The end-to-end tests of the server rules are one conformance suite: each
// test runs once per kind of store (GoogleTest value-parameterised over
// storeKinds()), on a store loaded from a tree file's JSON text, and must
// pass unchanged on every kind. A kind of store takes part by adding its
// entry to storeKinds() (StoreUnderTest.cpp): how to load a tree into a fresh
// store, and how to open a session on it.
#ifndef STOREUNDERTEST_H
#define STOREUNDERTEST_H

#include <QByteArray>
#include <QDateTime>
#include <QString>
#include <boost/shared_ptr.hpp>

#include <functional>
#include <memory>
#include <ostream>
#include <string>
#include <vector>

class Orv_Engine;
class Zel_MemorySession;

namespace ZelMemory {
class Store;
}

// One store holding a tree, as the tests see it.
class StoreUnderTest
{
public:
    virtual ~StoreUnderTest();
    // A new session on the store, its requests run by engine.
    virtual boost::shared_ptr<Zel_MemorySession> newSession(Orv_Engine* engine, const QString& applicationName) = 0;
    // The whole store in the tree file's form (the same text for the same tree).
    virtual QByteArray toJson() = 0;
    // The number of nodes, the root included.
    virtual int nodeCount() = 0;
    // The moniker of the node at a path of names below the root; empty if none.
    virtual QString monikerAt(const QString& path) = 0;
    // The store itself, through the storage interface of the server rules.
    virtual ZelMemory::Store& records() = 0;
    // The clock of the store's transactions from now on.
    virtual void setClock(std::function<QDateTime()> clock) = 0;
};

// A kind of store.
struct StoreKind {
    std::string name; // a GoogleTest parameter name: letters and digits
    // A fresh store holding the tree of the JSON text; null, with *error,
    // when the text is refused.
    std::function<std::unique_ptr<StoreUnderTest>(const QByteArray& json, QString* error)> load;
};

// Every kind of store the conformance suite runs against.
std::vector<StoreKind> storeKinds();

// The parameter's name in test names.
struct StoreKindName {
    template <class ParamInfo>
    std::string operator()(const ParamInfo& info) const
    {
        return info.param.name;
    }
};

inline std::ostream& operator<<(std::ostream& out, const StoreKind& kind)
{
    return out << kind.name;
}

#endif
