#pragma once

#include <string>
#include <string_view>

#include "vesk_hdl/hdl/Pieces.h"
#include "vesk_hdl/netlist/Netlist.h"
#include "vesk_hdl/text/ForEachAhead.h"
#include "vesk_hdl/text/StringArray.h"
#include "vesk_hdl/text/basis/Ascii.h"

// What the writers of both languages have in common: what is written, in which order, and how lists
// are separated. How each thing is spelled is in the statements of each language.

namespace Vesk_Hdl {

/// Writes each line of an object's comment after a comment mark; empty lines are left out.
inline void PutComment(OutStream &stream, Object const *object, char const *mark) {
    if (!object || !object->HasComment())
        return;
    StringArray const lines(object->GetComment(), "\n", true, nullptr);
    // The line end is text and not the operand: a comment does not fold.
    for (int i = 0; i < lines.GetSize(); ++i)
        Put(stream, mark, lines.At(i), "\n");
}

/// Separates the items of a list. The separator of an item is written when the next one comes, so
/// that the last item has none.
class ListSeparator {
public:
    /// `separator` comes between two items. Both texts must outlive the object.
    ListSeparator(OutStream &out, char const *separator) : stream(out), text(separator) {}
    /// The same, and each item but the first begins a new line with `column` blanks.
    ListSeparator(OutStream &out, char const *separator, std::size_t column)
        : ListSeparator(out, separator) {
        breaksLines = true;
        padding.assign(column, ' ');
    }

    /// Called before each item.
    void Next() {
        if (!isFirst)
            stream << text;
        if (!isFirst && breaksLines)
            Put(stream, EOL, padding.c_str());
        isFirst = false;
    }

private:
    OutStream &stream;
    char const *text;
    std::string padding; ///< one piece
    bool breaksLines = false;
    bool isFirst = true;
};

/// A name as it is taken apart for the text: a bus has a base name and bounds, any other name is
/// whole.
struct NameParts {
    explicit NameParts(Basis::StringBase<char> const &name)
        : base(name), isBus(Bus::IsBusName(name) && Bus::ParseBusName(name, base, left, right)) {}

    Basis::StringBase<char> base;
    int left = 0;
    int right = 0;
    bool isBus;
};

/// Whether a signal of this name leaves a pin open: a name that is empty or "open" in any case,
/// which VHDL reserves for that (IEEE 1076-1993, 4.3.2.2).
inline bool IsOpenName(std::string_view name) {
    return name.empty() || Basis::Ascii::EqualIgnoringCase(name, "open");
}

/// Whether a signal is in the port list. A port that is one bit of a bus is declared with its bus.
inline bool IsDeclaredPort(Signal const &signal) {
    return signal.IsPort() && signal.IsNeededToDeclared();
}

/// The signals that some part of a file is about, each list in the order of the netlist. One walk
/// finds them for all parts: with a million signals a walk takes longer than most parts do.
struct SignalLists {
    explicit SignalLists(Netlist const &netlist) {
        ForEachAhead(netlist.GetSignals(), [this](Signal *signal) {
            if (IsDeclaredPort(*signal))
                ports.Add(signal);
            if (signal->HasAttrs() && signal->GetPortPolarity() == Polarity::INVALID &&
                signal->IsNeededToDeclared())
                innerWithAttrs.Add(signal);
            if (signal->HasConstantValue() || signal->HasAssignments())
                assigned.Add(signal);
        });
    }

    PtrArray<Signal *> ports;          ///< those of the port list
    PtrArray<Signal *> innerWithAttrs; ///< declared signals that are no ports and have attributes
    PtrArray<Signal *> assigned;       ///< those with a constant or assigned from other signals
};

/// Adds an attribute that is a generic to one of two lists: generics for synthesis and simulation,
/// or generics for simulation only.
inline void AddGeneric(Attribute *attribute, PtrArray<Attribute *> &syn,
                       PtrArray<Attribute *> &nosyn) {
    if (attribute->IsGenericSyn())
        syn.Add(attribute);
    else if (attribute->IsGenericNoSyn())
        nosyn.Add(attribute);
}

/// Whether a constant of this signal is one digit.
inline bool IsOneDigit(Signal const &signal) {
    Signal::SignalType const type = signal.GetSignalType();
    return type == Signal::SIGNAL_SCALAR || type == Signal::SIGNAL_BUS_INDEX;
}

/// Writes the assignments of signals: first all constants, then what each signal is assigned from.
/// Verilog statements are left open, and `end` ends each of them.
template <class Statements, class End>
void PutAssignments(Iterator<Signal *> const &signals, Statements &statements, End end) {
    ForEachAhead(signals, [&](Signal const *signal) {
        if (!signal->HasConstantValue())
            return;
        statements.WriteConstantSignalAssignment(signal->GetNameRef(), IsOneDigit(*signal),
                                                 signal->GetConstantValue());
        end();
    });
    ForEachAhead(signals, [&](Signal const *target) {
        ForEach(target->GetSignalIterator(), [&](Signal const *source) {
            statements.WriteSignalAssignment(target->GetNameRef(), source->GetNameRef());
            end();
        });
    });
}

/// The one digit that a scalar takes of a constant: the one at the end of the declared length.
/// Required: any character but "0" counts as 1, also a place that the digits do not have.
inline char const *ScalarDigit(BitVectorValue const &value) {
    Basis::StringBase<char> const digits = value.GetValue();
    // A length of 0 or less is no place of any text.
    auto const place = static_cast<unsigned int>(value.GetLength()) - 1;
    return place < digits.GetLength() && digits.GetText()[place] == '0' ? "0" : "1";
}

} // namespace Vesk_Hdl
