#include "Tour.h"

#include "Zel_MemoryErrorCodes.h"
#include "Zel_MemorySession.h"

#include "Orv_Engine.h"
#include "Zel_CreateFolderCB.h"
#include "Zel_CreateFolderReq.h"
#include "Zel_CreateFolderUniqueCB.h"
#include "Zel_CreateFolderUniqueReq.h"
#include "Zel_CreateNodeUniqueReq.h"
#include "Zel_CreateReservationCB.h"
#include "Zel_CreateReservationReq.h"
#include "Zel_ChildrenReq.h"
#include "Zel_CheckinReq.h"
#include "Zel_DeleteNodeReq.h"
#include "Zel_DeleteReq.h"
#include "Zel_GetApplicationSettingsCB.h"
#include "Zel_GetApplicationSettingsReq.h"
#include "Zel_GetNodeReq.h"
#include "Zel_GetReservationsReq.h"
#include "Zel_GetUserSettingsReq.h"
#include "Zel_LoginReq.h"
#include "Zel_MobDescList.h"
#include "Zel_NodePermissionsReq.h"
#include "Zel_Property.h"
#include "Zel_PropertyKeys.h"
#include "Zel_PropertyManager.h"
#include "Zel_PropertyListReq.h"
#include "Zel_QueryCB.h"
#include "Zel_QueryReq.h"
#include "Zel_QuerySpec.h"
#include "Zel_RemoveReservationCB.h"
#include "Zel_RemoveReservationReq.h"
#include "Zel_RenameNodeCB.h"
#include "Zel_RenameNodeReq.h"
#include "Zel_ResultCB.h"
#include "Zel_RootNodeReq.h"
#include "Zel_SetApplicationSettingsCB.h"
#include "Zel_SetApplicationSettingsReq.h"
#include "Zel_SetUserSettingsCB.h"
#include "Zel_SetUserSettingsReq.h"
#include "Zel_SettingList.h"
#include "Zel_StartupReq.h"

#include <QDomDocument>
#include <QDomElement>
#include <boost/make_shared.hpp>

namespace {

Console& out()
{
    return Console::instance();
}

// The MobIDs the application gives the media it creates and checks in.
const QString kMobPrefix = QStringLiteral("060a2b340101010101010f00.13000000.");

// The settings of an XML document in the form of Zel_SettingList::toXML:
// every leaf element below the root, keyed by the dotted path of names.
QList<QPair<QString, QString>> leavesOf(const QDomElement& element, const QString& prefix)
{
    QList<QPair<QString, QString>> leaves;
    bool hasChildElements = false;
    for (QDomElement child = element.firstChildElement(); !child.isNull(); child = child.nextSiblingElement()) {
        hasChildElements = true;
        leaves += leavesOf(child, prefix.isEmpty() ? child.tagName() : prefix + QLatin1Char('.') + child.tagName());
    }
    if (!hasChildElements && !prefix.isEmpty())
        leaves.append(qMakePair(prefix, element.text()));
    return leaves;
}

// The word of a name to search for: its last word of three characters or more.
QString searchWordOf(const QString& name)
{
    const QStringList words = name.split(QLatin1Char(' '), Qt::SkipEmptyParts);
    for (int i = words.size() - 1; i >= 0; --i) {
        if (words.at(i).size() >= 3)
            return words.at(i);
    }
    return name;
}

bool mentions(const boost::shared_ptr<Zel_Node>& node, const QString& text)
{
    if (node->getName().contains(text, Qt::CaseInsensitive))
        return true;
    for (const Zel_Property& p : node->getProperties()) {
        if (p.value().contains(text, Qt::CaseInsensitive))
            return true;
    }
    return false;
}

QString lockedBy(const boost::shared_ptr<Zel_Node>& node)
{
    return node->isReserved() ? node->getPropertyValue(Zel_PropKey_LockedBy) : QString();
}

} // namespace

Tour::Tour(Orv_Engine& engine, boost::shared_ptr<Zel_MemorySession> session, const QString& user,
           const QString& password)
    : mEngine(engine)
    , mSession(std::move(session))
    , mUser(user)
    , mPassword(password)
{
}

Tour::~Tour()
{
    // Listeners leave the session's hub before the session goes.
    mBinWatch.reset();
    mProjectWatch.reset();
}

