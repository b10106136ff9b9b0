#!/usr/bin/env python3
"""generate.py KIND SEED FOLDER: writes KIND_SEED.cmd, commands for one random circuit of a kind,
and KIND_SEED_ref.v, what it does, into FOLDER. With KIND "all" the seed chooses the kind, too.

A bit is a signal and a place in it from its left end, or a constant 0 or 1. A kind puts lists of
bits, highest first, on pins. Circuit finds signals, slices, compounds and constants that say so,
and a spelling. What is known to give an illegal text or another function is not made.
"""
import collections
import os
import random
import re
import sys

CELLS = {  # inputs; outputs; their value in a row, unless the cell has a clock
    "INV": ("A", "Y", "~{A}"),
    "AND2": ("A B", "Y", "{A} & {B}"),
    "OR2": ("A B", "Y", "{A} | {B}"),
    "XOR2": ("A B", "Y", "{A} ^ {B}"),
    "FA": ("A B CI", "CO S", "{A} + {B} + {CI}"),
    "MUX2X4": ("A(3:0) B(3:0) S", "Y(0:3)", "{S} ? {B} : {A}"),
    "MUX2X16": ("A(15:0) B(15:0) S", "Y(15:0)", "{S} ? {B} : {A}"),
    "DFF": ("C R E D", "QN Q", None),
    "REG8": ("C R E D(0:7)", "Q(7:0)", None),
}
BASES = "A B Y S CO D Q net Data sumOfAll x_y a_name_that_is_long_enough_to_make_lines_fold".split()


def pins_of(kind, column):
    """Name, bounds and width of the inputs (0) or outputs (1) of a cell."""
    return [(name, bounds, max(map(int, re.findall(r"\d+", bounds)), default=0) + 1)
            for name, bounds in re.findall(r"(\w+)(\S*)", CELLS[kind][column])]


def cat(bits):
    """The bits in the reference."""
    if not isinstance(bits[0], int) and bits == bits[0][0].bits:
        return bits[0][0].name
    return "{" + ", ".join(f"1'b{bit}" if isinstance(bit, int) else bit[0].name + "".join(
        f"[{index}]" for index in bit[0].indices[bit[1]:bit[1] + 1]) for bit in bits) + "}"


class Signal:
    def __init__(self, name, indices, way):
        self.name, self.indices, self.way = name, indices, way
        self.bits = [(self, place) for place in range(len(indices) or 1)]
        # A bus that has a dummy is not driven through compounds, since they keep the bus itself. A
        # bus that grows comes into being with one of its slices; a wider one replaces it.
        self.dummy = self.split = self.grows = self.registered = False

    def part(self, place=0, count=None):
        indices = self.indices[place:][:count]
        return self, f"({indices[0]}:{indices[-1]})" if indices else ""


