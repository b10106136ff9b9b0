#pragma once

#include <cstddef>
#include <cstdint>
#include <deque>
#include <memory>
#include <vector>

#include "vesk_hdl/text/TextIndex.h"
#include "vesk_hdl/text/basis/StringBase.h"

namespace Vesk_Hdl {

/// A set of texts, compared with case, whose order of a walk is part of the written files: the
/// dummy signals of a netlist follow it. So the table, its hash and its growth are fixed, and no
/// table of the standard library can take its place.
///
/// The order of a walk: buckets in ascending order; in a bucket first the oldest text, then the
/// others from the newest to the second oldest. A table that grows takes its texts in the order of
/// a walk and puts each to the front of its new bucket. The hash begins with 5381; each character,
/// as a signed byte, makes it the hash times 33 plus the character, in 32 bits. Bucket counts are
/// primes, and a table never holds more texts than it has buckets. A table that holds nothing yet
/// costs no allocation.
///
/// This hash is known, so that names can be made that all belong into one bucket. As soon as a
/// bucket is longer than chance makes it, a TextIndex of all texts finds them in place of the
/// chains; the order does not change.
class OrderedTextTable {
public:
    static constexpr std::uint32_t NONE = 0xFFFFFFFF; ///< the number of no node

    struct Node {
        Basis::StringBase<char> key;
        std::uint32_t next = NONE;     ///< the number of the next node of the bucket
        std::uint32_t previous = NONE; ///< the number of the node before it in the bucket
        std::uint32_t hash = 0;
        std::uint32_t length = 0; ///< during Rebuild: how many nodes the bucket has from here on
    };

    /// The table begins with the first bucket count of the series at or above `buckets`.
    explicit OrderedTextTable(std::uint32_t buckets);

    std::size_t GetCount() const { return count; }
    bool Contains(std::string_view key) const;
    /// Makes the table as large as one more text needs, even if it holds the text already, and then
    /// adds the text if it is absent. The growth in the first case is visible in the order.
    void Add(Basis::StringBase<char> const &key);
    /// Does nothing if the text is absent.
    void Remove(std::string_view key);
    /// Removes all texts; the bucket count stays.
    void Empty();

    /// The first node of a walk, null if there is none. A node stays where it is until its text is
    /// removed.
    Node const *GetFirst();
    /// The node after `node`, null at the end.
    Node const *GetNext(Node const *node) const;

private:
    static constexpr std::uint32_t MAX_BUCKET = 50; ///< chance makes no bucket longer than this

    static std::uint32_t Hash(std::string_view key);
    std::uint32_t BucketOf(std::uint32_t hash) const { return hash % bucketCount; }
    Node const *Find(std::string_view key, std::uint32_t hash, std::uint32_t &passed) const;
    void GrowForOneMore();
    void Rebuild(std::uint32_t newCount);
    void MakeIndex();
    Node const *FirstFrom(std::uint32_t bucket) const;

    std::uint32_t bucketCount;
    std::uint32_t lowestBucket = 0; ///< no bucket before this one holds a text: walks begin here
    std::size_t count = 0;
    std::vector<std::uint32_t> buckets; ///< numbers of nodes; empty until the first text
    std::deque<Node> nodes;
    std::uint32_t unused = NONE;      ///< the first node without a text; `next` chains the others
    std::unique_ptr<TextIndex> index; ///< text to Node; null while no bucket is longer than chance
};

} // namespace Vesk_Hdl
