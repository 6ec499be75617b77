// Loading the tree from JSON and saving it back, with Qt's JSON classes.
//
// Syntax errors, and a member name given twice in one object (which Qt's
// reader would resolve silently by keeping the last), are reported as
// "FILE:LINE:COLUMN: message" (a byte offset turned into a line and a
// character column); every other problem as "FILE: PATH: message", where PATH
// names the offending value the way one would write it in code
// (root.children[2].name).
//
// Besides the form of the file, the loader enforces the server's own rules,
// so that a file holds only what the server itself could have built: names
// without "/" and within the name limit, distinct node IDs, monikers and
// media object IDs, dependencies and masters that name nodes, known key
// types and file version, the depth limit and the settings limits
// (Zel_MemoryLimits.h). Nodes are read and written without recursion.
#include "memory_tree_p.h"
#include "rules_p.h"

#include "Zel_MimeTypeSpec.h"
#include "Zel_MimeTypeValue.h"

#include <QJsonArray>
#include <QJsonDocument>
#include <QJsonObject>
#include <QJsonParseError>
#include <QJsonValue>
#include <QSet>

#include <cstring>
#include <memory>
#include <vector>

namespace ZelMemory {

namespace {

const char* const kFormat = "zel-memory-tree";

struct Failure {
    QString message;
};

// Where a value sits in the file (root.children[2].name), for messages. The
// path of a node is kept as a step (its parent's step and its index among the
// children) and written out only when a message needs it, so that loading a
// large tree spends nothing on the paths of values that are fine.
struct PathStep {
    int parent; // the parent's step; -1 for the root
    int index;  // among the parent's children
};

class Where
{
public:
    // A path given as text.
    Where(const QString& text)
        : mText(&text)
    {
    }
    // The path of the node at step.
    Where(const std::vector<PathStep>& steps, int step)
        : mSteps(&steps)
        , mStep(step)
    {
    }

    QString text() const
    {
        if (mText)
            return *mText;
        std::vector<int> indexes;
        for (int step = mStep; (*mSteps)[static_cast<std::size_t>(step)].parent >= 0;
             step = (*mSteps)[static_cast<std::size_t>(step)].parent)
            indexes.push_back((*mSteps)[static_cast<std::size_t>(step)].index);
        QString path = QStringLiteral("root");
        for (auto it = indexes.rbegin(); it != indexes.rend(); ++it)
            path += QStringLiteral(".children[") + QString::number(*it) + QLatin1Char(']');
        return path;
    }

private:
    const QString* mText = nullptr;
    const std::vector<PathStep>* mSteps = nullptr;
    int mStep = 0;
};

class Reader
{
public:
    Reader(Tree& tree, const QString& source)
        : mTree(tree)
        , mSource(source)
    {
    }

    void read(const QJsonObject& top)
    {
        const QString format = optString(top, QStringLiteral("format"), QString(), QString());
        if (!format.isEmpty() && format != QLatin1String(kFormat))
            fail(QStringLiteral("format"), QStringLiteral("expected \"%1\", found \"%2\"").arg(QLatin1String(kFormat), format));
        const int version = optInt(top, QStringLiteral("version"), QString(), TreeFileVersion);
        if (version != TreeFileVersion)
            fail(QStringLiteral("version"),
                 QStringLiteral("unknown version %1 (this server reads version %2)").arg(version).arg(TreeFileVersion));
        mTree.serverName = optString(top, QStringLiteral("server"), QString(), QStringLiteral("Zel Memory Server"));
        readUsers(top);
        readKeys(top);
        readResolutions(top);
        readSettings(top);
        if (!top.value(QStringLiteral("root")).isObject())
            fail(QStringLiteral("root"), QStringLiteral("missing or not an object (the tree's root node)"));
        const QJsonObject rootObject = top.value(QStringLiteral("root")).toObject();
        collectExplicitIds(rootObject);
        readNodes(rootObject);
        resolveReferences();
        readLinkedProjects(top);
    }

private:
    [[noreturn]] void fail(const QString& path, const QString& message)
    {
        throw Failure{mSource + QStringLiteral(": ") + path + QStringLiteral(": ") + message};
    }

    QString optString(const QJsonObject& object, const QString& key, const Where& parent, const QString& fallback)
    {
        const QJsonValue value = object.value(key);
        if (value.isUndefined() || value.isNull())
            return fallback;
        if (!value.isString())
            fail(fieldPath(parent, key), QStringLiteral("expected a string"));
        return value.toString();
    }

    QString reqString(const QJsonObject& object, const QString& key, const Where& parent)
    {
        const QJsonValue value = object.value(key);
        if (value.isUndefined())
            fail(fieldPath(parent, key), QStringLiteral("missing"));
        if (!value.isString())
            fail(fieldPath(parent, key), QStringLiteral("expected a string"));
        QString text = value.toString();
        if (text.isEmpty())
            fail(fieldPath(parent, key), QStringLiteral("must not be empty"));
        return text;
    }

    bool optBool(const QJsonObject& object, const QString& key, const Where& parent, bool fallback)
    {
        const QJsonValue value = object.value(key);
        if (value.isUndefined() || value.isNull())
            return fallback;
        if (!value.isBool())
            fail(fieldPath(parent, key), QStringLiteral("expected true or false"));
        return value.toBool();
    }

    int optInt(const QJsonObject& object, const QString& key, const Where& parent, int fallback)
    {
        const QJsonValue value = object.value(key);
        if (value.isUndefined() || value.isNull())
            return fallback;
        if (!value.isDouble() || value.toDouble() != static_cast<double>(value.toInt()))
            fail(fieldPath(parent, key), QStringLiteral("expected a whole number"));
        return value.toInt();
    }

