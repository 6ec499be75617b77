// End-to-end: every request class through the engine and its worker threads,
// against the sample tree, with its answers, its failures and its events. The
// suite of the server rules: every test runs on every kind of store
// (StoreUnderTest.h); tests of the in-memory tree alone say so.
#include "BackendRecorders.h"
#include "zel_version.h"

#include "Zel_Dependency.h"
#include "Zel_DependencySPList.h"
#include "Zel_GetNodeReq.h"
#include "Zel_MemoryLimits.h"
#include "Zel_Property.h"
#include "Zel_SettingList.h"

#include <QDateTime>

#include <QSet>

#include <algorithm>
#include <atomic>
#include <functional>
#include <memory>
#include <new>
#include <random>
#include <stdexcept>
#include <utility>
#include <vector>

using namespace Sample;

typedef BackendFixture Zel_MemorySessionTest;

INSTANTIATE_TEST_SUITE_P(Store, Zel_MemorySessionTest, ::testing::ValuesIn(storeKinds()), StoreKindName());

TEST_P(Zel_MemorySessionTest, RequestsBeforeLoginFailAndWrongPasswordIsRejected)
{
    boost::shared_ptr<Zel_MemorySession> anonymous = newSession(QString());
    auto node = rec<NodeRec>();
    run(anonymous->makeGetNodeReqSP(mk(m(Mayor)), node), anonymous);
    EXPECT_EQ((QStringList{QStringLiteral("fail %1").arg(Zel_MemoryErrorCodes::NotLoggedIn), QStringLiteral("finished")}), node->log);

    auto login = rec<LoginRec>();
    run(anonymous->makeLoginReqSP(QStringLiteral("editor"), QStringLiteral("wrong"), boost::shared_ptr<Zel_LoginCredentials>(), login),
        anonymous);
    EXPECT_EQ(QList<int>{Zel_MemoryErrorCodes::LoginFailed}, login->codes);
    EXPECT_FALSE(anonymous->isLoggedIn());

    login = rec<LoginRec>();
    run(anonymous->makeLoginReqSP(QStringLiteral("producer"), QStringLiteral("producer"), boost::shared_ptr<Zel_LoginCredentials>(), login),
        anonymous);
    EXPECT_EQ(QStringList{QStringLiteral("ok producer")}, login->log);
    EXPECT_TRUE(anonymous->isLoggedIn());
    EXPECT_EQ(QStringLiteral("producer"), anonymous->getUserName());
    EXPECT_FALSE(anonymous->getSessionID().isEmpty());
    EXPECT_TRUE(anonymous->getLoginTime().isValid());
    anonymous->logout();
    EXPECT_FALSE(anonymous->isLoggedIn());
}

TEST_P(Zel_MemorySessionTest, BrowsingRequestsAnswerNodesInNodeOrder)
{
    auto root = rec<RootNodeRec>();
    run(session->makeRootNodeReqSP(root));
    ASSERT_EQ(1, root->nodes.size());
    EXPECT_EQ(m(Root), root->nodes[0]->getMoniker());
    EXPECT_TRUE(root->nodes[0]->isFolder());
    EXPECT_EQ(QStringList{QStringLiteral("ok Newsroom")}, root->log); // no finished handler

    auto children = rec<NodeRec>();
    run(session->makeGetChildrenReqSP(mk(m(Footage)), children));
    // Media by mime type rank, then by name without regard to case.
    EXPECT_EQ((QStringList{QStringLiteral("ok City Hall Exterior"), QStringLiteral("ok Interview Mayor"),
                           QStringLiteral("ok traffic b-roll"), QStringLiteral("ok Crowd Atmosphere"),
                           QStringLiteral("ok Mayor Soundbite"), QStringLiteral("finished")}),
              children->log);
    const NodeSP mayor = children->nodes[1];
    EXPECT_EQ(m(Mayor), mayor->getMoniker());
    EXPECT_EQ(QStringLiteral("C-MAYOR"), mayor->getNodeID());
    EXPECT_EQ(QStringLiteral("B-FOOTAGE"), mayor->getParentNodeID());
    EXPECT_EQ(QStringLiteral("/Evening News/Footage/Interview Mayor"), mayor->getPath().toZelString(QStringLiteral("/")));
    EXPECT_EQ(QLatin1String(MayorMob), mayor->getMobID().toZelString());
    EXPECT_EQ(QStringLiteral("CARD-0417"), mayor->getPropertyValue(QStringLiteral("Tape")));
    EXPECT_EQ(QDateTime(QDate(2026, 3, 2), QTime(9, 15), Qt::UTC),
              mayor->getPropertyValueAsDateTime(QStringLiteral("CreationDate")));
    EXPECT_TRUE(mayor->isMedia());
    EXPECT_TRUE(mayor->isValid());
    EXPECT_EQ(m(Mayor), children->nodes[4]->getMasterMoniker());

    auto flags = rec<ChildrenRec>();
    run(session->makeChildrenReqSP(mk(m(News)), flags));
    EXPECT_EQ((QStringList{QStringLiteral("ok Archive +"), QStringLiteral("ok Effects +"), QStringLiteral("ok Footage +"),
                           QStringLiteral("ok Sequences +"), QStringLiteral("finished")}),
              flags->log);

    auto at = rec<ChildrenAtRec>();
    run(session->makeChildrenAtReqSP(Zel_Directory(QStringLiteral("/Evening News/Sequences"), QStringLiteral("/")), at));
    EXPECT_EQ((QStringList{QStringLiteral("ok Evening News 18-00"), QStringLiteral("ok Teaser"), QStringLiteral("finished")}), at->log);

    auto atMoniker = rec<ChildrenAtMonikerRec>();
    run(session->makeChildrenAtMonikerReqSP(mk(m(Sequences)), atMoniker));
    EXPECT_EQ(3, atMoniker->log.size());
    ASSERT_TRUE(atMoniker->getParentMoniker());
    EXPECT_EQ(m(Sequences), *atMoniker->getParentMoniker());
    ASSERT_TRUE(atMoniker->getParentNode());
    EXPECT_EQ(QStringLiteral("Sequences"), atMoniker->getParentNode()->getName());

    auto get = rec<NodeRec>();
    run(session->makeGetNodeReqSP(mk(m(Bulletin)), get));
    ASSERT_EQ(1, get->nodes.size());
    EXPECT_TRUE(get->nodes[0]->isReserved());
    EXPECT_EQ(QStringLiteral("producer"), get->nodes[0]->getPropertyValue(QStringLiteral("Locked By")));

    auto refresh = rec<RefreshNodeRec>();
    run(session->makeRefreshNodeReqSP(mk(m(Footage)), refresh));
    EXPECT_EQ((QStringList{QStringLiteral("ok Footage"), QStringLiteral("finished")}), refresh->log);
    EXPECT_TRUE(refresh->nodes[0]->isValidDropTarget());

    auto byPath = rec<NodeCBRec>();
    run(session->makeNodeReqSP(Zel_Directory(QStringLiteral("/Sports Tonight/Highlights"), QStringLiteral("/")), byPath));
    EXPECT_EQ((QStringList{QStringLiteral("ok Highlights"), QStringLiteral("finished")}), byPath->log);
    EXPECT_TRUE(byPath->nodes[0]->isSyncedBin());
    EXPECT_TRUE(byPath->nodes[0]->isSyncedFolder());

    auto moniker = rec<MonikerRec>();
    run(session->makeMonikerReqSP(Zel_Directory(QStringLiteral("/Evening News/Effects/Lower Third"), QStringLiteral("/")), moniker));
    EXPECT_EQ((QStringList{QStringLiteral("ok zel-mem://E-LOWERTHIRD"), QStringLiteral("finished")}), moniker->log);

    auto dir = rec<DirRec>();
    run(session->makeDirReqSP(mk(m(CityHall)), dir));
    EXPECT_EQ((QStringList{QStringLiteral("ok /Evening News/Footage/City Hall Exterior"), QStringLiteral("finished")}), dir->log);

    auto linked = rec<NodeRec>();
    run(session->makeGetLinkedProjectsReqSP(mk(m(Footage)), linked));
    EXPECT_EQ((QStringList{QStringLiteral("ok Sports Tonight"), QStringLiteral("finished")}), linked->log);

    auto synced = rec<NodeRec>();
    run(session->makeGetSyncedProjRootReqSP(mk(QStringLiteral("zel-mem://C-GOAL")), synced));
    EXPECT_EQ((QStringList{QStringLiteral("ok Sports Tonight"), QStringLiteral("finished")}), synced->log);
    auto notSynced = rec<NodeRec>();
    run(session->makeGetSyncedProjRootReqSP(mk(m(Mayor)), notSynced));
    EXPECT_EQ(QList<int>{Zel_MemoryErrorCodes::NotFound}, notSynced->codes);

    auto associations = rec<AssociationsRec>();
    run(session->makeAssociationsReqSP(mk(m(Mayor)), associations));
    EXPECT_EQ((QStringList{QStringLiteral("ok /media/newsroom/CARD-0417"), QStringLiteral("ok /media/newsroom/proxy"),
                           QStringLiteral("finished")}),
              associations->log);

    boost::shared_ptr<Zel_QuerySpec> spec(new Zel_QuerySpec(QStringLiteral("mayor")));
    auto query = rec<QueryRec>();
    run(session->makeQueryReqSP(spec, query));
    EXPECT_EQ(spec, query->getQuerySpec());
    // Names and text-searchable properties ("Comments" of the soundbite does not say mayor; its name does).
    EXPECT_EQ((QStringList{QStringLiteral("ok Interview Mayor"), QStringLiteral("ok Mayor Soundbite"), QStringLiteral("finished")}),
              query->log);
    boost::shared_ptr<Zel_QuerySpec> typed(new Zel_QuerySpec(QStringLiteral("order")));
    typed->addTypeParam(QStringLiteral("sequence"));
    auto typedQuery = rec<QueryRec>();
    run(session->makeQueryReqSP(typed, typedQuery));
    EXPECT_EQ((QStringList{QStringLiteral("ok Evening News 18-00"), QStringLiteral("finished")}), typedQuery->log);
    auto emptyQuery = rec<QueryRec>();
    run(session->makeQueryReqSP(boost::shared_ptr<Zel_QuerySpec>(new Zel_QuerySpec), emptyQuery));
    EXPECT_EQ(QList<int>{Zel_MemoryErrorCodes::InvalidArgument}, emptyQuery->codes);
}

