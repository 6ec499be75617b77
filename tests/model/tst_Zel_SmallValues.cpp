#include "VtableSlot.h"

#include "Zel_Dependency.h"
#include "Zel_DependencySPList.h"
#include "Zel_Directory.h"
#include "Zel_DirectoryList.h"
#include "Zel_Filename.h"
#include "Zel_LoginCredentials.h"
#include "Zel_ResolutionID.h"
#include "Zel_ResolutionIDList.h"

#include <boost/make_shared.hpp>

#include <gtest/gtest.h>

#include <string>
#include <vector>

namespace {

std::string str(const QString& text)
{
    return text.toStdString();
}

std::vector<std::string> parts(const Zel_Directory& dir)
{
    std::vector<std::string> out;
    for (const QString& part : dir)
        out.push_back(str(part));
    return out;
}

Zel_Dependency::Zel_DependencyType type(int value)
{
    return static_cast<Zel_Dependency::Zel_DependencyType>(value);
}

} // namespace

TEST(Zel_DirectoryTest, SplitsOnTheExactSeparatorDropsEmptyPartsAndRendersWithAnySeparator)
{
    struct Row
    {
        const char *path, *separator;
        std::vector<std::string> parts;
        bool rooted;
        const char* rendered; // with "/"
    };
    const std::vector<Row> rows = {
        {"/a//b/", "/", {"a", "b"}, true, "/a/b"},
        {"a/b", "/", {"a", "b"}, false, "a/b"},
        {"/", "/", {}, true, "/"},
        {nullptr, "/", {}, false, ""},
        {"\\\\server\\share\\clips\\", "\\", {"server", "share", "clips"}, true, "/server/share/clips"},
        // A slash is an ordinary character when the separator is a backslash.
        {"C:\\media/x\\y", "\\", {"C:", "media/x", "y"}, false, "C:/media/x/y"},
        // Case-sensitive and multi-character separators.
        {"XaXxbXX", "X", {"a", "xb"}, true, "/a/xb"},
        {"xaX", "X", {"xa"}, false, "xa"},
        {"::a::::b:c::", "::", {"a", "b:c"}, true, "/a/b:c"},
        // An empty separator keeps the path whole.
        {"/a/b", nullptr, {"/a/b"}, false, "/a/b"},
        {"", "", {}, false, ""},
    };
    for (const Row& row : rows) {
        SCOPED_TRACE(testing::Message() << "row " << &row - rows.data());
        const Zel_Directory dir(QString::fromLatin1(row.path), QString::fromLatin1(row.separator));
        EXPECT_EQ(parts(dir), row.parts);
        EXPECT_EQ(dir.isRooted(), row.rooted);
        EXPECT_EQ(str(dir.toZelString(QStringLiteral("/"))), row.rendered);
    }
    const Zel_Directory dir(QStringLiteral("/a/b"), QStringLiteral("/"));
    EXPECT_EQ(str(dir.toZelString(QStringLiteral("::"))), "::a::b");
    EXPECT_EQ(str(Zel_Directory(QStringLiteral("/"), QStringLiteral("/")).toZelString(QStringLiteral("\\"))), "\\");
    EXPECT_TRUE(Zel_Directory().isEmpty());
    EXPECT_FALSE(Zel_Directory().isRooted());
    EXPECT_EQ(str(Zel_Directory().toZelString(QStringLiteral("/"))), "");
}

TEST(Zel_DirectoryTest, CopiesCarryComponentsAndRootedFlag)
{
    const Zel_Directory dir(QStringLiteral("/x/y"), QStringLiteral("/"));
    const Zel_Directory copy(dir);
    Zel_Directory assigned(QStringLiteral("p"), QStringLiteral("/"));
    assigned = dir;
    for (const Zel_Directory* d : { &copy, static_cast<const Zel_Directory*>(&assigned) }) {
        EXPECT_TRUE(d->isRooted());
        EXPECT_EQ(str(d->toZelString(QStringLiteral("/"))), "/x/y");
    }
    assigned = Zel_Directory(QStringLiteral("q"), QStringLiteral("/"));
    EXPECT_FALSE(assigned.isRooted());

    Zel_DirectoryList list;
    list.append(boost::make_shared<Zel_Directory>(dir));
    Zel_DirectoryList shared(list);
    shared.first()->append(QStringLiteral("z"));
    EXPECT_EQ(str(list.first()->toZelString(QStringLiteral("/"))), "/x/y/z");
}

