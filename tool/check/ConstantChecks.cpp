// Constants of nets and pins, as they are going to be written.

#include <unordered_map>

#include "tool/check/Design.h"

using namespace Vesk_Hdl;

namespace Checks {

namespace {

/// The constant of a net, against the net's width.
class ConstantChecker {
public:
    ConstantChecker(Design const &checked, Signal const &checkedNet)
        : design(checked), net(checkedNet), value(checkedNet.GetConstantValue()),
          text(value.GetValue()), digits(text.View()) {}

    void Run() {
        Signal::SignalType const type = net.GetSignalType();
        if (type == Signal::SIGNAL_COMPOUND_BUS)
            return Add(Id::COMPOUND_ASSIGNMENT, BOTH);
        if (net.GetPortPolarity() == Polarity::INPUT)
            Add(Id::ASSIGNED_IN_PORT, BOTH);
        if (type == Signal::SIGNAL_BUS_SLICE || type == Signal::SIGNAL_BUS_INDEX)
            Add(Id::CONSTANT_ON_PART, VERILOG);
        if (type == Signal::SIGNAL_SCALAR || type == Signal::SIGNAL_BUS_INDEX)
            CheckBit();
        else if (value.HasBaseAndLength())
            CheckBased();
        else
            CheckBare();
    }

private:
    void Add(Id id, Languages languages, std::string detail = {}) {
        design.findings.Add(
            {id,
             design.ConstantAt(net),
             (id == Id::COMPOUND_ASSIGNMENT ? "compound " + Quoted(net.GetNameRef().View())
                                            : NetName(net)),
             {},
             languages,
             std::move(detail)});
    }

    /// Of a bit the last digit is written, as 0 if it is 0 and otherwise as 1.
    void CheckBit() {
        std::size_t const at =
            value.GetLength() > 0 ? static_cast<std::size_t>(value.GetLength()) - 1 : digits.size();
        char const digit = at < digits.size() ? digits[at] : '1';
        if (value.GetLength() != 1 || digits.size() != 1)
            Add(Id::CONSTANT_WIDTH, BOTH, std::string("written as ") + (digit == '0' ? '0' : '1'));
        else if (digit != '0' && digit != '1')
            Add(Id::CONSTANT_DIGIT, BOTH, "written as 1");
    }

    void CheckBased() {
        int const base = value.GetBase();
        std::string_view const known = base == 2   ? "01"
                                       : base == 8 ? "01234567"
                                                   : "0123456789abcdefABCDEF";
        std::size_t const bitsOfDigit = base == 2 ? 1 : base == 8 ? 3 : 4;
        Languages const bad = (AreAll(known, "_") ? NO_LANGUAGE : VHDL) |
                              (AreAll(known, "_xXzZ?") ? NO_LANGUAGE : VERILOG);
        if (bad != NO_LANGUAGE)
            Add(Id::CONSTANT_DIGIT, bad, std::string(digits));
        auto const count = static_cast<std::size_t>(digits.size()) -
                           static_cast<std::size_t>(std::count(digits.begin(), digits.end(), '_'));
        auto const width = static_cast<std::size_t>(std::max(net.GetWidth(), 0));
        bool const fitsVerilog =
            value.GetLength() > 0 && static_cast<std::size_t>(value.GetLength()) == width;
        Languages const wrong = (count * bitsOfDigit == width ? NO_LANGUAGE : VHDL) |
                                (fitsVerilog ? NO_LANGUAGE : VERILOG);
        if (wrong != NO_LANGUAGE)
            Add(Id::CONSTANT_WIDTH, wrong,
                "digits: " + std::to_string(count * bitsOfDigit) + ", told: " +
                    std::to_string(value.GetLength()) + ", width: " + std::to_string(width));
    }

    void CheckBare() {
        Languages const bad = (AreAll("01", "UXZWLH") ? NO_LANGUAGE : VHDL) |
                              (AreAll("0123456789", "_") ? NO_LANGUAGE : VERILOG);
        if (bad != NO_LANGUAGE)
            Add(Id::CONSTANT_DIGIT, bad, std::string(digits));
        if (static_cast<int>(digits.size()) != net.GetWidth())
            Add(Id::CONSTANT_WIDTH, VHDL,
                "digits: " + std::to_string(digits.size()) +
                    ", width: " + std::to_string(net.GetWidth()));
        if (digits.size() > 1)
            Add(Id::CONSTANT_WITHOUT_BASE, BOTH, std::string(digits));
    }

    bool AreAll(std::string_view known, std::string_view further) const {
        return !digits.empty() && digits.front() != '_' &&
               std::all_of(digits.begin(), digits.end(), [&](char c) {
                   return known.find(c) != std::string_view::npos ||
                          further.find(c) != std::string_view::npos;
               });
    }

    Design const &design;
    Signal const &net;
    BitVectorValue const value;
    Text const text;
    std::string_view digits;
};

/// Two pins whose INSTANCE_PIN is the same name.
void CheckSharedConstants(Design const &design) {
    std::unordered_map<Signal const *, Pin const *> pinOfTie;
    design.ForEachPin([&](Instance const &instance, Pin const &pin) {
        Signal const *const signal = pin.GetSignal();
        if (!signal || !signal->HasConstantValue())
            return;
        std::string tie = std::string(instance.GetNameRef().View()) + "_";
        tie += BaseOf(pin);
        tie += "_CONST_SIGNAL";
        if (!SameIgnoringCase(BaseOf(*signal), tie))
            return;
        auto const [former, isNew] = pinOfTie.try_emplace(signal, &pin);
        if (!isNew)
            design.findings.Add({Id::SHARED_CONSTANT,
                                 design.ConnectedAt(instance, pin),
                                 PinName(instance, pin),
                                 {{former->second, "the other pin is here", Places::CONNECTED}},
                                 BOTH,
                                 Quoted(signal->GetNameRef().View())});
    });
}

} // namespace

void CheckConstants(Design const &design) {
    design.ForEachSignal([&](Signal const *signal) {
        if (signal->HasConstantValue())
            ConstantChecker(design, *signal).Run();
    });
    CheckSharedConstants(design);
}

} // namespace Checks
