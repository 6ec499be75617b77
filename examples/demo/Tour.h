// Tour: the steps of the demo, each a small piece of an application.
//
// The tour works through the public interface only: it obtains every request
// from the session (Zel_Session's factories), submits it, lets the engine
// deliver the answers to its callbacks on this thread, and checks that each
// step received the answers it expected. Which nodes it works on it learns by
// browsing, so it tours any tree: the clip with the most properties is the
// showcase clip, the project that holds it the working project.
#ifndef ZEL_DEMO_TOUR_H
#define ZEL_DEMO_TOUR_H

#include "DemoCallbacks.h"

#include <QHash>
#include <QList>
#include <QString>
#include <QStringList>
#include <boost/shared_ptr.hpp>

#include <functional>
#include <memory>
#include <vector>

class Orv_Engine;
class Orv_Request;
class Zel_MemorySession;
class Zel_SettingList;

class Tour
{
public:
    Tour(Orv_Engine& engine, boost::shared_ptr<Zel_MemorySession> session, const QString& user, const QString& password);
    ~Tour();

    // Runs every step; 0 when each got the answers it expected, 1 otherwise.
    int run();

private:
    Tour(const Tour&) = delete;
    Tour& operator=(const Tour&) = delete;

    struct Visited {
        boost::shared_ptr<Zel_Node> node;
        int depth;
        boost::shared_ptr<Zel_Node> topLevel; // the child of the root it lies in (none for the root)
    };
    struct Failed {
        int number;
        QString title;
        QStringList problems;
    };

    // The steps; false when the tour cannot go on without what the step failed to get.
    bool logIn();
    bool browse();
    bool properties();
    bool watchBin();
    bool checkIn();
    bool reserve();
    bool deleteAssets();
    bool settings();
    bool query();
    bool permissions();
    bool connection();

    void browseFolder(const boost::shared_ptr<Zel_Node>& folder, int depth, const boost::shared_ptr<Zel_Node>& topLevel,
                      int& requests);

    // Submits a request made by the session and delivers every answer; false
    // (a failed check) when the session made none or refused it.
    bool send(const boost::shared_ptr<Orv_Request>& request, const QString& line);
    // A check: records and prints the expectation when it does not hold.
    bool expect(bool condition, const QString& expectation);
    // The folder events a watch heard since `from`, compared with the expected
    // (kind, child moniker) pairs.
    void expectEvents(const FolderWatch* watch, std::size_t from, const QString& parent,
                      const QList<QPair<QString, QString>>& expected);
    // The settings an XML text holds, compared with the list that was written.
    void expectSettings(const QString& xml, const Zel_SettingList& written);
    void remember(const boost::shared_ptr<Zel_Node>& node);
    QString nameOf(const boost::shared_ptr<Zel_Node>& node) const;
    boost::shared_ptr<QString> monikerOf(const boost::shared_ptr<Zel_Node>& node) const;

    Orv_Engine& mEngine;
    boost::shared_ptr<Zel_MemorySession> mSession;
    QString mUser;
    QString mPassword;

    QStringList mProblems; // of the running step
    std::vector<Failed> mFailed;

    QHash<QString, QString> mNames; // moniker -> name, for printing events
    QList<Visited> mBrowsed;        // the tree in browse order, root first
    boost::shared_ptr<Zel_Node> mRoot;
    boost::shared_ptr<Zel_Node> mShowcase;      // the media node with the most properties
    boost::shared_ptr<Zel_Node> mProject;       // where the tour creates its bin
    boost::shared_ptr<Zel_Node> mOtherReserved; // a node reserved by another user, if any
    boost::shared_ptr<Zel_Node> mDemoBin;
    boost::shared_ptr<Zel_Node> mStreetInterview;
    std::vector<boost::shared_ptr<Zel_Node>> mCheckedIn;

    boost::shared_ptr<ConnectionWatch> mConnection;
    std::unique_ptr<FolderWatch> mProjectWatch;
    std::unique_ptr<FolderWatch> mBinWatch;
};

#endif
