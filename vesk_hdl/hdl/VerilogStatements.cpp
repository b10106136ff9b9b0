// The statements of the Verilog writer. Each piece of a Put is one piece of the required text, see
// Pieces.h.

#include "vesk_hdl/hdl/VerilogStatements.h"

#include "vesk_hdl/hdl/HdlUtilities.h"
#include "vesk_hdl/hdl/Shared.h"
#include "vesk_hdl/netlist/Signal.h"

using namespace Vesk_Hdl;
using Text = Basis::StringBase<char>;

namespace {

/// Blanks up to the column of the first name in a Synopsys comment. Required: the Synplicity
/// comment has the same, although its beginning is shorter.
constexpr char const *ATTR_COLUMN = "                      ";

/// The size and base of a number, if the value was given with them.
void WriteSize(OutStream &stream, BitVectorValue const &value) {
    if (value.HasBaseAndLength())
        Put(stream, value.GetLength(), "'", HdlUtilities::ConvertVerilogBase(value.GetBase()));
}

/// Writes an attribute's value as a Verilog literal. Verilog has no booleans and no types of the
/// user, so that both are strings.
class WriteVerilogAttrValueVisitor : public AttributeVisitor {
public:
    explicit WriteVerilogAttrValueVisitor(OutStream &out) : stream(out) {}

    void VisitAttributeString(AttributeString *attr) override {
        WriteQuoted(HdlUtilities::RemoveQuotes(attr->GetValueString()));
    }
    void VisitAttributeInteger(AttributeInteger *attr) override {
        stream << attr->GetValueString();
    }
    void VisitAttributeFloat(AttributeFloat *attr) override { stream << attr->GetValueString(); }
    void VisitAttributeBit(AttributeBit *attr) override {
        Put(stream, "1'b", attr->GetValueString());
    }
    void VisitAttributeBitVector(AttributeBitVector *attr) override {
        WriteSize(stream, attr->GetBitVectorValue());
        stream << attr->GetValue();
    }
    void VisitAttributeBoolean(AttributeBoolean *attr) override {
        WriteQuoted(attr->GetValueString());
    }
    void VisitAttributeUser(AttributeUser *attr) override { WriteQuoted(attr->GetValueString()); }

private:
    void WriteQuoted(Text const &text) { Put(stream, "\"", text, "\""); }

    OutStream &stream;
};

void WriteValue(OutStream &stream, Attribute const *attr) {
    WriteVerilogAttrValueVisitor visitor(stream);
    const_cast<Attribute *>(attr)->AcceptAttribute(visitor); // the visitor does not change it
}

/// Calls `write` with the name of each attribute that is to be written, and its value without
/// quotes.
template <class Write> void ForEachSynAttr(Iterator<Attribute *> const &attrs, Write write) {
    ForEach(attrs, [&write](Attribute const *attr) {
        if (attr->IsSynAssigned())
            write(attr->GetNameRef(), HdlUtilities::RemoveQuotes(attr->GetValueString()));
    });
}

} // namespace

