#include "Zel_SettingList.h"

#include "Zel_Debug.h"
#include "zel_qtcompat_p.h"
#include "zel_xml_p.h"

#include <QDateTime>
#include <QDomDocument>
#include <QDomElement>
#include <QDomText>
#include <QHash>
#include <QStringList>

#include <cstddef>
#include <unordered_map>
#include <utility>
#include <vector>

namespace {

const char* const kTraceSource = "Zel_SettingList::toXML";

// The most levels a key may have. The DOM writes nested elements recursively,
// so a key of tens of thousands of levels would overflow the stack.
const int kMaxLevels = 64;

enum class KeyProblem { None, InvalidName, TooDeep };

// Index key of the first child element with a given name under a parent, so
// that a lookup costs constant time instead of a scan of the children.
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
        const std::size_t spread = key.parent * static_cast<std::size_t>(0x9E3779B97F4A7C15ull);
        return static_cast<std::size_t>(qHash(key.name)) ^ spread;
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
    // key is empty, ends in "." (only the intermediate levels are made), has
    // more than kMaxLevels levels or yields an invalid element name (in the
    // last two cases nothing is made and *problem says why).
    QDomElement addPath(const QString& key, KeyProblem* problem)
    {
        *problem = KeyProblem::None;
        if (key.isEmpty())
            return QDomElement();
        if (key.count(QLatin1Char('.')) >= kMaxLevels) {
            *problem = KeyProblem::TooDeep;
            return QDomElement();
        }

        const QStringList levels = key.split(QLatin1Char('.'));
        const int last = levels.size() - 1;
        for (int i = 0; i < last; ++i) {
            if (!ZelXml::isValidName(levels.at(i))) {
                *problem = KeyProblem::InvalidName;
                return QDomElement();
            }
        }
        if (!levels.at(last).isEmpty() && !ZelXml::isValidName(levels.at(last))) {
            *problem = KeyProblem::InvalidName;
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
    QDomDocument document;
    QDomElement root = document.createElement(rootName);
    document.appendChild(root);

    ElementTree tree(document, root);
    for (const Zel_Setting& setting : *this) {
        const QString key = setting.key();
        KeyProblem problem = KeyProblem::None;
        QDomElement leaf = tree.addPath(key, &problem);
        if (problem != KeyProblem::None) {
            if (trace->getEnabled())
                trace->debug(QLatin1String(kTraceSource), leftOutText(key, problem), 0);
            continue;
        }
        if (!leaf.isNull())
            leaf.appendChild(document.createTextNode(ZelXml::xmlCharsOnly(setting.value())));
    }

    const QDateTime moment = modifyDate.isValid() ? modifyDate : QDateTime::currentDateTime();
    root.setAttribute(QStringLiteral("version"), QStringLiteral("1.0"));
    root.setAttribute(QStringLiteral("modifydate"),
                      ZelXml::xmlCharsOnly(ZelCompat::systemTextDate(moment.toLocalTime())));
    root.setAttribute(QStringLiteral("modifydateInt"), QString::number(ZelCompat::toTimeT(moment)));

    return document.toString(1);
}
