#include "Zel_MimeTypeSpec.h"

#include <gtest/gtest.h>

#include <string>
#include <vector>

namespace {

struct Row
{
    quint32 value;
    const char* name;
    long rank;
};

const std::vector<Row> kTable = {
    { 0x2, "sequence", 1 },          { 0x8000, "masterclipewc", 2 },  { 0x1, "masterclip", 3 },
    { 0x1, "clip", 3 },              { 0x80000, "stereomasterclip", 4 }, { 0x10000, "audioclipewc", 5 },
    { 0x80, "audioclip", 6 },        { 0x4, "subclip", 7 },           { 0x100000, "stereosubclip", 8 },
    { 0x20, "effect", 9 },           { 0x40, "renderedeffect", 10 },  { 0x10, "motioneffect", 11 },
    { 0x8, "group", 12 },            { 0x100, "filemob", 13 },        { 0x200, "project", 20 },
    { 0x400, "bin", 21 },            { 0x800, "folder", 22 },         { 0x1000, "catalog", 23 },
    { 0x2000, "workspace", 24 },     { 0x4000, "playbackdevices", 25 }, { 0x20000, "Asset", 26 },
    { 0x40000, "physical", 27 },
};

Zel_MimeTypeValue v(quint32 bits)
{
    return static_cast<Zel_MimeTypeValue>(bits);
}

} // namespace

TEST(Zel_MimeTypeSpecTest, TableRoundTripsNamesBitsAndRanks)
{
    quint32 allBits = 0;
    for (const Row& row : kTable) {
        const QString name = QString::fromLatin1(row.name);
        Zel_MimeTypeValue value = v(0xDEAD);
        ASSERT_TRUE(Zel_MimeTypeSpec::getType(name, value)) << row.name;
        EXPECT_EQ(static_cast<quint32>(value), row.value) << row.name;
        EXPECT_EQ(Zel_MimeTypeSpec::getSortOrder(name), row.rank) << row.name;
        // getString gives the first row with the value: "masterclip" for "clip".
        EXPECT_EQ(Zel_MimeTypeSpec::getString(value).toStdString(),
                  row.value == 0x1 ? std::string("masterclip") : std::string(row.name));
        EXPECT_EQ(Zel_MimeTypeSpec(row.value).get(), static_cast<unsigned long>(row.value));
        EXPECT_TRUE(Zel_MimeTypeSpec(row.value).isType(name)) << row.name;
        EXPECT_FALSE(Zel_MimeTypeSpec(0x1FFFFF & ~row.value).isType(name)) << row.name;
        allBits |= row.value;
    }
    EXPECT_EQ(allBits, 0x1FFFFFu); // the 21 bits 0x1 .. 0x100000, nothing higher

    EXPECT_EQ(Zel_MimeType_MasterClip, 0x1u);
    EXPECT_EQ(Zel_MimeType_Sequence, 0x2u);
    EXPECT_EQ(Zel_MimeType_MasterClipEWC, 0x8000u);
    EXPECT_EQ(Zel_MimeType_Asset, 0x20000u);
    EXPECT_EQ(Zel_MimeType_Physical, 0x40000u);
    EXPECT_EQ(Zel_MimeType_StereoSubClip, 0x100000u);
}

TEST(Zel_MimeTypeSpecTest, UnknownNamesAndValuesFindNothing)
{
    Zel_MimeTypeValue value = Zel_MimeType_Bin;
    EXPECT_FALSE(Zel_MimeTypeSpec::getType(QStringLiteral("Sequence"), value));
    EXPECT_EQ(value, Zel_MimeType_Bin); // left unchanged
    EXPECT_FALSE(Zel_MimeTypeSpec::getType(QString(), value) || Zel_MimeTypeSpec::getType(QStringLiteral("asset"), value));
    EXPECT_EQ(value, Zel_MimeType_Bin);

    // Lookups go by length, then unit by unit: a name one longer than the
    // longest, a unit whose low byte is 'b' (U+0162), an embedded NUL.
    for (const QString& name : {QStringLiteral("Sequence"), QStringLiteral("asset"), QString(), QStringLiteral("sequence "),
                                QStringLiteral("stereomasterclips"), QString(QChar(0x162)) + QStringLiteral("in"),
                                QStringLiteral("bin") + QChar(0) + QStringLiteral("x"), QStringLiteral("bi")})
        EXPECT_EQ(Zel_MimeTypeSpec::getSortOrder(name), 28) << name.toStdString();
    EXPECT_FALSE(Zel_MimeTypeSpec(0xFFFFFFFFu).isType(QString(QChar(0x162)) + QStringLiteral("in")));
    for (quint32 bits : {0x3u, 0u, 0x200000u, 0x80000000u})
        EXPECT_TRUE(Zel_MimeTypeSpec::getString(v(bits)).isNull()) << bits;
}