    QDateTime optDate(const QJsonObject& object, const QString& key, const Where& parent)
    {
        const QString text = optString(object, key, parent, QString());
        if (text.isEmpty())
            return QDateTime();
        QDateTime date = QDateTime::fromString(text, Qt::ISODate);
        if (!date.isValid())
            fail(fieldPath(parent, key), QStringLiteral("\"%1\" is not an ISO 8601 date and time").arg(text));
        return date.toUTC();
    }

    QJsonArray optArray(const QJsonObject& object, const QString& key, const Where& parent)
    {
        const QJsonValue value = object.value(key);
        if (value.isUndefined() || value.isNull())
            return QJsonArray();
        if (!value.isArray())
            fail(fieldPath(parent, key), QStringLiteral("expected an array"));
        return value.toArray();
    }

    QJsonObject optObject(const QJsonObject& object, const QString& key, const Where& parent)
    {
        const QJsonValue value = object.value(key);
        if (value.isUndefined() || value.isNull())
            return QJsonObject();
        if (!value.isObject())
            fail(fieldPath(parent, key), QStringLiteral("expected an object"));
        return value.toObject();
    }

    QJsonObject element(const QJsonArray& array, int i, const QString& path)
    {
        if (!array.at(i).isObject())
            fail(path, QStringLiteral("expected an object"));
        return array.at(i).toObject();
    }

    static QString at(const QString& path, int i) { return path + QLatin1Char('[') + QString::number(i) + QLatin1Char(']'); }
    static QString dot(const QString& path, const QString& key) { return path + QLatin1Char('.') + key; }
    // The path of a member: its key alone at the top, otherwise parent.key.
    static QString fieldPath(const Where& parent, const QString& key)
    {
        const QString text = parent.text();
        return text.isEmpty() ? key : dot(text, key);
    }

    // Settings obey the limits of settings documents (see MaxSettingsLevels).
    SettingPairs readPairs(const QJsonObject& object, const QString& path)
    {
        SettingPairs pairs;
        qint64 size = 0;
        if (object.size() > MaxSettingsCount)
            fail(path, QStringLiteral("more than %1 settings").arg(MaxSettingsCount));
        for (auto it = object.begin(); it != object.end(); ++it) {
            const QString key = it.key();
            if (!it.value().isString())
                fail(dot(path, key), QStringLiteral("expected a string"));
            if (key.size() > MaxSettingsKeyLength)
                fail(dot(path, key.left(20) + QStringLiteral("...")),
                     QStringLiteral("a settings key longer than %1 characters").arg(MaxSettingsKeyLength));
            if (key.count(QLatin1Char('.')) >= MaxSettingsLevels)
                fail(dot(path, key), QStringLiteral("a settings key of more than %1 levels").arg(MaxSettingsLevels));
            const QString value = it.value().toString();
            size += key.size() + value.size();
            if (size > MaxSettingsSize)
                fail(path, QStringLiteral("settings of more than %1 characters").arg(MaxSettingsSize));
            pairs.append(qMakePair(key, value));
        }
        return pairs;
    }

    void readUsers(const QJsonObject& top)
    {
        const QJsonArray users = optArray(top, QStringLiteral("users"), QString());
        for (int i = 0; i < users.size(); ++i) {
            const QString path = at(QStringLiteral("users"), i);
            const QJsonObject o = element(users, i, path);
            User user;
            user.name = reqString(o, QStringLiteral("name"), path);
            if (user.name == QLatin1String("*"))
                fail(dot(path, QStringLiteral("name")), QStringLiteral("\"*\" stands for every user and cannot be a user's name"));
            if (mTree.user(user.name))
                fail(dot(path, QStringLiteral("name")), QStringLiteral("a second user named \"%1\"").arg(user.name));
            user.password = optString(o, QStringLiteral("password"), path, QString());
            user.fullName = optString(o, QStringLiteral("fullName"), path, user.name);
            user.admin = optBool(o, QStringLiteral("admin"), path, false);
            mTree.users.append(user);
        }
    }

    void readKeys(const QJsonObject& top)
    {
        const QJsonArray keys = optArray(top, QStringLiteral("propertyKeys"), QString());
        for (int i = 0; i < keys.size(); ++i) {
            const QString path = at(QStringLiteral("propertyKeys"), i);
            const QJsonObject o = element(keys, i, path);
            KeyDesc key;
            key.key = reqString(o, QStringLiteral("key"), path);
            if (mTree.key(key.key))
                fail(dot(path, QStringLiteral("key")), QStringLiteral("a second description of the key \"%1\"").arg(key.key));
            key.displayName = optString(o, QStringLiteral("displayName"), path, key.key);
            key.internalName = optString(o, QStringLiteral("internalName"), path, key.key);
            key.modifiable = optBool(o, QStringLiteral("modifiable"), path, true);
            key.available = optBool(o, QStringLiteral("available"), path, true);
            key.type = optInt(o, QStringLiteral("type"), path, KeyTypeText);
            if (!isKnownKeyType(key.type))
                fail(dot(path, QStringLiteral("type")),
                     QStringLiteral("unknown key type %1 (expected 1 text, 2 video resolution, 3 audio resolution, "
                                    "4 timecode, 5 date or 6 number)")
                         .arg(key.type));
            key.textSearchable = optBool(o, QStringLiteral("textSearchable"), path, true);
            key.hasCustomValues = optBool(o, QStringLiteral("customValues"), path, false);
            mTree.keys.append(key);
        }
    }

