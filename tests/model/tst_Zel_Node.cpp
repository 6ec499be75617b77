#include "VtableSlot.h"

#include "Zel_MimeTypeSpec.h"
#include "Zel_Node.h"
#include "Zel_NodeList.h"

#include <boost/make_shared.hpp>

#include <gtest/gtest.h>

#include <algorithm>
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
class VirtualIdentityNode : public Zel_Node
{
public:
    VirtualIdentityNode(const QString& nodeID, const QString& moniker)
        : mID(nodeID)
        , mMon(moniker)
    {
    }
    QString getNodeID() override { return mID; }
    QString getMoniker() override { return mMon; }

private:
    QString mID;
    QString mMon;
};

// Exposes the protected setters' member pointers for the slot checks.
class SlotProbe : public Zel_Node
{
public:
    using Zel_Node::setChildrenCount;
    using Zel_Node::setMasterMoniker;
    using Zel_Node::setMoniker;
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

// Characters whose case behaviour differs between toLower(), case folding and
// ASCII: µ, ſ, final and capital sigma, dotted and dotless i, the Kelvin
// sign, Ÿ (lowers into Latin-1), À/à, ×, Þ, ß and capital ẞ, a Deseret pair.
const std::vector<QString>& namePieces()
{
    static const std::vector<QString> pieces = {
        u("a"), u("A"), u("b"), u("B"), u("s"), u("S"), u("k"), u("K"), u("i"), u("I"), u(" "), u("1"),
        u("µ"), u("Μ"), u("μ"), u("ſ"), u("ς"), u("σ"), u("Σ"), u("İ"), u("ı"), u("\u212A"),
        u("Ÿ"), u("ÿ"), u("À"), u("à"), u("×"), u("÷"), u("Þ"), u("þ"), u("ß"), u("ẞ"),
        u("\xF0\x90\x90\x80"), u("\xF0\x90\x90\xA8"),
    };
    return pieces;
}

QString randomName(std::mt19937& random, int maxPieces)
{
    const std::vector<QString>& pieces = namePieces();
    std::uniform_int_distribution<int> count(0, maxPieces);
    std::uniform_int_distribution<std::size_t> pick(0, pieces.size() - 1);
    QString name;
    for (int n = count(random); n > 0; --n)
        name += pieces[pick(random)];
    return name;
}

std::vector<NodeSP> randomNodes(std::mt19937& random, int count)
{
    static const char* const mimes[] = { "sequence", "masterclip", "clip", "bin", "folder", "Asset",
                                         "physical", "unlisted", "other", "", "Sequence" };
    static const char* const monikers[] = { "", "m1", "m2", "M1" };
    std::uniform_int_distribution<int> mime(0, 10);
    std::uniform_int_distribution<int> moniker(0, 3);
    std::vector<NodeSP> nodes;
    for (int i = 0; i < count; ++i)
        nodes.push_back(node(mimes[mime(random)], randomName(random, 3), monikers[moniker(random)]));
    return nodes;
}

} // namespace

