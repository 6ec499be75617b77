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

TEST(Zel_DirectoryTest, SplitsDropsEmptyPartsAndRendersWithAnySeparator)
{
    const Zel_Directory dir(QStringLiteral("/a//b/"), QStringLiteral("/"));
    EXPECT_EQ(parts(dir), (std::vector<std::string>{ "a", "b" }));
    EXPECT_TRUE(dir.isRooted());
    EXPECT_EQ(str(dir.toZelString(QStringLiteral("/"))), "/a/b");
    EXPECT_EQ(str(dir.toZelString(QStringLiteral("\\"))), "\\a\\b");
    EXPECT_EQ(str(dir.toZelString(QStringLiteral("::"))), "::a::b");

    const Zel_Directory relative(QStringLiteral("a/b"), QStringLiteral("/"));
    EXPECT_FALSE(relative.isRooted());
    EXPECT_EQ(str(relative.toZelString(QStringLiteral("/"))), "a/b");

    const Zel_Directory root(QStringLiteral("/"), QStringLiteral("/"));
    EXPECT_TRUE(root.isEmpty());
    EXPECT_TRUE(root.isRooted());
    EXPECT_EQ(str(root.toZelString(QStringLiteral("\\"))), "\\");

    const Zel_Directory empty(QString(), QStringLiteral("/"));
    EXPECT_TRUE(empty.isEmpty());
    EXPECT_FALSE(empty.isRooted());
    EXPECT_EQ(str(empty.toZelString(QStringLiteral("/"))), "");

    const Zel_Directory none;
    EXPECT_TRUE(none.isEmpty());
    EXPECT_FALSE(none.isRooted());
    EXPECT_EQ(str(none.toZelString(QStringLiteral("/"))), "");
}

TEST(Zel_DirectoryTest, ForeignAndMultiCharacterSeparatorsAreCaseSensitive)
{
    const Zel_Directory windows(QStringLiteral("\\\\server\\share\\clips\\"), QStringLiteral("\\"));
    EXPECT_EQ(parts(windows), (std::vector<std::string>{ "server", "share", "clips" }));
    EXPECT_TRUE(windows.isRooted());
    EXPECT_EQ(str(windows.toZelString(QStringLiteral("/"))), "/server/share/clips");

    // A slash is an ordinary character when the separator is a backslash.
    const Zel_Directory mixed(QStringLiteral("C:\\media/x\\y"), QStringLiteral("\\"));
    EXPECT_EQ(parts(mixed), (std::vector<std::string>{ "C:", "media/x", "y" }));
    EXPECT_FALSE(mixed.isRooted());

    const Zel_Directory word(QStringLiteral("XaXxbXX"), QStringLiteral("X"));
    EXPECT_EQ(parts(word), (std::vector<std::string>{ "a", "xb" }));
    EXPECT_TRUE(word.isRooted());
    const Zel_Directory lower(QStringLiteral("xaX"), QStringLiteral("X"));
    EXPECT_FALSE(lower.isRooted());
    EXPECT_EQ(parts(lower), (std::vector<std::string>{ "xa" }));

    const Zel_Directory multi(QStringLiteral("::a::::b:c::"), QStringLiteral("::"));
    EXPECT_EQ(parts(multi), (std::vector<std::string>{ "a", "b:c" }));
    EXPECT_TRUE(multi.isRooted());
}