TEST_P(Zel_MemorySessionTest, PropertiesPermissionsReservationsAndResolutions)
{
    auto list = rec<PropertiesRec>();
    run(session->makePropertyListReqSP(mk(m(Mayor)), list));
    EXPECT_EQ(QStringLiteral("Name"), list->last.at(0).key());
    EXPECT_EQ(QStringLiteral("Interview Mayor"), list->last.at(0).value());
    EXPECT_EQ(QStringLiteral("masterclip"), list->last.findByKey(QStringLiteral("Mime Type")).value());
    EXPECT_EQ(QStringLiteral("darkred;darkgreen;darkblue"), list->last.findByKey(QStringLiteral("Color")).customValues());
    // The session registered the tree's property manager.
    EXPECT_EQ(QStringLiteral("Tape Name"), Zel_Property::getDisplayName(QStringLiteral("Tape")));
    EXPECT_FALSE(Zel_Property::getIsModifiable(QStringLiteral("Duration")));
    EXPECT_TRUE(Zel_Property::getHasCustomValues(QStringLiteral("Color")));
    EXPECT_EQ(QStringLiteral("Comments"), Zel_Property::getKeyByDisplayName(QStringLiteral("Comments")));

    auto some = rec<PropertiesRec>();
    run(session->makeGetPropertiesReqSP(mk(m(Mayor)), QStringList{QStringLiteral("Tape"), QStringLiteral("Story_ID")}, some));
    EXPECT_EQ((QStringList{QStringLiteral("ok 2"), QStringLiteral("finished")}), some->log);
    EXPECT_EQ(QStringLiteral("NEWS-0302-TRAM"), some->last.findByKey(QStringLiteral("Story_ID")).value());
    auto unknown = rec<PropertiesRec>();
    run(session->makeGetPropertiesReqSP(mk(m(Mayor)), QStringList{QStringLiteral("Nonsense")}, unknown));
    EXPECT_EQ(QList<int>{Zel_MemoryErrorCodes::UnknownProperty}, unknown->codes);

    auto permissions = rec<PermissionsRec>();
    run(session->makeNodePermissionsReqSP(mk(m(Archive)), permissions));
    // The editor may only read and copy in the archive.
    EXPECT_EQ((QStringList{QStringLiteral("ok { a o stp ral hr lr ar uam cc mc mpa R C fi fo wa wua wnv wl wd dela desa desm res "
                                          "ovres pm cl ml cr mr } zel-mem://B-ARCHIVE"),
                           QStringLiteral("finished")}),
              permissions->log);
    auto others = rec<PermissionsRec>();
    run(session->makeGetUserPriviledgesReqSP(QStringLiteral("producer"), mk(m(Footage)), others));
    EXPECT_EQ(QList<int>{Zel_MemoryErrorCodes::PermissionDenied}, others->codes);
    EXPECT_TRUE(others->privilege);
    boost::shared_ptr<Zel_MemorySession> admin = newSession(QStringLiteral("admin"));
    auto asAdmin = rec<PermissionsRec>();
    run(admin->makeGetUserPriviledgesReqSP(QStringLiteral("assistant"), mk(m(Archive)), asAdmin), admin);
    ASSERT_EQ(2, asAdmin->log.size());
    EXPECT_TRUE(asAdmin->log[0].contains(QStringLiteral(" r c "))) << asAdmin->log[0].toStdString();

    auto reservations = rec<ReservationsRec>();
    run(session->makeGetReservationsReqSP(mk(m(Bulletin)), reservations));
    EXPECT_EQ((QStringList{QStringLiteral("ok producer -"), QStringLiteral("finished")}), reservations->log);

    auto resolutions = rec<ResolutionsRec>();
    run(session->makeMediaResolutionsReqSP(resolutions));
    ASSERT_EQ(2, resolutions->log.size());
    EXPECT_TRUE(resolutions->log[0].contains(QStringLiteral("Zel_PropertyKeyInfo(9001:PCM 48 kHz:PCM 48 kHz:F:T:3:F:F)")));
    EXPECT_EQ(4, session->getResolutionIDList().size());

    auto nodeResolutions = rec<NodeResolutionsRec>();
    run(session->makeNodeResolutionsReqSP(mk(m(Mayor)), nodeResolutions));
    EXPECT_EQ((QStringList{QStringLiteral("ok %1 DNxHD 145").arg(QLatin1String(MayorMob)),
                           QStringLiteral("ok %1 PCM 48 kHz").arg(QLatin1String(MayorMob)),
                           QStringLiteral("ok %1 H.264 Proxy").arg(QLatin1String(MayorMob)), QStringLiteral("finished")}),
              nodeResolutions->log);
    auto notMedia = rec<NodeResolutionsRec>();
    run(session->makeNodeResolutionsReqSP(mk(m(Footage)), notMedia));
    EXPECT_EQ(QList<int>{Zel_MemoryErrorCodes::NotMedia}, notMedia->codes);
}

TEST_P(Zel_MemorySessionTest, ChangesAnswerTheChangedNodesAndReachFolderListenersInOrder)
{
    FolderRec footage(m(Footage), session);
    const int before = store->nodeCount();

    auto created = rec<CreateFolderRec>();
    run(session->makeCreateFolderReqSP(mk(m(Footage)), QStringLiteral("Rushes"), created));
    ASSERT_EQ(1, created->nodes.size());
    const QString rushes = created->nodes[0]->getMoniker();
    EXPECT_EQ(QStringLiteral("bin"), created->nodes[0]->getMimeType());
    EXPECT_EQ(QStringLiteral("editor"), created->nodes[0]->getPropertyValue(QStringLiteral("Created By")));

    auto again = rec<CreateFolderRec>();
    run(session->makeCreateFolderReqSP(mk(m(Footage)), QStringLiteral("Rushes"), again));
    EXPECT_EQ(QList<int>{Zel_MemoryErrorCodes::NameExists}, again->codes);

    auto unique = rec<CreateFolderUniqueRec>();
    run(session->makeCreateFolderUniqueReqSP(mk(m(Footage)), QStringLiteral("Rushes"), unique));
    EXPECT_EQ((QStringList{QStringLiteral("ok Rushes 2"), QStringLiteral("finished")}), unique->log);

    Zel_PropertyList props;
    props.append(Zel_Property(QStringLiteral("Mime Type"), QStringLiteral("sequence"), QString()));
    props.append(Zel_Property(QStringLiteral("Comments"), QStringLiteral("draft"), QString()));
    auto node = rec<NodeRec>();
    run(session->makeCreateNodeUniqueReqSP(mk(rushes), QStringLiteral("Cut 1"), props, node));
    ASSERT_EQ(1, node->nodes.size());
    EXPECT_EQ(QStringLiteral("sequence"), node->nodes[0]->getMimeType());
    EXPECT_FALSE(node->nodes[0]->getMobID().isEmpty());
    EXPECT_EQ(QStringLiteral("draft"), node->nodes[0]->getPropertyValue(QStringLiteral("Comments")));

    auto renamed = rec<RenameNodeRec>();
    run(session->makeRenameNodeReqSP(mk(rushes), QStringLiteral("Dailies"), renamed));
    EXPECT_EQ((QStringList{QStringLiteral("ok Dailies"), QStringLiteral("finished")}), renamed->log);
    auto renamedUnique = rec<RenameUniqueRec>();
    run(session->makeRenameUniqueReqSP(mk(unique->nodes[0]->getMoniker()), QStringLiteral("Dailies"), renamedUnique));
    EXPECT_EQ((QStringList{QStringLiteral("ok Dailies 2"), QStringLiteral("finished")}), renamedUnique->log);

    auto moved = rec<MoveNodeRec>();
    run(session->makeMoveNodeReqSP(mk(m(CityHall)), mk(rushes), moved));
    EXPECT_EQ(QStringLiteral("/Evening News/Footage/Dailies/City Hall Exterior"),
              moved->nodes.value(0) ? moved->nodes[0]->getPath().toZelString(QStringLiteral("/")) : QString());

    auto copied = rec<CopyRec>();
    run(session->makeCopyNodeReqSP(mk(rushes), mk(m(Footage)), copied));
    EXPECT_EQ((QStringList{QStringLiteral("ok Dailies -> Dailies 3"), QStringLiteral("finished")}), copied->log);
    EXPECT_EQ((QList<unsigned long>{3, 3}), copied->progressCalls); // the bin, the sequence and the clip

    auto deleted = rec<BoolRec>();
    run(session->makeDeleteNodeReqSP(mk(unique->nodes[0]->getMoniker()), deleted));
    EXPECT_EQ((QStringList{QStringLiteral("ok true"), QStringLiteral("finished")}), deleted->log);

    EXPECT_EQ(before + 3 + 3 - 1, store->nodeCount()); // three created, three copied, one deleted
    const QString copy = copied->nodes[0]->getMoniker();
    EXPECT_EQ((QStringList{QStringLiteral("added ") + rushes, QStringLiteral("added ") + unique->nodes[0]->getMoniker(),
                           QStringLiteral("updated ") + rushes, QStringLiteral("updated ") + unique->nodes[0]->getMoniker(),
                           QStringLiteral("removed ") + m(CityHall), QStringLiteral("added ") + copy,
                           QStringLiteral("removed ") + unique->nodes[0]->getMoniker()}),
              footage.events());
}

