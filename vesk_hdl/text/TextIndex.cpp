// The table that finds a pointer by a text; its header explains the references of 32 bits.

#include "vesk_hdl/text/TextIndex.h"

#include <algorithm>
#include <cassert>
#include <stdexcept>
#include <utility>

#include "vesk_hdl/text/basis/Ascii.h"

namespace Vesk_Hdl {

/// Most questions have the spelling of the table, and comparing bytes is cheaper than folding them.
bool TextIndex::Equal(std::string_view a, std::string_view b) const {
    return a == b || (caseRule == CASE_IGNORED && Basis::Ascii::EqualIgnoringCase(a, b));
}

TextIndex::Node const *TextIndex::FindUnhashed(std::string_view key) const {
    for (Node const &node : nodes)
        if (Equal(node.key.View(), key))
            return &node;
    return nullptr;
}

/// Follows a chain from one of its references on. A node whose bits of the hash differ is passed
/// over without reading it.
TextIndex::Node const *TextIndex::FindFrom(std::uint32_t at, std::string_view key,
                                           std::uint32_t hash) const {
    for (; at != NONE; at = Link(at & mask)) {
        if (((at ^ hash) & ~mask) != 0)
            continue;
        Node const &node = nodes[at & mask];
        if (Equal(node.key.View(), key))
            return &node;
    }
    return nullptr;
}

void TextIndex::Put(Basis::StringBase<char> const &key, void *value) {
    Put(key, HashOf(key.View()), value);
}

void TextIndex::Put(Basis::StringBase<char> const &key, std::uint32_t hash, void *value) {
    if (Node const *const node = Find(key.View(), hash)) {
        nodes[NumberOf(node)].value = value;
        return;
    }
    GrowForOneMore();
    nodes.push_back({key, value});
    if (IsHashed())
        Chain(static_cast<std::uint32_t>(nodes.size() - 1), hash);
}

/// Makes a node the first of its bucket.
void TextIndex::Chain(std::uint32_t number, std::uint32_t hash) {
    assert(number < mask && "the number of a node is taken for a part of its hash");
    std::uint32_t &bucket = buckets[hash & mask];
    Link(number) = bucket;
    bucket = (hash & ~mask) | number;
}

void TextIndex::GrowForOneMore() {
    if (nodes.size() < (IsHashed() ? mask : MAX_UNHASHED))
        return;
    if (mask == NONE) // 2^32 buckets: a number has no bit more
        throw std::length_error("Vesk_Hdl::TextIndex: too many texts");
    std::uint32_t const oldMask = mask;
    std::uint32_t const newMask = IsHashed() ? 2 * mask + 1 : 2 * MAX_UNHASHED - 1;
    std::size_t const newCount = std::size_t{newMask} + 1;
    auto grown = std::make_unique_for_overwrite<std::uint32_t[]>(newCount + newMask);
    std::fill_n(grown.get(), newCount, NONE);
    buckets.swap(grown); // `grown` now holds the old buckets and links, null for none
    mask = newMask;
    if (!grown)
        for (std::size_t number = 0; number < nodes.size(); ++number)
            Chain(static_cast<std::uint32_t>(number), HashOf(nodes[number].key.View()));
    else
        for (std::size_t bucket = 0; bucket <= oldMask; ++bucket)
            for (std::uint32_t at = grown[bucket]; at != NONE;) {
                std::uint32_t const number = at & oldMask;
                Chain(number, (at & ~oldMask) | static_cast<std::uint32_t>(bucket));
                at = grown[std::size_t{oldMask} + 1 + number];
            }
}

/// The bucket or link that refers to a node. `hash` is that of its text and leads to its chain.
std::uint32_t &TextIndex::ReferenceTo(std::uint32_t number, std::uint32_t hash) {
    std::uint32_t *at = &buckets[hash & mask];
    while ((*at & mask) != number) {
        assert(*at != NONE && "a node is in the chain of another bucket");
        at = &Link(*at & mask);
    }
    return *at;
}

/// The last node moves to the place of the removed one, so that the array has no gap. The reference
/// to the last node gets its new number.
void TextIndex::Remove(std::string_view key) {
    Node const *const node = Find(key);
    if (!node)
        return;
    std::uint32_t const number = NumberOf(node);
    auto const last = static_cast<std::uint32_t>(nodes.size() - 1);
    assert(number <= last && "the node found is none of this table");
    if (IsHashed())
        ReferenceTo(number, HashOf(key)) = Link(number);
    if (IsHashed() && number != last) {
        std::uint32_t &reference = ReferenceTo(last, HashOf(nodes[last].key.View()));
        reference = (reference & ~mask) | number;
        Link(number) = Link(last);
    }
    if (number != last)
        nodes[number] = std::move(nodes[last]);
    nodes.pop_back();
}

void TextIndex::Empty() {
    nodes.clear();
    buckets.reset();
    mask = 0;
}

} // namespace Vesk_Hdl
