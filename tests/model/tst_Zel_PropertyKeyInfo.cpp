#include "TraceCapture.h"
#include "VtableSlot.h"

#include "Zel_PropertyKeyInfo.h"
#include "Zel_PropertyKeyInfoList.h"

#include <gtest/gtest.h>

#include <string>
#include <vector>

namespace {

std::string str(const QString& text)
{
    return text.toStdString();
}

Zel_PropertyKeyInfo info(const char* key, const char* display, const char* internal, int type = 3,
                         bool modifiable = true)
{
    return Zel_PropertyKeyInfo(QString::fromLatin1(key), QString::fromLatin1(display), modifiable, false,
                               QString::fromLatin1(internal), static_cast<Zel_PropertyKeyType>(type), true, false);
}

const char* const kDuplicateTapeNo =
    "ZEL: Zel_PropertyKeyInfoList::addIfKeyNotInList() Duplicate\n"
    "\tcurrent: Zel_PropertyKeyInfo(Tape:Tape Name:tape:T:F:3:T:F)\n"
    "\tnew:     Zel_PropertyKeyInfo(Tape:Tape No.:tape:T:F:3:T:F)";

} // namespace

TEST(Zel_PropertyKeyInfoTest, RendersFieldsFlagsAndTypeAndIsValidWithAllThreeNames)
{
    const Zel_PropertyKeyInfo tape = info("Tape", "Tape Name", "tape");
    EXPECT_EQ(str(tape.toZelString()), "Zel_PropertyKeyInfo(Tape:Tape Name:tape:T:F:3:T:F)");
    const Zel_PropertyKeyInfo other(QStringLiteral("k"), QStringLiteral("d"), false, true, QStringLiteral("i"),
                                    static_cast<Zel_PropertyKeyType>(-12), false, true);
    EXPECT_EQ(str(other.toZelString()), "Zel_PropertyKeyInfo(k:d:i:F:T:-12:F:T)");
    EXPECT_EQ(str(Zel_PropertyKeyInfo().toZelString()), "Zel_PropertyKeyInfo(:::F:F:0:F:F)");
    EXPECT_TRUE(Zel_PropertyKeyInfo().isType(Zel_PropertyKeyType_None));
    EXPECT_TRUE(tape.isType(Zel_PropertyKeyType_AlternateResolution));
    EXPECT_FALSE(tape.isType(Zel_PropertyKeyType_Resolution));

    EXPECT_TRUE(tape.isValid());
    for (const Zel_PropertyKeyInfo& invalid :
         {Zel_PropertyKeyInfo(), info("", "d", "i"), info("k", "", "i"), info("k", "d", "")})
        EXPECT_FALSE(invalid.isValid()) << str(invalid.toZelString());
    EXPECT_EQ(vtableSlot(&Zel_PropertyKeyInfo::toZelString), 2);
}

TEST(Zel_PropertyKeyInfoTest, EqualityComparesAllEightFields)
{
    const auto make = [](const char* key, const char* display, bool modifiable, bool available, const char* internal,
                         Zel_PropertyKeyType type, bool searchable, bool custom) {
        return Zel_PropertyKeyInfo(QString::fromLatin1(key), QString::fromLatin1(display), modifiable, available,
                                   QString::fromLatin1(internal), type, searchable, custom);
    };
    const Zel_PropertyKeyType res = Zel_PropertyKeyType_Resolution, alt = Zel_PropertyKeyType_AlternateResolution;
    const Zel_PropertyKeyInfo base = make("k", "d", true, true, "i", res, true, true);
    Zel_PropertyKeyInfo copy(base);
    EXPECT_TRUE(copy == base);
    EXPECT_FALSE(copy != base);
    const std::vector<Zel_PropertyKeyInfo> variants = {
        make("K", "d", true, true, "i", res, true, true),  make("k", "D", true, true, "i", res, true, true),
        make("k", "d", false, true, "i", res, true, true), make("k", "d", true, false, "i", res, true, true),
        make("k", "d", true, true, "I", res, true, true),  make("k", "d", true, true, "i", alt, true, true),
        make("k", "d", true, true, "i", res, false, true), make("k", "d", true, true, "i", res, true, false),
    };
    for (const Zel_PropertyKeyInfo& variant : variants) {
        EXPECT_FALSE(variant == base) << str(variant.toZelString());
        EXPECT_TRUE(variant != base) << str(variant.toZelString());
    }
    copy = variants[5];
    EXPECT_TRUE(copy == variants[5]);
}