TEST_P(Zel_MemorySessionTest, FailuresAreDataAndLeaveTheTreeUnchanged)
{
    const QByteArray before = store->toJson();
    FolderRec footage(m(Footage), session);

    auto unknown = rec<RenameNodeRec>();
    run(session->makeRenameNodeReqSP(mk(QStringLiteral("zel-mem://NOPE")), QStringLiteral("X"), unknown));
    EXPECT_EQ(QList<int>{Zel_MemoryErrorCodes::UnknownMoniker}, unknown->codes);
    EXPECT_EQ(QStringLiteral("No node has the moniker \"zel-mem://NOPE\"."), unknown->messages.value(0));

    auto badName = rec<RenameNodeRec>();
    run(session->makeRenameNodeReqSP(mk(m(Mayor)), QStringLiteral("a/b"), badName));
    EXPECT_EQ(QList<int>{Zel_MemoryErrorCodes::InvalidName}, badName->codes);
    auto punctuation = rec<CreateFolderRec>();
    run(session->makeCreateFolderReqSP(mk(m(Footage)), QStringLiteral("--- !"), punctuation));
    EXPECT_EQ(QList<int>{Zel_MemoryErrorCodes::InvalidName}, punctuation->codes);

    auto denied = rec<BoolRec>();
    run(session->makeDeleteNodeReqSP(mk(QStringLiteral("zel-mem://C-ELECTION")), denied));
    EXPECT_EQ(QList<int>{Zel_MemoryErrorCodes::PermissionDenied}, denied->codes);
    EXPECT_TRUE(denied->privilege);
    EXPECT_TRUE(denied->messages.value(0).contains(QStringLiteral("DeleteAssets"))) << denied->messages.value(0).toStdString();

    auto reserved = rec<SetPropertiesRec>();
    Zel_PropertyList comments;
    comments.append(Zel_Property(QStringLiteral("Comments"), QStringLiteral("mine now"), QString()));
    run(session->makeSetPropertiesReqSP(mk(m(Bulletin)), comments, reserved));
    EXPECT_EQ(QList<int>{Zel_MemoryErrorCodes::ReservedByOtherUser}, reserved->codes);
    EXPECT_FALSE(reserved->privilege);
    auto deleteReservedBin = rec<BoolRec>();
    run(session->makeDeleteNodeReqSP(mk(m(Sequences)), deleteReservedBin));
    EXPECT_EQ(QList<int>{Zel_MemoryErrorCodes::ReservedByOtherUser}, deleteReservedBin->codes);

    auto intoItself = rec<MoveNodeRec>();
    run(session->makeMoveNodeReqSP(mk(m(News)), mk(m(Footage)), intoItself));
    EXPECT_EQ(QList<int>{Zel_MemoryErrorCodes::InvalidTarget}, intoItself->codes);
    auto notFolder = rec<CreateFolderRec>();
    run(session->makeCreateFolderReqSP(mk(m(Mayor)), QStringLiteral("Inside"), notFolder));
    EXPECT_EQ(QList<int>{Zel_MemoryErrorCodes::NotAFolder}, notFolder->codes);
    auto fixed = rec<SetPropertiesRec>();
    Zel_PropertyList duration;
    duration.append(Zel_Property(QStringLiteral("Duration"), QStringLiteral("1"), QString()));
    run(session->makeSetPropertiesReqSP(mk(m(Mayor)), duration, fixed));
    EXPECT_EQ(QList<int>{Zel_MemoryErrorCodes::PropertyNotModifiable}, fixed->codes);

    // A deletion of several assets: the denied one is reported, nothing else changes.
    auto many = rec<DeleteRec>();
    run(session->makeDeleteReqSP(QStringList{QStringLiteral("zel-mem://C-ELECTION"), QStringLiteral("zel-mem://NOPE")}, true, true, many));
    EXPECT_EQ((QStringList{QStringLiteral("fail %1").arg(Zel_MemoryErrorCodes::PermissionDenied),
                           QStringLiteral("fail %1").arg(Zel_MemoryErrorCodes::UnknownMoniker), QStringLiteral("assets 0"),
                           QStringLiteral("records 0"), QStringLiteral("finished")}),
              many->log);

    auto failedCheckin = rec<CheckinRec>();
    run(session->makeCheckinReqSP(Zel_MobDescList(), mk(m(Archive)), failedCheckin));
    EXPECT_EQ(QList<int>{Zel_MemoryErrorCodes::PermissionDenied}, failedCheckin->codes);

    EXPECT_EQ(before, store->toJson());
    EXPECT_TRUE(footage.events().isEmpty()) << footage.events().join(QLatin1Char(',')).toStdString();
}

TEST_P(Zel_MemorySessionTest, ReservationsLocatorsDependenciesAndConditionalSets)
{
    auto reserve = rec<CreateReservationRec>();
    run(session->makeCreateReservationReqSP(mk(m(Mayor)), QDateTime::currentDateTimeUtc().addSecs(3600), reserve));
    EXPECT_EQ((QStringList{QStringLiteral("ok "), QStringLiteral("finished")}), reserve->log);
    boost::shared_ptr<Zel_MemorySession> producer = newSession(QStringLiteral("producer"));
    auto blocked = rec<RenameNodeRec>();
    run(producer->makeRenameNodeReqSP(mk(m(Mayor)), QStringLiteral("Mayor"), blocked), producer);
    EXPECT_EQ(QList<int>{Zel_MemoryErrorCodes::ReservedByOtherUser}, blocked->codes);
    auto past = rec<CreateReservationRec>();
    run(session->makeCreateReservationReqSP(mk(m(CityHall)), QDateTime::currentDateTimeUtc().addSecs(-10), past));
    EXPECT_EQ(QList<int>{Zel_MemoryErrorCodes::InvalidArgument}, past->codes);
    auto release = rec<RemoveReservationRec>();
    run(session->makeRemoveReservationReqSP(mk(m(Mayor)), release));
    EXPECT_EQ((QStringList{QStringLiteral("ok "), QStringLiteral("finished")}), release->log);
    auto releaseAgain = rec<RemoveReservationRec>();
    run(session->makeRemoveReservationReqSP(mk(m(Mayor)), releaseAgain));
    EXPECT_EQ(QList<int>{Zel_MemoryErrorCodes::NotReserved}, releaseAgain->codes);
    auto notMine = rec<RemoveReservationRec>();
    run(session->makeRemoveReservationReqSP(mk(m(Bulletin)), notMine));
    EXPECT_EQ(QList<int>{Zel_MemoryErrorCodes::ReservedByOtherUser}, notMine->codes);

    auto locators = rec<LocatorsRec>();
    run(session->makeGetFrameLocatorListReqSP(mk(m(Mayor)), locators));
    EXPECT_EQ((QStringList{QStringLiteral("ok L-1,L-2"), QStringLiteral("finished")}), locators->log);
    EXPECT_EQ(QStringLiteral("Mayor enters"), locators->last.value(0).getValue(QStringLiteral("Comment")));
    Zel_FrameLocator locator;
    locator.setValue(QStringLiteral("Frame"), QStringLiteral("500"));
    auto added = rec<LocatorsRec>();
    run(session->makeAddFrameLocatorListReqSP(mk(m(Mayor)), QList<Zel_FrameLocator>{locator}, added));
    EXPECT_EQ((QStringList{QStringLiteral("ok L-1,L-2,L-3"), QStringLiteral("finished")}), added->log);
    Zel_FrameLocator first;
    first.setID(QStringLiteral("L-1"));
    Zel_FrameLocator missing;
    missing.setID(QStringLiteral("L-9"));
    auto removedNone = rec<LocatorsRec>();
    run(session->makeDeleteFrameLocatorListReqSP(mk(m(Mayor)), QList<Zel_FrameLocator>{first, missing}, removedNone));
    EXPECT_EQ(QList<int>{Zel_MemoryErrorCodes::NotFound}, removedNone->codes);
    auto removed = rec<LocatorsRec>();
    run(session->makeDeleteFrameLocatorListReqSP(mk(m(Mayor)), QList<Zel_FrameLocator>{first}, removed));
    EXPECT_EQ((QStringList{QStringLiteral("ok L-2,L-3"), QStringLiteral("finished")}), removed->log);

    auto restrictions = rec<RestrictionsRec>();
    run(session->makeGetFrameRestrictionListReqSP(mk(m(CityHall)), restrictions));
    EXPECT_EQ((QStringList{QStringLiteral("ok R-1"), QStringLiteral("finished")}), restrictions->log);
    auto addRestriction = rec<RestrictionsRec>();
    run(session->makeAddFrameRestrictionListReqSP(mk(m(CityHall)), QList<Zel_FrameLocator>{locator}, addRestriction));
    EXPECT_EQ((QStringList{QStringLiteral("ok R-1,R-2"), QStringLiteral("finished")}), addRestriction->log);
    Zel_FrameLocator r1;
    r1.setID(QStringLiteral("R-1"));
    auto deleteRestriction = rec<RestrictionsRec>();
    run(session->makeDeleteFrameRestrictionListReqSP(mk(m(CityHall)), QList<Zel_FrameLocator>{r1}, deleteRestriction));
    EXPECT_EQ((QStringList{QStringLiteral("ok R-2"), QStringLiteral("finished")}), deleteRestriction->log);

    Zel_DependencySPList dependencies;
    dependencies.append(boost::shared_ptr<Zel_Dependency>(
        new Zel_Dependency(mk(m(CityHall)), QStringLiteral("video"), static_cast<Zel_Dependency::Zel_DependencyType>(1))));
    auto dependency = rec<DependencyRec>();
    run(session->makeAddDependencyReqSP(mk(QStringLiteral("zel-mem://Q-TEASER")), dependencies, dependency));
    EXPECT_EQ((QStringList{QStringLiteral("ok Teaser"), QStringLiteral("finished")}), dependency->log);
    EXPECT_EQ(1, dependency->dependencies);

    auto create = rec<CreatePropertyRec>();
    run(session->makeCreatePropertyReqSP(mk(m(Mayor)), Zel_Property(QStringLiteral("Rights"), QStringLiteral("cleared"), QString()), create));
    EXPECT_EQ((QStringList{QStringLiteral("ok Zel_PropertyKeyInfo(Rights:Rights:rights:T:T:1:T:F)"), QStringLiteral("finished")}),
              create->log);
    EXPECT_EQ(QStringLiteral("Rights"), Zel_Property::getDisplayName(QStringLiteral("Rights")));
    auto twice = rec<CreatePropertyRec>();
    run(session->makeCreatePropertyReqSP(mk(m(Mayor)), Zel_Property(QStringLiteral("Rights"), QString(), QString()), twice));
    EXPECT_EQ(QList<int>{Zel_MemoryErrorCodes::PropertyExists}, twice->codes);

    // Conditional set: the custom values text holds the expected current value.
    Zel_PropertyList stale;
    stale.append(Zel_Property(QStringLiteral("Tape"), QStringLiteral("CARD-9"), QStringLiteral("CARD-1")));
    auto conditional = rec<ConditionalRec>();
    run(session->makeSetPropertiesReqSP(mk(m(Mayor)), stale, conditional));
    EXPECT_EQ((QStringList{QStringLiteral("conditionFailed"), QStringLiteral("finished")}), conditional->log);
    EXPECT_EQ(QStringLiteral("CARD-0417"), conditional->current.findByKey(QStringLiteral("Tape")).value());
    Zel_PropertyList current;
    current.append(Zel_Property(QStringLiteral("Tape"), QStringLiteral("CARD-9"), QStringLiteral("CARD-0417")));
    auto applied = rec<ConditionalRec>();
    run(session->makeSetPropertiesReqSP(mk(m(Mayor)), current, applied));
    ASSERT_EQ(1, applied->nodes.size());
    EXPECT_EQ(QStringLiteral("CARD-9"), applied->nodes[0]->getPropertyValue(QStringLiteral("Tape")));

    // A node read before the change shows the new value once decached.
    auto old = rec<NodeRec>();
    run(session->makeGetNodeReqSP(mk(m(CityHall)), old));
    Zel_PropertyList tape;
    tape.append(Zel_Property(QStringLiteral("Tape"), QStringLiteral("NEW"), QString()));
    auto set = rec<SetPropertiesRec>();
    run(session->makeSetPropertiesReqSP(mk(m(CityHall)), tape, set));
    EXPECT_EQ(QStringLiteral("CARD-0418"), old->nodes[0]->getPropertyValue(QStringLiteral("Tape")));
    old->nodes[0]->decacheProperties();
    EXPECT_EQ(QStringLiteral("NEW"), old->nodes[0]->getPropertyValue(QStringLiteral("Tape")));
}

