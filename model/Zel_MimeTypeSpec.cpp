#include "Zel_MimeTypeSpec.h"

#include <QLatin1String>

namespace {

struct MimeTypeRow
{
    Zel_MimeTypeValue value;
    QLatin1String name;
    long rank;
};

// The whole vocabulary, in lookup order: every lookup takes the first match.
const MimeTypeRow kMimeTypes[] = {
    { Zel_MimeType_Sequence, QLatin1String("sequence"), 1 },
    { Zel_MimeType_MasterClipEWC, QLatin1String("masterclipewc"), 2 },
    { Zel_MimeType_MasterClip, QLatin1String("masterclip"), 3 },
    { Zel_MimeType_MasterClip, QLatin1String("clip"), 3 },
    { Zel_MimeType_StereoMasterClip, QLatin1String("stereomasterclip"), 4 },
    { Zel_MimeType_AudioClipEWC, QLatin1String("audioclipewc"), 5 },
    { Zel_MimeType_AudioClip, QLatin1String("audioclip"), 6 },
    { Zel_MimeType_SubClip, QLatin1String("subclip"), 7 },
    { Zel_MimeType_StereoSubClip, QLatin1String("stereosubclip"), 8 },
    { Zel_MimeType_Effect, QLatin1String("effect"), 9 },
    { Zel_MimeType_RenderedEffect, QLatin1String("renderedeffect"), 10 },
    { Zel_MimeType_MotionEffect, QLatin1String("motioneffect"), 11 },
    { Zel_MimeType_Group, QLatin1String("group"), 12 },
    { Zel_MimeType_FileMob, QLatin1String("filemob"), 13 },
    { Zel_MimeType_Project, QLatin1String("project"), 20 },
    { Zel_MimeType_Bin, QLatin1String("bin"), 21 },
    { Zel_MimeType_Folder, QLatin1String("folder"), 22 },
    { Zel_MimeType_Catalog, QLatin1String("catalog"), 23 },
    { Zel_MimeType_Workspace, QLatin1String("workspace"), 24 },
    { Zel_MimeType_PlaybackDevices, QLatin1String("playbackdevices"), 25 },
    { Zel_MimeType_Asset, QLatin1String("Asset"), 26 },
    { Zel_MimeType_Physical, QLatin1String("physical"), 27 },
};

const long kUnlistedRank = 28;

// Whether text equals the Latin-1 literal, unit by unit, inline.
inline bool equalsLatin1(const QString& text, QLatin1String literal)
{
    const int size = text.size();
    if (size != literal.size())
        return false;
    const QChar* units = text.constData();
    const char* chars = literal.data();
    for (int i = 0; i < size; ++i) {
        if (units[i].unicode() != static_cast<unsigned char>(chars[i]))
            return false;
    }
    return true;
}

// The rows by name length, each length's rows in table order: node
// ordering looks up two ranks per comparison, and this way a lookup compares
// against at most a few names of the right length, inline.
const int kLongestName = 16;

struct RowsByLength
{
    const MimeTypeRow* rows[kLongestName + 1][sizeof(kMimeTypes) / sizeof(kMimeTypes[0]) + 1] = {};

    RowsByLength()
    {
        int counts[kLongestName + 1] = {};
        for (const MimeTypeRow& row : kMimeTypes) {
            const int length = row.name.size();
            Q_ASSERT(length <= kLongestName);
            rows[length][counts[length]++] = &row;
        }
    }
};

// The first row named name (exact, case-sensitive), or null, without an
// allocation or a call.
const MimeTypeRow* findByName(const QString& name)
{
    // Built on first use, so that a lookup from another static initialiser
    // finds it ready.
    static const RowsByLength byLength;
    const int length = name.size();
    if (length > kLongestName)
        return nullptr;
    for (const MimeTypeRow* const* row = byLength.rows[length]; *row; ++row) {
        if (equalsLatin1(name, (*row)->name))
            return *row;
    }
    return nullptr;
}

} // namespace

Zel_MimeTypeSpec::Zel_MimeTypeSpec(unsigned long mask)
    : mMask(mask)
{
}

Zel_MimeTypeSpec::Zel_MimeTypeSpec(const Zel_MimeTypeSpec& other) = default;
Zel_MimeTypeSpec& Zel_MimeTypeSpec::operator=(const Zel_MimeTypeSpec& other) = default;
Zel_MimeTypeSpec::~Zel_MimeTypeSpec() = default;

bool Zel_MimeTypeSpec::operator==(const Zel_MimeTypeSpec& other) const
{
    return mMask == other.mMask;
}

unsigned long Zel_MimeTypeSpec::get() const
{
    return mMask;
}

void Zel_MimeTypeSpec::set(const Zel_MimeTypeSpec& other)
{
    mMask = other.mMask;
}

unsigned long Zel_MimeTypeSpec::addType(Zel_MimeTypeValue value)
{
    mMask |= static_cast<unsigned long>(value);
    return mMask;
}

unsigned long Zel_MimeTypeSpec::removeType(Zel_MimeTypeValue value)
{
    mMask &= ~static_cast<unsigned long>(value);
    return mMask;
}

bool Zel_MimeTypeSpec::isType(Zel_MimeTypeValue value) const
{
    return (mMask & static_cast<unsigned long>(value)) != 0;
}

bool Zel_MimeTypeSpec::isType(const QString& name) const
{
    const MimeTypeRow* row = findByName(name);
    return row && isType(row->value);
}

QString Zel_MimeTypeSpec::getString(Zel_MimeTypeValue value)
{
    for (const MimeTypeRow& row : kMimeTypes) {
        if (row.value == value)
            return QString(row.name);
    }
    return QString();
}

bool Zel_MimeTypeSpec::getType(const QString& name, Zel_MimeTypeValue& value)
{
    const MimeTypeRow* row = findByName(name);
    if (!row)
        return false;
    value = row->value;
    return true;
}

long Zel_MimeTypeSpec::getSortOrder(const QString& name)
{
    const MimeTypeRow* row = findByName(name);
    return row ? row->rank : kUnlistedRank;
}
