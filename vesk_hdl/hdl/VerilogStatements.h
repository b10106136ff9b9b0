#pragma once

#include "vesk_hdl/netlist/NetlistFwd.h"
#include "vesk_hdl/text/PtrArray.h"
#include "vesk_hdl/text/StringArray.h"

namespace Vesk_Hdl {

class OutStream;

/// The vocabulary of the Verilog writer (IEEE 1364-1995): each operation writes one statement or
/// one fragment and looks at nothing but its arguments.
///
/// The texts are shown with NAME, VALUE and the like for what comes from the arguments. An
/// operation whose text ends in "¶" ends the line; the others leave the statement open, without
/// ";", for the netlister to finish. Bounds keep their order: an ascending bus stays ascending.
class VESK_HDL_API VerilogStatements {
public:
    /// Points at the stream, which must outlive this object.
    VerilogStatements(OutStream &stream);
    ~VerilogStatements();

    /// `timescale UNIT / PRECISION¶
    void WriteTimeScale(char const *unit, char const *precision);
    /// // Verilog model created from FILE - TIME¶; two blanks stand before the hyphen without a
    /// file
    void WriteTimeStamp(char const *fileName);
    /// `include "PATH"¶ for each, one pair of quotes whatever the path brings along
    void WriteIncludePath(StringArray const &paths);
    /// "// LINE¶" for each line of the object's comment, empty lines left out
    void WriteComment(Object const *object);

    /// parameter NAME = VALUE; null writes nothing
    void WriteParameterStatement(Attribute const *attr);
    /// output [7:0] BASE, " input" and " inout" with a blank in front; nothing for an empty name
    void WritePortDeclaration(Basis::StringBase<char> const &name, Polarity const &polarity);
    /// wire NAME, wire [7:0] BASE
    void WriteSignalDeclaration(Basis::StringBase<char> const &name);

    /// BASE[7:0]; a name that is no bus name, also one of a bit, as it stands
    void WriteSignalName(char const *name);
    /// Replaces "(" by "[" and ")" by "]".
    void NormalizeBusName(Basis::StringBase<char> &name) const;
    /// assign BASE = 8'hDIGITS, the size only when the value was given with base and length and the
    /// signal is no scalar. A scalar takes the digit at the end of the declared length; whatever is
    /// not 0 counts as 1. The target is the base name, also for one bit of a bus: meant so.
    void WriteConstantSignalAssignment(Basis::StringBase<char> const &name, bool isScalar,
                                       BitVectorValue const &value);
    /// assign TARGET = SOURCE
    void WriteSignalAssignment(Basis::StringBase<char> const &target,
                               Basis::StringBase<char> const &source);

    /// defparam INSTANCE.NAME = VALUE; null writes nothing
    void WriteDefParamStatement(Attribute const *attr, char const *instance);
    /// defparam INSTANCE.NAME = NAME, which hands on the macro's parameter; null writes nothing
    void WriteDefParamInitStatement(Attribute const *attr, char const *instance);

    // The synthesis attributes in the syntax of each tool, those of option "NONE" left out. The
    // iterator of the caller stays where it is.

    /// // synthesis attribute NAME of TARGET is "VALUE"¶
    void WriteQRTAttr(Iterator<Attribute *> const &attrs, char const *target);
    /// // exemplar attribute TARGET NAME VALUE¶
    void WriteExemplarAttr(Iterator<Attribute *> const &attrs, char const *target);
    /// //pragma attribute TARGET NAME VALUE¶
    void WritePrecisionAttr(Iterator<Attribute *> const &attrs, char const *target);
    /// /* synthesis "NAME=VALUE, \¶ ...NAME=VALUE" */, inside the statement
    void WriteSynplicityAttr(Iterator<Attribute *> const &attrs);
    /// /* synopsys attribute NAME "VALUE"¶ ...NAME "VALUE" */¶
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
