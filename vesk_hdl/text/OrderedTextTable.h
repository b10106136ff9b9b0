#pragma once

#include <cstddef>
#include <cstdint>
#include <deque>
#include <memory>
#include <vector>

#include "vesk_hdl/text/TextIndex.h"
#include "vesk_hdl/text/basis/StringBase.h"

namespace Vesk_Hdl {

/// Texts, compared with case, in an order that is part of the written files: the dummy signals of a
/// netlist follow it.
///
/// The order of a walk: buckets in ascending order, and in a bucket the oldest text first, then the
/// others newest first. A table that grows takes the texts in the order of a walk, each to the
/// front of its new bucket. Hash: from 5381, for each character as a signed byte, times 33 plus the
/// character, in 32 bits. Bucket counts are primes; a table never holds more texts than it has
/// buckets. A table that holds nothing yet costs no allocation.
///
/// Anybody can make names that this hash puts into one bucket. As soon as a bucket is longer than
/// chance makes it, a TextIndex of all texts beside the chains finds them; the order stays.
class OrderedTextTable {
public:
    static constexpr std::uint32_t NONE = 0xFFFFFFFF; ///< the number of no node

    struct Node {
        Basis::StringBase<char> key;
        std::uint32_t next = NONE;     ///< in its bucket, by number
        std::uint32_t previous = NONE; ///< in its bucket, by number
        std::uint32_t hash = 0;
        std::uint32_t length = 0; ///< while the table is rebuilt: the nodes from here to the end
    };

    /// The table begins with the first bucket count of the series at or above `buckets`.
    explicit OrderedTextTable(std::uint32_t buckets);

    std::size_t GetCount() const { return count; }
    bool Contains(std::string_view key) const;
    /// Makes the table as large as one more text demands, also if it holds the text already, and
    /// then adds the text if it is absent.
    void Add(Basis::StringBase<char> const &key);
    /// Does nothing if the text is absent.
    void Remove(std::string_view key);
    /// Removes all texts; the bucket count stays.
    void Empty();

    /// The walk: the first node, the one after `node`, null at the end. A node stays where it is
    /// until its text is removed.
    Node const *GetFirst();
    Node const *GetNext(Node const *node) const;

private:
    static constexpr std::uint32_t LONGEST_BUCKET = 50; ///< chance makes none of that length

    static std::uint32_t Hash(std::string_view key);
    std::uint32_t BucketOf(std::uint32_t hash) const { return hash % bucketCount; }
    Node const *Find(std::string_view key, std::uint32_t hash, std::uint32_t &passed) const;
    void GrowForOneMore();
    void Rebuild(std::uint32_t newCount);
    void MakeIndex();
    Node const *FirstFrom(std::uint32_t bucket) const;

    std::uint32_t bucketCount;
    std::uint32_t lowestBucket = 0; ///< no bucket before this one holds a text
    std::size_t count = 0;
    std::vector<std::uint32_t> buckets; ///< numbers of nodes; empty until the first text
    std::deque<Node> nodes;
    std::uint32_t unused = NONE;      ///< the first node without a text; `next` leads to others
    std::unique_ptr<TextIndex> index; ///< text to Node; null while no bucket is longer than chance
};

} // namespace Vesk_Hdl
