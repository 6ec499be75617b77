#include "VtableSlot.h"

#include "Zel_MimeTypeSpec.h"
#include "Zel_Node.h"
#include "Zel_NodeList.h"
#include "zel_nodeorder_p.h"

#include <boost/make_shared.hpp>

#include <gtest/gtest.h>

#include <algorithm>
#include <cstdint>
#include <random>
#include <string>
#include <tuple>
#include <vector>

namespace {

// A node as a backend would make it: name and mime type from "the server",
// identity set through the protected setters.
class TestNode : public Zel_Node
{
public:
    TestNode(const QString& mimeType, const QString& name, const QString& moniker = QString(),
             const QString& nodeID = QString())
        : Zel_Node(nodeID)
        , mMimeType(mimeType)
        , mName(name)
    {
        setMoniker(moniker);
    }

    QString getName() override { return mName; }
    QString getMimeType() override { return mMimeType; }

    using Zel_Node::setChildrenCount;
    using Zel_Node::setMasterMoniker;
    using Zel_Node::setMoniker;

private:
    QString mMimeType;
    QString mName;
};

// Answers its identity from overrides only; the stored fields stay empty.
struct VirtualIdentityNode : Zel_Node {
    VirtualIdentityNode(const char* nodeID, const char* moniker) : mID(nodeID), mMon(moniker) {}
    QString getNodeID() override { return mID; }
    QString getMoniker() override { return mMon; }
    QString mID, mMon;
};

QString u(const char* utf8)
{
    return QString::fromUtf8(utf8);
}

typedef boost::shared_ptr<TestNode> NodeSP;

NodeSP node(const char* mime, const QString& name, const char* moniker = "")
{
    return boost::make_shared<TestNode>(QString::fromLatin1(mime), name, QString::fromLatin1(moniker));
}

// The ordering by its definition: mime type rank, name lowered with
// toLower(), exact name, moniker.
bool referenceLess(TestNode& a, TestNode& b)
{
    const QString na = a.getName();
    const QString nb = b.getName();
    const auto key = [](TestNode& n, const QString& name) {
        return std::make_tuple(Zel_MimeTypeSpec::getSortOrder(n.getMimeType()), name.toLower(), name, n.getMoniker());
    };
    return key(a, na) < key(b, nb);
}

// One UTF-16 unit, paired or not.
QString unit(ushort value)
{
    return QString(QChar(value));
}

// Characters whose case behaviour differs between toLower(), case folding and
// ASCII: µ, ſ, final and capital sigma, dotted and dotless i, the Kelvin
// sign, Ÿ (lowers into Latin-1), À/à, ×, Þ, ß and capital ẞ, a Deseret pair;
// and broken UTF-16, which Qt lowers by rules of its own: unpaired high and
// low surrogates (Deseret halves, which may meet to make a pair) and U+FFFD,
// which Qt 6 puts in their place.
const std::vector<QString>& namePieces()
{
    static const std::vector<QString> pieces = {
        u("a"), u("A"), u("b"), u("B"), u("s"), u("S"), u("k"), u("K"), u("i"), u("I"), u(" "), u("1"),
        u("µ"), u("Μ"), u("μ"), u("ſ"), u("ς"), u("σ"), u("Σ"), u("İ"), u("ı"), u("\u212A"),
        u("Ÿ"), u("ÿ"), u("À"), u("à"), u("×"), u("÷"), u("Þ"), u("þ"), u("ß"), u("ẞ"),
        u("\xF0\x90\x90\x80"), u("\xF0\x90\x90\xA8"),
        unit(0xD801), unit(0xDC00), unit(0xDC28), u("\xEF\xBF\xBD"),
    };
    return pieces;
}

// Nodes of random kinds, names and monikers; every third name is the upper
// case of the one before.
std::vector<NodeSP> randomNodes(std::mt19937& random, int count)
{
    static const char* const mimes[] = { "sequence", "masterclip", "clip", "bin", "folder", "Asset",
                                         "physical", "unlisted", "other", "", "Sequence" };
    static const char* const monikers[] = { "", "m1", "m2", "M1" };
    std::uniform_int_distribution<int> mime(0, 10), moniker(0, 3), pieces(0, 4);
    std::uniform_int_distribution<std::size_t> pick(0, namePieces().size() - 1);
    std::vector<NodeSP> nodes;
    for (int i = 0; i < count; ++i) {
        QString name;
        for (int n = pieces(random); n > 0; --n)
            name += namePieces()[pick(random)];
        if (i % 3 == 2)
            name = nodes.back()->getName().toUpper();
        nodes.push_back(node(mimes[mime(random)], name, monikers[moniker(random)]));
    }
    return nodes;
}

// Names long enough for the comparison's word-at-a-time paths: stems shared
// by many names, every Latin-1 unit (NUL included), case changed anywhere,
// units replaced, pieces and unpaired surrogates inserted into shared
// stretches, names cut short.
std::vector<QString> longNames(std::mt19937& random, int count)
{
    std::uniform_int_distribution<int> roll(0, 99), latin1(0, 0xFF);
    std::uniform_int_distribution<std::size_t> piece(0, namePieces().size() - 1);
    std::vector<QString> names;
    for (int i = 0; i < count; ++i) {
        QString name;
        if (!names.empty() && roll(random) < 75) {
            name = names[std::uniform_int_distribution<std::size_t>(0, names.size() - 1)(random)];
            for (int edits = 1 + roll(random) % 3; edits > 0; --edits) {
                const int kind = roll(random);
                const int at = name.isEmpty() ? 0 : std::uniform_int_distribution<int>(0, name.size() - 1)(random);
                if (kind < 40 && !name.isEmpty()) {
                    const QChar c = name.at(at);
                    name[at] = c.isUpper() ? c.toLower() : c.toUpper();
                } else if (kind < 60) {
                    name += namePieces()[piece(random)];
                } else if (kind < 75 && !name.isEmpty()) {
                    name[at] = QChar(static_cast<ushort>(latin1(random)));
                } else if (kind < 90) {
                    name.insert(at, namePieces()[piece(random)]);
                } else {
                    name.truncate(at);
                }
            }
        } else {
            for (int n = roll(random) % 21; n > 0; --n) {
                if (roll(random) < 85)
                    name += QChar(static_cast<ushort>(latin1(random)));
                else
                    name += namePieces()[piece(random)];
            }
        }
        names.push_back(name);
    }
    return names;
}

} // namespace

