#pragma once

#include <deque>
#include <map>
#include <string>
#include <string_view>
#include <vector>

#include "vesk_hdl/engine/HdlCmd.h"
#include "vesk_hdl/text/basis/Ascii.h"

namespace Vesk_Hdl {

/// Keywords as paths through a tree of words, which match in any case. A line is compared with a
/// dozen words; a map of keywords would hash each beginning of the line.
class KeywordTree {
public:
    /// A node of the tree, which the words at the beginning of a line lead to.
    class Node {
    public:
        /// The creator of the keyword that ends here; null if none does.
        CommandCreator GetCreator() const { return creator; }

    private:
        friend class KeywordTree;
        struct Step {
            std::string word;
            Node *node; ///< where the word leads
        };
        /// Compares the lengths first, in which most words differ.
        struct Less {
            using is_transparent = void;
            bool operator()(std::string_view a, std::string_view b) const {
                return a.size() != b.size() ? a.size() < b.size()
                                            : Basis::Ascii::CompareIgnoringCase(a, b) < 0;
            }
        };

        CommandCreator creator = nullptr;
        std::vector<Step> next;                   ///< the first MAX_SCANNED words that may follow
        std::map<std::string, Node *, Less> more; ///< those of clients who register thousands
    };

    /// The node before the first word.
    Node const &GetRoot() const { return root; }

    /// The node that the words of a token lead to, null if no keyword continues with them. A
    /// quoted token may hold several words. Required: words are compared and not tokens.
    Node const *Follow(Node const &node, std::string_view token) const {
        Node const *at = &node;
        while (at) {
            // The whole token is tried first: few tokens have a blank.
            Node const *const found = Find(*at, token);
            std::size_t const blank = found ? token.npos : token.find(' ');
            if (blank == token.npos)
                return found;
            at = Find(*at, token.substr(0, blank));
            token.remove_prefix(blank + 1);
        }
        return nullptr;
    }

    /// Adds a keyword, or replaces the creator of one that is known. Single blanks separate words.
    void Add(std::string_view keyword, CommandCreator creator) {
        Node *node = &root;
        for (std::size_t blank = keyword.find(' '); blank != keyword.npos;
             blank = keyword.find(' ')) {
            node = &Enter(*node, keyword.substr(0, blank));
            keyword.remove_prefix(blank + 1);
        }
        Enter(*node, keyword).creator = creator;
    }

private:
    /// Scanning this many words is faster than a search; the library's keywords need no more.
    static constexpr std::size_t MAX_SCANNED = 16;

    static Node *Find(Node const &node, std::string_view word) {
        for (Node::Step const &step : node.next)
            if (Basis::Ascii::EqualIgnoringCase(step.word, word))
                return step.node;
        if (node.more.empty())
            return nullptr;
        auto const found = node.more.find(word);
        return found == node.more.end() ? nullptr : found->second;
    }
    Node &Enter(Node &node, std::string_view word) {
        if (Node *const found = Find(node, word))
            return *found;
        Node &made = nodes.emplace_back();
        if (node.next.size() < MAX_SCANNED)
            node.next.push_back({std::string(word), &made});
        else
            node.more.emplace(word, &made);
        return made;
    }

    Node root;
    std::deque<Node> nodes; ///< all other nodes; a deque never moves them
};

} // namespace Vesk_Hdl
