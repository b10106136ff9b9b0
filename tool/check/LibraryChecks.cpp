// Library and use clauses of the VHDL file, and the types that they have to make visible.

#include <unordered_set>

#include "tool/check/Attributes.h"
#include "tool/check/Identifiers.h"
#include "tool/check/SeededHash.h"

using namespace Vesk_Hdl;

namespace Checks {

namespace {

using Names = std::unordered_set<std::string, SeededHash>;

Names const STANDARD_TYPES = {
    "boolean", "bit",        "character",      "severity_level",  "integer",
    "real",    "time",       "delay_length",   "natural",         "positive",
    "string",  "bit_vector", "file_open_kind", "file_open_status"};
Names const STD_LOGIC_1164_TYPES = {
    "std_logic", "std_logic_vector", "std_ulogic", "std_ulogic_vector", "x01", "x01z", "ux01",
    "ux01z"};
Names const NUMERIC_STD_TYPES = {"signed", "unsigned"};

std::string_view Trimmed(std::string_view text) {
    std::size_t const begin = std::min(text.find_first_not_of(' '), text.size());
    return text.substr(begin, text.find_last_not_of(' ') + 1 - begin);
}

/// The trimmed parts in lower case, at least one.
std::vector<std::string> Split(std::string_view text, char separator) {
    std::vector<std::string> parts;
    for (std::size_t begin = 0; begin <= text.size();) {
        std::size_t const end = std::min(text.find(separator, begin), text.size());
        parts.push_back(Lowercase(Trimmed(text.substr(begin, end - begin))));
        begin = end + 1;
    }
    return parts;
}

bool IsName(std::string const &word) {
    return IsVhdlIdentifier(word) && !Engine::IsVhdlKeyword(word.c_str());
}

class LibraryChecker {
public:
    explicit LibraryChecker(Design const &checked)
        : design(checked), vhdl(checked.options.vhdlOption) {}

    void Run(std::vector<AttributeUse> const &typed) {
        CheckLibraries();
        CheckUseClauses();
        if (vhdl.useDefaultLibrary) {
            // These clauses come after the user's.
            visible.insert({"ieee", "korbal"});
            types.insert(STD_LOGIC_1164_TYPES.begin(), STD_LOGIC_1164_TYPES.end());
            types.insert(NUMERIC_STD_TYPES.begin(), NUMERIC_STD_TYPES.end());
        }
        CheckStdLogic();
        for (AttributeUse const &use : typed)
            CheckType(use);
    }

private:
    /// Calls `act` with each text of a list and where it was added.
    template <class Act> void ForEachClause(StringArray const &clauses, Act act) const {
        std::vector<CompactLocation> const spots = design.TextsAt(&clauses, clauses.GetSize());
        for (int i = 0; i < clauses.GetSize(); ++i)
            act(std::string(clauses.At(i).View()), spots[static_cast<std::size_t>(i)]);
    }

    void CheckLibraries() {
        ForEachClause(vhdl.libraries, [this](std::string const &clause, CompactLocation spot) {
            std::vector<std::string> const names = Split(clause, ',');
            if (!std::all_of(names.begin(), names.end(), IsName))
                design.findings.Add({Id::ILLEGAL_LIBRARY, spot, "library " + Quoted(clause)});
            visible.insert(names.begin(), names.end());
        });
    }

    void CheckUseClauses() {
        ForEachClause(vhdl.useLibraries, [this](std::string const &clause, CompactLocation spot) {
            for (std::string const &name : Split(clause, ','))
                CheckUse(Split(name, '.'), "use clause " + Quoted(clause), spot);
        });
    }