TEST(Zel_DependencyTest, RendersMonikerUsageAndSignedTypeAndCopiesShareTheMonikerText)
{
    const auto render = [](const char* moniker, const char* usage, int value) {
        const boost::shared_ptr<QString> text(moniker ? new QString(QString::fromLatin1(moniker)) : nullptr);
        return str(Zel_Dependency(text, QString::fromLatin1(usage), type(value)).toZelString());
    };
    EXPECT_EQ(render(nullptr, "u", 2), "Zel_Dependency(<no moniker> u 2)");
    EXPECT_EQ(render("mon:1", "uses", -1), "Zel_Dependency(mon:1 uses -1)");
    EXPECT_EQ(render("", "", 0), "Zel_Dependency(  0)");
    EXPECT_EQ(render("m", "u", -2147483647 - 1), "Zel_Dependency(m u -2147483648)");
    EXPECT_EQ(str(Zel_Dependency().toZelString()), "Zel_Dependency(<no moniker>  0)");

    const boost::shared_ptr<QString> moniker = boost::make_shared<QString>(QStringLiteral("m1"));
    Zel_Dependency dep(moniker, QStringLiteral("u"), type(7));
    Zel_Dependency copy(dep);
    Zel_Dependency assigned;
    assigned = dep;
    EXPECT_EQ(copy.getMoniker(), moniker);
    *moniker = QStringLiteral("renamed");
    EXPECT_EQ(str(copy.toZelString() + assigned.toZelString()), "Zel_Dependency(renamed u 7)Zel_Dependency(renamed u 7)");

    Zel_DependencySPList list;
    list.append(boost::make_shared<Zel_Dependency>(dep));
    Zel_DependencySPList other;
    other = list;
    EXPECT_EQ(other.first(), list.first());
}

TEST(Zel_ResolutionIDTest, RendersLabelAndIdentifierAndListsJoinWithOneLineFeed)
{
    const Zel_ResolutionID high(QStringLiteral("High"), QStringLiteral("17"));
    EXPECT_EQ(str(high.toZelString()), "Zel_ResolutionID(High:17)");
    EXPECT_EQ(str(high.label() + high.id() + high.first + high.second), "High17High17");
    EXPECT_EQ(str(Zel_ResolutionID().toZelString()), "Zel_ResolutionID(:)");
    EXPECT_EQ(str(Zel_ResolutionID(QStringLiteral("only label")).toZelString()), "Zel_ResolutionID(only label:)");

    Zel_ResolutionIDList list;
    EXPECT_EQ(str(list.toZelString()), "");
    list.append(high);
    EXPECT_EQ(str(list.toZelString()), "Zel_ResolutionID(High:17)");
    list.append(Zel_ResolutionID(QStringLiteral("Low"), QStringLiteral("3")));
    EXPECT_EQ(str(list.toZelString()), "Zel_ResolutionID(High:17)\nZel_ResolutionID(Low:3)");

    // Elements are values: a copy changes independently.
    Zel_ResolutionIDList copy(list);
    copy[0].first = QStringLiteral("Changed");
    EXPECT_EQ(str(list.first().label()), "High");
    Zel_ResolutionIDList assigned;
    assigned = copy;
    EXPECT_EQ(str(assigned.toZelString()), "Zel_ResolutionID(Changed:17)\nZel_ResolutionID(Low:3)");
}

TEST(Zel_FilenameTest, RendersTheNameAndAssignsByValue)
{
    Zel_Filename none;
    EXPECT_EQ(str(none.toZelString()), "");
    Zel_Filename name(QStringLiteral("clip 01.mxf"));
    none = name;
    Zel_Filename& self = name;
    name = self;
    EXPECT_EQ(str(none.toZelString() + name.toZelString() + Zel_Filename(name).toZelString()),
              "clip 01.mxfclip 01.mxfclip 01.mxf");
}

TEST(Zel_SmallValuesTest, VirtualSlotsKeepTheirOrder)
{
    EXPECT_EQ(vtableSlot(&Zel_Filename::operator=), 2);
    EXPECT_EQ(vtableSlot(&Zel_Filename::toZelString), 3);
    EXPECT_EQ(vtableSlot(&Zel_Directory::toZelString), 2);
    EXPECT_TRUE(std::has_virtual_destructor<Zel_LoginCredentials>::value
                && std::has_virtual_destructor<Zel_Dependency>::value && std::has_virtual_destructor<Zel_ResolutionID>::value);
    EXPECT_TRUE(std::has_virtual_destructor<Zel_ResolutionIDList>::value
                && std::has_virtual_destructor<Zel_DirectoryList>::value
                && std::has_virtual_destructor<Zel_DependencySPList>::value);
}
