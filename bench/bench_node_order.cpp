// Node ordering: std::sort of 100,000 nodes with Zel_Node::operator<, and
// Zel_NodeList::sortByOrder of the same nodes, against sorting the same nodes
// by keys read from them once, and against sorting bare (mime type rank,
// name) pairs.
//
// The nodes look like a large folder listing: mostly master clips, then
// sequences, subclips, bins, folders and a few other types; names such as
// "Interview 0042", "b-roll Take 7", "Café Scene 12 Shot 3" in mixed case,
// with exact duplicates (told apart by moniker). The "mixed" set replaces
// about one name in ten by a non-Latin-1 one (Cyrillic, Greek, Polish,
// Japanese).
//
// Rows (per set: latin1, mixed):
//   order/<set>/Zel_Node-operator</100000     std::sort(nodes, *a < *b), nodes behind
//                                             boost::shared_ptr<Zel_Node>
//   order/<set>/sortByOrder/100000            Zel_NodeList::sortByOrder of the same nodes:
//                                             reading the keys, sorting, placing the nodes
//   order/<set>/toLower-per-compare/100000    peer: sort of (rank, name) pairs comparing
//                                             a.name.toLower() < b.name.toLower()
//   order/<set>/precomputed-keys/100000       peer: what a user writes instead of operator<:
//                                             each node's key (rank, lowered name, name,
//                                             moniker) read once through the getters, the
//                                             (key, node) pairs sorted, the nodes put back
//   order/<set>/prelowered-keys/100000        floor: the sort alone of (rank, lowered name)
//                                             pairs made before the timing starts
//   order/<set>/getters+plain-compare/100000  floor of the node interface: the same nodes
//                                             sorted by getMimeType() then getName() with
//                                             plain QString <, i.e. the virtual calls and
//                                             QString copies every comparison must make
//
// Targets (per set): operator< at most 3x the precomputed-key peer;
// sortByOrder at most 1.3x it. operator< must make the virtual calls and
// QString copies of the getters floor on every comparison; sortByOrder reads
// the nodes once and then sorts keys of its own. The prelowered-keys floor,
// which never touches a node, is reported beside them.
#include "BenchSupport.h"

#include "Zel_MimeTypeSpec.h"
#include "Zel_Node.h"
#include "Zel_NodeList.h"

#include <QString>
#include <QStringList>
#include <boost/make_shared.hpp>
#include <boost/shared_ptr.hpp>

#include <algorithm>
#include <cstdint>
#include <cstdio>
#include <cstdlib>
#include <vector>

namespace {

const int kNodes = zelbench::size(100000, 1000);

// A backend's node in its simplest form: name and mime type held in memory.
class ListedNode : public Zel_Node
{
public:
    ListedNode(const QString& moniker, const QString& name, const QString& mimeType)
        : mName(name)
        , mMimeType(mimeType)
    {
        setMoniker(moniker);
    }

