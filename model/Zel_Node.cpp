#include "Zel_Node.h"

#include "Zel_MimeTypeSpec.h"

#include <cstddef>

namespace {

// Masks of the kind predicates.
const unsigned long kAbstractAssetMask = 0x20000; // Asset

// Lower case of a Latin-1 code unit as QChar::toLower gives it: A-Z and
// U+00C0..U+00DE except the multiplication sign U+00D7 move up by 0x20; every
// other Latin-1 unit (µ, ß and ÿ included) is its own lower case.
inline ushort latin1ToLower(ushort c)
{
    if ((c >= 'A' && c <= 'Z') || (c >= 0xC0 && c <= 0xDE && c != 0xD7))
        return static_cast<ushort>(c + 0x20);
    return c;
}

// Three-way comparison of a.toLower() with b.toLower() by UTF-16 code unit.
//
// Node ordering runs this for every comparison of a sort, so it avoids
// building the two lowered texts while both are Latin-1 up to the deciding
// position: there lowering is one unit to one unit and stays in Latin-1, so
// the lowered texts agree up to that position and differ exactly where the
// lowered units do. Any other unit (special and multi-unit mappings,
// surrogates) before the decision falls back to toLower() itself.
int compareLowered(const QString& a, const QString& b)
{
    const QChar* pa = a.constData();
    const QChar* pb = b.constData();
    const int lengthA = a.size();
    const int lengthB = b.size();
    const int common = lengthA < lengthB ? lengthA : lengthB;
    for (int i = 0; i < common; ++i) {
        const ushort ca = pa[i].unicode();
        const ushort cb = pb[i].unicode();
        if (ca >= 0x100 || cb >= 0x100) {
            const QString lowerA = a.toLower();
            const QString lowerB = b.toLower();
            if (lowerA < lowerB)
                return -1;
            return lowerA == lowerB ? 0 : 1;
        }
        if (ca == cb)
            continue;
        const ushort la = latin1ToLower(ca);
        const ushort lb = latin1ToLower(cb);
        if (la != lb)
            return la < lb ? -1 : 1;
    }
    // The lowered common parts are equal; lowering never makes a unit vanish,
    // so the longer text's lowered form is the longer one.
    if (lengthA == lengthB)
        return 0;
    return lengthA < lengthB ? -1 : 1;
}

struct ColorRow
{
    const char* name;
    int value;
};

// Sorted by name (all lower case ASCII) for bisection.
const ColorRow kColors[] = {
    { "black", 0x000000 },
    { "blue", 0x0000FF },
    { "cyan", 0x00FFFF },
    { "darkblue", 0x000080 },
    { "darkgreen", 0x008000 },
    { "darkred", 0x800000 },
    { "green", 0x00FF00 },
    { "lightblue", 0x8080FF },
    { "lightred", 0xFF0000 },
    { "olive", 0x808000 },
    { "pink", 0xFF00FF },
    { "purple", 0x800080 },
    { "teal", 0x008080 },
    { "white", 0xFFFFFF },
    { "yellow", 0xFFFF00 },
};

// Latin-1 case folding of one byte, the same in every Qt version.
inline unsigned char latin1Fold(char c)
{
    return static_cast<unsigned char>(latin1ToLower(static_cast<unsigned char>(c)));
}

// Case-insensitive comparison of two NUL-terminated Latin-1 texts.
int latin1CaseCompare(const char* a, const char* b)
{
    for (;; ++a, ++b) {
        const unsigned char ca = latin1Fold(*a);
        const unsigned char cb = latin1Fold(*b);
        if (ca != cb)
            return ca < cb ? -1 : 1;
        if (ca == 0)
            return 0;
    }
}

} // namespace

Zel_Node::Zel_Node()
    : mChildrenCount(0)
    , mValid(false)
{
}

Zel_Node::Zel_Node(const QString& nodeID)
    : mChildrenCount(0)
    , mNodeID(nodeID)
    , mValid(false)
{
}

Zel_Node::Zel_Node(const Zel_Node& other) = default;
Zel_Node& Zel_Node::operator=(const Zel_Node& other) = default;
Zel_Node::~Zel_Node() = default;

// The server-data operations are non-const (a derived node may fetch and
// cache); the const predicates and comparisons call them through const_cast.

bool Zel_Node::isFolder() const
{
    return Zel_MimeTypeSpec(Zel_MimeTypes_Containers).isType(const_cast<Zel_Node*>(this)->getMimeType());
}

bool Zel_Node::isMedia() const
{
    return Zel_MimeTypeSpec(Zel_MimeTypes_Media).isType(const_cast<Zel_Node*>(this)->getMimeType());
}

bool Zel_Node::isAbstractAsset() const
{
    return Zel_MimeTypeSpec(kAbstractAssetMask).isType(const_cast<Zel_Node*>(this)->getMimeType());
}