TEST(Zel_PropertyKeyInfoListTest, FirstValidWinsAndADifferingDuplicateIsTracedOnlyWhileTracingIsOn)
{
    {
        TraceCapture capture(false);
        Zel_PropertyKeyInfoList list;
        list.addIfKeyNotInList(info("Tape", "Tape Name", "tape"));
        list.addIfKeyNotInList(info("Tape", "Tape No.", "tape"));
        EXPECT_TRUE(capture.orvLines().empty());
        EXPECT_EQ(list.size(), 1);
    }
    TraceCapture capture;
    Zel_PropertyKeyInfoList list;
    const Zel_PropertyKeyInfo first = info("Tape", "Tape Name", "tape");
    list.addIfKeyNotInList(first);
    // The same description again, other fields differing: kept once, silently.
    list.push_back(info("Tape", "Tape Name", "tape", 7, false));
    EXPECT_EQ(str(list.toZelString()), "Zel_PropertyKeyInfo(Tape:Tape Name:tape:T:F:3:T:F)");
    EXPECT_TRUE(capture.orvLines().empty() && capture.qtLines().isEmpty());
    list.addIfKeyNotInList(info("Tape", "Tape No.", "tape"));

    EXPECT_TRUE(list.findByKey(QStringLiteral("Tape")) == first);
    EXPECT_TRUE(list.findByInternalName(QStringLiteral("tape")) == first);
    EXPECT_TRUE(list.findByDisplayName(QStringLiteral("Tape Name")) == first);
    EXPECT_FALSE(list.findByDisplayName(QStringLiteral("Tape No.")).isValid());

    ASSERT_EQ(capture.orvLines().size(), 1u);
    EXPECT_EQ(capture.orvLines()[0], kDuplicateTapeNo);
    ASSERT_EQ(capture.qtLines().size(), 1);
    EXPECT_TRUE(capture.qtLines()[0].endsWith(QString::fromLatin1(kDuplicateTapeNo).mid(4)));

    // A differing internal name alone is a duplicate too.
    list.addIfKeyNotInList(info("Tape", "Tape Name", "tape2"));
    EXPECT_EQ(capture.orvLines().size(), 2u);
    EXPECT_FALSE(list.findByInternalName(QStringLiteral("tape2")).isValid());
}

TEST(Zel_PropertyKeyInfoListTest, ByNameIndexesHoldTheLastAcceptedAndKeepTheRowsOfAReplacedInvalidEntry)
{
    Zel_PropertyKeyInfoList list;
    const Zel_PropertyKeyInfo a = info("A", "Shown", "intA");
    const Zel_PropertyKeyInfo b = info("B", "Shown", "intB");
    list.addIfKeyNotInList(a);
    list.addIfKeyNotInList(b);
    EXPECT_TRUE(list.findByKey(QStringLiteral("A")) == a);
    EXPECT_TRUE(list.findByKey(QStringLiteral("B")) == b);
    EXPECT_TRUE(list.findByDisplayName(QStringLiteral("Shown")) == b);
    EXPECT_TRUE(list.findByInternalName(QStringLiteral("intA")) == a);
    EXPECT_FALSE(list.findByDisplayName(QStringLiteral("shown")).isValid()); // case-sensitive
    EXPECT_FALSE(list.findByKey(QStringLiteral("a")).isValid());

    const Zel_PropertyKeyInfo invalid = info("Tape", "Old Display", "");
    const Zel_PropertyKeyInfo valid = info("Tape", "Tape Name", "tape");
    list.addIfKeyNotInList(invalid);
    EXPECT_TRUE(list.findByKey(QStringLiteral("Tape")) == invalid);
    EXPECT_TRUE(list.findByInternalName(QString()) == invalid);
    list.addIfKeyNotInList(valid);
    EXPECT_TRUE(list.findByKey(QStringLiteral("Tape")) == valid);
    EXPECT_TRUE(list.findByInternalName(QStringLiteral("tape")) == valid);
    EXPECT_TRUE(list.findByInternalName(QString()) == invalid);
    EXPECT_TRUE(list.findByDisplayName(QStringLiteral("Old Display")) == invalid);
    EXPECT_EQ(list.size(), 3);
}

TEST(Zel_PropertyKeyInfoListTest, LookupsNeverAddAndRenderingIsByAscendingKey)
{
    Zel_PropertyKeyInfoList list;
    EXPECT_EQ(str(list.toZelString()), "");
    list.addIfKeyNotInList(info("Tape", "Tape Name", "tape"));
    list.addIfKeyNotInList(info("MarkIN", "Mark In", "markin"));
    list.addIfKeyNotInList(info("Name", "Name", "name"));
    const QString before = list.toZelString();
    EXPECT_EQ(str(before), "Zel_PropertyKeyInfo(MarkIN:Mark In:markin:T:F:3:T:F)\n"
                           "Zel_PropertyKeyInfo(Name:Name:name:T:F:3:T:F)\n"
                           "Zel_PropertyKeyInfo(Tape:Tape Name:tape:T:F:3:T:F)");

    EXPECT_TRUE(list.findByKey(QStringLiteral("Absent")) == Zel_PropertyKeyInfo());
    list.findByInternalName(QStringLiteral("absent"));
    list.findByDisplayName(QStringLiteral("Absent"));
    EXPECT_EQ(list.toZelString(), before);
    EXPECT_EQ(list.size(), 3);

    std::vector<std::string> keys;
    for (Zel_PropertyKeyInfoList::const_iterator it = list.begin(); it != list.end(); ++it)
        keys.push_back(str(it.key()));
    EXPECT_EQ(keys, (std::vector<std::string>{ "MarkIN", "Name", "Tape" }));

    Zel_PropertyKeyInfoList copy(list);
    list.clear();
    EXPECT_FALSE(list.findByDisplayName(QStringLiteral("Mark In")).isValid());
    EXPECT_FALSE(list.findByInternalName(QStringLiteral("markin")).isValid());
    EXPECT_EQ(copy.toZelString(), before);
    EXPECT_TRUE(copy.findByInternalName(QStringLiteral("markin")).isValid());
    list = copy;
    EXPECT_TRUE(list.findByDisplayName(QStringLiteral("Mark In")).isValid());
}