TEST_P(Zel_MemorySessionTest, MediaCheckInDeletionAndBinaryForms)
{
    FolderRec footage(m(Footage), session);
    auto analyze = rec<AnalyzeRec>();
    run(session->makeAnalyzeReqSP(QStringList{QStringLiteral("/ingest/storm.mxf"), QStringLiteral("/ingest/notes.txt")}, analyze));
    ASSERT_EQ(1, analyze->descs.size());
    EXPECT_EQ((QList<int>{Zel_MemoryErrorCodes::InvalidMedia}), analyze->codes);
    EXPECT_EQ(QStringLiteral("/ingest/storm.mxf"), analyze->descs[0]->getAAFFilePath());

    Zel_MobDescList mobs;
    mobs.add(analyze->descs[0]);
    mobs.add(Zel_MobDesc(QLatin1String(MayorMob), QStringLiteral("/x/again.mxf"), QString()));
    auto checkin = rec<CheckinRec>();
    run(session->makeCheckinReqSP(mobs, mk(m(Footage)), checkin));
    EXPECT_EQ((QStringList{QStringLiteral("ok checked in as \"storm\""), QStringLiteral("fail %1").arg(Zel_MemoryErrorCodes::InvalidMedia), QStringLiteral("finished")}),
              checkin->log);
    ASSERT_EQ(1, checkin->nodes.size());
    const QString storm = checkin->nodes[0]->getMoniker();

    auto bin = rec<CheckinRec>();
    run(session->makeCheckinLocalBinReqSP(QStringLiteral("/local/Storm Coverage.avb"), mk(m(News)), bin));
    EXPECT_EQ((QStringList{QStringLiteral("ok checked in bin \"Storm Coverage\""), QStringLiteral("finished")}), bin->log);

    Zel_MobDescList updates;
    updates.add(Zel_MobDesc(analyze->descs[0]->getMobID(), QStringLiteral("/ingest/storm_v2.mxf"), QString()));
    updates.add(Zel_MobDesc(QStringLiteral("no-such-mob"), QStringLiteral("/x.mxf"), QString()));
    auto update = rec<CheckinUpdateRec>();
    run(session->makeCheckinUpdateReqSP(updates, update));
    EXPECT_EQ((QStringList{QStringLiteral("ok "), QStringLiteral("fail %1").arg(Zel_MemoryErrorCodes::NotFound), QStringLiteral("finished")}), update->log);

    boost::shared_ptr<Zel_MobID> mayorMob(new Zel_MobID(QLatin1String(MayorMob)));
    auto mobNode = rec<MobNodeRec>();
    run(session->makeMobNodeReqSP(mayorMob, mobNode));
    EXPECT_EQ((QStringList{QStringLiteral("ok Interview Mayor"), QStringLiteral("finished")}), mobNode->log);
    auto binary = rec<MobBinaryRec>();
    run(session->makeMobBinaryReqSP(mayorMob, binary));
    EXPECT_TRUE(binary->last.contains("\"name\":\"Interview Mayor\"")) << binary->last.constData();
    Zel_MobIDList dnd;
    dnd.add(Zel_MobID(QLatin1String(MayorMob)));
    dnd.add(Zel_MobID(QStringLiteral("missing")));
    auto dragged = rec<MobBinaryDnDRec>();
    run(session->makeMobBinaryDnDReqSP(dnd, dragged));
    EXPECT_EQ((QStringList{QStringLiteral("ok ") + QLatin1String(MayorMob), QStringLiteral("fail %1").arg(Zel_MemoryErrorCodes::NotFound), QStringLiteral("finished")}),
              dragged->log);
    auto head = rec<HeadframeRec>();
    run(session->makeMobHeadframeReqSP(mayorMob, head));
    EXPECT_TRUE(head->last.startsWith("P6\n16 9\n255\n"));
    EXPECT_EQ(static_cast<char>(0x80), head->last.at(12)); // darkred: 0x800000

    // Delete with media: the editor may not destroy media, so the server keeps the files.
    auto deletion = rec<DeleteRec>();
    run(session->makeDeleteReqSP(QStringList{storm, m(Mayor)}, true, true, deletion));
    EXPECT_EQ((QStringList{QStringLiteral("remote media error ") + analyze->descs[0]->getMobID(),
                           QStringLiteral("local media ") + analyze->descs[0]->getMobID(),
                           QStringLiteral("remote media error ") + QLatin1String(MayorMob),
                           QStringLiteral("remote media error ") + QLatin1String(MayorMob),
                           QStringLiteral("remote media error ") + QLatin1String(MayorMob),
                           QStringLiteral("local media ") + QLatin1String(MayorMob), QStringLiteral("assets 2"),
                           QStringLiteral("records 2"), QStringLiteral("finished")}),
              deletion->log);
    EXPECT_EQ((QList<int>{Zel_MemoryErrorCodes::PermissionDenied, Zel_MemoryErrorCodes::PermissionDenied,
                          Zel_MemoryErrorCodes::PermissionDenied, Zel_MemoryErrorCodes::PermissionDenied}), deletion->codes);
    boost::shared_ptr<Zel_MemorySession> admin = newSession(QStringLiteral("admin"));
    auto adminDeletion = rec<DeleteRec>();
    run(admin->makeDeleteReqSP(QStringList{m(CityHall), QStringLiteral("zel-mem://C-CROWD")}, true, false, adminDeletion), admin);
    EXPECT_EQ((QStringList{QStringLiteral("remote media 060a2b340101010101010f00.13000000.0002"),
                           QStringLiteral("remote media 060a2b340101010101010f00.13000000.0004"), QStringLiteral("assets 2"),
                           QStringLiteral("records 2"), QStringLiteral("finished")}),
              adminDeletion->log);

    EXPECT_EQ((QStringList{QStringLiteral("added ") + storm, QStringLiteral("updated ") + storm, QStringLiteral("removed ") + storm,
                           QStringLiteral("removed ") + m(Mayor), QStringLiteral("removed ") + m(CityHall),
                           QStringLiteral("removed zel-mem://C-CROWD")}),
              footage.events());
}

TEST_P(Zel_MemorySessionTest, SettingsRoundTripAsXml)
{
    auto startup = rec<StartupRec>();
    run(session->makeStartupReqSP(startup));
    EXPECT_EQ(QStringList{QStringLiteral("ok ")}, startup->log);

    auto app = rec<AppSettingsRec>();
    run(session->makeGetApplicationSettingsReqSP(QStringLiteral("zel-demo"), app));
    ASSERT_EQ(2, app->log.size());
    EXPECT_TRUE(app->log[0].contains(QStringLiteral("<Language>en</Language>"))) << app->log[0].toStdString();

    Zel_SettingList settings;
    settings.addIfKeyNotInList(Zel_Setting(QStringLiteral("View.Zoom"), QStringLiteral("150")));
    settings.addIfKeyNotInList(Zel_Setting(QStringLiteral("View.Grid"), QStringLiteral("on")));
    auto setApp = rec<SetApplicationSettingsRec>();
    run(session->makeSetApplicationSettingsReqSP(QStringLiteral("zel-demo"), settings.toXML(QStringLiteral("Settings")), setApp));
    EXPECT_EQ((QStringList{QStringLiteral("ok "), QStringLiteral("finished")}), setApp->log);
    auto appAgain = rec<AppSettingsRec>();
    run(session->makeGetApplicationSettingsReqSP(QStringLiteral("zel-demo"), appAgain));
    EXPECT_TRUE(appAgain->log[0].contains(QStringLiteral("<Zoom>150</Zoom>")));
    EXPECT_FALSE(appAgain->log[0].contains(QStringLiteral("Language")));
    auto malformed = rec<SetApplicationSettingsRec>();
    run(session->makeSetApplicationSettingsReqSP(QStringLiteral("zel-demo"), QStringLiteral("<Settings><a></Settings>"), malformed));
    EXPECT_EQ(QList<int>{Zel_MemoryErrorCodes::InvalidArgument}, malformed->codes);
    EXPECT_TRUE(malformed->messages.value(0).contains(QStringLiteral("line 1"))) << malformed->messages.value(0).toStdString();

    auto user = rec<UserSettingsRec>();
    run(session->makeGetUserSettingsReqSP(Zel_GetUserSettingsCB::UserSettingsGeneral, user));
    EXPECT_TRUE(user->log.value(0).startsWith(QStringLiteral("ok 0 "))) << user->log.value(0).toStdString();
    EXPECT_TRUE(user->log.value(0).contains(QStringLiteral("<TrackHeight>48</TrackHeight>")));
    auto setUser = rec<SetUserSettingsRec>();
    run(session->makeSetUserSettingsReqSP(Zel_GetUserSettingsCB::UserSettingsSite, settings.toXML(QStringLiteral("S")), setUser));
    EXPECT_EQ((QStringList{QStringLiteral("ok "), QStringLiteral("finished")}), setUser->log);
    auto site = rec<UserSettingsRec>();
    run(session->makeGetUserSettingsReqSP(Zel_GetUserSettingsCB::UserSettingsSite, site));
    EXPECT_TRUE(site->log.value(0).contains(QStringLiteral("<Grid>on</Grid>")));
    auto badType = rec<UserSettingsRec>();
    run(session->makeGetUserSettingsReqSP(Zel_GetUserSettingsCB::UserSettingsUnknown, badType));
    EXPECT_EQ(QList<int>{Zel_MemoryErrorCodes::InvalidArgument}, badType->codes);

    auto workgroup = rec<SettingsRec>();
    run(session->makeGetWorkgroupSettingsReqSP(workgroup));
    EXPECT_TRUE(workgroup->log.value(0).contains(QStringLiteral("<Name>Newsroom</Name>")));
    EXPECT_EQ(QStringLiteral("Newsroom"), session->getWorkgroupName());

    auto document = rec<GetSettingsRec>();
    run(session->makeGetSettingsReqSP(QStringLiteral("Playout"), document));
    EXPECT_TRUE(document->log.value(0).contains(QStringLiteral("<Server>playout-1</Server>")));
    auto save = rec<SaveSettingsRec>();
    run(session->makeSaveSettingsReqSP(QStringLiteral("Ingest"), QStringLiteral("<Ingest><Path>/in</Path></Ingest>"), save));
    EXPECT_EQ((QStringList{QStringLiteral("ok "), QStringLiteral("finished")}), save->log);
    auto saved = rec<GetSettingsRec>();
    run(session->makeGetSettingsReqSP(QStringLiteral("Ingest"), saved));
    EXPECT_EQ((QStringList{QStringLiteral("ok <Ingest><Path>/in</Path></Ingest>"), QStringLiteral("finished")}), saved->log);
    auto none = rec<GetSettingsRec>();
    run(session->makeGetSettingsReqSP(QStringLiteral("Nothing"), none));
    EXPECT_EQ(QList<int>{Zel_MemoryErrorCodes::NotFound}, none->codes);
}