TEST(Zel_NodeTest, VirtualSlotsKeepTheirOrder)
{
    EXPECT_EQ(vtableSlot(&Zel_Node::isFolder), 2);
    EXPECT_EQ(vtableSlot(&Zel_Node::isMedia), 3);
    EXPECT_EQ(vtableSlot(&Zel_Node::isAbstractAsset), 4);
    EXPECT_EQ(vtableSlot(&Zel_Node::isReserved), 5);
    EXPECT_EQ(vtableSlot(&Zel_Node::isSyncedBin), 6);
    EXPECT_EQ(vtableSlot(&Zel_Node::sameNode), 7);
    EXPECT_EQ(vtableSlot(&Zel_Node::isSyncedFolder), 8);
    EXPECT_EQ(vtableSlot(&Zel_Node::isValid), 9);
    EXPECT_EQ(vtableSlot(&Zel_Node::getName), 10);
    EXPECT_EQ(vtableSlot(&Zel_Node::getPath), 11);
    EXPECT_EQ(vtableSlot(&Zel_Node::getMobID), 12);
    EXPECT_EQ(vtableSlot(&Zel_Node::getMimeType), 13);
    EXPECT_EQ(vtableSlot(&Zel_Node::isValidDropTarget), 14);
    EXPECT_EQ(vtableSlot(&Zel_Node::isUserPlaced), 15);
    EXPECT_EQ(vtableSlot(&Zel_Node::getPropertyValue), 16);
    EXPECT_EQ(vtableSlot(&Zel_Node::getPropertyValueAsDateTime), 17);
    EXPECT_EQ(vtableSlot(&Zel_Node::getProperties), 18);
    EXPECT_EQ(vtableSlot(&Zel_Node::decacheProperties), 19);
    EXPECT_EQ(vtableSlot(&Zel_Node::getChildrenCount), 20);
    EXPECT_EQ(vtableSlot(&Zel_Node::getMoniker), 21);
    EXPECT_EQ(vtableSlot(&Zel_Node::getMasterMoniker), 22);
    EXPECT_EQ(vtableSlot(&Zel_Node::getNodeID), 23);
    EXPECT_EQ(vtableSlot(&Zel_Node::getParentNodeID), 24);
    EXPECT_EQ(vtableSlot(&Zel_Node::setNodeID), 25);
    EXPECT_EQ(vtableSlot(&Zel_Node::setParentNodeID), 26);
    EXPECT_EQ(vtableSlot(&Zel_Node::setValid), 27);
    EXPECT_EQ(vtableSlot(&SlotProbe::setChildrenCount), 28);
    EXPECT_EQ(vtableSlot(&SlotProbe::setMoniker), 29);
    EXPECT_EQ(vtableSlot(&SlotProbe::setMasterMoniker), 30);
}

TEST(Zel_NodeTest, BaseNodeAnswersEmptyServerData)
{
    Zel_Node base;
    EXPECT_FALSE(base.isValid());
    EXPECT_EQ(base.getChildrenCount(), 0ul);
    EXPECT_TRUE(base.getMoniker().isEmpty());
    EXPECT_TRUE(base.getMasterMoniker().isEmpty());
    EXPECT_TRUE(base.getNodeID().isEmpty());
    EXPECT_TRUE(base.getParentNodeID().isEmpty());
    EXPECT_TRUE(base.getName().isEmpty());
    EXPECT_TRUE(base.getMimeType().isEmpty());
    EXPECT_TRUE(base.getPropertyValue(QStringLiteral("Name")).isEmpty());
    EXPECT_TRUE(base.getPropertyValueAsDateTime(QStringLiteral("ModifiedDate")).isNull());
    EXPECT_TRUE(base.getProperties().isEmpty());
    const Zel_Directory path = base.getPath();
    EXPECT_TRUE(path.isEmpty());
    EXPECT_FALSE(path.isRooted());
    EXPECT_TRUE(base.getMobID().isEmpty());
    base.decacheProperties();

    EXPECT_FALSE(base.isFolder());
    EXPECT_FALSE(base.isMedia());
    EXPECT_FALSE(base.isAbstractAsset());
    EXPECT_TRUE(base.isUserPlaced());
    EXPECT_FALSE(base.isReserved());
    EXPECT_FALSE(base.isSyncedBin());
    EXPECT_FALSE(base.isSyncedFolder());
    EXPECT_FALSE(base.isValidDropTarget());

    const Zel_Node withID(QStringLiteral("id-7"));
    EXPECT_EQ(const_cast<Zel_Node&>(withID).getNodeID().toStdString(), "id-7");
    EXPECT_FALSE(withID.isValid());
}

TEST(Zel_NodeTest, CopiesCarryAllSixFields)
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
}

