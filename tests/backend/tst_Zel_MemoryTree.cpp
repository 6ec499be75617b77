// The tree file: the bundled sample, saving and loading back, and malformed
// files rejected with the file's name and the position of the fault.
#include "Zel_MemoryLimits.h"
#include "Zel_MemoryTree.h"
#include "Zel_Node.h"

#include <QDir>
#include <QSet>
#include <QFile>
#include <QTemporaryDir>

#include <gtest/gtest.h>


namespace {

QString loadError(const QByteArray& json, const QString& name = QStringLiteral("tree.json"))
{
    QString error;
    boost::shared_ptr<Zel_MemoryTree> tree = Zel_MemoryTree::fromJson(json, name, &error);
    EXPECT_FALSE(tree) << "loaded although malformed: " << json.constData();
    return error;
}

const QByteArray minimal = R"({"users":[{"name":"u","password":"p"}],
"root":{"id":"R","name":"Root","mimeType":"workspace","children":[
  {"id":"P","name":"Project","mimeType":"project"}]}})";

} // namespace

TEST(Zel_MemoryTreeTest, SampleTreeLoadsWithItsProjectsUsersAndPaths)
{
    boost::shared_ptr<Zel_MemoryTree> tree = Zel_MemoryTree::sample();
    ASSERT_TRUE(tree);
    EXPECT_EQ(QStringLiteral("Newsroom Asset Server (in memory)"), tree->serverName());
    EXPECT_EQ(QStringLiteral("zel-mem://ROOT"), tree->rootMoniker());
    EXPECT_EQ(QStringLiteral("zel-mem://C-MAYOR"), tree->monikerAt(QStringLiteral("/Evening News/Footage/Interview Mayor")));
    EXPECT_EQ(QString(), tree->monikerAt(QStringLiteral("/Evening News/No Such Bin")));
    EXPECT_EQ((QStringList{QStringLiteral("admin"), QStringLiteral("editor"), QStringLiteral("producer"),
                           QStringLiteral("assistant")}),
              tree->userNames());
    EXPECT_EQ(19, tree->nodeCount());
    // Each call gives an independent copy.
    EXPECT_NE(Zel_MemoryTree::sample().get(), tree.get());
}

TEST(Zel_MemoryTreeTest, SavedTreeLoadsBackToTheSameJson)
{
    boost::shared_ptr<Zel_MemoryTree> tree = Zel_MemoryTree::sample();
    const QByteArray saved = tree->toJson();
    QString error;
    boost::shared_ptr<Zel_MemoryTree> again = Zel_MemoryTree::fromJson(saved, QStringLiteral("saved.json"), &error);
    ASSERT_TRUE(again) << error.toStdString();
    EXPECT_EQ(saved, again->toJson());
    EXPECT_EQ(tree->nodeCount(), again->nodeCount());

    QTemporaryDir dir;
    ASSERT_TRUE(dir.isValid());
    const QString path = dir.filePath(QStringLiteral("tree.json"));
    ASSERT_TRUE(tree->saveFile(path, &error)) << error.toStdString();
    boost::shared_ptr<Zel_MemoryTree> fromFile = Zel_MemoryTree::fromFile(path, &error);
    ASSERT_TRUE(fromFile) << error.toStdString();
    EXPECT_EQ(saved, fromFile->toJson());

    EXPECT_FALSE(tree->saveFile(dir.filePath(QStringLiteral("missing/dir/tree.json")), &error));
    EXPECT_TRUE(error.startsWith(dir.filePath(QStringLiteral("missing/dir/tree.json")) + QStringLiteral(": cannot be written")))
        << error.toStdString();
}

TEST(Zel_MemoryTreeTest, SyntaxErrorNamesFileLineAndColumn)
{
    // The missing comma is noticed at the start of line 3 (column 3, after two
    // blanks; the parser may report the character after it).
    const QByteArray json = "{\n  \"users\": []\n  \"root\": {}\n}\n";
    const QString error = loadError(json, QStringLiteral("broken.json"));
    EXPECT_TRUE(error.startsWith(QStringLiteral("broken.json:3:3: ")) || error.startsWith(QStringLiteral("broken.json:3:4: ")))
        << error.toStdString();
    EXPECT_TRUE(error.endsWith(QStringLiteral("unterminated object")) || error.contains(QStringLiteral("separator")))
        << error.toStdString();

    // Columns count characters, not bytes.
    const QByteArray unicode = "{\"server\": \"\xc3\xa9\xc3\xa9\" x}";
    const QString unicodeError = loadError(unicode);
    EXPECT_TRUE(unicodeError.startsWith(QStringLiteral("tree.json:1:17: ")) || unicodeError.startsWith(QStringLiteral("tree.json:1:18: ")))
        << unicodeError.toStdString();

    EXPECT_EQ(QStringLiteral("tree.json: the tree file must hold one JSON object"), loadError("[1, 2]"));
}

