// Zel_Store: a store of the backend's records, opened by its URL.
//
// The backend's rules run over a store: the in-memory tree, or a database.
// An application names the store with a URL and opens a session on it:
//
//     QString error;
//     boost::shared_ptr<Zel_MemorySession> session
//         = Zel_MemorySession::open(QStringLiteral("memory:tree.json"), &engine, "my-app", &error);
//     if (!session)
//         qWarning() << error;   // "tree.json: cannot be read: No such file or directory"
//
// The URL forms:
//   memory:                  the bundled sample tree, held in this process
//   memory:FILE.json         a tree file (Zel_MemoryTree's JSON form), held in
//                            this process; the file is written only by save()
//   sqlite:PATH              a SQLite file (sqlite:///ABSOLUTE/PATH too)
//   postgresql://USER@HOST:PORT/DATABASE?PARAM=VALUE...
//                            a PostgreSQL database, as libpq reads the URL;
//                            what it leaves out comes from libpq's PG*
//                            environment variables and defaults
// Opening fails with a message that names what was wrong (the URL, with any
// password masked, the file, the store that is not built in) and creates or
// changes nothing.
//
// Several sessions may share one opened store (they then hear each other's
// changes); the store lives as long as the last of them or the last
// reference. Opening is thread-safe.
#ifndef ZEL_STORE_H
#define ZEL_STORE_H

#include "zel_memory_export.h"

#include <QByteArray>
#include <QString>
#include <boost/shared_ptr.hpp>

#include <memory>

class Zel_MemoryTree;

namespace ZelMemory {
class Store;
struct OpenedStore;
}

class ZEL_MEMORY_EXPORT Zel_Store
{
public:
    enum Kind { Memory, Sqlite, Postgresql };
    // What open does when memory:FILE.json names no file: refuse, or open an
    // empty store that save() writes to the file (a target to import into).
    enum OpenMode { OpenExisting, CreateMissingFile };

    // The store the URL names; empty on failure, with *error (when given)
    // saying what was wrong.
    static boost::shared_ptr<Zel_Store> open(const QString& url, QString* error = nullptr,
                                             OpenMode mode = OpenExisting);
    // The store that holds tree (the sample when tree is empty).
    static boost::shared_ptr<Zel_Store> ofTree(const boost::shared_ptr<Zel_MemoryTree>& tree);

    ~Zel_Store();

    Kind kind() const;
    // "memory", "sqlite" or "postgresql".
    QString kindName() const;
    // The URL the store was opened with, any password masked ("memory:" for
    // a tree given by ofTree).
    QString url() const;
    // The server's name, as sessions on the store answer getServerName().
    QString serverName() const;
    // The version of the store's schema; 0 for a store without one (memory).
    int schemaVersion() const;
    // The in-memory tree of a memory store; empty for every other kind.
    boost::shared_ptr<Zel_MemoryTree> memoryTree() const;

    // What the store holds.
    struct Counts {
        int nodes = 0;    // the root included; 0 for an empty store
        int users = 0;
        int keys = 0;     // property keys
        int settings = 0; // workgroup, application and user settings, and settings documents
    };
    // The counts; false with *error when the store cannot be read.
    bool counts(Counts& counts, QString* error = nullptr) const;

    // Copying whole trees, in the JSON form of Zel_MemoryTree (the same for
    // every kind of store, so that a tree exported and imported again is
    // exported to the same bytes). Each reads or writes in one transaction.
    //
    // The whole store as JSON; empty with *error on failure (an empty store
    // cannot be exported).
    QByteArray exportJson(QString* error = nullptr) const;
    // Puts the tree of the JSON text (sourceName names it in messages) into
    // the store: the nodes with their IDs and monikers, users, keys,
    // resolutions, settings. A store that holds a tree already is refused
    // unless replace is true, when the tree is replaced whole. False with
    // *error on failure, with nothing changed.
    bool importJson(const QByteArray& json, const QString& sourceName, bool replace, QString* error = nullptr);
    // A memory:FILE.json store: writes the tree to its file. Other stores
    // keep every change on commit, and a memory: store lives only in this
    // process: nothing to do. False with *error on failure.
    bool save(QString* error = nullptr) const;

    // The backend's own access to the records (not for applications).
    boost::shared_ptr<ZelMemory::Store> dataSP() const;

private:
    explicit Zel_Store(Kind kind);
    Zel_Store(const Zel_Store&) = delete;
    Zel_Store& operator=(const Zel_Store&) = delete;

    struct Private;
    std::unique_ptr<Private> d;
};

#endif
