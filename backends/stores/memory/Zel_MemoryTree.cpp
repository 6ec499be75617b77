#include "Zel_MemoryTree.h"

#include "session_p.h"
#include "memory_tree_p.h"
#include "Zel_MemoryPropertyManager.h"

#include <QFile>
#include <QSaveFile>

// The sample tree lives in the library's resources, built from sample_tree.json.
// (Q_INIT_RESOURCE must be used outside any namespace.)
static void initSampleResource()
{
    Q_INIT_RESOURCE(sample_tree);
}

Zel_MemoryTree::Zel_MemoryTree()
    : d(new ZelMemory::Tree)
{
}

Zel_MemoryTree::~Zel_MemoryTree() = default;

QByteArray Zel_MemoryTree::sampleJson()
{
    initSampleResource();
    QFile file(QStringLiteral(":/zel/memory/sample_tree.json"));
    if (!file.open(QIODevice::ReadOnly))
        return QByteArray();
    return file.readAll();
}

boost::shared_ptr<Zel_MemoryTree> Zel_MemoryTree::sample()
{
    return fromJson(sampleJson(), QStringLiteral("sample_tree.json"));
}

boost::shared_ptr<Zel_MemoryTree> Zel_MemoryTree::fromFile(const QString& path, QString* error)
{
    QFile file(path);
    if (!file.open(QIODevice::ReadOnly)) {
        if (error)
            *error = path + QStringLiteral(": cannot be read: ") + file.errorString();
        return boost::shared_ptr<Zel_MemoryTree>();
    }
    return fromJson(file.readAll(), path, error);
}

boost::shared_ptr<Zel_MemoryTree> Zel_MemoryTree::fromJson(const QByteArray& json, const QString& sourceName,
                                                           QString* error)
{
    boost::shared_ptr<Zel_MemoryTree> tree(new Zel_MemoryTree);
    QString message;
    if (!ZelMemory::loadTree(*tree->d, json, sourceName, message)) {
        if (error)
            *error = message;
        return boost::shared_ptr<Zel_MemoryTree>();
    }
    Zel_PropertyKeyInfoList keys;
    for (const ZelMemory::KeyDesc& k : tree->d->keys)
        keys.addIfKeyNotInList(ZelMemory::keyInfo(k));
    tree->d->propertyManager.reset(new Zel_MemoryPropertyManager(keys));
    return tree;
}

QByteArray Zel_MemoryTree::toJson() const
{
    ZelMemory::ReadHold hold(*d);
    return ZelMemory::saveTree(*d);
}

bool Zel_MemoryTree::saveFile(const QString& path, QString* error) const
{
    const QByteArray json = toJson();
    QSaveFile file(path);
    if (!file.open(QIODevice::WriteOnly) || file.write(json) != json.size() || !file.commit()) {
        if (error)
            *error = path + QStringLiteral(": cannot be written: ") + file.errorString();
        return false;
    }
    return true;
}

QString Zel_MemoryTree::serverName() const
{
    ZelMemory::ReadHold hold(*d);
    return d->serverName;
}

QString Zel_MemoryTree::rootMoniker() const
{
    ZelMemory::ReadHold hold(*d);
    const ZelMemory::Node* root = d->byId(d->rootId);
    return root ? root->moniker : QString();
}

QString Zel_MemoryTree::monikerAt(const QString& path) const
{
    ZelMemory::ReadHold hold(*d);
    const ZelMemory::Node* node = d->byPath(path);
    return node ? node->moniker : QString();
}

int Zel_MemoryTree::nodeCount() const
{
    ZelMemory::ReadHold hold(*d);
    return static_cast<int>(d->nodes.size());
}

QStringList Zel_MemoryTree::userNames() const
{
    ZelMemory::ReadHold hold(*d);
    QStringList names;
    for (const ZelMemory::User& user : d->users)
        names << user.name;
    return names;
}

QList<boost::shared_ptr<Zel_Node>> Zel_MemoryTree::childSnapshots(const boost::shared_ptr<Zel_MemoryTree>& tree,
                                                                  const QString& parentMoniker, const QString& user)
{
    QList<boost::shared_ptr<Zel_Node>> nodes;
    const boost::shared_ptr<ZelMemory::Store> owner(tree, tree->d.get());
    const std::unique_ptr<ZelMemory::ReadTxn> txn = owner->beginRead();
    const ZelMemory::Node* parent = txn->nodeByMoniker(parentMoniker);
    if (!parent)
        return nodes;
    const ZelMemory::SnapshotContext context = ZelMemory::childContext(*txn, parent, user);
    nodes.reserve(txn->childCount(*parent));
    txn->forEachChild(*parent, [&](const ZelMemory::Node& child) {
        nodes.append(ZelMemory::snapshotOf(*txn, child, context, owner));
    });
    txn->commit();
    return nodes;
}

ZelMemory::Tree& Zel_MemoryTree::data() const
{
    return *d;
}