TEST(Zel_MemoryTreeTest, InvalidContentNamesFileAndValuePath)
{
    EXPECT_TRUE(Zel_MemoryTree::fromJson(minimal, QStringLiteral("ok.json")));

    QByteArray json = minimal;
    json.replace("\"name\":\"Project\",", "");
    EXPECT_EQ(QStringLiteral("tree.json: root.children[0].name: missing"), loadError(json));

    json = minimal;
    json.replace("\"mimeType\":\"project\"", "\"mimeType\":\"Project\"");
    EXPECT_EQ(QStringLiteral("tree.json: root.children[0].mimeType: unknown mime type \"Project\""), loadError(json));

    json = minimal;
    json.replace("\"id\":\"P\"", "\"id\":\"R\"");
    EXPECT_EQ(QStringLiteral("tree.json: root.children[0].id: a second node with the ID \"R\""), loadError(json));

    json = minimal;
    json.replace("\"mimeType\":\"project\"}", "\"mimeType\":\"project\",\"permissions\":{\"u\":[\"Read\",\"Fly\"]}}");
    EXPECT_EQ(QStringLiteral("tree.json: root.children[0].permissions.u: unknown permission \"Fly\""), loadError(json));

    json = minimal;
    json.replace("\"mimeType\":\"project\"}", "\"mimeType\":\"project\",\"reservation\":{\"user\":\"nobody\"}}");
    EXPECT_EQ(QStringLiteral("tree.json: root.children[0].reservation.user: no user is named \"nobody\""), loadError(json));

    json = minimal;
    json.replace("\"mimeType\":\"project\"}",
                 "\"mimeType\":\"project\",\"children\":[{\"name\":\"C\",\"mimeType\":\"clip\",\"children\":[{\"name\":\"D\",\"mimeType\":\"clip\"}]}]}");
    EXPECT_EQ(QStringLiteral("tree.json: root.children[0].children[0].children[0]: the parent \"C\" is a clip, which cannot hold children"),
              loadError(json));

    json = minimal;
    json.replace("\"mimeType\":\"workspace\"", "\"mimeType\":\"clip\"");
    EXPECT_TRUE(loadError(json).startsWith(QStringLiteral("tree.json: root.children[0]: the parent"))
                || loadError(json).startsWith(QStringLiteral("tree.json: root.mimeType")))
        << loadError(json).toStdString();

    EXPECT_EQ(QStringLiteral("tree.json: root: missing or not an object (the tree's root node)"), loadError("{}"));
    EXPECT_EQ(QStringLiteral("tree.json: users[0].admin: expected true or false"),
              loadError("{\"users\":[{\"name\":\"u\",\"admin\":\"yes\"}],\"root\":{}}"));
}

TEST(Zel_MemoryTreeTest, MissingFileIsNamedInTheMessage)
{
    QString error;
    EXPECT_FALSE(Zel_MemoryTree::fromFile(QStringLiteral("/nonexistent/tree.json"), &error));
    EXPECT_TRUE(error.startsWith(QStringLiteral("/nonexistent/tree.json: cannot be read: "))) << error.toStdString();
    // Without an error pointer the failure is still an empty result, not a crash.
    EXPECT_FALSE(Zel_MemoryTree::fromJson("{", QStringLiteral("x.json")));
}

namespace {

// minimal with the project's members replaced (the text after "mimeType":"project").
QByteArray withProject(const QByteArray& members)
{
    QByteArray json = minimal;
    json.replace("\"mimeType\":\"project\"}", "\"mimeType\":\"project\"" + members + "}");
    return json;
}

// A chain of bins, the deepest at the given depth below the root.
QByteArray deepTree(int depth)
{
    QByteArray json = "{\"root\":{\"id\":\"R\",\"name\":\"Root\",\"mimeType\":\"workspace\"";
    for (int i = 1; i <= depth; ++i)
        json += ",\"children\":[{\"name\":\"L" + QByteArray::number(i) + "\",\"mimeType\":\"bin\"";
    for (int i = 1; i <= depth; ++i)
        json += "}]";
    json += "}}";
    return json;
}

} // namespace

