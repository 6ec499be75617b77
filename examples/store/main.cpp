// zel-store: moves asset trees between stores and tells what a store holds.
//
//   zel-store import [--replace] FILE.json URL   a tree file into a store
//   zel-store export URL FILE.json               a store into a tree file
//   zel-store info URL                           the store's kind, schema and counts
//
// It works through Zel_Store, over the backend's storage interface, so every
// kind of store (memory:FILE.json, sqlite:PATH, postgresql://...) is read and
// written alike; a tree file exported, imported and exported again is the
// same bytes.
#include "Zel_MemoryTree.h"
#include "Zel_Store.h"

#include "zel_version.h"

#include <QFile>
#include <QSaveFile>
#include <QString>
#include <QStringList>

#include <cstdio>

namespace {

const char* const kUsage =
    "Usage: zel-store import [--replace] FILE.json URL\n"
    "       zel-store export URL FILE.json\n"
    "       zel-store info URL\n"
    "\n"
    "Moves asset trees of the zel backend between stores and tells what a store holds.\n"
    "\n"
    "  import    puts the tree of FILE.json (the JSON form zel-demo --write-sample and\n"
    "            export write) into the store URL names; a store that holds a tree\n"
    "            already is refused unless --replace is given, which replaces it whole\n"
    "  export    writes the whole store URL names to FILE.json\n"
    "  info      prints the store's kind, its schema version (where it has one) and\n"
    "            the counts of its nodes, users, property keys and settings\n"
    "\n"
    "Store URLs:\n"
    "  memory:FILE.json                     a tree file (import writes it, created when\n"
    "                                       missing); memory: alone is the bundled sample\n"
    "  sqlite:PATH                          a SQLite file\n"
    "  postgresql://USER@HOST:PORT/DATABASE a PostgreSQL database (libpq's URL and PG*\n"
    "                                       environment variables)\n"
    "\n"
    "Exit status: 0 on success, 1 when the store or the file refused the work (the\n"
    "reason is printed), 2 for a bad command line.\n";

int usageError(const QString& message)
{
    std::fprintf(stderr, "zel-store: %s\nTry 'zel-store --help'.\n", message.toLocal8Bit().constData());
    return 2;
}

int failure(const QString& message)
{
    std::fprintf(stderr, "zel-store: %s\n", message.toLocal8Bit().constData());
    return 1;
}

QString arg(char** argv, int i)
{
    return QString::fromLocal8Bit(argv[i]);
}

int importTree(const QString& file, const QString& url, bool replace)
{
    QFile in(file);
    if (!in.open(QIODevice::ReadOnly))
        return failure(QStringLiteral("%1: cannot be read: %2").arg(file, in.errorString()));
    const QByteArray json = in.readAll();
    QString error;
    const boost::shared_ptr<Zel_Store> store = Zel_Store::open(url, &error, Zel_Store::CreateMissingFile);
    if (!store)
        return failure(error);
    if (!store->importJson(json, file, replace, &error)) {
        if (!replace && error.endsWith(QLatin1String("nodes)")))
            error += QStringLiteral("; --replace replaces it");
        return failure(error);
    }
    if (!store->save(&error))
        return failure(error);
    Zel_Store::Counts counts;
    if (!store->counts(counts, &error))
        return failure(error);
    std::printf("zel-store: imported %s into %s: %d nodes, %d users, %d keys, %d settings\n",
                file.toLocal8Bit().constData(), store->url().toLocal8Bit().constData(), counts.nodes, counts.users,
                counts.keys, counts.settings);
    if (store->kind() == Zel_Store::Memory && store->url() == QLatin1String("memory:"))
        std::printf("zel-store: memory: lives only in this process; the import is gone with it\n");
    return 0;
}

int exportTree(const QString& url, const QString& file)
{
    QString error;
    const boost::shared_ptr<Zel_Store> store = Zel_Store::open(url, &error);
    if (!store)
        return failure(error);
    const QByteArray json = store->exportJson(&error);
    if (json.isEmpty())
        return failure(error);
    QSaveFile out(file);
    if (!out.open(QIODevice::WriteOnly) || out.write(json) != json.size() || !out.commit())
        return failure(QStringLiteral("%1: cannot be written: %2").arg(file, out.errorString()));
    std::printf("zel-store: exported %s to %s\n", store->url().toLocal8Bit().constData(),
                file.toLocal8Bit().constData());
    return 0;
}

int info(const QString& url)
{
    QString error;
    const boost::shared_ptr<Zel_Store> store = Zel_Store::open(url, &error);
    if (!store)
        return failure(error);
    Zel_Store::Counts counts;
    if (!store->counts(counts, &error))
        return failure(error);
    std::printf("store:    %s\n", store->url().toLocal8Bit().constData());
    std::printf("kind:     %s\n", store->kindName().toLocal8Bit().constData());
    std::printf("server:   %s\n", store->serverName().toLocal8Bit().constData());
    if (store->schemaVersion() > 0)
        std::printf("schema:   version %d\n", store->schemaVersion());
    else
        std::printf("schema:   none (a tree held in memory)\n");
    std::printf("nodes:    %d\nusers:    %d\nkeys:     %d\nsettings: %d\n", counts.nodes, counts.users, counts.keys,
                counts.settings);
    return 0;
}

} // namespace

int main(int argc, char** argv)
{
    if (argc < 2)
        return usageError(QStringLiteral("a command is needed: import, export or info"));
    const QString command = arg(argv, 1);
    if (command == QLatin1String("-h") || command == QLatin1String("--help")) {
        std::fputs(kUsage, stdout);
        return 0;
    }
    if (command == QLatin1String("--version")) {
        std::printf("zel-store %s\n", ZEL_VERSION_STRING);
        return 0;
    }
    if (command == QLatin1String("import")) {
        bool replace = false;
        QStringList operands;
        for (int i = 2; i < argc; ++i) {
            if (arg(argv, i) == QLatin1String("--replace"))
                replace = true;
            else
                operands << arg(argv, i);
        }
        if (operands.size() != 2)
            return usageError(QStringLiteral("import needs a tree file and a store URL"));
        return importTree(operands[0], operands[1], replace);
    }
    if (command == QLatin1String("export")) {
        if (argc != 4)
            return usageError(QStringLiteral("export needs a store URL and a tree file"));
        return exportTree(arg(argv, 2), arg(argv, 3));
    }
    if (command == QLatin1String("info")) {
        if (argc != 3)
            return usageError(QStringLiteral("info needs a store URL"));
        return info(arg(argv, 2));
    }
    return usageError(QStringLiteral("unknown command '%1'").arg(command));
}
