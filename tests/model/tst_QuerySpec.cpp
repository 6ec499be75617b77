#include "Zel_QuerySpec.h"

#include "VtableSlot.h"

#include <gtest/gtest.h>

TEST(Zel_QuerySpecTest, GetStringIsTheOnlyVirtualAfterTheDestructor)
{
    EXPECT_EQ(2, vtableSlot(&Zel_QuerySpec::getString));
}

TEST(Zel_QuerySpecTest, DefaultQueryIsEmptyWithSwitchesOff)
{
    Zel_QuerySpec spec;
    EXPECT_TRUE(spec.getString().isEmpty());
    EXPECT_TRUE(spec.getTextParam().isEmpty());
    EXPECT_EQ(0L, spec.getTimeParamAsSeconds());
    EXPECT_TRUE(spec.getSelectedTypes().isEmpty());
    EXPECT_TRUE(spec.getCategories().isEmpty());
    EXPECT_TRUE(spec.getProperties().isEmpty());
    EXPECT_FALSE(spec.getReturnReferencedAssets());
    EXPECT_FALSE(spec.getSearchTextInLocatorsAndAnnotations());
    EXPECT_FALSE(spec.getSearchTextInRestrictions());

    Zel_QuerySpec texted(QStringLiteral("interview"));
    EXPECT_EQ(QStringLiteral("interview"), texted.getString());
    EXPECT_EQ(0L, texted.getTimeParamAsSeconds());
    EXPECT_FALSE(texted.getSearchTextInRestrictions());
}

TEST(Zel_QuerySpecTest, AddOperationsKeepDuplicatesInInsertionOrder)
{
    Zel_QuerySpec spec;
    spec.addPropertyParam(Zel_Property("Tape", "T1", QString()));
    spec.addPropertyParam(Zel_Property("Tape", "T2", QString()));
    spec.addPropertyParam(Zel_Property("Tape", "T1", QString()));
    ASSERT_EQ(3, spec.getProperties().size());
    EXPECT_EQ(QStringLiteral("T1"), spec.getProperties().at(0).value());
    EXPECT_EQ(QStringLiteral("T2"), spec.getProperties().at(1).value());
    EXPECT_EQ(QStringLiteral("T1"), spec.getProperties().at(2).value());

    spec.addTypeParam("clip");
    spec.setSelectedTypes(QStringList{"bin", "sequence"});
    spec.addTypeParam("bin");
    EXPECT_EQ((QStringList{"bin", "sequence", "bin"}), spec.getSelectedTypes());

    spec.addCategoryParam("news");
    spec.addCategoryParam("news");
    spec.addCategoryParam("sport");
    EXPECT_EQ((QStringList{"news", "news", "sport"}), spec.getCategories());
}

TEST(Zel_QuerySpecTest, StoresTimeAndSwitchesUnchanged)
{
    Zel_QuerySpec spec("text");
    spec.setTimeParam(-3600L);
    EXPECT_EQ(-3600L, spec.getTimeParamAsSeconds());
    spec.setTimeParam(2147483647L);
    EXPECT_EQ(2147483647L, spec.getTimeParamAsSeconds());

    spec.setReturnReferencedAssets(true);
    EXPECT_TRUE(spec.getReturnReferencedAssets());
    EXPECT_FALSE(spec.getSearchTextInLocatorsAndAnnotations());
    EXPECT_FALSE(spec.getSearchTextInRestrictions());
    spec.setSearchTextInLocatorsAndAnnotations(true);
    EXPECT_TRUE(spec.getSearchTextInLocatorsAndAnnotations());
    EXPECT_FALSE(spec.getSearchTextInRestrictions());
    spec.setSearchTextInRestrictions(true);
    EXPECT_TRUE(spec.getSearchTextInRestrictions());

    spec.setTextParam("other");
    EXPECT_EQ(QStringLiteral("other"), spec.getString());
}

TEST(Zel_QuerySpecTest, CopiesCarryAllEightFields)
{
    Zel_QuerySpec original("find me");
    original.setTimeParam(42);
    original.addTypeParam("clip");
    original.addCategoryParam("cat");
    original.addPropertyParam(Zel_Property("k", "v", "c"));
    original.setReturnReferencedAssets(true);
    original.setSearchTextInLocatorsAndAnnotations(true);
    original.setSearchTextInRestrictions(true);

    Zel_QuerySpec assigned;
    assigned.addTypeParam("stale");
    for (const Zel_QuerySpec& copy : {Zel_QuerySpec(original), (assigned = original, assigned)}) {
        EXPECT_EQ(QStringLiteral("find me"), copy.getTextParam());
        EXPECT_EQ(42L, copy.getTimeParamAsSeconds());
        EXPECT_EQ(QStringList{"clip"}, copy.getSelectedTypes());
        EXPECT_EQ(QStringList{"cat"}, copy.getCategories());
        ASSERT_EQ(1, copy.getProperties().size());
        EXPECT_EQ(QStringLiteral("c"), copy.getProperties().at(0).customValues());
        EXPECT_TRUE(copy.getReturnReferencedAssets());
        EXPECT_TRUE(copy.getSearchTextInLocatorsAndAnnotations());
        EXPECT_TRUE(copy.getSearchTextInRestrictions());
    }

    // The copy is independent of its source.
    Zel_QuerySpec copy(original);
    copy.addTypeParam("more");
    EXPECT_EQ(1, original.getSelectedTypes().size());
}
