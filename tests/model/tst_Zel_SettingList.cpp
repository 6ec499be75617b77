#include "Zel_SettingList.h"

#include "TraceCapture.h"

#include <QDateTime>
#include <QDomDocument>
#include <QDomElement>
#include <QDomImplementation>
#include <QDomNode>
#include <QElapsedTimer>
#include <QRegularExpression>
#include <QStringList>

#include <gtest/gtest.h>

#include <algorithm>
#include <set>
#include <string>
#include <vector>

namespace {

Zel_SettingList settings(std::initializer_list<std::pair<const char*, const char*>> pairs)
{
    Zel_SettingList list;
    for (const auto& pair : pairs)
        list.append(Zel_Setting(QString::fromUtf8(pair.first), QString::fromUtf8(pair.second)));
    return list;
}

// Parses the text; fails the test when it is not well-formed XML.
QDomElement parse(const QString& xml)
{
    QDomDocument document;
    QString error;
    int line = 0;
    int column = 0;
    EXPECT_TRUE(document.setContent(xml, &error, &line, &column))
        << error.toStdString() << " at " << line << ":" << column << " in\n" << xml.toStdString();
    return document.documentElement();
}

// The concatenated text nodes directly inside an element (not its children's).
QString ownText(const QDomElement& element)
{
    QString text;
    for (QDomNode node = element.firstChild(); !node.isNull(); node = node.nextSibling()) {
        if (node.isText())
            text += node.toText().data();
    }
    return text;
}

std::string str(const QString& text)
{
    return text.toStdString();
}

// The element's children as "tag=own text(children)" words: the tree in one line.
std::string outline(const QDomElement& element)
{
    std::string words;
    for (QDomElement child = element.firstChildElement(); !child.isNull(); child = child.nextSiblingElement()) {
        words += (words.empty() ? "" : " ") + str(child.tagName());
        if (!ownText(child).isEmpty())
            words += "=" + str(ownText(child));
        if (!child.firstChildElement().isNull())
            words += "(" + outline(child) + ")";
    }
    return words;
}

} // namespace

TEST(Zel_SettingListTest, SettingComparesAndRendersKeyColonValue)
{
    EXPECT_EQ(QStringLiteral("a.b:v"), static_cast<QString>(Zel_Setting("a.b", "v")));
    EXPECT_EQ(QStringLiteral(":"), static_cast<QString>(Zel_Setting()));
    EXPECT_TRUE(Zel_Setting("k", "v") == Zel_Setting("k", "v"));
    EXPECT_TRUE(Zel_Setting("k", "v") != Zel_Setting("K", "v"));
    EXPECT_TRUE(Zel_Setting("k", "v") != Zel_Setting("k", "V"));
    EXPECT_FALSE(Zel_Setting("k", "v") != Zel_Setting("k", "v"));
}

TEST(Zel_SettingListTest, FindByKeyGivesTheFirstAndAddIfKeyNotInListKeepsTheOld)
{
    Zel_SettingList list = settings({{"k", "1"}, {"other", "x"}, {"k", "2"}});
    EXPECT_EQ(Zel_Setting("k", "1"), list.findByKey("k"));
    EXPECT_EQ(Zel_Setting(), list.findByKey("K"));
    EXPECT_TRUE(list.findByKey("missing").key().isEmpty());
    EXPECT_TRUE(list.findByKey("missing").value().isEmpty());

    list.addIfKeyNotInList(Zel_Setting("other", "changed"));
    EXPECT_EQ(3, list.size());
    EXPECT_EQ(QStringLiteral("x"), list.findByKey("other").value());
    list.addIfKeyNotInList(Zel_Setting("new", "n"));
    ASSERT_EQ(4, list.size());
    EXPECT_EQ(Zel_Setting("new", "n"), list.last());

    EXPECT_EQ(QStringLiteral("k:1\nother:x\nk:2\nnew:n"), static_cast<QString>(list));
    EXPECT_EQ(QString(), static_cast<QString>(Zel_SettingList()));
    const Zel_SettingList copy(list);
    EXPECT_EQ(list, copy);
}