TEST_P(Zel_MemorySessionTest, ConnectionLossIsAnnouncedAndFailsRequestsUntilReconnected)
{
    boost::shared_ptr<StatusRec> status(new StatusRec);
    session->setStatusNotificationCB(status);
    EXPECT_EQ(status, session->getStatusNotificationCBSP());
    session->simulateConnectionLoss();
    session->simulateConnectionLoss(); // already down: no second notice
    EXPECT_FALSE(session->getConnectionStatus());
    auto during = rec<NodeRec>();
    run(session->makeGetNodeReqSP(mk(m(Mayor)), during));
    EXPECT_EQ(QList<int>{Zel_MemoryErrorCodes::NotConnected}, during->codes);
    session->simulateReconnect();
    EXPECT_TRUE(session->getConnectionStatus());
    auto after = rec<NodeRec>();
    run(session->makeGetNodeReqSP(mk(m(Mayor)), after));
    EXPECT_EQ(1, after->ok);
    EXPECT_EQ((QStringList{QStringLiteral("disconnected"), QStringLiteral("connected")}), status->log);
}

TEST_P(Zel_MemorySessionTest, SessionStateAndClose)
{
    EXPECT_EQ(QStringLiteral("Newsroom Asset Server (in memory)"), session->getServerName());
    EXPECT_EQ(QStringLiteral("zel-memory 1.0.0"), session->getServerVersion());
    EXPECT_EQ(QStringLiteral("zel-memory %1.%2.%3").arg(ZEL_VERSION_MAJOR).arg(ZEL_VERSION_MINOR).arg(ZEL_VERSION_PATCH),
              session->getServerVersion());
    EXPECT_EQ(QStringLiteral("zel-demo"), session->getApplicationName());
    EXPECT_EQ(m(Root), *session->getRootMonikerSP());
    EXPECT_EQ(m(Root), *session->getHomeMonikerSP());
    EXPECT_EQ(QStringLiteral("/"), session->getPathSeparator());
    EXPECT_TRUE(session->isValidMoniker(m(Mayor)));
    EXPECT_FALSE(session->isValidMoniker(QStringLiteral("http://x")));
    EXPECT_EQ(engine.getResultQ(), session->getResultQSP());
    EXPECT_TRUE(session->supportsRequest(QStringLiteral("Zel_GetNodeReq")));
    EXPECT_TRUE(session->supportsRequest(QStringLiteral("Zel_Query")));
    EXPECT_FALSE(session->supportsRequest(QStringLiteral("Zel_FlyReq")));
    EXPECT_TRUE(session->getServerTime().isValid());
    EXPECT_FALSE(session->isReadOnly());
    EXPECT_TRUE(newSession(QStringLiteral("assistant"))->isReadOnly());
    EXPECT_EQ(128, session->getMaxNameLength());
    EXPECT_FALSE(session->isValidAssetName(QStringLiteral("a:b")));
    EXPECT_TRUE(session->isValidAssetName(QStringLiteral("Rushes 2")));

    // A request made but not yet run is cancelled with the rest: it is not
    // run, and its callback hears that it was cancelled, and its end.
    auto cancelled = rec<NodeRec>();
    boost::shared_ptr<Zel_GetNodeReq> pending = session->makeGetNodeReqSP(mk(m(Mayor)), cancelled);
    session->cancelAllRequests();
    run(pending);
    EXPECT_EQ((QStringList{QStringLiteral("fail %1").arg(Zel_MemoryErrorCodes::Cancelled), QStringLiteral("finished")}),
              cancelled->log);
    EXPECT_EQ(QStringLiteral("The request was cancelled before it ran."), cancelled->messages.value(0));

    session->close();
    EXPECT_FALSE(session->isLoggedIn());
    EXPECT_FALSE(session->makeGetNodeReqSP(mk(m(Mayor)), rec<NodeRec>()));
    EXPECT_FALSE(session->submitRequest(boost::shared_ptr<Orv_Request>()));
}

// Of the in-memory tree alone: the expected order is worked out from the
// tree's own snapshots (Zel_MemoryTree::childSnapshots).
TEST(Zel_MemorySessionOrderTest, ChildrenComeInTheOrderAStableSortByNodeOrderGives)
{
    // Random folders: mixed mime types, names that differ only in case, long
    // names that share their first units, Latin-1 and other letters (some
    // whose lower case is longer), and children the user may not read. The
    // children requests answer exactly the readable children in the order
    // std::stable_sort with Zel_Node::operator< gives them.
    const QStringList pieces{QStringLiteral("a"), QStringLiteral("A"), QStringLiteral("b"), QStringLiteral("Z"),
                             QStringLiteral("1"), QStringLiteral(" "), QStringLiteral("\u00e9"), QStringLiteral("\u00c9"),
                             QStringLiteral("\u00df"), QStringLiteral("\u00ff"), QStringLiteral("\u03a3"),
                             QStringLiteral("\u03c3"), QStringLiteral("\u0130"), QStringLiteral("i"),
                             QStringLiteral("Long shared beginning ")};
    const QStringList mimeTypes{QStringLiteral("bin"), QStringLiteral("masterclip"), QStringLiteral("clip"),
                                QStringLiteral("sequence"), QStringLiteral("subclip"), QStringLiteral("effect"),
                                QStringLiteral("folder")};
    for (unsigned seed = 1; seed <= 6; ++seed) {
        SCOPED_TRACE(testing::Message() << "seed " << seed);
        std::mt19937 random(seed);
        auto pick = [&random](int count) { return static_cast<int>(random() % static_cast<unsigned>(count)); };
        QSet<QString> used;
        QSet<QString> unreadable;
        QString children;
        // Names alike in their first dozen units and different after them.
        const QStringList alike{QStringLiteral("Long shared beginning Zed"), QStringLiteral("Long shared beginning apple"),
                                QStringLiteral("long shared beginning Apple"), QStringLiteral("Long shared beginning \u00c9t\u00e9"),
                                QStringLiteral("Long shared beginning \u03a3igma"), QStringLiteral("Long shared beginning \u03c3igma"),
                                QStringLiteral("Long shared begin")};
        const int count = 40 + pick(80);
        for (int i = 0; i < count + alike.size(); ++i) {
            QString name;
            const int length = 1 + pick(4);
            for (int k = 0; k < length; ++k)
                name += pieces[pick(pieces.size())];
            if (i >= count)
                name = alike[i - count];
            if (name.trimmed().isEmpty() || used.contains(name))
                continue;
            used.insert(name);
            QString child = QStringLiteral("{\"name\":\"%1\",\"mimeType\":\"%2\"").arg(name, mimeTypes[pick(mimeTypes.size())]);
            if (pick(6) == 0) {
                child += QStringLiteral(",\"permissions\":{\"u\":[\"Copy\"]}");
                unreadable.insert(name);
            }
            children += (children.isEmpty() ? QString() : QStringLiteral(",")) + child + QLatin1Char('}');
        }
        const QByteArray json = (QStringLiteral("{\"users\":[{\"name\":\"u\",\"password\":\"u\"}],\"root\":{\"id\":\"R\","
                                                "\"name\":\"Root\",\"mimeType\":\"workspace\",\"permissions\":{\"*\":[\"All\"]},"
                                                "\"children\":[{\"id\":\"F\",\"name\":\"F\",\"mimeType\":\"bin\",\"children\":[")
                                 + children + QStringLiteral("]}]}}"))
                                    .toUtf8();
        QString error;
        const boost::shared_ptr<Zel_MemoryTree> tree = Zel_MemoryTree::fromJson(json, QStringLiteral("random.json"), &error);
        ASSERT_TRUE(tree) << error.toStdString();

        QList<NodeSP> expected;
        for (const NodeSP& node : Zel_MemoryTree::childSnapshots(tree, m("F"), QStringLiteral("u"))) {
            if (!unreadable.contains(node->getName()))
                expected << node;
        }
        std::stable_sort(expected.begin(), expected.end(), [](const NodeSP& a, const NodeSP& b) { return *a < *b; });
        QStringList expectedMonikers;
        for (const NodeSP& node : expected)
            expectedMonikers << node->getMoniker();

        Orv_Engine engine(2);
        boost::shared_ptr<Zel_MemorySession> session(new Zel_MemorySession(tree, &engine));
        auto login = rec<LoginRec>();
        session->submitRequest(session->makeLoginReqSP(QStringLiteral("u"), QStringLiteral("u"), {}, login));
        engine.DeliverAll(); // logged in before the requests that need it run
        auto answered = rec<NodeRec>();
        session->submitRequest(session->makeGetChildrenReqSP(mk(m("F")), answered));
        auto flagged = rec<ChildrenRec>();
        session->submitRequest(session->makeChildrenReqSP(mk(m("F")), flagged));
        engine.DeliverAll();
        ASSERT_EQ(QStringList{QStringLiteral("ok u")}, login->log);
        QStringList answeredMonikers;
        for (const NodeSP& node : answered->nodes)
            answeredMonikers << node->getMoniker();
        EXPECT_EQ(expectedMonikers, answeredMonikers);
        QStringList flaggedMonikers;
        for (const NodeSP& node : flagged->nodes)
            flaggedMonikers << node->getMoniker();
        EXPECT_EQ(expectedMonikers, flaggedMonikers);
        EXPECT_EQ(used.size() - unreadable.size(), expectedMonikers.size());
    }
}

