#include "vesk_hdl/text/StringTable.h"

#include <algorithm>
#include <functional>
#include <iterator>
#include <stdexcept>
#include <string>

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

StringTable::StringTable(CaseRule rule, std::uint32_t wanted, OrderRule order)
    : caseRule(rule), orderRule(order), bucketCount(BucketCountFor(wanted)) {}

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

/// One that cannot be made to collide together with the first.
std::uint32_t StringTable::OtherHash(std::string_view key) const {
    std::string folded(key);
    if (caseRule == CASE_IGNORED)
        for (char &c : folded)
            c = Basis::Ascii::ToUpper(c);
    return static_cast<std::uint32_t>(std::hash<std::string>()(folded));
}

void StringTable::Rehash() {
    isRehashed = true;
    std::uint32_t all = NONE; // the nodes of all buckets in one chain
    for (std::uint32_t &bucket : buckets)
        while (bucket != NONE) {
            std::uint32_t const number = bucket;
            bucket = At(number).next;
            At(number).next = all;
            all = number;
        }
    while (all != NONE) {
        Node &node = At(all);
        std::uint32_t const next = node.next;
        node.hash = OtherHash(node.key.View());
        std::uint32_t &bucket = buckets[BucketOf(node.hash)];
        node.next = bucket;
        bucket = all;
        all = next;
    }
}

bool StringTable::Equal(std::string_view a, std::string_view b) const {
    return a == b || (caseRule == CASE_IGNORED && Basis::Ascii::EqualIgnoringCase(a, b));
}

void StringTable::GrowForOneMore() {
    if (buckets.empty())
        buckets.assign(bucketCount, NONE);
    if (count + 1 > bucketCount)
        Rebuild(BucketCountFor(count + 1));
    if (isCrowded && !isRehashed && orderRule == ORDER_FREE)
        Rehash();
}

/// Takes the nodes in the order of a walk, each to the front of its new bucket.
void StringTable::Rebuild(std::uint32_t newCount) {
    std::vector<std::uint32_t> old(newCount, NONE);
    old.swap(buckets);
    bucketCount = newCount;
    for (std::uint32_t number : old)
        while (number != NONE) {
            Node &node = At(number);
            std::uint32_t const next = node.next;
            std::uint32_t &bucket = buckets[BucketOf(node.hash)];
            node.next = bucket;
            bucket = number;
            number = next;
        }
}

/// The number of a node without a text.
std::uint32_t StringTable::NewNode() {
    if (unused != NONE) {
        std::uint32_t const number = unused;
        unused = At(number).next;
        return number;
    }
    if (made == NONE)
        throw std::length_error("Vesk_Hdl::StringTable: too many texts");
    if (made % LARGEST_BLOCK == 0 || (made < LARGEST_BLOCK && std::has_single_bit(made)))
        blocks.push_back(
            std::make_unique<Node[]>(std::min(std::max<std::uint32_t>(made, 1), LARGEST_BLOCK)));
    return made++;
}

StringTable::Node *StringTable::Insert(Basis::StringBase<char> const &key, std::uint32_t hash,
                                       void *value) {
    if (isRehashed)
        hash = OtherHash(key.View());
    std::uint32_t const number = NewNode();
    Node &node = At(number);
    node.key = key;
    node.value = value;
    node.hash = hash;
    std::uint32_t &first = buckets[BucketOf(hash)];
    // The oldest text of a bucket stays in front; a new one goes directly behind it.
    std::uint32_t &place = first == NONE ? first : At(first).next;
    node.next = place;
    place = number;
    ++count;
    return &node;
}

void StringTable::Remove(std::string_view key) {
    Node *const node = Find(key);
    if (!node)
        return;
    std::uint32_t *link = &buckets[BucketOf(node->hash)];
    while (&At(*link) != node)
        link = &At(*link).next;
    std::uint32_t const number = *link;
    *link = node->next;
    Drop(number);
    --count;
}

void StringTable::Empty() {
    for (std::uint32_t &bucket : buckets)
        while (bucket != NONE) {
            std::uint32_t const number = bucket;
            bucket = At(number).next;
            Drop(number);
        }
    count = 0;
}

void StringTable::Drop(std::uint32_t number) {
    Node &node = At(number);
    node.key.Empty();
    node.next = unused;
    unused = number;
}

StringTable::Node *StringTable::FirstFrom(std::uint32_t bucket) const {
    for (; bucket < buckets.size(); ++bucket)
        if (buckets[bucket] != NONE)
            return &At(buckets[bucket]);
    return nullptr;
}

StringTable::Node *StringTable::GetNext(Node const *node) const {
    return node->next != NONE ? &At(node->next) : FirstFrom(BucketOf(node->hash) + 1);
}

} // namespace Vesk_Hdl