int Tour::run()
{
    struct Step {
        const char* title;
        const char* intro;
        bool (Tour::*run)();
    };
    static const Step steps[] = {
        {"Log in",
         "The application obtains every request from its session (Zel_Session's factories) and\n"
         "submits it; the answer arrives at the callback it gave the request. A wrong password\n"
         "first: failures are data, delivered to the failure handler with a Zel_Error.",
         &Tour::logIn},
        {"Browse the tree",
         "Zel_RootNodeReq answers the root node; a Zel_ChildrenReq per folder answers its children,\n"
         "each with a has-children flag. Children come in node order (Zel_Node::operator<): media\n"
         "first, then folders, each group by name regardless of case.",
         &Tour::browse},
        {"Properties",
         "Zel_PropertyListReq reads every property of a node. The names shown to users come from\n"
         "the property manager the session registered (Zel_Property::displayName).",
         &Tour::properties},
        {"Watch a bin",
         "A folder listener (derived from Zel_IEventListenerFolder) hears the children added to,\n"
         "removed from and updated in one folder. Events travel through the engine like answers.\n"
         "The application creates a bin, watches it, then creates, renames and deletes in it.",
         &Tour::watchBin},
        {"Check media in",
         "Zel_CheckinReq checks media objects in to a folder, each described by a Zel_MobDesc\n"
         "(MobID and media file); the Zel_CheckinCB hears one outcome per object. One object is on\n"
         "the server already, so it is refused while the others go in.",
         &Tour::checkIn},
        {"Reserve and release",
         "A reservation keeps other users from changing a node until it ends or is released.",
         &Tour::reserve},
        {"Delete with media",
         "Zel_DeleteReq deletes several assets at once and, when asked, their media on the server\n"
         "and on this machine. Its Zel_DeleteCB hears an outcome per media object, then the totals;\n"
         "an asset that cannot be deleted is reported and the others still go.",
         &Tour::deleteAssets},
        {"Settings",
         "User and application settings travel as XML text, the form Zel_SettingList::toXML writes:\n"
         "each dotted key becomes nested elements.",
         &Tour::settings},
        {"Search",
         "Zel_QueryReq searches the tree with a Zel_QuerySpec; one answer per node found.",
         &Tour::query},
        {"Permissions",
         "Zel_NodePermissionsReq answers the logged-in user's rights on a node. The rendering of\n"
         "Zel_NodePermissions::toZelString: upper case when granted, lower case when not (R read,\n"
         "C copy, FI/FO add files/folders, WA write attributes, DELA delete assets, DESM destroy\n"
         "media, RES reserve, OVRES override reservations, A admin, O owner, ...).",
         &Tour::permissions},
        {"Lose and regain the connection",
         "The session's status callback (a Zel_StatusNotificationCB) hears when the connection\n"
         "drops and when it is back; requests in between fail with a clear error.",
         &Tour::connection},
    };

    const int count = static_cast<int>(sizeof(steps) / sizeof(steps[0]));
    int ran = 0;
    bool goOn = true;
    while (ran < count && goOn) {
        const Step& step = steps[ran++];
        mProblems.clear();
        out().heading(ran, QString::fromLatin1(step.title), QString::fromLatin1(step.intro));
        goOn = (this->*step.run)();
        if (!mProblems.isEmpty() || !goOn)
            mFailed.push_back(Failed{ran, QString::fromLatin1(step.title), mProblems});
    }

    mBinWatch.reset();
    mProjectWatch.reset();
    mSession->setStatusNotificationCB(boost::shared_ptr<Zel_StatusNotificationCB>());
    mSession->close();
    mEngine.DeliverAll();

    out().line();
    out().line(QString(72, QLatin1Char('=')));
    if (mFailed.empty() && ran == count) {
        out().line(QStringLiteral("All %1 steps got the answers they expected.").arg(count));
        return 0;
    }
    for (const Failed& failed : mFailed) {
        out().line(QStringLiteral("FAILED: step %1 (%2)").arg(failed.number).arg(failed.title));
        for (const QString& problem : failed.problems)
            out().line(QStringLiteral("  expected ") + problem);
    }
    if (ran < count)
        out().line(QStringLiteral("NOT RUN: steps %1 to %2, which need what step %3 did not get.").arg(ran + 1).arg(count).arg(ran));
    out().line(QStringLiteral("%1 of %2 steps did not get the answers they expected.").arg(static_cast<int>(mFailed.size()) + count - ran).arg(count));
    return 1;
}

// --- Plumbing -------------------------------------------------------------------

bool Tour::send(const boost::shared_ptr<Orv_Request>& request, const QString& line)
{
    out().send(line);
    if (!expect(request != nullptr, QStringLiteral("the session to make the request")))
        return false;
    if (!expect(mSession->submitRequest(request), QStringLiteral("the session to accept the request")))
        return false;
    // Workers run the request; the answers (and any events it caused) are
    // delivered here, on the application's thread.
    mEngine.DeliverAll();
    return true;
}

bool Tour::expect(bool condition, const QString& expectation)
{
    if (!condition) {
        mProblems << expectation;
        out().mismatch(QStringLiteral("expected ") + expectation);
    }
    return condition;
}

void Tour::expectEvents(const FolderWatch* watch, std::size_t from, const QString& parent,
                        const QList<QPair<QString, QString>>& expected)
{
    QStringList heard;
    bool parentsRight = true;
    for (std::size_t i = from; watch && i < watch->heard.size(); ++i) {
        heard << watch->heard[i].kind + QLatin1Char(' ') + watch->heard[i].child;
        parentsRight = parentsRight && watch->heard[i].parent == parent;
    }
    QStringList wanted;
    for (const auto& e : expected)
        wanted << e.first + QLatin1Char(' ') + e.second;
    expect(heard == wanted, QStringLiteral("the listener to hear [%1], it heard [%2]")
                                .arg(wanted.join(QStringLiteral(", ")), heard.join(QStringLiteral(", "))));
    expect(parentsRight, QStringLiteral("every event to name the watched folder as the parent"));
}

void Tour::expectSettings(const QString& xml, const Zel_SettingList& written)
{
    QDomDocument document;
    if (!expect(document.setContent(xml), QStringLiteral("the settings read back to be well-formed XML")))
        return;
    const QList<QPair<QString, QString>> leaves = leavesOf(document.documentElement(), QString());
    QList<QPair<QString, QString>> wanted;
    for (const Zel_Setting& s : written)
        wanted.append(qMakePair(s.key(), s.value()));
    if (expect(leaves == wanted, QStringLiteral("the settings read back to be the %1 written").arg(wanted.size())))
        out().detail(QStringLiteral("(the %1 settings read back are the ones written)").arg(wanted.size()));
}