TEST(Zel_SettingListTest, XmlNestsDottedKeysWithOneBlankOfIndentPerLevel)
{
    const Zel_SettingList list =
        settings({{"General.Language", "en"}, {"General.Units", "metric"}, {"Recent", ""}});
    const QString xml = list.toXML("Settings");

    const QDomElement root = parse(xml);
    EXPECT_EQ(QStringLiteral("Settings"), root.tagName());
    EXPECT_EQ(3, root.attributes().count());
    EXPECT_EQ(QStringLiteral("1.0"), root.attribute("version"));
    EXPECT_EQ(outline(root), "General(Language=en Units=metric) Recent");

    // Layout: no declaration, root start tag first, one blank per level,
    // leaves on one line, a line break after the root's end tag. The root's
    // attribute order is the serialiser's and is not compared.
    // An empty value is an empty text node, <Recent></Recent>, not <Recent/>.
    const QStringList lines = xml.split('\n');
    EXPECT_TRUE(lines[0].startsWith("<Settings ")) << str(lines[0]);
    EXPECT_EQ(lines.mid(1), QStringList({" <General>", "  <Language>en</Language>", "  <Units>metric</Units>",
                                         " </General>", " <Recent></Recent>", "</Settings>", ""}))
        << str(xml);
}

TEST(Zel_SettingListTest, XmlSharesIntermediatesAndKeepsDuplicateLeavesInOrder)
{
    const QDomElement root = parse(settings({{"a.b", "1"}, {"a.d", "2"}, {"a.b", "3"}, {"x.y.z", "v"}, {"a.b", "4"},
                                             {"x.y.w", "w"}, {"leaf", "first"}, {"leaf", "second"}})
                                       .toXML("R"));
    EXPECT_EQ(outline(root), "a(b=1 d=2 b=3 b=4) x(y(z=v w=w)) leaf=first leaf=second");
}

TEST(Zel_SettingListTest, XmlLetsALeafGainChildrenThroughTheFirstElementOfThatName)
{
    // "a" is made as a leaf with text; "a.b" then descends into that same
    // element (the first child named a), not into the second leaf a.
    const QDomElement root =
        parse(settings({{"a", "x"}, {"a", "second"}, {"a.b", "y"}, {"a.b.c", "z"}}).toXML("R"));
    EXPECT_EQ(outline(root), "a=x(b=y(c=z)) a=second");
}

TEST(Zel_SettingListTest, XmlDropsEmptyKeysAndTheValuesOfKeysEndingInADot)
{
    TraceCapture trace;
    const QDomElement root =
        parse(settings({{"", "lost"}, {"p.", "lost too"}, {"q.r.", "also lost"}, {"s", ""}}).toXML("R"));
    EXPECT_EQ(outline(root), "p q(r) s");
    EXPECT_FALSE(root.firstChildElement("p").hasChildNodes());
    EXPECT_FALSE(root.firstChildElement("q").firstChildElement("r").hasChildNodes());
    // These are ordinary outcomes, not faults: no trace line.
    EXPECT_TRUE(trace.orvLines().empty());
}

TEST(Zel_SettingListTest, EmptyListGivesTheRootWithItsThreeAttributesOnly)
{
    const QString xml = Zel_SettingList().toXML("Settings");
    const QDomElement root = parse(xml);
    EXPECT_EQ(QStringLiteral("Settings"), root.tagName());
    EXPECT_FALSE(root.hasChildNodes());
    EXPECT_EQ(3, root.attributes().count());
    EXPECT_TRUE(root.hasAttribute("version") && root.hasAttribute("modifydate") && root.hasAttribute("modifydateInt"));
    EXPECT_TRUE(xml.endsWith("/>\n")) << str(xml);
    EXPECT_EQ(1, xml.count('\n'));

    // Dots in the root name are not split.
    EXPECT_EQ(QStringLiteral("my.Settings"), parse(Zel_SettingList().toXML("my.Settings")).tagName());
}

