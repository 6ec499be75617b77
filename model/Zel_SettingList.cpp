#include "Zel_SettingList.h"

#include "Zel_Debug.h"
#include "zel_qtcompat_p.h"
#include "zel_xml_p.h"

#include <QDateTime>
#include <QDomDocument>
#include <QDomElement>
#include <QHash>
#include <QStringView>

#include <algorithm>
#include <cstddef>
#include <vector>

namespace {

const char* const kTraceSource = "Zel_SettingList::toXML";

// The most levels a key may have. Readers of the document (QDom among them)
// walk nested elements recursively, so a key of tens of thousands of levels
// would overflow their stack.
const int kMaxLevels = 64;

enum class KeyProblem { None, InvalidName, TooDeep };

// One element of the document: its name (a level of a setting's key, whose
// characters the element refers to), the setting whose value is its text, and
// its place in the tree.
struct Element
{
    const QChar* name;
    int nameLength;
    int parent;
    uint hash; // of (parent, name)
    int firstChild = -1;
    int lastChild = -1;
    int nextSibling = -1;
    int text = -1; // index of the setting whose value is the text; -1: none
};

// The elements the settings' keys give: each level of a key is the first
// child element of that name under the level before it, made when there is
// none, and the last level is always a new element. Elements are found by
// (parent, name) through an open-addressing table, so that a key costs time
// in proportion to its length however wide the tree is. Every element is
// registered, so that a leaf made by one key is found (and given children)
// by a later key with it as a prefix, as "the first child with that name"
// requires.
class ElementTree
{
public:
    explicit ElementTree(int settings)
    {
        mElements.reserve(static_cast<std::size_t>(settings) + 1);
        mElements.push_back(Element{nullptr, 0, -1, 0}); // the root
        std::size_t capacity = 16;
        while (capacity < static_cast<std::size_t>(settings) * 2)
            capacity *= 2;
        mSlots.assign(capacity, -1);
    }

    // Adds the path of one key and returns its leaf element: -1 when the key
    // is empty, ends in "." (only the intermediate levels are made), has more
    // than kMaxLevels levels or yields an invalid element name (in the last
    // two cases nothing is made and *problem says why). The key's characters
    // must outlive the tree: the elements refer to them.
    int addPath(const QString& key, KeyProblem* problem)
    {
        *problem = KeyProblem::None;
        if (key.isEmpty())
            return -1;

        const QChar* const data = key.constData();
        const int size = key.size();
        int ends[kMaxLevels]; // where each level ends: at a dot or at the end
        int levels = 0;
        for (int i = 0; i < size; ++i) {
            if (data[i] == QLatin1Char('.')) {
                if (levels == kMaxLevels - 1) {
                    *problem = KeyProblem::TooDeep;
                    return -1;
                }
                ends[levels++] = i;
            }
        }
        ends[levels++] = size;

        const int last = levels - 1;
        int begin = 0;
        for (int level = 0; level < levels; ++level) {
            const QStringView name(data + begin, ends[level] - begin);
            if (!(level == last && name.isEmpty()) && !ZelXml::isValidName(name)) {
                *problem = KeyProblem::InvalidName;
                return -1;
            }
            begin = ends[level] + 1;
        }

        int parent = 0;
        begin = 0;
        for (int level = 0; level < last; ++level) {
            const int length = ends[level] - begin;
            const uint hash = nameHash(parent, data + begin, length);
            int* const slot = findSlot(parent, data + begin, length, hash);
            parent = *slot >= 0 ? *slot : appendElement(parent, data + begin, length, hash, slot);
            begin = ends[level] + 1;
        }
        const int length = size - begin;
        if (length == 0)
            return -1;
        const uint hash = nameHash(parent, data + begin, length);
        int* const slot = findSlot(parent, data + begin, length, hash);
        // An earlier element of that name stays the one later keys descend into.
        return appendElement(parent, data + begin, length, hash, *slot >= 0 ? nullptr : slot);
    }

    void setText(int element, int setting) { mElements[static_cast<std::size_t>(element)].text = setting; }

    const Element& at(int index) const { return mElements[static_cast<std::size_t>(index)]; }
    const Element& root() const { return mElements.front(); }

private:
    static uint nameHash(int parent, const QChar* name, int length)
    {
        return static_cast<uint>(qHash(QStringView(name, length))) ^ (static_cast<uint>(parent) * 0x9E3779B9u);
    }

    static std::size_t slotOf(uint hash, std::size_t mask)
    {
        return static_cast<std::size_t>((static_cast<unsigned long long>(hash) * 0x9E3779B97F4A7C15ull) >> 24) & mask;
    }

