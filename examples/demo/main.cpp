// zel-demo: a guided tour of the zel client library.
//
// The demo is an application in miniature. It builds the in-memory backend's
// session over an asset tree (the bundled sample, or a tree file), runs every
// request on the worker threads of an Orv_Engine, delivers the answers on the
// main thread, and prints what its callbacks and listeners receive. Each step
// checks its answers; the exit status says whether all of them were right.
#include "Console.h"
#include "Tour.h"

#include "Zel_MemorySession.h"
#include "Zel_MemoryTree.h"
#include "Zel_Store.h"
#include "Zel_IEventListenerFolder.h"
#include "Zel_LoginCB.h"
#include "Zel_LoginReq.h"
#include "Zel_Error.h"

#include "Orv.h"
#include "Orv_Engine.h"
#include "Zel_Debug.h"

#include <QString>
#include <QStringList>
#include "zel_version.h"

#include <QtGlobal>
#include <boost/make_shared.hpp>

#include <chrono>
#include <csignal>
#include <cstdio>
#include <thread>

namespace {

const char* const kUsage =
    "Usage: zel-demo [--store URL | --tree FILE] [--user NAME] [--password TEXT] [--trace]\n"
    "       zel-demo --watch URL [--user NAME] [--password TEXT]\n"
    "       zel-demo --write-sample FILE\n"
    "\n"
    "A guided tour of zel, the client interface through which a media-editing\n"
    "application works with a media asset-management server. The server here is\n"
    "the backend (Zel::memory), running in this process over a store: the bundled\n"
    "sample tree held in memory unless --store names another.\n"
    "\n"
    "The demo acts as an application would: it logs in, browses the asset tree,\n"
    "reads properties, watches a bin while it creates, renames and deletes bins\n"
    "and clips, checks media in, reserves and releases a clip, deletes assets with\n"
    "their media, reads and writes settings, searches, shows permissions, and\n"
    "rides out a lost connection. It prints every answer its callbacks receive and\n"
    "checks each step's answers.\n"
    "\n"
    "Options:\n"
    "  --store URL          tour the store URL names: memory: (the bundled sample,\n"
    "                       the default), memory:FILE.json (a tree file, read into\n"
    "                       memory), sqlite:PATH (a SQLite file shared by processes),\n"
    "                       postgresql://USER@HOST:PORT/DATABASE (a PostgreSQL database)\n"
    "  --watch URL          do not tour: watch every folder of the store URL names and\n"
    "                       print each change event heard, until interrupted (Ctrl-C).\n"
    "                       Run it beside a tour of a SQLite or PostgreSQL store to see\n"
    "                       the tour's changes as they happen; a memory: store lives in\n"
    "                       its own process, so a watcher of one hears only itself\n"
    "                       (that is, nothing)\n"
    "  --tree FILE          tour the asset tree in FILE (JSON, the form\n"
    "                       Zel_MemoryTree saves) instead of the bundled sample\n"
    "  --user NAME          log in as NAME (default: editor; the sample tree's users\n"
    "                       are admin, editor, producer and assistant, who may only read)\n"
    "  --password TEXT      log in with TEXT (default: the user name, as in the sample)\n"
    "  --trace              turn the library's trace log on and print its lines\n"
    "  --write-sample FILE  write the bundled sample tree to FILE, to edit and tour\n"
    "  --version            print the version of zel the demo was built with\n"
    "  -h, --help           show this help\n"
    "\n"
    "Exit status: 0 when every step got the answers it expected; 1 when one did not\n"
    "(the step and what it expected are printed); 2 for a bad command line or a\n"
    "tree file or store that cannot be opened.\n";

struct Options {
    QString storeUrl;
    QString watchUrl;
    QString treeFile;
    QString writeSample;
    QString user = QStringLiteral("editor");
    QString password;
    bool passwordGiven = false;
    bool trace = false;
    bool help = false;
    bool version = false;
};

int usageError(const QString& message)
{
    std::fprintf(stderr, "zel-demo: %s\nTry 'zel-demo --help'.\n", message.toLocal8Bit().constData());
    return 2;
}

// Parses the command line into options; an empty error text means success.
QString parse(int argc, char** argv, Options& options)
{
    for (int i = 1; i < argc; ++i) {
        const QString arg = QString::fromLocal8Bit(argv[i]);
        auto value = [&](QString& into) {
            if (i + 1 >= argc)
                return false;
            into = QString::fromLocal8Bit(argv[++i]);
            return true;
        };
        if (arg == QLatin1String("-h") || arg == QLatin1String("--help")) {
            options.help = true;
        } else if (arg == QLatin1String("--version")) {
            options.version = true;
        } else if (arg == QLatin1String("--trace")) {
            options.trace = true;
        } else if (arg == QLatin1String("--tree")) {
            if (!value(options.treeFile) || options.treeFile.isEmpty())
                return QStringLiteral("--tree needs a file name");
        } else if (arg == QLatin1String("--store")) {
            if (!value(options.storeUrl) || options.storeUrl.isEmpty())
                return QStringLiteral("--store needs a store URL");
        } else if (arg == QLatin1String("--watch")) {
            if (!value(options.watchUrl) || options.watchUrl.isEmpty())
                return QStringLiteral("--watch needs a store URL");
        } else if (arg == QLatin1String("--write-sample")) {
            if (!value(options.writeSample) || options.writeSample.isEmpty())
                return QStringLiteral("--write-sample needs a file name");
        } else if (arg == QLatin1String("--user")) {
            if (!value(options.user) || options.user.isEmpty())
                return QStringLiteral("--user needs a name");
        } else if (arg == QLatin1String("--password")) {
            if (!value(options.password))
                return QStringLiteral("--password needs a text");
            options.passwordGiven = true;
        } else {
            return QStringLiteral("unknown argument '%1'").arg(arg);
        }
    }
    if (!options.passwordGiven)
        options.password = options.user;
    const int sources = int(!options.storeUrl.isEmpty()) + int(!options.treeFile.isEmpty()) + int(!options.watchUrl.isEmpty());
    if (sources > 1)
        return QStringLiteral("--store, --tree and --watch exclude each other");
    return QString();
}

// With --trace, the trace lines reach the demo twice: through Orv::log (which
// the demo prints in the flow of the tour) and as Qt debug messages. The
// latter are dropped; Qt's warnings still go to stderr.
void qtMessages(QtMsgType type, const QMessageLogContext&, const QString& message)
{
    if (type == QtDebugMsg || type == QtInfoMsg)
        return;
    Console::instance().qtMessage(message);
}

volatile std::sig_atomic_t gInterrupted = 0;

void interrupt(int)
{
    gInterrupted = 1;
}

// Prints every change event of every folder it hears.
class Watcher : public Zel_IEventListenerFolder
{
public:
    explicit Watcher(boost::shared_ptr<Zel_Session> session)
        : Zel_IEventListenerFolder(boost::shared_ptr<QString>(), 7, session)
    {
    }
    ~Watcher() override { unregisterEventListener(); }
    void childAdded(boost::shared_ptr<QString> parent, boost::shared_ptr<QString> child) override
    {
        print("added", parent, child);
    }
    void childRemoved(boost::shared_ptr<QString> parent, boost::shared_ptr<QString> child) override
    {
        print("removed", parent, child);
    }
    void childUpdated(boost::shared_ptr<QString> parent, boost::shared_ptr<QString> child) override
    {
        print("updated", parent, child);
    }

private:
    static void print(const char* what, const boost::shared_ptr<QString>& parent, const boost::shared_ptr<QString>& child)
    {
        std::printf("~~ %s %s in %s\n", what, child ? child->toLocal8Bit().constData() : "?",
                    parent ? parent->toLocal8Bit().constData() : "?");
        std::fflush(stdout);
    }
};

struct WatchLogin : Zel_LoginCB {
    QString user;
    QString error;
    bool answered = false;
    void succeeded(QString name) override
    {
        user = name;
        answered = true;
    }
    void failed(boost::shared_ptr<Zel_Error> e) override
    {
        error = e ? e->getMsg() : QStringLiteral("no reason given");
        answered = true;
    }
};

// --watch: logs in to the store and prints what it hears until interrupted.
int watch(const Options& options)
{
    // From the start: an interrupt that comes early still ends the watch in
    // order (after the first line), never half way.
    std::signal(SIGINT, interrupt);
    std::signal(SIGTERM, interrupt);
    QString why;
    const boost::shared_ptr<Zel_Store> store = Zel_Store::open(options.watchUrl, &why);
    if (!store) {
        std::fprintf(stderr, "zel-demo: cannot open the store: %s\n", why.toLocal8Bit().constData());
        return 2;
    }
    Orv_Engine engine(1);
    int status = 0;
    {
        boost::shared_ptr<Zel_MemorySession> session =
            boost::make_shared<Zel_MemorySession>(store, &engine, QStringLiteral("zel-demo"));
        boost::shared_ptr<WatchLogin> login = boost::make_shared<WatchLogin>();
        session->submitRequest(session->makeLoginReqSP(options.user, options.password,
                                                       boost::shared_ptr<Zel_LoginCredentials>(), login));
        engine.DeliverAll();
        if (login->user.isEmpty()) {
            std::fprintf(stderr, "zel-demo: cannot log in as %s: %s\n", options.user.toLocal8Bit().constData(),
                         login->error.toLocal8Bit().constData());
            status = 1;
        } else {
            std::printf("zel-demo: watching every folder of %s (%s) as %s; Ctrl-C ends\n",
                        store->url().toLocal8Bit().constData(), store->serverName().toLocal8Bit().constData(),
                        login->user.toLocal8Bit().constData());
            std::fflush(stdout);
            Watcher watcher(session);
            while (!gInterrupted) {
                engine.DeliverPending();
                std::this_thread::sleep_for(std::chrono::milliseconds(20));
            }
            engine.DeliverPending();
            std::printf("zel-demo: stopped watching\n");
        }
        session.reset();
        engine.DeliverAll();
    }
    return status;
}

} // namespace

