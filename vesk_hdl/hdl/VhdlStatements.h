#pragma once

#include "vesk_hdl/netlist/NetlistFwd.h"
#include "vesk_hdl/text/StringArray.h"
#include "vesk_hdl/text/StringSet.h"

namespace Vesk_Hdl {

class OutStream;

/// The vocabulary of the VHDL writer (IEEE 1076-1993): each operation writes one statement or one
/// fragment and looks at nothing but its arguments.
///
/// The texts are shown with NAME, TYPE and the like for what comes from the arguments. An operation
/// whose text ends in "¶" ends the line; the others leave it open. Names that are bus names,
/// D(7:0), are written with a direction: "to" when the left bound is less than the right one,
/// otherwise "downto". `width` is a number of columns: a shorter name is padded with blanks to it.
class VESK_HDL_API VhdlStatements {
public:
    /// Points at the stream, which must outlive this object.
    VhdlStatements(OutStream &stream);

    /// -- VHDL model created from FILE - TIME¶, without " created from FILE" for an empty or null
    /// name
    void WriteTimeStamp(char const *fileName);
    /// "-- LINE¶" for each line of the object's comment, empty lines left out
    void WriteComment(Object const *object);

    /// library ieee;¶ and the use clauses of std_logic_1164 and numeric_std
    void WriteIEEELibrary();
    /// library KORBAL;¶ use KORBAL.Kelements.ALL;¶, in translate brackets with `translate`
    void WriteKorbalLibrary(bool translate);
    /// library NAME;¶ for each
    void WriteUserLibrary(StringArray const &names);
    /// use NAME;¶ for each
    void WriteUseUserLibrary(StringArray const &names);

    /// NAME : TYPE :=  VALUE, a generic's declaration; null writes nothing
    void WriteGenericMapAttrType(Attribute const *attr);
    /// NAME => VALUE, an item of a generic map; null writes nothing
    void WriteGenericMapAttr(Attribute const *attr);
    /// NAME => NAME, which hands on the enclosing macro's generic; null writes nothing
    void WriteGenericMapInitAttr(Attribute const *attr);

    /// BASE : in    std_logic_vector (7 downto 0), the mode five characters wide
    void WritePortStatement(Basis::StringBase<char> const &name, Polarity const &polarity,
                            int width);
    /// std_logic
    void WriteStdLogic();
    /// std_logic_vector (7 downto 0)
    void WriteStdLogicVector(int left, int right);
    /// (7 downto 0)
    void WriteBusIndex(int left, int right);
    /// D(7 downto 0); a name that is no bus name as it stands
    void WriteBus(Basis::StringBase<char> const &name);

    /// signal NAME : std_logic;¶
    void WriteSignalStatement(Basis::StringBase<char> const &name, int width);
    /// signal BASE : std_logic_vector (7 downto 0);¶
    void WriteSignalVectorStatement(Basis::StringBase<char> const &name, int width);

    /// attribute NAME : TYPE ;¶ with the attribute's type, or "string" without `useAttrType`
    void WriteAttrDeclaration(Attribute const *attr, bool useAttrType, int width);
    /// attribute NAME of TARGET : CLASS is VALUE;¶, the value quoted without `useAttrType`
    void WriteAttrAssignment(Attribute const *attr, char const *target, char const *objectClass,
                             bool useAttrType);
    /// The declaration of each attribute of the holder whose synthesis option is "ASSIGN" and whose
    /// name `declared`, which takes it up, does not hold in any case. Null writes nothing.
    void WriteAttrDeclaration(AttributeHolder const *holder, StringSet &declared, bool useAttrType,
                              int width);
    /// The assignment of each attribute whose synthesis option is not "NONE". Null writes nothing.
    void WriteAttrAssignment(AttributeHolder const *holder, char const *target,
                             char const *objectClass, bool useAttrType);

    /// NAME <= 'BIT';¶ for a scalar, NAME <= x"DIGITS";¶ otherwise, the base letter only when the
    /// value was given with base and length. A scalar takes the digit at the end of the declared
    /// length; whatever is not 0 counts as 1.
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