TEST_P(Zel_MemorySessionTest, CancelAllReachesEveryLiveRequestAmongManyMadeAndDropped)
{
    // The session forgets requests that are gone only now and then; however
    // many were made and dropped in between, every request still alive is
    // cancelled, and one made afterwards runs.
    auto cancelled = rec<NodeRec>();
    std::vector<boost::shared_ptr<Zel_GetNodeReq>> kept;
    for (int i = 0; i < 1000; ++i) {
        boost::shared_ptr<Zel_GetNodeReq> request = session->makeGetNodeReqSP(mk(m(Mayor)), cancelled);
        if (i % 7 == 0)
            kept.push_back(request);
    }
    session->cancelAllRequests();
    auto after = rec<NodeRec>();
    boost::shared_ptr<Zel_GetNodeReq> later = session->makeGetNodeReqSP(mk(m(Mayor)), after);
    for (const boost::shared_ptr<Zel_GetNodeReq>& request : kept)
        run(request);
    run(later);

    QStringList expected;
    for (std::size_t i = 0; i < kept.size(); ++i)
        expected << QStringLiteral("fail %1").arg(Zel_MemoryErrorCodes::Cancelled) << QStringLiteral("finished");
    EXPECT_EQ(expected, cancelled->log);
    EXPECT_EQ(QStringLiteral("finished"), after->log.value(1));
    EXPECT_TRUE(after->log.value(0).startsWith(QStringLiteral("ok "))) << after->log.join(QLatin1Char('|')).toStdString();
}

TEST_P(Zel_MemorySessionTest, PropertyManagerStaysRegisteredWhileAnySessionLives)
{
    const boost::shared_ptr<Zel_PropertyManager> own = Zel_Property::getPropertyManagerSP();
    ASSERT_TRUE(own);
    EXPECT_EQ(QStringLiteral("Tape Name"), Zel_Property::getDisplayName(QStringLiteral("Tape")));

    // A second session on the same tree comes and goes: the first keeps its manager.
    newSession(QStringLiteral("assistant")).reset();
    EXPECT_EQ(own, Zel_Property::getPropertyManagerSP());
    EXPECT_EQ(QStringLiteral("Tape Name"), Zel_Property::getDisplayName(QStringLiteral("Tape")));

    // A session on another tree takes over while it lives and hands back after.
    {
        const std::unique_ptr<StoreUnderTest> otherStore = load(Zel_MemoryTree::sampleJson());
        ASSERT_TRUE(otherStore);
        const boost::shared_ptr<Zel_MemorySession> other = otherStore->newSession(&engine, QStringLiteral("other"));
        EXPECT_NE(own, Zel_Property::getPropertyManagerSP());
        EXPECT_TRUE(Zel_Property::getPropertyManagerSP());
    }
    EXPECT_EQ(own, Zel_Property::getPropertyManagerSP());

    session.reset();
    engine.DeliverAll();
    EXPECT_FALSE(Zel_Property::getPropertyManagerSP());
}

TEST_P(Zel_MemorySessionTest, ExpiredReservationIsReportedAsFree)
{
    // The sample tree with the bulletin's reservation run out in the past.
    QByteArray json = Zel_MemoryTree::sampleJson();
    const QByteArray held("\"reservation\": { \"user\": \"producer\", \"since\": \"2026-03-02T11:00:00Z\" }");
    ASSERT_TRUE(json.contains(held));
    json.replace(held, "\"reservation\": { \"user\": \"producer\", \"since\": \"2020-01-01T09:00:00Z\", "
                       "\"until\": \"2020-01-01T10:00:00Z\" }");
    session.reset();
    store = load(json);
    ASSERT_TRUE(store);
    session = newSession();

    auto get = rec<NodeRec>();
    run(session->makeGetNodeReqSP(mk(m(Bulletin)), get));
    ASSERT_EQ(1, get->nodes.size());
    EXPECT_FALSE(get->nodes[0]->isReserved());
    EXPECT_TRUE(get->nodes[0]->getPropertyValue(QStringLiteral("Locked By")).isEmpty());

    auto reservations = rec<ReservationsRec>();
    run(session->makeGetReservationsReqSP(mk(m(Bulletin)), reservations));
    EXPECT_EQ(QStringList{QStringLiteral("finished")}, reservations->log);

    // The answers agree with what the server enforces: the node is free to change.
    auto release = rec<RemoveReservationRec>();
    run(session->makeRemoveReservationReqSP(mk(m(Bulletin)), release));
    EXPECT_EQ(QList<int>{Zel_MemoryErrorCodes::NotReserved}, release->codes);
    auto reserve = rec<CreateReservationRec>();
    run(session->makeCreateReservationReqSP(mk(m(Bulletin)), QDateTime(), reserve));
    EXPECT_EQ((QStringList{QStringLiteral("ok "), QStringLiteral("finished")}), reserve->log);
}

TEST_P(Zel_MemorySessionTest, ReservationsEndWhenTheStoreClockPassesTheirEnd)
{
    // The store's clock, moved by the test between requests: expiry is judged
    // by each request's transaction time, not by the machine's clock.
    const QDateTime start(QDate(2030, 1, 1), QTime(10, 0), Qt::UTC);
    const QDateTime end = start.addSecs(3600);
    const std::shared_ptr<std::atomic<qint64>> clock = std::make_shared<std::atomic<qint64>>(start.toMSecsSinceEpoch());
    store->setClock([clock] { return QDateTime::fromMSecsSinceEpoch(clock->load(), Qt::UTC); });

    const boost::shared_ptr<Zel_MemorySession> producer = newSession(QStringLiteral("producer"));
    auto reserve = rec<CreateReservationRec>();
    run(producer->makeCreateReservationReqSP(mk(m(Mayor)), end, reserve), producer);
    EXPECT_EQ((QStringList{QStringLiteral("ok "), QStringLiteral("finished")}), reserve->log);
    auto held = rec<ReservationsRec>();
    run(session->makeGetReservationsReqSP(mk(m(Mayor)), held));
    EXPECT_EQ((QStringList{QStringLiteral("ok producer 2030-01-01T11:00:00Z"), QStringLiteral("finished")}), held->log);
    auto node = rec<NodeRec>();
    run(session->makeGetNodeReqSP(mk(m(Mayor)), node));
    ASSERT_EQ(1, node->nodes.size());
    EXPECT_TRUE(node->nodes[0]->isReserved());
    EXPECT_EQ(QStringLiteral("2030-01-01T10:00:00Z"), node->nodes[0]->getPropertyValue(QStringLiteral("Locked On")));

    // A second before its end the reservation still holds.
    clock->store(end.addSecs(-1).toMSecsSinceEpoch());
    auto renamed = rec<RenameNodeRec>();
    run(session->makeRenameNodeReqSP(mk(m(Mayor)), QStringLiteral("Mayor later"), renamed));
    EXPECT_EQ(QList<int>{Zel_MemoryErrorCodes::ReservedByOtherUser}, renamed->codes);
    auto past = rec<CreateReservationRec>();
    run(session->makeCreateReservationReqSP(mk(m(Mayor)), end.addSecs(-2), past));
    EXPECT_EQ(QList<int>{Zel_MemoryErrorCodes::ReservedByOtherUser}, past->codes);

    // At its end the node is free, shown free, and taken at the store's time.
    clock->store(end.toMSecsSinceEpoch());
    auto free = rec<ReservationsRec>();
    run(session->makeGetReservationsReqSP(mk(m(Mayor)), free));
    EXPECT_EQ(QStringList{QStringLiteral("finished")}, free->log);
    auto late = rec<CreateReservationRec>();
    run(session->makeCreateReservationReqSP(mk(m(Mayor)), end.addSecs(-1), late));
    EXPECT_EQ(QList<int>{Zel_MemoryErrorCodes::InvalidArgument}, late->codes);
    auto taken = rec<CreateReservationRec>();
    run(session->makeCreateReservationReqSP(mk(m(Mayor)), QDateTime(), taken));
    EXPECT_EQ((QStringList{QStringLiteral("ok "), QStringLiteral("finished")}), taken->log);
    auto mine = rec<NodeRec>();
    run(session->makeGetNodeReqSP(mk(m(Mayor)), mine));
    ASSERT_EQ(1, mine->nodes.size());
    EXPECT_EQ(QStringLiteral("editor"), mine->nodes[0]->getPropertyValue(QStringLiteral("Locked By")));
    EXPECT_EQ(QStringLiteral("2030-01-01T11:00:00Z"), mine->nodes[0]->getPropertyValue(QStringLiteral("Locked On")));
}

TEST_P(Zel_MemorySessionTest, NamesTheServerMakesStayWithinTheNameLimit)
{
    const QString longest(session->getMaxNameLength(), QLatin1Char('x'));
    auto first = rec<CreateFolderUniqueRec>();
    run(session->makeCreateFolderUniqueReqSP(mk(m(Footage)), longest, first));
    ASSERT_EQ(1, first->nodes.size());
    EXPECT_EQ(longest, first->nodes[0]->getName());

    // The number that makes the second name unique replaces its end.
    auto second = rec<CreateFolderUniqueRec>();
    run(session->makeCreateFolderUniqueReqSP(mk(m(Footage)), longest, second));
    ASSERT_EQ(1, second->nodes.size());
    EXPECT_EQ(QString(session->getMaxNameLength() - 2, QLatin1Char('x')) + QStringLiteral(" 2"), second->nodes[0]->getName());

    // A media file whose name is too long arrives under a generated name.
    Zel_MobDescList mobs;
    mobs.add(Zel_MobDesc(QString(), QStringLiteral("/ingest/") + QString(200, QLatin1Char('y')) + QStringLiteral(".mxf"), QString()));
    auto checkin = rec<CheckinRec>();
    run(session->makeCheckinReqSP(mobs, mk(m(Footage)), checkin));
    ASSERT_EQ(1, checkin->nodes.size());
    ASSERT_TRUE(checkin->nodes[0]);
    EXPECT_LE(checkin->nodes[0]->getName().size(), session->getMaxNameLength());
    EXPECT_TRUE(checkin->nodes[0]->getName().startsWith(QStringLiteral("Clip ")));

    // Every name the server made passes its own name rules (renaming a node
    // to its own name checks the name and changes nothing).
    for (const NodeSP& node : {second->nodes[0], checkin->nodes[0]}) {
        auto rename = rec<RenameNodeRec>();
        run(session->makeRenameNodeReqSP(mk(node->getMoniker()), node->getName(), rename));
        EXPECT_TRUE(rename->codes.isEmpty()) << node->getName().toStdString();
    }
}