namespace Vesk_Hdl {

VerilogStatements::VerilogStatements(OutStream &out) : stream(out) {}
VerilogStatements::~VerilogStatements() = default;

void VerilogStatements::WriteTimeScale(char const *unit, char const *precision) {
    Put(stream, "`timescale", " ", unit, " / ", precision, EOL);
}

/// For clients, as in VHDL. Required: without a file two blanks remain before the hyphen.
void VerilogStatements::WriteTimeStamp(char const *fileName) {
    stream << "// Verilog model ";
    if (fileName && *fileName)
        Put(stream, "created from ", fileName);
    Put(stream, " - ", HdlUtilities::CurrentTimeString(), EOL);
}

void VerilogStatements::WriteIncludePath(StringArray const &paths) {
    for (int i = 0; i < paths.GetSize(); ++i)
        Put(stream, "`include", " \"", HdlUtilities::RemoveQuotes(paths.At(i)), "\"", EOL);
}

void VerilogStatements::WriteComment(Object const *object) { PutComment(stream, object, "// "); }

void VerilogStatements::WriteParameterStatement(Attribute const *attr) {
    if (!attr)
        return;
    Put(stream, "parameter", " ", attr->GetNameRef(), " = ");
    WriteValue(stream, attr);
}

void VerilogStatements::WritePortDeclaration(Text const &name, Polarity const &polarity) {
    if (name.IsEmpty())
        return;
    Put(stream,
        (polarity == Polarity::INPUT           ? " input"
         : polarity == Polarity::BIDIRECTIONAL ? " inout"
                                               : "output"),
        " ");
    NameParts const parts(name);
    if (parts.isBus)
        Put(stream, "[", parts.left, ":", parts.right, "]", " ");
    stream << parts.base;
}

void VerilogStatements::WriteSignalDeclaration(Text const &name) {
    if (Bus::IsBusName(name))
        WriteWireBus(name);
    else
        WriteWire(name);
}

void VerilogStatements::WriteWire(Text const &name) { Put(stream, "wire", " ", name); }

void VerilogStatements::WriteWireBus(Text const &name) {
    NameParts const parts(name);
    Put(stream, "wire", " ", "[", parts.left, ":", parts.right, "]", " ", parts.base);
}

/// Required: only a range gets square brackets. The name of a bit keeps its parentheses here,
/// unlike at the pin of an instance.
void VerilogStatements::WriteSignalName(char const *name) {
    NameParts const parts{Text(name)};
    stream << parts.base;
    if (parts.isBus)
        Put(stream, "[", parts.left, ":", parts.right, "]");
}

void VerilogStatements::NormalizeBusName(Text &name) const {
    name.ReplaceChars('(', '[');
    name.ReplaceChars(')', ']');
}

/// Required: the target is the base name, also for one bit of a bus.
void VerilogStatements::WriteConstantSignalAssignment(Text const &name, bool isScalar,
                                                      BitVectorValue const &value) {
    Put(stream, "assign", " ", Object::GetBaseName(name), " = ");
    if (isScalar) {
        stream << ScalarDigit(value);
    } else {
        WriteSize(stream, value);
        stream << value.GetValue();
    }
}

void VerilogStatements::WriteSignalAssignment(Text const &target, Text const &source) {
    Put(stream, "assign", " ");
    WriteSignalName(target);
    stream << " = ";
    WriteSignalName(source);
}

void VerilogStatements::WriteDefParamStatement(Attribute const *attr, char const *instance) {
    if (!attr)
        return;
    Put(stream, "defparam", " ", instance, ".", attr->GetNameRef(), " = ");
    WriteValue(stream, attr);
}

void VerilogStatements::WriteDefParamInitStatement(Attribute const *attr, char const *instance) {
    if (attr)
        Put(stream, "defparam", " ", instance, ".", attr->GetNameRef(), " = ", attr->GetNameRef());
}

// Three tools read one comment line for each attribute, which names its target. The other two read
// one comment for all attributes, which is inside or directly after the statement of the target.

void VerilogStatements::WriteQRTAttr(Iterator<Attribute *> const &attrs, char const *target) {
    ForEachSynAttr(attrs, [this, target](Text const &name, Text const &value) {
        WriteQRTAttrStatement(name, target, value);
    });
}

void VerilogStatements::WriteQRTAttrStatement(char const *name, char const *target,
                                              char const *value) {
    Put(stream, "// synthesis attribute ", name, " ", "of", " ", target, " ", "is", " ", "\"",
        value, "\"", EOL);
}

void VerilogStatements::WriteExemplarAttr(Iterator<Attribute *> const &attrs, char const *target) {
    ForEachSynAttr(attrs, [this, target](Text const &name, Text const &value) {
        WriteExemplarAttrStatement(name, target, value);
    });
}

void VerilogStatements::WriteExemplarAttrStatement(char const *name, char const *target,
                                                   char const *value) {
    Put(stream, "// exemplar attribute ", target, " ", name, " ", value, EOL);
}

void VerilogStatements::WritePrecisionAttr(Iterator<Attribute *> const &attrs, char const *target) {
    ForEachSynAttr(attrs, [this, target](Text const &name, Text const &value) {
        WritePrecisionAttrStatement(name, target, value);
    });
}

void VerilogStatements::WritePrecisionAttrStatement(char const *name, char const *target,
                                                    char const *value) {
    Put(stream, "//pragma attribute ", target, " ", name, " ", value, EOL);
}

/// Required: a line of this comment ends in a comma and a backslash.
void VerilogStatements::WriteSynplicityAttr(Iterator<Attribute *> const &attrs) {
    bool first = true;
    ForEachSynAttr(attrs, [this, &first](Text const &name, Text const &value) {
        if (first)
            stream << "/* synthesis \"";
        else
            Put(stream, ", \\", EOL, ATTR_COLUMN);
        first = false;
        Put(stream, name, "=", value);
    });
    if (!first)
        Put(stream, "\" ", "*/");
}

void VerilogStatements::WriteSynopsysAttr(Iterator<Attribute *> const &attrs) {
    bool first = true;
    ForEachSynAttr(attrs, [this, &first](Text const &name, Text const &value) {
        if (first)
            stream << "/* synopsys attribute ";
        else
            Put(stream, EOL, ATTR_COLUMN);
        first = false;
        Put(stream, name, " ", "\"", value, "\"");
    });
    if (!first)
        Put(stream, " */", EOL);
}

} // namespace Vesk_Hdl
