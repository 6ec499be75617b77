// The application's side of the conversation: its callbacks and listeners.
//
// An application derives one class from the callback class of each operation
// it uses and hands an instance, under a boost::shared_ptr, to the request.
// The engine calls the handlers on the thread that delivers results (here the
// main thread, inside Orv_Engine::DeliverAll), one call per answer. These
// callbacks print each answer and keep it, so that the tour can check what it
// received once the request has finished.
#ifndef ZEL_DEMO_DEMOCALLBACKS_H
#define ZEL_DEMO_DEMOCALLBACKS_H

#include "Console.h"

#include "Zel_CheckinCB.h"
#include "Zel_ChildrenCB.h"
#include "Zel_DeleteCB.h"
#include "Zel_Error.h"
#include "Zel_GetReservationsCB.h"
#include "Zel_GetUserSettingsCB.h"
#include "Zel_IEventListenerFolder.h"
#include "Zel_LoginCB.h"
#include "Zel_MobDesc.h"
#include "Zel_MobID.h"
#include "Zel_Node.h"
#include "Zel_NodePermissions.h"
#include "Zel_NodePermissionsCB.h"
#include "Zel_PropertyList.h"
#include "Zel_PropertyListCB.h"
#include "Zel_ResultBoolCB.h"
#include "Zel_RootNodeCB.h"
#include "Zel_StartupCB.h"
#include "Zel_StatusNotificationCB.h"

#include <QDateTime>
#include <QHash>
#include <QString>
#include <QStringList>
#include <boost/shared_ptr.hpp>

#include <initializer_list>
#include <vector>

// What every callback keeps besides its answers: the failures and how often
// it heard that its request had finished.
class Answers
{
public:
    std::vector<boost::shared_ptr<Zel_Error>> failures;
    int finishedCalls = 0;

    // The code of the only failure, or 0 when there was not exactly one.
    int onlyFailureCode() const { return failures.size() == 1 && failures[0] ? failures[0]->getCode() : 0; }

protected:
    void gotFailure(const boost::shared_ptr<Zel_Error>& error)
    {
        failures.push_back(error);
        Console::instance().answer(QStringLiteral("failed: ") + errorHeadline(error));
        if (error)
            Console::instance().detail(error->getMsg());
    }
    void gotFinished()
    {
        ++finishedCalls;
        Console::instance().answer(QStringLiteral("finished"));
    }
};

// Login: one answer, the name of the user the server knows; no end notice.
class LoginAnswers : public Zel_LoginCB, public Answers
{
public:
    QStringList users;

    void succeeded(QString userName) override
    {
        users << userName;
        Console::instance().answer(QStringLiteral("succeeded: logged in as ") + quoted(userName));
    }
    void failed(boost::shared_ptr<Zel_Error> error) override { gotFailure(error); }
};

// Start-up after login: one outcome; no end notice.
class StartupAnswers : public Zel_StartupCB, public Answers
{
public:
    int succeededCalls = 0;

    void succeeded() override
    {
        ++succeededCalls;
        Console::instance().answer(QStringLiteral("succeeded: the session is ready for work"));
    }
    void failed(boost::shared_ptr<Zel_Error> error) override { gotFailure(error); }
};

// The root node of the tree; no end notice.
class RootAnswers : public Zel_RootNodeCB, public Answers
{
public:
    std::vector<boost::shared_ptr<Zel_Node>> nodes;

    void succeeded(boost::shared_ptr<Zel_Node> root) override { nodes.push_back(root); }
    void failed(boost::shared_ptr<Zel_Error> error) override { gotFailure(error); }
};

// The children of a folder, each with its has-children flag. The browse step
// prints them as an outline once the folder is complete, so these handlers
// only keep what they receive.
class ChildrenAnswers : public Zel_ChildrenCB, public Answers
{
public:
    std::vector<boost::shared_ptr<Zel_Node>> nodes;
    std::vector<bool> hasChildren;

