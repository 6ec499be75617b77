#include "Zel_SettingList.h"

#include "Zel_Debug.h"
#include "zel_qtcompat_p.h"
#include "zel_xml_p.h"

#include <QDateTime>
#include <QDomDocument>
#include <QDomElement>
#include <QStringView>

#include <algorithm>
#include <cstddef>
#include <memory>
#include <new>
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
    int firstChild = -1;
    int lastChild = -1;
    int nextSibling = -1;
    int children = 0;              // child elements
    const QString* text = nullptr; // the value of a setting, or none
};

// Elements in blocks of a fixed size, so that growing never moves them, and
// blocks small enough for the allocator to reuse freed memory.
class ElementStore
{
public:
    Element& operator[](int index) { return mBlocks[index >> kBlockBits][index & kBlockMask]; }
    const Element& operator[](int index) const { return mBlocks[index >> kBlockBits][index & kBlockMask]; }

    int push(const Element& element)
    {
        if ((mSize & kBlockMask) == 0) {
            Block block(static_cast<Element*>(::operator new(sizeof(Element) << kBlockBits)));
            mBlocks.push_back(std::move(block));
        }
        new (&mBlocks.back()[mSize & kBlockMask]) Element(element);
        return mSize++;
    }

private:
    static const int kBlockBits = 10;
    static const int kBlockMask = (1 << kBlockBits) - 1;

    struct Release
    {
        void operator()(Element* block) const { ::operator delete(block); }
    };

    using Block = std::unique_ptr<Element[], Release>;

    std::vector<Block> mBlocks;
    int mSize = 0;
};

// The elements the settings' keys give: each level of a key is the first
// child element of that name under the level before it, made when there is
// none, and the last level is always a new element.
//
// A child is found among few siblings by walking them; once an element has
// kIndexedFrom children, its children are also entered, by (parent, name), in
// an open-addressing table (the first child of each name only), so that a key
// costs time in proportion to its length however wide the tree is, and the
// table holds only the children of wide elements. A lookup under an element
// without children costs nothing, and a last level is looked up only to keep
// the table's "first child of that name" when its parent is wide.
class ElementTree
{
public:
    ElementTree()
        : mSeed(ZelCompat::hashSeed())
    {
        mElements.push(Element{nullptr, 0, -1}); // the root
        mSlots.assign(64, Slot{0, -1});
    }

    // Adds the path of one key and returns its leaf element: -1 when the key
    // is empty, ends in "." (only the intermediate levels are made), has more
    // than kMaxLevels levels or yields an invalid element name (in the last
    // two cases nothing is made and *problem says why). The key's characters
    // must outlive the tree: the elements refer to them. firstHash, if not
    // null, is the hash of the first level that prefetch() gave.
    int addPath(const QString& key, KeyProblem* problem, const uint* firstHash)
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
            const QChar* const name = data + begin;
            const int length = ends[level] - begin;
            Probe probe;
            const int found = findChild(parent, name, length, level == 0 ? firstHash : nullptr, &probe);
            parent = found >= 0 ? found : appendChild(parent, level + 1, name, length, probe);
            begin = ends[level] + 1;
        }
        const int length = size - begin;
        if (length == 0)
            return -1;
        const QChar* const name = data + begin;
        // A leaf is looked up only in a wide parent, for the table's sake.
        Probe probe;
        if (isWide(element(parent)))
            findChild(parent, name, length, last == 0 ? firstHash : nullptr, &probe);
        return appendChild(parent, last + 1, name, length, probe);
    }

    // Readies what adding the key will read when the root is wide: the table
    // slot of the key's first level, which would otherwise be fetched from
    // memory, at random, when its turn comes. Returns false when the root is
    // not wide; otherwise sets *hash to the first level's hash, for addPath.
    bool prefetch(const QString& key, uint* hash) const
    {
        if (!isWide(root()))
            return false;
        const QChar* const data = key.constData();
        const int size = key.size();
        int length = 0;
        while (length < size && data[length] != QLatin1Char('.'))
            ++length;
        *hash = nameHash(0, data, length);
#if defined(__GNUC__)
        __builtin_prefetch(&mSlots[firstSlot(*hash)]);
#endif
        return true;
    }

    void setText(int index, const QString* text) { mElements[index].text = text; }

    const Element& at(int index) const { return mElements[index]; }
    const Element& root() const { return mElements[0]; }

    // The most characters the elements' tags, indentation and line breaks take.
    qsizetype markupSize() const { return mMarkupSize; }