TEST(Zel_NodeTest, VirtualSlotsKeepTheirOrder)
{
#define ROW(member) ZEL_SLOT_ROW(TestNode, member)
    EXPECT_EQ(slotsOutOfOrder(2, {ROW(isFolder), ROW(isMedia), ROW(isAbstractAsset), ROW(isReserved), ROW(isSyncedBin),
                                  ROW(sameNode), ROW(isSyncedFolder), ROW(isValid), ROW(getName), ROW(getPath),
                                  ROW(getMobID), ROW(getMimeType), ROW(isValidDropTarget), ROW(isUserPlaced),
                                  ROW(getPropertyValue), ROW(getPropertyValueAsDateTime), ROW(getProperties),
                                  ROW(decacheProperties), ROW(getChildrenCount), ROW(getMoniker), ROW(getMasterMoniker),
                                  ROW(getNodeID), ROW(getParentNodeID), ROW(setNodeID), ROW(setParentNodeID),
                                  ROW(setValid), ROW(setChildrenCount), ROW(setMoniker), ROW(setMasterMoniker)}),
              "");
#undef ROW
}

TEST(Zel_NodeTest, BaseNodeAnswersEmptyServerDataAndOnlyIsUserPlaced)
{
    Zel_Node base;
    const QString texts = base.getMoniker() + base.getMasterMoniker() + base.getNodeID() + base.getParentNodeID()
        + base.getName() + base.getMimeType() + base.getPropertyValue(QStringLiteral("Name"))
        + base.getMobID().toZelString() + base.getPath().toZelString(QStringLiteral("/"));
    EXPECT_TRUE(texts.isEmpty()) << texts.toStdString();
    EXPECT_EQ(base.getChildrenCount(), 0ul);
    EXPECT_TRUE(base.getPropertyValueAsDateTime(QStringLiteral("ModifiedDate")).isNull());
    EXPECT_TRUE(base.getProperties().isEmpty());
    EXPECT_FALSE(base.getPath().isRooted());
    base.decacheProperties();

    const std::vector<bool> predicates = {base.isValid(),       base.isFolder(),         base.isMedia(),
                                          base.isAbstractAsset(), base.isUserPlaced(),   base.isReserved(),
                                          base.isSyncedBin(),   base.isSyncedFolder(),   base.isValidDropTarget()};
    EXPECT_EQ(predicates, (std::vector<bool>{false, false, false, false, true, false, false, false, false}));

    Zel_Node withID(QStringLiteral("id-7"));
    EXPECT_EQ(withID.getNodeID().toStdString(), "id-7");
    EXPECT_FALSE(withID.isValid());
}

