#include "Zel_MobDesc.h"
#include "Zel_MobDescList.h"
#include "Zel_MobID.h"
#include "Zel_MobIDList.h"

#include <boost/make_shared.hpp>

#include <gtest/gtest.h>

#include <map>
#include <set>
#include <string>
#include <vector>

namespace {

std::vector<std::string> ids(const Zel_MobIDList& list)
{
    std::vector<std::string> out;
    for (unsigned long long i = 0; i < list.size(); ++i)
        out.push_back(list.getMobID(i)->toZelString().toStdString());
    return out;
}

Zel_MobIDList makeList(std::initializer_list<const char*> texts)
{
    Zel_MobIDList list;
    for (const char* text : texts)
        list.add(Zel_MobID(QString::fromLatin1(text)));
    return list;
}

} // namespace

TEST(Zel_MobIDTest, EmptinessAndExactEquality)
{
    EXPECT_TRUE(Zel_MobID().isEmpty());
    EXPECT_TRUE(Zel_MobID(QStringLiteral("")).isEmpty());
    EXPECT_TRUE(Zel_MobID(QString()) == Zel_MobID(QStringLiteral("")));
    EXPECT_TRUE(Zel_MobID() == Zel_MobID(QStringLiteral("")));
    EXPECT_FALSE(Zel_MobID(QStringLiteral(" ")).isEmpty());

    EXPECT_TRUE(Zel_MobID(QStringLiteral("abc")) != Zel_MobID(QStringLiteral("ABC")));
    EXPECT_FALSE(Zel_MobID(QStringLiteral("abc")) == Zel_MobID(QStringLiteral("ABC")));
    EXPECT_TRUE(Zel_MobID(QStringLiteral("060a2b34.1")) == Zel_MobID(QStringLiteral("060a2b34.1")));

    // The text is returned as is, by reference to the object's own text.
    const Zel_MobID id(QStringLiteral("  urn:smpte:umid:060A  "));
    EXPECT_EQ(id.toZelString().toStdString(), "  urn:smpte:umid:060A  ");
    EXPECT_EQ(&id.toZelString(), &id.toZelString());

    Zel_MobID assigned;
    assigned = id;
    assigned = assigned;
    EXPECT_TRUE(assigned == id);
}

TEST(Zel_MobIDTest, OrdersByCodeUnitAndAgreesWithEquality)
{
    // Code units, not locale or numbers: "10" < "9", 'Z' (0x5A) < 'a' (0x61) < U+00E9, and U+1F600
    // (the surrogate pair D83D DE00) < U+FB01.
    const std::vector<std::pair<QString, QString>> ascending = {
        {"A", "a"}, {"ab", "abc"}, {QString(), "0"}, {"10", "9"}, {"Z", "a"}, {"a", QString(QChar(0xE9))},
        {QString::fromUtf8("\xF0\x9F\x98\x80"), QString(QChar(0xFB01))}};
    for (const auto& pair : ascending) {
        EXPECT_TRUE(Zel_MobID(pair.first) < Zel_MobID(pair.second)) << pair.first.toStdString();
        EXPECT_FALSE(Zel_MobID(pair.second) < Zel_MobID(pair.first)) << pair.first.toStdString();
    }
    EXPECT_FALSE(Zel_MobID(QStringLiteral("abc")) < Zel_MobID(QStringLiteral("abc")));

    // Usable as a key of ordered containers: null and empty are one key.
    std::map<Zel_MobID, int> map;
    map[Zel_MobID(QStringLiteral("b"))] = 1;
    map[Zel_MobID(QStringLiteral("a"))] = 2;
    map[Zel_MobID(QString())] = 3;
    map[Zel_MobID(QStringLiteral(""))] = 4;
    map[Zel_MobID(QStringLiteral("B"))] = 5;
    ASSERT_EQ(map.size(), 4u);
    std::vector<std::string> order;
    for (const auto& entry : map)
        order.push_back(entry.first.toZelString().toStdString());
    EXPECT_EQ(order, (std::vector<std::string>{ "", "B", "a", "b" }));
    EXPECT_EQ(map[Zel_MobID()], 4);
}

TEST(Zel_MobIDListTest, AddRemoveAndIndexedAccess)
{
    Zel_MobIDList list;
    EXPECT_EQ(list.size(), 0u);
    EXPECT_FALSE(list.getMobID(0));

    const Zel_MobID x(QStringLiteral("x"));
    list.add(x);
    list.add(Zel_MobID(QStringLiteral("y")));
    list.add(x);
    EXPECT_EQ(ids(list), (std::vector<std::string>{ "x", "y", "x" }));
    EXPECT_FALSE(list.getMobID(3));
    EXPECT_FALSE(list.getMobID(~0ull));
    // The list holds its own objects, not the caller's.
    EXPECT_NE(list.getMobID(0).get(), &x);
    EXPECT_NE(list.getMobID(0), list.getMobID(2));

    list.remove(Zel_MobID(QStringLiteral("X")));
    EXPECT_EQ(list.size(), 3u);
    list.remove(x);
    EXPECT_EQ(ids(list), (std::vector<std::string>{ "y", "x" }));
    list.remove(x);
    EXPECT_EQ(ids(list), (std::vector<std::string>{ "y" }));
    list.remove(x);
    EXPECT_EQ(ids(list), (std::vector<std::string>{ "y" }));

    list.clear();
    EXPECT_EQ(list.size(), 0u);
    EXPECT_FALSE(list.getMobID(0));
}

