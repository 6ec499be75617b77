#include "Zel_PropertyList.h"

#include <utility>

Zel_PropertyList::Zel_PropertyList() = default;
Zel_PropertyList::Zel_PropertyList(const Zel_PropertyList& other) = default;
Zel_PropertyList& Zel_PropertyList::operator=(const Zel_PropertyList& other) = default;
Zel_PropertyList::~Zel_PropertyList() = default;

Zel_Property Zel_PropertyList::findByKey(const QString& key) const
{
    for (const Zel_Property& property : *this) {
        if (property.key() == key)
            return property;
    }
    return Zel_Property();
}

bool Zel_PropertyList::eraseByKey(const QString& key)
{
    for (int i = 0; i < size(); ++i) {
        if (at(i).key() == key) {
            removeAt(i);
            return true;
        }
    }
    return false;
}

void Zel_PropertyList::addIfKeyNotInList(const Zel_Property& property)
{
    const QString key = property.key();
    for (const Zel_Property& existing : std::as_const(*this)) {
        if (existing.key() == key)
            return;
    }
    append(property);
}

void Zel_PropertyList::addOrUpdate(const Zel_Property& property)
{
    const QString key = property.key();
    for (int i = 0; i < size(); ++i) {
        if (at(i).key() == key) {
            (*this)[i].setValue(property.value());
            return;
        }
    }
    append(property);
}

QList<Zel_Property>& Zel_PropertyList::operator+=(const Zel_Property& property)
{
    addIfKeyNotInList(property);
    return *this;
}

Zel_PropertyList::operator QString() const
{
    QString text;
    for (int i = 0; i < size(); ++i) {
        if (i > 0)
            text += QLatin1Char('\n');
        text += static_cast<QString>(at(i));
    }
    return text;
}