TEST(Zel_NodeTest, CopiesCarryAllSixFieldsAndListCopiesShareTheNodes)
{
    TestNode source(QStringLiteral("bin"), QStringLiteral("n"), QStringLiteral("mon"), QStringLiteral("id"));
    source.setMasterMoniker(QStringLiteral("master"));
    source.setParentNodeID(QStringLiteral("parent"));
    source.setChildrenCount(4000000000ul);
    source.setValid(true);

    Zel_Node copy(source);
    Zel_Node assigned;
    assigned = source;
    for (Zel_Node* n : { &copy, &assigned }) {
        EXPECT_EQ((n->getMoniker() + n->getMasterMoniker() + n->getNodeID() + n->getParentNodeID()).toStdString(),
                  "monmasteridparent");
        EXPECT_EQ(n->getChildrenCount(), 4000000000ul);
        EXPECT_TRUE(n->isValid());
        EXPECT_TRUE(n->getMimeType().isEmpty()); // sliced to the base: server data is not copied
    }
    source.setNodeID(QStringLiteral("other"));
    source.setValid(false);
    EXPECT_EQ(copy.getNodeID().toStdString(), "id");
    EXPECT_TRUE(copy.isValid());

    // A node list's copies share the nodes.
    Zel_NodeList list;
    list.append(boost::make_shared<TestNode>(QStringLiteral("bin"), QStringLiteral("a")));
    Zel_NodeList copied(list);
    Zel_NodeList assignedList;
    assignedList = list;
    EXPECT_TRUE(copied.first() == list.first() && assignedList.first() == list.first());
    copied.append(boost::make_shared<Zel_Node>());
    EXPECT_EQ(list.size(), 1);
}

TEST(Zel_NodeTest, KindPredicatesFollowTheMimeMasks)
{
    // Folder, media, abstract asset, as "FMA" with '-' for false.
    const std::vector<std::pair<const char*, const char*>> kinds = {
        {"project", "F--"},        {"bin", "F--"},           {"folder", "F--"},          {"catalog", "F--"},
        {"workspace", "F--"},      {"playbackdevices", "F--"}, {"masterclip", "-M-"},    {"clip", "-M-"},
        {"sequence", "-M-"},       {"subclip", "-M-"},       {"group", "-M-"},           {"motioneffect", "-M-"},
        {"effect", "-M-"},         {"renderedeffect", "-M-"}, {"audioclip", "-M-"},      {"filemob", "-M-"},
        {"masterclipewc", "-M-"},  {"audioclipewc", "-M-"},  {"stereomasterclip", "-M-"}, {"stereosubclip", "-M-"},
        {"Asset", "--A"},          {"physical", "---"},      {"asset", "---"},           {"Bin", "---"},
        {"", "---"},               {"unknown", "---"},
    };
    for (const auto& kind : kinds) {
        const TestNode n(QString::fromLatin1(kind.first), QStringLiteral("x"));
        const std::string answers = {n.isFolder() ? 'F' : '-', n.isMedia() ? 'M' : '-', n.isAbstractAsset() ? 'A' : '-'};
        EXPECT_EQ(answers, kind.second) << kind.first;
    }
}