    void readResolutions(const QJsonObject& top)
    {
        const QJsonArray list = optArray(top, QStringLiteral("resolutions"), QString());
        for (int i = 0; i < list.size(); ++i) {
            const QString path = at(QStringLiteral("resolutions"), i);
            const QJsonObject o = element(list, i, path);
            Resolution r;
            r.label = reqString(o, QStringLiteral("label"), path);
            r.id = reqString(o, QStringLiteral("id"), path);
            r.type = optInt(o, QStringLiteral("type"), path, 2);
            if (r.type != 2 && r.type != 3)
                fail(dot(path, QStringLiteral("type")), QStringLiteral("expected 2 (video) or 3 (audio)"));
            mTree.resolutions.append(r);
        }
    }

    void readSettings(const QJsonObject& top)
    {
        const QString base = QStringLiteral("settings");
        const QJsonObject settings = optObject(top, base, QString());
        mTree.workgroupSettings = readPairs(optObject(settings, QStringLiteral("workgroup"), base),
                                            dot(base, QStringLiteral("workgroup")));
        const QString appsPath = dot(base, QStringLiteral("applications"));
        const QJsonObject apps = optObject(settings, QStringLiteral("applications"), base);
        for (auto it = apps.begin(); it != apps.end(); ++it) {
            if (!it.value().isObject())
                fail(dot(appsPath, it.key()), QStringLiteral("expected an object"));
            mTree.applicationSettings.insert(it.key(), readPairs(it.value().toObject(), dot(appsPath, it.key())));
        }
        const QString usersPath = dot(base, QStringLiteral("users"));
        const QJsonObject users = optObject(settings, QStringLiteral("users"), base);
        for (auto it = users.begin(); it != users.end(); ++it) {
            const QString userPath = dot(usersPath, it.key());
            if (!mTree.user(it.key()))
                fail(userPath, QStringLiteral("no user is named \"%1\"").arg(it.key()));
            if (!it.value().isObject())
                fail(userPath, QStringLiteral("expected an object"));
            const QJsonObject types = it.value().toObject();
            QMap<int, SettingPairs> byType;
            for (auto t = types.begin(); t != types.end(); ++t) {
                int type = 0;
                while (type < 3 && t.key() != QLatin1String(userSettingsTypeName(type)))
                    ++type;
                if (type == 3)
                    fail(dot(userPath, t.key()), QStringLiteral("unknown settings type (expected general, project or site)"));
                if (!t.value().isObject())
                    fail(dot(userPath, t.key()), QStringLiteral("expected an object"));
                byType.insert(type, readPairs(t.value().toObject(), dot(userPath, t.key())));
            }
            mTree.userSettings.insert(it.key(), byType);
        }
        const QString docsPath = dot(base, QStringLiteral("documents"));
        const QJsonObject docs = optObject(settings, QStringLiteral("documents"), base);
        for (auto it = docs.begin(); it != docs.end(); ++it) {
            if (!it.value().isString())
                fail(dot(docsPath, it.key()), QStringLiteral("expected a string"));
            mTree.documents.insert(it.key(), it.value().toString());
        }
    }

    QList<Marker> readMarkers(const QJsonObject& o, const QString& key, const Where& path)
    {
        QList<Marker> markers;
        const QJsonArray list = optArray(o, key, path);
        for (int i = 0; i < list.size(); ++i) {
            const QString p = at(dot(path.text(), key), i);
            const QJsonObject m = element(list, i, p);
            Marker marker;
            marker.id = reqString(m, QStringLiteral("id"), p);
            marker.properties = readPairs(optObject(m, QStringLiteral("properties"), p),
                                          dot(p, QStringLiteral("properties")));
            markers.append(marker);
        }
        return markers;
    }

    // Node IDs and monikers given in the file, so that generated ones avoid
    // them wherever they appear (also later in the file).
    // Also makes room for all the nodes in the tree's tables.
    void collectExplicitIds(const QJsonObject& root)
    {
        // The arrays of children still to visit; each node is looked at in
        // place, without being copied out of its array.
        std::vector<QJsonArray> pending;
        int count = 0;
        auto visit = [&](const QJsonObject& o) {
            ++count;
            const QJsonValue id = o.value(QStringLiteral("id"));
            if (id.isString())
                mExplicitIds.insert(id.toString());
            const QJsonValue moniker = o.value(QStringLiteral("moniker"));
            if (moniker.isString())
                mExplicitMonikers.insert(moniker.toString());
            const QJsonValue children = o.value(QStringLiteral("children"));
            if (children.isArray())
                pending.push_back(children.toArray());
        };
        visit(root);
        while (!pending.empty()) {
            const QJsonArray children = pending.back();
            pending.pop_back();
            for (const QJsonValue& child : children) {
                if (child.isObject())
                    visit(child.toObject());
            }
        }
        mTree.nodes.reserve(static_cast<std::size_t>(count));
        mSteps.reserve(static_cast<std::size_t>(count));
    }

    // One copy of each text that many nodes repeat (mime types, property
    // keys): the nodes share it rather than holding a copy each.
    QString shared(const QString& text)
    {
        auto known = mSharedTexts.constFind(text);
        if (known != mSharedTexts.constEnd())
            return *known;
        mSharedTexts.insert(text);
        return text;
    }

    // A node ID that no node has and that the file gives to no node later,
    // whose moniker no node has either, now or later in the file. The tree
    // holds only this file's nodes, whose IDs and monikers are either given
    // in the file (collectExplicitIds) or made here from serial numbers that
    // never repeat: checking the file's is enough.
    QString generatedId()
    {
        for (;;) {
            const QString id = mTree.nextNodeId();
            if (!mExplicitIds.contains(id) && (mExplicitMonikers.isEmpty() || !mExplicitMonikers.contains(monikerOfId(id))))
                return id;
        }
    }