TEST(Zel_MemoryTreeTest, NamesWithSlashOrBeyondTheNameLimitAreRefused)
{
    QByteArray json = minimal;
    json.replace("\"name\":\"Project\"", "\"name\":\"Pro/ject\"");
    EXPECT_EQ(QStringLiteral("tree.json: root.children[0].name: \"Pro/ject\" contains \"/\", which separates the names of a path"),
              loadError(json));

    const QByteArray longest(Zel_MemoryLimits::MaxNameLength, 'x');
    json = minimal;
    json.replace("\"name\":\"Project\"", "\"name\":\"" + longest + "\"");
    EXPECT_TRUE(Zel_MemoryTree::fromJson(json, QStringLiteral("tree.json")));
    json = minimal;
    json.replace("\"name\":\"Project\"", "\"name\":\"" + longest + "y\"");
    EXPECT_EQ(QStringLiteral("tree.json: root.children[0].name: longer than the 128 characters a name may have"), loadError(json));
}

TEST(Zel_MemoryTreeTest, SecondNodeWithAMediaObjectIdIsRefused)
{
    const QByteArray clips = ",\"children\":[{\"id\":\"A\",\"name\":\"A\",\"mimeType\":\"masterclip\",\"mobID\":\"M-1\"},"
                             "{\"id\":\"B\",\"name\":\"B\",\"mimeType\":\"masterclip\",\"mobID\":\"M-2\"}]";
    EXPECT_TRUE(Zel_MemoryTree::fromJson(withProject(clips), QStringLiteral("tree.json")));
    QByteArray twice = clips;
    twice.replace("M-2", "M-1");
    EXPECT_EQ(QStringLiteral("tree.json: root.children[0].children[1].mobID: a second node with the media object ID \"M-1\""),
              loadError(withProject(twice)));
}

TEST(Zel_MemoryTreeTest, DependencyOnNoNodeIsRefused)
{
    // A dependency may name a node that comes later in the file.
    const QByteArray clips = ",\"children\":[{\"id\":\"A\",\"name\":\"A\",\"mimeType\":\"sequence\","
                             "\"dependencies\":[{\"moniker\":\"zel-mem://B\"}]},"
                             "{\"id\":\"B\",\"name\":\"B\",\"mimeType\":\"masterclip\"}]";
    EXPECT_TRUE(Zel_MemoryTree::fromJson(withProject(clips), QStringLiteral("tree.json")));
    QByteArray dangling = clips;
    dangling.replace("zel-mem://B", "zel-mem://Z");
    EXPECT_EQ(QStringLiteral("tree.json: root.children[0].children[0].dependencies[0].moniker: no node has the moniker \"zel-mem://Z\""),
              loadError(withProject(dangling)));
}

TEST(Zel_MemoryTreeTest, UnknownVersionIsRefused)
{
    QByteArray json = minimal;
    json.replace("{\"users\"", "{\"version\":1,\"users\"");
    EXPECT_TRUE(Zel_MemoryTree::fromJson(json, QStringLiteral("tree.json")));
    json = minimal;
    json.replace("{\"users\"", "{\"version\":2,\"users\"");
    EXPECT_EQ(QStringLiteral("tree.json: version: unknown version 2 (this server reads version 1)"), loadError(json));
    json = minimal;
    json.replace("{\"users\"", "{\"version\":\"1\",\"users\"");
    EXPECT_EQ(QStringLiteral("tree.json: version: expected a whole number"), loadError(json));
}

TEST(Zel_MemoryTreeTest, UnknownKeyTypeIsRefused)
{
    QByteArray json = minimal;
    json.replace("{\"users\"", "{\"propertyKeys\":[{\"key\":\"Tape\",\"type\":6},{\"key\":\"Odd\",\"type\":9}],\"users\"");
    EXPECT_EQ(QStringLiteral("tree.json: propertyKeys[1].type: unknown key type 9 (expected 1 text, 2 video resolution, "
                             "3 audio resolution, 4 timecode, 5 date or 6 number)"),
              loadError(json));
    json.replace("\"type\":9", "\"type\":0");
    EXPECT_EQ(QStringLiteral("tree.json: propertyKeys[1].type: unknown key type 0 (expected 1 text, 2 video resolution, "
                             "3 audio resolution, 4 timecode, 5 date or 6 number)"),
              loadError(json));
}

