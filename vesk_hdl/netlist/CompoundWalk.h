#pragma once

#include <unordered_map>
#include <unordered_set>
#include <vector>

#include "vesk_hdl/netlist/As.h"

namespace Vesk_Hdl {

/// A walk over the members of a compound and of the compounds in it, left to right. Clients can
/// nest compounds as deep as they like, also in a circle: the walk needs no recursion, leaves out a
/// compound that it is in the middle of, and once it met one enters no compound a second time. So
/// it ends in any case, and without a circle it visits every member as often as it occurs.
///
/// `Visitor` has Enter(CompoundBus &), Leave(CompoundBus &), and Visit(Signal &) for what is no
/// compound. Null members are skipped.
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
        if (entered.empty()) { // few compounds hold another one
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
    std::unordered_set<CompoundBus const *> open;    ///< those of the path
    std::unordered_set<CompoundBus const *> entered; ///< at any time
    bool isCircular = false;
};

template <class Visitor> void WalkCompound(CompoundBus &top, Visitor &visitor) {
    CompoundWalk<Visitor>(visitor).Walk(top);
}

/// The widths of compounds: the sums over their members. Each compound is added up once, however
/// often it occurs; one that is in the middle of that adds nothing.
class CompoundWidths {
public:
    /// In bits, at most INT_MAX.
    int Get(CompoundBus const &compound);

private:
    struct Step {
        CompoundBus const *compound;
        int next;
        long long width;
    };

    /// The width if it is known or takes no other compound's.
    bool Find(CompoundBus const &compound, long long &width) const;

    std::unordered_map<CompoundBus const *, long long> widths; ///< 0 for those in the middle
};

} // namespace Vesk_Hdl