TEST(Zel_NodeTest, KindPredicatesFollowTheMimeMasks)
{
    struct Kind
    {
        const char* mime;
        bool folder, media, asset;
    };
    const std::vector<Kind> kinds = {
        { "project", true, false, false },       { "bin", true, false, false },
        { "folder", true, false, false },        { "catalog", true, false, false },
        { "workspace", true, false, false },     { "playbackdevices", true, false, false },
        { "masterclip", false, true, false },    { "clip", false, true, false },
        { "sequence", false, true, false },      { "subclip", false, true, false },
        { "group", false, true, false },         { "motioneffect", false, true, false },
        { "effect", false, true, false },        { "renderedeffect", false, true, false },
        { "audioclip", false, true, false },     { "filemob", false, true, false },
        { "masterclipewc", false, true, false }, { "audioclipewc", false, true, false },
        { "stereomasterclip", false, true, false }, { "stereosubclip", false, true, false },
        { "Asset", false, false, true },         { "physical", false, false, false },
        { "asset", false, false, false },        { "Bin", false, false, false },
        { "", false, false, false },             { "unknown", false, false, false },
    };
    for (const Kind& kind : kinds) {
        const TestNode n(QString::fromLatin1(kind.mime), QStringLiteral("x"));
        EXPECT_EQ(n.isFolder(), kind.folder) << kind.mime;
        EXPECT_EQ(n.isMedia(), kind.media) << kind.mime;
        EXPECT_EQ(n.isAbstractAsset(), kind.asset) << kind.mime;
    }
}

TEST(Zel_NodeTest, SameNodeByOwnIDThenByMoniker)
{
    const TestNode a(QString(), QString(), QStringLiteral("mon-a"), QStringLiteral("7"));
    const TestNode b(QString(), QString(), QStringLiteral("mon-b"), QStringLiteral("7"));
    EXPECT_TRUE(a.sameNode(&b));

    const TestNode c(QString(), QString(), QStringLiteral("same"), QStringLiteral("1"));
    const TestNode d(QString(), QString(), QStringLiteral("same"), QStringLiteral("2"));
    EXPECT_TRUE(c.sameNode(&d));

    const TestNode e(QString(), QString(), QStringLiteral("x"), QStringLiteral("1"));
    const TestNode f(QString(), QString(), QStringLiteral("X"), QStringLiteral("2"));
    EXPECT_FALSE(e.sameNode(&f));
    EXPECT_TRUE(e != f);

    // Only this node's stored ID counts; the other's is asked virtually.
    const VirtualIdentityNode virtualOne(QStringLiteral("7"), QStringLiteral("v"));
    const TestNode stored(QString(), QString(), QStringLiteral("s"), QStringLiteral("7"));
    EXPECT_FALSE(virtualOne.sameNode(&stored)); // its stored ID is empty: monikers v and s differ
    EXPECT_TRUE(stored.sameNode(&virtualOne));
    const VirtualIdentityNode virtualTwo(QStringLiteral("8"), QStringLiteral("s"));
    EXPECT_TRUE(virtualTwo.sameNode(&stored)); // monikers through the override

    // Empty IDs and empty monikers: the same node.
    const Zel_Node blank1;
    const Zel_Node blank2;
    EXPECT_TRUE(blank1.sameNode(&blank2));
    EXPECT_TRUE(blank1 == blank2);

    // A null pointer is no node.
    EXPECT_FALSE(a.sameNode(nullptr));
    EXPECT_FALSE(Zel_Node().sameNode(nullptr));
}