TEST(Zel_MemoryTreeTest, PathsInMessagesNameTheNodeAmongManyAndDeepInTheTree)
{
    // A node's path is written out only for a message: it must still count
    // the children of every folder on the way, in file order.
    auto tree = [](const QByteArray& last) {
        QByteArray json = "{\"users\":[{\"name\":\"u\"}],\"root\":{\"id\":\"R\",\"name\":\"Root\",\"mimeType\":\"workspace\",\"children\":[";
        for (int i = 0; i < 3; ++i)
            json += "{\"name\":\"Bin " + QByteArray::number(i) + "\",\"mimeType\":\"bin\"},";
        json += "{\"id\":\"F\",\"name\":\"Folder\",\"mimeType\":\"bin\",\"children\":[";
        for (int i = 0; i < 20; ++i)
            json += "{\"name\":\"Clip " + QByteArray::number(i) + "\",\"mimeType\":\"masterclip\"},";
        json += last + "]}]}}";
        return json;
    };
    EXPECT_EQ(QStringLiteral("tree.json: root.children[3].children[20].name: a second child named \"Clip 7\" in \"Folder\""),
              loadError(tree("{\"name\":\"Clip 7\",\"mimeType\":\"masterclip\"}")));
    EXPECT_EQ(QStringLiteral("tree.json: root.children[3].children[20].properties.Name: set by \"name\", \"mimeType\" and "
                             "\"mobID\", not as a property"),
              loadError(tree("{\"name\":\"X\",\"mimeType\":\"masterclip\",\"properties\":{\"Name\":\"Y\"}}")));
    EXPECT_EQ(QStringLiteral("tree.json: root.children[3].children[20].properties.Tape.value: expected a string"),
              loadError(tree("{\"name\":\"X\",\"mimeType\":\"masterclip\",\"properties\":{\"Tape\":{\"value\":1}}}")));
    EXPECT_EQ(QStringLiteral("tree.json: root.children[3].children[20].reservation.since: \"soon\" is not an ISO 8601 "
                             "date and time"),
              loadError(tree("{\"name\":\"X\",\"mimeType\":\"masterclip\",\"reservation\":{\"user\":\"u\",\"since\":\"soon\"}}")));
    EXPECT_EQ(QStringLiteral("tree.json: root.children[3].children[20].locators[0].id: missing"),
              loadError(tree("{\"name\":\"X\",\"mimeType\":\"masterclip\",\"locators\":[{}]}")));
    EXPECT_EQ(QStringLiteral("tree.json: root.children[3].children[20].master: no node has the moniker or ID \"Z\""),
              loadError(tree("{\"name\":\"X\",\"mimeType\":\"subclip\",\"master\":\"Z\"}")));
    EXPECT_EQ(QStringLiteral("tree.json: root.children[3].children[20]: expected an object"), loadError(tree("7")));
}

