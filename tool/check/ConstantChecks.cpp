// Constants of nets and pins, as they are going to be written.

#include "tool/check/Design.h"
#include "tool/check/Digits.h"
#include "tool/check/WrittenText.h"

using namespace Vesk_Hdl;

namespace Checks {

namespace {

/// The constant of a net, against the net's width.
class ConstantChecker {
public:
    ConstantChecker(Design const &checked, Signal const &checkedNet)
        : design(checked), net(checkedNet), value(checkedNet.GetConstantValue()), digits(value) {}

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

    /// One digit is written, in quotes, whatever the constant holds.
    void CheckBit() {
        std::string const statement = WrittenText::Plain([this](OutStream &stream) {
            VhdlStatements(stream).WriteConstantSignalAssignment(net.GetNameRef(), true, value);
        });
        std::string const written(1, statement[statement.rfind('\'') - 1]);
        if (value.GetLength() != 1 || digits.GetText().size() != 1)
            Add(Id::CONSTANT_WIDTH, BOTH, "written as " + written);
        else if (digits.GetText() != written)
            Add(Id::CONSTANT_DIGIT, BOTH, "written as " + written);
    }

    void CheckBased() {
        if (Languages const bad = digits.RefusedIn(""))
            Add(Id::CONSTANT_DIGIT, bad, digits.GetText());
        auto const width = static_cast<std::size_t>(std::max(net.GetWidth(), 0));
        bool const fitsVerilog =
            value.GetLength() > 0 && static_cast<std::size_t>(value.GetLength()) == width;
        Languages const wrong = (digits.GetWidth() == width ? NO_LANGUAGE : VHDL) |
                                (fitsVerilog ? NO_LANGUAGE : VERILOG);
        if (wrong != NO_LANGUAGE)
            Add(Id::CONSTANT_WIDTH, wrong,
                "digits: " + std::to_string(digits.GetWidth()) + ", stated: " +
                    std::to_string(value.GetLength()) + ", width: " + std::to_string(width));
    }

    void CheckBare() {
        if (Languages const bad = digits.RefusedIn("UXZWLH"))
            Add(Id::CONSTANT_DIGIT, bad, digits.GetText());
        std::size_t const count = digits.GetText().size();
        if (static_cast<int>(count) != net.GetWidth())
            Add(Id::CONSTANT_WIDTH, VHDL,
                "digits: " + std::to_string(count) + ", width: " + std::to_string(net.GetWidth()));
        if (count > 1)
            Add(Id::CONSTANT_WITHOUT_BASE, BOTH, digits.GetText());
    }

    Design const &design;
    Signal const &net;
    BitVectorValue const value;
    Digits const digits;
};

/// Two pins whose INSTANCE_PIN is the same name are tied to one signal.
void CheckSharedConstant(Design const &design, Signal const &signal) {
    Pin const *former = nullptr;
    for (Use const &use : design.FurtherUses(&signal)) {
        if (!use.pin || use.pin->GetSignal() != &signal)
            continue;
        Instance const *const instance = former ? design.OwnerOf(use.pin) : nullptr;
        if (instance)
            design.findings.Add({Id::SHARED_CONSTANT,
                                 design.ConnectedAt(*instance, *use.pin),
                                 PinName(*instance, *use.pin),
                                 {{former, "the other pin is here", LocationMap::CONNECTED}},
                                 BOTH,
                                 Quoted(signal.GetNameRef().View())});
        else
            former = use.pin;
    }
}

} // namespace

void CheckConstants(Design const &design) {
    design.ForEachSignal([&](Signal const *signal) {
        if (!signal->HasConstantValue())
            return;
        ConstantChecker(design, *signal).Run();
        CheckSharedConstant(design, *signal);
    });
}

} // namespace Checks
