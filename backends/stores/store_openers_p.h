// Internal: the openers of the stores that are not kept in memory.
//
// Zel_Store::open parses a URL and hands a sqlite: or postgresql: URL to the
// opener registered for its kind. Each SQL store registers its factory here
// (registerStoreOpener(Zel_Store::Sqlite, openSqliteStore)); a kind without
// an opener is answered with "... store is not built into this backend".
//
// An opener answers the opened store, or throws: a ZelSql::StoreError (its
// message is the caller's error text as it is) or any std::exception (its
// what()). It must create or change nothing when it throws.
#ifndef STORE_OPENERS_P_H
#define STORE_OPENERS_P_H

#include "Zel_Store.h"

#include <QString>
#include <boost/shared_ptr.hpp>

#include <functional>

namespace ZelSql {
struct StoreUrl;
}

namespace ZelMemory {

class Store;

struct OpenedStore {
    boost::shared_ptr<Store> store;
    QString serverName;    // what sessions answer getServerName() with
    int schemaVersion = 0; // the schema's version, 0 when there is none
};

typedef std::function<OpenedStore(const ZelSql::StoreUrl& url)> StoreOpener;

// Sets the opener of kind's URLs (an empty one removes it); thread-safe.
// Answers the opener it replaces.
ZEL_MEMORY_EXPORT StoreOpener registerStoreOpener(Zel_Store::Kind kind, StoreOpener opener);

} // namespace ZelMemory

#endif
