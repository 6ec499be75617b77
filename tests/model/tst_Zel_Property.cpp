#include "VtableSlot.h"

#include "Zel_Property.h"
#include "Zel_PropertyKeys.h"
#include "Zel_PropertyList.h"
#include "Zel_PropertyManager.h"
#include "Zel_SequenceKeys.h"

#include <boost/make_shared.hpp>

#include <gtest/gtest.h>

#include <set>
#include <string>
#include <vector>

namespace {

std::string str(const QString& text)
{
    return text.toStdString();
}

// A manager whose answers carry its tag, and that records what it was asked.
class TaggedManager : public Zel_PropertyManager
{
public:
    explicit TaggedManager(const QString& tag, bool answer = false) : mTag(tag), mAnswer(answer) {}

    QString getDisplayName(const QString& key) override { return ask("getDisplayName", key, "-display-"); }
    bool getIsModifiable(const QString& key) override { ask("getIsModifiable", key); return mAnswer; }
    bool getIsAvailable(const QString& key) override { ask("getIsAvailable", key); return mAnswer; }
    QString getInternalName(const QString& key) override { return ask("getInternalName", key, "-internal-"); }
    bool getIsType(Zel_PropertyKeyType type, const QString& key) override
    {
        ask("getIsType", QString::number(static_cast<int>(type)) + QLatin1Char(',') + key);
        return mTrueTypes.count(static_cast<int>(type)) ? true : mAnswer;
    }
    bool getIsTextSearchable(const QString& key) override { ask("getIsTextSearchable", key); return mAnswer; }
    bool getHasCustomValues(const QString& key) override { ask("getHasCustomValues", key); return !mAnswer; }
    QStringList getKeys() override { ask("getKeys", QString()); return QStringList(); }
    QString getKeyByDisplayName(const QString& name) override { return ask("getKeyByDisplayName", name, "-key-"); }

    void answerTrueForType(int type) { mTrueTypes.insert(type); }
    // The questions asked so far, joined by "|".
    std::string calls() const { return mCalls.join(QLatin1Char('|')).toStdString(); }
    int callCount() const { return mCalls.size(); }

private:
    // Records "question(argument)"; answers "<tag><infix><argument>".
    QString ask(const char* question, const QString& argument, const char* infix = "")
    {
        mCalls.append(QLatin1String(question) + QLatin1Char('(') + argument + QLatin1Char(')'));
        return mTag + QLatin1String(infix) + argument;
    }

    QString mTag;
    bool mAnswer;
    std::set<int> mTrueTypes;
    QStringList mCalls;
};

// The registration is process-wide: every test starts and ends without one.
class Zel_PropertyTest : public ::testing::Test
{
protected:
    void SetUp() override { Zel_Property::setPropertyManagerSP(boost::shared_ptr<Zel_PropertyManager>()); }
    void TearDown() override { Zel_Property::setPropertyManagerSP(boost::shared_ptr<Zel_PropertyManager>()); }
};

class Zel_PropertyListTest : public Zel_PropertyTest
{
};

Zel_Property prop(const char* key, const char* value, const char* custom = "")
{
    return Zel_Property(QString::fromLatin1(key), QString::fromLatin1(value), QString::fromLatin1(custom));
}

boost::shared_ptr<TaggedManager> manager(const char* tag, bool answer = false)
{
    return boost::make_shared<TaggedManager>(QString::fromLatin1(tag), answer);
}

// The static questions' answers about "Name": display name, key by display
// name, custom values, modifiable, of type None.
std::string staticAnswers()
{
    const QString name = QStringLiteral("Name");
    std::string text = str(Zel_Property::getDisplayName(name)) + '|';
    text += str(Zel_Property::getKeyByDisplayName(name)) + '|';
    text += char('0' + Zel_Property::getHasCustomValues(name));
    text += char('0' + Zel_Property::getIsModifiable(name));
    return text + char('0' + Zel_Property::getIsType(Zel_PropertyKeyType_None, name));
}

// A property's answers through the manager (or, when empty, the registered
// one): display name | internal name | available, modifiable, text
// searchable, of type None as 0/1.
std::string answers(const Zel_Property& p, boost::shared_ptr<Zel_PropertyManager> m = boost::shared_ptr<Zel_PropertyManager>())
{
    // One question per statement: the managers record the order they are asked in.
    std::string text = str(p.displayName(m)) + '|';
    text += str(p.internalName(m)) + '|';
    text += char('0' + p.isAvailable(m));
    text += char('0' + p.isModifiable(m));
    text += char('0' + p.isTextSearchable(m));
    return text + char('0' + p.isType(Zel_PropertyKeyType_None, m));
}

// "key=value/custom" per element, for whole-list comparisons.
std::vector<std::string> contents(const Zel_PropertyList& list)
{
    std::vector<std::string> out;
    for (const Zel_Property& p : list)
        out.push_back(str(p.key() + QLatin1Char('=') + p.value() + QLatin1Char('/') + p.customValues()));
    return out;
}

} // namespace

