// The tree file: the bundled sample, saving and loading back, and malformed
// files rejected with the file's name and the position of the fault.
#include "Zel_MemoryTree.h"

#include <QDir>
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
