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
/// The nodes lie in one array, without gaps. A table of a few texts is searched from its first node
/// to its last; a larger one hashes them into chains. A bucket, and the link from each node to the
/// next one of its bucket, is a reference of 32 bits:
///
///     | upper bits of the text's hash | number of the node |
///
/// Where there are 2^k buckets, the number has k bits, and the lower k bits of the hash are the
/// number of the bucket. So a reference holds all of the hash that its bucket does not tell, and a
/// search looks at no node but the one it finds. This relies on two invariants:
/// - There are fewer nodes than buckets, so that no number has k bits that are all 1. NONE does.
/// - A chain holds the nodes of one bucket and no other, so that a node's hash can be read off its
///   reference and its bucket when the table grows.
class TextIndex {
public:
    enum CaseRule { CASE_EXACT, CASE_IGNORED };

    struct Node {
        Basis::StringBase<char> key;
        void *value;
    };

    explicit TextIndex(CaseRule rule) : caseRule(rule) {}

    std::size_t GetCount() const { return nodes.size(); }
    /// Null when absent. A node is valid until the table changes.
    Node const *Find(std::string_view key) const { return Find(key, IsHashed() ? HashOf(key) : 0); }
    /// With the key's hash by HashOf, where the caller has it already.
    Node const *Find(std::string_view key, std::uint32_t hash) const {
        if (!IsHashed())
            return FindUnhashed(key);
        std::uint32_t const first = buckets[hash & mask];
        return first == NONE ? nullptr : FindFrom(first, key, hash);
    }
    /// Adds a text, or gives it another value if it is there. The text that was there stays.
    void Put(Basis::StringBase<char> const &key, void *value);
    void Put(Basis::StringBase<char> const &key, std::uint32_t hash, void *value);
    /// Does nothing if the text is absent.
    void Remove(std::string_view key);
    void Empty();
    std::uint32_t HashOf(std::string_view key) const {
        return caseRule == CASE_IGNORED ? SeededHashIgnoringCase(key) : SeededHash(key);
    }

    /// The nodes in an order that means nothing.
    std::vector<Node>::const_iterator begin() const { return nodes.begin(); }
    std::vector<Node>::const_iterator end() const { return nodes.end(); }

private:
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
    /// The buckets, after them the link of each node; null while no text is hashed.
    std::unique_ptr<std::uint32_t[]> buckets;
    std::uint32_t mask = 0; ///< the number of buckets less one
    CaseRule caseRule;
};

} // namespace Vesk_Hdl
