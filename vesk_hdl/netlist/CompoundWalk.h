#pragma once

#include <unordered_map>
#include <unordered_set>
#include <vector>

#include "vesk_hdl/netlist/As.h"

namespace Vesk_Hdl {

/// A walk over the members of a compound and of the compounds in it, left to right.
///
/// Clients can nest compounds as deep as they like, also in a circle. The walk uses no recursion,
/// so that depth costs no stack. It leaves out a compound that it is inside of; after it has met
/// such a one it enters no compound a second time, since a circle could be entered on exponentially
/// many ways. So it always ends, and without a circle it visits every member as often as it occurs.
///
/// `Visitor` has Enter(CompoundBus &), Leave(CompoundBus &), and Visit(Signal &) for members that
/// are no compounds. Null members are skipped.
template <class Visitor> class CompoundWalk {
public:
    explicit CompoundWalk(Visitor &toVisit) : visitor(toVisit) {}

    void Walk(CompoundBus &top) {
        Enter(top);
        while (!path.empty()) {
            CompoundBus &compound = *path.back().compound;
            if (path.back().next == compound.GetSize()) {
                visitor.Leave(compound);
                open.erase(&compound);
                path.pop_back();
                continue;
            }
            Signal *const member = compound.GetAt(path.back().next++);
            if (auto *const inner = As<CompoundBus>(member))
                EnterOrSkip(top, *inner);
            else if (member)
                visitor.Visit(*member);
        }
    }

private:
    struct Step {
        CompoundBus *compound;
        int next;
    };

    void Enter(CompoundBus &compound) {
        visitor.Enter(compound);
        path.push_back({&compound, 0});
    }
    void EnterOrSkip(CompoundBus &top, CompoundBus &inner) {
        if (entered.empty()) { // the sets are filled late, since few compounds hold another one
            open.insert(&top);
            entered.insert(&top);
        }
        isCircular = isCircular || open.count(&inner) > 0;
        if (isCircular && entered.count(&inner) > 0)
            return;
        Enter(inner);
        open.insert(&inner);
        entered.insert(&inner);
    }

    Visitor &visitor;
    std::vector<Step> path;
    std::unordered_set<CompoundBus const *> open;    ///< the compounds of the path
    std::unordered_set<CompoundBus const *> entered; ///< all that were entered so far
    bool isCircular = false;                         ///< a compound inside of itself was met
};

/// One such walk.
template <class Visitor> void WalkCompound(CompoundBus &top, Visitor &visitor) {
    CompoundWalk<Visitor>(visitor).Walk(top);
}

/// The widths of compounds: the sums over their members. Each compound is added up once, however
/// often it occurs in others. One whose sum is being made, as in a circle, counts as 0.
class CompoundWidths {
public:
    /// The width in bits, at most INT_MAX.
    int Get(CompoundBus const &compound);

private:
    struct Step {
        CompoundBus const *compound;
        int next;
        long long width;
    };

    /// The width, if it is known or needs that of no other compound. False otherwise.
    bool Find(CompoundBus const &compound, long long &width) const;

    std::unordered_map<CompoundBus const *, long long> widths; ///< 0 while a sum is being made
};

} // namespace Vesk_Hdl