void Tour::remember(const boost::shared_ptr<Zel_Node>& node)
{
    if (node)
        mNames.insert(node->getMoniker(), node->getName());
}

QString Tour::nameOf(const boost::shared_ptr<Zel_Node>& node) const
{
    return node ? quoted(node->getName()) : QStringLiteral("(none)");
}

boost::shared_ptr<QString> Tour::monikerOf(const boost::shared_ptr<Zel_Node>& node) const
{
    return boost::make_shared<QString>(node ? node->getMoniker() : QString());
}

// --- 1. Log in -----------------------------------------------------------------

bool Tour::logIn()
{
    // Connection news goes to this callback for the whole session.
    mConnection = boost::make_shared<ConnectionWatch>();
    mSession->setStatusNotificationCB(mConnection);

    auto wrong = boost::make_shared<LoginAnswers>();
    send(mSession->makeLoginReqSP(mUser, mPassword + QStringLiteral("-typo"), boost::shared_ptr<Zel_LoginCredentials>(), wrong),
         QStringLiteral("Zel_LoginReq as %1 with a wrong password").arg(quoted(mUser)));
    expect(wrong->users.isEmpty() && wrong->onlyFailureCode() == Zel_MemoryErrorCodes::LoginFailed,
           QStringLiteral("the login with a wrong password to fail with LoginFailed"));

    auto login = boost::make_shared<LoginAnswers>();
    send(mSession->makeLoginReqSP(mUser, mPassword, boost::shared_ptr<Zel_LoginCredentials>(), login),
         QStringLiteral("Zel_LoginReq as %1").arg(quoted(mUser)));
    if (!expect(login->failures.empty() && login->users == QStringList(mUser) && mSession->isLoggedIn(),
                QStringLiteral("the login as %1 to succeed (try --user and --password)").arg(quoted(mUser))))
        return false;

    auto startup = boost::make_shared<StartupAnswers>();
    send(mSession->makeStartupReqSP(startup), QStringLiteral("Zel_StartupReq"));
    expect(startup->succeededCalls == 1 && startup->failures.empty(), QStringLiteral("the start-up to succeed"));

    out().note(QStringLiteral("The session: server %1 (%2),\nworkgroup %3, user %4, application %5%6.")
                   .arg(quoted(mSession->getServerName()), mSession->getServerVersion(),
                        mSession->getWorkgroupName().isEmpty() ? QStringLiteral("(none)") : quoted(mSession->getWorkgroupName()),
                        quoted(mSession->getUserName()),
                        quoted(mSession->getApplicationName()),
                        mSession->isReadOnly() ? QStringLiteral(", read-only") : QString()));
    if (mSession->isReadOnly())
        out().note(QStringLiteral("%1 may only read: the steps that change the tree will be refused.").arg(quoted(mUser)));
    return true;
}

// --- 2. Browse -----------------------------------------------------------------

bool Tour::browse()
{
    auto rootCB = boost::make_shared<RootAnswers>();
    send(mSession->makeRootNodeReqSP(rootCB), QStringLiteral("Zel_RootNodeReq, then a Zel_ChildrenReq for each folder"));
    if (!expect(rootCB->failures.empty() && rootCB->nodes.size() == 1 && rootCB->nodes[0],
                QStringLiteral("one answer, the root node")))
        return false;
    mRoot = rootCB->nodes[0];
    expect(mRoot->getMoniker() == *mSession->getRootMonikerSP(),
           QStringLiteral("the root node to have the session's root moniker"));
    remember(mRoot);
    mBrowsed.append(Visited{mRoot, 0, boost::shared_ptr<Zel_Node>()});
    int requests = 0;
    browseFolder(mRoot, 1, boost::shared_ptr<Zel_Node>(), requests);

    // The outline of what the requests answered, in the order received.
    for (const Visited& v : mBrowsed) {
        QString line = QString(v.depth * 3, QLatin1Char(' ')) + describeNode(v.node);
        if (v.depth == 0)
            line += QStringLiteral("  (the root)");
        if (!lockedBy(v.node).isEmpty())
            line += QStringLiteral("  reserved by ") + quoted(lockedBy(v.node));
        out().answer(line);
    }

    int folders = 0;
    int media = 0;
    for (const Visited& v : mBrowsed) {
        folders += v.node->isFolder();
        media += v.node->isMedia();
    }
    out().note(QStringLiteral("%1 nodes (%2 folders, %3 media), answered to %4 requests.")
                   .arg(mBrowsed.size()).arg(folders).arg(media).arg(requests + 1));

    // What the rest of the tour works on, chosen from what the browse found.
    for (const Visited& v : mBrowsed) {
        if (v.node->isMedia() && (!mShowcase || v.node->getProperties().size() > mShowcase->getProperties().size()))
            mShowcase = v.node;
        if (!mOtherReserved && !lockedBy(v.node).isEmpty() && lockedBy(v.node) != mSession->getUserName())
            mOtherReserved = v.node;
    }
    for (const Visited& v : mBrowsed) {
        if (mShowcase && v.node == mShowcase)
            mProject = v.topLevel;
    }
    if (!mProject) {
        for (const Visited& v : mBrowsed) {
            if (v.depth == 1 && v.node->isFolder()) {
                mProject = v.node;
                break;
            }
        }
    }
    if (!mProject)
        mProject = mRoot;
    out().note(QStringLiteral("The tour works with the clip %1 in %2%3.")
                   .arg(mShowcase ? nameOf(mShowcase) : QStringLiteral("(none: the tree has no media)"), nameOf(mProject),
                        mOtherReserved ? QStringLiteral(";\n%1 is reserved by %2").arg(nameOf(mOtherReserved), quoted(lockedBy(mOtherReserved)))
                                       : QString()));
    return true;
}

