#pragma once

#include <unordered_map>
#include <unordered_set>
#include <utility>

#include "vesk_hdl/netlist/NetlistFwd.h"

namespace Vesk_Hdl {

/// Which signals may list which others, by link or as a member: at least those that do of what was
/// noted here. Signals are compared and never looked into.
class Referrers {
public:
    using Set = std::unordered_set<Signal *>;

    void Note(Signal *target, Signal *referrer) {
        referrers[target].insert(referrer);
        targets[referrer].insert(target);
    }

    /// What `from` lists may be listed by `to` as well.
    void Copy(Signal *from, Signal *to) {
        auto const found = targets.find(from);
        if (found == targets.end())
            return;
        Set const listed = found->second;
        for (Signal *const target : listed)
            Note(target, to);
    }

    /// Forgets a signal that is about to die.
    void Forget(Signal *signal) {
        for (Signal *const target : Take(targets, signal))
            referrers[target].erase(signal);
        for (Signal *const referrer : Take(referrers, signal))
            targets[referrer].erase(signal);
    }

    /// Forgets who lists a signal, and tells.
    Set TakeReferrers(Signal *target) {
        Set taken = Take(referrers, target);
        for (Signal *const referrer : taken)
            targets[referrer].erase(target);
        return taken;
    }

private:
    using Map = std::unordered_map<Signal *, Set>;

    static Set Take(Map &map, Signal *key) {
        auto const found = map.find(key);
        if (found == map.end())
            return {};
        Set taken = std::move(found->second);
        map.erase(found);
        return taken;
    }

    Map referrers; ///< of a target
    Map targets;   ///< of a referrer
};

} // namespace Vesk_Hdl
