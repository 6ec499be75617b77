#include "Zel_ResolutionIDList.h"

Zel_ResolutionIDList::Zel_ResolutionIDList() = default;
Zel_ResolutionIDList::Zel_ResolutionIDList(const Zel_ResolutionIDList& other) = default;
Zel_ResolutionIDList& Zel_ResolutionIDList::operator=(const Zel_ResolutionIDList& other) = default;
Zel_ResolutionIDList::~Zel_ResolutionIDList() = default;

const QString Zel_ResolutionIDList::toZelString() const
{
    QString text;
    for (int i = 0; i < size(); ++i) {
        if (i > 0)
            text += QLatin1Char('\n');
        text += at(i).toZelString();
    }
    return text;
}