void Tour::browseFolder(const boost::shared_ptr<Zel_Node>& folder, int depth, const boost::shared_ptr<Zel_Node>& topLevel,
                        int& requests)
{
    // Quietly: browse() prints the outline of what these requests answered.
    auto children = boost::make_shared<ChildrenAnswers>();
    ++requests;
    if (!expect(mSession->submitRequest(mSession->makeChildrenReqSP(monikerOf(folder), children)),
                QStringLiteral("the session to accept the Zel_ChildrenReq for %1").arg(nameOf(folder))))
        return;
    mEngine.DeliverAll();
    expect(children->failures.empty() && children->finishedCalls == 1,
           QStringLiteral("the children of %1 without failure, then finished once").arg(nameOf(folder)));

    for (std::size_t i = 0; i < children->nodes.size(); ++i) {
        const boost::shared_ptr<Zel_Node>& child = children->nodes[i];
        if (!expect(child != nullptr, QStringLiteral("a node in every answer")))
            continue;
        if (i > 0)
            expect(!(*child < *children->nodes[i - 1]),
                   QStringLiteral("%1 to come before %2 (node order)").arg(nameOf(child), nameOf(children->nodes[i - 1])));
        expect(children->hasChildren[i] == (child->getChildrenCount() > 0),
               QStringLiteral("the has-children flag of %1 to match its child count").arg(nameOf(child)));
        remember(child);
        const boost::shared_ptr<Zel_Node> top = topLevel ? topLevel : child;
        mBrowsed.append(Visited{child, depth, top});
        if (child->isFolder() && children->hasChildren[i])
            browseFolder(child, depth + 1, top, requests);
    }
}

// --- 3. Properties ---------------------------------------------------------------

bool Tour::properties()
{
    const boost::shared_ptr<Zel_Node> node = mShowcase ? mShowcase : mRoot;
    auto props = boost::make_shared<PropertyAnswers>();
    send(mSession->makePropertyListReqSP(monikerOf(node), props), QStringLiteral("Zel_PropertyListReq for %1").arg(nameOf(node)));
    if (!expect(props->failures.empty() && props->lists.size() == 1 && props->finishedCalls == 1,
                QStringLiteral("one property list, then finished")))
        return true;

    expect(Zel_Property::getPropertyManagerSP() != nullptr, QStringLiteral("the session to have registered a property manager"));
    const Zel_PropertyList& list = props->lists.front();
    for (const Zel_Property& p : list) {
        const QString shown = p.displayName();
        if (!shown.isEmpty()) {
            const QString back = Zel_Property::getKeyByDisplayName(shown);
            expect(Zel_Property::getDisplayName(back) == shown,
                   QStringLiteral("the display name %1 to lead back to a key shown so").arg(quoted(shown)));
        }
    }
    expect(list.findByKey(Zel_PropKey_Name).value() == node->getName(), QStringLiteral("the Name property to be the node's name"));
    expect(list.findByKey(Zel_PropKey_MimeType).value() == node->getMimeType(),
           QStringLiteral("the Mime Type property to be the node's mime type"));
    return true;
}

// --- 4. Watch a bin ----------------------------------------------------------------

