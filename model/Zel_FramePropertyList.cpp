#include "Zel_FramePropertyList.h"

#include <QHash>
#include <QPair>

#include <vector>

Zel_FramePropertyList::Zel_FramePropertyList() = default;
Zel_FramePropertyList::Zel_FramePropertyList(const Zel_FramePropertyList& other) = default;
Zel_FramePropertyList& Zel_FramePropertyList::operator=(const Zel_FramePropertyList& other) = default;
Zel_FramePropertyList::~Zel_FramePropertyList() = default;

bool Zel_FramePropertyList::operator==(const Zel_FramePropertyList& other) const
{
    // Multiset equality: every property of this list is matched with a
    // distinct, equal property of the other, so a property held twice here
    // must be held twice there too.
    if (size() != other.size())
        return false;
    if (isEmpty())
        return true;

    constexpr int kPairwiseLimit = 16;
    if (size() <= kPairwiseLimit) {
        bool matched[kPairwiseLimit] = {};
        for (const Zel_FrameProperty& property : *this) {
            bool found = false;
            for (int j = 0; j < other.size(); ++j) {
                if (!matched[j] && other.at(j) == property) {
                    matched[j] = true;
                    found = true;
                    break;
                }
            }
            if (!found)
                return false;
        }
        return true;
    }

    QHash<QPair<QString, QString>, int> counts;
    counts.reserve(size());
    for (const Zel_FrameProperty& property : *this)
        ++counts[qMakePair(property.key(), property.value())];
    for (const Zel_FrameProperty& property : other) {
        const auto found = counts.find(qMakePair(property.key(), property.value()));
        if (found == counts.end() || found.value() == 0)
            return false;
        --found.value();
    }
    return true; // equal sizes and nothing left over: all counts are zero
}

bool Zel_FramePropertyList::operator!=(const Zel_FramePropertyList& other) const
{
    return !(*this == other);
}

QString Zel_FramePropertyList::toZelString() const
{
    QString text;
    for (int i = 0; i < size(); ++i) {
        if (i > 0)
            text += QLatin1Char('\n');
        text += at(i).toZelString();
    }
    return text;
}

QString Zel_FramePropertyList::getValue(QString key) const
{
    for (const Zel_FrameProperty& property : *this) {
        if (property.key() == key)
            return property.value();
    }
    return QString();
}

void Zel_FramePropertyList::setValue(const QString& key, const QString& value)
{
    for (Zel_FrameProperty& property : *this) {
        if (property.key() == key) {
            property.setValue(value);
            return;
        }
    }
    append(Zel_FrameProperty(key, value));
}