TEST(Zel_MimeTypeSpecTest, DefaultSetHoldsMediaAndContainersOnlyAndAnEmptySetNothing)
{
    const Zel_MimeTypeSpec spec;
    EXPECT_EQ(spec.get(), 0x19FFFFul);
    for (const char* name : {"clip", "sequence", "bin"})
        EXPECT_TRUE(spec.isType(QString::fromLatin1(name))) << name;
    for (const char* name : {"Asset", "physical", "Sequence", ""})
        EXPECT_FALSE(spec.isType(QString::fromLatin1(name))) << name;
    EXPECT_FALSE(spec.isType(QString()));
    EXPECT_TRUE(spec == Zel_MimeTypeSpec(0x1981FF | 0x7E00));

    const Zel_MimeTypeSpec none(0);
    for (const Row& row : kTable)
        EXPECT_FALSE(none.isType(QString::fromLatin1(row.name)) || none.isType(v(row.value))) << row.name;
    EXPECT_FALSE(none.isType(QString()) || none.isType(QStringLiteral("")) || none.isType(v(0xFFFFFFFFu)));
}

TEST(Zel_MimeTypeSpecTest, AddRemoveAndSetChangeTheMask)
{
    Zel_MimeTypeSpec spec(Zel_MimeType_Bin);
    EXPECT_EQ(spec.addType(Zel_MimeType_Bin), 0x400ul);
    EXPECT_EQ(spec.addType(Zel_MimeType_Folder), 0xC00ul);
    EXPECT_EQ(spec.removeType(Zel_MimeType_Project), 0xC00ul);
    EXPECT_EQ(spec.removeType(Zel_MimeType_Bin), 0x800ul);
    EXPECT_EQ(spec.get(), 0x800ul);

    // A combined value matches when any one of its bits is in the set.
    EXPECT_TRUE(spec.isType(v(Zel_MimeType_Bin | Zel_MimeType_Folder)));
    EXPECT_FALSE(spec.isType(v(Zel_MimeType_Bin | Zel_MimeType_Project)));
    EXPECT_EQ(spec.removeType(v(0xFFFFFFFFu)), 0ul);

    Zel_MimeTypeSpec other(0x1234);
    spec.set(other);
    EXPECT_TRUE(spec == other);
    Zel_MimeTypeSpec assigned;
    assigned = spec;
    EXPECT_EQ(assigned.get(), 0x1234ul);
    EXPECT_FALSE(assigned == Zel_MimeTypeSpec());
}

TEST(Zel_MimeTypeSpecTest, GroupConstantsHoldExactlyTheirTypes)
{
    EXPECT_EQ(Zel_MimeTypes_Containers, quint32(Zel_MimeType_Project | Zel_MimeType_Bin | Zel_MimeType_Folder |
                                                Zel_MimeType_Catalog | Zel_MimeType_Workspace |
                                                Zel_MimeType_PlaybackDevices));
    EXPECT_EQ(Zel_MimeTypes_Media,
              quint32(Zel_MimeType_MasterClip | Zel_MimeType_Sequence | Zel_MimeType_SubClip | Zel_MimeType_Group |
                      Zel_MimeType_MotionEffect | Zel_MimeType_Effect | Zel_MimeType_RenderedEffect |
                      Zel_MimeType_AudioClip | Zel_MimeType_FileMob | Zel_MimeType_MasterClipEWC |
                      Zel_MimeType_AudioClipEWC | Zel_MimeType_StereoMasterClip | Zel_MimeType_StereoSubClip));
    // The groups do not overlap, and together they are the default set.
    EXPECT_EQ(0u, Zel_MimeTypes_Containers & Zel_MimeTypes_Media);
    EXPECT_TRUE(Zel_MimeTypeSpec(Zel_MimeTypes_Containers | Zel_MimeTypes_Media) == Zel_MimeTypeSpec());
    EXPECT_FALSE(Zel_MimeTypeSpec(Zel_MimeTypes_Media).isType(QStringLiteral("bin")));
    EXPECT_FALSE(Zel_MimeTypeSpec(Zel_MimeTypes_Containers).isType(QStringLiteral("Asset")));
}