    // The slot holding the element (parent, name), or the empty slot where it
    // would go.
    int* findSlot(int parent, const QChar* name, int length, uint hash)
    {
        const std::size_t mask = mSlots.size() - 1;
        for (std::size_t i = slotOf(hash, mask);; i = (i + 1) & mask) {
            const int index = mSlots[i];
            if (index < 0)
                return &mSlots[i];
            const Element& element = at(index);
            if (element.hash == hash && element.parent == parent && element.nameLength == length
                && std::equal(name, name + length, element.name))
                return &mSlots[i];
        }
    }

    // Appends a new last child to parent and registers it in slot, unless slot is null.
    int appendElement(int parent, const QChar* name, int length, uint hash, int* slot)
    {
        const int index = static_cast<int>(mElements.size());
        mElements.push_back(Element{name, length, parent, hash});
        Element& parentElement = mElements[static_cast<std::size_t>(parent)];
        if (parentElement.lastChild >= 0)
            mElements[static_cast<std::size_t>(parentElement.lastChild)].nextSibling = index;
        else
            parentElement.firstChild = index;
        parentElement.lastChild = index;
        if (slot) {
            *slot = index;
            if (++mRegistered * 2 > mSlots.size())
                grow();
        }
        return index;
    }

    void grow()
    {
        std::vector<int> old(mSlots.size() * 2, -1);
        old.swap(mSlots);
        const std::size_t mask = mSlots.size() - 1;
        for (const int index : old) {
            if (index < 0)
                continue;
            std::size_t i = slotOf(at(index).hash, mask);
            while (mSlots[i] >= 0)
                i = (i + 1) & mask;
            mSlots[i] = index;
        }
    }

    std::vector<Element> mElements;
    std::vector<int> mSlots;
    std::size_t mRegistered = 0;
};

// Writes the document text straight into a QString through a pointer,
// growing the string (at least doubling it) only when a piece might not fit.
// The form is exactly the one in which QDomDocument::toString(1) writes the
// same DOM tree:
//   - one element per line, indented by one blank per level below the root;
//   - an element with text: start tag and text on one line, then its child
//     elements, the first one on that same line (it follows text) and, if it
//     has any, its end tag on a line of its own, indented; without children,
//     the end tag right after the text ("<k>v</k>", "<k></k>" for an empty text);
//   - an element without text or children: an empty-element tag ("<k/>");
//   - text escaped as ZelXml::writeElementText describes; a line break after
//     each end tag and empty-element tag, the root's included.
class DocumentWriter
{
public:
    DocumentWriter(const ElementTree& tree, const Zel_SettingList& settings, qsizetype expectedSize)
        : mTree(tree)
        , mSettings(settings)
    {
        mText.resize(std::max<qsizetype>(expectedSize, 256));
        mOut = mText.data();
    }

    void write(QStringView text)
    {
        reserve(text.size());
        put(text.data(), static_cast<int>(text.size()));
    }

    // The root's children and everything below them.
    void writeChildrenOfRoot()
    {
        for (int child = mTree.root().firstChild; child >= 0; child = mTree.at(child).nextSibling)
            writeElement(child, 1, false);
    }

    QString take()
    {
        mText.resize(mOut - mText.constData());
        return std::move(mText);
    }

private:
    void writeElement(int index, int depth, bool afterText)
    {
        const Element& element = mTree.at(index);
        reserve(depth + element.nameLength + 4);
        if (!afterText)
            indent(depth);
        put(QLatin1Char('<'));
        put(element.name, element.nameLength);
        if (element.text < 0 && element.firstChild < 0) {
            put(QLatin1Char('/'));
            put(QLatin1Char('>'));
            put(QLatin1Char('\n'));
            return;
        }
        put(QLatin1Char('>'));
        if (element.text >= 0) {
            const QString value = mSettings.at(element.text).value();
            reserve(qsizetype(value.size()) * ZelXml::kMaxEscapedLength);
            mOut = ZelXml::writeElementText(value, mOut);
        } else {
            put(QLatin1Char('\n'));
        }
        for (int child = element.firstChild; child >= 0; child = mTree.at(child).nextSibling)
            writeElement(child, depth + 1, child == element.firstChild && element.text >= 0);
        reserve(depth + element.nameLength + 4);
        if (element.firstChild >= 0)
            indent(depth);
        put(QLatin1Char('<'));
        put(QLatin1Char('/'));
        put(element.name, element.nameLength);
        put(QLatin1Char('>'));
        put(QLatin1Char('\n'));
    }

    void reserve(qsizetype count)
    {
        const qsizetype used = mOut - mText.constData();
        if (mText.size() - used >= count)
            return;
        mText.resize(std::max<qsizetype>(mText.size() * 2, used + count));
        mOut = mText.data() + used;
    }
    void put(QLatin1Char c) { *mOut++ = c; }
    void put(const QChar* text, int length) { mOut = std::copy(text, text + length, mOut); }
    void indent(int depth) { mOut = std::fill_n(mOut, depth, QChar(QLatin1Char(' '))); }