TEST(Zel_SettingListTest, ModifyDateIsWrittenInBothFormsAndDefaultsToNow)
{
    const QDateTime moment(QDate(2001, 9, 9), QTime(1, 46, 40), Qt::UTC);
    const QDomElement root = parse(settings({{"k", "v"}}).toXML("R", moment));
    EXPECT_EQ(QStringLiteral("1000000000"), root.attribute("modifydateInt"));
    EXPECT_EQ(QStringLiteral("1.0"), root.attribute("version"));
    // Local time in TextDate form: day name, month name, day, hh:mm:ss,
    // four-digit year. The names come from the system locale (checked under a
    // German one by the locale tests).
    const QString date = root.attribute("modifydate");
    EXPECT_TRUE(date.endsWith(moment.toLocalTime().toString(QStringLiteral(" d hh:mm:ss yyyy")))) << str(date);
    EXPECT_TRUE(QRegularExpression("^\\S+ \\S+ \\d{1,2} \\d{2}:\\d{2}:\\d{2} \\d{4}$").match(date).hasMatch())
        << str(date);

    // Outside the unsigned 32-bit range the stamp saturates instead of wrapping.
    const QDateTime early(QDate(1969, 12, 31), QTime(23, 59, 59), Qt::UTC);
    EXPECT_EQ(QStringLiteral("4294967295"), parse(Zel_SettingList().toXML("R", early)).attribute("modifydateInt"));
    const QDateTime last(QDate(2106, 2, 7), QTime(6, 28, 14), Qt::UTC);
    EXPECT_EQ(QStringLiteral("4294967294"), parse(Zel_SettingList().toXML("R", last)).attribute("modifydateInt"));

    // No moment, or an invalid one: the current time in whole seconds.
    const qint64 before = QDateTime::currentDateTimeUtc().toSecsSinceEpoch();
    const Zel_SettingList empty;
    for (const QDomElement& stamped : {parse(empty.toXML("R")), parse(empty.toXML("R", QDateTime()))}) {
        const QString seconds = stamped.attribute("modifydateInt");
        EXPECT_TRUE(QRegularExpression("^[0-9]+$").match(seconds).hasMatch()) << str(seconds);
        EXPECT_LE(before, seconds.toLongLong());
        EXPECT_GE(QDateTime::currentDateTimeUtc().toSecsSinceEpoch(), seconds.toLongLong());
        EXPECT_TRUE(stamped.attribute("modifydate")
                        .endsWith(QDateTime::fromSecsSinceEpoch(seconds.toLongLong()).toLocalTime().toString(
                            QStringLiteral(" d hh:mm:ss yyyy"))))
            << str(stamped.attribute("modifydate"));
    }
}

TEST(Zel_SettingListTest, KeysGivingInvalidNamesAreLeftOutWithOneTraceLineEach)
{
    TraceCapture trace;
    const QDomImplementation::InvalidDataPolicy policy = QDomImplementation::invalidDataPolicy();

    const QString xml = settings({{"good", "1"}, {"a b", "space"}, {"1x", "digit first"}, {"x<y", "angle"},
                                  {"ok.a b", "bad leaf"}, {"bad one.ok", "bad intermediate"}, {"a..b", "empty level"},
                                  {".", "dot"}, {".x", "leading dot"}, {"ns:name", "colon"}, {"-x", "dash first"},
                                  {"x&y", "ampersand"}, {"tail", "2"}})
                            .toXML("R");
    EXPECT_EQ(policy, QDomImplementation::invalidDataPolicy());

    const QDomElement root = parse(xml);
    // Nothing at all is made for a rejected key, not even its valid levels.
    EXPECT_EQ(outline(root), "good=1 tail=2") << str(xml);

    const std::vector<std::string> lines = trace.orvLines();
    ASSERT_EQ(11u, lines.size());
    const char* const firstKeys[] = {"a b", "1x", "x<y"};
    for (int i = 0; i < 3; ++i)
        EXPECT_EQ("ZEL: Zel_SettingList::toXML: key \"" + std::string(firstKeys[i])
                      + "\" does not give valid XML element names; setting left out",
                  lines[i]);
    EXPECT_NE(std::string::npos, lines[9].find("\"-x\""));
}