TEST_F(Zel_PropertyTest, AnswersFallbacksWithoutManager)
{
    EXPECT_FALSE(Zel_Property::getPropertyManagerSP());
    EXPECT_EQ(staticAnswers(), "||011");

    const Zel_Property p = prop("Name", "x");
    EXPECT_EQ(answers(p), "||1111");
    EXPECT_TRUE(p.isResolution() && p.isType(static_cast<Zel_PropertyKeyType>(77)));
    EXPECT_EQ(str(p), "Zel_Property(Name:x::)");
}

TEST_F(Zel_PropertyTest, TraceFormTakesNamesFromRegisteredManager)
{
    const boost::shared_ptr<TaggedManager> registered = manager("reg");
    Zel_Property::setPropertyManagerSP(registered);
    EXPECT_EQ(str(prop("Name", "x", "ignored")), "Zel_Property(Name:x:reg-display-Name:reg-internal-Name)");
    EXPECT_EQ(registered->calls(), "getDisplayName(Name)|getInternalName(Name)");
}

TEST_F(Zel_PropertyTest, ResolvesArgumentThenRegisteredThenFallback)
{
    const boost::shared_ptr<TaggedManager> registered = manager("reg", false);
    const boost::shared_ptr<TaggedManager> argument = manager("arg", true);
    Zel_Property::setPropertyManagerSP(registered);
    ASSERT_EQ(Zel_Property::getPropertyManagerSP(), registered);

    const Zel_Property p = prop("Tape", "t1");
    // The argument wins, for that call only; without one the registered manager answers.
    EXPECT_EQ(answers(p, argument), "arg-display-Tape|arg-internal-Tape|1111");
    EXPECT_EQ(registered->calls(), "");
    EXPECT_EQ(answers(p), "reg-display-Tape|reg-internal-Tape|0000");
    EXPECT_EQ(registered->calls(),
              "getDisplayName(Tape)|getInternalName(Tape)|getIsAvailable(Tape)|getIsModifiable(Tape)|"
              "getIsTextSearchable(Tape)|getIsType(0,Tape)");

    // The static questions always ask the registered manager.
    EXPECT_EQ(str(Zel_Property::getDisplayName(QStringLiteral("Tape"))), "reg-display-Tape");
    EXPECT_EQ(str(Zel_Property::getKeyByDisplayName(QStringLiteral("Tape Name"))), "reg-key-Tape Name");
    EXPECT_TRUE(Zel_Property::getHasCustomValues(QStringLiteral("Tape")));
    EXPECT_FALSE(Zel_Property::getIsModifiable(QStringLiteral("Tape")));
    EXPECT_FALSE(Zel_Property::getIsType(Zel_PropertyKeyType_Resolution, QStringLiteral("Tape")));
    EXPECT_EQ(registered->calls(),
              "getDisplayName(Tape)|getInternalName(Tape)|getIsAvailable(Tape)|getIsModifiable(Tape)|"
              "getIsTextSearchable(Tape)|getIsType(0,Tape)|"
              "getDisplayName(Tape)|getKeyByDisplayName(Tape Name)|getHasCustomValues(Tape)|"
              "getIsModifiable(Tape)|getIsType(2,Tape)");

    // An empty pointer unregisters.
    Zel_Property::setPropertyManagerSP(boost::shared_ptr<Zel_PropertyManager>());
    EXPECT_FALSE(Zel_Property::getPropertyManagerSP());
    EXPECT_EQ(answers(p), "||1111");
    EXPECT_EQ(registered->callCount(), 11);
}