    void succeeded(boost::shared_ptr<Zel_Node> node, bool flag) override
    {
        nodes.push_back(node);
        hasChildren.push_back(flag);
    }
    // The other kind of answer (pairs of nodes) is not used for children.
    void succeeded(boost::shared_ptr<Zel_Node> first, boost::shared_ptr<Zel_Node> second) override
    {
        Console::instance().answer(QStringLiteral("succeeded (pair): ") + describeNode(first) + QStringLiteral(", ")
                                   + describeNode(second));
    }
    void failed(boost::shared_ptr<Zel_Node> node, boost::shared_ptr<Zel_Error> error) override
    {
        Q_UNUSED(node);
        gotFailure(error);
    }
    void finished() override { ++finishedCalls; }
};

// Property lists, shown as a table: the name users see, the value, the key.
class PropertyAnswers : public Zel_PropertyListCB, public Answers
{
public:
    std::vector<Zel_PropertyList> lists;

    void succeeded(Zel_PropertyList properties) override
    {
        lists.push_back(properties);
        Console& out = Console::instance();
        out.answer(QStringLiteral("succeeded: %1 properties").arg(properties.size()));
        out.detail(QStringLiteral("%1 %2 %3").arg(QStringLiteral("Shown as").leftJustified(16),
                                                     QStringLiteral("Value").leftJustified(40), QStringLiteral("Key")));
        for (const Zel_Property& p : properties) {
            // Questions about the key go to the property manager the session registered.
            const QString shown = p.displayName();
            QString key = p.key();
            if (!p.isModifiable())
                key += QStringLiteral(", read-only");
            out.detail(QStringLiteral("%1 %2 %3")
                           .arg((shown.isEmpty() ? p.key() : shown).leftJustified(16), p.value().leftJustified(40), key));
        }
    }
    void failed(boost::shared_ptr<Zel_Error> error) override { gotFailure(error); }
    void finished() override { gotFinished(); }
};

// Every callback whose answer is a node (created folders and clips, renamed
// nodes, nodes found by a query, ...): Base is its callback class.
template <class Base>
class NodeAnswers : public Base, public Answers
{
public:
    enum Show { ShowMoniker, ShowPath };

    explicit NodeAnswers(Show show = ShowMoniker) : mShow(show) {}

    std::vector<boost::shared_ptr<Zel_Node>> nodes;

    void succeeded(boost::shared_ptr<Zel_Node> node) override
    {
        nodes.push_back(node);
        QString text = QStringLiteral("succeeded: ") + describeNode(node);
        if (node && mShow == ShowMoniker)
            text += QLatin1Char(' ') + node->getMoniker();
        else if (node)
            text += QStringLiteral(" in ") + node->getPath().toZelString(QStringLiteral("/"));
        Console::instance().answer(text);
    }
    void failed(boost::shared_ptr<Zel_Error> error) override { gotFailure(error); }
    void finished() override { gotFinished(); }

private:
    Show mShow;
};

// Every callback whose answer only says "done" (reservations, stored settings).
template <class Base>
class DoneAnswers : public Base, public Answers
{
public:
    explicit DoneAnswers(const QString& what) : mWhat(what) {}

    int succeededCalls = 0;

    void succeeded() override
    {
        ++succeededCalls;
        Console::instance().answer(QStringLiteral("succeeded: ") + mWhat);
    }
    void failed(boost::shared_ptr<Zel_Error> error) override { gotFailure(error); }
    void finished() override { gotFinished(); }

private:
    QString mWhat;
};

// Every callback whose answer is one text (application settings, ...).
template <class Base>
class TextAnswers : public Base, public Answers
{
public:
    QStringList texts;

    void succeeded(QString text) override
    {
        texts << text;
        Console::instance().answer(QStringLiteral("succeeded:"));
        Console::instance().block(text);
    }
    void failed(boost::shared_ptr<Zel_Error> error) override { gotFailure(error); }
    void finished() override { gotFinished(); }
};