    // The tree below "root", depth first with children in order, without
    // recursion: each node is read and inserted before its children, and a
    // folder's children are taken in file order.
    void readNodes(const QJsonObject& rootObject)
    {
        mSteps.push_back(PathStep{-1, 0});
        StoredNode& root = readNode(rootObject, 0, nullptr);
        if (!Zel_MimeTypeSpec(Zel_MimeTypes_Containers).isType(root.mimeType))
            fail(QStringLiteral("root.mimeType"), QStringLiteral("the root must be a container (project, bin, folder, catalog, workspace), not \"%1\"").arg(root.mimeType));
        mTree.rootId = root.id;

        struct Pending {
            QJsonValue value;
            int step;
            StoredNode* parent; // references into the node table stay valid
            int depth;
        };
        std::vector<Pending> pending;
        auto pushChildren = [&](const QJsonObject& o, int step, StoredNode& node, int depth) {
            const QJsonArray children = optArray(o, QStringLiteral("children"), Where(mSteps, step));
            if (children.isEmpty())
                return;
            node.childByName.reserve(children.size());
            for (int i = children.size() - 1; i >= 0; --i) {
                mSteps.push_back(PathStep{step, i});
                pending.push_back(Pending{children.at(i), static_cast<int>(mSteps.size()) - 1, &node, depth + 1});
            }
        };
        pushChildren(rootObject, 0, root, 0);
        while (!pending.empty()) {
            const Pending next = std::move(pending.back());
            pending.pop_back();
            const Where where(mSteps, next.step);
            if (!next.value.isObject())
                fail(where.text(), QStringLiteral("expected an object"));
            const QJsonObject child = next.value.toObject();
            StoredNode* parent = next.parent;
            if (next.depth > MaxDepth)
                fail(where.text(), QStringLiteral("lies %1 levels below the root; the server allows at most %2").arg(next.depth).arg(MaxDepth));
            StoredNode& stored = readNode(child, next.step, parent);
            pushChildren(child, next.step, stored, next.depth);
        }
    }

