#include "EventTestSupport.h"
#include "StubSession.h"
#include "VtableSlot.h"
#include "Zel_ResolutionID.h"

#include <gtest/gtest.h>

#include <QRegExp> // Qt 6: Core5Compat
#include <type_traits>

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
    EXPECT_TRUE(session.illegalAssetNameCharacters().isEmpty());
    EXPECT_TRUE(session.illegalPropertyNameCharacters().isEmpty());

    EXPECT_FALSE(session.isValidAssetName(QString()));
    EXPECT_FALSE(session.isValidAssetName(QStringLiteral("")));
    EXPECT_FALSE(session.isValidAssetName(QStringLiteral("   ")));
    EXPECT_FALSE(session.isValidAssetName(QStringLiteral(" .,;-/\\ !")));
    EXPECT_FALSE(session.isValidPropertyName(QStringLiteral("#?")));
    EXPECT_TRUE(session.isValidAssetName(QStringLiteral("a b/c")));
    EXPECT_TRUE(session.isValidAssetName(QStringLiteral("_")));
    EXPECT_TRUE(session.isValidAssetName(QStringLiteral("  7 ")));
    EXPECT_TRUE(session.isValidPropertyName(QStringLiteral("[]^-\\x")));
    EXPECT_TRUE(session.isValidAssetName(QString::fromUtf8("\xc3\xa9t\xc3\xa9"))); // été
    EXPECT_TRUE(session.isValidAssetName(QString(QChar(0x0301)) + QLatin1Char('!'))); // a lone combining mark
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

TEST(Zel_SessionTest, IllegalCharactersAreTakenLiterally)
{
    StubSession session;
    // A backslash.
    EXPECT_FALSE(session.isValidName(QStringLiteral("a\\b"), QStringLiteral("\\")));
    EXPECT_TRUE(session.isValidName(QStringLiteral("ab"), QStringLiteral("\\")));
    // A range is not a range: "a-z" outlaws a, the hyphen and z only.
    EXPECT_TRUE(session.isValidName(QStringLiteral("bcd"), QStringLiteral("a-z")));
    EXPECT_FALSE(session.isValidName(QStringLiteral("bad"), QStringLiteral("a-z")));
    EXPECT_FALSE(session.isValidName(QStringLiteral("b-c"), QStringLiteral("a-z")));
    EXPECT_FALSE(session.isValidName(QStringLiteral("bz"), QStringLiteral("a-z")));
    // A closing bracket, a caret and an opening bracket are enforced.
    EXPECT_FALSE(session.isValidName(QStringLiteral("x]"), QStringLiteral("]")));
    EXPECT_TRUE(session.isValidName(QStringLiteral("x["), QStringLiteral("]")));
    EXPECT_FALSE(session.isValidName(QStringLiteral("x^y"), QStringLiteral("^")));
    EXPECT_TRUE(session.isValidName(QStringLiteral("xy"), QStringLiteral("^")));
    // A leading caret does not negate the set.
    EXPECT_FALSE(session.isValidName(QStringLiteral("abc"), QStringLiteral("^a")));
    EXPECT_TRUE(session.isValidName(QStringLiteral("bc"), QStringLiteral("^a")));
    EXPECT_FALSE(session.isValidName(QStringLiteral("a[b"), QStringLiteral("[")));
    // Case matters.
    EXPECT_TRUE(session.isValidName(QStringLiteral("ABC"), QStringLiteral("abc")));
    // Word characters may be illegal too.
    EXPECT_FALSE(session.isValidName(QStringLiteral("a_b"), QStringLiteral("_")));
}

TEST(Zel_SessionTest, OverriddenSetsApplyToTheirKindThroughTheVirtualSlots)
{
    StrictSession strict(QStringLiteral("/\\:"), QStringLiteral(".-]"));
    Zel_Session& session = strict;
    EXPECT_FALSE(session.isValidAssetName(QStringLiteral("a/b")));
    EXPECT_FALSE(session.isValidAssetName(QStringLiteral("a\\b")));
    EXPECT_FALSE(session.isValidAssetName(QStringLiteral("c:")));
    EXPECT_TRUE(session.isValidAssetName(QStringLiteral("a.b-c]")));
    EXPECT_FALSE(session.isValidPropertyName(QStringLiteral("a.b")));
    EXPECT_FALSE(session.isValidPropertyName(QStringLiteral("a-b")));
    EXPECT_FALSE(session.isValidPropertyName(QStringLiteral("a]")));
    EXPECT_TRUE(session.isValidPropertyName(QStringLiteral("a/b:c\\")));
    EXPECT_FALSE(session.isValidPropertyName(QStringLiteral("...")));
}

