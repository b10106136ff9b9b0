#!/usr/bin/env python3
"""bench.py FILE.cmd: writes vectors.txt and the benches that apply it, bench.v and bench.vhd.

The ports are those of the ADD PORT lines. A line of vectors.txt is the value of all inputs, a line
that a bench prints the value of all outputs, in the order of the ports and each from its left bit.
A port clk ticks, everything else changes while it is low; a port rst is 1 in the first four cycles,
of which nothing is printed. A design with few inputs and no clock gets all their values, any other
random ones.
"""
import itertools
import random
import re
import sys

CYCLES = 2000
RESET_CYCLES = 4

VERILOG = """module bench;
    reg [0:{last_in}] vectors [0:{last_vector}];
    reg [0:{last_in}] i;
    wire [0:{last_out}] o;
    integer n;
    {top} dut ({verilog_map});
    initial begin
        $readmemb("vectors.txt", vectors);
        for (n = 0; n <= {last_vector}; n = n + 1) begin
            i = vectors[n];
            #10;
            if (n >= {silent}) $display("%b", o);
        end
    end
endmodule
"""

VHDL = """library ieee;
use ieee.std_logic_1164.all;
use std.textio.all;
entity bench is
end bench;
architecture test of bench is
    signal i : std_logic_vector (0 to {last_in});
    signal o : std_logic_vector (0 to {last_out});
begin
    dut : configuration work.CFG_{top} port map ({vhdl_map});
    process
        file vectors : text open read_mode is "vectors.txt";
        variable row : line;
        variable value : bit_vector (0 to {last_in});
        variable image : string (1 to 3);
    begin
        for n in 0 to {last_vector} loop
            readline(vectors, row);
            read(row, value);
            i <= to_stdlogicvector(value);
            wait for 10 ns;
            next when n < {silent};
            for k in o'range loop
                image := std_logic'image(o(k));
                write(row, image(2));
            end loop;
            writeline(output, row);
        end loop;
        wait;
    end process;
end test;
"""


def vectors(inputs):
    widths = [width for _, width in inputs]
    clock, reset = ([name for name, _ in inputs].index(name) if (name, 1) in inputs else None
                    for name in ("clk", "rst"))
    if clock is None and 10 <= sum(widths) <= 13:
        return ["".join(bits) for bits in itertools.product("01", repeat=sum(widths))]
    source = random.Random(1)
    rows = []
    for cycle in range(CYCLES):
        values = ["".join(source.choices("01", k=width)) for width in widths]
        if reset is not None:
            values[reset] = "1" if cycle < RESET_CYCLES or source.random() < 0.03 else "0"
        for level in "01" if clock is not None else " ":
            if clock is not None:
                values[clock] = level
            rows.append("".join(values))
    return rows


def main():
    with open(sys.argv[1], encoding="ascii") as file:
        text = file.read()
    top = re.search(r"^SET NETLIST NAME (\w+)$", text, re.M).group(1)
    ports = {"input": [], "output": []}
    maps = {"verilog_map": [], "vhdl_map": []}
    for name, left, right, way in re.findall(
            r"^ADD PORT (\w+)(?:[\[({<](\d+)[:-](\d+)[\])}>])? (input|output)$", text, re.M | re.I):
        way = way.lower()
        wire, first = way[0], sum(width for _, width in ports[way])
        width = abs(int(left) - int(right)) + 1 if left else 1
        last = first + width - 1
        ports[way].append((name, width))
        maps["verilog_map"].append(f".{name}({wire}[{first}:{last}])")
        maps["vhdl_map"].append(f"{name} => {wire}({first} to {last})" if left else
                                f"{name} => {wire}({first})")
    rows = vectors(ports["input"])
    fill = {key: ",\n        ".join(items) for key, items in maps.items()}
    fill.update(top=top, last_vector=len(rows) - 1,
                silent=2 * RESET_CYCLES if ("rst", 1) in ports["input"] else 0,
                last_in=sum(width for _, width in ports["input"]) - 1,
                last_out=sum(width for _, width in ports["output"]) - 1)
    for name, content in (("vectors.txt", "\n".join(rows) + "\n"),
                          ("bench.v", VERILOG.format(**fill)),
                          ("bench.vhd", VHDL.format(**fill))):
        with open(name, "w", encoding="ascii") as file:
            file.write(content)


main()
