#include "Zel_MobAttr.h"
#include "Zel_MobAttrList.h"
#include "Zel_MobPropertyChange.h"
#include "Zel_Node.h"

#include <gtest/gtest.h>

#include <type_traits>

namespace {

boost::shared_ptr<Zel_Node> node(const char* id)
{
    return boost::shared_ptr<Zel_Node>(new Zel_Node(QLatin1String(id)));
}

} // namespace

TEST(Zel_MobAttrTest, RendersKeyAndValuesWithTheBlanksBeforeTwoColons)
{
    const boost::shared_ptr<Zel_Node> clip = node("n1");
    Zel_MobAttr attr(Zel_MobID("M1"), clip, "clip name", "k", "a", "b", static_cast<Zel_MobAttr::AttrType>(7));
    EXPECT_EQ(QStringLiteral("mobID: M1, key: k, old val : a, new val: b, server val : "), attr.toZelString());
    EXPECT_TRUE(attr.getServerVal().isEmpty());

    attr.setServerValue("c");
    EXPECT_EQ(QStringLiteral("mobID: M1, key: k, old val : a, new val: b, server val : c"), attr.toZelString());
    EXPECT_EQ(QStringLiteral("c"), attr.getServerVal());

    // Constructor order: identifier, node, name, key, old, new, type.
    EXPECT_EQ(QStringList({attr.getMobID().toZelString(), attr.getMobName(), attr.getAttrKey(), attr.getOldVal(),
                           attr.getNewVal(), QString::number(attr.getType())}),
              QStringList({"M1", "clip name", "k", "a", "b", "7"}));
    EXPECT_EQ(clip, attr.getNodeSP());

    // A backend-defined type value outside the named ones is kept exactly.
    const Zel_MobAttr negative(Zel_MobID(), boost::shared_ptr<Zel_Node>(), "", "", "", "",
                               static_cast<Zel_MobAttr::AttrType>(-2147483647 - 1));
    EXPECT_EQ(-2147483647 - 1, static_cast<qint32>(negative.getType()));
    EXPECT_FALSE(negative.getNodeSP());
    EXPECT_EQ(QStringLiteral("mobID: , key: , old val : , new val: , server val : "), negative.toZelString());
    static_assert(sizeof(Zel_MobAttr::AttrType) == 4, "AttrType is a 32-bit integer");
    static_assert(Zel_MobAttr::AttrTypeDefault == 0, "type 0 exists");
}

TEST(Zel_MobAttrTest, CopiesShareTheNodeAndKeepTheServerValue)
{
    const boost::shared_ptr<Zel_Node> clip = node("n1");
    Zel_MobAttr attr(Zel_MobID("M1"), clip, "name", "k", "a", "b", Zel_MobAttr::AttrTypeDefault);
    attr.setServerValue("s");
    const Zel_MobAttr copy(attr);
    EXPECT_EQ(attr.toZelString() + attr.getMobName(), copy.toZelString() + copy.getMobName());
    EXPECT_EQ(clip.get(), copy.getNodeSP().get());

    attr.setServerValue("changed");
    EXPECT_EQ(QStringLiteral("s"), copy.getServerVal());
}

TEST(Zel_MobAttrTest, ListAddsTypeZeroEntriesAndIndexesSafely)
{
    Zel_MobAttrList list;
    EXPECT_EQ(0u, list.size());
    EXPECT_FALSE(list.getMobAttr(0));

    const boost::shared_ptr<Zel_Node> clip = node("n1");
    list.add(Zel_MobID("M1"), clip, "one", "k1", "a", "b");
    list.add(Zel_MobID("M1"), boost::shared_ptr<Zel_Node>(), "one", "k1", "a", "b"); // duplicates allowed
    list.add(Zel_MobID("M2"), clip, "two", "k2", "c", "d");
    ASSERT_EQ(3u, list.size());
    for (unsigned int i = 0; i < list.size(); ++i)
        EXPECT_EQ(Zel_MobAttr::AttrTypeDefault, list.getMobAttr(i)->getType());
    EXPECT_EQ(QStringLiteral("k2two"), list.getMobAttr(2)->getAttrKey() + list.getMobAttr(2)->getMobName());
    EXPECT_EQ(clip, list.getMobAttr(0)->getNodeSP());
    EXPECT_FALSE(list.getMobAttr(1)->getNodeSP());

    EXPECT_FALSE(list.getMobAttr(list.size()));
    EXPECT_FALSE(list.getMobAttr(0xFFFFFFFFull + 1)); // not truncated to index 0
    EXPECT_FALSE(list.getMobAttr(~0ull));

    // Entries are shared, not copied.
    list.getMobAttr(0)->setServerValue("sv");
    EXPECT_EQ(QStringLiteral("sv"), list.getMobAttr(0)->getServerVal());
}