    QString getName() override { return mName; }
    QString getMimeType() override { return mMimeType; }

private:
    QString mName;
    QString mMimeType;
};

// A small deterministic generator, so that every run sorts the same input.
class Random
{
public:
    explicit Random(std::uint32_t seed)
        : mState(seed)
    {
    }
    std::uint32_t next()
    {
        mState = mState * 1664525u + 1013904223u;
        return mState >> 8;
    }
    int below(int bound) { return static_cast<int>(next() % static_cast<std::uint32_t>(bound)); }

private:
    std::uint32_t mState;
};

struct Listing
{
    std::vector<boost::shared_ptr<Zel_Node>> nodes;
    Zel_NodeList list;
    std::vector<QString> names;
    std::vector<long> ranks;
};

QString mimeTypeFor(Random& random)
{
    const int roll = random.below(100);
    if (roll < 50)
        return QStringLiteral("masterclip");
    if (roll < 55)
        return QStringLiteral("clip"); // same rank as masterclip
    if (roll < 70)
        return QStringLiteral("sequence");
    if (roll < 80)
        return QStringLiteral("subclip");
    if (roll < 88)
        return QStringLiteral("bin");
    if (roll < 94)
        return QStringLiteral("folder");
    if (roll < 97)
        return QStringLiteral("effect");
    return QStringLiteral("Asset");
}

QString latin1NameFor(Random& random)
{
    static const char* const stems[] = {
        "Interview", "interview", "INTERVIEW", "B-Roll Take", "b-roll take", "Scene", "scene",
        "Caf\xc3\xa9 Scene", "CAF\xc3\x89 SCENE", "\xc3\x9c" "ber Shot", "\xc3\xbc" "ber shot",
        "Se\xc3\xb1or Wide", "Archive", "archive", "\xc3\x89lan Final", "Promo", "Titles",
    };
    const int stem = random.below(static_cast<int>(sizeof stems / sizeof stems[0]));
    const QString base = QString::fromUtf8(stems[stem]);
    if (random.below(3) == 0)
        return QStringLiteral("%1 %2 Shot %3").arg(base).arg(random.below(60)).arg(random.below(12));
    return QStringLiteral("%1 %2").arg(base).arg(random.below(2000), 4, 10, QLatin1Char('0'));
}

QString otherNameFor(Random& random)
{
    static const char* const stems[] = {
        "\xd0\x98\xd0\xbd\xd1\x82\xd0\xb5\xd1\x80\xd0\xb2\xd1\x8c\xd1\x8e", // Интервью
        "\xd0\xb8\xd0\xbd\xd1\x82\xd0\xb5\xd1\x80\xd0\xb2\xd1\x8c\xd1\x8e", // интервью
        "\xce\xa3\xce\xba\xce\xb7\xce\xbd\xce\xae",                         // Σκηνή
        "\xc5\x81\xc3\xb3\x64\xc5\xba Plan",                                 // Łódź Plan
        "\xe5\xa0\xb4\xe9\x9d\xa2",                                          // 場面
    };
    const int stem = random.below(static_cast<int>(sizeof stems / sizeof stems[0]));
    return QStringLiteral("%1 %2").arg(QString::fromUtf8(stems[stem])).arg(random.below(2000), 4, 10, QLatin1Char('0'));
}

Listing makeListing(bool withNonLatin1)
{
    Random random(withNonLatin1 ? 20240611u : 19700101u);
    Listing listing;
    for (int i = 0; i < kNodes; ++i) {
        const QString mimeType = mimeTypeFor(random);
        const QString name = withNonLatin1 && random.below(10) == 0 ? otherNameFor(random) : latin1NameFor(random);
        listing.nodes.push_back(boost::make_shared<ListedNode>(
            QStringLiteral("zel://server/asset/%1").arg(i), name, mimeType));
        listing.list.append(listing.nodes.back());
        listing.names.push_back(name);
        listing.ranks.push_back(Zel_MimeTypeSpec::getSortOrder(mimeType));
    }
    return listing;
}

struct RankedName
{
    long rank;
    QString name;
};

std::vector<RankedName> rankedNames(const Listing& listing, bool lowered)
{
    std::vector<RankedName> entries;
    for (std::size_t i = 0; i < listing.names.size(); ++i)
        entries.push_back(RankedName{listing.ranks[i], lowered ? listing.names[i].toLower() : listing.names[i]});
    return entries;
}

void check(bool condition, const char* what)
{
    if (!condition) {
        std::fprintf(stderr, "bench_node_order: %s\n", what);
        std::exit(2);
    }
}

// The nodes agree with the peer's order on rank and lowered name.
template <class Nodes>
void checkOrder(const Nodes& nodes)
{
    for (int i = 1; i < static_cast<int>(nodes.size()); ++i) {
        const long rankA = Zel_MimeTypeSpec::getSortOrder(nodes[i - 1]->getMimeType());
        const long rankB = Zel_MimeTypeSpec::getSortOrder(nodes[i]->getMimeType());
        check(rankA < rankB || (rankA == rankB && nodes[i - 1]->getName().toLower() <= nodes[i]->getName().toLower()),
              "nodes out of order");
    }
}

void registerRows(const char* set, bool withNonLatin1)
{
    const std::string stem = std::string("order/") + set + "/";
    const std::string size = "/" + std::to_string(kNodes);
    const std::string feature = stem + "Zel_Node-operator<" + size;
    const std::string sortByOrder = stem + "sortByOrder" + size;
    const std::string peer = stem + "toLower-per-compare" + size;
    const std::string keyed = stem + "precomputed-keys" + size;
    const std::string floor = stem + "prelowered-keys" + size;
    const std::string gettersFloor = stem + "getters+plain-compare" + size;

    zelbench::row(feature, kNodes, [withNonLatin1](benchmark::State& state) {
        const Listing listing = makeListing(withNonLatin1);
        std::vector<boost::shared_ptr<Zel_Node>> nodes;
        for (auto _ : state) {
            state.PauseTiming();
            nodes = listing.nodes;
            state.ResumeTiming();
            std::sort(nodes.begin(), nodes.end(),
                      [](const boost::shared_ptr<Zel_Node>& a, const boost::shared_ptr<Zel_Node>& b) { return *a < *b; });
        }
        checkOrder(nodes);
    });
    zelbench::row(sortByOrder, kNodes, [withNonLatin1](benchmark::State& state) {
        const Listing listing = makeListing(withNonLatin1);
        Zel_NodeList nodes;
        for (auto _ : state) {
            state.PauseTiming();
            nodes = listing.list;
            nodes.detach();
            state.ResumeTiming();
            nodes.sortByOrder();
        }
        checkOrder(nodes);
    });
    zelbench::row(peer, kNodes, [withNonLatin1](benchmark::State& state) {
        const std::vector<RankedName> unsorted = rankedNames(makeListing(withNonLatin1), false);
        std::vector<RankedName> entries;
        for (auto _ : state) {
            state.PauseTiming();
            entries = unsorted;
            state.ResumeTiming();
            std::sort(entries.begin(), entries.end(), [](const RankedName& a, const RankedName& b) {
                if (a.rank != b.rank)
                    return a.rank < b.rank;
                return a.name.toLower() < b.name.toLower();
            });
        }
    });
    zelbench::row(keyed, kNodes, [withNonLatin1](benchmark::State& state) {
        struct Keyed
        {
            long rank;
            QString lowered;
            QString name;
            QString moniker;
            boost::shared_ptr<Zel_Node> node;
        };
        const Listing listing = makeListing(withNonLatin1);
        std::vector<boost::shared_ptr<Zel_Node>> nodes;
        std::vector<Keyed> keys;
        for (auto _ : state) {
            state.PauseTiming();
            nodes = listing.nodes;
            keys.clear();
            state.ResumeTiming();
            keys.reserve(nodes.size());
            for (boost::shared_ptr<Zel_Node>& node : nodes) {
                const QString name = node->getName();
                keys.push_back(Keyed{Zel_MimeTypeSpec::getSortOrder(node->getMimeType()), name.toLower(), name,
                                     node->getMoniker(), std::move(node)});
            }
            std::sort(keys.begin(), keys.end(), [](const Keyed& a, const Keyed& b) {
                if (a.rank != b.rank)
                    return a.rank < b.rank;
                if (a.lowered != b.lowered)
                    return a.lowered < b.lowered;
                if (a.name != b.name)
                    return a.name < b.name;
                return a.moniker < b.moniker;
            });
            for (std::size_t i = 0; i < keys.size(); ++i)
                nodes[i] = std::move(keys[i].node);
        }
        checkOrder(nodes);
    });
    zelbench::row(floor, kNodes, [withNonLatin1](benchmark::State& state) {
        const std::vector<RankedName> unsorted = rankedNames(makeListing(withNonLatin1), true);
        std::vector<RankedName> entries;
        for (auto _ : state) {
            state.PauseTiming();
            entries = unsorted;
            state.ResumeTiming();
            std::sort(entries.begin(), entries.end(), [](const RankedName& a, const RankedName& b) {
                if (a.rank != b.rank)
                    return a.rank < b.rank;
                return a.name < b.name;
            });
        }
    });
    zelbench::row(gettersFloor, kNodes, [withNonLatin1](benchmark::State& state) {
        const Listing listing = makeListing(withNonLatin1);
        std::vector<boost::shared_ptr<Zel_Node>> nodes;
        for (auto _ : state) {
            state.PauseTiming();
            nodes = listing.nodes;
            state.ResumeTiming();
            std::sort(nodes.begin(), nodes.end(), [](const boost::shared_ptr<Zel_Node>& a, const boost::shared_ptr<Zel_Node>& b) {
                const QString mimeA = a->getMimeType();
                const QString mimeB = b->getMimeType();
                if (mimeA != mimeB)
                    return mimeA < mimeB;
                return a->getName() < b->getName();
            });
        }
    });
    zelbench::target(std::string("node order: operator< sort, ") + set, feature, keyed, "peer", 3.0);
    zelbench::target(std::string("node order: sortByOrder, ") + set, sortByOrder, keyed, "peer", 1.3);
    zelbench::compare(feature, floor, "floor");
    zelbench::compare(sortByOrder, floor, "floor");
    zelbench::compare(feature, peer, "peer");
    zelbench::compare(feature, gettersFloor, "floor");
}

} // namespace

int main(int argc, char** argv)
{
    registerRows("latin1", false);
    registerRows("mixed", true);
    return zelbench::runMain(argc, argv, "node order");
}
