#include "Zel_QuerySpec.h"

#include "VtableSlot.h"

#include <gtest/gtest.h>

#include <string>

namespace {

// Every field of a query as text, switches as 0/1.
std::string fields(const Zel_QuerySpec& spec)
{
    QStringList properties;
    for (const Zel_Property& p : spec.getProperties())
        properties << p.key() + QLatin1Char('=') + p.value() + QLatin1Char('/') + p.customValues();
    const QString lists = spec.getSelectedTypes().join(QLatin1Char(',')) + QLatin1Char('|')
        + spec.getCategories().join(QLatin1Char(',')) + QLatin1Char('|') + properties.join(QLatin1Char(','));
    return (spec.getTextParam() + QLatin1Char('|') + QString::number(spec.getTimeParamAsSeconds()) + QLatin1Char('|')
            + lists + QLatin1Char('|')).toStdString()
        + char('0' + spec.getReturnReferencedAssets()) + char('0' + spec.getSearchTextInLocatorsAndAnnotations())
        + char('0' + spec.getSearchTextInRestrictions());
}

} // namespace

TEST(Zel_QuerySpecTest, GetStringIsTheOnlyVirtualAndADefaultQueryIsEmptyWithSwitchesOff)
{
    EXPECT_EQ(2, vtableSlot(&Zel_QuerySpec::getString));
    EXPECT_EQ(fields(Zel_QuerySpec()), "|0||||000");
    EXPECT_EQ(fields(Zel_QuerySpec(QStringLiteral("interview"))), "interview|0||||000");
    EXPECT_EQ(Zel_QuerySpec(QStringLiteral("interview")).getString(), QStringLiteral("interview"));
}

TEST(Zel_QuerySpecTest, AddOperationsKeepDuplicatesInInsertionOrder)
{
    Zel_QuerySpec spec;
    spec.addPropertyParam(Zel_Property("Tape", "T1", QString()));
    spec.addPropertyParam(Zel_Property("Tape", "T2", QString()));
    spec.addPropertyParam(Zel_Property("Tape", "T1", QString()));
    spec.addTypeParam("clip");
    spec.setSelectedTypes(QStringList{"bin", "sequence"});
    spec.addTypeParam("bin");
    spec.addCategoryParam("news");
    spec.addCategoryParam("news");
    spec.addCategoryParam("sport");
    EXPECT_EQ(fields(spec), "|0|bin,sequence,bin|news,news,sport|Tape=T1/,Tape=T2/,Tape=T1/|000");
}

TEST(Zel_QuerySpecTest, StoresTimeAndEachSwitchOnItsOwn)
{
    Zel_QuerySpec spec("text");
    spec.setTimeParam(-3600L);
    EXPECT_EQ(fields(spec), "text|-3600||||000");
    spec.setTimeParam(2147483647L);
    spec.setReturnReferencedAssets(true);
    EXPECT_EQ(fields(spec), "text|2147483647||||100");
    spec.setSearchTextInLocatorsAndAnnotations(true);
    EXPECT_EQ(fields(spec), "text|2147483647||||110");
    spec.setSearchTextInRestrictions(true);
    spec.setTextParam("other");
    EXPECT_EQ(fields(spec), "other|2147483647||||111");
    EXPECT_EQ(QStringLiteral("other"), spec.getString());
}

TEST(Zel_QuerySpecTest, CopiesCarryAllEightFieldsAndAreIndependent)
{
    Zel_QuerySpec original("find me");
    original.setTimeParam(42);
    original.addTypeParam("clip");
    original.addCategoryParam("cat");
    original.addPropertyParam(Zel_Property("k", "v", "c"));
    original.setReturnReferencedAssets(true);
    original.setSearchTextInLocatorsAndAnnotations(true);
    original.setSearchTextInRestrictions(true);
    ASSERT_EQ(fields(original), "find me|42|clip|cat|k=v/c|111");

    Zel_QuerySpec assigned;
    assigned.addTypeParam("stale");
    assigned = original;
    EXPECT_EQ(fields(assigned), fields(original));
    Zel_QuerySpec copy(original);
    EXPECT_EQ(fields(copy), fields(original));
    copy.addTypeParam("more");
    EXPECT_EQ(1, original.getSelectedTypes().size());
}
