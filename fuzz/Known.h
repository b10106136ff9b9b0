#pragma once

#include <unordered_map>
#include <vector>

/// The objects of one class that a client knows, and whether they still exist. Pointers are
/// compared and never dereferenced.
template <class T> class Known {
public:
    struct Entry {
        T *object;
        void const *owner; ///< null if the client owns it
        bool lives = true;
        bool isHidden = false; ///< not listed by its netlist: it replaced a bus that was widened
    };

    void Add(T *object, void const *owner, bool isHidden = false) {
        if (Lives(object))
            return;
        places[object] = entries.size();
        entries.push_back({object, owner, true, isHidden});
    }
    bool Knows(T const *object) const { return places.contains(object); }
    bool Lives(T const *object) const { return Knows(object) && entries[NumberOf(object)].lives; }
    bool IsOwn(T const *object) const { return !entries[NumberOf(object)].owner; }
    Entry &Get(T const *object) { return entries[NumberOf(object)]; }
    std::size_t NumberOf(T const *object) const { return places.at(object); }

    void Bury(T const *object) { Get(object).lives = false; }
    void BuryAllOf(void const *owner) {
        for (Entry &entry : entries)
            entry.lives = entry.lives && entry.owner != owner;
    }

    template <class Choose> std::vector<T *> All(Choose choose) const {
        std::vector<T *> chosen;
        for (Entry const &entry : entries)
            if (choose(entry))
                chosen.push_back(entry.object);
        return chosen;
    }
    std::vector<T *> Living() const {
        return All([](Entry const &entry) { return entry.lives; });
    }
    std::vector<T *> LivingOf(void const *owner) const {
        return All([owner](Entry const &entry) { return entry.lives && entry.owner == owner; });
    }

private:
    std::vector<Entry> entries;
    std::unordered_map<T const *, std::size_t>
        places; ///< of an address that was used again, the newest
};