TEST(Zel_SessionTest, StartsConnectedWithItsResolutionIdsAndKeepsTheFlags)
{
    Zel_ResolutionIDList ids;
    ids.append(Zel_ResolutionID(QStringLiteral("High"), QStringLiteral("17")));
    ids.append(Zel_ResolutionID(QStringLiteral("Proxy"), QStringLiteral("3")));
    StubSession session(ids);
    ids.clear(); // the session keeps its own copy
    ASSERT_EQ(session.getResolutionIDList().size(), 2);
    EXPECT_EQ(session.getResolutionIDList().at(0).label(), QStringLiteral("High"));
    EXPECT_EQ(session.getResolutionIDList().at(1).id(), QStringLiteral("3"));

    EXPECT_TRUE(session.getConnectionStatus());
    EXPECT_FALSE(session.getRemoteClientStatus());
    session.setConnectedStatus(false);
    session.setRemoteClientStatus(true);
    EXPECT_FALSE(session.getConnectionStatus());
    EXPECT_TRUE(session.getRemoteClientStatus());

    StubSession copy(session);
    EXPECT_FALSE(copy.getConnectionStatus());
    EXPECT_TRUE(copy.getRemoteClientStatus());
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
    StubSession other;
    const boost::shared_ptr<Zel_EventCB> otherHub = other.getEventCBSP();
    boost::shared_ptr<RecordingListener> c(new RecordingListener(&log, QStringLiteral("c"), moniker("A")));
    other.RegisterListener(c);
    EXPECT_EQ(c.use_count(), 2);
    other = *session;
    EXPECT_EQ(c.use_count(), 1);
    EXPECT_EQ(other.getEventCBSP().get(), hub.get());
    StubSession& alias = other;
    other = alias; // self-assignment keeps it
    EXPECT_EQ(other.getEventCBSP().get(), hub.get());

    // The original goes; the assigned copy still shares the hub.
    session.reset();
    EXPECT_EQ(a.use_count(), 2);
    other.UnregisterListener(a);
    EXPECT_EQ(a.use_count(), 1);
    log.clear();
    deliver(hub, addedEvent("A", "c"));
    EXPECT_EQ(log.lines(), QStringList({"b:Zel_EventChildAdded parent: A child: c"}));
}

TEST(Zel_SessionTest, LastSessionsEndEmptiesTheHub)
{
    EventLog log;
    boost::shared_ptr<Zel_EventCB> hub;
    boost::shared_ptr<RecordingListener> a(new RecordingListener(&log, QStringLiteral("a"), boost::shared_ptr<QString>()));
    {
        StubSession session;
        StubSession copy(session);
        hub = session.getEventCBSP();
        copy.RegisterListener(a);
        EXPECT_TRUE(hub->hasRegisteredListener(moniker("x")));
    }
    EXPECT_EQ(a.use_count(), 1);
    EXPECT_FALSE(hub->hasRegisteredListener(moniker("x")));
    EXPECT_FALSE(deliver(hub, addedEvent("x", "y")));
    EXPECT_TRUE(log.lines().isEmpty());
}