TEST(Zel_DirectoryTest, EmptySeparatorKeepsThePathWhole)
{
    const Zel_Directory whole(QStringLiteral("/a/b"), QString());
    EXPECT_EQ(parts(whole), (std::vector<std::string>{ "/a/b" }));
    EXPECT_FALSE(whole.isRooted());
    EXPECT_EQ(str(whole.toZelString(QStringLiteral("/"))), "/a/b");

    const Zel_Directory nothing(QString(), QStringLiteral(""));
    EXPECT_TRUE(nothing.isEmpty());
    EXPECT_FALSE(nothing.isRooted());
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

TEST(Zel_DependencyTest, RendersMonikerUsageAndSignedType)
{
    EXPECT_EQ(str(Zel_Dependency(boost::shared_ptr<QString>(), QStringLiteral("u"), type(2)).toZelString()),
              "Zel_Dependency(<no moniker> u 2)");
    EXPECT_EQ(str(Zel_Dependency(boost::make_shared<QString>(QStringLiteral("mon:1")), QStringLiteral("uses"), type(-1))
                      .toZelString()),
              "Zel_Dependency(mon:1 uses -1)");
    EXPECT_EQ(str(Zel_Dependency(boost::make_shared<QString>(), QString(), type(0)).toZelString()),
              "Zel_Dependency(  0)");
    EXPECT_EQ(str(Zel_Dependency(boost::make_shared<QString>(QStringLiteral("m")), QStringLiteral("u"),
                                 type(-2147483647 - 1)).toZelString()),
              "Zel_Dependency(m u -2147483648)");
    EXPECT_EQ(str(Zel_Dependency().toZelString()), "Zel_Dependency(<no moniker>  0)");
}

TEST(Zel_DependencyTest, CopiesShareTheMonikerText)
{
    const boost::shared_ptr<QString> moniker = boost::make_shared<QString>(QStringLiteral("m1"));
    Zel_Dependency dep(moniker, QStringLiteral("u"), type(7));
    Zel_Dependency copy(dep);
    Zel_Dependency assigned;
    assigned = dep;
    EXPECT_EQ(copy.getMoniker(), moniker);
    EXPECT_EQ(assigned.getMoniker(), moniker);
    EXPECT_EQ(str(assigned.getUsage()), "u");
    EXPECT_EQ(assigned.getType(), type(7));
    *moniker = QStringLiteral("renamed");
    EXPECT_EQ(str(copy.toZelString()), "Zel_Dependency(renamed u 7)");

    Zel_DependencySPList list;
    list.append(boost::make_shared<Zel_Dependency>(dep));
    Zel_DependencySPList other;
    other = list;
    EXPECT_EQ(other.first(), list.first());
}

TEST(Zel_ResolutionIDTest, RendersLabelAndIdentifier)
{
    const Zel_ResolutionID high(QStringLiteral("High"), QStringLiteral("17"));
    EXPECT_EQ(str(high.toZelString()), "Zel_ResolutionID(High:17)");
    EXPECT_EQ(str(high.label()), "High");
    EXPECT_EQ(str(high.id()), "17");
    EXPECT_EQ(str(high.first), "High");
    EXPECT_EQ(str(high.second), "17");
    EXPECT_EQ(str(Zel_ResolutionID().toZelString()), "Zel_ResolutionID(:)");
    EXPECT_EQ(str(Zel_ResolutionID(QStringLiteral("only label")).toZelString()), "Zel_ResolutionID(only label:)");
    EXPECT_TRUE(Zel_ResolutionID().label().isEmpty());
}

TEST(Zel_ResolutionIDListTest, JoinsElementsWithOneLineFeed)
{
    Zel_ResolutionIDList list;
    EXPECT_EQ(str(list.toZelString()), "");
    list.append(Zel_ResolutionID(QStringLiteral("High"), QStringLiteral("17")));
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
    EXPECT_EQ(str(name.toZelString()), "clip 01.mxf");
    none = name;
    EXPECT_EQ(str(none.toZelString()), "clip 01.mxf");
    Zel_Filename& self = name;
    name = self;
    EXPECT_EQ(str(name.toZelString()), "clip 01.mxf");
    Zel_Filename copy(name);
    EXPECT_EQ(str(copy.toZelString()), "clip 01.mxf");
}

TEST(Zel_SmallValuesTest, VirtualSlotsKeepTheirOrder)
{
    EXPECT_EQ(vtableSlot(&Zel_Filename::operator=), 2);
    EXPECT_EQ(vtableSlot(&Zel_Filename::toZelString), 3);
    EXPECT_EQ(vtableSlot(&Zel_Directory::toZelString), 2);
    EXPECT_TRUE(std::has_virtual_destructor<Zel_LoginCredentials>::value);
    EXPECT_TRUE(std::has_virtual_destructor<Zel_Dependency>::value);
    EXPECT_TRUE(std::has_virtual_destructor<Zel_ResolutionID>::value);
    EXPECT_TRUE(std::has_virtual_destructor<Zel_ResolutionIDList>::value);
    EXPECT_TRUE(std::has_virtual_destructor<Zel_DirectoryList>::value);
    EXPECT_TRUE(std::has_virtual_destructor<Zel_DependencySPList>::value);
}
