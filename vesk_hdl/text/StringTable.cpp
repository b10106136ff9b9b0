#include "vesk_hdl/text/StringTable.h"

#include <algorithm>
#include <iterator>

#include "vesk_hdl/text/basis/Ascii.h"

namespace Vesk_Hdl {

namespace {

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

StringTable::StringTable(CaseRule rule, std::uint32_t wanted)
    : caseRule(rule), bucketCount(BucketCountFor(wanted)) {}

std::uint32_t StringTable::HashIgnoringCase(std::string_view key) {
    std::uint32_t hash = FIRST_HASH;
    for (char const c : key)
        hash = AddToHash(hash, Basis::Ascii::ToUpper(c));
    return hash;
}

std::uint32_t StringTable::Hash(std::string_view key) const {
    if (caseRule == CASE_IGNORED)
        return HashIgnoringCase(key);
    std::uint32_t hash = FIRST_HASH;
    for (char const c : key)
        hash = AddToHash(hash, c);
    return hash;
}

bool StringTable::Equal(std::string_view a, std::string_view b) const {
    return a == b || (caseRule == CASE_IGNORED && Basis::Ascii::EqualIgnoringCase(a, b));
}

void StringTable::GrowForOneMore() {
    if (buckets.empty())
        buckets.assign(bucketCount, nullptr);
    if (count + 1 > bucketCount)
        Rebuild(BucketCountFor(count + 1));
}

/// Takes the nodes in the order of a walk, each to the front of its new bucket.
void StringTable::Rebuild(std::uint32_t newCount) {
    std::vector<Node *> old(newCount, nullptr);
    old.swap(buckets);
    bucketCount = newCount;
    for (Node *node : old)
        while (node) {
            Node *const next = node->next;
            Node *&bucket = buckets[BucketOf(node->hash)];
            node->next = bucket;
            bucket = node;
            node = next;
        }
}

StringTable::Node *StringTable::NewNode() {
    if (!unused) {
        constexpr std::size_t LARGEST_BLOCK = 1024;
        std::size_t const size = std::min(std::max<std::size_t>(count, 1), LARGEST_BLOCK);
        blocks.push_back(std::make_unique<Node[]>(size));
        for (std::size_t i = 0; i < size; ++i) {
            blocks.back()[i].next = unused;
            unused = &blocks.back()[i];
        }
    }
    Node *const node = unused;
    unused = node->next;
    return node;
}

StringTable::Node *StringTable::Insert(Basis::StringBase<char> const &key, std::uint32_t hash,
                                       void *value) {
    Node *const node = NewNode();
    node->key = key;
    node->value = value;
    node->hash = hash;
    Node *&first = buckets[BucketOf(node->hash)];
    // The oldest text of a bucket stays in front; a new one goes directly behind it.
    Node *&place = first ? first->next : first;
    node->next = place;
    place = node;
    ++count;
    return node;
}

void StringTable::Remove(std::string_view key) {
    Node *const node = Find(key);
    if (!node)
        return;
    Node **link = &buckets[BucketOf(node->hash)];
    while (*link != node)
        link = &(*link)->next;
    *link = node->next;
    node->key.Empty();
    node->next = unused;
    unused = node;
    --count;
}

void StringTable::Empty() {
    for (Node *&bucket : buckets)
        while (Node *const node = bucket) {
            bucket = node->next;
            node->key.Empty();
            node->next = unused;
            unused = node;
        }
    count = 0;
}

StringTable::Node *StringTable::FirstFrom(std::uint32_t bucket) const {
    for (; bucket < buckets.size(); ++bucket)
        if (buckets[bucket])
            return buckets[bucket];
    return nullptr;
}

StringTable::Node *StringTable::GetNext(Node const *node) const {
    return node->next ? node->next : FirstFrom(BucketOf(node->hash) + 1);
}

} // namespace Vesk_Hdl
