#!/usr/bin/env python3
"""run.py TOOL: the cases of *.cases: for each check designs that trip it and that just do not.

What the tool finds has to be what a case says, and nothing in its clean design. Both are written,
and independent readers have to refuse of the first exactly the languages that the case says, of the
second none: GHDL reads VHDL-93, Icarus and Verilator read Verilog. A case may instead say, by
regular expressions, what wrong text is there. The head of a case is `### CHECK`, then, separated by
semicolons, `alone` (without prelude.cmd), `refused LANGUAGE...`, `shows LANGUAGE EXPRESSION`. A
backslash, x and two digits in its commands are the character of that number.
"""

import concurrent.futures
import json
import os
import pathlib
import re
import shutil
import subprocess
import sys
import tempfile

HERE = pathlib.Path(__file__).resolve().parent
KELEMENTS = HERE.parents[1] / "judges" / "kelements.vhd"
PAGE = HERE.parents[2] / "docs" / "checks.md"
TOOL = os.path.abspath(sys.argv[1])
WRITES = "WRITE VHDL -NOHEADER out.vhd\nWRITE VERILOG -NOHEADER out.v\n"


def run(folder, *command):
    return subprocess.run(command, cwd=folder, capture_output=True, text=True, errors="replace")


def ports_of(component, commands):
    return dict((port[0], port[1:]) for port in re.findall(
        rf"^ADD PIN {component} (\w+)(?:[(\[](\d+)(?::(\d+))?[)\]])? (\w)", commands, re.M))


def stubs(commands):
    """A module for each component, with the parameters that the design knows; an entity with a
    configuration."""
    parameters = sorted(set(re.findall(r"ATTRIBUTE (?:BUF|keep) (?:-TYPE=\w+ )?(\w+)", commands)))
    verilog, vhdl = "", ""
    for name in re.findall(r"^ADD COMPONENT (\w+)$", commands, re.M):
        ports, entity = [], []
        for base, (left, right, way) in ports_of(name, commands).items():
            bounds = f"[{left}:{right or 0}] " if left else ""
            ports.append(f"{dict(i='input', o='output', b='inout')[way]} {bounds}{base}")
            entity.append(f"{base} : {dict(i='in', o='out', b='inout')[way]} std_logic" + (
                f"_vector({left} downto {right or 0})" if left else ""))
        verilog += f"module {name}({', '.join(ports)});\n"
        verilog += "".join(f"parameter {p} = 0;\n" for p in parameters) + "endmodule\n"
        if name != "work":
            vhdl += (f"library ieee; use ieee.std_logic_1164.all; entity {name} is "
                     f"{'port (' * bool(entity)}{'; '.join(entity)}{');' * bool(entity)} end;\n"
                     f"architecture a of {name} is begin end;\n"
                     f"configuration CFG_{name} of {name} is for a end for; end;\n")
    return verilog, vhdl


def accepts(folder, language, commands):
    """Whether the readers take a written file, and what they say."""
    top = re.findall(r"^SET NETLIST NAME (\S+)", commands, re.M)[-1]
    verilog, vhdl = stubs(commands)
    if language == "vhdl":
        (folder / "stubs.vhd").write_text(vhdl)
        files = ["stubs.vhd"] * ("CONFIGURATION false" in commands) + ["out.vhd"]
        steps = [["ghdl", "-a", "--std=93", "--work=KORBAL", KELEMENTS],
                 ["ghdl", "-a", "--std=93", "--ieee=synopsys", *files],
                 ["ghdl", "-r", "--std=93", "--ieee=synopsys", "-Wno-binding", top, "--stop-time=0ns"]]
    else:
        (folder / "stubs.v").write_text(verilog)
        steps = [["iverilog", "-t", "null", "-s", top, "out.v", "stubs.v"],
                 ["verilator", "--lint-only", "-Wno-lint", "-Wno-style", "-Wno-fatal",
                  "--top-module", top, "-v", "stubs.v", "out.v"]]
    for step in steps:
        done = run(folder, *step)
        if done.returncode != 0:
            return False, done.stdout + done.stderr
    return True, ""


def findings(folder, *arguments):
    found = run(folder, TOOL, "check", "--diagnostics", "json", *arguments).stderr.splitlines()
    return [one for one in map(json.loads, found) if one["severity"] != "count"]


def check(folder, check_name, *files):
    off = [] if check_name == "unused-component" else ["--off", "unused-component"]
    found = []
    for one in findings(folder, *off, *files):
        notes = [str(note) for note in one.get("notes", [])]
        found.append((one["file"], f"{one['line']}:{one['column']} "
                      f"{one.get('finding', one['message'])} {one.get('language', '')}"
                      + " with a note twice" * (len(notes) > len(set(notes)))))
    return found