TEST_P(Zel_MemorySessionTest, FoldersNestOnlyToTheDepthLimitAndSuchATreeLoadsBack)
{
    using Zel_MemoryLimits::MaxDepth;
    // A chain of bins below Footage (depth 2), the last at the limit.
    QStringList chain{m(News), m(Footage)};
    for (int depth = 3; depth <= MaxDepth; ++depth) {
        auto created = rec<CreateFolderRec>();
        run(session->makeCreateFolderReqSP(mk(chain.last()), QStringLiteral("Level %1").arg(depth), created));
        ASSERT_EQ(1, created->nodes.size()) << "depth " << depth << ": " << created->messages.value(0).toStdString();
        chain << created->nodes[0]->getMoniker();
    }
    const QString deepest = chain.last();
    const QString aboveDeepest = chain.at(chain.size() - 2);
    const QList<int> tooDeep{Zel_MemoryErrorCodes::TooDeep};

    auto folder = rec<CreateFolderRec>();
    run(session->makeCreateFolderReqSP(mk(deepest), QStringLiteral("Below"), folder));
    EXPECT_EQ(tooDeep, folder->codes);
    EXPECT_EQ(QStringLiteral("Nodes added to \"Level 128\" (%1) would lie 129 levels below the root; the server allows at most 128.")
                  .arg(deepest),
              folder->messages.value(0));
    auto unique = rec<CreateFolderUniqueRec>();
    run(session->makeCreateFolderUniqueReqSP(mk(deepest), QStringLiteral("Below"), unique));
    EXPECT_EQ(tooDeep, unique->codes);
    auto node = rec<NodeRec>();
    run(session->makeCreateNodeUniqueReqSP(mk(deepest), QStringLiteral("Clip"), Zel_PropertyList(), node));
    EXPECT_EQ(tooDeep, node->codes);
    auto bin = rec<CheckinRec>();
    run(session->makeCheckinLocalBinReqSP(QStringLiteral("/bins/Below.avb"), mk(deepest), bin));
    EXPECT_EQ(tooDeep, bin->codes);

    // Effects holds two effects: with them it is two levels high.
    auto moved = rec<MoveNodeRec>();
    run(session->makeMoveNodeReqSP(mk(m("B-EFFECTS")), mk(aboveDeepest), moved));
    EXPECT_EQ(tooDeep, moved->codes);
    auto copied = rec<CopyRec>();
    run(session->makeCopyNodeReqSP(mk(m("B-EFFECTS")), mk(aboveDeepest), copied));
    EXPECT_EQ(tooDeep, copied->codes);
    auto clip = rec<MoveNodeRec>();
    run(session->makeMoveNodeReqSP(mk(m(Mayor)), mk(deepest), clip));
    EXPECT_EQ(tooDeep, clip->codes);
    // One level higher they fit, the effects at the limit.
    auto copiedHigher = rec<CopyRec>();
    run(session->makeCopyNodeReqSP(mk(m("B-EFFECTS")), mk(chain.at(chain.size() - 3)), copiedHigher));
    EXPECT_EQ((QStringList{QStringLiteral("ok Effects -> Effects"), QStringLiteral("finished")}), copiedHigher->log);
    auto movedHigher = rec<MoveNodeRec>();
    run(session->makeMoveNodeReqSP(mk(m("B-EFFECTS")), mk(chain.at(chain.size() - 4)), movedHigher));
    EXPECT_EQ((QStringList{QStringLiteral("ok Effects"), QStringLiteral("finished")}), movedHigher->log);

    // Everything the requests built saves and loads back the same.
    const QByteArray saved = store->toJson();
    const std::unique_ptr<StoreUnderTest> again = load(saved);
    ASSERT_TRUE(again);
    EXPECT_EQ(store->nodeCount(), again->nodeCount());
    EXPECT_EQ(saved, again->toJson());
    QString path = QStringLiteral("/Evening News/Footage");
    for (int depth = 3; depth <= MaxDepth; ++depth)
        path += QStringLiteral("/Level %1").arg(depth);
    EXPECT_EQ(deepest, again->monikerAt(path));

    // Deleting the chain takes its whole subtree.
    const int before = store->nodeCount();
    auto deleted = rec<BoolRec>();
    run(session->makeDeleteNodeReqSP(mk(chain.at(2)), deleted));
    EXPECT_EQ((QStringList{QStringLiteral("ok true"), QStringLiteral("finished")}), deleted->log);
    EXPECT_EQ(before - (MaxDepth - 2) - 3 - 3, store->nodeCount()); // the chain, the copied and the moved effects
}

TEST_P(Zel_MemorySessionTest, CreateNodeUniqueRefusesAMediaObjectIdInUse)
{
    const QByteArray before = store->toJson();
    Zel_PropertyList props;
    props.append(Zel_Property(QStringLiteral("MobID"), QLatin1String(MayorMob), QString()));
    auto taken = rec<NodeRec>();
    run(session->makeCreateNodeUniqueReqSP(mk(m(Footage)), QStringLiteral("Mayor again"), props, taken));
    EXPECT_EQ(QList<int>{Zel_MemoryErrorCodes::MobIDExists}, taken->codes);
    EXPECT_EQ(QStringLiteral("The media object ID \"%1\" belongs to \"Interview Mayor\" (%2) already.")
                  .arg(QLatin1String(MayorMob), m(Mayor)),
              taken->messages.value(0));
    EXPECT_EQ(before, store->toJson());

    const QString fresh = QStringLiteral("060a2b340101010101010f00.13000000.9999");
    props.clear();
    props.append(Zel_Property(QStringLiteral("MobID"), fresh, QString()));
    auto first = rec<NodeRec>();
    run(session->makeCreateNodeUniqueReqSP(mk(m(Footage)), QStringLiteral("New clip"), props, first));
    ASSERT_EQ(1, first->nodes.size());
    EXPECT_EQ(fresh, first->nodes[0]->getMobID().toZelString());
    auto second = rec<NodeRec>();
    run(session->makeCreateNodeUniqueReqSP(mk(m(Sequences)), QStringLiteral("New clip"), props, second));
    EXPECT_EQ(QList<int>{Zel_MemoryErrorCodes::MobIDExists}, second->codes);
}

namespace {

QString repeated(const QString& text, int times)
{
    QString result;
    result.reserve(text.size() * times);
    for (int i = 0; i < times; ++i)
        result += text;
    return result;
}

} // namespace

TEST_P(Zel_MemorySessionTest, SettingsBeyondTheLimitsAreRefusedAndStoredSettingsReadBack)
{
    using namespace Zel_MemoryLimits;
    const QList<int> invalid{Zel_MemoryErrorCodes::InvalidArgument};
    auto setUser = [this](const QString& xml) {
        auto set = rec<SetUserSettingsRec>();
        run(session->makeSetUserSettingsReqSP(Zel_GetUserSettingsCB::UserSettingsGeneral, xml, set));
        return set;
    };
    auto general = [this]() {
        auto get = rec<UserSettingsRec>();
        run(session->makeGetUserSettingsReqSP(Zel_GetUserSettingsCB::UserSettingsGeneral, get));
        EXPECT_EQ(2, get->log.size());
        return get->log.value(0);
    };

    // 20,000 levels (140 KB): refused before anything is stored, so reading
    // the settings back still works.
    const QString deep = QStringLiteral("<S>") + repeated(QStringLiteral("<a>"), 20000) + QStringLiteral("v")
        + repeated(QStringLiteral("</a>"), 20000) + QStringLiteral("</S>");
    auto deepUser = setUser(deep);
    EXPECT_EQ(invalid, deepUser->codes);
    EXPECT_EQ(QStringLiteral("The settings nest deeper than 64 levels below the root (line 1, column 198)."),
              deepUser->messages.value(0))
        << deepUser->messages.value(0).toStdString();
    auto deepApp = rec<SetApplicationSettingsRec>();
    run(session->makeSetApplicationSettingsReqSP(QStringLiteral("zel-demo"), deep, deepApp));
    EXPECT_EQ(invalid, deepApp->codes);
    auto deepDocument = rec<SaveSettingsRec>();
    run(session->makeSaveSettingsReqSP(QStringLiteral("Deep"), deep, deepDocument));
    EXPECT_EQ(invalid, deepDocument->codes);
    EXPECT_TRUE(general().contains(QStringLiteral("<TrackHeight>48</TrackHeight>")));

    // A document longer than the size limit.
    const QString huge = QStringLiteral("<S>") + repeated(QStringLiteral("<k>value</k>"), MaxSettingsSize / 12 + 1)
        + QStringLiteral("</S>");
    auto hugeUser = setUser(huge);
    EXPECT_EQ(invalid, hugeUser->codes);
    EXPECT_EQ(QStringLiteral("The settings document has %1 characters; the server accepts at most 1048576.").arg(huge.size()),
              hugeUser->messages.value(0));

    // A short document whose keys would come to more than the size limit:
    // each leaf's key repeats a long parent's name.
    QString wide = QStringLiteral("<S><") + QString(1000, QLatin1Char('p')) + QLatin1Char('>');
    for (int i = 0; i < 1100; ++i)
        wide += QStringLiteral("<k%1/>").arg(i);
    wide += QStringLiteral("</") + QString(1000, QLatin1Char('p')) + QStringLiteral("></S>");
    auto wideUser = setUser(wide);
    EXPECT_EQ(invalid, wideUser->codes);
    EXPECT_TRUE(wideUser->messages.value(0).startsWith(
        QStringLiteral("The settings keys and values come to more than 1048576 characters (line 1, column ")))
        << wideUser->messages.value(0).toStdString();

    // A key longer than the key limit, and more settings than the count limit.
    auto longKey = setUser(QStringLiteral("<S><") + QString(MaxSettingsKeyLength + 1, QLatin1Char('k')) + QStringLiteral("/></S>"));
    EXPECT_EQ(invalid, longKey->codes);
    EXPECT_EQ(QStringLiteral("The settings have a key longer than 1024 characters (line 1, column 1031)."), longKey->messages.value(0))
        << longKey->messages.value(0).toStdString();
    QString many = QStringLiteral("<S>");
    for (int i = 0; i <= MaxSettingsCount; ++i)
        many += QStringLiteral("<k%1/>").arg(i);
    many += QStringLiteral("</S>");
    auto manyUser = setUser(many);
    EXPECT_EQ(invalid, manyUser->codes);
    EXPECT_TRUE(manyUser->messages.value(0).startsWith(QStringLiteral("The settings hold more than 10000 keys (line 1, column ")))
        << manyUser->messages.value(0).toStdString();
    EXPECT_TRUE(general().contains(QStringLiteral("<TrackHeight>48</TrackHeight>")));

    // At the limits the settings are stored and read back: a key of 64
    // levels; a later leaf with the same key replaces the value in place;
    // white space alone is no value.
    QString open;
    QString close;
    for (int level = 1; level <= MaxSettingsLevels; ++level) {
        open += QStringLiteral("<l%1>").arg(level);
        close.prepend(QStringLiteral("</l%1>").arg(level));
    }
    auto atLimit = setUser(QStringLiteral("<S><a><b>1</b><c>2</c><b>3</b></a><d> </d>") + open + QStringLiteral("deep") + close
                           + QStringLiteral("</S>"));
    EXPECT_EQ((QStringList{QStringLiteral("ok "), QStringLiteral("finished")}), atLimit->log);
    const QString back = general();
    EXPECT_TRUE(back.contains(QStringLiteral("<a>\n  <b>3</b>\n  <c>2</c>\n </a>\n <d></d>\n"))) << back.toStdString();
    EXPECT_TRUE(back.contains(QStringLiteral("<l64>deep</l64>"))) << back.toStdString();
    EXPECT_FALSE(back.contains(QStringLiteral("TrackHeight")));
}