// The deletion of a single node: yes or no.
class BoolAnswers : public Zel_ResultBoolCB, public Answers
{
public:
    std::vector<bool> values;

    void succeeded(bool deleted) override
    {
        values.push_back(deleted);
        Console::instance().answer(deleted ? QStringLiteral("succeeded: deleted") : QStringLiteral("succeeded: not deleted"));
    }
    void failed(boost::shared_ptr<Zel_Error> error) override { gotFailure(error); }
    void finished() override { gotFinished(); }
};

// Check-in: one outcome per media object.
class CheckinAnswers : public Zel_CheckinCB, public Answers
{
public:
    struct CheckedIn {
        boost::shared_ptr<Zel_MobDesc> desc;
        boost::shared_ptr<Zel_Node> node;
    };
    std::vector<CheckedIn> checkedIn;
    std::vector<boost::shared_ptr<Zel_MobDesc>> refused;

    void succeeded(boost::shared_ptr<Zel_MobDesc> mobDesc, boost::shared_ptr<Zel_Node> node,
                   boost::shared_ptr<QString> text) override
    {
        checkedIn.push_back(CheckedIn{mobDesc, node});
        Console::instance().answer(QStringLiteral("succeeded: %1 %2").arg(describeNode(node), node ? node->getMoniker() : QString()));
        Console::instance().detail(QStringLiteral("from %1: %2").arg(mobDesc ? mobDesc->getAAFFilePath() : QString(),
                                                                     text ? *text : QString()));
    }
    void failed(boost::shared_ptr<Zel_MobDesc> mobDesc, boost::shared_ptr<Zel_Error> error) override
    {
        refused.push_back(mobDesc);
        failures.push_back(error);
        Console::instance().answer(QStringLiteral("failed: %1 for %2").arg(errorHeadline(error), mobDesc ? mobDesc->getAAFFilePath() : QString()));
        if (error)
            Console::instance().detail(error->getMsg());
    }
    void finished() override { gotFinished(); }
};

// Reservations of a node: holder and end (an invalid end: until released).
class ReservationAnswers : public Zel_GetReservationsCB, public Answers
{
public:
    QStringList holders;

    void succeeded(QString text, QDateTime dateTime) override
    {
        holders << text;
        Console::instance().answer(QStringLiteral("succeeded: reserved by %1 %2")
                                       .arg(quoted(text), dateTime.isValid()
                                                              ? QStringLiteral("until ") + dateTime.toUTC().toString(Qt::ISODate)
                                                              : QStringLiteral("until released")));
    }
    void failed(boost::shared_ptr<Zel_Error> error) override { gotFailure(error); }
    void finished() override { gotFinished(); }
};

// A deletion: totals, and outcomes per media object on the server and here.
class DeleteAnswers : public Zel_DeleteCB, public Answers
{
public:
    enum Kind { AssetTotal, MetadataTotal, MetadataError, RemoteMediaDeleted, RemoteMediaError, LocalMediaDeleted,
                LocalMediaError, LocalMobNotFound, WholeError };
    struct Outcome {
        Kind kind;
        long count;
        QString mobID; // the MobID, or the first text of the texts kinds
        boost::shared_ptr<Zel_Error> error;
    };
    std::vector<Outcome> outcomes;

    int countOf(Kind kind) const
    {
        int n = 0;
        for (const Outcome& o : outcomes)
            n += o.kind == kind;
        return n;
    }
    bool has(Kind kind, const QString& mobID) const
    {
        for (const Outcome& o : outcomes) {
            if (o.kind == kind && o.mobID == mobID)
                return true;
        }
        return false;
    }
    long total(Kind kind) const
    {
        for (const Outcome& o : outcomes) {
            if (o.kind == kind)
                return o.count;
        }
        return -1;
    }

