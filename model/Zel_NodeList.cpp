#include "Zel_NodeList.h"

#include "Zel_MimeTypeSpec.h"
#include "zel_nodeorder_p.h"

#include <QtAlgorithms>
#include <QtGlobal>

#include <algorithm>
#include <cstdint>
#include <cstring>
#include <limits>
#include <vector>

namespace {

// The sort works on small entries: the first four units of a node's key
// (its rank and the start of its lowered name) packed so that comparing the
// integers compares the units, and the node's position in the list. The
// rest lives in one buffer of UTF-16 units, per node:
//   three 32-bit lengths (lowered key, name, moniker) as two units each,
//   the key: the rank as one unit, then the lowered name,
//   the exact name, then the moniker.
// The packed units decide most comparisons near the top of the sort; below
// that, one node's data is one short run of the buffer.
struct SortEntry
{
    std::uint64_t prefix[3];
    std::uint32_t start;
    std::uint32_t index;

    bool prefixLess(const SortEntry& other) const
    {
        if (prefix[0] != other.prefix[0])
            return prefix[0] < other.prefix[0];
        if (prefix[1] != other.prefix[1])
            return prefix[1] < other.prefix[1];
        return prefix[2] < other.prefix[2];
    }
    bool prefixEqual(const SortEntry& other) const
    {
        return prefix[0] == other.prefix[0] && prefix[1] == other.prefix[1] && prefix[2] == other.prefix[2];
    }
};

// Units of the key packed into the entries: the rank and the first eleven
// units of the lowered name, enough to tell most names of a folder apart
// ("Interview 0042", "clip 000123") without reading the buffer.
const std::size_t kPrefixUnits = 12;

const int kHeaderUnits = 6;

// Entries address the buffer with 32 bits.
const std::size_t kLargestStart = 0xFFFFFFFFu;

// Above every rank Zel_MimeTypeSpec::getSortOrder gives: null pointers.
const ushort kNullRank = 0xFFFF;

ushort rankUnit(long rank)
{
    if (rank < 0)
        return 0;
    return rank >= kNullRank ? kNullRank - 1 : static_cast<ushort>(rank);
}

void putLength(std::vector<ushort>& units, std::size_t at, std::size_t length)
{
    const std::uint32_t value = static_cast<std::uint32_t>(length);
    std::memcpy(units.data() + at, &value, sizeof value);
}

std::uint32_t lengthAt(const ushort* header, int which)
{
    std::uint32_t value;
    std::memcpy(&value, header + 2 * which, sizeof value);
    return value;
}

void appendUnits(std::vector<ushort>& units, const QString& text)
{
    const ushort* data = reinterpret_cast<const ushort*>(text.constData());
    units.insert(units.end(), data, data + text.size());
}

// Three-way comparison of two runs of units by value, shorter first when
// one is a prefix of the other (QString's order); four units at a time.
int compareUnits(const ushort* a, std::uint32_t sizeA, const ushort* b, std::uint32_t sizeB)
{
    const std::uint32_t common = sizeA < sizeB ? sizeA : sizeB;
    std::uint32_t i = 0;
#if Q_BYTE_ORDER == Q_LITTLE_ENDIAN
    for (; i + 4 <= common; i += 4) {
        std::uint64_t wordA;
        std::uint64_t wordB;
        std::memcpy(&wordA, a + i, sizeof wordA);
        std::memcpy(&wordB, b + i, sizeof wordB);
        if (wordA != wordB) {
            // The lowest differing lane is the first differing unit.
            i += qCountTrailingZeroBits(wordA ^ wordB) / 16;
            return a[i] < b[i] ? -1 : 1;
        }
    }
#endif
    for (; i < common; ++i) {
        if (a[i] != b[i])
            return a[i] < b[i] ? -1 : 1;
    }
    if (sizeA == sizeB)
        return 0;
    return sizeA < sizeB ? -1 : 1;
}

// Zel_Node::operator< with null pointers after every node.
bool nodeLess(const boost::shared_ptr<Zel_Node>& a, const boost::shared_ptr<Zel_Node>& b)
{
    if (!a || !b)
        return a && !b;
    return *a < *b;
}

// Swaps two items of a list of nodes without touching their counts.
void swapItems(QList<boost::shared_ptr<Zel_Node>>& nodes, int a, int b)
{
    nodes.swapItemsAt(a, b);
}

void swapItems(std::vector<boost::shared_ptr<Zel_Node>>& nodes, int a, int b)
{
    nodes[static_cast<std::size_t>(a)].swap(nodes[static_cast<std::size_t>(b)]);
}

template <class Nodes>
void sortNodes(Nodes& nodes)
{
    const int count = static_cast<int>(nodes.size());
    if (count < 2)
        return;

    // The keys, read once per node in list order.
    std::vector<ushort> units;
    units.reserve(static_cast<std::size_t>(count) * 64);
    std::vector<SortEntry> entries(static_cast<std::size_t>(count));
    for (int i = 0; i < count; ++i) {
        const std::size_t start = units.size();
        if (start > kLargestStart) {
            // Texts beyond what the entries can address (gigabytes of
            // names): sort with operator< itself.
            std::stable_sort(nodes.begin(), nodes.end(), nodeLess);
            return;
        }
        units.resize(start + kHeaderUnits);
        Zel_Node* node = nodes[static_cast<std::size_t>(i)].get();
        std::size_t nameUnits = 0;
        std::size_t monikerUnits = 0;
        if (!node) {
            units.push_back(kNullRank);
        } else {
            units.push_back(rankUnit(Zel_MimeTypeSpec::getSortOrder(node->getMimeType())));
            const QString name = node->getName();
            ZelNodeOrder::appendLowered(name, units);
            const std::size_t keyEnd = units.size();
            appendUnits(units, name);
            nameUnits = units.size() - keyEnd;
            appendUnits(units, node->getMoniker());
            monikerUnits = units.size() - keyEnd - nameUnits;
        }
        const std::size_t keyUnits = units.size() - start - kHeaderUnits - nameUnits - monikerUnits;
        putLength(units, start, keyUnits);
        putLength(units, start + 2, nameUnits);
        putLength(units, start + 4, monikerUnits);
        SortEntry& entry = entries[static_cast<std::size_t>(i)];
        for (std::size_t w = 0; w < kPrefixUnits / 4; ++w) {
            std::uint64_t word = 0;
            for (std::size_t k = 4 * w; k < 4 * w + 4; ++k)
                word = (word << 16) | (k < keyUnits ? units[start + kHeaderUnits + k] : 0);
            entry.prefix[w] = word;
        }
        entry.start = static_cast<std::uint32_t>(start);
        entry.index = static_cast<std::uint32_t>(i);
    }

    // First by the packed units alone, which needs nothing but the entries;
    // then each run of equal packed units by rank and lowered name, exact
    // name, moniker and position. No two entries are equal in that order, so
    // std::sort gives the stable order. Sorting a run at a time keeps the
    // buffer reads of one run together, and they are fetched ahead.
    std::sort(entries.begin(), entries.end(),
              [](const SortEntry& a, const SortEntry& b) { return a.prefixLess(b); });
    const ushort* buffer = units.data();
    const auto fullLess = [buffer](const SortEntry& a, const SortEntry& b) {
        // Equal packed units may still hide shorter keys padded with zeros,
        // so the whole keys are compared.
        const ushort* headerA = buffer + a.start;
        const ushort* headerB = buffer + b.start;
        const ushort* runA = headerA + kHeaderUnits;
        const ushort* runB = headerB + kHeaderUnits;
        for (int part = 0; part < 3; ++part) {
            const std::uint32_t sizeA = lengthAt(headerA, part);
            const std::uint32_t sizeB = lengthAt(headerB, part);
            const int order = compareUnits(runA, sizeA, runB, sizeB);
            if (order != 0)
                return order < 0;
            runA += sizeA;
            runB += sizeB;
        }
        return a.index < b.index;
    };
    for (auto run = entries.begin(); run != entries.end();) {
        auto runEnd = run + 1;
        while (runEnd != entries.end() && runEnd->prefixEqual(*run))
            ++runEnd;
        if (runEnd - run > 1) {
#if defined(__GNUC__)
            for (auto entry = run; entry != runEnd; ++entry)
                __builtin_prefetch(buffer + entry->start);
#endif
            std::sort(run, runEnd, fullLess);
        }
        run = runEnd;
    }

    // Move the nodes into place by following the permutation's cycles:
    // swaps of list items, no copies and no allocation. A position whose
    // source is itself is in place.
    std::vector<std::uint32_t> sources(static_cast<std::size_t>(count));
    for (int i = 0; i < count; ++i)
        sources[i] = entries[i].index;
    std::vector<SortEntry>().swap(entries);
    for (std::uint32_t start = 0; start < static_cast<std::uint32_t>(count); ++start) {
        std::uint32_t position = start;
        for (;;) {
            const std::uint32_t source = sources[position];
            sources[position] = position;
            if (source == start)
                break;
            swapItems(nodes, static_cast<int>(position), static_cast<int>(source));
            position = source;
        }
    }
}

} // namespace

Zel_NodeList::Zel_NodeList() = default;
Zel_NodeList::Zel_NodeList(const Zel_NodeList& other) = default;
Zel_NodeList& Zel_NodeList::operator=(const Zel_NodeList& other) = default;
Zel_NodeList::~Zel_NodeList() = default;

void Zel_NodeList::sortByOrder()
{
    sortByOrder(*this);
}

void Zel_NodeList::sortByOrder(QList<boost::shared_ptr<Zel_Node>>& nodes)
{
    sortNodes(nodes);
}

void Zel_NodeList::sortByOrder(std::vector<boost::shared_ptr<Zel_Node>>& nodes)
{
    if (nodes.size() > static_cast<std::size_t>(std::numeric_limits<int>::max()))
        std::stable_sort(nodes.begin(), nodes.end(), nodeLess);
    else
        sortNodes(nodes);
}