TEST(Zel_NodeTest, SameNodeByOwnIDThenByMoniker)
{
    const auto stored = [](const char* moniker, const char* id) {
        return TestNode(QString(), QString(), QString::fromLatin1(moniker), QString::fromLatin1(id));
    };
    const auto same = [](const Zel_Node& a, const Zel_Node& b) { return a.sameNode(&b); };
    EXPECT_TRUE(same(stored("mon-a", "7"), stored("mon-b", "7")));
    EXPECT_TRUE(same(stored("same", "1"), stored("same", "2")));
    EXPECT_FALSE(same(stored("x", "1"), stored("X", "2")));
    EXPECT_TRUE(stored("x", "1") != stored("X", "2"));
    // Empty IDs and empty monikers: the same node.
    EXPECT_TRUE(same(Zel_Node(), stored("", "")));
    EXPECT_TRUE(Zel_Node() == Zel_Node());

    // Only this node's stored ID counts; the other's is asked virtually.
    EXPECT_FALSE(same(VirtualIdentityNode("7", "v"), stored("s", "7"))); // its stored ID is empty: v and s differ
    EXPECT_TRUE(same(stored("s", "7"), VirtualIdentityNode("7", "v")));
    EXPECT_TRUE(same(VirtualIdentityNode("8", "s"), stored("s", "7"))); // monikers through the override

    // A null pointer is no node.
    EXPECT_FALSE(stored("s", "7").sameNode(nullptr));
    EXPECT_FALSE(Zel_Node().sameNode(nullptr));
}

TEST(Zel_NodeTest, OrdersByRankThenNameIgnoringCaseThenCaseThenMoniker)
{
    // Nodes as "mime:name:moniker"; '<' when the first sorts strictly before
    // the second, '=' when neither sorts before the other.
    const std::vector<std::tuple<const char*, const char*, char>> pairs = {
        // Rank beats name; equal ranks of different types go on to the names.
        {"sequence:zzz", "masterclip:aaa", '<'}, {"physical:z", "unlisted:a", '<'}, {"clip:a", "masterclip:b", '<'},
        {"masterclip:a", "clip:b", '<'}, {"unlisted:a", "other:b", '<'}, {"other:a:m", "unlisted:a:m", '='},
        {"sequence:z", "bin:a", '<'}, {"masterclip:z", "bin:a", '<'}, {"clip:z", "bin:a", '<'}, {"subclip:z", "bin:a", '<'},
        {"filemob:z", "bin:a", '<'}, {"stereosubclip:z", "bin:a", '<'},
        // Name ignoring case, then case, then moniker.
        {"bin:abc", "bin:ABD", '<'}, {"bin:Abc", "bin:abc", '<'}, {"bin:same:m1", "bin:same:m2", '<'},
        {"bin:same:m1", "bin:same:m1", '='},
        // The lowered names are toLower()'s: µ and ſ stay themselves, so µ (U+00B5)
        // sorts before Μ/μ (U+03BC) and ſ (U+017F) after S/s.
        {"bin:µ", "bin:Μ", '<'}, {"bin:s", "bin:ſ", '<'},
        // Ÿ (U+0178) lowers to ÿ (U+00FF): tied, then the exact units decide.
        {"bin:ÿ", "bin:Ÿ", '<'}, {"bin:ÿa", "bin:Ÿb", '<'}, {"bin:À", "bin:àb", '<'},
        {"bin:×", "bin:ø", '<'}, // × (D7) is no letter
        // Σ lowers to σ (U+03C3), which follows ς (U+03C2); case folding would tie them.
        {"bin:ς", "bin:Σ", '<'},
    };
    const auto parse = [](const char* text) {
        const QStringList parts = QString::fromUtf8(text).split(QLatin1Char(':'));
        return TestNode(parts[0], parts[1], parts.value(2));
    };
    for (const auto& pair : pairs) {
        const TestNode a = parse(std::get<0>(pair));
        const TestNode b = parse(std::get<1>(pair));
        EXPECT_EQ(a < b, std::get<2>(pair) == '<') << std::get<0>(pair) << " < " << std::get<1>(pair);
        EXPECT_FALSE(b < a) << std::get<1>(pair) << " < " << std::get<0>(pair);
    }
}

