#include "Zel_PropertyKeyInfoList.h"

#include "Zel_Debug.h"

namespace {

Zel_PropertyKeyInfo lookUp(const QMap<QString, Zel_PropertyKeyInfo>& map, const QString& name)
{
    // find() on a const map never inserts.
    const QMap<QString, Zel_PropertyKeyInfo>::const_iterator it = map.constFind(name);
    return it == map.constEnd() ? Zel_PropertyKeyInfo() : it.value();
}

} // namespace

Zel_PropertyKeyInfoList::Zel_PropertyKeyInfoList() = default;
Zel_PropertyKeyInfoList::Zel_PropertyKeyInfoList(const Zel_PropertyKeyInfoList& other) = default;
Zel_PropertyKeyInfoList& Zel_PropertyKeyInfoList::operator=(const Zel_PropertyKeyInfoList& other) = default;
Zel_PropertyKeyInfoList::~Zel_PropertyKeyInfoList() = default;

void Zel_PropertyKeyInfoList::addIfKeyNotInList(const Zel_PropertyKeyInfo& info)
{
    const QMap<QString, Zel_PropertyKeyInfo>::const_iterator it = mByKey.constFind(info.key());
    if (it != mByKey.constEnd() && it.value().isValid()) {
        const Zel_PropertyKeyInfo& current = it.value();
        if (current.internalName() == info.internalName() && current.displayName() == info.displayName())
            return;
        const boost::shared_ptr<Zel_Debug> debug = Zel_Debug::instance();
        if (debug->getEnabled()) {
            debug->debug(QString(),
                         QStringLiteral("Zel_PropertyKeyInfoList::addIfKeyNotInList() Duplicate\n\tcurrent: %1\n\tnew:     %2")
                             .arg(current.toZelString(), info.toZelString()),
                         0);
        }
        return;
    }
    mByKey.insert(info.key(), info);
    mByInternalName.insert(info.internalName(), info);
    mByDisplayName.insert(info.displayName(), info);
}

void Zel_PropertyKeyInfoList::push_back(Zel_PropertyKeyInfo info)
{
    addIfKeyNotInList(info);
}

Zel_PropertyKeyInfo Zel_PropertyKeyInfoList::findByKey(const QString& key) const
{
    return lookUp(mByKey, key);
}

Zel_PropertyKeyInfo Zel_PropertyKeyInfoList::findByInternalName(const QString& internalName) const
{
    return lookUp(mByInternalName, internalName);
}

Zel_PropertyKeyInfo Zel_PropertyKeyInfoList::findByDisplayName(const QString& displayName) const
{
    return lookUp(mByDisplayName, displayName);
}

void Zel_PropertyKeyInfoList::clear()
{
    mByKey.clear();
    mByInternalName.clear();
    mByDisplayName.clear();
}

int Zel_PropertyKeyInfoList::size() const
{
    return mByKey.size();
}

bool Zel_PropertyKeyInfoList::isEmpty() const
{
    return mByKey.isEmpty();
}

QMap<QString, Zel_PropertyKeyInfo>::const_iterator Zel_PropertyKeyInfoList::begin() const
{
    return mByKey.constBegin();
}

QMap<QString, Zel_PropertyKeyInfo>::const_iterator Zel_PropertyKeyInfoList::end() const
{
    return mByKey.constEnd();
}

QString Zel_PropertyKeyInfoList::toZelString() const
{
    QString text;
    for (QMap<QString, Zel_PropertyKeyInfo>::const_iterator it = mByKey.constBegin(); it != mByKey.constEnd(); ++it) {
        if (it != mByKey.constBegin())
            text += QLatin1Char('\n');
        text += it.value().toZelString();
    }
    return text;
}
