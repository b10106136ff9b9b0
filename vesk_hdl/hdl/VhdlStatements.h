#pragma once

#include "vesk_hdl/netlist/NetlistFwd.h"
#include "vesk_hdl/text/StringArray.h"
#include "vesk_hdl/text/StringSet.h"

namespace Vesk_Hdl {

class OutStream;

/// The vocabulary of the VHDL writer (IEEE 1076-1993): each operation writes one statement or one
/// fragment of one, and depends on its arguments only. Names are written as they are: whether they
/// are legal is not checked. A null attribute, holder or object writes nothing.
///
/// The texts below have NAME, TYPE and the like for what comes from the arguments. An operation
/// whose text ends in "¶" ends the line; the others leave it open for the caller. Bus names, such
/// as D(7:0), are written with a direction: "to" if the left bound is less than the right one,
/// otherwise "downto". `width` is a number of columns: a shorter name is padded with blanks to it,
/// and one that is as long or longer is not. 0 asks for no padding.
class VESK_HDL_API VhdlStatements {
public:
    /// Writes to a stream, which is not owned and must outlive this object.
    VhdlStatements(OutStream &stream);

    /// -- VHDL model created from FILE - TIME¶. An empty or null name leaves " created from FILE"
    /// out. The time is the present local one.
    void WriteTimeStamp(char const *fileName);
    /// -- LINE¶ for each line of the object's comment; empty lines are left out.
    void WriteComment(Object const *object);

    /// library ieee;¶ and the use clauses of std_logic_1164 and numeric_std.
    void WriteIEEELibrary();
    /// library KORBAL;¶ use KORBAL.Kelements.ALL;¶. With `translate` between marks that synthesis
    /// tools skip.
    void WriteKorbalLibrary(bool translate);
    /// library NAME;¶ for each name, in order.
    void WriteUserLibrary(StringArray const &names);
    /// use NAME;¶ for each name, in order.
    void WriteUseUserLibrary(StringArray const &names);

    /// NAME : TYPE :=  VALUE, the declaration of a generic. The second blank before the value is
    /// required.
    void WriteGenericMapAttrType(Attribute const *attr);
    /// NAME => VALUE, an item of a generic map.
    void WriteGenericMapAttr(Attribute const *attr);
    /// NAME => NAME, an item that passes on the generic of that name of the enclosing macro.
    void WriteGenericMapInitAttr(Attribute const *attr);

    /// BASE : in    std_logic_vector (7 downto 0), or std_logic for a name that is no bus name. The
    /// mode is five characters wide; a polarity that is no direction is "out".
    void WritePortStatement(Basis::StringBase<char> const &name, Polarity const &polarity,
                            int width);
    /// std_logic
    void WriteStdLogic();
    /// std_logic_vector (7 downto 0)
    void WriteStdLogicVector(int left, int right);
    /// (7 downto 0)
    void WriteBusIndex(int left, int right);
    /// D(7 downto 0); a name that is no bus name as it is.
    void WriteBus(Basis::StringBase<char> const &name);

    /// signal NAME : std_logic;¶
    void WriteSignalStatement(Basis::StringBase<char> const &name, int width);
    /// signal BASE : std_logic_vector (7 downto 0);¶ A name that is no bus name has the bounds 0
    /// and 0.
    void WriteSignalVectorStatement(Basis::StringBase<char> const &name, int width);

    /// attribute NAME : TYPE ;¶ With `useAttrType` the type is that of the attribute, otherwise
    /// "string".
    void WriteAttrDeclaration(Attribute const *attr, bool useAttrType, int width);
    /// attribute NAME of TARGET : CLASS is VALUE;¶ With `useAttrType` the value is a literal of the
    /// attribute's type, otherwise a string. CLASS is "signal", "component" or "label" (IEEE
    /// 1076-1993, 5.1).
    void WriteAttrAssignment(Attribute const *attr, char const *target, char const *objectClass,
                             bool useAttrType);
    /// The declaration of each attribute of the holder whose synthesis option is "ASSIGN" and whose
    /// name is not in `declared`, case ignored. The name is added to `declared`.
    void WriteAttrDeclaration(AttributeHolder const *holder, StringSet &declared, bool useAttrType,
                              int width);
    /// The assignment of each attribute of the holder whose synthesis option is not "NONE".
    void WriteAttrAssignment(AttributeHolder const *holder, char const *target,
                             char const *objectClass, bool useAttrType);

    /// NAME <= 'BIT';¶ for a scalar, otherwise NAME <= x"DIGITS";¶ The base letter is there only if
    /// the value has base and length. A scalar takes the digit at the end of the declared length;
    /// any character but "0" counts as 1, also a missing one.
    void WriteConstantSignalAssignment(Basis::StringBase<char> const &name, bool isScalar,
                                       BitVectorValue const &value);
    /// TARGET <= SOURCE;¶
    void WriteSignalAssignment(Basis::StringBase<char> const &target,
                               Basis::StringBase<char> const &source);

private:
    void WritePadded(Basis::StringBase<char> const &name, int width);
    void WriteSide(Basis::StringBase<char> const &name);

    OutStream &stream;
};

} // namespace Vesk_Hdl