    // One node without its children, inserted under parent (the root when
    // parent is null).
    StoredNode& readNode(const QJsonObject& o, int step, StoredNode* parent)
    {
        const Where path(mSteps, step);
        StoredNode node;
        node.id = optString(o, QStringLiteral("id"), path, QString());
        // A generated ID, and the moniker made from it, are known to be new
        // (generatedId); only given ones are looked up.
        const bool generated = node.id.isEmpty();
        if (generated)
            node.id = generatedId();
        else if (mTree.byId(node.id))
            fail(dot(path.text(), QStringLiteral("id")), QStringLiteral("a second node with the ID \"%1\"").arg(node.id));
        const QJsonValue givenMoniker = o.value(QStringLiteral("moniker"));
        const bool defaultMoniker = givenMoniker.isUndefined() || givenMoniker.isNull();
        node.moniker = defaultMoniker ? monikerOfId(node.id) : optString(o, QStringLiteral("moniker"), path, QString());
        if (node.moniker.isEmpty())
            fail(dot(path.text(), QStringLiteral("moniker")), QStringLiteral("must not be empty"));
        if (!(generated && defaultMoniker) && mTree.byMoniker(node.moniker))
            fail(dot(path.text(), QStringLiteral("moniker")), QStringLiteral("a second node with the moniker \"%1\"").arg(node.moniker));
        node.name = reqString(o, QStringLiteral("name"), path);
        if (node.name.contains(QLatin1Char('/')))
            fail(dot(path.text(), QStringLiteral("name")),
                 QStringLiteral("\"%1\" contains \"/\", which separates the names of a path").arg(node.name));
        if (node.name.size() > MaxNameLength)
            fail(dot(path.text(), QStringLiteral("name")),
                 QStringLiteral("longer than the %1 characters a name may have").arg(MaxNameLength));
        node.mimeType = reqString(o, QStringLiteral("mimeType"), path);
        Zel_MimeTypeValue mimeValue;
        if (!Zel_MimeTypeSpec::getType(node.mimeType, mimeValue))
            fail(dot(path.text(), QStringLiteral("mimeType")), QStringLiteral("unknown mime type \"%1\"").arg(node.mimeType));
        node.mimeType = shared(node.mimeType);
        if (parent && !Zel_MimeTypeSpec(Zel_MimeTypes_Containers).isType(parent->mimeType))
            fail(path.text(), QStringLiteral("the parent \"%1\" is a %2, which cannot hold children").arg(parent->name, parent->mimeType));
        node.mobId = optString(o, QStringLiteral("mobID"), path, QString());
        if (!node.mobId.isEmpty()) {
            if (mMobIds.contains(node.mobId))
                fail(dot(path.text(), QStringLiteral("mobID")),
                     QStringLiteral("a second node with the media object ID \"%1\"").arg(node.mobId));
            mMobIds.insert(node.mobId);
        }
        node.masterMoniker = optString(o, QStringLiteral("master"), path, QString());
        node.userPlaced = optBool(o, QStringLiteral("userPlaced"), path, true);
        node.created = optDate(o, QStringLiteral("created"), path);
        node.modified = optDate(o, QStringLiteral("modified"), path);

        auto propsPath = [&path] { return dot(path.text(), QStringLiteral("properties")); };
        const QJsonObject props = optObject(o, QStringLiteral("properties"), path);
        for (auto it = props.begin(); it != props.end(); ++it) {
            Property p;
            p.key = shared(it.key());
            if (p.key == QLatin1String("Name") || p.key == QLatin1String("Mime Type") || p.key == QLatin1String("MobID"))
                fail(dot(propsPath(), p.key), QStringLiteral("set by \"name\", \"mimeType\" and \"mobID\", not as a property"));
            if (it.value().isString()) {
                p.value = it.value().toString();
            } else if (it.value().isObject()) {
                const QJsonObject po = it.value().toObject();
                p.value = optString(po, QStringLiteral("value"), dot(propsPath(), p.key), QString());
                p.customValues = optString(po, QStringLiteral("customValues"), dot(propsPath(), p.key), QString());
            } else {
                fail(dot(propsPath(), p.key), QStringLiteral("expected a string or an object with \"value\" and \"customValues\""));
            }
            node.properties.append(p);
        }

        const QJsonObject reservation = optObject(o, QStringLiteral("reservation"), path);
        if (!reservation.isEmpty()) {
            const QString resPath = dot(path.text(), QStringLiteral("reservation"));
            node.reservation.user = reqString(reservation, QStringLiteral("user"), resPath);
            if (!mTree.user(node.reservation.user))
                fail(dot(resPath, QStringLiteral("user")), QStringLiteral("no user is named \"%1\"").arg(node.reservation.user));
            node.reservation.since = optDate(reservation, QStringLiteral("since"), resPath);
            node.reservation.until = optDate(reservation, QStringLiteral("until"), resPath);
        }

        const QJsonObject permissions = optObject(o, QStringLiteral("permissions"), path);
        for (auto it = permissions.begin(); it != permissions.end(); ++it) {
            const QString p = dot(dot(path.text(), QStringLiteral("permissions")), it.key());
            if (it.key() != QLatin1String("*") && !mTree.user(it.key()))
                fail(p, QStringLiteral("no user is named \"%1\"").arg(it.key()));
            if (!it.value().isArray())
                fail(p, QStringLiteral("expected an array of permission names"));
            QStringList names;
            for (const QJsonValue& v : it.value().toArray()) {
                if (!v.isString())
                    fail(p, QStringLiteral("expected an array of permission names"));
                names << v.toString();
            }
            std::uint32_t bits = 0;
            QString unknown;
            if (!permissionsFromNames(names, bits, unknown))
                fail(p, QStringLiteral("unknown permission \"%1\"").arg(unknown));
            node.permissions.insert(it.key(), bits);
        }

        node.locators = readMarkers(o, QStringLiteral("locators"), path);
        node.restrictions = readMarkers(o, QStringLiteral("restrictions"), path);

        const QJsonArray deps = optArray(o, QStringLiteral("dependencies"), path);
        for (int i = 0; i < deps.size(); ++i) {
            const QString p = at(dot(path.text(), QStringLiteral("dependencies")), i);
            const QJsonObject d = element(deps, i, p);
            Dependency dep;
            dep.moniker = reqString(d, QStringLiteral("moniker"), p);
            mDependencyPaths.append(qMakePair(dep.moniker, dot(p, QStringLiteral("moniker"))));
            dep.usage = optString(d, QStringLiteral("usage"), p, QString());
            dep.type = optInt(d, QStringLiteral("type"), p, 0);
            node.dependencies.append(dep);
        }

        const QJsonArray media = optArray(o, QStringLiteral("media"), path);
        for (int i = 0; i < media.size(); ++i) {
            const QString p = at(dot(path.text(), QStringLiteral("media")), i);
            const QJsonObject m = element(media, i, p);
            Media file;
            file.path = reqString(m, QStringLiteral("path"), p);
            file.resolution = optString(m, QStringLiteral("resolution"), p, QString());
            node.media.append(file);
        }

        StoredNode* stored = nullptr;
        if (parent) {
            // A name the parent's index of names already holds is a second
            // child of that name; the index is looked up once, by the
            // insertion (the tree is dropped when the load fails).
            const int named = parent->childByName.size();
            stored = &mTree.insertNode(std::move(node), *parent);
            if (parent->childByName.size() == named)
                fail(dot(path.text(), QStringLiteral("name")),
                     QStringLiteral("a second child named \"%1\" in \"%2\"").arg(stored->name, parent->name));
        } else {
            stored = &mTree.addNode(std::move(node));
        }
        if (!stored->masterMoniker.isEmpty())
            mMasters.emplace_back(stored, step);
        return *stored;
    }

    void resolveReferences()
    {
        // Dependencies name nodes by moniker, in file order.
        for (const auto& dependency : mDependencyPaths) {
            if (!mTree.byMoniker(dependency.first))
                fail(dependency.second, QStringLiteral("no node has the moniker \"%1\"").arg(dependency.first));
        }
        // Masters, in file order (only the nodes that name one are visited).
        for (const auto& master : mMasters) {
            const Node& node = *master.first;
            if (!mTree.byMoniker(node.masterMoniker) && !mTree.byId(node.masterMoniker))
                fail(dot(Where(mSteps, master.second).text(), QStringLiteral("master")),
                     QStringLiteral("no node has the moniker or ID \"%1\"").arg(node.masterMoniker));
        }
        // A master given by ID is stored as the master's moniker.
        for (const auto& master : mMasters) {
            Node& node = *master.first;
            if (!mTree.byMoniker(node.masterMoniker))
                node.masterMoniker = mTree.byId(node.masterMoniker)->moniker;
        }
    }