TEST(Zel_NodeTest, RandomNodesOrderExactlyAsTheReferenceOrderingAndSortCleanly)
{
    // Every pair of a mixed sample agrees with the reference, itself a strict
    // weak ordering (a lexicographic tuple comparison).
    std::mt19937 random(20240501);
    std::vector<NodeSP> sample = randomNodes(random, 500);
    for (const NodeSP& a : sample)
        for (const NodeSP& b : sample)
            ASSERT_EQ(*a < *b, referenceLess(*a, *b)) << a->getName().toStdString() << " vs " << b->getName().toStdString();
    const auto less = [](const NodeSP& a, const NodeSP& b) { return *a < *b; };
    std::sort(sample.begin(), sample.end(), less);
    EXPECT_TRUE(std::is_sorted(sample.begin(), sample.end(), less));
}

TEST(Zel_NodeTest, LongNamesOrderExactlyAsTheReferenceOrdering)
{
    for (std::uint32_t seed : {7u, 8u, 9u}) {
        std::mt19937 random(seed);
        std::vector<TestNode> nodes;
        int i = 0;
        for (const QString& name : longNames(random, 300))
            nodes.emplace_back(QStringLiteral("bin"), name, QString::fromLatin1(i++ % 3 ? "m" : ""));
        for (TestNode& a : nodes)
            for (TestNode& b : nodes)
                ASSERT_EQ(a < b, referenceLess(a, b)) << "seed " << seed << ": " << a.getName().toStdString() << " vs "
                                                      << b.getName().toStdString();
    }
}

TEST(Zel_NodeTest, EveryPairOfLatin1UnitsOrdersAsTheReference)
{
    // Latin-1 names are lowered four units at a time: every pair of units,
    // at each of the four places, in names that agree elsewhere.
    for (int c = 0; c < 0x100; ++c) {
        for (int d = 0; d < 0x100; ++d) {
            const int place = (c + d) % 4;
            const QString stem = QStringLiteral("Ab\u00C9").left(place);
            TestNode a(QStringLiteral("bin"), stem + QChar(static_cast<ushort>(c)) + QStringLiteral("xY"), QString());
            TestNode b(QStringLiteral("bin"), stem + QChar(static_cast<ushort>(d)) + QStringLiteral("xY"), QString());
            ASSERT_EQ(a < b, referenceLess(a, b)) << std::hex << c << " " << d;
        }
    }
}