def judge(case):
    """The faults of one case."""
    head, body = case.split("\n", 1)
    trips, finds, clean = re.split(r"^--- (?:finds|clean)\n", body, flags=re.M)
    name, *settings = [part.strip() for part in head.replace(";;", "\0").split(";")]
    settings = [part.replace("\0", ";") for part in settings]
    trips, clean = (re.sub(r"\\x([0-9A-F]{2})", lambda code: chr(int(code[1], 16)), text)
                    for text in (trips, clean))
    alone = "alone" in settings
    refused = [w for s in settings if s.startswith("refused ") for w in s.split()[1:]]
    shows = [s.split(" ", 2)[1:] for s in settings if s.startswith("shows ")]
    prelude = "" if alone else (HERE / "prelude.cmd").read_text()
    if name == "unused-component":  # of which the prelude has one
        prelude = re.sub(r".*BUF4.*\n", "", prelude)
    faults = []
    for kind, commands in ("trips", trips), ("clean", clean):
        with tempfile.TemporaryDirectory() as temporary:
            folder = pathlib.Path(temporary)
            (folder / "prelude.cmd").write_text(prelude)
            (folder / "case.cmd").write_text(commands + WRITES)
            files = ["case.cmd"] if alone else ["prelude.cmd", "case.cmd"]
            found = [text for file, text in check(folder, name, *files)]
            wanted = finds.splitlines() if kind == "trips" else []
            if found != wanted:
                faults.append(f"{kind}: found {found}")
            run(folder, TOOL, "run", *files)
            for language, file in ("vhdl", "out.vhd"), ("verilog", "out.v"):
                accepted, said = accepts(folder, language, prelude + commands)
                if accepted == (kind == "trips" and language in refused):
                    faults.append(f"{kind}: {file} is {'taken' if accepted else 'refused'}: {said}")
                text = (folder / file).read_text()
                hits = [bool(re.search(e, text)) for where, e in shows if where == language]
                if kind == "trips" and not all(hits) or kind == "clean" and hits and all(hits):
                    faults.append(f"{kind}: {file} shows {hits}:\n{text}")
    return [f"{name}: {fault}\n{trips}" for fault in faults]


def folds():
    """Values of all lengths, in each statement: found are those that the written text breaks."""
    owners = {"MODULE": "", "COMPONENT": "BUF ", "INSTANCE": "keep ", "SIGNAL": "x "}
    commands = (HERE / "prelude.cmd").read_text()
    for owner, word in owners.items():
        for length in range(30, 90):
            name = f"{owner[0]}{length}"
            generic = "-GENERIC=" + ("SYN" if length % 2 else "NOSYN")
            option = "-SYNATTR=ASSIGN" if owner == "SIGNAL" else generic
            commands += f'ADD {owner} ATTRIBUTE {word}{name} "{("ab " * 30)[:length - 1]}x"\n'
            commands += f"SET {owner} ATTRIBUTE OPTION {word}{name} {option}\n"
    with tempfile.TemporaryDirectory() as temporary:
        folder = pathlib.Path(temporary)
        (folder / "case.cmd").write_text(commands + WRITES)
        found = {re.match(r'attribute "(\w+)"', one["message"])[1]
                 for one in findings(folder, "--only", "folded-value", "case.cmd")}
        run(folder, TOOL, "run", "case.cmd")
        lines = (folder / "out.vhd").read_text().splitlines() + (folder / "out.v").read_text().splitlines()
        broken, name = set(), ""
        for line in lines:
            name = (re.findall(r"\b[MCIS]\d\d\b", line) or [name])[0]
            if line.count('"') % 2 == 1:
                broken.add(name)
    return [f"folds: {sorted(found ^ broken)}"] if found != broken or not broken else []