class Circuit:
    def __init__(self, name, rng):
        self.name, self.rng, self.modelled, self.spare = name, rng, False, False
        self.signals, self.instances, self.first, self.lines, self.model = [], [], [], [], []
        self.taken, self.mentioned, self.ties, self.cells = set(), {}, [], collections.Counter()

    def chance(self, probability):
        return self.rng.random() < probability

    def signal(self, width, way=None, name=None):
        base = self.rng.choice(BASES)
        while (chosen := name or base).lower() in self.taken:
            base += self.rng.choice(("", "_")) + str(len(self.taken))
        self.taken.add(chosen.lower())
        low = self.rng.choice((0, 0, 1, 7, 98))
        indices = list(range(low, low + width))[::self.rng.choice((1, -1))]
        scalar = name or width == 1 and self.chance(.8)
        self.signals.append(Signal(chosen, [] if scalar else indices, way))
        return self.signals[-1].bits

    def clock(self):
        return {"C": self.signal(1, "input", "clk"), "R": self.signal(1, "input", "rst")}

    def nets(self, count):
        found = []
        while len(found) < count:
            found += self.signal(self.rng.randint(1, count - len(found)))
        return found

    def constant(self, target, bits, scalar):
        width, digits = len(bits), "".join(map(str, bits))
        texts = [f"{width}:b:{digits}"] + [digits, f"3:B:01{digits}"] * scalar + [
            f"{width}:{base}:{int(digits, 2):0{width // size}{form}}"
            for base, size, form in (("h", 4, "X"), ("o", 3, "o")) if width % size == 0]
        self.lines.append(("ASSIGN CONSTANT", target, self.rng.choice(texts)))

    def tie(self, value):
        """A bit with that constant value, for places that take no constant."""
        for values in [] if self.ties else ([0], [1], self.rng.choices((0, 1), k=5)):
            bits = self.signal(len(values))
            self.constant([bits[0][0].part()], values, not bits[0][0].indices)
            self.model.append(f"assign {cat(bits)} = {cat(values)};")
            self.ties += zip(bits, values)
        return self.rng.choice([bit for bit, constant in self.ties if constant == value])

    def connect(self, bits, pin, drives):
        if all(isinstance(bit, int) for bit in bits) and self.chance(.8):
            self.constant(pin, bits, len(bits) == 1)
            return
        rest, parts = [self.tie(bit) if isinstance(bit, int) else bit for bit in bits], []
        while rest:
            signal, place = rest[0]
            count = 1
            whole = drives and (signal.way or signal.dummy or signal.grows)
            while count < len(rest) and rest[count] == (signal, place + count) and (
                    whole or self.chance(.95)):
                count += 1
            rest = rest[count:]
            parts.append(signal.part(place, count))
            # A slice of one bit counts as ascending. In a descending bus that makes no difference.
            falls = len(bits) > 1 and signal.indices[:1] > signal.indices[-1:]
            if signal.indices and count == 1 and not (
                    self.chance(.2) and (falls or len(signal.bits) == 1)):
                parts[-1] = (signal, f"({signal.indices[place]})")
        for signal, _ in parts if drives and len(parts) > 1 else []:
            signal.split = bool(signal.indices)
        self.lines.append(("CONNECT SIGNAL", parts, pin))

    def alias(self, target, source):
        parts = [[bits[0][0].part(bits[0][1], len(bits))] for bits in (target, source)]
        self.lines.append(("CONNECT SIGNAL", *parts))
        self.model.append(f"assign {cat(target)} = {cat(source)};")

    def cell(self, kind, **pins):
        """An instance with these bits on its pins; the other pins stay open."""
        name = f"{kind}_{self.cells[kind]}"
        self.cells[kind] += 1
        self.instances.append(f"{kind} {name}")
        for column in (0, 1):
            for pin, bounds, _ in pins_of(kind, column):
                if pins.get(pin):
                    self.connect(pins[pin], f"{name}.{pin}{bounds}", drives=column == 1)
        if not self.modelled or not pins:
            return
        text = {pin: cat(bits) for pin, bits in pins.items() if bits}
        if "C" not in pins:
            outputs = [bit for pin, _, _ in pins_of(kind, 1) for bit in pins.get(pin) or []]
            self.model.append(f"assign {cat(outputs)} = {CELLS[kind][2].format(**text)};")
        else:
            self.register(pins["Q"], f"if ({text['E']}) @ <= {text['D']};")
            if pins.get("QN"):
                self.model.append(f"assign {text['QN']} = ~{text['Q']};")

    def register(self, outputs, step):
        """Adds a register to the reference, @ in its step. Nothing else drives these signals: the
        proof finds a register only by a name that is all its own."""
        for signal, _ in outputs:
            signal.registered = True
        step = f"if (rst) @ <= 0; else {step}".replace("@ ", cat(outputs) + " ")
        self.model.append(f"always @(posedge clk) {step}")

    def mux(self, a, b, select, y):
        while a:
            width = (16 if len(a) >= 16 and self.cells["MUX2X4"] else
                     4 if len(a) >= 4 and not (self.cells["MUX2X4"] and self.chance(.2)) else 1)
            if width > 1:
                self.cell(f"MUX2X{width}", A=a[:width], B=b[:width], S=select, Y=y[:width])
            else:
                off, low, high = self.nets(1), self.nets(1), self.nets(1)
                self.cell("INV", A=select, Y=off)
                self.cell("AND2", A=a[:1], B=off, Y=low)
                self.cell("AND2", A=b[:1], B=select, Y=high)
                self.cell("OR2", A=low, B=high, Y=y[:1])
            a, b, y = a[width:], b[width:], y[width:]

    def word(self, text):
        return self.rng.choice((text, text.upper(), text.lower(), text.title()))

    def brackets(self, text):
        ends = self.rng.choice(("()", "[]", "{}", "<>")) + self.rng.choice(":-")
        return text.translate(str.maketrans("():", ends))

    def mention(self, parts):
        """A name that exists may be spelled in any case and with any brackets. A new name is stored
        as it is first spelled, and only round brackets make it a part of a bus."""
        key = tuple(signal.name + part for signal, part in parts)
        if key in self.mentioned and not (len(parts) == 1 and parts[0][0].grows):
            return self.word(self.brackets(self.mentioned[key]))
        # The pass before a write finds a compound that needs a dummy only if its name has a comma.
        between = "," if parts[0][0].way == "output" else ",\\"
        text = "".join(name + self.rng.choice(between) for name in key)[:-1]
        return self.mentioned.setdefault(key, text)

    def commands(self):
        yield f"SET NETLIST NAME {self.name}"
        for kind in self.cells:
            yield f"ADD COMPONENT {kind}"
            pins = [(pin + bounds, way) for column, way in enumerate(("input", "output"))
                    for pin, bounds, _ in pins_of(kind, column)]
            for pin, way in self.rng.sample(pins, len(pins)):
                yield f"ADD PIN {self.word(kind)} {pin} {self.word(way)}"
        for signal in self.rng.sample(self.signals, len(self.signals)):
            name = signal.name + signal.part()[1]
            if signal.way:
                yield f"ADD PORT {self.brackets(name)} {self.word(signal.way)}"
            elif not signal.grows and (signal.indices or self.chance(.3)):
                yield f"ADD SIGNAL {self.brackets(name)}"
            if signal.way or signal.indices:
                self.mentioned[(name,)] = name
        yield from (f"ADD INSTANCE {instance}" for instance in self.instances)
        self.rng.shuffle(self.lines)
        for line in self.first + self.lines:
            yield " ".join(self.word(operand) if isinstance(operand, str) else
                           self.mention(operand) for operand in line)
        writes = [f"WRITE {language} -NOHEADER {self.name}.{end}"
                  for language, end in (("VERILOG", "v"), ("VHDL", "vhd"))]
        # Writing VHDL first would give Verilog a wire without driver for each open input.
        if self.spare:
            yield "SET OPEN PIN false"
        yield from writes if self.spare or self.chance(.5) else writes[::-1]

    def reference(self):
        ports, wires = [], []
        for signal in self.signals:
            bounds = f"[{signal.indices[0]}:{signal.indices[-1]}] " if signal.indices else ""
            kind = "reg " if signal.registered else "" if signal.way else "wire "
            (ports if signal.way else wires).append(
                f"{signal.way or ''} {kind}{bounds}{signal.name}")
        return [f"module {self.name} ({', '.join(ports)});"] + [
            wire + ";" for wire in wires] + self.model + ["endmodule"]