TEST(Zel_NodeTest, LoweringOneCodePointAtATimeMatchesToLower)
{
    // The ordering never builds a lowered name: it lowers code point by code
    // point and relies on that giving exactly QString::toLower(), which it
    // does for every code point, in one unit or two.
    int mismatches = 0;
    std::string first;
    for (uint cp = 0; cp <= 0x10FFFF; ++cp) {
        if (QChar::isSurrogate(cp))
            continue;
        QString text;
        if (QChar::requiresSurrogates(cp)) {
            text.append(QChar(QChar::highSurrogate(cp)));
            text.append(QChar(QChar::lowSurrogate(cp)));
        } else {
            text.append(QChar(static_cast<ushort>(cp)));
        }
        const QString expected = text.toLower();
        ushort units[2] = {0, 0};
        const int count = ZelNodeOrder::lowerCodePoint(cp, units);
        std::vector<ushort> appended;
        ZelNodeOrder::appendLowered(text, appended);
        const bool same = expected.size() == count && expected.at(0).unicode() == units[0]
            && (count == 1 || expected.at(1).unicode() == units[1]);
        const bool sameAppended = std::vector<ushort>(expected.utf16(), expected.utf16() + expected.size()) == appended;
        if (!same || !sameAppended) {
            if (mismatches++ == 0)
                first = QString::number(cp, 16).toStdString();
        }
    }
    EXPECT_EQ(mismatches, 0) << "first at U+" << first;

    // Broken UTF-16 is lowered by Qt's rules for the whole text.
    const std::vector<QString> broken = {
        unit(0xD801), unit(0xDC28), unit(0xD801) + u("A"), u("A") + unit(0xD801), unit(0xDC00) + u("A"),
        u("A") + unit(0xD800) + u("¶Z"), unit(0xD800) + u("¶"), u("xÀ") + unit(0xD801) + unit(0xDC00) + unit(0xD800) + u("Y"),
        unit(0xD801) + unit(0xD801) + unit(0xDC00) + u("B"),
    };
    for (const QString& text : broken) {
        const QString expected = text.toLower();
        std::vector<ushort> appended;
        appended.push_back('#'); // appends after what is there
        ZelNodeOrder::appendLowered(text, appended);
        std::vector<ushort> wanted(1, '#');
        wanted.insert(wanted.end(), expected.utf16(), expected.utf16() + expected.size());
        EXPECT_EQ(appended, wanted) << QString::number(text.at(0).unicode(), 16).toStdString();
    }
}

TEST(Zel_NodeTest, BrokenUtf16OrdersByItsToLowerForm)
{
    // Qt lowers an unpaired surrogate by rules that look at the whole text
    // (Qt 5 pairs it with the next unit, Qt 6 may replace it with U+FFFD),
    // so these pairs order as their toLower() forms do, whatever those are;
    // taking the surrogate for itself would get some of them wrong.
    const std::vector<std::pair<QString, QString>> pairs = {
        {u("A") + unit(0xD800) + u("x"), u("a") + unit(0xD800) + u("y")},
        {unit(0xD800) + u("A"), unit(0xD800) + u("a")},
        {unit(0xD800) + u("¶"), unit(0xD800) + u("\u24B6")},
        {unit(0xD800) + u("A"), unit(0xD800) + u("[")}, // Qt 5 reads U+D800 and A as one, leaving A
        // A case change before an unpaired surrogate in a stretch the two share.
        {u("Abcd") + unit(0xD800) + u("xyz0"), u("abcd") + unit(0xD800) + u("xyz1")},
        {u("Abcd") + unit(0xD800) + u("xyz1"), u("abcd") + unit(0xD800) + u("xyz0")},
        {u("B") + unit(0xDC00), u("b") + u("\xEF\xBF\xBD")},
        {u("b") + unit(0xD801), u("B") + unit(0xD801) + unit(0xDC00)},
        {u("\xF0\x90\x90\x80") + u("A"), u("\xF0\x90\x90\xA8") + unit(0xDC00)},
        {u("İ") + unit(0xD800), u("i\u0307") + unit(0xD800)},
        {unit(0xD801), QString()},
    };
    for (const auto& pair : pairs) {
        TestNode a(QStringLiteral("bin"), pair.first, QStringLiteral("m"));
        TestNode b(QStringLiteral("bin"), pair.second, QStringLiteral("m"));
        EXPECT_EQ(a < b, referenceLess(a, b)) << pair.first.size() << " " << pair.second.size();
        EXPECT_EQ(b < a, referenceLess(b, a)) << pair.first.size() << " " << pair.second.size();
    }
}