TEST_F(Zel_PropertyTest, DestroyedManagerReadsAsNoneAndIsNeverOwned)
{
    boost::shared_ptr<TaggedManager> gone = manager("gone", false);
    const boost::weak_ptr<TaggedManager> watch = gone;
    Zel_Property::setPropertyManagerSP(gone);
    EXPECT_FALSE(Zel_Property::getIsModifiable(QStringLiteral("Name")));
    EXPECT_EQ(gone.use_count(), 1); // the registration holds no strong reference

    gone.reset();
    EXPECT_TRUE(watch.expired());
    EXPECT_FALSE(Zel_Property::getPropertyManagerSP());
    EXPECT_EQ(staticAnswers(), "||011");
    EXPECT_EQ(answers(prop("Name", "x")), "||1111");
    EXPECT_EQ(str(prop("Name", "x")), "Zel_Property(Name:x::)");
    EXPECT_TRUE(prop("Name", "x").isResolution());

    // Registering another manager replaces the first at once.
    const boost::shared_ptr<TaggedManager> first = manager("one");
    const boost::shared_ptr<TaggedManager> second = manager("two");
    Zel_Property::setPropertyManagerSP(first);
    Zel_Property::setPropertyManagerSP(second);
    EXPECT_EQ(str(Zel_Property::getDisplayName(QStringLiteral("k"))), "two-display-k");
    EXPECT_EQ(first->calls(), "");
}

TEST_F(Zel_PropertyTest, IsResolutionAsksTypeTwoThenThree)
{
    const boost::shared_ptr<TaggedManager> onlyThree = manager("m", false);
    onlyThree->answerTrueForType(3);
    const Zel_Property p = prop("Res", "1080");
    EXPECT_TRUE(p.isResolution(onlyThree));
    EXPECT_EQ(onlyThree->calls(), "getIsType(2,Res)|getIsType(3,Res)");

    const boost::shared_ptr<TaggedManager> onlyTwo = manager("m", false);
    onlyTwo->answerTrueForType(2);
    EXPECT_TRUE(p.isResolution(onlyTwo));
    EXPECT_EQ(onlyTwo->calls(), "getIsType(2,Res)");

    const boost::shared_ptr<TaggedManager> neither = manager("m", false);
    EXPECT_FALSE(p.isResolution(neither));

    // Through the registered manager as well.
    Zel_Property::setPropertyManagerSP(neither);
    EXPECT_FALSE(p.isResolution());
    Zel_Property::setPropertyManagerSP(onlyThree);
    EXPECT_TRUE(p.isResolution());
}

TEST_F(Zel_PropertyTest, EqualityIgnoresCustomValuesAndEmptinessIgnoresThem)
{
    EXPECT_TRUE(prop("Name", "a", "c1") == prop("Name", "a", "c2"));
    EXPECT_FALSE(prop("Name", "a", "c1") != prop("Name", "a", "c2"));
    EXPECT_TRUE(prop("Name", "a") != prop("name", "a"));
    EXPECT_TRUE(prop("Name", "a") != prop("Name", "A"));

    const Zel_Property null;
    EXPECT_TRUE(null.key().isNull() && null.value().isNull() && null.customValues().isNull());
    EXPECT_TRUE(null.isEmpty());
    EXPECT_TRUE(prop("", "", "custom only").isEmpty());
    EXPECT_FALSE(prop("", "v").isEmpty());
    EXPECT_FALSE(prop("k", "").isEmpty());

    Zel_Property p = prop("Name", "a", "c");
    p.setValue(QStringLiteral("b"));
    EXPECT_EQ(str(p.key() + p.value() + p.customValues()), "Namebc");
}

