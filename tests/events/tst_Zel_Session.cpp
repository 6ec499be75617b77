#include "EventTestSupport.h"
#include "StubSession.h"
#include "VtableSlot.h"
#include "Zel_ResolutionID.h"

#include <gtest/gtest.h>

#include <QRegExp> // Qt 6: Core5Compat
#include <type_traits>
#include <vector>

namespace {

// A backend session with its own illegal characters.
class StrictSession : public StubSession
{
public:
    StrictSession(const QString& assetChars, const QString& propertyChars)
        : mAsset(assetChars)
        , mProperty(propertyChars)
    {
    }
    const QString illegalAssetNameCharacters() const override { return mAsset; }
    const QString illegalPropertyNameCharacters() const override { return mProperty; }

private:
    QString mAsset;
    QString mProperty;
};

} // namespace

TEST(Zel_SessionTest, DefaultSetsAcceptEveryNameWithAWordCharacter)
{
    StubSession session;
    EXPECT_TRUE((session.illegalAssetNameCharacters() + session.illegalPropertyNameCharacters()).isEmpty());
    for (const QString& name : {QString(), QStringLiteral(""), QStringLiteral("   "), QStringLiteral(" .,;-/\\ !")})
        EXPECT_FALSE(session.isValidAssetName(name)) << name.toStdString();
    EXPECT_FALSE(session.isValidPropertyName(QStringLiteral("#?")));
    // A lone combining mark counts as a word character.
    for (const QString& name : {QStringLiteral("a b/c"), QStringLiteral("_"), QStringLiteral("  7 "),
                                QString::fromUtf8("\xc3\xa9t\xc3\xa9"), QString(QChar(0x0301)) + QLatin1Char('!')})
        EXPECT_TRUE(session.isValidAssetName(name)) << name.toStdString();
    EXPECT_TRUE(session.isValidPropertyName(QStringLiteral("[]^-\\x")));
}

TEST(Zel_SessionTest, WordCharactersAreThoseOfQtsRegularExpressions)
{
    StubSession session;
    QRegExp word(QStringLiteral("[\\w]"));
    int mismatches = 0;
    for (int code = 0; code <= 0xffff; ++code) {
        const QString name(QChar(static_cast<ushort>(code)));
        if (session.isValidName(name, QString()) != (word.indexIn(name) >= 0))
            ++mismatches;
    }
    EXPECT_EQ(mismatches, 0);
}

TEST(Zel_SessionTest, IllegalCharactersAreTakenLiterallyAndOverriddenSetsApplyToTheirKind)
{
    // A range is not a range, a leading caret does not negate, brackets and
    // backslashes are enforced, case matters, word characters may be illegal.
    struct Row
    {
        const char *name, *illegal;
        bool valid;
    };
    const std::vector<Row> rows = {
        {"a\\b", "\\", false}, {"ab", "\\", true},  {"bcd", "a-z", true}, {"bad", "a-z", false},
        {"b-c", "a-z", false}, {"bz", "a-z", false}, {"x]", "]", false},  {"x[", "]", true},
        {"x^y", "^", false},   {"xy", "^", true},    {"abc", "^a", false}, {"bc", "^a", true},
        {"a[b", "[", false},   {"ABC", "abc", true}, {"a_b", "_", false},
    };
    StubSession stub;
    for (const Row& row : rows)
        EXPECT_EQ(stub.isValidName(QString::fromLatin1(row.name), QString::fromLatin1(row.illegal)), row.valid)
            << row.name << " with " << row.illegal;

    StrictSession strict(QStringLiteral("/\\:"), QStringLiteral(".-]"));
    Zel_Session& session = strict;
    for (const char* name : {"a/b", "a\\b", "c:"})
        EXPECT_FALSE(session.isValidAssetName(QString::fromLatin1(name))) << name;
    for (const char* name : {"a.b", "a-b", "a]", "..."})
        EXPECT_FALSE(session.isValidPropertyName(QString::fromLatin1(name))) << name;
    EXPECT_TRUE(session.isValidAssetName(QStringLiteral("a.b-c]")));
    EXPECT_TRUE(session.isValidPropertyName(QStringLiteral("a/b:c\\")));
}