bool Tour::watchBin()
{
    const boost::shared_ptr<QString> projectMoniker = monikerOf(mProject);
    mProjectWatch.reset(new FolderWatch(projectMoniker, mProject->getName(), mSession, &mNames));
    out().note(QStringLiteral("The application listens to %1.").arg(nameOf(mProject)));

    auto created = boost::make_shared<NodeAnswers<Zel_CreateFolderUniqueCB>>();
    send(mSession->makeCreateFolderUniqueReqSP(projectMoniker, QStringLiteral("Demo Bin"), created),
         QStringLiteral("Zel_CreateFolderUniqueReq \"Demo Bin\" in %1").arg(nameOf(mProject)));
    if (!expect(created->failures.empty() && created->nodes.size() == 1 && created->nodes[0]->isFolder(),
                QStringLiteral("a new folder in %1 (may %2 add folders there?)").arg(nameOf(mProject), quoted(mUser))))
        return false;
    mDemoBin = created->nodes[0];
    remember(mDemoBin);
    expectEvents(mProjectWatch.get(), 0, mProject->getMoniker(),
                 {qMakePair(QStringLiteral("added"), mDemoBin->getMoniker())});

    const boost::shared_ptr<QString> binMoniker = monikerOf(mDemoBin);
    mBinWatch.reset(new FolderWatch(binMoniker, mDemoBin->getName(), mSession, &mNames));
    out().note(QStringLiteral("The application listens to %1 as well.").arg(nameOf(mDemoBin)));

    auto rushes = boost::make_shared<NodeAnswers<Zel_CreateFolderCB>>();
    send(mSession->makeCreateFolderReqSP(binMoniker, QStringLiteral("Rushes"), rushes),
         QStringLiteral("Zel_CreateFolderReq \"Rushes\" in %1").arg(nameOf(mDemoBin)));
    if (!expect(rushes->failures.empty() && rushes->nodes.size() == 1, QStringLiteral("the bin \"Rushes\" to be created")))
        return false;
    remember(rushes->nodes[0]);

    auto again = boost::make_shared<NodeAnswers<Zel_CreateFolderCB>>();
    send(mSession->makeCreateFolderReqSP(binMoniker, QStringLiteral("Rushes"), again),
         QStringLiteral("Zel_CreateFolderReq \"Rushes\" again: the name is taken"));
    expect(again->nodes.empty() && again->onlyFailureCode() == Zel_MemoryErrorCodes::NameExists,
           QStringLiteral("the second \"Rushes\" to fail with NameExists"));

    // A clip's type and first values come with its properties; the MobID is the application's.
    std::vector<boost::shared_ptr<Zel_Node>> clips;
    for (int i = 1; i <= 2; ++i) {
        Zel_PropertyList properties;
        properties.append(Zel_Property(Zel_PropKey_MimeType, QStringLiteral("masterclip"), QString()));
        properties.append(Zel_Property(Zel_PropKey_MobID, kMobPrefix + QStringLiteral("d10%1").arg(i), QString()));
        properties.append(Zel_Property(Zel_PropKey_Tape, QStringLiteral("CARD-0501"), QString()));
        properties.append(Zel_Property(Zel_PropKey_Comments, QStringLiteral("Vox pop at the tram stop"), QString()));
        auto clip = boost::make_shared<NodeAnswers<Zel_ResultCB>>();
        send(mSession->makeCreateNodeUniqueReqSP(binMoniker, QStringLiteral("Street Interview"), properties, clip),
             QStringLiteral("Zel_CreateNodeUniqueReq \"Street Interview\" (a master clip)%1")
                 .arg(i == 2 ? QStringLiteral(" again: made unique") : QString()));
        if (!expect(clip->failures.empty() && clip->nodes.size() == 1 && clip->nodes[0]->isMedia(),
                    QStringLiteral("a new master clip")))
            return false;
        remember(clip->nodes[0]);
        clips.push_back(clip->nodes[0]);
    }
    expect(clips[0]->getName() == QLatin1String("Street Interview") && clips[1]->getName() != clips[0]->getName(),
           QStringLiteral("the second clip to get a name of its own"));
    mStreetInterview = clips[0];

    auto renamed = boost::make_shared<NodeAnswers<Zel_RenameNodeCB>>();
    send(mSession->makeRenameNodeReqSP(monikerOf(rushes->nodes[0]), QStringLiteral("Selects"), renamed),
         QStringLiteral("Zel_RenameNodeReq \"Rushes\" to \"Selects\""));
    expect(renamed->failures.empty() && renamed->nodes.size() == 1 && renamed->nodes[0]->getName() == QLatin1String("Selects"),
           QStringLiteral("the bin to be renamed \"Selects\""));
    if (!renamed->nodes.empty())
        remember(renamed->nodes[0]);

    auto deleted = boost::make_shared<BoolAnswers>();
    send(mSession->makeDeleteNodeReqSP(monikerOf(clips[1]), deleted),
         QStringLiteral("Zel_DeleteNodeReq for %1").arg(nameOf(clips[1])));
    expect(deleted->failures.empty() && deleted->values == std::vector<bool>{true}, QStringLiteral("the clip to be deleted"));

    expectEvents(mBinWatch.get(), 0, mDemoBin->getMoniker(),
                 {qMakePair(QStringLiteral("added"), rushes->nodes[0]->getMoniker()),
                  qMakePair(QStringLiteral("added"), clips[0]->getMoniker()),
                  qMakePair(QStringLiteral("added"), clips[1]->getMoniker()),
                  qMakePair(QStringLiteral("updated"), rushes->nodes[0]->getMoniker()),
                  qMakePair(QStringLiteral("removed"), clips[1]->getMoniker())});
    return true;
}

// --- 5. Check media in ------------------------------------------------------------

bool Tour::checkIn()
{
    Zel_MobDescList mobs;
    mobs.add(Zel_MobDesc(kMobPrefix + QStringLiteral("d001"), QStringLiteral("/media/demo/street_vox_1.mxf"),
                         QStringLiteral("/media/demo/street_vox_1.ppm")));
    mobs.add(Zel_MobDesc(kMobPrefix + QStringLiteral("d002"), QStringLiteral("/media/demo/tram_arrival.mxf"),
                         QStringLiteral("/media/demo/tram_arrival.ppm")));
    const QString knownMob = mShowcase ? mShowcase->getMobID().toZelString() : QString();
    if (!knownMob.isEmpty())
        mobs.add(Zel_MobDesc(knownMob, QStringLiteral("/media/demo/mayor_again.mxf"), QString()));
    else
        out().note(QStringLiteral("(The tree has no media object to offer again: nothing to be refused.)"));

    const std::size_t eventsBefore = mBinWatch->heard.size();
    auto checkin = boost::make_shared<CheckinAnswers>();
    send(mSession->makeCheckinReqSP(mobs, monikerOf(mDemoBin), checkin),
         QStringLiteral("Zel_CheckinReq of %1 media objects to %2").arg(mobs.size()).arg(nameOf(mDemoBin)));
    for (const CheckinAnswers::CheckedIn& c : checkin->checkedIn) {
        remember(c.node);
        if (c.node)
            mCheckedIn.push_back(c.node);
    }
    if (!expect(checkin->checkedIn.size() == 2 && mCheckedIn.size() == 2 && checkin->finishedCalls == 1,
                QStringLiteral("two media objects checked in, then finished")))
        return true;
    expect(mCheckedIn[0]->getMobID().toZelString() == mobs.getMobDesc(0)->getMobID()
               && mCheckedIn[1]->getMobID().toZelString() == mobs.getMobDesc(1)->getMobID(),
           QStringLiteral("the new clips to carry the MobIDs given"));
    if (!knownMob.isEmpty())
        expect(checkin->refused.size() == 1 && checkin->onlyFailureCode() == Zel_MemoryErrorCodes::InvalidMedia,
               QStringLiteral("the object already on the server to be refused with InvalidMedia"));
    else
        expect(checkin->failures.empty(), QStringLiteral("no failure"));
    expectEvents(mBinWatch.get(), eventsBefore, mDemoBin->getMoniker(),
                 {qMakePair(QStringLiteral("added"), mCheckedIn[0]->getMoniker()),
                  qMakePair(QStringLiteral("added"), mCheckedIn[1]->getMoniker())});
    return true;
}

