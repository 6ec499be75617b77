// Zel_MemoryTree: the asset tree of the in-memory backend.
//
// Holds everything a server would: the node tree (projects, bins, clips,
// sequences, effects, with properties, reservations, permissions per user,
// frame locators and restrictions, media), the users, the property keys the
// server describes, the resolutions, and the user, application and workgroup
// settings. It is loaded from a JSON file (or the bundled sample tree) and
// can be saved back; one tree may serve several sessions at once, and the
// changes one session makes are reported to the listeners of all of them.
//
//     QString error;
//     boost::shared_ptr<Zel_MemoryTree> tree = Zel_MemoryTree::fromFile("tree.json", &error);
//     if (!tree)
//         qWarning() << error;   // "tree.json:12:5: unterminated object"
//
// Every operation is thread-safe: one shared mutex guards the tree, and each
// request of a session holds it for its whole work.
#ifndef ZEL_MEMORYTREE_H
#define ZEL_MEMORYTREE_H

#include "zel_memory_export.h"

#include <QByteArray>
#include <QList>
#include <QString>
#include <QStringList>
#include <boost/shared_ptr.hpp>

#include <memory>

class Zel_Node;

namespace ZelMemory {
class Tree;
}

class ZEL_MEMORY_EXPORT Zel_MemoryTree
{
public:
    // The bundled sample tree: a news project with bins, master clips,
    // subclips, sequences and effects, four users with different rights,
    // reservations and settings. A fresh copy on every call.
    static boost::shared_ptr<Zel_MemoryTree> sample();
    // The bundled sample tree as JSON text.
    static QByteArray sampleJson();
    // A tree read from a JSON file; empty on failure, with *error (when given)
    // naming the file and the position of the fault. A file that breaks the
    // server's rules (a name with "/", a second node with a media object ID,
    // nodes deeper than Zel_MemoryLimits::MaxDepth, ...) is refused as well.
    static boost::shared_ptr<Zel_MemoryTree> fromFile(const QString& path, QString* error = nullptr);
    // A tree read from JSON text; sourceName stands for the file in messages.
    static boost::shared_ptr<Zel_MemoryTree> fromJson(const QByteArray& json, const QString& sourceName,
                                                      QString* error = nullptr);

    virtual ~Zel_MemoryTree();

    // The tree as JSON text, in the form fromJson reads.
    QByteArray toJson() const;
    // Writes toJson() to a file; false with *error on failure.
    bool saveFile(const QString& path, QString* error = nullptr) const;

    // The server's name.
    QString serverName() const;
    // The root node's moniker.
    QString rootMoniker() const;
    // The moniker of the node at a path of names below the root
    // ("/Evening News/Footage"); empty when there is none.
    QString monikerAt(const QString& path) const;
    // The number of nodes, the root included.
    int nodeCount() const;
    // The names of the users who may log in.
    QStringList userNames() const;

    // Snapshots of the children of the node at parentMoniker as the requests
    // of user see them (the Zel_MemoryNode objects every request answers
    // with), in the order the children were added, without checking rights
    // or putting them in node order; empty when no node has the moniker. For
    // tools and benchmarks that read a tree without a session.
    static QList<boost::shared_ptr<Zel_Node>> childSnapshots(const boost::shared_ptr<Zel_MemoryTree>& tree,
                                                             const QString& parentMoniker, const QString& user);

    // The backend's own access to the records (not for applications).
    ZelMemory::Tree& data() const;

private:
    Zel_MemoryTree();
    Zel_MemoryTree(const Zel_MemoryTree&) = delete;
    Zel_MemoryTree& operator=(const Zel_MemoryTree&) = delete;

    std::unique_ptr<ZelMemory::Tree> d;
};

#endif