TEST(Zel_SessionTest, StartsConnectedWithItsResolutionIdsAndKeepsTheFlags)
{
    Zel_ResolutionIDList ids;
    ids.append(Zel_ResolutionID(QStringLiteral("High"), QStringLiteral("17")));
    ids.append(Zel_ResolutionID(QStringLiteral("Proxy"), QStringLiteral("3")));
    StubSession session(ids);
    ids.clear(); // the session keeps its own copy
    EXPECT_EQ(session.getResolutionIDList().toZelString(), QStringLiteral("Zel_ResolutionID(High:17)\nZel_ResolutionID(Proxy:3)"));

    EXPECT_TRUE(session.getConnectionStatus() && !session.getRemoteClientStatus());
    session.setConnectedStatus(false);
    session.setRemoteClientStatus(true);

    StubSession copy(session);
    EXPECT_TRUE(!copy.getConnectionStatus() && copy.getRemoteClientStatus());
    EXPECT_EQ(copy.getResolutionIDList().size(), 2);
    EXPECT_FALSE(copy.getBackendDataSP());
    boost::shared_ptr<int> data(new int(5));
    copy.setBackendDataSP(data);
    StubSession copyOfCopy(copy);
    EXPECT_EQ(copyOfCopy.getBackendDataSP().get(), data.get());
}

TEST(Zel_SessionTest, CopiesShareTheHubWhichIsEmptiedWhenTheLastOneGoes)
{
    EventLog log;
    boost::shared_ptr<StubSession> session(new StubSession);
    const boost::shared_ptr<Zel_EventCB> hub = session->getEventCBSP();
    boost::shared_ptr<RecordingListener> a(new RecordingListener(&log, QStringLiteral("a"), moniker("A")));
    boost::shared_ptr<RecordingListener> b(new RecordingListener(&log, QStringLiteral("b"), moniker("A")));
    session->RegisterListener(a);
    {
        // A temporary copy registers in the same hub and must not empty it.
        StubSession temporary(*session);
        EXPECT_EQ(temporary.getEventCBSP().get(), hub.get());
        temporary.RegisterListener(b);
        temporary.RegisterListener(b);
    }
    deliver(hub, addedEvent("A", "c"));
    EXPECT_EQ(log.lines(), QStringList({"a:Zel_EventChildAdded parent: A child: c", "b:Zel_EventChildAdded parent: A child: c"}));

    // Assignment: the target leaves its old hub (emptied, as it was the only
    // holder) and shares the other's.
    boost::shared_ptr<StubSession> other(new StubSession);
    boost::shared_ptr<RecordingListener> c(new RecordingListener(&log, QStringLiteral("c"), moniker("A")));
    other->RegisterListener(c);
    EXPECT_EQ(c.use_count(), 2);
    *other = *session;
    EXPECT_EQ(c.use_count(), 1);
    EXPECT_EQ(other->getEventCBSP().get(), hub.get());
    StubSession& alias = *other;
    *other = alias; // self-assignment keeps it
    EXPECT_EQ(other->getEventCBSP().get(), hub.get());

    // The original goes; the assigned copy still shares the hub.
    session.reset();
    EXPECT_EQ(a.use_count(), 2);
    other->UnregisterListener(a);
    EXPECT_EQ(a.use_count(), 1);
    log.clear();
    deliver(hub, addedEvent("A", "c"));
    EXPECT_EQ(log.lines(), QStringList({"b:Zel_EventChildAdded parent: A child: c"}));

    // The last one goes: the hub (still alive here) is emptied.
    other.reset();
    EXPECT_EQ(b.use_count(), 1);
    EXPECT_FALSE(hub->hasRegisteredListener(moniker("A")));
    EXPECT_FALSE(deliver(hub, addedEvent("A", "c")));
    EXPECT_EQ(log.lines().size(), 1);
}