TEST(Zel_MobIDListTest, CopiesShareEntriesAndAssignmentReplaces)
{
    Zel_MobIDList source = makeList({ "a", "b" });
    Zel_MobIDList copy(source);
    EXPECT_EQ(copy.getMobID(0), source.getMobID(0));
    *copy.getMobID(1) = Zel_MobID(QStringLiteral("changed"));
    EXPECT_EQ(ids(source), (std::vector<std::string>{ "a", "changed" }));

    // Assignment replaces this list's entries (it does not append).
    Zel_MobIDList target = makeList({ "1", "2", "3" });
    target = source;
    EXPECT_EQ(ids(target), (std::vector<std::string>{ "a", "changed" }));
    EXPECT_EQ(target.getMobID(0), source.getMobID(0));

    // Changing the copy's membership leaves the source alone.
    target.add(Zel_MobID(QStringLiteral("z")));
    target.remove(Zel_MobID(QStringLiteral("a")));
    EXPECT_EQ(ids(source), (std::vector<std::string>{ "a", "changed" }));

    const boost::shared_ptr<Zel_MobID> first = source.getMobID(0);
    Zel_MobIDList& self = source;
    source = self;
    EXPECT_EQ(ids(source), (std::vector<std::string>{ "a", "changed" }));
    EXPECT_EQ(source.getMobID(0), first);

    target = Zel_MobIDList();
    EXPECT_EQ(target.size(), 0u);
}

TEST(Zel_MobDescTest, IsNullUnlessAnIdentifierOrAPathOtherThanOMAAFIsSetAndCopiesCarryAllSixFields)
{
    EXPECT_TRUE(Zel_MobDesc().isNull());
    const Zel_MobDesc three(QStringLiteral("mob"), QStringLiteral("/aaf"), QStringLiteral("/head"));
    EXPECT_EQ((three.getMobID() + three.getAAFFilePath() + three.getHeadFrameFilePath()).toStdString(), "mob/aaf/head");
    EXPECT_TRUE((three.getOMAAFFilePath() + three.getOMF2FilePath()).isEmpty());
    EXPECT_FALSE(three.getGenerateFexSpaaf());
    EXPECT_FALSE(three.isNull());

    const std::vector<std::pair<void (Zel_MobDesc::*)(const QString&), bool>> setters = {
        {&Zel_MobDesc::setOMAAFFilePath, true}, {&Zel_MobDesc::setHeadFrameFilePath, false},
        {&Zel_MobDesc::setOMF2FilePath, false}, {&Zel_MobDesc::setAAFFilePath, false}, {&Zel_MobDesc::setMobID, false}};
    for (std::size_t i = 0; i < setters.size(); ++i) {
        Zel_MobDesc d;
        (d.*setters[i].first)(QStringLiteral("/x"));
        EXPECT_EQ(d.isNull(), setters[i].second) << "setter " << i;
    }
    Zel_MobDesc onlyFlag;
    onlyFlag.setGenerateFexSpaaf(true);
    EXPECT_TRUE(onlyFlag.isNull());

    Zel_MobDesc full(QStringLiteral("m"), QStringLiteral("a"), QStringLiteral("h"));
    full.setOMAAFFilePath(QStringLiteral("o"));
    full.setOMF2FilePath(QStringLiteral("f"));
    full.setGenerateFexSpaaf(true);
    Zel_MobDesc copy;
    copy = full;
    const Zel_MobDesc copied(full);
    for (const Zel_MobDesc* c : { static_cast<const Zel_MobDesc*>(&copy), &copied }) {
        EXPECT_EQ((c->getMobID() + c->getAAFFilePath() + c->getOMAAFFilePath() + c->getOMF2FilePath()
                   + c->getHeadFrameFilePath()).toStdString(), "maofh");
        EXPECT_TRUE(c->getGenerateFexSpaaf());
    }
}

TEST(Zel_MobDescListTest, AddCopiesOrSharesAndAssignmentReplaces)
{
    Zel_MobDescList list;
    EXPECT_EQ(list.size(), 0u);
    EXPECT_FALSE(list.getMobDesc(0));

    Zel_MobDesc value(QStringLiteral("m1"), QString(), QString());
    list.add(value);
    value.setMobID(QStringLiteral("changed after add"));
    EXPECT_EQ(list.getMobDesc(0)->getMobID().toStdString(), "m1");

    const boost::shared_ptr<Zel_MobDesc> shared = boost::make_shared<Zel_MobDesc>(QStringLiteral("m2"), QString(), QString());
    list.add(shared);
    list.add(shared);
    EXPECT_EQ(list.size(), 3u);
    EXPECT_EQ(list.getMobDesc(1), shared);
    EXPECT_EQ(list.getMobDesc(2), shared);
    EXPECT_FALSE(list.getMobDesc(3));

    Zel_MobDescList copy(list);
    EXPECT_EQ(copy.getMobDesc(0), list.getMobDesc(0));
    Zel_MobDescList target;
    target.add(Zel_MobDesc(QStringLiteral("old"), QString(), QString()));
    target = list;
    ASSERT_EQ(target.size(), 3u);
    EXPECT_EQ(target.getMobDesc(0)->getMobID().toStdString(), "m1");
    target.getMobDesc(0)->setAAFFilePath(QStringLiteral("/seen"));
    EXPECT_EQ(list.getMobDesc(0)->getAAFFilePath().toStdString(), "/seen");

    Zel_MobDescList& self = list;
    list = self;
    EXPECT_EQ(list.size(), 3u);
}