// --- 6. Reserve and release ---------------------------------------------------------

bool Tour::reserve()
{
    if (!expect(!mCheckedIn.empty(), QStringLiteral("a checked-in clip to reserve")))
        return true;
    const boost::shared_ptr<Zel_Node> clip = mCheckedIn.front();
    const std::size_t eventsBefore = mBinWatch->heard.size();

    // Reservations end in server time.
    const QDateTime until = mSession->getServerTime().addSecs(2 * 3600);
    auto reserved = boost::make_shared<DoneAnswers<Zel_CreateReservationCB>>(QStringLiteral("reserved"));
    send(mSession->makeCreateReservationReqSP(monikerOf(clip), until, reserved),
         QStringLiteral("Zel_CreateReservationReq for %1 for two hours").arg(nameOf(clip)));
    expect(reserved->succeededCalls == 1 && reserved->failures.empty(), QStringLiteral("the reservation to be made"));

    auto held = boost::make_shared<ReservationAnswers>();
    send(mSession->makeGetReservationsReqSP(monikerOf(clip), held), QStringLiteral("Zel_GetReservationsReq for %1").arg(nameOf(clip)));
    expect(held->holders == QStringList(mSession->getUserName()) && held->finishedCalls == 1,
           QStringLiteral("one reservation, held by %1").arg(quoted(mSession->getUserName())));

    if (mOtherReserved) {
        auto refused = boost::make_shared<DoneAnswers<Zel_CreateReservationCB>>(QStringLiteral("reserved"));
        send(mSession->makeCreateReservationReqSP(monikerOf(mOtherReserved), until, refused),
             QStringLiteral("Zel_CreateReservationReq for %1, which %2 holds").arg(nameOf(mOtherReserved), quoted(lockedBy(mOtherReserved))));
        expect(refused->succeededCalls == 0 && refused->onlyFailureCode() == Zel_MemoryErrorCodes::ReservedByOtherUser
                   && !refused->failures[0]->isPrivilegeError(),
               QStringLiteral("the reservation to be refused with ReservedByOtherUser (not a privilege error)"));
    } else {
        out().note(QStringLiteral("(No node of this tree is reserved by another user: nothing to be refused.)"));
    }

    auto released = boost::make_shared<DoneAnswers<Zel_RemoveReservationCB>>(QStringLiteral("released"));
    send(mSession->makeRemoveReservationReqSP(monikerOf(clip), released),
         QStringLiteral("Zel_RemoveReservationReq for %1").arg(nameOf(clip)));
    expect(released->succeededCalls == 1 && released->failures.empty(), QStringLiteral("the reservation to be released"));

    auto none = boost::make_shared<ReservationAnswers>();
    send(mSession->makeGetReservationsReqSP(monikerOf(clip), none),
         QStringLiteral("Zel_GetReservationsReq for %1 again").arg(nameOf(clip)));
    expect(none->holders.isEmpty() && none->failures.empty() && none->finishedCalls == 1,
           QStringLiteral("no reservation any more"));

    expectEvents(mBinWatch.get(), eventsBefore, mDemoBin->getMoniker(),
                 {qMakePair(QStringLiteral("updated"), clip->getMoniker()),
                  qMakePair(QStringLiteral("updated"), clip->getMoniker())});
    return true;
}

// --- 7. Delete with media -------------------------------------------------------------

bool Tour::deleteAssets()
{
    if (!expect(mCheckedIn.size() == 2 && mStreetInterview, QStringLiteral("the clips of the earlier steps to delete")))
        return true;
    QStringList monikers;
    QStringList names;
    for (const boost::shared_ptr<Zel_Node>& node : {mCheckedIn[0], mCheckedIn[1], mStreetInterview}) {
        monikers << node->getMoniker();
        names << nameOf(node);
    }
    if (mOtherReserved) {
        monikers << mOtherReserved->getMoniker();
        names << nameOf(mOtherReserved);
    }
    const std::size_t eventsBefore = mBinWatch->heard.size();
    auto deleted = boost::make_shared<DeleteAnswers>();
    send(mSession->makeDeleteReqSP(monikers, true, true, deleted),
         QStringLiteral("Zel_DeleteReq for %1 assets, with their media on the server and here:\n        %2")
             .arg(QString::number(names.size()), names.join(QStringLiteral(", "))));

    expect(deleted->finishedCalls == 1, QStringLiteral("finished once"));
    expect(deleted->total(DeleteAnswers::AssetTotal) == 3 && deleted->total(DeleteAnswers::MetadataTotal) == 3,
           QStringLiteral("3 assets and 3 metadata records deleted"));
    if (mOtherReserved)
        expect(deleted->countOf(DeleteAnswers::WholeError) == 1
                   && deleted->onlyFailureCode() == Zel_MemoryErrorCodes::ReservedByOtherUser,
               QStringLiteral("%1 to be kept with ReservedByOtherUser").arg(nameOf(mOtherReserved)));
    else
        expect(deleted->countOf(DeleteAnswers::WholeError) == 0, QStringLiteral("no asset to be refused"));
    for (const boost::shared_ptr<Zel_Node>& clip : mCheckedIn) {
        const QString mob = clip->getMobID().toZelString();
        expect(deleted->has(DeleteAnswers::LocalMediaDeleted, mob),
               QStringLiteral("the media of %1 to be deleted on this machine").arg(nameOf(clip)));
        expect(deleted->has(DeleteAnswers::RemoteMediaDeleted, mob) || deleted->has(DeleteAnswers::RemoteMediaError, mob),
               QStringLiteral("an outcome for the media of %1 on the server").arg(nameOf(clip)));
    }
    expect(deleted->has(DeleteAnswers::LocalMobNotFound, mStreetInterview->getMobID().toZelString()),
           QStringLiteral("%1, which has no media, to be reported as not found here").arg(nameOf(mStreetInterview)));
    expectEvents(mBinWatch.get(), eventsBefore, mDemoBin->getMoniker(),
                 {qMakePair(QStringLiteral("removed"), monikers[0]), qMakePair(QStringLiteral("removed"), monikers[1]),
                  qMakePair(QStringLiteral("removed"), monikers[2])});
    return true;
}