TEST(Zel_NodeTest, RelationsAreBuiltFromLessAndIdentity)
{
    // Same node (equal IDs) with different names: equal and also ordered.
    const TestNode a(QStringLiteral("bin"), QStringLiteral("a"), QStringLiteral("m1"), QStringLiteral("7"));
    const TestNode b(QStringLiteral("bin"), QStringLiteral("b"), QStringLiteral("m2"), QStringLiteral("7"));
    const TestNode c(QStringLiteral("bin"), QStringLiteral("c"), QStringLiteral("m3"), QStringLiteral("8"));
    // == != < <= > >= as "1" or "0".
    const auto relations = [](const TestNode& x, const TestNode& y) {
        return std::string{char('0' + (x == y)), char('0' + (x != y)), char('0' + (x < y)),
                           char('0' + (x <= y)), char('0' + (x > y)), char('0' + (x >= y))};
    };
    EXPECT_EQ(relations(a, b), "101101");
    EXPECT_EQ(relations(b, a), "100101");
    EXPECT_EQ(relations(a, c), "011100");
    EXPECT_EQ(relations(c, a), "010011");
}

TEST(Zel_NodeTest, ColorFromNameIgnoresCase)
{
    const std::vector<std::pair<const char*, int>> table = {
        { "black", 0x000000 },    { "blue", 0x0000FF },     { "cyan", 0x00FFFF },   { "darkblue", 0x000080 },
        { "darkgreen", 0x008000 }, { "darkred", 0x800000 },  { "green", 0x00FF00 },  { "lightblue", 0x8080FF },
        { "lightred", 0xFF0000 }, { "olive", 0x808000 },    { "pink", 0xFF00FF },   { "purple", 0x800080 },
        { "teal", 0x008080 },     { "white", 0xFFFFFF },    { "yellow", 0xFFFF00 },
    };
    for (const auto& row : table) {
        EXPECT_EQ(Zel_Node::colorFromName(row.first), row.second) << row.first;
        const std::string upper = QString::fromLatin1(row.first).toUpper().toStdString();
        EXPECT_EQ(Zel_Node::colorFromName(upper.c_str()), row.second) << upper;
    }
    EXPECT_EQ(Zel_Node::colorFromName("DarkRed"), 0x800000);
    EXPECT_EQ(Zel_Node::colorFromName("PiNk"), 0xFF00FF);
    // Latin-1 Ü folds to ü, not u.
    for (const char* unknown : {"red", "", "blu", "blue ", "zzz", "aaa", "bl\xDC" "e", "\xC0\xFF", (const char*)nullptr})
        EXPECT_EQ(Zel_Node::colorFromName(unknown), -1) << (unknown ? unknown : "null");
}

namespace {

// Counts the reads of the three texts that order it.
class CountingNode : public TestNode
{
public:
    using TestNode::TestNode;
    QString getName() override { ++names; return TestNode::getName(); }
    QString getMimeType() override { ++mimeTypes; return TestNode::getMimeType(); }
    QString getMoniker() override { ++monikers; return TestNode::getMoniker(); }
    int names = 0;
    int mimeTypes = 0;
    int monikers = 0;
};

template <class Nodes>
std::vector<const Zel_Node*> pointers(const Nodes& nodes)
{
    std::vector<const Zel_Node*> result;
    for (const boost::shared_ptr<Zel_Node>& node : nodes)
        result.push_back(node.get());
    return result;
}

} // namespace