TEST(Zel_MemoryTreeTest, MemberGivenTwiceInOneObjectIsRefusedWithBothPositions)
{
    // A second "children" would silently replace the first subtree.
    const QByteArray json = "{\"users\":[{\"name\":\"u\"}],\n"
                            "\"root\":{\"id\":\"R\",\"name\":\"Root\",\"mimeType\":\"workspace\",\n"
                            " \"children\":[{\"id\":\"P\",\"name\":\"Project\",\"mimeType\":\"project\"}],\n"
                            " \"children\":[]}}";
    EXPECT_EQ(QStringLiteral("tree.json:4:2: a second member named \"children\" in one object (the first is at 3:2)"),
              loadError(json));

    // Names are compared as the reader sees them, escapes resolved; columns
    // count characters.
    const QByteArray escaped = "{\"root\":{\"id\":\"R\",\"name\":\"\xc3\xa9t\xc3\xa9\",\"n\\u0061me\":\"Root\",\"mimeType\":\"workspace\"}}";
    EXPECT_EQ(QStringLiteral("tree.json:1:32: a second member named \"name\" in one object (the first is at 1:19)"),
              loadError(escaped));

    // Objects with many names are searched as thoroughly as small ones, and a
    // name written with an escape is the same as one written plainly.
    QByteArray many = "{\"root\":{\"id\":\"R\",\"name\":\"Root\",\"mimeType\":\"workspace\",\"settings\":{";
    for (int i = 0; i < 40; ++i)
        many += "\"k" + QByteArray::number(i) + "\":\"v\",";
    EXPECT_EQ(QStringLiteral("tree.json:1:458: a second member named \"k17\" in one object (the first is at 1:228)"),
              loadError(many + "\"k\\u00317\":\"w\"}}}"));
    EXPECT_EQ(QStringLiteral("tree.json:1:458: a second member named \"k3\" in one object (the first is at 1:95)"),
              loadError(many + "\"k3\":\"w\"}}}"));
    const QByteArray plainAfterEscaped = "{\"root\":{\"n\\u0061me\":\"Root\",\"name\":\"Root\"}}";
    EXPECT_EQ(QStringLiteral("tree.json:1:29: a second member named \"name\" in one object (the first is at 1:10)"),
              loadError(plainAfterEscaped));

    // A text broken near the second name is a syntax error, not a duplicate.
    const QString broken = loadError("{\"root\":{}, \"root\" {}}");
    EXPECT_TRUE(broken.startsWith(QStringLiteral("tree.json:1:")) && !broken.contains(QStringLiteral("second member")))
        << broken.toStdString();

    // The same name in different objects, and names as values, are fine.
    EXPECT_TRUE(Zel_MemoryTree::fromJson(
        "{\"root\":{\"id\":\"id\",\"name\":\"name\",\"mimeType\":\"workspace\",\"children\":["
        "{\"id\":\"A\",\"name\":\"children\",\"mimeType\":\"bin\"},{\"id\":\"B\",\"name\":\"B\",\"mimeType\":\"bin\"}]}}",
        QStringLiteral("tree.json")));
}

TEST(Zel_MemoryTreeTest, EveryMonikerNamesOneNodeWhetherGivenOrMadeFromTheId)
{
    // Bins X (moniker made from its ID), Y (a moniker of its own) and Z (its
    // own moniker, the same as the one made from its ID), each with a clip.
    const QByteArray json = "{\"users\":[{\"name\":\"u\"}],\"root\":{\"id\":\"R\",\"name\":\"Root\",\"mimeType\":\"workspace\",\"children\":["
                            "{\"id\":\"X\",\"name\":\"X\",\"mimeType\":\"bin\",\"children\":[{\"name\":\"in X\",\"mimeType\":\"clip\"}]},"
                            "{\"id\":\"Y\",\"moniker\":\"zel-mem://elsewhere\",\"name\":\"Y\",\"mimeType\":\"bin\","
                            "\"children\":[{\"name\":\"in Y\",\"mimeType\":\"clip\"}]},"
                            "{\"id\":\"Z\",\"moniker\":\"zel-mem://Z\",\"name\":\"Z\",\"mimeType\":\"bin\","
                            "\"children\":[{\"name\":\"in Z\",\"mimeType\":\"clip\"}]}]}}";
    QString error;
    const boost::shared_ptr<Zel_MemoryTree> tree = Zel_MemoryTree::fromJson(json, QStringLiteral("tree.json"), &error);
    ASSERT_TRUE(tree) << error.toStdString();
    auto childOf = [&tree](const char* moniker) {
        const QList<boost::shared_ptr<Zel_Node>> children =
            Zel_MemoryTree::childSnapshots(tree, QLatin1String(moniker), QStringLiteral("u"));
        return children.size() == 1 ? children.at(0)->getName() : QStringLiteral("%1 children").arg(children.size());
    };
    EXPECT_EQ(QStringLiteral("in X"), childOf("zel-mem://X"));
    EXPECT_EQ(QStringLiteral("in Y"), childOf("zel-mem://elsewhere"));
    EXPECT_EQ(QStringLiteral("0 children"), childOf("zel-mem://Y")) << "Y's moniker is another one";
    EXPECT_EQ(QStringLiteral("in Z"), childOf("zel-mem://Z"));
    EXPECT_EQ(QStringLiteral("zel-mem://elsewhere"), tree->monikerAt(QStringLiteral("/Y")));

    // A moniker given to one node and made from another's ID is refused,
    // whichever comes first.
    const QByteArray madeFirst = "{\"root\":{\"id\":\"R\",\"name\":\"Root\",\"mimeType\":\"workspace\",\"children\":["
                                 "{\"id\":\"Y\",\"name\":\"A\",\"mimeType\":\"bin\"},"
                                 "{\"id\":\"B\",\"moniker\":\"zel-mem://Y\",\"name\":\"B\",\"mimeType\":\"bin\"}]}}";
    EXPECT_EQ(QStringLiteral("tree.json: root.children[1].moniker: a second node with the moniker \"zel-mem://Y\""),
              loadError(madeFirst));
    const QByteArray givenFirst = "{\"root\":{\"id\":\"R\",\"name\":\"Root\",\"mimeType\":\"workspace\",\"children\":["
                                  "{\"id\":\"B\",\"moniker\":\"zel-mem://Y\",\"name\":\"B\",\"mimeType\":\"bin\"},"
                                  "{\"id\":\"Y\",\"name\":\"A\",\"mimeType\":\"bin\"}]}}";
    EXPECT_EQ(QStringLiteral("tree.json: root.children[1].moniker: a second node with the moniker \"zel-mem://Y\""),
              loadError(givenFirst));
}

