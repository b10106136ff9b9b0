// The statements of the VHDL writer. Each piece of a Put is one piece of the required text, see
// Pieces.h.

#include "vesk_hdl/hdl/VhdlStatements.h"

#include <string>

#include "vesk_hdl/hdl/HdlUtilities.h"
#include "vesk_hdl/hdl/Shared.h"
#include "vesk_hdl/hdl/Translate.h"
#include "vesk_hdl/netlist/Signal.h"

using namespace Vesk_Hdl;
using Text = Basis::StringBase<char>;

namespace {

/// Writes the VHDL type of an attribute.
class WriteVhdlAttrTypeVisitor : public AttributeVisitor {
public:
    explicit WriteVhdlAttrTypeVisitor(OutStream &out) : stream(out) {}

    void VisitAttributeString(AttributeString *) override { stream << "string"; }
    void VisitAttributeInteger(AttributeInteger *) override { stream << "integer"; }
    void VisitAttributeFloat(AttributeFloat *) override { stream << "real"; }
    void VisitAttributeBit(AttributeBit *) override { stream << "bit"; }
    void VisitAttributeBitVector(AttributeBitVector *) override { stream << "bit_vector"; }
    void VisitAttributeBoolean(AttributeBoolean *) override { stream << "boolean"; }
    void VisitAttributeUser(AttributeUser *attr) override { stream << attr->GetUserType(); }

private:
    OutStream &stream;
};

/// Writes the value of an attribute as a VHDL literal of that type. The text of a user's type is an
/// expression and not quoted; an empty one would be no expression, so that it is an empty string.
class WriteVhdlAttrValueVisitor : public AttributeVisitor {
public:
    explicit WriteVhdlAttrValueVisitor(OutStream &out) : stream(out) {}

    void VisitAttributeString(AttributeString *attr) override {
        Put(stream, "\"", HdlUtilities::RemoveQuotes(attr->GetValueString()), "\"");
    }
    void VisitAttributeInteger(AttributeInteger *attr) override {
        stream << attr->GetValueString();
    }
    void VisitAttributeFloat(AttributeFloat *attr) override { stream << attr->GetValueString(); }
    void VisitAttributeBit(AttributeBit *attr) override {
        Put(stream, "'", attr->GetValueString(), "'");
    }
    void VisitAttributeBitVector(AttributeBitVector *attr) override {
        BitVectorValue const value = attr->GetBitVectorValue();
        if (value.HasBaseAndLength())
            stream << HdlUtilities::ConvertVhdlBase(value.GetBase());
        Put(stream, "\"", value.GetValue(), "\"");
    }
    void VisitAttributeBoolean(AttributeBoolean *attr) override {
        stream << attr->GetValueString();
    }
    void VisitAttributeUser(AttributeUser *attr) override {
        Text const value = attr->GetValueString();
        stream << (value.IsEmpty() ? Text("\"\"") : value);
    }

private:
    OutStream &stream;
};

/// Visits an attribute with a visitor that does not change it.
void Accept(Attribute const *attr, AttributeVisitor &&visitor) {
    const_cast<Attribute *>(attr)->AcceptAttribute(visitor);
}

} // namespace