TEST_P(Zel_MemorySessionTest, ChangeEventsReachOnlySessionsWhoseUserMayReadTheParent)
{
    // The assistant may read the project but not its Archive bin (an empty
    // entry there); the editor may read it; the admin reads everything.
    boost::shared_ptr<Zel_MemorySession> admin = newSession(QStringLiteral("admin"));
    boost::shared_ptr<Zel_MemorySession> assistant = newSession(QStringLiteral("assistant"));
    FolderRec adminArchive(m(Archive), admin);
    FolderRec adminAll(QString(), admin);
    FolderRec editorArchive(m(Archive), session);
    FolderRec editorAll(QString(), session);
    FolderRec assistantArchive(m(Archive), assistant);
    FolderRec assistantAll(QString(), assistant);

    auto vault = rec<CreateFolderRec>();
    run(admin->makeCreateFolderReqSP(mk(m(Archive)), QStringLiteral("Vault"), vault), admin);
    ASSERT_EQ(1, vault->nodes.size());
    const QString v = vault->nodes[0]->getMoniker();
    auto inner = rec<CreateFolderRec>();
    run(admin->makeCreateFolderReqSP(mk(v), QStringLiteral("Inner"), inner), admin);
    ASSERT_EQ(1, inner->nodes.size());
    const QString i = inner->nodes[0]->getMoniker();
    auto rushes = rec<CreateFolderRec>();
    run(admin->makeCreateFolderReqSP(mk(m(Footage)), QStringLiteral("Rushes"), rushes), admin);
    ASSERT_EQ(1, rushes->nodes.size());
    const QString r = rushes->nodes[0]->getMoniker();
    const QString election = QStringLiteral("zel-mem://C-ELECTION");
    auto renamed = rec<RenameNodeRec>();
    run(admin->makeRenameNodeReqSP(mk(election), QStringLiteral("Election Night"), renamed), admin);
    EXPECT_EQ(1, renamed->ok);
    auto moved = rec<MoveNodeRec>();
    run(admin->makeMoveNodeReqSP(mk(election), mk(m(Footage)), moved), admin);
    EXPECT_EQ(1, moved->ok);
    auto deleted = rec<BoolRec>();
    run(admin->makeDeleteNodeReqSP(mk(v), deleted), admin);
    EXPECT_EQ(1, deleted->ok);

    const QStringList everything{QStringLiteral("added ") + v,          QStringLiteral("added ") + i,
                                 QStringLiteral("added ") + r,          QStringLiteral("updated ") + election,
                                 QStringLiteral("removed ") + election, QStringLiteral("added ") + election,
                                 QStringLiteral("removed ") + v};
    const QStringList inArchive{QStringLiteral("added ") + v, QStringLiteral("updated ") + election,
                                QStringLiteral("removed ") + election, QStringLiteral("removed ") + v};
    EXPECT_EQ(everything.join(QLatin1Char(',')).toStdString(), adminAll.events().join(QLatin1Char(',')).toStdString());
    EXPECT_EQ(inArchive.join(QLatin1Char(',')).toStdString(), adminArchive.events().join(QLatin1Char(',')).toStdString());
    EXPECT_EQ(everything.join(QLatin1Char(',')).toStdString(), editorAll.events().join(QLatin1Char(',')).toStdString());
    EXPECT_EQ(inArchive.join(QLatin1Char(',')).toStdString(), editorArchive.events().join(QLatin1Char(',')).toStdString());
    // Nothing of the bin the assistant may not read, nor of the bin inside
    // it; the changes under readable parents arrive, in order.
    EXPECT_EQ((QStringLiteral("added ") + r + QStringLiteral(",added ") + election).toStdString(),
              assistantAll.events().join(QLatin1Char(',')).toStdString());
    EXPECT_EQ(std::string(), assistantArchive.events().join(QLatin1Char(',')).toStdString());
}

// The session may outlive its engine: it then refuses requests, and neither
// that nor its end touches the engine that is gone.
TEST_P(Zel_MemorySessionTest, SessionOutlivingItsEngineRefusesRequestsAndEndsCleanly)
{
    std::unique_ptr<Orv_Engine> ownEngine(new Orv_Engine(2));
    boost::shared_ptr<Zel_MemorySession> orphan = store->newSession(ownEngine.get(), QStringLiteral("zel"));
    auto login = rec<LoginRec>();
    ASSERT_TRUE(orphan->submitRequest(orphan->makeLoginReqSP(QStringLiteral("editor"), QStringLiteral("editor"), {}, login)));
    ownEngine->DeliverAll();
    ASSERT_EQ(1, login->ok);
    std::unique_ptr<FolderRec> footage(new FolderRec(m(Footage), orphan));

    ownEngine.reset();
    auto node = rec<NodeRec>();
    const boost::shared_ptr<Zel_GetNodeReq> request = orphan->makeGetNodeReqSP(mk(m(Mayor)), node);
    ASSERT_TRUE(request);
    EXPECT_FALSE(orphan->submitRequest(request));
    EXPECT_FALSE(orphan->submitRequest(orphan->makeGetNodeReqSP(mk(m(Mayor)), node)));

    // Another session on the same store, on an engine of its own, changes the
    // bin the first one listens to: the report goes nowhere near the old engine.
    {
        Orv_Engine other(1);
        boost::shared_ptr<Zel_MemorySession> producer = store->newSession(&other, QStringLiteral("zel"));
        auto login2 = rec<LoginRec>();
        producer->submitRequest(producer->makeLoginReqSP(QStringLiteral("producer"), QStringLiteral("producer"), {}, login2));
        auto created = rec<CreateFolderRec>();
        producer->submitRequest(producer->makeCreateFolderReqSP(mk(m(Footage)), QStringLiteral("Late"), created));
        other.DeliverAll();
        EXPECT_EQ(1, created->ok);
    }
    EXPECT_TRUE(footage->events().isEmpty()); // nobody delivers the first session's results any more
    footage.reset();
    orphan.reset();
    EXPECT_TRUE(node->log.isEmpty()) << node->log.join(QLatin1Char(',')).toStdString();
}

TEST_P(Zel_MemorySessionTest, EveryExceptionOfTheWorkIsAnsweredWithOneFailureAndTheEnd)
{
    // Whatever the server's work throws, the callback hears exactly one
    // failure (Internal, naming the exception where it has a text) and then
    // finished(), through the engine; the tree is unchanged and later
    // requests run normally.
    struct NotAStdException {
    };
    const std::vector<std::pair<std::function<void()>, QString>> throwers = {
        {[] { throw std::bad_alloc(); }, QStringLiteral("The server failed: std::bad_alloc.")},
        {[] { throw std::runtime_error("disk on fire"); }, QStringLiteral("The server failed: disk on fire.")},
        {[] { throw std::out_of_range(""); }, QStringLiteral("The server failed.")},
        {[] { throw 42; }, QStringLiteral("The server failed.")},
        {[] { throw NotAStdException(); }, QStringLiteral("The server failed.")},
    };
    QStringList asked;
    for (const auto& thrower : throwers) {
        session->setFaultHook([&asked, &thrower](const QString& requestName) {
            asked << requestName;
            thrower.first();
        });
        auto get = rec<NodeRec>();
        run(session->makeGetNodeReqSP(mk(m(Mayor)), get));
        EXPECT_EQ((QStringList{QStringLiteral("fail %1").arg(Zel_MemoryErrorCodes::Internal), QStringLiteral("finished")}),
                  get->log);
        EXPECT_EQ(thrower.second, get->messages.value(0));

        // A change that fails this way changes nothing.
        auto rename = rec<RenameNodeRec>();
        run(session->makeRenameNodeReqSP(mk(m(Mayor)), QStringLiteral("Renamed"), rename));
        EXPECT_EQ(QList<int>{Zel_MemoryErrorCodes::Internal}, rename->codes);
        EXPECT_EQ(1, rename->ends);
    }
    EXPECT_EQ(QStringLiteral("Zel_GetNodeReq"), asked.value(0));
    EXPECT_EQ(QStringLiteral("Zel_RenameNodeReq"), asked.value(1));
    EXPECT_EQ(10, asked.size());

    // The three requests on Orv_Request go the same way (the root node's
    // callback has no end notice).
    session->setFaultHook([](const QString&) { throw std::runtime_error("no root today"); });
    auto root = rec<RootNodeRec>();
    run(session->makeRootNodeReqSP(root));
    EXPECT_EQ(QStringList{QStringLiteral("fail %1").arg(Zel_MemoryErrorCodes::Internal)}, root->log);
    EXPECT_EQ(QStringLiteral("The server failed: no root today."), root->messages.value(0));

    session->setFaultHook(nullptr);
    auto get = rec<NodeRec>();
    run(session->makeGetNodeReqSP(mk(m(Mayor)), get));
    EXPECT_EQ((QStringList{QStringLiteral("ok Interview Mayor"), QStringLiteral("finished")}), get->log);
    EXPECT_EQ(0u, engine.failedRequestCount());
}
