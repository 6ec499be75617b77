#include "Zel_Store.h"

#include "Zel_MemoryTree.h"
#include "memory_tree_p.h"
#include "store_openers_p.h"

#ifdef ZEL_HAVE_STORE_URLS
#include "sql_error_p.h"
#include "sql_url_p.h"
#endif

#include <exception>
#include <mutex>

namespace {

const int KindCount = 3;

std::mutex gOpenersMutex;

ZelMemory::StoreOpener& openerOf(Zel_Store::Kind kind)
{
    static ZelMemory::StoreOpener openers[KindCount];
    return openers[kind];
}

const char* kindNameOf(Zel_Store::Kind kind)
{
    switch (kind) {
    case Zel_Store::Memory: return "memory";
    case Zel_Store::Sqlite: return "sqlite";
    case Zel_Store::Postgresql: return "postgresql";
    }
    return "unknown";
}

// The store's name in messages ("the SQLite store").
const char* storeTitle(Zel_Store::Kind kind)
{
    switch (kind) {
    case Zel_Store::Memory: return "the in-memory store";
    case Zel_Store::Sqlite: return "the SQLite store";
    case Zel_Store::Postgresql: return "the PostgreSQL store";
    }
    return "the store";
}

} // namespace

namespace ZelMemory {

StoreOpener registerStoreOpener(Zel_Store::Kind kind, StoreOpener opener)
{
    std::lock_guard<std::mutex> lock(gOpenersMutex);
    StoreOpener previous = std::move(openerOf(kind));
    openerOf(kind) = std::move(opener);
    return previous;
}

} // namespace ZelMemory

struct Zel_Store::Private {
    Kind kind = Memory;
    QString url;
    QString serverName;
    int schemaVersion = 0;
    boost::shared_ptr<Zel_MemoryTree> tree;
    boost::shared_ptr<ZelMemory::Store> store;
};

Zel_Store::Zel_Store(Kind kind)
    : d(new Private)
{
    d->kind = kind;
}

Zel_Store::~Zel_Store() = default;

boost::shared_ptr<Zel_Store> Zel_Store::ofTree(const boost::shared_ptr<Zel_MemoryTree>& tree)
{
    boost::shared_ptr<Zel_Store> store(new Zel_Store(Memory));
    store->d->url = QStringLiteral("memory:");
    store->d->tree = tree ? tree : Zel_MemoryTree::sample();
    store->d->serverName = store->d->tree->serverName();
    // The records are the tree's, kept alive by the tree.
    store->d->store = boost::shared_ptr<ZelMemory::Store>(store->d->tree, &store->d->tree->data());
    return store;
}

boost::shared_ptr<Zel_Store> Zel_Store::open(const QString& url, QString* error)
{
    auto fail = [error](const QString& message) {
        if (error)
            *error = message;
        return boost::shared_ptr<Zel_Store>();
    };
#ifdef ZEL_HAVE_STORE_URLS
    ZelSql::StoreUrl parsed;
    try {
        parsed = ZelSql::parseStoreUrl(url);
    } catch (const ZelSql::StoreError& e) {
        return fail(e.message());
    }
    const Kind kind = parsed.type == ZelSql::StoreUrl::Sqlite ? Sqlite
        : parsed.type == ZelSql::StoreUrl::Postgresql         ? Postgresql
                                                              : Memory;
    const QString display = parsed.display;
    const QString path = parsed.path;
#else
    // Built without Qt SQL and libpq: only the memory forms are understood.
    if (!url.startsWith(QLatin1String("memory:")))
        return fail(QStringLiteral("bad store URL \"%1\": this backend is built without the SQL stores and opens "
                                   "only memory: and memory:FILE.json")
                        .arg(url));
    const Kind kind = Memory;
    const QString display = url;
    const QString path = url.mid(7);
#endif

    if (kind == Memory) {
        boost::shared_ptr<Zel_MemoryTree> tree;
        if (path.isEmpty()) {
            tree = Zel_MemoryTree::sample();
        } else {
            QString why;
            tree = Zel_MemoryTree::fromFile(path, &why);
            if (!tree)
                return fail(why);
        }
        boost::shared_ptr<Zel_Store> store = ofTree(tree);
        store->d->url = display;
        return store;
    }

#ifdef ZEL_HAVE_STORE_URLS
    ZelMemory::StoreOpener opener;
    {
        std::lock_guard<std::mutex> lock(gOpenersMutex);
        opener = openerOf(kind);
    }
    if (!opener)
        return fail(QStringLiteral("%1: %2 is not built into this backend").arg(display, QLatin1String(storeTitle(kind))));
    ZelMemory::OpenedStore opened;
    try {
        opened = opener(parsed);
    } catch (const ZelSql::StoreError& e) {
        return fail(e.message());
    } catch (const std::exception& e) {
        return fail(QStringLiteral("%1: %2 cannot be opened: %3")
                        .arg(display, QLatin1String(storeTitle(kind)), QString::fromLocal8Bit(e.what())));
    }
    if (!opened.store)
        return fail(QStringLiteral("%1: %2 answered no store").arg(display, QLatin1String(storeTitle(kind))));
    boost::shared_ptr<Zel_Store> store(new Zel_Store(kind));
    store->d->url = display;
    store->d->serverName = opened.serverName.isEmpty() ? display : opened.serverName;
    store->d->schemaVersion = opened.schemaVersion;
    store->d->store = opened.store;
    return store;
#else
    return fail(QString());
#endif
}

Zel_Store::Kind Zel_Store::kind() const
{
    return d->kind;
}

QString Zel_Store::kindName() const
{
    return QLatin1String(kindNameOf(d->kind));
}

QString Zel_Store::url() const
{
    return d->url;
}

QString Zel_Store::serverName() const
{
    return d->serverName;
}

int Zel_Store::schemaVersion() const
{
    return d->schemaVersion;
}

boost::shared_ptr<Zel_MemoryTree> Zel_Store::memoryTree() const
{
    return d->tree;
}

boost::shared_ptr<ZelMemory::Store> Zel_Store::dataSP() const
{
    return d->store;
}