TEST(Zel_SettingListTest, InvalidRootNameGivesAnEmptyTextAndATraceLine)
{
    TraceCapture trace;
    const Zel_SettingList list = settings({{"k", "v"}});
    EXPECT_EQ(QString(), list.toXML("bad root"));
    EXPECT_EQ(QString(), list.toXML(""));
    EXPECT_EQ(QString(), list.toXML("<R>"));
    const std::vector<std::string> lines = trace.orvLines();
    ASSERT_EQ(3u, lines.size());
    EXPECT_EQ("ZEL: Zel_SettingList::toXML: root name \"bad root\" is not a valid XML name; no document written",
              lines[0]);
}

TEST(Zel_SettingListTest, ValuesRoundTripWithCharactersXmlCannotCarryRemoved)
{
    const QString markup = QStringLiteral("<tag attr=\"v\"> & 'q' ]]> &amp;");
    const QString lineBreaks = QStringLiteral("a\r\nb\rc\td\ne");
    const QString nonAscii = QString::fromUtf8("Grüße 日本 \xF0\x9F\x98\x80 end");
    // Controls, non-characters, a high surrogate without its low half, a low one alone, NUL.
    QString controls;
    for (char16_t unit : {u'x', u'\x01', u'\x1B', u'\xFFFE', u'\xFFFF', char16_t(0xD800), u'y', char16_t(0xDC00), u'\0'})
        controls += QChar(unit);

    Zel_SettingList list;
    list.append(Zel_Setting("markup", markup));
    list.append(Zel_Setting("breaks", lineBreaks));
    list.append(Zel_Setting("unicode", nonAscii));
    list.append(Zel_Setting("controls", controls));
    list.append(Zel_Setting(QString::fromUtf8("Einstellung.Größe.日本"), "named"));

    const QDomElement root = parse(list.toXML("R"));
    EXPECT_EQ(markup, root.firstChildElement("markup").text());
    EXPECT_EQ(lineBreaks, root.firstChildElement("breaks").text());
    EXPECT_EQ(nonAscii, root.firstChildElement("unicode").text());
    EXPECT_EQ(QStringLiteral("xy"), root.firstChildElement("controls").text());
    EXPECT_EQ(outline(root.lastChildElement()), "Größe(日本=named)");
}

TEST(Zel_SettingListTest, WideListsAreBuiltInLinearTime)
{
    // 100,000 settings: half directly under the root, half under one shared
    // parent. A scan of all children per key would take minutes.
    const int count = 100000;
    Zel_SettingList list;
    list.reserve(count);
    for (int i = 0; i < count / 2; ++i) {
        list.append(Zel_Setting(QStringLiteral("k%1").arg(i), QString::number(i)));
        list.append(Zel_Setting(QStringLiteral("group.g%1").arg(i), QString::number(i)));
    }

    QElapsedTimer timer;
    timer.start();
    const QString xml = list.toXML("R");
    const qint64 elapsed = timer.elapsed();
    EXPECT_LT(elapsed, 30000) << "toXML of " << count << " settings took " << elapsed << " ms";

    const QDomElement root = parse(xml);
    EXPECT_EQ(count / 2 + 1, root.childNodes().count());
    const QDomElement group = root.firstChildElement("group");
    EXPECT_EQ(count / 2, group.childNodes().count());
    EXPECT_EQ(QStringLiteral("0"), group.firstChildElement("g0").text());
    EXPECT_EQ(QString::number(count / 2 - 1), group.lastChildElement().text());
    EXPECT_EQ(QString::number(count / 2 - 1), root.lastChildElement().text());
}