def shifter(c, rng):
    width = rng.randint(5, 20)
    stages = rng.randint(2, (width - 1).bit_length())
    data, amount = c.signal(width, "input"), c.signal(stages, "input")
    value, which = cat(data), rng.randrange(4)
    for stage in range(stages):
        step, by = 1 << stage, cat(amount[-1 - stage:])
        shifted, meant = (
            (data[step:] + [0] * step, f"{value} << {by}"),
            ([0] * step + data[:-step], f"{value} >> {by}"),
            ([data[0]] * step + data[:-step], f"$signed({value}) >>> {by}"),
            (data[step:] + data[:step], f"{{2{{{value}}}}} << {by} % {width} >> {width}"))[which]
        # A compound that begins with a read port cannot hold constants, so only rotation reads stages.
        way = "output" if stage == stages - 1 or which == 3 and c.chance(.5) else None
        result = c.signal(width, way) if way or c.chance(.5) else c.nets(width)
        c.model.append(f"assign {cat(result)} = {meant};")
        c.mux(data, shifted, [amount[-1 - stage]], result)
        data = result


def register_file(c, rng):
    width, select = rng.choice((8, 9, 11, 16, 18)), rng.randint(1, 2)
    clock, enable, data = c.clock(), c.signal(1, "input"), c.signal(width, "input")
    write, read = c.signal(select, "input"), c.signal(select, "input")
    inverted, words = c.nets(select), []
    for bit, other in zip(write, inverted):
        c.cell("INV", A=[bit], Y=[other])
    for number in range(1 << select):
        enabled = enable
        for pair, digit in zip(zip(inverted, write), f"{number:0{select}b}"):
            before, enabled = enabled, c.nets(1)
            c.cell("AND2", A=before, B=[pair[int(digit)]], Y=enabled)
        words.append(c.signal(width, rng.choice((None, "output"))))
        c.register(words[-1], f"if ({cat(enable)} && {cat(write)} == {number}) @ <= {cat(data)};")
        for place in sorted({*range(0, width - 7, 8), *range(width // 8 * 8, width)}):
            cell, end = ("REG8", place + 8) if place + 8 <= width else ("DFF", place + 1)
            c.cell(cell, **clock, E=enabled, D=data[place:end], Q=words[-1][place:end])
    meant = "".join(f"{cat(read)} == {n} ? {cat(word)} : " for n, word in enumerate(words)) + "0"
    for bit in reversed(read):
        pairs = list(zip(words[::2], words[1::2]))
        words = [c.signal(width, "output" if len(pairs) == 1 else None) for _ in pairs]
        for (low, high), result in zip(pairs, words):
            c.mux(low, high, [bit], result)
    c.model.append(f"assign {cat(words[0])} = {meant};")


def counter(c, rng):
    clock, enable = c.clock(), c.signal(1, "input")
    count = c.signal(rng.randint(2, 6), rng.choice((None, "output")))
    down, toggle = c.chance(.5), [1]
    for place in reversed(range(len(count))):
        bit, inverse, following = [count[place]], c.nets(1) if down else [], c.nets(1)
        carry = c.nets(1) if place else c.signal(1, "output")
        c.cell("XOR2", A=bit, B=toggle, Y=following)
        c.cell("AND2", A=toggle, B=inverse or bit, Y=carry)
        c.cell("DFF", **clock, E=enable, D=following, Q=bit, QN=inverse)
        toggle = carry
    c.register(count, f"if ({cat(enable)}) @ <= @ {'+-'[down]} 1;")
    c.model.append(f"assign {cat(toggle)} = {('&', '~|')[down]}{cat(count)};")
    if not count[0][0].way:
        c.alias(c.signal(len(count), "output"), count)


class RandomLogic:
    """Knows the bits that may be read and those that nothing drives so far."""

    def __init__(self, c, rng):
        self.c, self.rng, self.ready, self.todo = c, rng, [], []
        while len(self.ready) < 10:
            self.ready += c.signal(rng.choice((1, 1, 2, 4, 7)), "input")
        self.inputs = list(self.ready)
        c.modelled, a, sums = True, self.ready[:3], c.signal(1, "output") + c.signal(1, "output")
        c.cell("FA", A=a[:1], B=a[1:2], CI=a[2:], S=sums[:1], CO=sums[1:])
        self.ready += sums
        for _ in range(rng.randint(5, 12)):
            self.todo += c.signal(rng.choice((1, 1, 3, 4, 8, 18)), rng.choice((None, "output")))
        for bits in [c.signal(rng.randint(5, 9)) for _ in range(rng.randrange(3))]:
            bits[0][0].grows, start = True, rng.randrange(2)
            if c.chance(.5):
                c.alias(c.signal(2, rng.choice((None, "output"))), bits[start:start + 2])
            else:
                pins = {"A": self.read(4), "B": self.read(4), "S": self.read(1)}
                c.cell("MUX2X4", **pins, Y=bits[start:start + 4])
                self.ready += bits[start:start + 4]
            c.first.append(c.lines.pop())
            c.alias(c.signal(len(bits), "output"), bits)
            self.todo += [bit for bit in bits if bit not in self.ready]
        registers, clock, comb = [], c.clock() if c.chance(.6) else None, self.todo
        self.todo = [bit for width in rng.choices((1, 1, 4, 10, 20), k=3 if clock else 0)
                     for bit in c.signal(width, rng.choice((None, "output")))]
        while self.todo:
            kind, width = rng.choice((("DFF", 1), ("REG8", 8)))
            if outputs := self.drive(width):
                registers.append((kind, outputs))
                self.ready += outputs
        self.todo = comb
        while self.todo:
            if c.chance(.1) and self.alias():
                continue
            kind = rng.choice([kind for kind in CELLS if CELLS[kind][2]] + ["XOR2", "FA", "MUX2X4"])
            before = self.todo
            found = {pin: self.drive(width) for pin, _, width in pins_of(kind, 1)
                     if pin != "CO" or c.chance(.8)}
            if None in found.values():
                self.todo = before
                continue
            c.cell(kind, **found, **{pin: self.read(width) for pin, _, width in pins_of(kind, 0)})
            self.ready += sum(found.values(), [])
        for kind, outputs in registers:
            c.cell(kind, **clock, E=self.read(1), D=self.read(len(outputs)), Q=outputs,
                   QN=c.signal(1, "output") if kind == "DFF" and c.chance(.5) else None)
        if c.chance(.3):
            c.spare = True
            c.cell(rng.choice(list(CELLS)))

    def run(self, bits, fits, most):
        """One of these bits on a signal that fits, and as many of its neighbours."""
        found = [self.rng.choice([bit for bit in bits if fits(bit[0])])]
        while len(found) < most and (found[0][0], found[-1][1] + 1) in bits:
            found.append((found[0][0], found[-1][1] + 1))
        return found

    def drive(self, count):
        """Bits for an output: neighbours, if they are found easily, else any that fit."""
        for _ in range(5 if self.todo else 0):
            found = self.run(self.todo, lambda signal: True, count)
            if len(found) == count:
                break
        else:
            free = [bit for bit in self.todo if not bit[0].dummy]
            if len(free) < count:
                return None
            found = self.rng.sample(free, count)
            for signal, _ in found:
                signal.split = bool(signal.indices)
        self.todo = [bit for bit in self.todo if bit not in found]
        return found

    def read(self, count):
        """Bits for an input. With a port that is read a compound must begin with one and have
        neither an input port nor a constant in it, as all of its signals get a dummy."""
        def fits(signal):
            if led:
                return not signal.split and signal.way == "output" if not found else (
                    not signal.split and signal.way != "input")
            return signal.way != "output" or count == most and not signal.split

        found, led, most = [], False, count
        if self.c.chance(.05):
            return self.rng.choices((0, 1), k=count)
        for _ in range(4):
            # Half of the inputs are ports: bits that are far from a port hardly change.
            found = self.run(self.inputs if self.c.chance(.5) else self.ready, fits, count)
            if len(found) == count:
                break
        else:
            found, led, most = [], self.c.chance(.5), 0
            led = led and any(fits(signal) for signal, _ in self.ready)
            while len(found) < count:
                if not led and self.c.chance(.1):
                    found.append(self.rng.randrange(2))
                else:
                    found += self.run(self.ready, fits, self.rng.randint(1, count - len(found)))
        for bit in found:
            if not isinstance(bit, int) and (led or bit[0].way == "output"):
                bit[0].dummy = True
        return found

    def alias(self):
        """A part of a signal takes the value of another. One bit of a bus has no form for that."""
        count = self.rng.choice((1, 3, 8))
        target = self.run(self.todo, lambda signal: True, count)
        source = self.run(self.ready, lambda signal: signal.way != "output", len(target))
        target = target[:len(source)]
        single = len(source) == 1
        if target[0][0].grows or single and (target[0][0].indices or source[0][0].indices):
            return False
        self.c.alias(target, source)
        self.todo = [bit for bit in self.todo if bit not in target]
        self.ready += target
        return True


KINDS = {"shifter": shifter, "counter": counter, "register_file": register_file,
         "random_logic": RandomLogic}


def main():
    kind, seed, folder = sys.argv[1:]
    if kind == "all":
        kind = list(KINDS)[int(seed) % len(KINDS)]
    name = f"{kind}_{seed}"
    circuit = Circuit(name, random.Random(name))
    KINDS[kind](circuit, circuit.rng)
    os.makedirs(folder, exist_ok=True)
    for end, lines in ((".cmd", circuit.commands()), ("_ref.v", circuit.reference())):
        with open(os.path.join(folder, name + end), "w", encoding="ascii") as file:
            file.write("\n".join(lines) + "\n")


main()
