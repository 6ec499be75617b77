// Node ordering internals shared by Zel_Node::operator< and
// Zel_NodeList::sortByOrder.
//
// Nodes order by mime type rank, then by name.toLower(), then by exact name,
// then by moniker. A sort makes many comparisons per node, so the lowered
// names are never built there: QString::toLower() lowers code point by code
// point, without context, so comparing the lowered code points one by one
// gives the same answer as comparing the lowered texts.
//
// That holds for well-formed UTF-16. Qt lowers a text with an unpaired
// surrogate in ways that depend on the rest of the text (Qt 5 pairs the
// surrogate with whatever unit follows it, Qt 6 replaces it with U+FFFD once
// it has started converting), so the comparisons fall back to toLower()
// itself as soon as they meet one.
#ifndef ZEL_NODEORDER_P_H
#define ZEL_NODEORDER_P_H

#include <QChar>
#include <QString>

namespace ZelNodeOrder {

// Lower case of a Latin-1 code unit as QString::toLower() gives it: A-Z and
// U+00C0..U+00DE except the multiplication sign U+00D7 move up by 0x20; every
// other Latin-1 unit (µ, ß and ÿ included) is its own lower case.
inline ushort latin1ToLower(ushort c)
{
    if ((c >= 'A' && c <= 'Z') || (c >= 0xC0 && c <= 0xDE && c != 0xD7))
        return static_cast<ushort>(c + 0x20);
    return c;
}

// Writes the UTF-16 units of QString::toLower() of the one code point cp
// (not a surrogate) to out, which has room for two, and returns how many.
// Qt applies the simple mapping of QChar::toLower() to every code point but
// one: İ (U+0130) has a full lower case of two code points, i and U+0307
// COMBINING DOT ABOVE. The model tests check this against toLower() for
// every code point.
inline int lowerCodePoint(uint cp, ushort* out)
{
    if (cp < 0x100) {
        out[0] = latin1ToLower(static_cast<ushort>(cp));
        return 1;
    }
    if (cp == 0x130) {
        out[0] = 'i';
        out[1] = 0x307;
        return 2;
    }
    const uint lower = QChar::toLower(cp);
    if (QChar::requiresSurrogates(lower)) {
        out[0] = QChar::highSurrogate(lower);
        out[1] = QChar::lowSurrogate(lower);
        return 2;
    }
    out[0] = static_cast<ushort>(lower);
    return 1;
}

// The lowered units of a text, produced one at a time from a position on.
class LoweredUnits
{
public:
    enum Step { Unit, End, Unpaired };

    LoweredUnits(const QChar* text, int size, int position)
        : mText(text)
        , mSize(size)
        , mPosition(position)
    {
    }

    // Unit: unit holds the next lowered unit. End: the text is exhausted.
    // Unpaired: the next code point is an unpaired surrogate, whose lowering
    // depends on the whole text.
    Step next(ushort& unit)
    {
        if (mPending < mPendingSize) {
            unit = mBuffer[mPending++];
            return Unit;
        }
        if (mPosition >= mSize)
            return End;
        uint cp = mText[mPosition].unicode();
        if (QChar::isSurrogate(cp)) {
            if (!QChar::isHighSurrogate(cp) || mPosition + 1 >= mSize || !mText[mPosition + 1].isLowSurrogate())
                return Unpaired;
            cp = QChar::surrogateToUcs4(static_cast<ushort>(cp), mText[mPosition + 1].unicode());
            ++mPosition;
        }
        ++mPosition;
        mPendingSize = lowerCodePoint(cp, mBuffer);
        mPending = 1;
        unit = mBuffer[0];
        return Unit;
    }

private:
    const QChar* mText;
    int mSize;
    int mPosition;
    ushort mBuffer[2];
    int mPending = 0;
    int mPendingSize = 0;
};

// Three-way comparison of (a.toLower(), a) with (b.toLower(), b), each by
// UTF-16 code unit as QString::operator< compares: negative when a sorts
// first, zero only when a == b, positive when b sorts first.
int compareNames(const QString& a, const QString& b);

// Appends the units of name.toLower() to out, a vector of ushort or alike.
template <class Units>
void appendLowered(const QString& name, Units& out)
{
    const QChar* text = name.constData();
    const int size = name.size();
    const auto start = out.size();
    // Latin-1 runs, the common case, lower one unit to one unit.
    out.resize(start + size);
    auto* lowered = out.data() + start;
    int i = 0;
    for (; i < size && text[i].unicode() < 0x100; ++i)
        lowered[i] = latin1ToLower(text[i].unicode());
    if (i == size)
        return;
    out.resize(start + i);
    LoweredUnits units(text, size, i);
    ushort unit;
    for (;;) {
        const LoweredUnits::Step step = units.next(unit);
        if (step == LoweredUnits::End)
            return;
        if (step == LoweredUnits::Unpaired)
            break;
        out.push_back(unit);
    }
    // An unpaired surrogate: Qt's own lowering of the whole text.
    out.resize(start);
    const QString whole = name.toLower();
    for (const QChar c : whole)
        out.push_back(c.unicode());
}

} // namespace ZelNodeOrder

#endif