int main(int argc, char** argv)
{
    Options options;
    const QString error = parse(argc, argv, options);
    if (!error.isEmpty())
        return usageError(error);
    if (options.help) {
        std::fputs(kUsage, stdout);
        return 0;
    }
    if (options.version) {
        std::printf("zel-demo %s\n", ZEL_VERSION_STRING);
        return 0;
    }
    if (!options.writeSample.isEmpty()) {
        QString why;
        if (!Zel_MemoryTree::sample()->saveFile(options.writeSample, &why)) {
            std::fprintf(stderr, "zel-demo: %s\n", why.toLocal8Bit().constData());
            return 2;
        }
        std::printf("zel-demo: wrote the sample tree to %s\n", options.writeSample.toLocal8Bit().constData());
        return 0;
    }

    if (!options.watchUrl.isEmpty())
        return watch(options);

    boost::shared_ptr<Zel_Store> store;
    if (!options.treeFile.isEmpty()) {
        QString why;
        const boost::shared_ptr<Zel_MemoryTree> tree = Zel_MemoryTree::fromFile(options.treeFile, &why);
        if (!tree) {
            std::fprintf(stderr, "zel-demo: cannot load the tree: %s\n", why.toLocal8Bit().constData());
            return 2;
        }
        store = Zel_Store::ofTree(tree);
    } else {
        QString why;
        store = Zel_Store::open(options.storeUrl.isEmpty() ? QStringLiteral("memory:") : options.storeUrl, &why);
        if (!store) {
            std::fprintf(stderr, "zel-demo: cannot open the store: %s\n", why.toLocal8Bit().constData());
            return 2;
        }
    }

    QtMessageHandler previousHandler = nullptr;
    if (options.trace) {
        previousHandler = qInstallMessageHandler(qtMessages);
        Orv::setLogHandler([](const char* line) { Console::instance().trace(line); });
        Zel_Debug::instance()->setEnabled(true);
    }

    Console& out = Console::instance();
    out.line(QStringLiteral("zel-demo: a tour of zel, the client interface to a media asset-management server"));
    if (const boost::shared_ptr<Zel_MemoryTree> tree = store->memoryTree()) {
        QString source = QStringLiteral("the bundled sample tree");
        if (!options.treeFile.isEmpty())
            source = QStringLiteral("the tree of ") + options.treeFile;
        else if (store->url() != QLatin1String("memory:"))
            source = QStringLiteral("the tree of ") + store->url().mid(7);
        out.line(QStringLiteral("Server:   %1, the in-memory backend,\n          with %2 (%3 nodes)")
                     .arg(quoted(tree->serverName()), source, QString::number(tree->nodeCount())));
    } else {
        out.line(QStringLiteral("Server:   %1, the backend over the %2 store %3")
                     .arg(quoted(store->serverName()), store->kindName(), store->url()));
    }

    int status = 0;
    {
        // Requests run on the engine's two worker threads; their answers are
        // delivered on this thread whenever the tour calls DeliverAll.
        Orv_Engine engine(2);
        out.line(QStringLiteral("Engine:   requests run on %1 worker threads of an Orv_Engine; answers are delivered on"
                                "\n          this thread (Orv_Engine::DeliverAll) to the application's callbacks.")
                     .arg(engine.workerCount()));
        out.line(QStringLiteral("Legend:   -> a request sent   <- an answer received   ~~ a notification heard"
                                "\n          !! an answer the tour did not expect"));
        boost::shared_ptr<Zel_MemorySession> session =
            boost::make_shared<Zel_MemorySession>(store, &engine, QStringLiteral("zel-demo"));
        {
            Tour tour(engine, session, options.user, options.password);
            status = tour.run();
        }
        session.reset();
        engine.DeliverAll();
    }

    if (options.trace) {
        Zel_Debug::instance()->setEnabled(false);
        Orv::setLogHandler(Orv::LogHandler());
        qInstallMessageHandler(previousHandler);
    }
    return status;
}
