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

TEST(Zel_PropertyKeyInfoTest, RendersFieldsFlagsAndType)
{
    const Zel_PropertyKeyInfo tape(QStringLiteral("Tape"), QStringLiteral("Tape Name"), true, false,
                                   QStringLiteral("tape"), static_cast<Zel_PropertyKeyType>(3), true, false);
    EXPECT_EQ(str(tape.toZelString()), "Zel_PropertyKeyInfo(Tape:Tape Name:tape:T:F:3:T:F)");
    const Zel_PropertyKeyInfo other(QStringLiteral("k"), QStringLiteral("d"), false, true, QStringLiteral("i"),
                                    static_cast<Zel_PropertyKeyType>(-12), false, true);
    EXPECT_EQ(str(other.toZelString()), "Zel_PropertyKeyInfo(k:d:i:F:T:-12:F:T)");

    const Zel_PropertyKeyInfo empty;
    EXPECT_EQ(str(empty.toZelString()), "Zel_PropertyKeyInfo(:::F:F:0:F:F)");
    EXPECT_FALSE(empty.isValid());
    EXPECT_TRUE(empty.isType(Zel_PropertyKeyType_None));

    EXPECT_TRUE(tape.isType(Zel_PropertyKeyType_AlternateResolution));
    EXPECT_FALSE(tape.isType(Zel_PropertyKeyType_Resolution));
    EXPECT_TRUE(tape.isModifiable());
    EXPECT_FALSE(tape.isAvailable());
    EXPECT_TRUE(tape.isTextSearchable());
    EXPECT_FALSE(tape.hasCustomValues());
}

TEST(Zel_PropertyKeyInfoTest, ValidNeedsKeyDisplayAndInternalName)
{
    EXPECT_TRUE(info("k", "d", "i").isValid());
    EXPECT_FALSE(info("", "d", "i").isValid());
    EXPECT_FALSE(info("k", "", "i").isValid());
    EXPECT_FALSE(info("k", "d", "").isValid());
}

TEST(Zel_PropertyKeyInfoTest, EqualityComparesAllEightFields)
{
    const Zel_PropertyKeyInfo base(QStringLiteral("k"), QStringLiteral("d"), true, true, QStringLiteral("i"),
                                   Zel_PropertyKeyType_Resolution, true, true);
    Zel_PropertyKeyInfo copy(base);
    EXPECT_TRUE(copy == base);
    EXPECT_FALSE(copy != base);
    const std::vector<Zel_PropertyKeyInfo> variants = {
        Zel_PropertyKeyInfo(QStringLiteral("K"), QStringLiteral("d"), true, true, QStringLiteral("i"), Zel_PropertyKeyType_Resolution, true, true),
        Zel_PropertyKeyInfo(QStringLiteral("k"), QStringLiteral("D"), true, true, QStringLiteral("i"), Zel_PropertyKeyType_Resolution, true, true),
        Zel_PropertyKeyInfo(QStringLiteral("k"), QStringLiteral("d"), false, true, QStringLiteral("i"), Zel_PropertyKeyType_Resolution, true, true),
        Zel_PropertyKeyInfo(QStringLiteral("k"), QStringLiteral("d"), true, false, QStringLiteral("i"), Zel_PropertyKeyType_Resolution, true, true),
        Zel_PropertyKeyInfo(QStringLiteral("k"), QStringLiteral("d"), true, true, QStringLiteral("I"), Zel_PropertyKeyType_Resolution, true, true),
        Zel_PropertyKeyInfo(QStringLiteral("k"), QStringLiteral("d"), true, true, QStringLiteral("i"), Zel_PropertyKeyType_AlternateResolution, true, true),
        Zel_PropertyKeyInfo(QStringLiteral("k"), QStringLiteral("d"), true, true, QStringLiteral("i"), Zel_PropertyKeyType_Resolution, false, true),
        Zel_PropertyKeyInfo(QStringLiteral("k"), QStringLiteral("d"), true, true, QStringLiteral("i"), Zel_PropertyKeyType_Resolution, true, false),
    };
    for (const Zel_PropertyKeyInfo& variant : variants) {
        EXPECT_FALSE(variant == base) << str(variant.toZelString());
        EXPECT_TRUE(variant != base) << str(variant.toZelString());
    }
    copy = variants[5];
    EXPECT_TRUE(copy == variants[5]);
}

TEST(Zel_PropertyKeyInfoTest, VirtualSlotsKeepTheirOrder)
{
    EXPECT_EQ(vtableSlot(&Zel_PropertyKeyInfo::toZelString), 2);
}

TEST(Zel_PropertyKeyInfoListTest, SameDescriptionTwiceKeepsOneEntrySilently)
{
    TraceCapture capture;
    Zel_PropertyKeyInfoList list;
    list.addIfKeyNotInList(info("Tape", "Tape Name", "tape"));
    // Same names, other fields differ: ignored without a trace line; the first stays.
    list.push_back(info("Tape", "Tape Name", "tape", 7, false));
    EXPECT_EQ(list.size(), 1);
    EXPECT_EQ(str(list.toZelString()), "Zel_PropertyKeyInfo(Tape:Tape Name:tape:T:F:3:T:F)");
    EXPECT_TRUE(capture.orvLines().empty());
    EXPECT_TRUE(capture.qtLines().isEmpty());
}

TEST(Zel_PropertyKeyInfoListTest, FirstValidWinsAndDuplicateIsTraced)
{
    TraceCapture capture;
    Zel_PropertyKeyInfoList list;
    const Zel_PropertyKeyInfo first = info("Tape", "Tape Name", "tape");
    list.addIfKeyNotInList(first);
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

TEST(Zel_PropertyKeyInfoListTest, DuplicateWritesNothingWhileTracingIsOff)
{
    TraceCapture capture(false);
    Zel_PropertyKeyInfoList list;
    list.addIfKeyNotInList(info("Tape", "Tape Name", "tape"));
    list.addIfKeyNotInList(info("Tape", "Tape No.", "tape"));
    EXPECT_TRUE(capture.orvLines().empty());
    EXPECT_EQ(list.size(), 1);
}

TEST(Zel_PropertyKeyInfoListTest, ByNameIndexesHoldTheLastAccepted)
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
}

TEST(Zel_PropertyKeyInfoListTest, InvalidEntryIsReplacedButItsOldRowsStay)
{
    Zel_PropertyKeyInfoList list;
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
    EXPECT_EQ(list.size(), 1);
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

    const Zel_PropertyKeyInfo absent = list.findByKey(QStringLiteral("Absent"));
    EXPECT_TRUE(absent == Zel_PropertyKeyInfo());
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
    EXPECT_TRUE(list.isEmpty());
    EXPECT_FALSE(list.findByDisplayName(QStringLiteral("Mark In")).isValid());
    EXPECT_FALSE(list.findByInternalName(QStringLiteral("markin")).isValid());
    EXPECT_EQ(copy.toZelString(), before);
    EXPECT_TRUE(copy.findByInternalName(QStringLiteral("markin")).isValid());
    list = copy;
    EXPECT_TRUE(list.findByDisplayName(QStringLiteral("Mark In")).isValid());
}