    /// LIBRARY.PACKAGE.all or a shorter name that begins with what is visible.
    void CheckUse(std::vector<std::string> const &parts, std::string const &subject,
                  CompactLocation spot) {
        constexpr std::size_t MOST = 3;
        std::string const &last = parts.back();
        bool const isOperator = !last.empty() && (last.front() == '"' || last.front() == '\'');
        if (parts.size() < 2 || parts.size() > MOST ||
            !std::all_of(parts.begin(), parts.end() - 1, IsName) ||
            (!IsName(last) && last != "all" && !isOperator)) {
            design.findings.Add({Id::ILLEGAL_LIBRARY, spot, subject});
            bringsPackages = bringsTypes = true;
            return;
        }
        if (visible.count(parts.front()) == 0 && !bringsPackages)
            design.findings.Add(
                {Id::UNKNOWN_LIBRARY, spot, subject, {}, BOTH, Quoted(parts.front())});
        TakeIn(*(parts.end() - 2), last, parts.size() == MOST);
    }

    /// What the clause makes visible: `last` of a package, or of what may be a library.
    void TakeIn(std::string const &prefix, std::string const &last, bool isPackage) {
        auto const take = [this](Names const &names) { types.insert(names.begin(), names.end()); };
        if (last != "all") {
            types.insert(last);
            if (!isPackage)
                visible.insert(last);
        } else if (prefix == "std_logic_1164") {
            take(STD_LOGIC_1164_TYPES);
        } else if (prefix == "numeric_std") {
            take(NUMERIC_STD_TYPES);
        } else {
            bringsTypes = true;
            bringsPackages |= !isPackage;
        }
    }

    void CheckStdLogic() {
        if (vhdl.useDefaultLibrary)
            return;
        bool hasBits = false;
        bool hasVectors = false;
        design.ForEachSignal([&](Signal const *signal) {
            hasBits |= signal->GetSignalType() == Signal::SIGNAL_SCALAR;
            hasVectors |= signal->GetSignalType() == Signal::SIGNAL_BUS;
        });
        if (!vhdl.suppressComponent)
            design.ForEachUsedComponent([&](Component const *component) {
                ForEach(component->GetPinIterator(), [&](Pin const *pin) {
                    (Bus::IsBusName(pin->GetNameRef()) ? hasVectors : hasBits) = true;
                });
            });
        bool const lacksBits = hasBits && types.count("std_logic") == 0;
        bool const lacksVectors = hasVectors && types.count("std_logic_vector") == 0;
        if (lacksBits || lacksVectors)
            design.findings.Add({Id::NO_STD_LOGIC, design.MadeAt(&design.netlist),
                                 "design " + Quoted(design.netlist.GetNameRef().View())});
    }

    void CheckType(AttributeUse const &use) {
        std::string const type(
            static_cast<AttributeUser const &>(*use.attribute).GetUserType().View());
        std::string const folded = Lowercase(Trimmed(type));
        std::size_t const end = std::min(folded.find_first_of(" ("), folded.size());
        std::vector<std::string> const mark = Split(folded.substr(0, end), '.');
        std::string_view const constraint = Trimmed(std::string_view(folded).substr(end));
        bool const isConstrained =
            use.generic && (constraint.substr(0, 1) == "(" || constraint.substr(0, 6) == "range ");
        if (!std::all_of(mark.begin(), mark.end(), IsName) ||
            (!constraint.empty() && !isConstrained))
            Add(Id::ILLEGAL_TYPE, use, type);
        else if (!bringsTypes && (mark.size() > 1 ? visible.count(mark.front()) == 0
                                                  : STANDARD_TYPES.count(mark.front()) == 0 &&
                                                        types.count(mark.front()) == 0))
            Add(Id::UNKNOWN_TYPE, use, type);
    }

    void Add(Id id, AttributeUse const &use, std::string const &type) {
        AddFinding(design, id, use, BOTH, Quoted(type));
    }

    Design const &design;
    HdlOptions::VhdlOption const &vhdl;
    Names visible = {"std", "work"}; ///< libraries, and packages that are named by themselves
    Names types;                     ///< that use clauses bring, besides those of VHDL itself
    bool bringsTypes = false;        ///< of a package that is not known here
    bool bringsPackages = false;     ///< of a library
};

} // namespace

void CheckLibraries(Design const &design, std::vector<AttributeUse> const &typed) {
    LibraryChecker(design).Run(typed);
}

} // namespace Checks