TEST(Zel_NodeListTest, SortByOrderGivesTheOrderOfAStableSortWithLess)
{
    // Random sets of every size class: ties (equal kind, name and moniker,
    // which must keep their order), case variants, non-Latin-1 and broken
    // UTF-16 names, empty names and monikers, unknown and empty mime types.
    const int sizes[] = {0, 1, 2, 3, 7, 40, 250, 1500};
    for (std::uint32_t seed = 1; seed <= 48; ++seed) {
        std::mt19937 random(seed);
        const int count = sizes[seed % (sizeof sizes / sizeof sizes[0])];
        std::vector<NodeSP> sample = randomNodes(random, count);
        // Exact copies of earlier nodes, distinct objects.
        std::uniform_int_distribution<int> copyOf(0, count > 0 ? count - 1 : 0);
        for (int i = 0; i < count / 4; ++i) {
            const NodeSP original = sample[copyOf(random)];
            sample.push_back(boost::make_shared<TestNode>(original->getMimeType(), original->getName(), original->getMoniker()));
        }
        std::shuffle(sample.begin(), sample.end(), random);

        Zel_NodeList list;
        QList<boost::shared_ptr<Zel_Node>> plain;
        for (const NodeSP& n : sample) {
            list.append(n);
            plain.append(n);
        }
        std::vector<boost::shared_ptr<Zel_Node>> expected(list.begin(), list.end());
        std::stable_sort(expected.begin(), expected.end(),
                         [](const boost::shared_ptr<Zel_Node>& a, const boost::shared_ptr<Zel_Node>& b) { return *a < *b; });
        std::vector<const Zel_Node*> expectedPointers;
        for (const boost::shared_ptr<Zel_Node>& n : expected)
            expectedPointers.push_back(n.get());

        const Zel_NodeList unsorted = list; // shares the items until sorted
        list.sortByOrder();
        ASSERT_EQ(pointers(list), expectedPointers) << "seed " << seed << ", " << sample.size() << " nodes";
        Zel_NodeList::sortByOrder(plain);
        ASSERT_EQ(pointers(plain), expectedPointers) << "seed " << seed;
        std::vector<boost::shared_ptr<Zel_Node>> vector(sample.begin(), sample.end());
        Zel_NodeList::sortByOrder(vector);
        ASSERT_EQ(pointers(vector), expectedPointers) << "seed " << seed;
        // The copy taken before is untouched.
        std::vector<const Zel_Node*> before;
        for (const NodeSP& n : sample)
            before.push_back(n.get());
        ASSERT_EQ(pointers(unsorted), before) << "seed " << seed;
    }
}

TEST(Zel_NodeListTest, SortByOrderReadsEachNodeOnceAndPutsNullsLast)
{
    // Twenty nodes of four names in two cases and two kinds, every name
    // twice with one moniker: many ties to break by name, moniker and place.
    std::vector<boost::shared_ptr<CountingNode>> counted;
    Zel_NodeList list;
    for (int i = 0; i < 20; ++i) {
        const QString name = QString::fromLatin1(i % 2 ? "Take " : "take ") + QString::number(i % 4);
        counted.push_back(boost::make_shared<CountingNode>(QString::fromLatin1(i % 3 ? "clip" : "bin"), name,
                                                           QString::fromLatin1(i % 5 ? "m" : "n")));
        list.append(counted.back());
        if (i % 6 == 0)
            list.append(boost::shared_ptr<Zel_Node>());
    }
    std::vector<boost::shared_ptr<Zel_Node>> expected;
    for (const boost::shared_ptr<CountingNode>& n : counted)
        expected.push_back(n);
    const auto less = [](const boost::shared_ptr<Zel_Node>& a, const boost::shared_ptr<Zel_Node>& b) { return *a < *b; };
    std::stable_sort(expected.begin(), expected.end(), less);
    for (const boost::shared_ptr<CountingNode>& n : counted)
        n->names = n->mimeTypes = n->monikers = 0;

    list.sortByOrder();

    for (const boost::shared_ptr<CountingNode>& n : counted) {
        EXPECT_EQ(n->names, 1);
        EXPECT_EQ(n->mimeTypes, 1);
        EXPECT_EQ(n->monikers, 1);
    }
    ASSERT_EQ(list.size(), 24);
    for (int i = 0; i < 20; ++i)
        EXPECT_EQ(list.at(i).get(), expected[i].get()) << i;
    for (int i = 20; i < 24; ++i)
        EXPECT_FALSE(list.at(i)) << i;

    // Nothing to do for no node or one.
    Zel_NodeList one;
    one.append(counted.front());
    one.sortByOrder();
    Zel_NodeList none;
    none.sortByOrder();
    EXPECT_EQ(one.size(), 1);
    EXPECT_TRUE(none.isEmpty());
}
