// The designs that the benchmarks read and write. Each kind grows in one thing and keeps the rest
// small: if its curve bends, the cause is that thing.

#include "bench/kinds.h"

#include <algorithm>
#include <ostream>

namespace {

/// Gates in a row. Each is fed by the two before it, so that no net has more than three pins.
void WriteChain(std::ostream &lines, long n) {
    lines << "ADD COMPONENT AND2\n"
             "ADD PIN AND2 I0 in\n"
             "ADD PIN AND2 I1 in\n"
             "ADD PIN AND2 O out\n"
             "ADD PORT n0 in\n"
             "ADD PORT y out\n";
    for (long i = 1; i <= n; ++i) {
        lines << "ADD SIGNAL n" << i << '\n';
        lines << "ADD INSTANCE AND2 u" << i << '\n';
        lines << "CONNECT SIGNAL n" << i - 1 << " u" << i << ".I0\n";
        lines << "CONNECT SIGNAL n" << std::max(i - 2, 0L) << " u" << i << ".I1\n";
        lines << "CONNECT SIGNAL n" << i << " u" << i << ".O\n";
    }
    lines << "CONNECT SIGNAL y n" << n << '\n';
}

/// One net that every instance is on, as a clock is.
void WriteNet(std::ostream &lines, long n) {
    lines << "ADD COMPONENT BUFF\n"
             "ADD PIN BUFF I in\n"
             "ADD PIN BUFF O out\n"
             "ADD PORT clk in\n";
    for (long i = 1; i <= n; ++i) {
        lines << "ADD SIGNAL n" << i << '\n';
        lines << "ADD INSTANCE BUFF u" << i << '\n';
        lines << "CONNECT SIGNAL clk u" << i << ".I\n";
        lines << "CONNECT SIGNAL n" << i << " u" << i << ".O\n";
    }
}

/// Registers of 32 bits in a row. After each, a gate takes a bit of its bus and another instance a
/// slice. There is no clock: one net for all is another kind.
void WriteBus(std::ostream &lines, long n) {
    lines << "ADD COMPONENT REG\n"
             "ADD PIN REG D(31:0) in\n"
             "ADD PIN REG Q(31:0) out\n"
             "ADD COMPONENT BIT\n"
             "ADD PIN BIT A in\n"
             "ADD PIN BIT O out\n"
             "ADD COMPONENT NIBBLE\n"
             "ADD PIN NIBBLE A(3:0) in\n"
             "ADD PIN NIBBLE O out\n"
             "ADD PORT d0(31:0) in\n";
    for (long i = 0; i < n; ++i) {
        long const stage = i / 3;
        switch (i % 3) {
        case 0:
            lines << "ADD SIGNAL d" << stage + 1 << "(31:0)\n";
            lines << "ADD INSTANCE REG r" << stage << '\n';
            lines << "CONNECT SIGNAL d" << stage << "(31:0) r" << stage << ".D(31:0)\n";
            lines << "CONNECT SIGNAL d" << stage + 1 << "(31:0) r" << stage << ".Q(31:0)\n";
            break;
        case 1:
            lines << "ADD INSTANCE BIT b" << stage << '\n';
            lines << "CONNECT SIGNAL d" << stage + 1 << "(3) b" << stage << ".A\n";
            lines << "CONNECT SIGNAL x" << stage << " b" << stage << ".O\n";
            break;
        default:
            lines << "ADD INSTANCE NIBBLE s" << stage << '\n';
            lines << "CONNECT SIGNAL d" << stage + 1 << "(7:4) s" << stage << ".A(3:0)\n";
            lines << "CONNECT SIGNAL y" << stage << " s" << stage << ".O\n";
        }
    }
}

/// A component of 2,000 pins, half of them in, as often as it takes to have n pins.
void WritePins(std::ostream &lines, long n) {
    constexpr long PINS = 2000;
    lines << "ADD COMPONENT CHIP\n"
             "ADD PORT n0 in\n";
    for (long pin = 0; pin < PINS; ++pin)
        lines << "ADD PIN CHIP P" << pin << (pin < PINS / 2 ? " in\n" : " out\n");
    for (long i = 0; i < n; ++i) {
        long const instance = i / PINS;
        long const pin = i % PINS;
        if (pin == 0)
            lines << "ADD INSTANCE CHIP u" << instance << '\n';
        // What leaves one instance enters the next one.
        lines << "CONNECT SIGNAL n" << (pin < PINS / 2 ? i : i + PINS / 2) << " u" << instance
              << ".P" << pin << '\n';
    }
}

/// Out ports that the design reads as well: each needs a dummy signal before a write.
void WritePorts(std::ostream &lines, long n) {
    lines << "ADD COMPONENT INV\n"
             "ADD PIN INV I in\n"
             "ADD PIN INV O out\n"
             "ADD PORT p0 out\n";
    for (long i = 1; i <= n; ++i) {
        lines << "ADD PORT p" << i << " out\n";
        lines << "ADD INSTANCE INV u" << i << '\n';
        lines << "CONNECT SIGNAL p" << i - 1 << " u" << i << ".I\n";
        lines << "CONNECT SIGNAL p" << i << " u" << i << ".O\n";
    }
}

/// Bundles of a scalar, a slice and a bit, each on a pin of six bits.
void WriteCompound(std::ostream &lines, long n) {
    lines << "ADD COMPONENT SINK\n"
             "ADD PIN SINK A(5:0) in\n"
             "ADD PORT a0 in\n";
    for (long i = 0; i < n; ++i) {
        lines << "ADD SIGNAL d" << i << "(7:0)\n";
        lines << "ADD INSTANCE SINK u" << i << '\n';
        lines << "CONNECT SIGNAL a" << i << ",d" << i << "(3:0),d" << i << "(7) u" << i
              << ".A(5:0)\n";
    }
}

/// Connects an instance between its own net and that of the instance before it.
void ConnectInRow(std::ostream &lines, long i) {
    lines << "CONNECT SIGNAL n" << i - 1 << " u" << i << ".I\n";
    lines << "CONNECT SIGNAL n" << i << " u" << i << ".O\n";
}

/// A thousand components that take turns.
void WriteComponents(std::ostream &lines, long n) {
    constexpr long COMPONENTS = 1000;
    lines << "ADD PORT n0 in\n";
    for (long i = 0; i < COMPONENTS; ++i) {
        lines << "ADD COMPONENT C" << i << '\n';
        lines << "ADD PIN C" << i << " I in\n";
        lines << "ADD PIN C" << i << " O out\n";
    }
    for (long i = 1; i <= n; ++i) {
        lines << "ADD INSTANCE C" << i % COMPONENTS << " u" << i << '\n';
        ConnectInRow(lines, i);
    }
}

/// Gates whose pins, instances and component have attributes.
void WriteAttributes(std::ostream &lines, long n) {
    lines << "ADD COMPONENT INV\n"
             "ADD PIN INV I in\n"
             "ADD PIN INV O out\n"
             "ADD COMPONENT ATTRIBUTE INV INIT 0 Integer\n"
             "SET COMPONENT ATTRIBUTE OPTION INV INIT -GENERIC=SYN\n"
             "ADD PORT n0 in\n";
    for (long i = 1; i <= n; ++i) {
        lines << "ADD INSTANCE INV u" << i << '\n';
        lines << "ADD INSTANCE ATTRIBUTE u" << i << " LOC X" << i << "Y1\n";
        lines << "ADD INSTANCE PIN ATTRIBUTE u" << i << ".I DELAY " << i % 7 << " Integer\n";
        lines << "ADD INSTANCE PIN ATTRIBUTE u" << i << ".O DELAY " << i % 5 << " Integer\n";
        ConnectInRow(lines, i);
    }
}

/// A thousand components with attributes that are declared, assigned and passed on as generics, all
/// of them in the configuration.
void WriteConfiguration(std::ostream &lines, long n) {
    WriteComponents(lines, n);
    for (long i = 0; i < 1000; ++i) {
        lines << "ADD COMPONENT ATTRIBUTE C" << i << " KIND k" << i << '\n';
        lines << "SET COMPONENT ATTRIBUTE OPTION C" << i << " KIND -SYNATTR=ASSIGN\n";
    }
    for (long i = 1; i <= n; ++i) {
        lines << "ADD INSTANCE ATTRIBUTE u" << i << " LOC X" << i << "Y1\n";
        lines << "SET INSTANCE ATTRIBUTE OPTION u" << i << " LOC -SYNATTR=ASSIGN\n";
    }
}

constexpr int MANY_WRITES = 10;

constexpr Kind KINDS[] = {
    {"chain", "instances", "two-input gates, each fed by the ones before", WriteChain},
    {"net", "instances", "one net on a pin of every instance", WriteNet},
    {"bus", "instances", "32-bit buses whole, by the bit and by the slice", WriteBus},
    {"pins", "pins", "a component of 2,000 pins", WritePins},
    {"ports", "instances", "out ports that are read inside", WritePorts},
    {"compound", "instances", "bundles of a scalar, a slice and a bit", WriteCompound},
    {"components", "instances", "a thousand components", WriteComponents},
    {"attributes", "instances", "attributes on every instance and pin", WriteAttributes},
    {"configuration", "instances", "a thousand components, all attributes written",
     WriteConfiguration},
    {"writes", "instances", "a chain that is written ten times", WriteChain, MANY_WRITES},
};

} // namespace

std::span<Kind const> GetKinds() { return KINDS; }

Kind const *FindKind(std::string_view name) {
    auto const *const found = std::find_if(std::begin(KINDS), std::end(KINDS),
                                           [name](Kind const &kind) { return kind.name == name; });
    return found == std::end(KINDS) ? nullptr : found;
}

void WriteDesign(std::ostream &lines, Kind const &kind, long n, std::string const &vhdlFile,
                 std::string const &verilogFile) {
    lines << "SET NETLIST NAME bench_" << kind.name << '\n';
    kind.write(lines, n);
    for (int i = 0; !vhdlFile.empty() && i < kind.writes; ++i)
        lines << "WRITE VHDL -NOHEADER " << vhdlFile << '\n';
    for (int i = 0; !verilogFile.empty() && i < kind.writes; ++i)
        lines << "WRITE VERILOG -NOHEADER " << verilogFile << '\n';
}