def options():
    """Exit codes, and what the options leave of four findings and a refused line."""
    design = "ADD PORT wire in\nADD PORT signal in\nADD SIGNAL n\nADD SIGNAL n\nADD COMPONENT C\n"
    good = "SET NETLIST NAME t\nADD PORT a in\n"
    # A write gives open pins nets, of which no line knows.
    opened = (good + "ADD COMPONENT C\nADD PIN C A in\nADD PIN C B out\nADD INSTANCE C u\n"
              "SET OPEN PIN false\nWRITE VHDL f.vhd\nCONNECT SIGNAL a u.A\nWRITE VHDL f.vhd\n")
    n, c, w, s = "3:unused-net", "5:unused-component", "1:reserved-word", "2:reserved-word"
    rows = [
        (design, 1, [w, s, n, c], []),
        (good, 0, [], ["--strict"]),
        (good + "ADD SIGNAL n", 0, [n], []),
        (good + "ADD SIGNAL n", 1, [n], ["--strict"]),
        (design, 1, [s, n, c], ["--language", "vhdl"]),
        (design + "WRITE VERILOG f.v\n", 1, [w, n, c], []),
        (design + "WRITE VERILOG f.v\n", 1, [w, s, n, c], ["--language", "both"]),
        (design, 1, [w, s], ["--off", "unused-net,unused-component"]),
        (design, 1, [w, s, c], ["--only", "unused-component", "--only", "reserved-word"]),
        (opened, 0, [], []),
        ("UPPERCASE siganl\n" + opened.replace("CONNECT", "WRITE VERILOG f.v\nCONNECT"), 0, [],
         ["--off", "case-differs"]),
        (good + "ADD SIGNAL n_openSignal\n", 0, ["3:unused-net"], []),
        (good, 2, [], ["--off", "nonsense"]),
        (good, 2, [], ["--language", "C"]),
    ]
    faults = []
    for commands, code, wanted, arguments in rows:
        done = subprocess.run([TOOL, "check", "--diagnostics", "json", *arguments, "-"],
                              input=commands, capture_output=True, text=True)
        said = [json.loads(line) for line in done.stderr.splitlines()] if code != 2 else []
        said = [one for one in said if one["severity"] != "count"]
        found = [f"{one['line']}:{one['finding']}" for one in said if "finding" in one]
        refused = [one["line"] for one in said if "finding" not in one]
        if (done.returncode, found) != (code, wanted) or refused != [4] * (design in commands):
            faults.append(f"{arguments}: exit code {done.returncode}, {found}, refused {refused}")
    if list(pathlib.Path().glob("f.v*")):
        faults.append("something was written")
    return faults


def inputs():
    """What cannot be read twice gives the same findings with the same lines, also beyond what is
    kept in memory, and a very long line is shown in part."""
    filler = "NOOP " + 100 * "x" + "\n"
    wide = "ADD SIGNAL " + 70000 * "w" + "\n"
    design = "ADD PORT wire in\r\n" + 12000 * filler + wide + "ADD SIGNAL n\r\r\nADD SIGNAL n"
    faults = []
    with tempfile.TemporaryDirectory() as folder:
        file, pipe = pathlib.Path(folder) / "f.cmd", pathlib.Path(folder) / "pipe"
        file.write_text(design, newline="")
        wanted = subprocess.run([TOOL, "check", file], capture_output=True, text=True).stderr
        if wanted.count("ADD SIGNAL n?\n") != 2 or not wanted.count("ADD SIGNAL n\n") or len(wanted) > 3000:
            faults.append(f"from a file: {wanted[:3000]}")
        os.mkfifo(pipe)
        for name, shown in ("-", "<stdin>"), (str(pipe), str(pipe)):
            tool = subprocess.Popen([TOOL, "check", name], stdin=subprocess.PIPE,
                                    stderr=subprocess.PIPE, text=True)
            if name == "-":
                said = tool.communicate(design, timeout=60)[1]
            else:
                pipe.write_text(design, newline="")
                said = tool.communicate(timeout=60)[1]
            if said != wanted.replace(str(file), shown):
                faults.append(f"from {shown}: {said[:3000]}")
    return faults


def main():
    missing = [tool for tool in ("ghdl", "iverilog", "verilator") if not shutil.which(tool)]
    if missing:
        print("not installed:", *missing)
        return 77
    cases = [case for file in sorted(HERE.glob("*.cases"))
             for case in file.read_text().split("### ")[1:]]
    faults = folds() + options() + inputs()
    listed = run(HERE, TOOL, "check", "--list", "--markdown").stdout
    if listed != PAGE.read_text():
        faults.append("docs/checks.md: not what `vesk-hdl check --list --markdown` prints")
    tried = {re.split(r"[;\n]", case)[0] for case in cases}
    faults += [f"{name}: no case" for name in re.findall(r"^\| `([\w-]+)`", listed, re.M)
               if name not in tried]
    with concurrent.futures.ThreadPoolExecutor(2) as pool:
        for found in pool.map(judge, cases):
            faults += found
    print(*faults, f"{len(cases)} cases, {len(faults)} faults", sep="\n")
    return 1 if faults else 0


sys.exit(main())
