// The reserved words of both languages. Model does not ask for them: a name may be legal in one
// language only.

#include "vesk_hdl/engine/Keywords.h"

namespace Vesk_Hdl {

namespace {

char const *const VHDL_WORDS[] = {
    "abs",          "access",     "after",      "alias",     "all",       "and",
    "architecture", "array",      "assert",     "attribute", "begin",     "block",
    "body",         "buffer",     "bus",        "case",      "component", "configuration",
    "constant",     "disconnect", "downto",     "else",      "elsif",     "end",
    "entity",       "exit",       "file",       "for",       "function",  "generate",
    "generic",      "group",      "guarded",    "if",        "impure",    "in",
    "inertial",     "inout",      "is",         "label",     "library",   "linkage",
    "literal",      "loop",       "map",        "mod",       "nand",      "new",
    "next",         "nor",        "not",        "null",      "of",        "on",
    "open",         "or",         "others",     "out",       "package",   "port",
    "postponed",    "procedure",  "process",    "pure",      "range",     "record",
    "register",     "reject",     "rem",        "report",    "return",    "rol",
    "ror",          "select",     "severity",   "signal",    "shared",    "sla",
    "sll",          "sra",        "srl",        "subtype",   "then",      "to",
    "transport",    "type",       "unaffected", "units",     "until",     "use",
    "variable",     "wait",       "when",       "while",     "with",      "xnor",
    "xor",
};

char const *const VERILOG_WORDS[] = {
    "always",  "and",       "assign",      "begin",        "buf",         "bufif0",
    "bufif1",  "case",      "casex",       "casez",        "cmos",        "deassign",
    "default", "defparam",  "disable",     "edge",         "else",        "end",
    "endcase", "endmodule", "endfunction", "endprimitive", "endspecify",  "endtable",
    "endtask", "event",     "for",         "forever",      "fork",        "function",
    "highz0",  "highz1",    "if",          "ifnone",       "initial",     "inout",
    "input",   "integer",   "join",        "large",        "macromodule", "medium",
    "module",  "nand",      "negedge",     "nmos",         "nor",         "not",
    "notif0",  "notif1",    "or",          "output",       "parameter",   "pmos",
    "posedge", "primitive", "pull0",       "pull1",        "pullup",      "pulldown",
    "rcmos",   "real",      "realtime",    "reg",          "release",     "repeat",
    "rnmos",   "rpmos",     "rtran",       "rtranif0",     "rtranif1",    "scalared",
    "small",   "specify",   "specparam",   "strong0",      "strong1",     "supply0",
    "supply1", "table",     "task",        "time",         "tran",        "tranif0",
    "tranif1", "tri",       "tri0",        "tri1",         "triand",      "trior",
    "trireg",  "vectored",  "wait",        "wand",         "weak0",       "weak1",
    "while",   "wire",      "wor",         "xnor",         "xor",
};

/// A set with these words. It is filled when it is made, so that it can be const and threads can
/// share it.
template <std::size_t Count> class KeywordSet : public StringSet {
public:
    explicit KeywordSet(char const *const (&words)[Count]) {
        for (char const *const word : words)
            Add(word);
    }
};

} // namespace

StringSet const &VhdlKeywords() {
    static KeywordSet const words(VHDL_WORDS);
    return words;
}

StringSet const &VerilogKeywords() {
    static KeywordSet const words(VERILOG_WORDS);
    return words;
}

} // namespace Vesk_Hdl
