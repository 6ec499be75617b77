#include "Zel_FrameLocator.h"
#include "Zel_FrameProperty.h"
#include "Zel_FramePropertyList.h"

#include "VtableSlot.h"

#include <gtest/gtest.h>

namespace {

Zel_FrameLocator locator(const char* id, std::initializer_list<std::pair<const char*, const char*>> properties)
{
    Zel_FrameLocator result;
    result.setID(QLatin1String(id));
    for (const auto& property : properties)
        result.append(Zel_FrameProperty(QLatin1String(property.first), QLatin1String(property.second)));
    return result;
}

Zel_FramePropertyList list(std::initializer_list<std::pair<const char*, const char*>> properties)
{
    Zel_FramePropertyList result;
    for (const auto& property : properties)
        result.append(Zel_FrameProperty(QLatin1String(property.first), QLatin1String(property.second)));
    return result;
}

using ListEq = bool (Zel_FramePropertyList::*)(const Zel_FramePropertyList&) const;
using LocatorEq = bool (Zel_FrameLocator::*)(const Zel_FrameLocator&) const;

} // namespace

TEST(Zel_FrameLocatorTest, VirtualSlotsFollowTheListThenTheLocator)
{
    EXPECT_EQ(2, vtableSlot(static_cast<ListEq>(&Zel_FramePropertyList::operator==)));
    EXPECT_EQ(3, vtableSlot(static_cast<ListEq>(&Zel_FramePropertyList::operator!=)));
    EXPECT_EQ(4, vtableSlot(&Zel_FramePropertyList::toZelString));
    EXPECT_EQ(5, vtableSlot(static_cast<LocatorEq>(&Zel_FrameLocator::operator==)));
    EXPECT_EQ(6, vtableSlot(static_cast<LocatorEq>(&Zel_FrameLocator::operator!=)));
}

TEST(Zel_FrameLocatorTest, PropertyAndListRenderAndCompareKeyAndValue)
{
    Zel_FrameProperty property("k", "v");
    EXPECT_EQ(QStringLiteral("Zel_FrameProperty - key(k) value(v)"), property.toZelString());
    EXPECT_EQ(QStringLiteral("Zel_FrameProperty - key() value()"), Zel_FrameProperty().toZelString());
    EXPECT_TRUE(property == Zel_FrameProperty("k", "v"));
    EXPECT_TRUE(property != Zel_FrameProperty("K", "v") && property != Zel_FrameProperty("k", "V"));
    property.setValue("w");
    EXPECT_EQ(QStringLiteral("k=w"), property.key() + '=' + property.value());

    // One property per line; through the base, a locator renders its properties only.
    EXPECT_EQ(QString(), Zel_FramePropertyList().toZelString());
    EXPECT_EQ(QStringLiteral("Zel_FrameProperty - key(k) value(v)\nZel_FrameProperty - key(a) value(b)"),
              list({{"k", "v"}, {"a", "b"}}).toZelString());
    const Zel_FramePropertyList& base = locator("L", {{"k", "v"}});
    EXPECT_EQ(QStringLiteral("Zel_FrameProperty - key(k) value(v)"), base.toZelString());
}

TEST(Zel_FrameLocatorTest, GetValueFindsTheFirstAndSetValueUpdatesOnlyIt)
{
    Zel_FramePropertyList properties = list({{"k", "1"}, {"x", "y"}, {"k", "2"}});
    EXPECT_EQ(QStringLiteral("1"), properties.getValue("k"));
    EXPECT_TRUE((properties.getValue("missing") + properties.getValue("K")).isEmpty());

    properties.setValue("k", "changed");
    ASSERT_EQ(3, properties.size());
    EXPECT_EQ(Zel_FrameProperty("k", "changed"), properties.at(0));
    EXPECT_EQ(Zel_FrameProperty("k", "2"), properties.at(2));

    properties.setValue("new", "n");
    ASSERT_EQ(4, properties.size());
    EXPECT_EQ(Zel_FrameProperty("new", "n"), properties.at(3));
}