bool Zel_Node::isReserved() const
{
    return false;
}

bool Zel_Node::isSyncedBin() const
{
    return false;
}

bool Zel_Node::sameNode(const Zel_Node* other) const
{
    if (!other)
        return false;
    Zel_Node* that = const_cast<Zel_Node*>(other);
    // Only this node's own stored ID counts: an empty one never matches.
    if (!mNodeID.isEmpty() && mNodeID == that->getNodeID())
        return true;
    return const_cast<Zel_Node*>(this)->getMoniker() == that->getMoniker();
}

bool Zel_Node::isSyncedFolder() const
{
    return false;
}

bool Zel_Node::isValid() const
{
    return mValid;
}

QString Zel_Node::getName()
{
    return QString();
}

Zel_Directory Zel_Node::getPath()
{
    return Zel_Directory();
}

Zel_MobID Zel_Node::getMobID()
{
    return Zel_MobID();
}

QString Zel_Node::getMimeType()
{
    return QString();
}

bool Zel_Node::isValidDropTarget() const
{
    return false;
}

bool Zel_Node::isUserPlaced() const
{
    return true;
}

QString Zel_Node::getPropertyValue(const QString& key)
{
    return QString();
}

QDateTime Zel_Node::getPropertyValueAsDateTime(const QString& key)
{
    return QDateTime();
}

Zel_PropertyList Zel_Node::getProperties()
{
    return Zel_PropertyList();
}

void Zel_Node::decacheProperties()
{
}

unsigned long Zel_Node::getChildrenCount() const
{
    return mChildrenCount;
}

QString Zel_Node::getMoniker()
{
    return mMoniker;
}

QString Zel_Node::getMasterMoniker()
{
    return mMasterMoniker;
}

QString Zel_Node::getNodeID()
{
    return mNodeID;
}

QString Zel_Node::getParentNodeID()
{
    return mParentNodeID;
}

void Zel_Node::setNodeID(const QString& nodeID)
{
    mNodeID = nodeID;
}

void Zel_Node::setParentNodeID(const QString& parentNodeID)
{
    mParentNodeID = parentNodeID;
}

void Zel_Node::setValid(bool valid)
{
    mValid = valid;
}

void Zel_Node::setChildrenCount(unsigned long childrenCount)
{
    mChildrenCount = childrenCount;
}

void Zel_Node::setMoniker(const QString& moniker)
{
    mMoniker = moniker;
}

void Zel_Node::setMasterMoniker(const QString& masterMoniker)
{
    mMasterMoniker = masterMoniker;
}

bool Zel_Node::operator==(const Zel_Node& other) const
{
    return sameNode(&other);
}

bool Zel_Node::operator!=(const Zel_Node& other) const
{
    return !sameNode(&other);
}

bool Zel_Node::operator<(const Zel_Node& other) const
{
    Zel_Node& self = const_cast<Zel_Node&>(*this);
    Zel_Node& that = const_cast<Zel_Node&>(other);

    // Mime type rank first. Different types of equal rank ("masterclip" and
    // "clip", two unlisted types) go on to the names, so that the ordering
    // stays a strict weak ordering.
    const QString mimeA = self.getMimeType();
    const QString mimeB = that.getMimeType();
    if (mimeA != mimeB) {
        const long rankA = Zel_MimeTypeSpec::getSortOrder(mimeA);
        const long rankB = Zel_MimeTypeSpec::getSortOrder(mimeB);
        if (rankA != rankB)
            return rankA < rankB;
    }

    // Then the name without regard to case, then the exact name, then the moniker.
    const QString nameA = self.getName();
    const QString nameB = that.getName();
    if (nameA == nameB)
        return self.getMoniker() < that.getMoniker();
    const int lowered = compareLowered(nameA, nameB);
    if (lowered != 0)
        return lowered < 0;
    return nameA < nameB;
}

bool Zel_Node::operator<=(const Zel_Node& other) const
{
    return *this < other || *this == other;
}

bool Zel_Node::operator>(const Zel_Node& other) const
{
    return !(*this < other) && !(*this == other);
}

bool Zel_Node::operator>=(const Zel_Node& other) const
{
    return *this > other || *this == other;
}

int Zel_Node::colorFromName(const char* name)
{
    if (!name)
        return -1;
    std::size_t low = 0;
    std::size_t high = sizeof(kColors) / sizeof(kColors[0]);
    while (low < high) {
        const std::size_t middle = low + (high - low) / 2;
        const int order = latin1CaseCompare(name, kColors[middle].name);
        if (order == 0)
            return kColors[middle].value;
        if (order < 0)
            high = middle;
        else
            low = middle + 1;
    }
    return -1;
}