namespace Vesk_Hdl {

VhdlStatements::VhdlStatements(OutStream &out) : stream(out) {}

/// For clients: the files of the writers have the time in their header.
void VhdlStatements::WriteTimeStamp(char const *fileName) {
    stream << "-- VHDL model";
    if (fileName && *fileName)
        Put(stream, " created from ", fileName);
    Put(stream, " - ", HdlUtilities::CurrentTimeString(), EOL);
}

void VhdlStatements::WriteComment(Object const *object) { PutComment(stream, object, "-- "); }

void VhdlStatements::WriteIEEELibrary() {
    Put(stream, "library", " ieee;", EOL);
    Put(stream, "use", " ieee.std_logic_1164.ALL;", EOL);
    Put(stream, "use", " ieee.numeric_std.ALL;", EOL);
}

/// Neither writer asks for the marks; they are for clients whose synthesis tool lacks the library.
void VhdlStatements::WriteKorbalLibrary(bool translate) {
    if (translate)
        Put(stream, Translate::VHDL_OFF, EOL);
    Put(stream, "library", " KORBAL;", EOL);
    Put(stream, "use", " KORBAL.Kelements.ALL;", EOL);
    if (translate)
        Put(stream, Translate::VHDL_ON, EOL);
}

void VhdlStatements::WriteUserLibrary(StringArray const &names) {
    for (int i = 0; i < names.GetSize(); ++i)
        Put(stream, "library", " ", names.At(i), ";", EOL);
}

void VhdlStatements::WriteUseUserLibrary(StringArray const &names) {
    for (int i = 0; i < names.GetSize(); ++i)
        Put(stream, "use", " ", names.At(i), ";", EOL);
}

/// Required: two blanks after the sign.
void VhdlStatements::WriteGenericMapAttrType(Attribute const *attr) {
    if (!attr)
        return;
    Put(stream, attr->GetNameRef(), " : ");
    Accept(attr, WriteVhdlAttrTypeVisitor(stream));
    stream << " :=  ";
    Accept(attr, WriteVhdlAttrValueVisitor(stream));
}

void VhdlStatements::WriteGenericMapAttr(Attribute const *attr) {
    if (!attr)
        return;
    Put(stream, attr->GetNameRef(), " => ");
    Accept(attr, WriteVhdlAttrValueVisitor(stream));
}

void VhdlStatements::WriteGenericMapInitAttr(Attribute const *attr) {
    if (attr)
        Put(stream, attr->GetNameRef(), " => ", attr->GetNameRef());
}

void VhdlStatements::WritePortStatement(Text const &name, Polarity const &polarity, int width) {
    NameParts const parts(name);
    WritePadded(parts.base, width);
    Put(stream, ":", " ");
    switch (polarity.GetValue()) {
    case Polarity::INPUT:
        stream << "in   ";
        break;
    case Polarity::BIDIRECTIONAL:
        stream << "inout";
        break;
    default: // required: also of a polarity that is no direction
        stream << "out  ";
    }
    stream << " ";
    if (parts.isBus)
        WriteStdLogicVector(parts.left, parts.right);
    else
        WriteStdLogic();
}

void VhdlStatements::WriteStdLogic() { stream << "std_logic"; }

void VhdlStatements::WriteStdLogicVector(int left, int right) {
    Put(stream, "std_logic_vector", " ");
    WriteBusIndex(left, right);
}

/// Equal bounds are written as "downto".
void VhdlStatements::WriteBusIndex(int left, int right) {
    Put(stream, "(", left, " ", (left < right ? "to" : "downto"), " ", right, ")");
}

void VhdlStatements::WriteBus(Text const &name) {
    Text base;
    int left = 0;
    int right = 0;
    if (Bus::ParseBusName(name, base, left, right)) {
        stream << base;
        WriteBusIndex(left, right);
    } else {
        stream << name;
    }
}

void VhdlStatements::WriteSignalStatement(Text const &name, int width) {
    Put(stream, "signal", " ");
    WritePadded(name, width);
    Put(stream, ":", " ", "std_logic", ";", EOL);
}

/// Required: the result of the parse is not tested. A bus without a range, such as the dummy of a
/// base that ends in the mark, is declared with the bounds 0 and 0.
void VhdlStatements::WriteSignalVectorStatement(Text const &name, int width) {
    Text base = name;
    int left = 0;
    int right = 0;
    Bus::ParseBusName(name, base, left, right);
    Put(stream, "signal", " ");
    WritePadded(base, width);
    Put(stream, ":", " ");
    WriteStdLogicVector(left, right);
    Put(stream, ";", EOL);
}

/// Required: this is the only statement with a blank before its semicolon.
void VhdlStatements::WriteAttrDeclaration(Attribute const *attr, bool useAttrType, int width) {
    if (!attr)
        return;
    Put(stream, "attribute", " ");
    WritePadded(attr->GetNameRef(), width);
    stream << ": ";
    if (useAttrType)
        Accept(attr, WriteVhdlAttrTypeVisitor(stream));
    else
        stream << "string";
    Put(stream, " ;", EOL);
}

void VhdlStatements::WriteAttrAssignment(Attribute const *attr, char const *target,
                                         char const *objectClass, bool useAttrType) {
    if (!attr)
        return;
    Put(stream, "attribute", " ", attr->GetNameRef(), " ", "of", " ", target, " : ", objectClass,
        " ", "is", " ");
    if (useAttrType)
        Accept(attr, WriteVhdlAttrValueVisitor(stream));
    else
        Put(stream, "\"", HdlUtilities::RemoveQuotes(attr->GetValueString()), "\"");
    Put(stream, ";", EOL);
}

/// A second declaration of a name would be illegal. Names are compared as VHDL does, without case.
void VhdlStatements::WriteAttrDeclaration(AttributeHolder const *holder, StringSet &declared,
                                          bool useAttrType, int width) {
    // Asking an empty holder for an iterator would make a list in it: see AttributeHolder.
    if (!holder || !holder->HasAttrs())
        return;
    ForEach(holder->GetAttrIterator(), [&](Attribute const *attr) {
        if (!attr->IsSynDeclared() || declared.IContains(attr->GetNameRef().View()))
            return;
        WriteAttrDeclaration(attr, useAttrType, width);
        declared.Add(attr->GetNameRef());
    });
}

void VhdlStatements::WriteAttrAssignment(AttributeHolder const *holder, char const *target,
                                         char const *objectClass, bool useAttrType) {
    if (!holder || !holder->HasAttrs())
        return;
    ForEach(holder->GetAttrIterator(), [&](Attribute const *attr) {
        if (attr->IsSynAssigned())
            WriteAttrAssignment(attr, target, objectClass, useAttrType);
    });
}

/// Without base and length the digits are taken as bits, one for each character.
void VhdlStatements::WriteConstantSignalAssignment(Text const &name, bool isScalar,
                                                   BitVectorValue const &value) {
    char const *const quote = isScalar ? "'" : "\"";
    WriteSide(name);
    stream << " <= ";
    if (value.HasBaseAndLength() && !isScalar)
        stream << HdlUtilities::ConvertVhdlBase(value.GetBase());
    Put(stream, quote, (isScalar ? Text(ScalarDigit(value)) : value.GetValue()), quote, ";", EOL);
}

void VhdlStatements::WriteSignalAssignment(Text const &target, Text const &source) {
    WriteSide(target);
    stream << " <= ";
    WriteSide(source);
    Put(stream, ";", EOL);
}

/// Writes the name, a blank and the padding. Each is a piece of its own: required.
void VhdlStatements::WritePadded(Text const &name, int width) {
    Put(stream, name, " ");
    int const length = static_cast<int>(name.GetLength());
    if (length < width)
        stream << std::string(static_cast<std::size_t>(width - length), ' ').c_str();
}

/// Writes one side of an assignment. Required: IsBusName decides, and WriteBus reads the name
/// again, token by token.
void VhdlStatements::WriteSide(Text const &name) {
    if (Bus::IsBusName(name))
        WriteBus(name);
    else
        stream << name;
}

} // namespace Vesk_Hdl
