#pragma once

#include "vesk_hdl/hdl/Pieces.h"
#include "vesk_hdl/netlist/Netlist.h"
#include "vesk_hdl/text/ForEachAhead.h"
#include "vesk_hdl/text/StringArray.h"

// What the writers of both languages decide alike.

namespace Vesk_Hdl {

/// Writes each line of an object's comment behind a comment mark; empty lines are left out.
inline void PutComment(OutStream &stream, Object const *object, char const *mark) {
    if (!object || !object->HasComment())
        return;
    StringArray const lines(object->GetComment(), "\n", true, nullptr);
    for (int i = 0; i < lines.GetSize(); ++i)
        Put(stream, mark, lines.At(i), "\n");
}

/// A port that stands in the port list.
inline bool IsDeclaredPort(Signal const &signal) {
    return signal.IsPort() && signal.IsNeededToDeclared();
}

/// The signals that some part of the file is about, in their order. One walk finds them for several
/// parts: with a million signals it takes longer than most of the parts.
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

    PtrArray<Signal *> ports;          ///< of the port list
    PtrArray<Signal *> innerWithAttrs; ///< declared inside
    PtrArray<Signal *> assigned;       ///< with a constant value or from other signals
};

/// Whether a constant of this signal is one digit.
inline bool IsOneDigit(Signal const &signal) {
    Signal::SignalType const type = signal.GetSignalType();
    return type == Signal::SIGNAL_SCALAR || type == Signal::SIGNAL_BUS_INDEX;
}

/// What a scalar takes of a constant: the digit at the end of the declared length. Whatever is not
/// 0 counts as 1, also a place behind the digits or before them.
inline char const *ScalarDigit(BitVectorValue const &value) {
    Basis::StringBase<char> const digits = value.GetValue();
    auto const place = static_cast<unsigned int>(value.GetLength()) - 1;
    return place < digits.GetLength() && digits.GetText()[place] == '0' ? "0" : "1";
}

} // namespace Vesk_Hdl
