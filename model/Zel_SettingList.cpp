#include "Zel_SettingList.h"

#include "Zel_Debug.h"
#include "zel_qtcompat_p.h"

#include <QChar>
#include <QDateTime>
#include <QDomDocument>
#include <QDomElement>
#include <QDomText>
#include <QStringList>
#include <QHash>

#include <cstddef>
#include <unordered_map>
#include <utility>
#include <vector>

namespace {

const char* const kTraceSource = "Zel_SettingList::toXML";

// XML 1.0 (fifth edition) NameStartChar ranges above ASCII, BMP only.
bool inNameStartRange(ushort u)
{
    return (u >= 0xC0 && u <= 0xD6) || (u >= 0xD8 && u <= 0xF6) || (u >= 0xF8 && u <= 0x2FF)
        || (u >= 0x370 && u <= 0x37D) || (u >= 0x37F && u <= 0x1FFF) || (u >= 0x200C && u <= 0x200D)
        || (u >= 0x2070 && u <= 0x218F) || (u >= 0x2C00 && u <= 0x2FEF) || (u >= 0x3001 && u <= 0xD7FF)
        || (u >= 0xF900 && u <= 0xFDCF) || (u >= 0xFDF0 && u <= 0xFFFD);
}

bool isAsciiLetter(ushort u)
{
    return (u >= 'A' && u <= 'Z') || (u >= 'a' && u <= 'z');
}

// Name characters are taken where the XML 1.0 ranges and the Unicode letter,
// mark and digit categories agree, so that every XML reader (Qt's included,
// which classify by category) accepts them. ':' is left out: a name with an
// undeclared prefix fails namespace-aware readers. Surrogates are refused.
bool isNameStartChar(QChar c)
{
    const ushort u = c.unicode();
    if (u < 0x80)
        return isAsciiLetter(u) || u == '_';
    if (!inNameStartRange(u))
        return false;
    switch (c.category()) {
    case QChar::Letter_Uppercase:
    case QChar::Letter_Lowercase:
    case QChar::Letter_Titlecase:
    case QChar::Letter_Other:
    case QChar::Number_Letter:
        return true;
    default:
        return false;
    }
}

bool isNameChar(QChar c)
{
    const ushort u = c.unicode();
    if (u < 0x80)
        return isAsciiLetter(u) || (u >= '0' && u <= '9') || u == '_' || u == '-' || u == '.';
    if (!inNameStartRange(u) && !(u >= 0x300 && u <= 0x36F) && u != 0xB7 && u != 0x203F && u != 0x2040)
        return false;
    switch (c.category()) {
    case QChar::Letter_Uppercase:
    case QChar::Letter_Lowercase:
    case QChar::Letter_Titlecase:
    case QChar::Letter_Other:
    case QChar::Letter_Modifier:
    case QChar::Number_Letter:
    case QChar::Number_DecimalDigit:
    case QChar::Mark_NonSpacing:
    case QChar::Mark_SpacingCombining:
    case QChar::Mark_Enclosing:
        return true;
    default:
        return false;
    }
}

bool isValidName(const QString& name)
{
    if (name.isEmpty() || !isNameStartChar(name.at(0)))
        return false;
    for (int i = 1; i < name.size(); ++i) {
        if (!isNameChar(name.at(i)))
            return false;
    }
    return true;
}

// Whether the UTF-16 unit at i starts an XML 1.0 Char; sets length to 1 or 2.
bool isXmlChar(const QString& text, int i, int& length)
{
    const ushort u = text.at(i).unicode();
    length = 1;
    if (u < 0x20)
        return u == 0x9 || u == 0xA || u == 0xD;
    if (u < 0xD800)
        return true;
    if (u <= 0xDBFF) {
        if (i + 1 < text.size() && text.at(i + 1).isLowSurrogate()) {
            length = 2;
            return true;
        }
        return false;
    }
    if (u <= 0xDFFF)
        return false; // a low surrogate without its high half
    return u != 0xFFFE && u != 0xFFFF;
}

// The text without the characters XML 1.0 cannot carry (control characters
// other than tab, line feed and carriage return, unpaired surrogates, U+FFFE,
// U+FFFF). Returns the text itself, unchanged, in the usual case.
QString xmlCharsOnly(const QString& text)
{
    int i = 0;
    int length = 1;
    while (i < text.size() && isXmlChar(text, i, length))
        i += length;
    if (i == text.size())
        return text;

    QString kept;
    kept.reserve(text.size());
    kept.append(text.constData(), i);
    while (i < text.size()) {
        if (isXmlChar(text, i, length))
            kept.append(text.constData() + i, length);
        i += length;
    }
    return kept;
}

// The first child element of a parent with a given name, for lookups in
// constant time instead of a scan of the parent's children.
struct ChildKey
{
    std::size_t parent;
    QString name;

