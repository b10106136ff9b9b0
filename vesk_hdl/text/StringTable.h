#pragma once

#include <bit>
#include <cstddef>
#include <cstdint>
#include <memory>
#include <vector>

#include "vesk_hdl/text/basis/StringBase.h"

namespace Vesk_Hdl {

/// The hash table behind IStringPtrMap and StringSet: texts, each with a pointer, hashed in chains.
///
/// The order of a walk is fixed, since the order of dummy signals in a written file comes from it:
/// buckets in ascending order, and in a bucket the oldest text first, then the others newest first.
/// Hash: from 5381, for each character as a signed byte, times 33 plus the character, in 32 bits.
/// Bucket counts are primes; a table never holds more texts than it has buckets. A table that holds
/// nothing yet costs no allocation.
class StringTable {
public:
    enum CaseRule { CASE_EXACT, CASE_IGNORED };
    /// A table that nobody walks takes another hash once names that were made to collide fill a
    /// bucket: looking one up stays as fast as any other.
    enum OrderRule { ORDER_FIXED, ORDER_FREE };

    static constexpr std::uint32_t NONE = 0xFFFFFFFF; ///< the number of no node

    struct Node {
        Basis::StringBase<char> key;
        void *value = nullptr;
        std::uint32_t next = NONE; ///< in its bucket, by number
        std::uint32_t hash = 0;
    };

    /// The table begins with the first bucket count of the series at or above `buckets`.
    StringTable(CaseRule caseRule, std::uint32_t buckets, OrderRule orderRule = ORDER_FIXED);

    std::size_t GetCount() const { return count; }
    Node *Find(std::string_view key) const { return Find(key, Hash(key)); }
    /// With the key's hash, where the caller has it already.
    Node *Find(std::string_view key, std::uint32_t hash) const {
        if (buckets.empty())
            return nullptr;
        if (isRehashed)
            hash = OtherHash(key);
        int length = 0;
        for (std::uint32_t at = buckets[BucketOf(hash)]; at != NONE; ++length) {
            Node &node = At(at);
            if (node.hash == hash && Equal(node.key.View(), key))
                return &node;
            at = node.next;
        }
        if (length > LONGEST_BUCKET)
            isCrowded = true;
        return nullptr;
    }
    /// The hash of tables that ignore case.
    static std::uint32_t HashIgnoringCase(std::string_view key);
    static std::uint32_t AddToHash(std::uint32_t hash, char c) {
        auto const byte = static_cast<signed char>(c);
        return hash * 33 + static_cast<std::uint32_t>(static_cast<std::int32_t>(byte));
    }
    static constexpr std::uint32_t FIRST_HASH = 5381;
    /// Makes the table as large as one more text demands.
    void GrowForOneMore();
    /// Adds a text that the table does not hold, behind GrowForOneMore.
    Node *Insert(Basis::StringBase<char> const &key, void *value) {
        return Insert(key, Hash(key.View()), value);
    }
    Node *Insert(Basis::StringBase<char> const &key, std::uint32_t hash, void *value);
    void Remove(std::string_view key);
    /// Removes all texts; the bucket count stays.
    void Empty();

    /// The walk: the first node, the one behind `node`, null at the end.
    Node *GetFirst() const { return FirstFrom(0); }
    Node *GetNext(Node const *node) const;

private:
    static constexpr std::uint32_t LARGEST_BLOCK = 1024;
    static constexpr int LONGEST_BUCKET = 50; ///< chance makes none of that length

    /// A node by its number. Numbers take half the room of pointers, and a design has two nodes for
    /// each instance. Blocks have 1, 1, 2, 4 and on to 512 nodes, then LARGEST_BLOCK.
    Node &At(std::uint32_t number) const {
        return number < LARGEST_BLOCK
                   ? blocks[std::bit_width(number)][number - std::bit_floor(number)]
                   : blocks[10 + number / LARGEST_BLOCK][number % LARGEST_BLOCK];
    }
    std::uint32_t Hash(std::string_view key) const;
    std::uint32_t OtherHash(std::string_view key) const;
    void Rehash();
    bool Equal(std::string_view a, std::string_view b) const;
    std::uint32_t BucketOf(std::uint32_t hash) const { return hash % bucketCount; }
    Node *FirstFrom(std::uint32_t bucket) const;
    void Rebuild(std::uint32_t newCount);
    std::uint32_t NewNode();
    void Drop(std::uint32_t number);

    CaseRule caseRule;
    OrderRule orderRule;
    bool isRehashed = false;
    mutable bool isCrowded = false; ///< a bucket is longer than chance would make it
    std::uint32_t bucketCount;
    std::size_t count = 0;
    std::vector<std::uint32_t> buckets;          ///< numbers of nodes; empty until the first text
    std::vector<std::unique_ptr<Node[]>> blocks; ///< nodes are made by the block
    std::uint32_t made = 0;                      ///< nodes that held a text at some time
    std::uint32_t unused = NONE;                 ///< those of them that hold none now
};

} // namespace Vesk_Hdl
