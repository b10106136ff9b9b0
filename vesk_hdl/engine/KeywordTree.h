#pragma once

#include <deque>
#include <map>
#include <string>
#include <string_view>
#include <vector>

#include "vesk_hdl/engine/HdlCmd.h"
#include "vesk_hdl/text/basis/Ascii.h"

namespace Vesk_Hdl {

/// Keywords as ways through a tree of words, which match in any case.
class KeywordTree {
public:
    /// What is reached by the words of the beginning of a line.
    class Place {
    public:
        /// Of the keyword that ends here; null if none does.
        CommandCreator GetCreator() const { return creator; }

    private:
        friend class KeywordTree;
        struct Step {
            std::string word;
            Place *place; ///< after the word
        };
        /// The length first: most words differ in it.
        struct Less {
            using is_transparent = void;
            bool operator()(std::string_view a, std::string_view b) const {
                return a.size() != b.size() ? a.size() < b.size()
                                            : Basis::Ascii::CompareIgnoringCase(a, b) < 0;
            }
        };

        CommandCreator creator = nullptr;
        std::vector<Step> next; ///< at most MAX_SCANNED
        std::map<std::string, Place *, Less> more;
    };

    /// In front of all words.
    Place const &GetRoot() const { return root; }

    /// The place after all words of a token; a quoted token may hold several. Null if no keyword
    /// continues like this.
    Place const *Follow(Place const &place, std::string_view token) const {
        Place const *at = &place;
        while (at) {
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
    std::deque<Place> places; ///< all others; a deque never moves them
};

} // namespace Vesk_Hdl
