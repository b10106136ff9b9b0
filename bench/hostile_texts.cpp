// Hostile kinds that grow in names, values and writes.

#include "bench/hostile_parts.h"

std::vector<HostileKind> TextKinds() {
    // A value that ends after column 80, so that its line is folded.
    std::string const BLANKS = "\"two words of a value that is long enough to end after column 80, "
                               "where lines are folded\"";
    return {
        // Names that are long, or equal up to their end.
        {"long-name-beside",
         "nets beside one with a name as long as all of them",
         {Once("ADD SIGNAL {long}\n"), Each("ADD SIGNAL n{i}\n")},
         16000,
         ALIGNED},
        {"long-names-sorted",
         "names with 100 letters in common",
         {Each("ADD SIGNAL " + std::string(100, 'a') + "{i}\n")}},
        {"long-compounds",
         "pins on one compound with a long name of its own",
         {Once(VECTOR + "ADD INSTANCE V W\nCONNECT SIGNAL a"), Each(",n{i}"), Once(" W.I(7:0)\n"),
          Each("ADD INSTANCE V W{i}\n")}},
        {"long-instance-findings",
         "open inputs of an instance with a long name",
         {Once("ADD COMPONENT C\n"), Each("ADD PIN C P{i} in\n"), Once("ADD INSTANCE C {long}\n")},
         8000,
         "each finding names its pin with the instance"},

        // Names with one hash.
        {"clashing-nets", "nets with one hash", {Each("ADD SIGNAL {clash}\n")}},
        {"clashing-buses", "buses with one hash", {Each("ADD SIGNAL {clash}(3:0)\n")}},
        {"clashing-components",
         "components with one hash",
         {Each("ADD COMPONENT {clash}\nADD INSTANCE {clash} U{i}\n")}},
        {"clashing-instances",
         "instances with one hash",
         {Once(BUFFER), Each("ADD INSTANCE C {clash}\nCONNECT SIGNAL n{i} {clash}.I\n")}},
        {"clashing-pins",
         "pins with one hash",
         {Once("ADD COMPONENT C\n"), Each("ADD PIN C {clash} in\n"), Once("ADD INSTANCE C U\n"),
          Each("CONNECT SIGNAL n{i} U.{clash}\n")}},
        {"clashing-bus-pins",
         "pins of several bits with one hash",
         {Once("ADD COMPONENT C\n"), Each("ADD PIN C {clash}(1:0) in\n"),
          Once("ADD INSTANCE C U\n"), Each("CONNECT SIGNAL n{i}(1:0) U.{clash}(1:0)\n")}},
        {"clashing-ports",
         "out ports with one hash that are read",
         {Once(BUFFER), Each("ADD PORT {clash} out\nADD INSTANCE C U{i}\n"
                             "CONNECT SIGNAL {clash} U{i}.I\n")},
         32000},
        {"clashing-bus-ports",
         "out ports of several bits with one hash that are read",
         {Once(VECTOR), Each("ADD PORT {clash}(7:0) out\nADD INSTANCE V U{i}\n"
                             "CONNECT SIGNAL {clash}(7:0) U{i}.I(7:0)\n")},
         32000},
        {"clashing-attributes",
         "attributes with one hash that are declared",
         {Each("ADD SIGNAL s{i}\nADD SIGNAL ATTRIBUTE s{i} {clash} v\n"
               "SET SIGNAL ATTRIBUTE OPTION s{i} {clash} -SYNATTR=ASSIGN\n")},
         32000},
        {"clashing-attributes-of-one",
         "attributes with one hash of one net",
         {Once("ADD SIGNAL S\n"), Each("ADD SIGNAL ATTRIBUTE S {clash} v\n"
                                       "SET SIGNAL ATTRIBUTE OPTION S {clash} -SYNATTR=ASSIGN\n")},
         32000},
        {"clashing-generics",
         "generics with one hash of a component with an instance",
         {Once(ONE_BUFFER), Each("ADD COMPONENT ATTRIBUTE C {clash} v\n"
                                 "SET COMPONENT ATTRIBUTE OPTION C {clash} -GENERIC=SYN\n")},
         32000},
        {"clashing-refused", "unknown names with one hash", {Each("ADD INSTANCE {clash} u{i}\n")}},

        // Attributes, comments and options.
        {"generics-blanks",
         "generics of the design with blanks in their values",
         {Each("ADD MODULE ATTRIBUTE A{i} " + BLANKS +
               "\nSET MODULE ATTRIBUTE OPTION A{i} -GENERIC=SYN\n")},
         32000},
        {"component-generics-blanks",
         "generics of a component with blanks in their values",
         {Once(ONE_BUFFER), Each("ADD COMPONENT ATTRIBUTE C A{i} " + BLANKS +
                                 "\nSET COMPONENT ATTRIBUTE OPTION C A{i} -GENERIC=NOSYN\n")},
         32000},
        {"instance-attributes-blanks",
         "generics of an instance with blanks in their values",
         {Once(ONE_BUFFER), Each("ADD INSTANCE ATTRIBUTE U A{i} " + BLANKS +
                                 "\nSET INSTANCE ATTRIBUTE OPTION U A{i} -GENERIC=SYN\n")},
         32000},
        {"net-attributes-blanks",
         "attributes of a net with blanks in their values",
         {Once("ADD SIGNAL S\n"), Each("ADD SIGNAL ATTRIBUTE S A{i} " + BLANKS +
                                       "\nSET SIGNAL ATTRIBUTE OPTION S A{i} -SYNATTR=ASSIGN\n")},
         32000},
        {"generics-and-pins",
         "generics and as many pins of one component",
         {Once("ADD COMPONENT C\n"), Each("ADD PIN C P{i} in\n"),
          Each("ADD COMPONENT ATTRIBUTE C A{i} v\nSET COMPONENT ATTRIBUTE OPTION C A{i} "
               "-GENERIC=SYN\n"),
          Once("ADD INSTANCE C U\n")},
         32000},
        {"generics-and-instances",
         "generics of a component and as many instances",
         {Once(BUFFER),
          Each("ADD COMPONENT ATTRIBUTE C A{i} v\n"
               "SET COMPONENT ATTRIBUTE OPTION C A{i} -GENERIC=SYN\n"),
          Each("ADD INSTANCE C U{i}\n")},
         4000,
         REPEATED},
        {"attributes-unwritten",
         "component attributes that are not written, and as many instances",
         {Once(BUFFER), Each("ADD COMPONENT ATTRIBUTE C A{i} v\n"), Each("ADD INSTANCE C U{i}\n")},
         32000},
        {"attributes-unwritten-own",
         "the same with an attribute on each instance",
         {Once(BUFFER), Each("ADD COMPONENT ATTRIBUTE C A{i} v\n"),
          Each("ADD INSTANCE C U{i}\nADD INSTANCE ATTRIBUTE U{i} A{i} w\n"
               "SET INSTANCE ATTRIBUTE OPTION U{i} A{i} -GENERIC=SYN\n")},
         32000},
        {"attributes-hidden",
         "generics of a component and of each of two instances",
         {Once(ONE_BUFFER + "ADD INSTANCE C T\n"),
          Each(
              "ADD COMPONENT ATTRIBUTE C A{i} v\nSET COMPONENT ATTRIBUTE OPTION C A{i} "
              "-GENERIC=SYN\n"
              "ADD INSTANCE ATTRIBUTE U A{i} v\nSET INSTANCE ATTRIBUTE OPTION U A{i} -GENERIC=SYN\n"
              "ADD INSTANCE ATTRIBUTE T A{i} w\nSET INSTANCE ATTRIBUTE OPTION T A{i} "
              "-GENERIC=SYN\n")},
         16000},
        {"attributes-inherited",
         "attributes of instances with the values of their component",
         {Once(BUFFER + "ADD COMPONENT ATTRIBUTE C A v\n"
                        "SET COMPONENT ATTRIBUTE OPTION C A -SYNATTR=ASSIGN\n"),
          Each("ADD INSTANCE C U{i}\nADD INSTANCE ATTRIBUTE U{i} A v\n"
               "SET INSTANCE ATTRIBUTE OPTION U{i} A -SYNATTR=ASSIGN\n")},
         32000},
        {"attributes-copied",
         "attributes that the instances copy from their component",
         {Once(BUFFER + "ADD COMPONENT ATTRIBUTE C A v\n"),
          Each("ADD INSTANCE C U{i}\nSET INSTANCE ATTRIBUTE VALUE U{i} A w\n")}},
        {"pin-attributes",
         "attributes of a pin and as many instances",
         {Once("ADD COMPONENT C\nADD PIN C I in\n"),
          Each("ADD COMPONENT PIN ATTRIBUTE C.I A{i} v\n"), Each("ADD INSTANCE C U{i}\n")},
         4000,
         "each instance has a copy of each attribute of a pin"},
        {"attributes-without-type",
         "attributes of a type without a name",
         {Once("ADD SIGNAL S\nUse AttrType\n"),
          Each("ADD SIGNAL ATTRIBUTE S -TYPE=User A{i} v\n"
               "SET SIGNAL ATTRIBUTE OPTION S A{i} -SYNATTR=ASSIGN\n")},
         32000},
        {"attributes-like-nets",
         "attributes called like nets",
         {Each("ADD SIGNAL s{i}\nADD SIGNAL ATTRIBUTE s{i} s{i} v\n"
               "SET SIGNAL ATTRIBUTE OPTION s{i} s{i} -SYNATTR=ASSIGN\n")},
         32000},
        {"macro-init",
         "instances with an INIT in a macro",
         {Once("SET NETLIST NAME MORVANE_x\nADD MODULE ATTRIBUTE INIT v\n"
               "SET MODULE ATTRIBUTE OPTION INIT -GENERIC=SYN\n" +
               BUFFER),
          Each("ADD INSTANCE C U{i}\nADD INSTANCE ATTRIBUTE U{i} INIT v\n"
               "SET INSTANCE ATTRIBUTE OPTION U{i} INIT -GENERIC=NOSYN\n")},
         32000},
        {"component-comments",
         "comments of a component and as many instances",
         {Once(BUFFER), Each("ADD COMPONENT COMMENT C c{i}\n"), Each("ADD INSTANCE C U{i}\n")},
         4000,
         REPEATED},
        {"box-types",
         "components of the vendor's library",
         {Each("ADD COMPONENT C{i}\nADD COMPONENT ATTRIBUTE C{i} Level ORVANE\nADD INSTANCE C{i} "
               "U{i}\n")},
         32000},
        {"libraries-and-name",
         "libraries and a design called like the last one",
         {Each("ADD LIBRARY L{i}\n"), Once("SET NETLIST NAME L{n}\n")}},
        {"libraries-and-nets",
         "libraries and as many nets called like them",
         {Each("ADD LIBRARY L{i}\nADD USE LIBRARY L{i}.all\n"), Each("ADD PORT L{i} in\n")}},
        {"name-cases",
         "changes of the case of n names",
         {Each("ADD SIGNAL s{i}\n"),
          Once("UPPERCASE siganl\n" + WRITE + "LOWERCASE signal\n" + WRITE)}},

        // Writes and changes in turn.
        {"writes",
         "writes of a small design",
         {Once(ONE_BUFFER + "CONNECT SIGNAL a U.I\n"), Each(WRITE)},
         4000},
        {"writes-and-noops",
         "writes of a small design and lines that change nothing",
         {Once(ONE_BUFFER + "CONNECT SIGNAL a U.I\n"), Each(WRITE + "NOOP\n")},
         4000},
        {"writes-and-changes",
         "writes, each with a line before it",
         {Each("ADD SIGNAL s{i}\n" + WRITE)},
         1000,
         WRITTEN_OFTEN},
        {"changes-and-writes-back",
         "writes of a small design, its pin moved between them",
         {Once(ONE_BUFFER),
          Each("CONNECT SIGNAL a U.I\n" + WRITE + "CONNECT SIGNAL b U.I\n" + WRITE)},
         2000},
        {"ports-read-after-writes",
         "writes of a design with a port that is read again each time",
         {Once(ONE_BUFFER + "ADD PORT p out\n"), Each("CONNECT SIGNAL p U.I\n" + WRITE)},
         1000,
         "each write makes another dummy signal, and all are written"},
    };
}