TEST(Zel_MobAttrTest, ListCopySharesAndAssignmentReplacesEntries)
{
    Zel_MobAttrList three;
    Zel_MobAttrList two;
    for (const char* key : {"a", "b", "c"})
        three.add(Zel_MobID(QString::fromLatin1(key).toUpper()), boost::shared_ptr<Zel_Node>(), "", key, "", "");
    for (const char* key : {"x", "y"})
        two.add(Zel_MobID(QString::fromLatin1(key).toUpper()), boost::shared_ptr<Zel_Node>(), "", key, "", "");

    const Zel_MobAttrList copy(three);
    ASSERT_EQ(3u, copy.size());
    EXPECT_EQ(three.getMobAttr(1).get(), copy.getMobAttr(1).get());

    three = two;
    ASSERT_EQ(2u, three.size());
    EXPECT_EQ(two.getMobAttr(0).get(), three.getMobAttr(0).get());
    EXPECT_EQ(two.getMobAttr(1).get(), three.getMobAttr(1).get());
    EXPECT_EQ(3u, copy.size()); // the earlier copy keeps the old entries

    three = two; // repeated assignment does not grow the list
    EXPECT_EQ(2u, three.size());

    const Zel_MobAttrList& self = two;
    two = self;
    ASSERT_EQ(2u, two.size());
    EXPECT_EQ(QStringLiteral("xy"), two.getMobAttr(0)->getAttrKey() + two.getMobAttr(1)->getAttrKey());

    three = Zel_MobAttrList();
    EXPECT_EQ(0u, three.size());
}

TEST(Zel_MobPropertyChangeTest, RendersThePropertyTextFormAndTheServerValue)
{
    const Zel_MobPropertyChange empty;
    EXPECT_EQ(QStringLiteral("mobID: , prop: Zel_Property(:::), new val: , server val : "), empty.toZelString());
    EXPECT_FALSE(empty.getNodeSP());
    EXPECT_TRUE(empty.getReturnPropertyList().isEmpty());

    Zel_PropertyList returned;
    returned.addIfKeyNotInList(Zel_Property("Name", "clip", QString()));
    const boost::shared_ptr<Zel_Node> clip = node("n1");
    Zel_MobPropertyChange change(Zel_MobID("M1"), clip, "clip name", Zel_Property("Tape", "T1", "cv"), "T2",
                                 returned);
    EXPECT_EQ(QStringLiteral("mobID: M1, prop: Zel_Property(Tape:T1::), new val: T2, server val : "),
              change.toZelString());
    change.setServerValue("T3");
    EXPECT_EQ(QStringLiteral("mobID: M1, prop: Zel_Property(Tape:T1::), new val: T2, server val : T3"),
              change.toZelString());

    EXPECT_EQ(clip, change.getNodeSP());
    EXPECT_EQ(QStringLiteral("clip name|cv|T2|T3"), change.getMobName() + '|' + change.getProperty().customValues() + '|'
                                                          + change.getNewVal() + '|' + change.getServerVal());
    ASSERT_EQ(1, change.getReturnPropertyList().size());
    EXPECT_EQ(QStringLiteral("clip"), change.getReturnPropertyList().findByKey("Name").value());

    Zel_MobPropertyChange assigned;
    assigned = change;
    EXPECT_EQ(change.toZelString(), assigned.toZelString());
    EXPECT_EQ(clip.get(), assigned.getNodeSP().get());
    const Zel_MobPropertyChange copy(change);
    EXPECT_EQ(QStringLiteral("clip name"), copy.getMobName());
    EXPECT_EQ(1, copy.getReturnPropertyList().size());
}
