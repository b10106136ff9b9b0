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
    class Place {
    public:
        /// The creator of the keyword that ends here; null if none does.
        CommandCreator GetCreator() const { return creator; }

    private:
        friend class KeywordTree;
        struct Step {
            std::string word;
            Place *place; ///< where the word leads
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
        std::vector<Step> next;                    ///< the first MAX_SCANNED words that may follow
        std::map<std::string, Place *, Less> more; ///< those of clients who register thousands
    };

    /// The place before the first word.
    Place const &GetRoot() const { return root; }

    /// The place that the words of a token lead to, null if no keyword continues with them. A
    /// quoted token may hold several words. Required: words are compared and not tokens.
    Place const *Follow(Place const &place, std::string_view token) const {
        Place const *at = &place;
        while (at) {
            // The whole token is tried first: few tokens have a blank.
            Place const *const found = Find(*at, token);
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
        Place *place = &root;
        for (std::size_t blank = keyword.find(' '); blank != keyword.npos;
             blank = keyword.find(' ')) {
            place = &Enter(*place, keyword.substr(0, blank));
            keyword.remove_prefix(blank + 1);
        }
        Enter(*place, keyword).creator = creator;
    }

private:
    /// Scanning this many words is faster than a search; the library's keywords need no more.
    static constexpr std::size_t MAX_SCANNED = 16;

    static Place *Find(Place const &place, std::string_view word) {
        for (Place::Step const &step : place.next)
            if (Basis::Ascii::EqualIgnoringCase(step.word, word))
                return step.place;
        if (place.more.empty())
            return nullptr;
        auto const found = place.more.find(word);
        return found == place.more.end() ? nullptr : found->second;
    }
    Place &Enter(Place &place, std::string_view word) {
        if (Place *const found = Find(place, word))
            return *found;
        Place &made = places.emplace_back();
        if (place.next.size() < MAX_SCANNED)
            place.next.push_back({std::string(word), &made});
        else
            place.more.emplace(word, &made);
        return made;
    }

    Place root;
    std::deque<Place> places; ///< all other places; a deque never moves them
};

} // namespace Vesk_Hdl
