#pragma once

#include <string>
#include <utility>
#include <vector>

#include "vesk_hdl/Vesk_Hdl.h"

using Lines = std::vector<std::string>;

/// Runs lines on a model up to the first that is refused. Its message, or "" if none was.
std::string Refusal(Vesk_Hdl::Model &model, Lines const &lines);

/// The message of the exception that a call raises, or "" if it raises none.
template <class Call> std::string MessageOf(Call call) {
    try {
        call();
    } catch (Vesk_Hdl::Exception const &refusal) {
        return refusal.getDescription();
    }
    return "";
}

/// A fresh model that knows the library's commands, after lines that it must accept.
struct Design {
    explicit Design(Lines const &lines = {});

    Vesk_Hdl::CommandFactory factory;
    Vesk_Hdl::Model model;
    Vesk_Hdl::Netlist &netlist;
};

/// The pieces of a text between semicolons, without blanks in front.
Lines Pieces(std::string const &text);

/// Each piece taken apart at its first "=".
std::vector<std::pair<std::string, std::string>> Pairs(std::string const &text);

/// Lines from a short form of them: "port q out; sig n; q u1.A; u1.B = 1" declares a port and a
/// signal, connects and assigns. Lines that begin with ADD or SET are taken unchanged.
Lines Short(std::string const &text);

/// A component CELL with pins of all forms and directions, and its instances u1, u2 and u3.
Lines const &Cells();
/// Cells, then more lines in the short form.
Lines CellsAnd(std::string const &text);

/// Names of objects, with a blank between them.
template <class T> std::string NamesOf(Vesk_Hdl::Iterator<T> objects) {
    std::string names;
    Vesk_Hdl::ForEach(objects, [&names](T object) {
        names += (names.empty() ? "" : " ") + std::string(object->GetName());
    });
    return names;
}
template <class T> std::string NamesOf(Vesk_Hdl::PtrArray<T> const &objects) {
    return NamesOf(Vesk_Hdl::Iterator<T>(&objects));
}

/// All signals with their pins, members and assignments, a line for each signal in the netlist's
/// order:
///
///     out q {member member}: u1.Y (u2.A) <- assigned assigned
///
/// A pin in brackets points at a signal that does not list it; one with "!" is listed by a signal
/// that it does not point at. A name in square brackets is that of a signal outside the netlist's
/// array that something leads to; such signals come last.
std::string Wiring(Vesk_Hdl::Netlist const &netlist);