    void readLinkedProjects(const QJsonObject& top)
    {
        const QJsonArray list = optArray(top, QStringLiteral("linkedProjects"), QString());
        for (int i = 0; i < list.size(); ++i) {
            const QString path = at(QStringLiteral("linkedProjects"), i);
            if (!list.at(i).isString())
                fail(path, QStringLiteral("expected a string"));
            const QString ref = list.at(i).toString();
            const Node* node = mTree.byMoniker(ref);
            if (!node)
                node = mTree.byId(ref);
            if (!node)
                fail(path, QStringLiteral("no node has the moniker or ID \"%1\"").arg(ref));
            mTree.linkedProjects.append(node->moniker);
        }
    }

    Tree& mTree;
    QString mSource;
    std::vector<PathStep> mSteps;      // every node's place in the file; the root's first
    std::vector<std::pair<StoredNode*, int>> mMasters; // the nodes that name a master, with their steps, in file order
    QSet<QString> mExplicitIds;
    QSet<QString> mExplicitMonikers;
    QSet<QString> mMobIds;
    QSet<QString> mSharedTexts;
    QList<QPair<QString, QString>> mDependencyPaths; // moniker -> path of the dependency's moniker
};

// Line and column (both from 1; the column counts characters) of a byte offset.
void position(const QByteArray& data, int offset, int& line, int& column)
{
    offset = qBound(0, offset, data.size());
    line = 1;
    int lineStart = 0;
    for (int i = 0; i < offset; ++i) {
        if (data.at(i) == '\n') {
            ++line;
            lineStart = i + 1;
        }
    }
    column = QString::fromUtf8(data.constData() + lineStart, offset - lineStart).size() + 1;
}

QJsonObject pairsToObject(const SettingPairs& pairs)
{
    QJsonObject o;
    for (const auto& pair : pairs)
        o.insert(pair.first, pair.second);
    return o;
}

QString isoDate(const QDateTime& date)
{
    return date.toUTC().toString(Qt::ISODate);
}

QJsonArray markersToJson(const QList<Marker>& markers)
{
    QJsonArray list;
    for (const Marker& m : markers) {
        QJsonObject o;
        o.insert(QStringLiteral("id"), m.id);
        if (!m.properties.isEmpty())
            o.insert(QStringLiteral("properties"), pairsToObject(m.properties));
        list.append(o);
    }
    return list;
}

// One node's members without its children.
QJsonObject nodeFieldsToJson(const Node& node)
{
    QJsonObject o;
    o.insert(QStringLiteral("id"), node.id);
    if (node.moniker != monikerOfId(node.id))
        o.insert(QStringLiteral("moniker"), node.moniker);
    o.insert(QStringLiteral("name"), node.name);
    o.insert(QStringLiteral("mimeType"), node.mimeType);
    if (!node.mobId.isEmpty())
        o.insert(QStringLiteral("mobID"), node.mobId);
    if (!node.masterMoniker.isEmpty())
        o.insert(QStringLiteral("master"), node.masterMoniker);
    if (!node.userPlaced)
        o.insert(QStringLiteral("userPlaced"), false);
    if (node.created.isValid())
        o.insert(QStringLiteral("created"), isoDate(node.created));
    if (node.modified.isValid())
        o.insert(QStringLiteral("modified"), isoDate(node.modified));
    if (!node.properties.isEmpty()) {
        QJsonObject props;
        for (const Property& p : node.properties) {
            if (p.customValues.isEmpty()) {
                props.insert(p.key, p.value);
            } else {
                QJsonObject po;
                po.insert(QStringLiteral("value"), p.value);
                po.insert(QStringLiteral("customValues"), p.customValues);
                props.insert(p.key, po);
            }
        }
        o.insert(QStringLiteral("properties"), props);
    }
    if (!node.reservation.user.isEmpty()) {
        QJsonObject r;
        r.insert(QStringLiteral("user"), node.reservation.user);
        if (node.reservation.since.isValid())
            r.insert(QStringLiteral("since"), isoDate(node.reservation.since));
        if (node.reservation.until.isValid())
            r.insert(QStringLiteral("until"), isoDate(node.reservation.until));
        o.insert(QStringLiteral("reservation"), r);
    }
    if (!node.permissions.isEmpty()) {
        QJsonObject perms;
        for (auto it = node.permissions.constBegin(); it != node.permissions.constEnd(); ++it)
            perms.insert(it.key(), QJsonArray::fromStringList(permissionNames(it.value())));
        o.insert(QStringLiteral("permissions"), perms);
    }
    if (!node.locators.isEmpty())
        o.insert(QStringLiteral("locators"), markersToJson(node.locators));
    if (!node.restrictions.isEmpty())
        o.insert(QStringLiteral("restrictions"), markersToJson(node.restrictions));
    if (!node.dependencies.isEmpty()) {
        QJsonArray deps;
        for (const Dependency& d : node.dependencies) {
            QJsonObject dep;
            dep.insert(QStringLiteral("moniker"), d.moniker);
            dep.insert(QStringLiteral("usage"), d.usage);
            dep.insert(QStringLiteral("type"), d.type);
            deps.append(dep);
        }
        o.insert(QStringLiteral("dependencies"), deps);
    }
    if (!node.media.isEmpty()) {
        QJsonArray media;
        for (const Media& m : node.media) {
            QJsonObject file;
            file.insert(QStringLiteral("path"), m.path);
            if (!m.resolution.isEmpty())
                file.insert(QStringLiteral("resolution"), m.resolution);
            media.append(file);
        }
        o.insert(QStringLiteral("media"), media);
    }
    return o;
}

// A node and its subtree, built without recursion: a stack of open nodes,
// each with the children array it is filling; a node's object is complete
// when its last child is, and then goes into its parent's array.
template <class ChildrenOf>
QJsonObject nodeToJson(const Node& node, ChildrenOf childrenOf)
{
    struct Open {
        const Node* node;
        QJsonObject object;
        QJsonArray children;
        std::vector<const Node*> childRecords;
        std::size_t next;
    };
    std::vector<Open> open;
    auto push = [&](const Node& n) {
        open.push_back(Open{&n, nodeFieldsToJson(n), QJsonArray(), {}, 0});
        childrenOf(n, open.back().childRecords);
    };
    push(node);
    for (;;) {
        Open& top = open.back();
        if (top.next < top.childRecords.size()) {
            const Node* child = top.childRecords[top.next++];
            push(*child);
            continue;
        }
        if (!top.childRecords.empty())
            top.object.insert(QStringLiteral("children"), top.children);
        QJsonObject done = top.object;
        open.pop_back();
        if (open.empty())
            return done;
        open.back().children.append(done);
    }
}

// Finds a member name given twice in one object of a JSON text (Qt's reader
// keeps the last silently, and Qt 5's leaks the replaced value). Runs before
// the reader, once over the text, without recursion; names are compared after
// unescaping. Answers the byte offsets of the second and of the first
// occurrence (of their opening quotes), or false when every object's names
// are distinct, and also false as soon as the text is malformed in a way it
// notices (mismatched brackets, a name without ":"), so that the reader
// reports that error instead.
bool findDuplicateMember(const QByteArray& json, int& offset, int& firstOffset, QString& name)
{
    // The names of the open objects lie on one stack, each object's above
    // its start: nothing is allocated per object. A name of plain ASCII
    // without escapes is compared as it is written; any other is unescaped
    // (and decoded) once. An object with many names looks them up in a hash.
    struct Name {
        int offset;    // of the opening quote
        int length;    // of the text between the quotes
        bool plain;    // ASCII without escapes: the text is the name
        QString text;  // the name, when it is not plain
    };
    struct Level {
        bool object;
        bool expectName;
        std::size_t firstName;            // index into names
        std::unique_ptr<QHash<QString, int>> index; // name -> index into names, for large objects
    };
    const std::size_t HashFrom = 16;
    std::vector<Level> levels;
    std::vector<Name> names;
    const char* data = json.constData();
    const int size = json.size();
    auto textOf = [data](const Name& n) {
        return n.plain ? QString::fromLatin1(data + n.offset + 1, n.length) : n.text;
    };
    auto same = [data](const Name& a, const Name& b) {
        if (a.plain && b.plain)
            return a.length == b.length && std::memcmp(data + a.offset + 1, data + b.offset + 1, a.length) == 0;
        if (a.plain)
            return b.text == QLatin1String(data + a.offset + 1, a.length);
        if (b.plain)
            return a.text == QLatin1String(data + b.offset + 1, b.length);
        return a.text == b.text;
    };
    for (int i = 0; i < size; ++i) {
        const char c = data[i];
        switch (c) {
        case '{':
            levels.push_back(Level{true, true, names.size(), nullptr});
            break;
        case '[':
            levels.push_back(Level{false, false, names.size(), nullptr});
            break;
        case '}':
        case ']':
            if (levels.empty() || levels.back().object != (c == '}'))
                return false;
            names.resize(levels.back().firstName);
            levels.pop_back();
            break;
        case ',':
            if (!levels.empty() && levels.back().object)
                levels.back().expectName = true;
            break;
        case '"': {
            const int start = i;
            bool escaped = false;
            bool ascii = true;
            int j = i + 1;
            while (j < size && data[j] != '"') {
                if (data[j] == '\\') {
                    escaped = true;
                    ++j;
                } else if (static_cast<unsigned char>(data[j]) >= 0x80) {
                    ascii = false;
                }
                ++j;
            }
            i = j; // the closing quote
            if (levels.empty() || !levels.back().object || !levels.back().expectName)
                break;
            Level& level = levels.back();
            level.expectName = false;
            int colon = j + 1;
            while (colon < size && (data[colon] == ' ' || data[colon] == '\t' || data[colon] == '\n' || data[colon] == '\r'))
                ++colon;
            if (colon >= size || data[colon] != ':')
                return false;
            Name current{start, j - start - 1, ascii && !escaped, QString()};
            if (!current.plain) {
                if (!escaped) {
                    current.text = QString::fromUtf8(data + start + 1, j - start - 1);
                } else {
                    // Let the JSON reader unescape the name: ["<name>"].
                    const QByteArray wrapped = QByteArray("[") + QByteArray(data + start, j - start + 1) + ']';
                    QJsonParseError unescapeError;
                    const QJsonDocument unescaped = QJsonDocument::fromJson(wrapped, &unescapeError);
                    if (unescapeError.error != QJsonParseError::NoError)
                        return false;
                    current.text = unescaped.array().at(0).toString();
                }
            }
            int known = -1;
            if (level.index) {
                known = level.index->value(textOf(current), -1);
            } else {
                for (std::size_t k = level.firstName; k < names.size(); ++k) {
                    if (same(names[k], current)) {
                        known = static_cast<int>(k);
                        break;
                    }
                }
            }
            if (known >= 0) {
                offset = start;
                firstOffset = names[static_cast<std::size_t>(known)].offset;
                name = textOf(current);
                return true;
            }
            names.push_back(current);
            if (level.index) {
                level.index->insert(textOf(current), static_cast<int>(names.size() - 1));
            } else if (names.size() - level.firstName >= HashFrom) {
                level.index.reset(new QHash<QString, int>);
                for (std::size_t k = level.firstName; k < names.size(); ++k)
                    level.index->insert(textOf(names[k]), static_cast<int>(k));
            }
            break;
        }
        default:
            break;
        }
    }
    return false;
}

} // namespace

bool loadTree(Tree& tree, const QByteArray& json, const QString& sourceName, QString& error)
{
    int duplicate = 0;
    int first = 0;
    QString member;
    if (findDuplicateMember(json, duplicate, first, member)) {
        int line = 0;
        int column = 0;
        int firstLine = 0;
        int firstColumn = 0;
        position(json, duplicate, line, column);
        position(json, first, firstLine, firstColumn);
        error = QStringLiteral("%1:%2:%3: a second member named \"%4\" in one object (the first is at %5:%6)")
                    .arg(sourceName)
                    .arg(line)
                    .arg(column)
                    .arg(member)
                    .arg(firstLine)
                    .arg(firstColumn);
        return false;
    }
    QJsonParseError parseError;
    const QJsonDocument document = QJsonDocument::fromJson(json, &parseError);
    if (parseError.error != QJsonParseError::NoError) {
        int line = 0;
        int column = 0;
        position(json, parseError.offset, line, column);
        error = QStringLiteral("%1:%2:%3: %4").arg(sourceName).arg(line).arg(column).arg(parseError.errorString());
        return false;
    }
    if (!document.isObject()) {
        error = sourceName + QStringLiteral(": the tree file must hold one JSON object");
        return false;
    }
    try {
        Reader(tree, sourceName).read(document.object());
    } catch (const Failure& failure) {
        error = failure.message;
        return false;
    }
    return true;
}

QByteArray nodeJson(ReadTxn& txn, const Node& node)
{
    const QJsonObject object
        = nodeToJson(node, [&txn](const Node& n, std::vector<const Node*>& out) { txn.children(n, out); });
    return QJsonDocument(object).toJson(QJsonDocument::Compact);
}

QByteArray saveTree(const Tree& tree)
{
    QJsonObject top;
    top.insert(QStringLiteral("format"), QLatin1String(kFormat));
    top.insert(QStringLiteral("version"), 1);
    top.insert(QStringLiteral("server"), tree.serverName);

    QJsonArray users;
    for (const User& u : tree.users) {
        QJsonObject o;
        o.insert(QStringLiteral("name"), u.name);
        o.insert(QStringLiteral("password"), u.password);
        o.insert(QStringLiteral("fullName"), u.fullName);
        if (u.admin)
            o.insert(QStringLiteral("admin"), true);
        users.append(o);
    }
    top.insert(QStringLiteral("users"), users);

    QJsonArray keys;
    for (const KeyDesc& k : tree.keys) {
        QJsonObject o;
        o.insert(QStringLiteral("key"), k.key);
        o.insert(QStringLiteral("displayName"), k.displayName);
        o.insert(QStringLiteral("internalName"), k.internalName);
        o.insert(QStringLiteral("modifiable"), k.modifiable);
        o.insert(QStringLiteral("available"), k.available);
        o.insert(QStringLiteral("type"), k.type);
        o.insert(QStringLiteral("textSearchable"), k.textSearchable);
        o.insert(QStringLiteral("customValues"), k.hasCustomValues);
        keys.append(o);
    }
    top.insert(QStringLiteral("propertyKeys"), keys);

    QJsonArray resolutions;
    for (const auto& r : tree.resolutions) {
        QJsonObject o;
        o.insert(QStringLiteral("label"), r.label);
        o.insert(QStringLiteral("id"), r.id);
        o.insert(QStringLiteral("type"), r.type);
        resolutions.append(o);
    }
    top.insert(QStringLiteral("resolutions"), resolutions);

    QJsonObject settings;
    settings.insert(QStringLiteral("workgroup"), pairsToObject(tree.workgroupSettings));
    QJsonObject apps;
    for (auto it = tree.applicationSettings.constBegin(); it != tree.applicationSettings.constEnd(); ++it)
        apps.insert(it.key(), pairsToObject(it.value()));
    settings.insert(QStringLiteral("applications"), apps);
    QJsonObject userSettings;
    for (auto it = tree.userSettings.constBegin(); it != tree.userSettings.constEnd(); ++it) {
        QJsonObject types;
        for (auto t = it.value().constBegin(); t != it.value().constEnd(); ++t)
            types.insert(QLatin1String(userSettingsTypeName(t.key())), pairsToObject(t.value()));
        userSettings.insert(it.key(), types);
    }
    settings.insert(QStringLiteral("users"), userSettings);
    QJsonObject docs;
    for (auto it = tree.documents.constBegin(); it != tree.documents.constEnd(); ++it)
        docs.insert(it.key(), it.value());
    settings.insert(QStringLiteral("documents"), docs);
    top.insert(QStringLiteral("settings"), settings);

    if (!tree.linkedProjects.isEmpty())
        top.insert(QStringLiteral("linkedProjects"), QJsonArray::fromStringList(tree.linkedProjects));

    if (const Node* root = tree.byId(tree.rootId)) {
        auto childrenOf = [&tree](const Node& n, std::vector<const Node*>& out) {
            for (const QString& id : static_cast<const StoredNode&>(n).children) {
                if (const StoredNode* child = tree.byId(id))
                    out.push_back(child);
            }
        };
        top.insert(QStringLiteral("root"), nodeToJson(*root, childrenOf));
    }
    return QJsonDocument(top).toJson(QJsonDocument::Indented);
}

} // namespace ZelMemory
