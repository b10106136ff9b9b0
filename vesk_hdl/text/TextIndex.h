#pragma once

#include <cstddef>
#include <cstdint>
#include <memory>
#include <vector>

#include "vesk_hdl/text/SeededHash.h"
#include "vesk_hdl/text/basis/StringBase.h"

namespace Vesk_Hdl {

/// Finds a pointer by a text. The texts have no order.
///
/// The nodes are in one array without gaps. A table of a few texts is searched from its first node
/// to its last; a larger one hashes its texts into chains. Each bucket, and each link from a node
/// to the next one of its bucket, is a reference of 32 bits:
///
///     | upper bits of the text's hash | number of the node |
///
/// With 2^k buckets, the number has k bits, and the lower k bits of the hash are the number of the
/// bucket. So a reference and its bucket together hold the whole hash, and a search reads no node
/// but the one that it finds. This relies on two invariants:
/// - There are fewer nodes than buckets. So no number has k bits that are all 1, as NONE has.
/// - A chain holds the nodes of one bucket and no other. So a table that grows need not hash its
/// texts
///   again: the hash is read off the reference and the bucket.
class TextIndex {
public:
    enum CaseRule { CASE_EXACT, CASE_IGNORED };

    struct Node {
        Basis::StringBase<char> key;
        void *value;
    };

    explicit TextIndex(CaseRule rule) : caseRule(rule) {}

    std::size_t GetCount() const { return nodes.size(); }
    /// The node of a text, null when absent. It is valid until the table changes.
    Node const *Find(std::string_view key) const { return Find(key, IsHashed() ? HashOf(key) : 0); }
    /// The same with the hash of the key (HashOf), for a caller that asks several tables.
    Node const *Find(std::string_view key, std::uint32_t hash) const {
        if (!IsHashed())
            return FindUnhashed(key);
        std::uint32_t const first = buckets[hash & mask];
        return first == NONE ? nullptr : FindFrom(first, key, hash);
    }
    /// Adds a text, or replaces the value of one that is there, whose spelling stays.
    void Put(Basis::StringBase<char> const &key, void *value);
    void Put(Basis::StringBase<char> const &key, std::uint32_t hash, void *value);
    /// Does nothing if the text is absent.
    void Remove(std::string_view key);
    void Empty();
    std::uint32_t HashOf(std::string_view key) const {
        return caseRule == CASE_IGNORED ? SeededHashIgnoringCase(key) : SeededHash(key);
    }

    /// The nodes, in an order without a meaning.
    std::vector<Node>::const_iterator begin() const { return nodes.begin(); }
    std::vector<Node>::const_iterator end() const { return nodes.end(); }

private:
    /// Up to this many texts a search from first to last is as fast, and needs no buckets.
    static constexpr std::uint32_t MAX_UNHASHED = 4;
    static constexpr std::uint32_t NONE = 0xFFFFFFFF; ///< the reference to no node

    bool IsHashed() const { return buckets != nullptr; }
    Node const *FindUnhashed(std::string_view key) const;
    Node const *FindFrom(std::uint32_t at, std::string_view key, std::uint32_t hash) const;
    bool Equal(std::string_view a, std::string_view b) const;
    std::uint32_t NumberOf(Node const *node) const {
        return static_cast<std::uint32_t>(node - nodes.data());
    }
    std::uint32_t &Link(std::uint32_t number) const {
        return buckets[std::size_t{mask} + 1 + number];
    }
    std::uint32_t &ReferenceTo(std::uint32_t number, std::uint32_t hash);
    void Chain(std::uint32_t number, std::uint32_t hash);
    void GrowForOneMore();

    std::vector<Node> nodes;
    /// The buckets, then the link of each node, in one block; null while no text is hashed.
    std::unique_ptr<std::uint32_t[]> buckets;
    std::uint32_t mask = 0; ///< the number of buckets less one: k bits that are 1
    CaseRule caseRule;
};

} // namespace Vesk_Hdl