// --- 8. Settings -------------------------------------------------------------------

bool Tour::settings()
{
    const Zel_GetUserSettingsCB::UserSettingsType general = Zel_GetUserSettingsCB::UserSettingsGeneral;
    auto before = boost::make_shared<UserSettingsAnswers>();
    send(mSession->makeGetUserSettingsReqSP(general, before), QStringLiteral("Zel_GetUserSettingsReq (general)"));
    expect(before->texts.size() == 1 && before->failures.empty(), QStringLiteral("the user's general settings"));

    Zel_SettingList user;
    user.append(Zel_Setting(QStringLiteral("Timeline.TrackHeight"), QStringLiteral("64")));
    user.append(Zel_Setting(QStringLiteral("Timeline.Waveforms"), QStringLiteral("on")));
    user.append(Zel_Setting(QStringLiteral("Bins.View"), QStringLiteral("script")));
    const QString userXml = user.toXML(QStringLiteral("UserSettings"));
    out().note(QStringLiteral("The application's new settings, a Zel_SettingList in its XML form:"));
    out().block(userXml);
    auto stored = boost::make_shared<DoneAnswers<Zel_SetUserSettingsCB>>(QStringLiteral("stored"));
    send(mSession->makeSetUserSettingsReqSP(general, userXml, stored), QStringLiteral("Zel_SetUserSettingsReq (general)"));
    expect(stored->succeededCalls == 1 && stored->failures.empty(), QStringLiteral("the user settings to be stored"));

    auto after = boost::make_shared<UserSettingsAnswers>();
    send(mSession->makeGetUserSettingsReqSP(general, after), QStringLiteral("Zel_GetUserSettingsReq (general) again"));
    if (expect(after->texts.size() == 1, QStringLiteral("the user's general settings")))
        expectSettings(after->texts.front(), user);

    const QString application = mSession->getApplicationName();
    auto appBefore = boost::make_shared<TextAnswers<Zel_GetApplicationSettingsCB>>();
    send(mSession->makeGetApplicationSettingsReqSP(application, appBefore),
         QStringLiteral("Zel_GetApplicationSettingsReq for %1").arg(quoted(application)));
    expect(appBefore->texts.size() == 1 && appBefore->failures.empty(), QStringLiteral("the application's settings"));

    Zel_SettingList app;
    app.append(Zel_Setting(QStringLiteral("General.Language"), QStringLiteral("en")));
    app.append(Zel_Setting(QStringLiteral("Recent.Project"), mProject->getName()));
    app.append(Zel_Setting(QStringLiteral("Recent.Bin"), mDemoBin ? mDemoBin->getName() : QString()));
    auto appStored = boost::make_shared<DoneAnswers<Zel_SetApplicationSettingsCB>>(QStringLiteral("stored"));
    send(mSession->makeSetApplicationSettingsReqSP(application, app.toXML(QStringLiteral("ApplicationSettings")), appStored),
         QStringLiteral("Zel_SetApplicationSettingsReq for %1:\n        %2")
             .arg(quoted(application), QString(app).replace(QLatin1Char('\n'), QStringLiteral(", "))));
    expect(appStored->succeededCalls == 1 && appStored->failures.empty(), QStringLiteral("the application settings to be stored"));

    auto appAfter = boost::make_shared<TextAnswers<Zel_GetApplicationSettingsCB>>();
    send(mSession->makeGetApplicationSettingsReqSP(application, appAfter),
         QStringLiteral("Zel_GetApplicationSettingsReq for %1 again").arg(quoted(application)));
    if (expect(appAfter->texts.size() == 1, QStringLiteral("the application's settings")))
        expectSettings(appAfter->texts.front(), app);
    return true;
}

// --- 9. Search ----------------------------------------------------------------------