    void remoteAssetDeleteSuccessTotalResult(long count) override
    {
        add(AssetTotal, count, QString(), boost::shared_ptr<Zel_Error>(),
            QStringLiteral("remote assets deleted: %1").arg(count));
    }
    void remoteMetadataDeleteSuccessTotalResult(long count) override
    {
        add(MetadataTotal, count, QString(), boost::shared_ptr<Zel_Error>(),
            QStringLiteral("remote metadata records deleted: %1").arg(count));
    }
    void remoteMetadataDeleteErrorPartialResult(boost::shared_ptr<Zel_MobID> mobID, boost::shared_ptr<Zel_Error> error) override
    {
        add(MetadataError, 0, mob(mobID), error, QStringLiteral("metadata of %1 not deleted").arg(mob(mobID)));
        Console::instance().detail(describeError(error));
    }
    void remoteMediaDeleteSuccessPartialResult(boost::shared_ptr<Zel_MobID> mobID) override
    {
        add(RemoteMediaDeleted, 0, mob(mobID), boost::shared_ptr<Zel_Error>(),
            QStringLiteral("media of %1 deleted on the server").arg(mob(mobID)));
    }
    void remoteMediaDeleteErrorPartialResult(boost::shared_ptr<QString> text1, boost::shared_ptr<QString> text2,
                                             boost::shared_ptr<QString> text3, boost::shared_ptr<QString> text4,
                                             boost::shared_ptr<QString> text5, boost::shared_ptr<Zel_Error> error) override
    {
        add(RemoteMediaError, 0, text(text1), error,
            QStringLiteral("media not deleted on the server: %1").arg(texts({text1, text2, text3, text4, text5}, error)));
        Console::instance().detail(describeError(error));
    }
    void localDeleteMediaSuccessPartialResult(boost::shared_ptr<Zel_MobID> mobID) override
    {
        add(LocalMediaDeleted, 0, mob(mobID), boost::shared_ptr<Zel_Error>(),
            QStringLiteral("media of %1 deleted on this machine").arg(mob(mobID)));
    }
    void localDeleteMediaErrorPartialResult(boost::shared_ptr<QString> text1, boost::shared_ptr<QString> text2,
                                            boost::shared_ptr<QString> text3, boost::shared_ptr<QString> text4,
                                            boost::shared_ptr<Zel_Error> error) override
    {
        add(LocalMediaError, 0, text(text1), error,
            QStringLiteral("media not deleted on this machine: %1").arg(texts({text1, text2, text3, text4}, error)));
        Console::instance().detail(describeError(error));
    }
    void localDeleteMobNotFoundErrorPartialResult(boost::shared_ptr<Zel_MobID> mobID, boost::shared_ptr<Zel_Error> error) override
    {
        add(LocalMobNotFound, 0, mob(mobID), error, QStringLiteral("no media of %1 on this machine").arg(mob(mobID)));
        Console::instance().detail(describeError(error));
    }
    void errorResult(boost::shared_ptr<Zel_Error> error) override
    {
        failures.push_back(error);
        add(WholeError, 0, QString(), error, QStringLiteral("error: ") + errorHeadline(error));
        if (error)
            Console::instance().detail(error->getMsg());
    }
    void finished() override { gotFinished(); }

private:
    static QString mob(const boost::shared_ptr<Zel_MobID>& mobID) { return mobID ? mobID->toZelString() : QString(); }
    static QString text(const boost::shared_ptr<QString>& t) { return t ? *t : QString(); }
    // The backend's texts, joined; one that repeats the error's message is left out.
    static QString texts(std::initializer_list<boost::shared_ptr<QString>> list, const boost::shared_ptr<Zel_Error>& error)
    {
        QStringList parts;
        for (const boost::shared_ptr<QString>& t : list) {
            if (!(t && error && *t == error->getMsg()))
                parts << text(t);
        }
        return parts.join(QStringLiteral(" | "));
    }

    void add(Kind kind, long count, const QString& mobID, const boost::shared_ptr<Zel_Error>& error, const QString& line)
    {
        outcomes.push_back(Outcome{kind, count, mobID, error});
        Console::instance().answer(line);
    }
};