    bool operator==(const ChildKey& other) const { return parent == other.parent && name == other.name; }
};

struct ChildKeyHash
{
    std::size_t operator()(const ChildKey& key) const
    {
        return static_cast<std::size_t>(qHash(key.name)) ^ (key.parent * static_cast<std::size_t>(0x9E3779B97F4A7C15ull));
    }
};

// Builds the element paths of the settings under one root element. Every
// element made is registered, so a leaf made by one key is found (and given
// children) by a later key with it as a prefix, as "the first child with that
// name" requires.
class ElementTree
{
public:
    ElementTree(QDomDocument& document, const QDomElement& root)
        : mDocument(document)
    {
        mElements.push_back(root);
    }

    // Adds the path of one key and returns its leaf element: null when the
    // key is empty, ends in "." (only the intermediate levels are made) or
    // yields an invalid element name (nothing is made; *invalid is set).
    QDomElement addPath(const QString& key, bool* invalid)
    {
        *invalid = false;
        if (key.isEmpty())
            return QDomElement();

        const QStringList levels = key.split(QLatin1Char('.'));
        const int last = levels.size() - 1;
        for (int i = 0; i < last; ++i) {
            if (!isValidName(levels.at(i))) {
                *invalid = true;
                return QDomElement();
            }
        }
        if (!levels.at(last).isEmpty() && !isValidName(levels.at(last))) {
            *invalid = true;
            return QDomElement();
        }

        std::size_t parent = 0;
        for (int i = 0; i < last; ++i) {
            ChildKey childKey{parent, levels.at(i)};
            const auto found = mFirstChild.find(childKey);
            if (found != mFirstChild.end())
                parent = found->second;
            else
                parent = appendElement(parent, std::move(childKey));
        }
        if (levels.at(last).isEmpty())
            return QDomElement();
        return mElements[appendElement(parent, ChildKey{parent, levels.at(last)})];
    }

private:
    std::size_t appendElement(std::size_t parent, ChildKey&& childKey)
    {
        QDomElement element = mDocument.createElement(childKey.name);
        mElements[parent].appendChild(element);
        const std::size_t index = mElements.size();
        mElements.push_back(element);
        // emplace keeps an existing entry: the first child with the name wins.
        mFirstChild.emplace(std::move(childKey), index);
        return index;
    }

    QDomDocument& mDocument;
    std::vector<QDomElement> mElements;
    std::unordered_map<ChildKey, std::size_t, ChildKeyHash> mFirstChild;
};

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
    if (!isValidName(rootName)) {
        Zel_Debug::instance()->debug(QLatin1String(kTraceSource),
            QStringLiteral("root name \"%1\" is not a valid XML name; no document written").arg(rootName), 0);
        return QString();
    }

    QDomDocument document;
    QDomElement root = document.createElement(rootName);
    document.appendChild(root);

    ElementTree tree(document, root);
    for (const Zel_Setting& setting : *this) {
        const QString key = setting.key();
        bool invalid = false;
        QDomElement leaf = tree.addPath(key, &invalid);
        if (invalid) {
            Zel_Debug::instance()->debug(QLatin1String(kTraceSource),
                QStringLiteral("key \"%1\" does not give valid XML element names; setting left out").arg(key), 0);
            continue;
        }
        if (!leaf.isNull())
            leaf.appendChild(document.createTextNode(xmlCharsOnly(setting.value())));
    }

    const QDateTime moment = modifyDate.isValid() ? modifyDate : QDateTime::currentDateTime();
    root.setAttribute(QStringLiteral("version"), QStringLiteral("1.0"));
    root.setAttribute(QStringLiteral("modifydate"), xmlCharsOnly(moment.toLocalTime().toString(Qt::TextDate)));
    root.setAttribute(QStringLiteral("modifydateInt"), QString::number(ZelCompat::toTimeT(moment)));

    return document.toString(1);
}