TEST(Zel_FrameLocatorTest, ListEqualityIsSymmetricAndCountsRepeats)
{
    EXPECT_TRUE(list({}) == list({}));
    EXPECT_TRUE(list({{"a", "1"}, {"b", "2"}}) == list({{"b", "2"}, {"a", "1"}}));
    EXPECT_TRUE(list({{"a", "1"}, {"b", "2"}}) != list({{"a", "1"}, {"b", "3"}}));
    // Different lengths are unequal even when one holds all of the other.
    EXPECT_TRUE(list({{"a", "1"}}) != list({{"a", "1"}, {"b", "2"}}));
    EXPECT_TRUE(list({{"a", "1"}, {"b", "2"}}) != list({{"a", "1"}}));

    // A repeated property must be repeated on both sides, whichever side asks.
    const Zel_FramePropertyList twice = list({{"a", "1"}, {"a", "1"}});
    const Zel_FramePropertyList mixed = list({{"a", "1"}, {"b", "2"}});
    EXPECT_FALSE(twice == mixed);
    EXPECT_FALSE(mixed == twice);
    EXPECT_TRUE(twice != mixed);
    EXPECT_TRUE(mixed != twice);
    EXPECT_TRUE(twice == list({{"a", "1"}, {"a", "1"}}));
    EXPECT_TRUE(list({{"a", "1"}, {"b", "2"}, {"a", "1"}}) == list({{"a", "1"}, {"a", "1"}, {"b", "2"}}));
    EXPECT_FALSE(list({{"a", "1"}, {"b", "2"}, {"a", "1"}}) == list({{"a", "1"}, {"b", "2"}, {"b", "2"}}));
}

TEST(Zel_FrameLocatorTest, LongListEqualityCountsRepeatsToo)
{
    // Past the pairwise matching size the comparison counts occurrences.
    Zel_FramePropertyList left;
    Zel_FramePropertyList right;
    for (int i = 0; i < 40; ++i) {
        left.append(Zel_FrameProperty(QString::number(i % 20), "v"));
        right.prepend(Zel_FrameProperty(QString::number(i % 20), "v"));
    }
    EXPECT_TRUE(left == right && right == left);

    Zel_FramePropertyList skewed = right;
    skewed[0] = Zel_FrameProperty(QString::number(1), "v"); // 1 three times, another key once
    EXPECT_FALSE(left == skewed || skewed == left);
    EXPECT_TRUE(skewed != left);
}

TEST(Zel_FrameLocatorTest, IdentityComparesIdentifiersAndEquivalenceComparesContent)
{
    const Zel_FrameLocator a = locator("L1", {{"color", "red"}, {"note", "x"}});
    const Zel_FrameLocator sameIdOtherContent = locator("L1", {{"color", "blue"}});
    EXPECT_TRUE(a == sameIdOtherContent);
    EXPECT_FALSE(a != sameIdOtherContent);
    EXPECT_FALSE(a.isEquivalent(sameIdOtherContent));
    EXPECT_FALSE(sameIdOtherContent.isEquivalent(a));

    const Zel_FrameLocator otherIdSameContent = locator("L2", {{"note", "x"}, {"color", "red"}});
    EXPECT_FALSE(a == otherIdSameContent);
    EXPECT_TRUE(a != otherIdSameContent);
    EXPECT_TRUE(a.isEquivalent(otherIdSameContent));
    EXPECT_TRUE(otherIdSameContent.isEquivalent(a));

    // Equivalence reads a missing key as an empty value.
    const Zel_FrameLocator emptyValue = locator("E", {{"k", ""}});
    EXPECT_TRUE(emptyValue.isEquivalent(locator("N", {})));
    EXPECT_TRUE(locator("N", {}).isEquivalent(emptyValue));
    EXPECT_FALSE(locator("K", {{"k", "v"}}).isEquivalent(locator("N", {})));
    EXPECT_FALSE(locator("N", {}).isEquivalent(locator("K", {{"k", "v"}})));

    // A key held twice with different values is not equivalent even to itself.
    const Zel_FrameLocator conflicting = locator("C", {{"k", "1"}, {"k", "2"}});
    EXPECT_FALSE(conflicting.isEquivalent(conflicting));
    EXPECT_TRUE(conflicting == conflicting);

    // The list comparison stays reachable and ignores identifiers.
    const Zel_FramePropertyList& base = otherIdSameContent;
    EXPECT_TRUE(a == base);
    EXPECT_FALSE(sameIdOtherContent == base);
}

TEST(Zel_FrameLocatorTest, CopiesCarryIdentifierAndProperties)
{
    const Zel_FrameLocator original = locator("L9", {{"k", "v"}});
    Zel_FrameLocator copy(original);
    EXPECT_EQ(QStringLiteral("L9"), copy.getID());
    EXPECT_TRUE(copy.isEquivalent(original));

    Zel_FrameLocator assigned = locator("other", {{"a", "b"}, {"c", "d"}});
    assigned = original;
    EXPECT_EQ(QStringLiteral("L9"), assigned.getID());
    EXPECT_EQ(original.toZelString(), assigned.toZelString());

    copy.setValue("k", "changed");
    EXPECT_EQ(QStringLiteral("v"), original.getValue("k"));
}