// User settings: the kind and the XML text.
class UserSettingsAnswers : public Zel_GetUserSettingsCB, public Answers
{
public:
    QStringList texts;

    void succeeded(UserSettingsType type, QString settings) override
    {
        texts << settings;
        Console::instance().answer(QStringLiteral("succeeded: %1 settings:").arg(typeName(type)));
        Console::instance().block(settings);
    }
    void failed(boost::shared_ptr<Zel_Error> error) override { gotFailure(error); }
    void finished() override { gotFinished(); }

    static QString typeName(UserSettingsType type)
    {
        switch (type) {
        case UserSettingsGeneral: return QStringLiteral("general");
        case UserSettingsProject: return QStringLiteral("project");
        case UserSettingsSite: return QStringLiteral("site");
        default: return QStringLiteral("unknown (%1)").arg(static_cast<int>(type));
        }
    }
};

// The permissions of the logged-in user on one node; printed by the step, in
// the order of the tree.
class PermissionAnswers : public Zel_NodePermissionsCB, public Answers
{
public:
    std::vector<boost::shared_ptr<Zel_NodePermissions>> permissions;

    void succeeded(boost::shared_ptr<Zel_NodePermissions> p) override { permissions.push_back(p); }
    void failed(boost::shared_ptr<Zel_Error> error) override { gotFailure(error); }
    void finished() override { ++finishedCalls; }
};

// News about the connection.
class ConnectionWatch : public Zel_StatusNotificationCB
{
public:
    QStringList heard;

    void connected() override
    {
        heard << QStringLiteral("connected");
        Console::instance().event(QStringLiteral("status: connected (the connection is back)"));
    }
    void disconnected() override
    {
        heard << QStringLiteral("disconnected");
        Console::instance().event(QStringLiteral("status: disconnected (the connection is lost, reconnecting)"));
    }
};

// A folder listener: hears children added to, removed from and updated in
// one folder. Registered with the session on construction, unregistered on
// destruction.
class FolderWatch : public Zel_IEventListenerFolder
{
public:
    struct Heard {
        QString kind; // "added", "removed", "updated"
        QString parent;
        QString child;
    };

    // names: the names the tour knows for monikers, to print events readably.
    FolderWatch(boost::shared_ptr<QString> folderMoniker, const QString& folderName,
                boost::shared_ptr<Zel_Session> session, const QHash<QString, QString>* names)
        : Zel_IEventListenerFolder(folderMoniker, 1 | 2 | 4, session)
        , mFolderName(folderName)
        , mNames(names)
    {
    }

    std::vector<Heard> heard;

    void childAdded(boost::shared_ptr<QString> parentMoniker, boost::shared_ptr<QString> childMoniker) override
    {
        hear(QStringLiteral("added"), parentMoniker, childMoniker);
    }
    void childRemoved(boost::shared_ptr<QString> parentMoniker, boost::shared_ptr<QString> childMoniker) override
    {
        hear(QStringLiteral("removed"), parentMoniker, childMoniker);
    }
    void childUpdated(boost::shared_ptr<QString> parentMoniker, boost::shared_ptr<QString> childMoniker) override
    {
        hear(QStringLiteral("updated"), parentMoniker, childMoniker);
    }

private:
    void hear(const QString& kind, const boost::shared_ptr<QString>& parent, const boost::shared_ptr<QString>& child)
    {
        const QString childText = child ? *child : QString();
        heard.push_back(Heard{kind, parent ? *parent : QString(), childText});
        QString line = QStringLiteral("event in %1: child %2: %3").arg(quoted(mFolderName), kind, childText);
        const QString name = mNames ? mNames->value(childText) : QString();
        if (!name.isEmpty())
            line += QStringLiteral(" (") + quoted(name) + QLatin1Char(')');
        Console::instance().event(line);
    }

    QString mFolderName;
    const QHash<QString, QString>* mNames;
};

#endif