TEST(Zel_NodeTest, OrdersByRankThenNameIgnoringCaseThenCaseThenMoniker)
{
    // Rank beats name.
    EXPECT_TRUE(*node("sequence", u("zzz")) < *node("masterclip", u("aaa")));
    EXPECT_FALSE(*node("masterclip", u("aaa")) < *node("sequence", u("zzz")));
    for (const char* media : { "sequence", "masterclip", "clip", "subclip", "filemob", "stereosubclip" }) {
        EXPECT_TRUE(*node(media, u("z")) < *node("bin", u("a"))) << media;
        EXPECT_FALSE(*node("bin", u("a")) < *node(media, u("z"))) << media;
    }
    EXPECT_TRUE(*node("physical", u("z")) < *node("unlisted", u("a")));

    EXPECT_TRUE(*node("bin", u("abc")) < *node("bin", u("ABD")));
    EXPECT_FALSE(*node("bin", u("ABD")) < *node("bin", u("abc")));
    EXPECT_TRUE(*node("bin", u("Abc")) < *node("bin", u("abc")));
    EXPECT_FALSE(*node("bin", u("abc")) < *node("bin", u("Abc")));
    EXPECT_TRUE(*node("bin", u("same"), "m1") < *node("bin", u("same"), "m2"));
    EXPECT_FALSE(*node("bin", u("same"), "m2") < *node("bin", u("same"), "m1"));
    EXPECT_FALSE(*node("bin", u("same"), "m1") < *node("bin", u("same"), "m1"));

    // Equal ranks of different types go on to the names.
    EXPECT_TRUE(*node("clip", u("a")) < *node("masterclip", u("b")));
    EXPECT_FALSE(*node("masterclip", u("b")) < *node("clip", u("a")));
    EXPECT_TRUE(*node("masterclip", u("a")) < *node("clip", u("b")));
    EXPECT_TRUE(*node("unlisted", u("a")) < *node("other", u("b")));
    EXPECT_FALSE(*node("other", u("b")) < *node("unlisted", u("a")));
    EXPECT_FALSE(*node("other", u("a"), "m") < *node("unlisted", u("a"), "m"));
    EXPECT_FALSE(*node("unlisted", u("a"), "m") < *node("other", u("a"), "m"));

    // The lowered names are toLower()'s: µ and ſ stay themselves, so µ (U+00B5)
    // sorts before Μ/μ (U+03BC) and ſ (U+017F) after S/s.
    EXPECT_TRUE(*node("bin", u("µ")) < *node("bin", u("Μ")));
    EXPECT_TRUE(*node("bin", u("s")) < *node("bin", u("ſ")));
    // Ÿ (U+0178) lowers to ÿ (U+00FF): tied, then the exact units decide.
    EXPECT_TRUE(*node("bin", u("ÿ")) < *node("bin", u("Ÿ")));
    EXPECT_FALSE(*node("bin", u("Ÿ")) < *node("bin", u("ÿ")));
    EXPECT_TRUE(*node("bin", u("ÿa")) < *node("bin", u("Ÿb")));
    EXPECT_TRUE(*node("bin", u("À")) < *node("bin", u("àb")));
    EXPECT_TRUE(*node("bin", u("×")) < *node("bin", u("ø"))); // × (D7) is no letter
    // Σ lowers to σ (U+03C3), which follows ς (U+03C2); case folding would tie them.
    EXPECT_TRUE(*node("bin", u("ς")) < *node("bin", u("Σ")));
    EXPECT_FALSE(*node("bin", u("Σ")) < *node("bin", u("ς")));
}

TEST(Zel_NodeTest, NameComparisonEqualsToLowerDefinition)
{
    std::mt19937 random(20240501);
    for (int i = 0; i < 200000; ++i) {
        const QString a = randomName(random, 4);
        const QString b = (i % 3 == 0) ? a.toUpper() : randomName(random, 4);
        TestNode na(QStringLiteral("bin"), a, QStringLiteral("m"));
        TestNode nb(QStringLiteral("bin"), b, QStringLiteral("m"));
        ASSERT_EQ(na < nb, referenceLess(na, nb)) << a.toStdString() << " vs " << b.toStdString();
        ASSERT_EQ(nb < na, referenceLess(nb, na)) << b.toStdString() << " vs " << a.toStdString();
    }
}

