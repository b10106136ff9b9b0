// A set of texts with a required order. The header says which; docs/architecture.md, "Storage and
// its invariants", what depends on it.

#include "vesk_hdl/text/OrderedTextTable.h"

#include <algorithm>
#include <cassert>
#include <iterator>
#include <stdexcept>

namespace Vesk_Hdl {

namespace {

/// Primes, each about double the one before. The series is part of the visible order.
constexpr std::uint32_t BUCKET_COUNTS[] = {
    7,         23,        53,        97,         193,        389,        769,      1543,
    3079,      6151,      12289,     24593,      49157,      98317,      196613,   393241,
    786433,    1572869,   3145739,   6291469,    12582917,   25165843,   50331653, 100663319,
    201326611, 402653189, 805306457, 1610612741, 3221225473, 4294967291,
};

std::uint32_t BucketCountFor(std::size_t wanted) {
    auto const *const found =
        std::lower_bound(std::begin(BUCKET_COUNTS), std::end(BUCKET_COUNTS), wanted);
    return found == std::end(BUCKET_COUNTS) ? *(found - 1) : *found;
}

} // namespace

OrderedTextTable::OrderedTextTable(std::uint32_t wanted) : bucketCount(BucketCountFor(wanted)) {}

/// A character is taken as signed, so that bytes above 127 count as negative numbers. Where `char`
/// is unsigned the order must be the same.
std::uint32_t OrderedTextTable::Hash(std::string_view key) {
    std::uint32_t hash = 5381;
    for (char const c : key)
        hash = hash * 33 + static_cast<std::uint32_t>(std::int32_t{static_cast<signed char>(c)});
    return hash;
}

/// Counts in `passed` the nodes of the bucket that have another text.
OrderedTextTable::Node const *OrderedTextTable::Find(std::string_view key, std::uint32_t hash,
                                                     std::uint32_t &passed) const {
    passed = 0;
    if (index) {
        TextIndex::Node const *const found = index->Find(key);
        return found ? static_cast<Node const *>(found->value) : nullptr;
    }
    if (buckets.empty())
        return nullptr;
    for (std::uint32_t at = buckets[BucketOf(hash)]; at != NONE; ++passed) {
        Node const &node = nodes[at];
        if (node.hash == hash && node.key.View() == key)
            return &node;
        at = node.next;
    }
    return nullptr;
}

bool OrderedTextTable::Contains(std::string_view key) const {
    std::uint32_t passed = 0;
    return Find(key, Hash(key), passed) != nullptr;
}

void OrderedTextTable::GrowForOneMore() {
    if (buckets.empty())
        buckets.assign(bucketCount, NONE);
    if (count + 1 > bucketCount)
        Rebuild(BucketCountFor(count + 1));
}

/// The nodes stay where they are; only their chains are made anew. Their order within a bucket is
/// the reverse of the order in which this walk meets them.
void OrderedTextTable::Rebuild(std::uint32_t newCount) {
    std::vector<std::uint32_t> old(newCount, NONE);
    old.swap(buckets);
    bucketCount = newCount;
    lowestBucket = 0;
    std::uint32_t longest = 0;
    for (std::uint32_t number : old)
        while (number != NONE) {
            Node &node = nodes[number];
            std::uint32_t const next = node.next;
            std::uint32_t &first = buckets[BucketOf(node.hash)];
            node.next = first;
            node.previous = NONE;
            node.length =
                1; // counted on the way, since a walk over a long bucket would cost its square
            if (first != NONE) {
                nodes[first].previous = number;
                node.length += nodes[first].length;
            }
            longest = std::max(longest, node.length);
            first = number;
            number = next;
        }
    if (longest > MAX_BUCKET)
        MakeIndex();
}

/// The index stays until the table is emptied: names that collided once may do so again.
void OrderedTextTable::MakeIndex() {
    if (index)
        return;
    auto made = std::make_unique<TextIndex>(TextIndex::CASE_EXACT);
    for (std::uint32_t number : buckets)
        for (; number != NONE; number = nodes[number].next)
            made->Put(nodes[number].key, &nodes[number]);
    index = std::move(made);
}

void OrderedTextTable::Add(Basis::StringBase<char> const &key) {
    GrowForOneMore();
    std::uint32_t const hash = Hash(key.View());
    std::uint32_t passed = 0;
    if (Find(key.View(), hash, passed))
        return;
    if (passed >= MAX_BUCKET)
        MakeIndex();
    // All that may run out of memory comes before the first change, so that a failed Add leaves the
    // table whole.
    if (unused == NONE) {
        if (nodes.size() >= NONE)
            throw std::length_error("Vesk_Hdl::OrderedTextTable: too many texts");
        nodes.emplace_back();
        unused = static_cast<std::uint32_t>(nodes.size() - 1);
    }
    std::uint32_t const number = unused;
    Node &node = nodes[number];
    if (index)
        index->Put(key, &node);
    unused = node.next;
    node.key = key;
    node.hash = hash;
    // The oldest text of a bucket stays its first; a new one comes directly after it.
    std::uint32_t const bucket = BucketOf(hash);
    std::uint32_t &first = buckets[bucket];
    node.previous = first;
    std::uint32_t &place = first == NONE ? first : nodes[first].next;
    node.next = place;
    if (node.next != NONE)
        nodes[node.next].previous = number;
    place = number;
    lowestBucket = std::min(lowestBucket, bucket);
    ++count;
}

void OrderedTextTable::Remove(std::string_view key) {
    std::uint32_t passed = 0;
    Node const *const found = Find(key, Hash(key), passed);
    if (!found)
        return;
    std::uint32_t &link =
        found->previous == NONE ? buckets[BucketOf(found->hash)] : nodes[found->previous].next;
    std::uint32_t const number = link;
    Node &node = nodes[number];
    assert(&node == found && "a text and the one before it in the bucket disagree");
    link = node.next;
    if (node.next != NONE)
        nodes[node.next].previous = node.previous;
    if (index)
        index->Remove(key);
    node.key.Empty();
    node.next = unused;
    unused = number;
    --count;
}

/// Only buckets that are in use are reset. The passes of a write empty a set that is small again
/// but may have been large.
void OrderedTextTable::Empty() {
    for (Node const &node : nodes)
        buckets[BucketOf(node.hash)] = NONE;
    nodes.clear();
    unused = NONE;
    index.reset();
    count = 0;
}

OrderedTextTable::Node const *OrderedTextTable::FirstFrom(std::uint32_t bucket) const {
    for (; bucket < buckets.size(); ++bucket)
        if (buckets[bucket] != NONE)
            return &nodes[buckets[bucket]];
    return nullptr;
}

OrderedTextTable::Node const *OrderedTextTable::GetFirst() {
    while (lowestBucket < buckets.size() && buckets[lowestBucket] == NONE)
        ++lowestBucket;
    return FirstFrom(lowestBucket);
}

OrderedTextTable::Node const *OrderedTextTable::GetNext(Node const *node) const {
    return node->next != NONE ? &nodes[node->next] : FirstFrom(BucketOf(node->hash) + 1);
}

} // namespace Vesk_Hdl
