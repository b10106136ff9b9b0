#!/usr/bin/env python3
"""check-pages.py TOOL SOURCE PAGE...: what the pages show is what happens.

Each page is run from top to bottom in a shell of its own, in an empty folder with a link `examples`
and with TOOL in the PATH. The info string of a fenced block says what it is:

    console      lines `$ COMMAND` and the output of each; a command fails only if `$ echo $?` follows
    save=NAME    a file that the reader writes
    file=NAME    a file that is there by now, byte for byte
    part=NAME    lines that are part of a file of SOURCE

Any other block is left alone.
"""
import difflib
import os
import re
import subprocess
import sys
import tempfile

# Lines that take minutes, with what runs in their place: the tool that is built already is used.
REPLACED = {
    "cmake --build --preset release > build.log":
        'mkdir -p build/release/tool && ln -s "$TOOL" build/release/tool/vesk-hdl',
}
MARK = "\x1e"
FENCE = re.compile(r"^```(\S+)(?: (save|file|part)=(\S+))?\n(.*?)^```$", re.M | re.S)


def blocks(page):
    """Line, kind, name and text of each block that is to be tried."""
    text = open(page, encoding="utf-8").read()
    for match in FENCE.finditer(text):
        kind = match[2] or match[1]
        if kind in ("console", "save", "file", "part"):
            yield text.count("\n", 0, match.start()) + 2, kind, match[3], match[4]


def check(tool, source, page):
    """Complaints about a page."""
    with tempfile.TemporaryDirectory() as work:
        room, script, expected = work + "/room", [], []
        os.mkdir(room)
        os.symlink(source + "/examples", room + "/examples")

        def step(line, command, output):
            script.append(f"{REPLACED.get(command, command)}\n__status=$?\n"
                          f"printf '{MARK}%d{MARK}' $__status; (exit $__status)\n")
            expected.append((line, command, output))

        for line, kind, name, text in blocks(page):
            if kind == "console":
                for part in re.split(r"^(?=\$ )", text, flags=re.M)[1:]:
                    command, _, output = part[2:].partition("\n")
                    step(line, command, output)
                    line += part.count("\n")
            elif kind == "save":
                saved = f"{work}/saved{line}"
                open(saved, "w", encoding="utf-8").write(text)
                step(line, f"cp {saved} {name}", "")
            elif kind == "file":
                step(line, f"cat {name}", text)
            elif text not in open(f"{source}/{name}", encoding="utf-8").read():
                yield f"{page}:{line}: not in {name}"

        open(work + "/script", "w", encoding="utf-8").write("".join(script))
        with open(work + "/.gitconfig", "w", encoding="utf-8") as config:
            # The checkout may be another user's, and on no branch.
            config.write("[safe]\n\tdirectory = *\n[advice]\n\tdetachedHead = false\n")
        environment = {"PATH": os.path.dirname(tool) + ":" + os.environ["PATH"], "LC_ALL": "C.UTF-8",
                       "HOME": work, "TOOL": tool, "REPOSITORY": source}
        said = subprocess.run(["bash", work + "/script"], cwd=room, env=environment, text=True,
                              stdin=subprocess.DEVNULL, stdout=subprocess.PIPE,
                              stderr=subprocess.STDOUT, check=False).stdout.split(MARK)
        outputs, states = said[0::2], said[1::2] + ["0"]
        asked = [command == "echo $?" for _, command, _ in expected[1:]] + [False]
        for (line, command, output), got, state, ask in zip(expected, outputs, states, asked):
            if got != output:
                difference = difflib.unified_diff(output.splitlines(True), got.splitlines(True),
                                                  "the page", "what came", n=1)
                yield f"{page}:{line}: $ {command}\n{''.join(difference)}"
            if state != "0" and not ask:
                yield f"{page}:{line}: $ {command}: exit code {state}"
        if not expected or len(states) <= len(expected):
            yield f"{page}: {len(states) - 1} of {len(expected)} commands were run"


def main():
    tool, source = map(os.path.realpath, sys.argv[1:3])
    complaints = [text for page in sys.argv[3:] for text in check(tool, source, page)]
    print("\n".join(complaints))
    return 1 if complaints else 0


sys.exit(main())