private:
    // From this many children on, an element's children are found through the table.
    static const int kIndexedFrom = 8;

    struct Slot
    {
        uint hash;
        int element; // -1: empty
    };

    // Where a lookup in the table found no child: the empty slot where the
    // child goes, if it is made before the table changes.
    struct Probe
    {
        bool missed = false;
        uint hash = 0;
        std::size_t slot = 0;
    };

    Element& element(int index) { return mElements[index]; }

    static bool isWide(const Element& element) { return element.children >= kIndexedFrom; }

    static bool sameName(const Element& element, const QChar* name, int length)
    {
        return element.nameLength == length && std::equal(name, name + length, element.name);
    }

    // The first child of parent with this name, or -1; knownHash: the
    // name's hash under parent, if known. *probe tells a miss in the table.
    int findChild(int parent, const QChar* name, int length, const uint* knownHash, Probe* probe) const
    {
        const Element& parentElement = at(parent);
        if (!isWide(parentElement)) {
            for (int child = parentElement.firstChild; child >= 0; child = at(child).nextSibling) {
                if (sameName(at(child), name, length))
                    return child;
            }
            return -1;
        }
        const uint hash = knownHash ? *knownHash : nameHash(parent, name, length);
        const std::size_t slot = findSlot(parent, name, length, hash);
        const int found = mSlots[slot].element;
        if (found < 0)
            *probe = Probe{true, hash, slot};
        return found;
    }

    uint nameHash(int parent, const QChar* name, int length) const
    {
        return ZelCompat::hashText(QStringView(name, length), mSeed) ^ (static_cast<uint>(parent) * 0x9E3779B9u);
    }

    std::size_t firstSlot(uint hash) const
    {
        const unsigned long long spread = static_cast<unsigned long long>(hash) * 0x9E3779B97F4A7C15ull;
        return static_cast<std::size_t>(spread >> 24) & (mSlots.size() - 1);
    }

    // The slot holding the child (parent, name), or the empty slot where it would go.
    std::size_t findSlot(int parent, const QChar* name, int length, uint hash) const
    {
        const std::size_t mask = mSlots.size() - 1;
        for (std::size_t i = firstSlot(hash);; i = (i + 1) & mask) {
            const Slot& slot = mSlots[i];
            if (slot.element < 0)
                return i;
            if (slot.hash == hash) {
                const Element& candidate = at(slot.element);
                if (candidate.parent == parent && sameName(candidate, name, length))
                    return i;
            }
        }
    }

    // Enters the child in the table at the empty slot, keeping the table at
    // most half full.
    void enter(int child, uint hash, std::size_t slot)
    {
        mSlots[slot] = Slot{hash, child};
        if (++mEntered * 2 > mSlots.size())
            grow();
    }

    // Enters the child in the table, unless a child of that name is there.
    void enterIfFirst(int child)
    {
        const Element& entered = at(child);
        const uint hash = nameHash(entered.parent, entered.name, entered.nameLength);
        const std::size_t slot = findSlot(entered.parent, entered.name, entered.nameLength, hash);
        if (mSlots[slot].element < 0)
            enter(child, hash, slot);
    }

    // Appends a new last child, at this depth, to parent. probe: the lookup
    // of its name in parent, if parent is wide.
    int appendChild(int parent, int depth, const QChar* name, int length, const Probe& probe)
    {
        // Both tags indented, "<></>", "/" or a line break after the start
        // tag, a line break after the end tag: at most this much.
        mMarkupSize += 2 * qsizetype(depth + length) + 7;
        const int index = mElements.push(Element{name, length, parent});
        Element& parentElement = element(parent);
        if (parentElement.lastChild >= 0)
            element(parentElement.lastChild).nextSibling = index;
        else
            parentElement.firstChild = index;
        parentElement.lastChild = index;
        if (++parentElement.children == kIndexedFrom) {
            // From now on the children are found through the table.
            for (int child = parentElement.firstChild; child >= 0; child = at(child).nextSibling)
                enterIfFirst(child);
        } else if (probe.missed) {
            // The first child of its name in a wide parent.
            enter(index, probe.hash, probe.slot);
        }
        return index;
    }

    void grow()
    {
        std::vector<Slot> old(mSlots.size() * 2, Slot{0, -1});
        old.swap(mSlots);
        const std::size_t mask = mSlots.size() - 1;
        for (const Slot& slot : old) {
            if (slot.element < 0)
                continue;
            std::size_t i = firstSlot(slot.hash);
            while (mSlots[i].element >= 0)
                i = (i + 1) & mask;
            mSlots[i] = slot;
        }
    }

    const std::size_t mSeed;
    ElementStore mElements;
    std::vector<Slot> mSlots;
    std::size_t mEntered = 0;
    qsizetype mMarkupSize = 0;
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
    DocumentWriter(const ElementTree& tree, qsizetype expectedSize)
        : mTree(tree)
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
        if (!element.text && element.firstChild < 0) {
            put(QLatin1Char('/'));
            put(QLatin1Char('>'));
            put(QLatin1Char('\n'));
            return;
        }
        put(QLatin1Char('>'));
        if (element.text) {
            reserve(qsizetype(element.text->size()) * ZelXml::kMaxEscapedLength);
            mOut = ZelXml::writeElementText(*element.text, mOut);
        } else {
            put(QLatin1Char('\n'));
        }
        for (int child = element.firstChild; child >= 0; child = mTree.at(child).nextSibling)
            writeElement(child, depth + 1, child == element.firstChild && element.text);
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
    // The elements refer to the characters of the keys, which the list keeps.
    ElementTree tree;
    qsizetype textSize = 0; // the values as they are; escapes add to it
    qsizetype longestText = 0;
    // In a wide root, the first level of the key kAhead places ahead is
    // hashed and its table slot fetched, in a ring of kAhead places.
    const int kAhead = 8;
    uint aheadHash[kAhead];
    bool ahead[kAhead] = {};
    const int count = size();
    for (int i = 0; i < count; ++i) {
        const QString& key = at(i).mKey;
        const int place = i % kAhead;
        KeyProblem problem = KeyProblem::None;
        const int leaf = tree.addPath(key, &problem, ahead[place] ? &aheadHash[place] : nullptr);
        ahead[place] = i + kAhead < count && tree.prefetch(at(i + kAhead).mKey, &aheadHash[place]);
        if (problem != KeyProblem::None) {
            if (trace->getEnabled())
                trace->debug(QLatin1String(kTraceSource), leftOutText(key, problem), 0);
            continue;
        }
        if (leaf >= 0) {
            const QString& value = at(i).mValue;
            tree.setText(leaf, &value);
            textSize += value.size();
            longestText = std::max<qsizetype>(longestText, value.size());
        }
    }

    const QString tag = rootTag(rootName, modifyDate.isValid() ? modifyDate : QDateTime::currentDateTime());
    Q_ASSERT(tag.endsWith(QLatin1String("/>\n")));
    if (tree.root().firstChild < 0)
        return tag;
    // Room for the whole text unless escapes lengthen the values a lot; the
    // writer asks for room for the longest value escaped throughout.
    DocumentWriter writer(tree, tree.markupSize() + textSize + textSize / 8
                                    + longestText * (ZelXml::kMaxEscapedLength - 1) + 2 * tag.size() + 64);
    // "<Root .../>\n" becomes "<Root ...>\n" ... "</Root>\n".
    writer.write(QStringView(tag).left(tag.size() - 3));
    writer.write(u">\n");
    writer.writeChildrenOfRoot();
    writer.write(u"</");
    writer.write(rootName);
    writer.write(u">\n");
    return writer.take();
}
