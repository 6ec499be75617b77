#include "Zel_Directory.h"

Zel_Directory::Zel_Directory()
    : mRooted(false)
{
}

Zel_Directory::Zel_Directory(const QString& path, const QString& separator)
    : mRooted(false)
{
    if (separator.isEmpty()) {
        // Splitting on an empty text would cut between every character: the
        // whole path is one component instead, and nothing begins with "".
        if (!path.isEmpty())
            append(path);
        return;
    }
    mRooted = path.startsWith(separator, Qt::CaseSensitive);
    // Empty parts (leading, trailing or doubled separators) are dropped.
    int start = 0;
    const int length = path.size();
    while (start <= length) {
        int end = path.indexOf(separator, start, Qt::CaseSensitive);
        if (end < 0)
            end = length;
        if (end > start)
            append(path.mid(start, end - start));
        start = end + separator.size();
    }
}

Zel_Directory::Zel_Directory(const Zel_Directory& other) = default;
Zel_Directory& Zel_Directory::operator=(const Zel_Directory& other) = default;
Zel_Directory::~Zel_Directory() = default;

const QString Zel_Directory::toZelString(const QString& separator) const
{
    QString text;
    if (mRooted)
        text = separator;
    text += join(separator);
    return text;
}

bool Zel_Directory::isRooted() const
{
    return mRooted;
}