TEST_F(Zel_PropertyListTest, AddOrUpdateReplacesOnlyTheValueInPlaceTheOtherAddsKeepTheFirst)
{
    Zel_PropertyList list;
    list.addOrUpdate(prop("First", "1"));
    list.addOrUpdate(prop("Name", "a", "c1"));
    list.addOrUpdate(prop("Last", "9"));
    list.addOrUpdate(prop("Name", "b", "c2"));
    EXPECT_EQ(contents(list), (std::vector<std::string>{ "First=1/", "Name=b/c1", "Last=9/" }));
    list.addOrUpdate(prop("name", "lower"));
    EXPECT_EQ(contents(list), (std::vector<std::string>{ "First=1/", "Name=b/c1", "Last=9/", "name=lower/" }));

    // addIfKeyNotInList and += keep the first.
    list.clear();
    list.addIfKeyNotInList(prop("Name", "a", "c1"));
    list.addIfKeyNotInList(prop("Name", "other", "c2"));
    QList<Zel_Property>& returned = (list += prop("Name", "third"));
    EXPECT_EQ(&returned, static_cast<QList<Zel_Property>*>(&list));
    list += prop("Tape", "t");
    list.addIfKeyNotInList(prop("NAME", "upper"));
    EXPECT_EQ(contents(list), (std::vector<std::string>{ "Name=a/c1", "Tape=t/", "NAME=upper/" }));
}

TEST_F(Zel_PropertyListTest, FindAndEraseWorkOnTheFirstExactKey)
{
    Zel_PropertyList list;
    // The inherited QList operations do not check for duplicates.
    list.append(prop("Name", "first"));
    list.append(prop("Tape", "t"));
    list.append(prop("Name", "second"));

    EXPECT_EQ(str(list.findByKey(QStringLiteral("Name")).value()), "first");
    const Zel_Property missing = list.findByKey(QStringLiteral("name"));
    EXPECT_TRUE(missing.key().isNull() && missing.value().isNull() && missing.customValues().isNull());

    EXPECT_FALSE(list.eraseByKey(QStringLiteral("name")));
    EXPECT_EQ(list.size(), 3);
    EXPECT_TRUE(list.eraseByKey(QStringLiteral("Name")));
    EXPECT_EQ(contents(list), (std::vector<std::string>{ "Tape=t/", "Name=second/" }));
    EXPECT_TRUE(list.eraseByKey(QStringLiteral("Name")));
    EXPECT_EQ(contents(list), (std::vector<std::string>{ "Tape=t/" }));
    EXPECT_FALSE(list.eraseByKey(QStringLiteral("Name")));
}

TEST_F(Zel_PropertyListTest, TraceFormJoinsElementsWithNewlines)
{
    Zel_PropertyList list;
    EXPECT_EQ(str(list), "");
    list += prop("Name", "x");
    EXPECT_EQ(str(list), "Zel_Property(Name:x::)");
    list += prop("Tape", "y");
    EXPECT_EQ(str(list), "Zel_Property(Name:x::)\nZel_Property(Tape:y::)");

    const boost::shared_ptr<TaggedManager> m = manager("m"); // the registration holds it weakly
    Zel_Property::setPropertyManagerSP(m);
    EXPECT_EQ(str(list), "Zel_Property(Name:x:m-display-Name:m-internal-Name)\n"
                         "Zel_Property(Tape:y:m-display-Tape:m-internal-Tape)");

    // Copies are independent values.
    Zel_PropertyList copy(list);
    copy.addOrUpdate(prop("Name", "changed"));
    EXPECT_EQ(str(list.findByKey(QStringLiteral("Name")).value()), "x");
    Zel_PropertyList assigned;
    assigned = copy;
    EXPECT_EQ(contents(assigned), contents(copy));
}