TEST(Zel_MemoryTreeTest, GeneratedIdsAvoidIdsGivenLaterInTheFile)
{
    const QByteArray json = "{\"root\":{\"name\":\"Root\",\"mimeType\":\"workspace\",\"children\":["
                            "{\"name\":\"First\",\"mimeType\":\"project\"},"
                            "{\"id\":\"N000001\",\"name\":\"Second\",\"mimeType\":\"project\"},"
                            "{\"moniker\":\"zel-mem://N000003\",\"name\":\"Third\",\"mimeType\":\"project\"}]}}";
    QString error;
    boost::shared_ptr<Zel_MemoryTree> tree = Zel_MemoryTree::fromJson(json, QStringLiteral("tree.json"), &error);
    ASSERT_TRUE(tree) << error.toStdString();
    EXPECT_EQ(4, tree->nodeCount());
    EXPECT_EQ(QStringLiteral("zel-mem://N000001"), tree->monikerAt(QStringLiteral("/Second")));
    EXPECT_EQ(QStringLiteral("zel-mem://N000003"), tree->monikerAt(QStringLiteral("/Third")));
    const QSet<QString> monikers{tree->rootMoniker(), tree->monikerAt(QStringLiteral("/First")),
                                 tree->monikerAt(QStringLiteral("/Second")), tree->monikerAt(QStringLiteral("/Third"))};
    EXPECT_EQ(4, monikers.size());
}

TEST(Zel_MemoryTreeTest, NodesDeeperThanTheDepthLimitAreRefused)
{
    using Zel_MemoryLimits::MaxDepth;
    QString error;
    boost::shared_ptr<Zel_MemoryTree> deepest = Zel_MemoryTree::fromJson(deepTree(MaxDepth), QStringLiteral("tree.json"), &error);
    ASSERT_TRUE(deepest) << error.toStdString();
    EXPECT_EQ(MaxDepth + 1, deepest->nodeCount());

    QString path = QStringLiteral("root");
    for (int i = 0; i <= MaxDepth; ++i)
        path += QStringLiteral(".children[0]");
    EXPECT_EQ(QStringLiteral("tree.json: %1: lies 129 levels below the root; the server allows at most 128").arg(path),
              loadError(deepTree(MaxDepth + 1)));
}

TEST(Zel_MemoryTreeTest, SettingsBeyondTheSettingsLimitsAreRefused)
{
    QByteArray key = "a";
    for (int i = 1; i < Zel_MemoryLimits::MaxSettingsLevels; ++i)
        key += ".a";
    QByteArray json = minimal;
    json.replace("{\"users\"", "{\"settings\":{\"workgroup\":{\"" + key + "\":\"v\"}},\"users\"");
    EXPECT_TRUE(Zel_MemoryTree::fromJson(json, QStringLiteral("tree.json")));
    json.replace(key, key + ".a");
    EXPECT_EQ(QStringLiteral("tree.json: settings.workgroup.%1.a: a settings key of more than 64 levels").arg(QLatin1String(key)),
              loadError(json));
}