TEST(Zel_NodeTest, SortingMixedNodesIsAStrictWeakOrdering)
{
    std::mt19937 random(7);
    std::vector<NodeSP> nodes = randomNodes(random, 4000);
    const auto less = [](const NodeSP& a, const NodeSP& b) { return *a < *b; };
    std::sort(nodes.begin(), nodes.end(), less);
    ASSERT_TRUE(std::is_sorted(nodes.begin(), nodes.end(), less));
    for (std::size_t i = 1; i < nodes.size(); ++i)
        ASSERT_FALSE(referenceLess(*nodes[i], *nodes[i - 1])) << i;

    // The axioms, checked exhaustively on a smaller mixed sample.
    const std::vector<NodeSP> sample = randomNodes(random, 70);
    const std::size_t n = sample.size();
    std::vector<std::vector<char>> lt(n, std::vector<char>(n));
    for (std::size_t i = 0; i < n; ++i)
        for (std::size_t j = 0; j < n; ++j) {
            lt[i][j] = *sample[i] < *sample[j];
            ASSERT_EQ(static_cast<bool>(lt[i][j]), referenceLess(*sample[i], *sample[j]));
        }
    for (std::size_t i = 0; i < n; ++i) {
        ASSERT_FALSE(lt[i][i]) << "irreflexive " << i;
        for (std::size_t j = 0; j < n; ++j) {
            ASSERT_FALSE(lt[i][j] && lt[j][i]) << "asymmetric " << i << ' ' << j;
            for (std::size_t k = 0; k < n; ++k) {
                if (lt[i][j] && lt[j][k]) {
                    ASSERT_TRUE(lt[i][k]) << "transitive " << i << ' ' << j << ' ' << k;
                }
                const bool ijEquiv = !lt[i][j] && !lt[j][i];
                const bool jkEquiv = !lt[j][k] && !lt[k][j];
                if (ijEquiv && jkEquiv) {
                    ASSERT_TRUE(!lt[i][k] && !lt[k][i]) << "equivalence " << i << ' ' << j << ' ' << k;
                }
            }
        }
    }
}

TEST(Zel_NodeTest, RelationsAreBuiltFromLessAndIdentity)
{
    // Same node (equal IDs) with different names: equal and also ordered.
    const TestNode a(QStringLiteral("bin"), QStringLiteral("a"), QStringLiteral("m1"), QStringLiteral("7"));
    const TestNode b(QStringLiteral("bin"), QStringLiteral("b"), QStringLiteral("m2"), QStringLiteral("7"));
    EXPECT_TRUE(a == b);
    EXPECT_FALSE(a != b);
    EXPECT_TRUE(a < b);
    EXPECT_TRUE(a <= b);
    EXPECT_FALSE(a > b);
    EXPECT_TRUE(a >= b);
    EXPECT_FALSE(b < a);
    EXPECT_TRUE(b <= a);
    EXPECT_FALSE(b > a);
    EXPECT_TRUE(b >= a);

    // Different nodes.
    const TestNode c(QStringLiteral("bin"), QStringLiteral("c"), QStringLiteral("m3"), QStringLiteral("8"));
    EXPECT_TRUE(a != c);
    EXPECT_TRUE(a <= c);
    EXPECT_FALSE(a >= c);
    EXPECT_TRUE(c > a);
    EXPECT_TRUE(c >= a);
    EXPECT_FALSE(c <= a);
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
    EXPECT_EQ(Zel_Node::colorFromName("red"), -1);
    EXPECT_EQ(Zel_Node::colorFromName(""), -1);
    EXPECT_EQ(Zel_Node::colorFromName("blu"), -1);
    EXPECT_EQ(Zel_Node::colorFromName("blue "), -1);
    EXPECT_EQ(Zel_Node::colorFromName("zzz"), -1);
    EXPECT_EQ(Zel_Node::colorFromName("aaa"), -1);
    EXPECT_EQ(Zel_Node::colorFromName("bl\xDC" "e"), -1); // Latin-1 Ü folds to ü, not u
    EXPECT_EQ(Zel_Node::colorFromName("\xC0\xFF"), -1);
    EXPECT_EQ(Zel_Node::colorFromName(nullptr), -1);
}

TEST(Zel_NodeListTest, CopiesShareTheNodes)
{
    Zel_NodeList list;
    list.append(boost::make_shared<TestNode>(QStringLiteral("bin"), QStringLiteral("a")));
    Zel_NodeList copy(list);
    Zel_NodeList assigned;
    assigned = list;
    EXPECT_EQ(copy.first(), list.first());
    EXPECT_EQ(assigned.first(), list.first());
    copy.first()->setValid(true);
    EXPECT_TRUE(list.first()->isValid());
    copy.append(boost::make_shared<Zel_Node>());
    EXPECT_EQ(list.size(), 1);
}