TEST(Zel_SettingListTest, EveryCharacterInKeysAndValuesGivesWellFormedXml)
{
    // Each UTF-16 code unit as the first and as a later character of a key
    // and inside a value: whatever is kept must parse back; values keep
    // exactly the characters XML 1.0 can carry.
    TraceCapture quiet(false);
    int keptStarts = 0;
    for (int block = 0; block < 0x10000; block += 0x400) {
        Zel_SettingList list;
        QString value;
        QString expected;
        for (int u = std::max(block, 1); u < block + 0x400; ++u) {
            const QChar c(static_cast<char16_t>(u));
            list.append(Zel_Setting(QString(c) + QStringLiteral("s"), "start"));
            list.append(Zel_Setting(QStringLiteral("i") + c, "inner"));
            value += c;
            const bool carried = (u >= 0x20 || u == 0x9 || u == 0xA || u == 0xD)
                && (u < 0xD800 || u > 0xDFFF) && u != 0xFFFE && u != 0xFFFF;
            if (carried)
                expected += c;
        }
        list.append(Zel_Setting("value", value));

        const QDomElement root = parse(list.toXML("R"));
        ASSERT_FALSE(root.isNull()) << "block " << block;
        EXPECT_EQ(expected, root.lastChildElement("value").text()) << "block " << block;
        for (QDomElement child = root.firstChildElement(); !child.isNull(); child = child.nextSiblingElement()) {
            if (child.text() == QLatin1String("start"))
                ++keptStarts;
        }
    }
    // Letters of many scripts are kept, not only ASCII ones.
    EXPECT_GT(keptStarts, 30000);

    const QDomElement root =
        parse(settings({{"_", "1"}, {"a-b.c_d.e1", "2"}, {"xmlns", "3"}, {"É.日本.ß", "4"}}).toXML("R"));
    EXPECT_EQ(outline(root), "_=1 a-b(c_d(e1=2)) xmlns=3 É(日本(ß=4))");
}

namespace {

// Writes an element of this name with QDom, reads the text back with QDom,
// and tells whether the element returns under the same name: what an
// application of this Qt build sees of a settings document.
bool domReadsBack(const QString& name)
{
    QDomDocument written;
    QDomElement root = written.createElement(QStringLiteral("r"));
    written.appendChild(root);
    QDomElement element = written.createElement(name);
    root.appendChild(element);
    element.appendChild(written.createTextNode(QStringLiteral("v")));

    QDomDocument read;
    if (!read.setContent(written.toString(1)))
        return false;
    const QDomElement back = read.documentElement().firstChildElement();
    return back.tagName() == name && back.text() == QLatin1String("v") && back.nextSiblingElement().isNull();
}

// Which of the keys the library keeps: one document with every key, each
// value naming its key's index.
std::vector<bool> keptKeys(const QStringList& keys)
{
    Zel_SettingList list;
    list.reserve(keys.size());
    for (int i = 0; i < keys.size(); ++i)
        list.append(Zel_Setting(keys[i], QString::number(i)));
    const QDomElement root = parse(list.toXML("R"));
    std::vector<bool> kept(static_cast<std::size_t>(keys.size()), false);
    for (QDomElement child = root.firstChildElement(); !child.isNull(); child = child.nextSiblingElement()) {
        bool isIndex = false;
        const int index = child.text().toInt(&isIndex);
        if (!isIndex)
            continue; // the intermediate level of a key with a dot
        EXPECT_EQ(str(keys[index]), str(child.tagName())) << "a kept key must come back as its own name";
        kept[static_cast<std::size_t>(index)] = true;
    }
    return kept;
}

} // namespace

