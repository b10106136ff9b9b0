#pragma once

#include "vesk_hdl/netlist/NetlistFwd.h"
#include "vesk_hdl/text/PtrArray.h"
#include "vesk_hdl/text/StringArray.h"

namespace Vesk_Hdl {

class OutStream;

/// The vocabulary of the Verilog writer (IEEE 1364-1995): each operation writes one statement or
/// one fragment of one, and depends on its arguments only. Names are written as they are: whether
/// they are legal is not checked. A null attribute or object writes nothing.
///
/// The texts below have NAME, VALUE and the like for what comes from the arguments. An operation
/// whose text ends in "¶" ends the line; the others leave the statement open, without ";", for the
/// netlister to finish. Bounds keep their order: an ascending bus stays ascending.
class VESK_HDL_API VerilogStatements {
public:
    /// Writes to a stream, which is not owned and must outlive this object.
    VerilogStatements(OutStream &stream);
    /// Leaves the stream alone.
    ~VerilogStatements();

    /// `timescale UNIT / PRECISION¶
    void WriteTimeScale(char const *unit, char const *precision);
    /// // Verilog model created from FILE - TIME¶. An empty or null name leaves "created from FILE"
    /// out, which leaves two blanks before the hyphen: required. The time is the present local one.
    void WriteTimeStamp(char const *fileName);
    /// `include "PATH"¶ for each path, in order. Quotes around a path are not doubled.
    void WriteIncludePath(StringArray const &paths);
    /// // LINE¶ for each line of the object's comment; empty lines are left out.
    void WriteComment(Object const *object);

    /// parameter NAME = VALUE
    void WriteParameterStatement(Attribute const *attr);
    /// output [7:0] BASE, or output NAME for a name that is no bus name. " input" and " inout"
    /// begin with a blank, which lines the names up; a polarity that is no direction is "output".
    /// An empty name writes nothing.
    void WritePortDeclaration(Basis::StringBase<char> const &name, Polarity const &polarity);
    /// wire [7:0] BASE, or wire NAME for a name that is no bus name.
    void WriteSignalDeclaration(Basis::StringBase<char> const &name);

    /// BASE[7:0]; a name that is no bus name, also that of a bit, as it is. Null writes nothing.
    void WriteSignalName(char const *name);
    /// Replaces each "(" by "[" and each ")" by "]" in a name, and writes nothing.
    void NormalizeBusName(Basis::StringBase<char> &name) const;
    /// assign BASE = 8'hDIGITS. The size is there only if the value has base and length and the
    /// signal is no scalar. A scalar takes the digit at the end of the declared length; any
    /// character but "0" counts as 1, also a missing one. Required: the target is the base name,
    /// also for one bit of a bus.
    void WriteConstantSignalAssignment(Basis::StringBase<char> const &name, bool isScalar,
                                       BitVectorValue const &value);
    /// assign TARGET = SOURCE
    void WriteSignalAssignment(Basis::StringBase<char> const &target,
                               Basis::StringBase<char> const &source);

    /// defparam INSTANCE.NAME = VALUE (IEEE 1364-1995, 12.2.1).
    void WriteDefParamStatement(Attribute const *attr, char const *instance);
    /// defparam INSTANCE.NAME = NAME, which passes on the parameter of that name of the enclosing
    /// macro.
    void WriteDefParamInitStatement(Attribute const *attr, char const *instance);

    // The synthesis attributes in the syntax of each tool. Those of option "NONE" are left out. A
    // value is written without its enclosing quotes, see HdlUtilities::RemoveQuotes. The position
    // of the iterator does not matter and does not change.

    /// // synthesis attribute NAME of TARGET is "VALUE"¶ for each.
    void WriteQRTAttr(Iterator<Attribute *> const &attrs, char const *target);
    /// // exemplar attribute TARGET NAME VALUE¶ for each.
    void WriteExemplarAttr(Iterator<Attribute *> const &attrs, char const *target);
    /// //pragma attribute TARGET NAME VALUE¶ for each.
    void WritePrecisionAttr(Iterator<Attribute *> const &attrs, char const *target);
    /// /* synthesis "NAME=VALUE, \¶ ...NAME=VALUE" */ for all in one comment, which is inside the
    /// statement that the attributes belong to. Nothing if there are none.
    void WriteSynplicityAttr(Iterator<Attribute *> const &attrs);
    /// /* synopsys attribute NAME "VALUE"¶ ...NAME "VALUE" */¶ for all in one comment. Nothing if
    /// there are none.
    void WriteSynopsysAttr(Iterator<Attribute *> const &attrs);

private:
    void WriteWire(Basis::StringBase<char> const &name);
    void WriteWireBus(Basis::StringBase<char> const &name);
    void WriteQRTAttrStatement(char const *name, char const *target, char const *value);
    void WriteExemplarAttrStatement(char const *name, char const *target, char const *value);
    void WritePrecisionAttrStatement(char const *name, char const *target, char const *value);

    OutStream &stream;
};

} // namespace Vesk_Hdl
