// Zel_MimeTypeSpec: a set of mime types, held as a mask of Zel_MimeTypeValue bits.
//
// The library knows 22 mime type names (21 bits; "masterclip" and "clip"
// share one), each with a sort rank that groups nodes: media first
// ("sequence" 1 ... "filemob" 13), then containers ("project" 20 ...
// "playbackdevices" 25), "Asset" 26, "physical" 27, unknown names 28. Names
// are case-sensitive. The default set holds every media and container type
// (0x19FFFF) but not "Asset" or "physical".
//
//     Zel_MimeTypeSpec folders(Zel_MimeType_Bin | Zel_MimeType_Folder);
//     bool isBin = folders.isType(QStringLiteral("bin"));   // true
//
// Plain value; the static lookups use a fixed table and are thread-safe.
#ifndef ZEL_MIMETYPESPEC_H
#define ZEL_MIMETYPESPEC_H

#include "zel_export.h"
#include "Zel_MimeTypeValue.h"

#include <QString>

class ZEL_EXPORT Zel_MimeTypeSpec
{
public:
    Zel_MimeTypeSpec(unsigned long mask = 0x19FFFF);
    Zel_MimeTypeSpec(const Zel_MimeTypeSpec& other);
    Zel_MimeTypeSpec& operator=(const Zel_MimeTypeSpec& other);
    virtual ~Zel_MimeTypeSpec();

    // The masks are equal.
    bool operator==(const Zel_MimeTypeSpec& other) const;

    unsigned long get() const;
    // Takes over the other set's mask.
    void set(const Zel_MimeTypeSpec& other);
    // Adds / removes the bits of value; returns the new mask.
    unsigned long addType(Zel_MimeTypeValue value);
    unsigned long removeType(Zel_MimeTypeValue value);

    // True when any bit of value is in the set.
    bool isType(Zel_MimeTypeValue value) const;
    // True when name is a known mime type whose bit is in the set.
    bool isType(const QString& name) const;

    // The name of the first table row whose value equals value exactly
    // ("masterclip" for 0x1); a null text for combined or unknown values.
    static QString getString(Zel_MimeTypeValue value);
    // Stores the value of the first row named name and answers true; answers
    // false and leaves value unchanged when the name is unknown.
    static bool getType(const QString& name, Zel_MimeTypeValue& value);
    // The sort rank of name, 28 when the name is unknown.
    static long getSortOrder(const QString& name);

private:
    unsigned long mMask;
};

#endif