TEST(Zel_SettingListTest, NameRuleKeepsExactlyTheNamesBothQtReadersReadBack)
{
    // The rule was found by writing and reading every BMP character, first and
    // after a letter, with Qt 5's and Qt 6's DOM: Qt 6's reader takes the XML
    // 1.0 Appendix B letters and name characters, and Qt 5's takes all of
    // them but these five, which the library therefore refuses too.
    const std::set<int> qt5RefusesFirst = {0x212E};
    const std::set<int> qt5RefusesLater = {0x00B7, 0x0387, 0x06DD, 0x06DE, 0x212E};
    const bool qt6 = QT_VERSION_MAJOR >= 6;

    TraceCapture quiet(false);
    QStringList firstKeys;
    QStringList laterKeys;
    for (int u = 0; u <= 0xFFFF; ++u) {
        const QChar c(static_cast<char16_t>(u));
        firstKeys.append(QString(c));
        laterKeys.append(QStringLiteral("a") + c);
    }
    const std::vector<bool> keptFirst = keptKeys(firstKeys);
    const std::vector<bool> keptLater = keptKeys(laterKeys);

    int mismatches = 0;
    for (int u = 0; u <= 0xFFFF && mismatches < 20; ++u) {
        for (bool later : {false, true}) {
            if (later && u == '.')
                continue; // in a key, a dot separates levels
            const QString name = later ? laterKeys[u] : firstKeys[u];
            const bool kept = later ? keptLater[u] : keptFirst[u];
            const bool readBack = domReadsBack(name);
            const bool refusedByQt5 = (later ? qt5RefusesLater : qt5RefusesFirst).count(u) > 0;
            // Kept names read back in this build. In Qt 6 the converse holds
            // too, except for the characters Qt 5 refuses; in Qt 5 those are
            // indeed refused.
            bool right = !kept || readBack;
            if (refusedByQt5)
                right = right && !kept && readBack == qt6;
            else if (qt6)
                right = right && kept == readBack;
            if (!right) {
                ++mismatches;
                ADD_FAILURE() << "U+" << QString::number(u, 16).toStdString() << (later ? " after a letter" : " first")
                              << ": kept " << kept << ", read back " << readBack;
            }
        }
    }

    // Examples: modifier letters first (Hawaiian, Armenian) are kept; the
    // comma-below letters of Romanian are not (Qt 6 reads "țara" as an
    // invalid name), nor a middle dot or an estimate sign, nor ':'.
    const QDomElement root = parse(settings({{"ʻōlelo.ʻāina", "1"}, {"ՙx", "2"}, {"Größe.日本", "3"}, {"țara", "lost"},
                                             {"a·b", "lost"}, {"℮", "lost"}, {"x:y", "lost"}, {"_-.x", "4"}})
                                       .toXML("R"));
    EXPECT_EQ(outline(root), "ʻōlelo(ʻāina=1) ՙx=2 Größe(日本=3) _-(x=4)");
}

TEST(Zel_SettingListTest, KeysOfMoreThanSixtyFourLevelsAreLeftOutWithOneTraceLine)
{
    // 64 levels are kept; 65 and 50,000 are left out like other unusable
    // keys, and nothing deep reaches the DOM, whose writer recurses per level.
    const auto levels = [](int count) {
        QStringList parts;
        for (int i = 0; i < count; ++i)
            parts.append(QStringLiteral("a"));
        return parts.join(QLatin1Char('.'));
    };
    TraceCapture trace;
    Zel_SettingList list;
    list.append(Zel_Setting(levels(64), "deepest"));
    list.append(Zel_Setting(levels(65), "too deep"));
    list.append(Zel_Setting(levels(50000), "far too deep"));
    list.append(Zel_Setting("tail", "kept"));
    const QDomElement root = parse(list.toXML("R"));

    QDomElement leaf = root;
    int depth = 0;
    while (!leaf.firstChildElement("a").isNull()) {
        leaf = leaf.firstChildElement("a");
        ++depth;
    }
    EXPECT_EQ(64, depth);
    EXPECT_EQ(QStringLiteral("deepest"), leaf.text());
    EXPECT_EQ(QStringLiteral("kept"), root.lastChildElement().text());
    EXPECT_EQ(2, root.childNodes().count());

    // The line shows the first 64 levels of the key.
    const std::string shown = "ZEL: Zel_SettingList::toXML: key \"" + str(levels(64)) + "...\" has ";
    EXPECT_EQ(trace.orvLines(), (std::vector<std::string>{shown + "65 levels, more than 64; setting left out",
                                                          shown + "50000 levels, more than 64; setting left out"}));
}
