#include "Zel_Node.h"

#include "Zel_MimeTypeSpec.h"
#include "zel_nodeorder_p.h"

#include <QtAlgorithms>
#include <QtGlobal>

#include <cstddef>
#include <cstdint>
#include <cstring>

namespace {

// Masks of the kind predicates.
const unsigned long kAbstractAssetMask = 0x20000; // Asset

using ZelNodeOrder::latin1ToLower;
using ZelNodeOrder::LoweredUnits;
using ZelNodeOrder::lowerCodePoint;

// Three-way comparison of the first differing units, or of the lengths.
int compareUnits(const QChar* a, int sizeA, const QChar* b, int sizeB)
{
    const int common = sizeA < sizeB ? sizeA : sizeB;
    for (int i = 0; i < common; ++i) {
        if (a[i] != b[i])
            return a[i].unicode() < b[i].unicode() ? -1 : 1;
    }
    if (sizeA == sizeB)
        return 0;
    return sizeA < sizeB ? -1 : 1;
}

// Four UTF-16 units as one 64-bit word, the first unit in the lowest lane
// (words are compared only where that holds, on little-endian machines).
inline std::uint64_t unitWord(const QChar* units)
{
    std::uint64_t word;
    std::memcpy(&word, units, sizeof word);
    return word;
}

const std::uint64_t kLanes = 0x0001000100010001ull;

// Whether a lane of the word is a surrogate (its top five bits 11011): such
// a lane becomes zero here, and the usual zero-lane test finds it.
inline bool hasSurrogate(std::uint64_t word)
{
    const std::uint64_t marked = (word & (0xF800 * kLanes)) ^ (0xD800 * kLanes);
    return ((marked - kLanes) & ~marked & (0x8000 * kLanes)) != 0;
}

// latin1ToLower of each lane of a word whose lanes are all below 0x100.
// Adding 0x100 - n to a lane sets its bit 8 exactly when the lane is at
// least n, without carrying into the next lane.
inline std::uint64_t lowerLatin1Word(std::uint64_t word)
{
    const std::uint64_t atLeastA = word + (0x100 - 'A') * kLanes;
    const std::uint64_t pastZ = word + (0x100 - 'Z' - 1) * kLanes;
    const std::uint64_t atLeastC0 = word + (0x100 - 0xC0) * kLanes;
    const std::uint64_t pastDE = word + (0x100 - 0xDF) * kLanes;
    const std::uint64_t notD7 = (word ^ (0xD7 * kLanes)) + 0xFF * kLanes;
    const std::uint64_t upper = ((atLeastA & ~pastZ) | (atLeastC0 & ~pastDE & notD7)) & (0x100 * kLanes);
    return word + (upper >> 3);
}

// Three-way comparison of the lowest differing lanes of two different words.
inline int compareLowestDifferentLane(std::uint64_t a, std::uint64_t b)
{
    const int shift = qCountTrailingZeroBits(a ^ b) & ~15;
    return ((a >> shift) & 0xFFFF) < ((b >> shift) & 0xFFFF) ? -1 : 1;
}

// The comparison of compareNames with the lowered texts built by toLower().
int compareNamesThroughToLower(const QString& a, const QString& b)
{
    const QString lowerA = a.toLower();
    const QString lowerB = b.toLower();
    const int lowered = compareUnits(lowerA.constData(), lowerA.size(), lowerB.constData(), lowerB.size());
    if (lowered != 0)
        return lowered;
    return compareUnits(a.constData(), a.size(), b.constData(), b.size());
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

namespace {

// compareNames from position i on, where the two texts have lowered alike
// so far and stay aligned: code point by code point, as many units as each
// lowers to. exact is the first exact difference before i, if any.
Q_NEVER_INLINE int compareNamesFrom(const QString& a, const QString& b, int i, int exact)
{
    const QChar* pa = a.constData();
    const QChar* pb = b.constData();
    LoweredUnits unitsA(pa, a.size(), i);
    LoweredUnits unitsB(pb, b.size(), i);
    for (;;) {
        ushort ua = 0;
        ushort ub = 0;
        const LoweredUnits::Step stepA = unitsA.next(ua);
        const LoweredUnits::Step stepB = unitsB.next(ub);
        if (stepA == LoweredUnits::Unpaired || stepB == LoweredUnits::Unpaired)
            return compareNamesThroughToLower(a, b);
        if (stepA == LoweredUnits::End || stepB == LoweredUnits::End) {
            if (stepA != stepB)
                return stepA == LoweredUnits::End ? -1 : 1;
            break;
        }
        if (ua != ub)
            return ua < ub ? -1 : 1;
    }
    if (exact != 0)
        return exact;
    return compareUnits(pa + i, a.size() - i, pb + i, b.size() - i);
}

} // namespace

int ZelNodeOrder::compareNames(const QString& a, const QString& b)
{
    const QChar* pa = a.constData();
    const QChar* pb = b.constData();
    const int sizeA = a.size();
    const int sizeB = b.size();
    if (pa == pb && sizeA == sizeB)
        return 0;
    const int common = sizeA < sizeB ? sizeA : sizeB;
    // The first exact difference, the tie-break when the lowered texts agree.
    int exact = 0;
    int i = 0;
    // While every code point lowers to one unit the two lowered texts stay
    // aligned with the texts themselves, and equal units lower equally.
    // Four units at a time where they are equal or all Latin-1, else one.
    while (i < common) {
#if Q_BYTE_ORDER == Q_LITTLE_ENDIAN
        if (i + 4 <= common) {
            const std::uint64_t wordA = unitWord(pa + i);
            const std::uint64_t wordB = unitWord(pb + i);
            if (wordA == wordB) {
                if (hasSurrogate(wordA))
                    return compareNamesFrom(a, b, i, exact);
                i += 4;
                continue;
            }
            if (((wordA | wordB) & (0xFF00 * kLanes)) == 0) {
                const std::uint64_t lowerA = lowerLatin1Word(wordA);
                const std::uint64_t lowerB = lowerLatin1Word(wordB);
                if (lowerA != lowerB)
                    return compareLowestDifferentLane(lowerA, lowerB);
                if (exact == 0)
                    exact = compareLowestDifferentLane(wordA, wordB);
                i += 4;
                continue;
            }
        }
#endif
        const ushort ca = pa[i].unicode();
        const ushort cb = pb[i].unicode();
        if (ca != cb || QChar::isSurrogate(ca)) {
            if (QChar::isSurrogate(ca) || QChar::isSurrogate(cb))
                return compareNamesFrom(a, b, i, exact);
            ushort la[2];
            ushort lb[2];
            if (lowerCodePoint(ca, la) != 1 || lowerCodePoint(cb, lb) != 1)
                return compareNamesFrom(a, b, i, exact);
            if (la[0] != lb[0])
                return la[0] < lb[0] ? -1 : 1;
            if (exact == 0)
                exact = ca < cb ? -1 : 1;
        }
        ++i;
    }
    // One text is a prefix of the other up to case; lowering never shortens
    // a text, so the longer one's lowered text is the longer.
    if (sizeA != sizeB)
        return sizeA < sizeB ? -1 : 1;
    return exact;
}

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
    // stays a strict weak ordering. Equal types have equal ranks, so the
    // ranks alone decide; texts sharing their data are the same type.
    {
        const QString mimeA = self.getMimeType();
        const QString mimeB = that.getMimeType();
        if (mimeA.constData() != mimeB.constData() || mimeA.size() != mimeB.size()) {
            const long rankA = Zel_MimeTypeSpec::getSortOrder(mimeA);
            const long rankB = Zel_MimeTypeSpec::getSortOrder(mimeB);
            if (rankA != rankB)
                return rankA < rankB;
        }
    }

    // Then the name without regard to case, then the exact name, then the
    // moniker, compared in place without building the lowered names.
    const QString nameA = self.getName();
    const QString nameB = that.getName();
    const int names = ZelNodeOrder::compareNames(nameA, nameB);
    if (names != 0)
        return names < 0;
    return self.getMoniker() < that.getMoniker();
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