TEST(Zel_SessionTest, VirtualSlotOrderIsFixed)
{
    // Destructor (0, 1), eighty backend operations, the two name sets, one
    // more backend operation: eighty-four virtual operations in all.
#define ROW(member) ZEL_SLOT_ROW(Zel_Session, member)
    EXPECT_EQ(slotsOutOfOrder(2, {ROW(getServerName), ROW(getServerVersion), ROW(getWorkgroupName), ROW(getUserName),
                                  ROW(getApplicationName), ROW(getSessionID), ROW(isLoggedIn), ROW(getLoginTime),
                                  ROW(logout), ROW(getRootMonikerSP), ROW(getHomeMonikerSP), ROW(getPathSeparator),
                                  ROW(isValidMoniker), ROW(getResultQSP), ROW(submitRequest), ROW(cancelAllRequests),
                                  ROW(supportsRequest), ROW(getServerTime), ROW(isReadOnly), ROW(getMaxNameLength),
                                  ROW(setStatusNotificationCB), ROW(getStatusNotificationCBSP),
                                  ROW(makeAddDependencyReqSP), ROW(makeAddFrameLocatorListReqSP),
                                  ROW(makeAddFrameRestrictionListReqSP), ROW(makeAnalyzeReqSP),
                                  ROW(makeAssociationsReqSP), ROW(makeCheckinLocalBinReqSP), ROW(makeCheckinReqSP),
                                  ROW(makeCheckinUpdateReqSP), ROW(makeChildrenAtMonikerReqSP),
                                  ROW(makeChildrenAtReqSP), ROW(makeChildrenReqSP), ROW(makeCopyNodeReqSP),
                                  ROW(makeCreateFolderReqSP), ROW(makeCreateFolderUniqueReqSP),
                                  ROW(makeCreateNodeUniqueReqSP), ROW(makeCreatePropertyReqSP),
                                  ROW(makeCreateReservationReqSP), ROW(makeDeleteFrameLocatorListReqSP),
                                  ROW(makeDeleteFrameRestrictionListReqSP), ROW(makeDeleteNodeReqSP),
                                  ROW(makeDeleteReqSP), ROW(makeDirReqSP), ROW(makeGetApplicationSettingsReqSP),
                                  ROW(makeGetChildrenReqSP), ROW(makeGetFrameLocatorListReqSP),
                                  ROW(makeGetFrameRestrictionListReqSP), ROW(makeGetLinkedProjectsReqSP),
                                  ROW(makeGetNodeReqSP), ROW(makeGetPropertiesReqSP), ROW(makeGetReservationsReqSP),
                                  ROW(makeGetSettingsReqSP), ROW(makeGetSyncedProjRootReqSP),
                                  ROW(makeGetUserPriviledgesReqSP), ROW(makeGetUserSettingsReqSP),
                                  ROW(makeGetWorkgroupSettingsReqSP), ROW(makeLoginReqSP),
                                  ROW(makeMediaResolutionsReqSP), ROW(makeMobBinaryDnDReqSP),
                                  ROW(makeMobBinaryReqSP), ROW(makeMobHeadframeReqSP), ROW(makeMobNodeReqSP),
                                  ROW(makeMonikerReqSP), ROW(makeMoveNodeReqSP), ROW(makeNodePermissionsReqSP),
                                  ROW(makeNodeReqSP), ROW(makeNodeResolutionsReqSP), ROW(makePropertyListReqSP),
                                  ROW(makeQueryReqSP), ROW(makeRefreshNodeReqSP), ROW(makeRemoveReservationReqSP),
                                  ROW(makeRenameNodeReqSP), ROW(makeRenameUniqueReqSP), ROW(makeRootNodeReqSP),
                                  ROW(makeSaveSettingsReqSP), ROW(makeSetApplicationSettingsReqSP),
                                  ROW(makeSetPropertiesReqSP), ROW(makeSetUserSettingsReqSP), ROW(makeStartupReqSP),
                                  ROW(illegalAssetNameCharacters), ROW(illegalPropertyNameCharacters), ROW(close)}),
              "");
#undef ROW
    EXPECT_TRUE(std::is_abstract<Zel_Session>::value);
    EXPECT_TRUE(std::has_virtual_destructor<Zel_Session>::value);
}