TEST(Zel_SessionTest, VirtualSlotOrderIsFixed)
{
    // Destructor (0, 1), eighty backend operations, the two name sets, one
    // more backend operation: eighty-four virtual operations in all.
    EXPECT_EQ(vtableSlot(&Zel_Session::getServerName), 2);
    EXPECT_EQ(vtableSlot(&Zel_Session::getServerVersion), 3);
    EXPECT_EQ(vtableSlot(&Zel_Session::getWorkgroupName), 4);
    EXPECT_EQ(vtableSlot(&Zel_Session::getUserName), 5);
    EXPECT_EQ(vtableSlot(&Zel_Session::getApplicationName), 6);
    EXPECT_EQ(vtableSlot(&Zel_Session::getSessionID), 7);
    EXPECT_EQ(vtableSlot(&Zel_Session::isLoggedIn), 8);
    EXPECT_EQ(vtableSlot(&Zel_Session::getLoginTime), 9);
    EXPECT_EQ(vtableSlot(&Zel_Session::logout), 10);
    EXPECT_EQ(vtableSlot(&Zel_Session::getRootMonikerSP), 11);
    EXPECT_EQ(vtableSlot(&Zel_Session::getHomeMonikerSP), 12);
    EXPECT_EQ(vtableSlot(&Zel_Session::getPathSeparator), 13);
    EXPECT_EQ(vtableSlot(&Zel_Session::isValidMoniker), 14);
    EXPECT_EQ(vtableSlot(&Zel_Session::getResultQSP), 15);
    EXPECT_EQ(vtableSlot(&Zel_Session::submitRequest), 16);
    EXPECT_EQ(vtableSlot(&Zel_Session::cancelAllRequests), 17);
    EXPECT_EQ(vtableSlot(&Zel_Session::supportsRequest), 18);
    EXPECT_EQ(vtableSlot(&Zel_Session::getServerTime), 19);
    EXPECT_EQ(vtableSlot(&Zel_Session::isReadOnly), 20);
    EXPECT_EQ(vtableSlot(&Zel_Session::getMaxNameLength), 21);
    EXPECT_EQ(vtableSlot(&Zel_Session::setStatusNotificationCB), 22);
    EXPECT_EQ(vtableSlot(&Zel_Session::getStatusNotificationCBSP), 23);
    EXPECT_EQ(vtableSlot(&Zel_Session::makeAddDependencyReqSP), 24);
    EXPECT_EQ(vtableSlot(&Zel_Session::makeAddFrameLocatorListReqSP), 25);
    EXPECT_EQ(vtableSlot(&Zel_Session::makeAddFrameRestrictionListReqSP), 26);
    EXPECT_EQ(vtableSlot(&Zel_Session::makeAnalyzeReqSP), 27);
    EXPECT_EQ(vtableSlot(&Zel_Session::makeAssociationsReqSP), 28);
    EXPECT_EQ(vtableSlot(&Zel_Session::makeCheckinLocalBinReqSP), 29);
    EXPECT_EQ(vtableSlot(&Zel_Session::makeCheckinReqSP), 30);
    EXPECT_EQ(vtableSlot(&Zel_Session::makeCheckinUpdateReqSP), 31);
    EXPECT_EQ(vtableSlot(&Zel_Session::makeChildrenAtMonikerReqSP), 32);
    EXPECT_EQ(vtableSlot(&Zel_Session::makeChildrenAtReqSP), 33);
    EXPECT_EQ(vtableSlot(&Zel_Session::makeChildrenReqSP), 34);
    EXPECT_EQ(vtableSlot(&Zel_Session::makeCopyNodeReqSP), 35);
    EXPECT_EQ(vtableSlot(&Zel_Session::makeCreateFolderReqSP), 36);
    EXPECT_EQ(vtableSlot(&Zel_Session::makeCreateFolderUniqueReqSP), 37);
    EXPECT_EQ(vtableSlot(&Zel_Session::makeCreateNodeUniqueReqSP), 38);
    EXPECT_EQ(vtableSlot(&Zel_Session::makeCreatePropertyReqSP), 39);
    EXPECT_EQ(vtableSlot(&Zel_Session::makeCreateReservationReqSP), 40);
    EXPECT_EQ(vtableSlot(&Zel_Session::makeDeleteFrameLocatorListReqSP), 41);
    EXPECT_EQ(vtableSlot(&Zel_Session::makeDeleteFrameRestrictionListReqSP), 42);
    EXPECT_EQ(vtableSlot(&Zel_Session::makeDeleteNodeReqSP), 43);
    EXPECT_EQ(vtableSlot(&Zel_Session::makeDeleteReqSP), 44);
    EXPECT_EQ(vtableSlot(&Zel_Session::makeDirReqSP), 45);
    EXPECT_EQ(vtableSlot(&Zel_Session::makeGetApplicationSettingsReqSP), 46);
    EXPECT_EQ(vtableSlot(&Zel_Session::makeGetChildrenReqSP), 47);
    EXPECT_EQ(vtableSlot(&Zel_Session::makeGetFrameLocatorListReqSP), 48);
    EXPECT_EQ(vtableSlot(&Zel_Session::makeGetFrameRestrictionListReqSP), 49);
    EXPECT_EQ(vtableSlot(&Zel_Session::makeGetLinkedProjectsReqSP), 50);
    EXPECT_EQ(vtableSlot(&Zel_Session::makeGetNodeReqSP), 51);
    EXPECT_EQ(vtableSlot(&Zel_Session::makeGetPropertiesReqSP), 52);
    EXPECT_EQ(vtableSlot(&Zel_Session::makeGetReservationsReqSP), 53);
    EXPECT_EQ(vtableSlot(&Zel_Session::makeGetSettingsReqSP), 54);
    EXPECT_EQ(vtableSlot(&Zel_Session::makeGetSyncedProjRootReqSP), 55);
    EXPECT_EQ(vtableSlot(&Zel_Session::makeGetUserPriviledgesReqSP), 56);
    EXPECT_EQ(vtableSlot(&Zel_Session::makeGetUserSettingsReqSP), 57);
    EXPECT_EQ(vtableSlot(&Zel_Session::makeGetWorkgroupSettingsReqSP), 58);
    EXPECT_EQ(vtableSlot(&Zel_Session::makeLoginReqSP), 59);
    EXPECT_EQ(vtableSlot(&Zel_Session::makeMediaResolutionsReqSP), 60);
    EXPECT_EQ(vtableSlot(&Zel_Session::makeMobBinaryDnDReqSP), 61);
    EXPECT_EQ(vtableSlot(&Zel_Session::makeMobBinaryReqSP), 62);
    EXPECT_EQ(vtableSlot(&Zel_Session::makeMobHeadframeReqSP), 63);
    EXPECT_EQ(vtableSlot(&Zel_Session::makeMobNodeReqSP), 64);
    EXPECT_EQ(vtableSlot(&Zel_Session::makeMonikerReqSP), 65);
    EXPECT_EQ(vtableSlot(&Zel_Session::makeMoveNodeReqSP), 66);
    EXPECT_EQ(vtableSlot(&Zel_Session::makeNodePermissionsReqSP), 67);
    EXPECT_EQ(vtableSlot(&Zel_Session::makeNodeReqSP), 68);
    EXPECT_EQ(vtableSlot(&Zel_Session::makeNodeResolutionsReqSP), 69);
    EXPECT_EQ(vtableSlot(&Zel_Session::makePropertyListReqSP), 70);
    EXPECT_EQ(vtableSlot(&Zel_Session::makeQueryReqSP), 71);
    EXPECT_EQ(vtableSlot(&Zel_Session::makeRefreshNodeReqSP), 72);
    EXPECT_EQ(vtableSlot(&Zel_Session::makeRemoveReservationReqSP), 73);
    EXPECT_EQ(vtableSlot(&Zel_Session::makeRenameNodeReqSP), 74);
    EXPECT_EQ(vtableSlot(&Zel_Session::makeRenameUniqueReqSP), 75);
    EXPECT_EQ(vtableSlot(&Zel_Session::makeRootNodeReqSP), 76);
    EXPECT_EQ(vtableSlot(&Zel_Session::makeSaveSettingsReqSP), 77);
    EXPECT_EQ(vtableSlot(&Zel_Session::makeSetApplicationSettingsReqSP), 78);
    EXPECT_EQ(vtableSlot(&Zel_Session::makeSetPropertiesReqSP), 79);
    EXPECT_EQ(vtableSlot(&Zel_Session::makeSetUserSettingsReqSP), 80);
    EXPECT_EQ(vtableSlot(&Zel_Session::makeStartupReqSP), 81);
    EXPECT_EQ(vtableSlot(&Zel_Session::illegalAssetNameCharacters), 82);
    EXPECT_EQ(vtableSlot(&Zel_Session::illegalPropertyNameCharacters), 83);
    EXPECT_EQ(vtableSlot(&Zel_Session::close), 84);
    EXPECT_TRUE(std::is_abstract<Zel_Session>::value);
    EXPECT_TRUE(std::has_virtual_destructor<Zel_Session>::value);
}