bool Tour::query()
{
    const QString text = searchWordOf((mShowcase ? mShowcase : mProject)->getName());
    boost::shared_ptr<Zel_QuerySpec> spec(new Zel_QuerySpec(text));
    auto found = boost::make_shared<NodeAnswers<Zel_QueryCB>>(NodeAnswers<Zel_QueryCB>::ShowPath);
    send(mSession->makeQueryReqSP(spec, found), QStringLiteral("Zel_QueryReq for the text %1").arg(quoted(text)));
    expect(found->getQuerySpec() == spec, QStringLiteral("the callback to carry the query specification"));
    expect(found->failures.empty() && found->finishedCalls == 1 && !found->nodes.empty(),
           QStringLiteral("nodes found, then finished"));
    if (mShowcase) {
        bool hasShowcase = false;
        for (const boost::shared_ptr<Zel_Node>& node : found->nodes)
            hasShowcase = hasShowcase || node->sameNode(mShowcase.get());
        expect(hasShowcase, QStringLiteral("%1 among the nodes found").arg(nameOf(mShowcase)));
    }
    for (std::size_t i = 0; i < found->nodes.size(); ++i) {
        expect(mentions(found->nodes[i], text), QStringLiteral("%1 to mention %2").arg(nameOf(found->nodes[i]), quoted(text)));
        if (i > 0)
            expect(!(*found->nodes[i] < *found->nodes[i - 1]), QStringLiteral("the nodes found in node order"));
    }
    return true;
}

// --- 10. Permissions -------------------------------------------------------------------

bool Tour::permissions()
{
    // One request per folder, all in flight at once; the answers are printed
    // in the order of the tree once they are all in.
    std::vector<boost::shared_ptr<Zel_Node>> folders;
    for (const Visited& v : mBrowsed) {
        if (v.node->isFolder())
            folders.push_back(v.node);
    }
    if (mDemoBin)
        folders.push_back(mDemoBin);
    std::vector<boost::shared_ptr<PermissionAnswers>> answers;
    out().send(QStringLiteral("Zel_NodePermissionsReq for each of the %1 folders, all at once").arg(folders.size()));
    for (const boost::shared_ptr<Zel_Node>& folder : folders) {
        answers.push_back(boost::make_shared<PermissionAnswers>());
        expect(mSession->submitRequest(mSession->makeNodePermissionsReqSP(monikerOf(folder), answers.back())),
               QStringLiteral("the session to accept the request for %1").arg(nameOf(folder)));
    }
    mEngine.DeliverAll();

    boost::shared_ptr<Zel_Node> closed; // a folder the user may not add folders to
    for (std::size_t i = 0; i < folders.size(); ++i) {
        const boost::shared_ptr<PermissionAnswers>& a = answers[i];
        if (!expect(a->failures.empty() && a->permissions.size() == 1 && a->permissions[0] && a->finishedCalls == 1,
                    QStringLiteral("one answer for %1").arg(nameOf(folders[i]))))
            continue;
        const boost::shared_ptr<Zel_NodePermissions>& p = a->permissions[0];
        out().answer(QStringLiteral("%1 %2").arg(nameOf(folders[i]).leftJustified(18), p->toZelString()));
        expect(p->getMoniker() && *p->getMoniker() == folders[i]->getMoniker(),
               QStringLiteral("the permissions of %1 to name it").arg(nameOf(folders[i])));
        expect(p->getHasRead(), QStringLiteral("the right to read %1, which the browse read").arg(nameOf(folders[i])));
        if (!closed && !p->getHasAddFolders())
            closed = folders[i];
    }

    if (!closed) {
        out().note(QStringLiteral("(%1 may add folders everywhere: nothing to be refused.)").arg(quoted(mSession->getUserName())));
        return true;
    }
    auto refused = boost::make_shared<NodeAnswers<Zel_CreateFolderCB>>();
    send(mSession->makeCreateFolderReqSP(monikerOf(closed), QStringLiteral("Not Allowed"), refused),
         QStringLiteral("Zel_CreateFolderReq \"Not Allowed\" in %1, where FO is lower case").arg(nameOf(closed)));
    expect(refused->nodes.empty() && refused->onlyFailureCode() == Zel_MemoryErrorCodes::PermissionDenied
               && refused->failures[0]->isPrivilegeError(),
           QStringLiteral("the folder to be refused with PermissionDenied, a privilege error"));
    return true;
}

// --- 11. Connection -----------------------------------------------------------------------

bool Tour::connection()
{
    out().send(QStringLiteral("(the server connection drops: Zel_MemorySession::simulateConnectionLoss)"));
    mSession->simulateConnectionLoss();
    mEngine.DeliverAll();
    expect(mConnection->heard == QStringList(QStringLiteral("disconnected")) && !mSession->getConnectionStatus(),
           QStringLiteral("the status callback to hear disconnected"));

    auto during = boost::make_shared<NodeAnswers<Zel_ResultCB>>();
    send(mSession->makeGetNodeReqSP(monikerOf(mRoot), during), QStringLiteral("Zel_GetNodeReq for %1").arg(nameOf(mRoot)));
    expect(during->nodes.empty() && during->onlyFailureCode() == Zel_MemoryErrorCodes::NotConnected,
           QStringLiteral("the request to fail with NotConnected"));

    out().send(QStringLiteral("(the connection is back: Zel_MemorySession::simulateReconnect)"));
    mSession->simulateReconnect();
    mEngine.DeliverAll();
    expect(mConnection->heard == (QStringList() << QStringLiteral("disconnected") << QStringLiteral("connected"))
               && mSession->getConnectionStatus(),
           QStringLiteral("the status callback to hear connected"));

    auto after = boost::make_shared<NodeAnswers<Zel_ResultCB>>();
    send(mSession->makeGetNodeReqSP(monikerOf(mRoot), after), QStringLiteral("Zel_GetNodeReq for %1 again").arg(nameOf(mRoot)));
    expect(after->failures.empty() && after->nodes.size() == 1 && after->nodes[0]->sameNode(mRoot.get()),
           QStringLiteral("the root node again"));
    return true;
}