    const ElementTree& mTree;
    const Zel_SettingList& mSettings;
    QString mText;
    QChar* mOut = nullptr;
};

// The root's start tag with its attributes, as the DOM writes it: the DOM's
// order of attributes is that of its internal hash of them (in Qt 5 and in Qt
// 6 before 6.5, which depends on the process's hash seed) or their names
// sorted (later Qt 6), so it is taken from the DOM itself. The text ends in
// "/>\n", the form of a root without children.
QString rootTag(const QString& rootName, const QDateTime& moment)
{
    QDomDocument document;
    QDomElement root = document.createElement(rootName);
    document.appendChild(root);
    root.setAttribute(QStringLiteral("version"), QStringLiteral("1.0"));
    root.setAttribute(QStringLiteral("modifydate"),
                      ZelXml::xmlCharsOnly(ZelCompat::systemTextDate(moment.toLocalTime())));
    root.setAttribute(QStringLiteral("modifydateInt"), QString::number(ZelCompat::toTimeT(moment)));
    return document.toString(1);
}

// The trace text for a key that is left out. A key that is too deep is shown
// by its first kMaxLevels levels only.
QString leftOutText(const QString& key, KeyProblem problem)
{
    if (problem == KeyProblem::TooDeep) {
        return QStringLiteral("key \"%1...\" has %2 levels, more than %3; setting left out")
            .arg(key.section(QLatin1Char('.'), 0, kMaxLevels - 1), QString::number(key.count(QLatin1Char('.')) + 1),
                 QString::number(kMaxLevels));
    }
    return QStringLiteral("key \"%1\" does not give valid XML element names; setting left out").arg(key);
}

} // namespace

Zel_SettingList::Zel_SettingList() = default;
Zel_SettingList::Zel_SettingList(const Zel_SettingList& other) = default;
Zel_SettingList& Zel_SettingList::operator=(const Zel_SettingList& other) = default;
Zel_SettingList::~Zel_SettingList() = default;

Zel_Setting Zel_SettingList::findByKey(const QString& key) const
{
    for (const Zel_Setting& setting : *this) {
        if (setting.key() == key)
            return setting;
    }
    return Zel_Setting();
}

void Zel_SettingList::addIfKeyNotInList(Zel_Setting setting)
{
    const QString key = setting.key();
    for (const Zel_Setting& existing : std::as_const(*this)) {
        if (existing.key() == key)
            return;
    }
    append(std::move(setting));
}

Zel_SettingList::operator QString() const
{
    QString text;
    for (int i = 0; i < size(); ++i) {
        if (i > 0)
            text += QLatin1Char('\n');
        text += static_cast<QString>(at(i));
    }
    return text;
}

const QString Zel_SettingList::toXML(const QString& rootName) const
{
    return toXML(rootName, QDateTime::currentDateTime());
}

const QString Zel_SettingList::toXML(const QString& rootName, const QDateTime& modifyDate) const
{
    if (!ZelXml::isValidName(rootName)) {
        Zel_Debug::instance()->debug(QLatin1String(kTraceSource),
            QStringLiteral("root name \"%1\" is not a valid XML name; no document written").arg(rootName), 0);
        return QString();
    }

    const boost::shared_ptr<Zel_Debug> trace = Zel_Debug::instance();
    // The keys stay here while the elements refer to their characters.
    std::vector<QString> keys;
    keys.reserve(static_cast<std::size_t>(size()));
    ElementTree tree(size());
    qsizetype expectedSize = 0;
    for (int i = 0; i < size(); ++i) {
        keys.push_back(at(i).key());
        const QString& key = keys.back();
        KeyProblem problem = KeyProblem::None;
        const int leaf = tree.addPath(key, &problem);
        if (problem != KeyProblem::None) {
            if (trace->getEnabled())
                trace->debug(QLatin1String(kTraceSource), leftOutText(key, problem), 0);
            continue;
        }
        if (leaf >= 0)
            tree.setText(leaf, i);
        // Roughly: both tags, indentation, the value.
        expectedSize += 2 * key.size() + 16;
    }

    const QString tag = rootTag(rootName, modifyDate.isValid() ? modifyDate : QDateTime::currentDateTime());
    Q_ASSERT(tag.endsWith(QLatin1String("/>\n")));
    if (tree.root().firstChild < 0)
        return tag;
    DocumentWriter writer(tree, *this, expectedSize + 2 * tag.size());
    // "<Root .../>\n" becomes "<Root ...>\n" ... "</Root>\n".
    writer.write(QStringView(tag).left(tag.size() - 3));
    writer.write(u">\n");
    writer.writeChildrenOfRoot();
    writer.write(u"</");
    writer.write(rootName);
    writer.write(u">\n");
    return writer.take();
}