TEST(Zel_PropertyKeysTest, SpellTheServersKeysExactly)
{
    const std::vector<std::pair<const QString*, const char*>> keys = {
        { &Zel_PropKey_Name, "Name" }, { &Zel_PropKey_MobID, "MobID" },
        { &Zel_PropKey_Duration, "Duration" }, { &Zel_PropKey_Tape, "Tape" },
        { &Zel_PropKey_TapeID, "TapeID" }, { &Zel_PropKey_ModifiedDate, "ModifiedDate" },
        { &Zel_PropKey_Tracks, "Tracks" }, { &Zel_PropKey_Comments, "Comments" },
        { &Zel_PropKey_MimeType, "Mime Type" }, { &Zel_PropKey_OmmMobComplete, "_OMM_MOB_COMPLETE" },
        { &Zel_PropKey_EwcExpectedDur, "_EWC_EXPECTED_DUR" },
        { &Zel_PropKey_EwcKnownMediaDur, "_EWC_KNOWN_MEDIA_DUR" },
        { &Zel_PropKey_QmOffsetToSource, "_QM_OFFSET_TO_SOURCE" }, { &Zel_PropKey_QmSourceMobID, "_QM_SOURCE_MOBID" },
        { &Zel_PropKey_QmTrackInfo, "_QM_TRACK_INFO" }, { &Zel_PropKey_MetadataType, "MetadataType" },
        { &Zel_PropKey_Frame, "Frame" }, { &Zel_PropKey_MarkIN, "MarkIN" },
        { &Zel_PropKey_MarkOUT, "MarkOUT" }, { &Zel_PropKey_KopWorkgroupStatus, "KOP_Workgroup_Status" },
        { &Zel_PropKey_Position, "Position" }, { &Zel_PropKey_Start, "Start" },
        { &Zel_PropKey_CreationDate, "CreationDate" }, { &Zel_PropKey_SCRT, "SCRT" },
        { &Zel_PropKey_SMOT, "SMOT" }, { &Zel_PropKey_SCIT, "SCIT" },
        { &Zel_PropKey_SIMT, "SIMT" }, { &Zel_PropKey_CategoryValues, "Category_Values" },
        { &Zel_PropKey_Category, "Category" }, { &Zel_PropKey_LocatorAnnotationValues, "LocatorAnnotationValues" },
        { &Zel_PropKey_StoryID, "Story_ID" }, { &Zel_PropKey_ReviewSequence, "ReviewSequence" },
        { &Zel_PropKey_Path, "Path" }, { &Zel_PropKey_KopServerAuthOwner, "KopServer_AuthOwner" },
        { &Zel_PropKey_KopServerWGContainsDRMClip, "KopServer_WG_ContainsDRMClip" },
        { &Zel_PropKey_CustomList, "CustomList" }, { &Zel_PropKey_CreatedBy, "Created By" },
        { &Zel_PropKey_AppliedDefaults, "AppliedDefaults" }, { &Zel_PropKey_DurationTC, "_DurationTC_" },
        { &Zel_PropKey_VersionNumber, "VersionNumber" }, { &Zel_PropKey_LockedBy, "Locked By" },
        { &Zel_PropKey_LockedOn, "Locked On" }, { &Zel_PropKey_Color, "Color" },
        { &Zel_PropKey_SyncedProjectGUID, "SyncedProject_GUID" },
        { &Zel_PropKey_SyncedProjectType, "SyncedProject_Type" },
        { &Zel_MasterAndSonarisSequence, "Master and Sonaris Sequence" },
        { &Zel_SonarisSequence, "Sonaris_Sequence" },
    };
    ASSERT_EQ(keys.size(), 47u);
    for (const auto& key : keys)
        EXPECT_EQ(str(*key.first), key.second);
}

TEST(Zel_PropertyManagerTest, VirtualSlotsKeepTheirOrder)
{
#define ROW(member) ZEL_SLOT_ROW(Zel_PropertyManager, member)
    EXPECT_EQ(slotsOutOfOrder(2, {ROW(getDisplayName), ROW(getIsModifiable), ROW(getIsAvailable), ROW(getInternalName),
                                  ROW(getIsType), ROW(getIsTextSearchable), ROW(getHasCustomValues), ROW(getKeys),
                                  ROW(getKeyByDisplayName)}),
              "");
#undef ROW
}
