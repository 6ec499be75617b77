#include "Zel_Store.h"

#include "Zel_MemoryPropertyManager.h"
#include "Zel_MemoryTree.h"
#include "Zel_PropertyKeyInfoList.h"
#include "memory_tree_p.h"
#include "store_openers_p.h"

#ifdef ZEL_HAVE_STORE_URLS
#include "sql_error_p.h"
#include "sql_url_p.h"
#endif

#include <QFileInfo>

#include <exception>
#include <functional>
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

// A memory tree that holds nothing: the sample, emptied.
boost::shared_ptr<Zel_MemoryTree> emptyTree()
{
    const boost::shared_ptr<Zel_MemoryTree> tree = Zel_MemoryTree::sample();
    const std::unique_ptr<ZelMemory::WriteTxn> txn = tree->data().beginWrite();
    txn->removeEverything();
    txn->commit();
    return tree;
}

// Copies every record of from into to (which holds none): the tables, then
// the nodes depth first, each folder's children in their order.
void copyRecords(ZelMemory::ReadTxn& from, ZelMemory::WriteTxn& to)
{
    to.setServerTables(from.serverTables());
    const ZelMemory::Node* root = from.root();
    if (!root)
        return;
    std::function<void(const ZelMemory::Node&, const ZelMemory::Node*)> copy
        = [&](const ZelMemory::Node& node, const ZelMemory::Node* parent) {
              const ZelMemory::Node& inserted = to.insertRecord(node, parent);
              from.forEachChild(node, [&](const ZelMemory::Node& child) { copy(child, &inserted); });
          };
    copy(*root, nullptr);
}

int nodeCount(ZelMemory::ReadTxn& txn)
{
    std::vector<const ZelMemory::Node*> nodes;
    txn.allNodes(nodes);
    return static_cast<int>(nodes.size());
}

QString exceptionText(const std::exception& e)
{
#ifdef ZEL_HAVE_STORE_URLS
    if (const auto* storeError = dynamic_cast<const ZelSql::StoreError*>(&e))
        return storeError->message();
#endif
    return QString::fromLocal8Bit(e.what());
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
    QString file; // memory:FILE.json: the file
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

boost::shared_ptr<Zel_Store> Zel_Store::open(const QString& url, QString* error, OpenMode mode)
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
        } else if (mode == CreateMissingFile && !QFileInfo::exists(path)) {
            tree = emptyTree();
        } else {
            QString why;
            tree = Zel_MemoryTree::fromFile(path, &why);
            if (!tree)
                return fail(why);
        }
        boost::shared_ptr<Zel_Store> store = ofTree(tree);
        store->d->url = display;
        store->d->file = path;
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

bool Zel_Store::counts(Counts& counts, QString* error) const
{
    try {
        const std::unique_ptr<ZelMemory::ReadTxn> txn = d->store->beginRead();
        const ZelMemory::ServerTables tables = txn->serverTables();
        counts = Counts();
        counts.nodes = nodeCount(*txn);
        counts.users = tables.users.size();
        counts.keys = tables.keys.size();
        counts.settings = tables.workgroupSettings.size() + tables.documents.size();
        for (const ZelMemory::SettingPairs& pairs : tables.applicationSettings)
            counts.settings += pairs.size();
        for (const auto& types : tables.userSettings) {
            for (const ZelMemory::SettingPairs& pairs : types)
                counts.settings += pairs.size();
        }
        txn->commit();
        return true;
    } catch (const std::exception& e) {
        if (error)
            *error = QStringLiteral("%1: cannot be read: %2").arg(d->url, exceptionText(e));
        return false;
    }
}

QByteArray Zel_Store::exportJson(QString* error) const
{
    try {
        const boost::shared_ptr<Zel_MemoryTree> copy = emptyTree();
        {
            const std::unique_ptr<ZelMemory::ReadTxn> from = d->store->beginRead();
            if (!from->root()) {
                if (error)
                    *error = QStringLiteral("%1: the store holds no tree to export").arg(d->url);
                return QByteArray();
            }
            const std::unique_ptr<ZelMemory::WriteTxn> to = copy->data().beginWrite();
            copyRecords(*from, *to);
            to->commit();
            from->commit();
        }
        return copy->toJson();
    } catch (const std::exception& e) {
        if (error)
            *error = QStringLiteral("%1: cannot be exported: %2").arg(d->url, exceptionText(e));
        return QByteArray();
    }
}

bool Zel_Store::importJson(const QByteArray& json, const QString& sourceName, bool replace, QString* error)
{
    QString why;
    // The file is read and checked against the server's rules whole before
    // the store is touched.
    const boost::shared_ptr<Zel_MemoryTree> tree = Zel_MemoryTree::fromJson(json, sourceName, &why);
    if (!tree) {
        if (error)
            *error = why;
        return false;
    }
    try {
        const std::unique_ptr<ZelMemory::WriteTxn> to = d->store->beginWrite();
        if (to->root()) {
            if (!replace) {
                if (error)
                    *error = QStringLiteral("%1 holds a tree already (%2 nodes)").arg(d->url).arg(nodeCount(*to));
                return false;
            }
            to->removeEverything();
        }
        const std::unique_ptr<ZelMemory::ReadTxn> from = tree->data().beginRead();
        copyRecords(*from, *to);
        from->commit();
        to->commit();
    } catch (const std::exception& e) {
        if (error)
            *error = QStringLiteral("%1: cannot import %2: %3").arg(d->url, sourceName, exceptionText(e));
        return false;
    }
    if (d->tree) {
        // The key descriptions of sessions opened from now on.
        d->serverName = d->tree->serverName();
        Zel_PropertyKeyInfoList keys;
        const std::unique_ptr<ZelMemory::ReadTxn> txn = d->store->beginRead();
        for (const ZelMemory::KeyDesc& key : txn->serverTables().keys)
            keys.addIfKeyNotInList(ZelMemory::keyInfo(key));
        txn->commit();
        d->tree->data().propertyManager.reset(new Zel_MemoryPropertyManager(keys));
    }
    return true;
}

bool Zel_Store::save(QString* error) const
{
    if (d->kind != Memory || d->file.isEmpty())
        return true;
    return d->tree->saveFile(d->file, error);
}
