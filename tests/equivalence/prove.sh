#!/usr/bin/env bash
# prove.sh TOOL FOLDER [--swap INSTANCE PIN PIN]: lets TOOL write the design of FOLDER/NAME.cmd and
# proves that both files have the function of FOLDER/NAME_ref.v.
#
# With --swap the two pins of that instance exchange their nets in both files. Then success means
# that the files are still accepted, but that each of the proofs finds a difference.
set -euo pipefail
here=$(cd "$(dirname "${BASH_SOURCE[0]}")" && pwd)
tool=$(realpath "$1") folder=$(realpath "$2")
name=$(basename "$folder"/*.cmd .cmd)
work=$(mktemp -d)
trap 'rm -rf "$work"' EXIT
cd "$work"

die() {
    echo "$name: $1"
    [[ ! -s log ]] || tail -n 10 log
    exit 1
}

# quiet WHAT COMMAND...: COMMAND succeeds and says nothing.
quiet() {
    local what=$1
    shift
    if ! "$@" > log 2>&1 || [[ -s log ]]; then
        die "$what"
    fi
}

# verdict PROOF ANSWER: an answer is "same" or "differs".
expected=same
verdict() {
    echo "$name: $1: $2"
    [[ $2 == "$expected" ]] || die "expected: $expected"
}

# A pin occurs in its instance as .PIN(NET) in Verilog, as PIN=>NET or PIN(RANGE)=>NET in VHDL.
swap() {
    cp "$name.v" old.v
    cp "$name.vhd" old.vhd
    sed -i "/ $1 (/,/;/{ s/\.$2(/.@(/; s/\.$3(/.$2(/; s/\.@(/.$3(/ }" "$name.v"
    local range='\(([^)]*)\)\?=>'
    sed -i "/^ *$1 : /,/;/{ s/\<$2$range/@\1=>/; s/\<$3$range/$2\1=>/; s/@/$3/ }" "$name.vhd"
    ! cmp -s "$name.v" old.v || die "Verilog: $* is not there"
    ! cmp -s "$name.vhd" old.vhd || die "VHDL: $* is not there"
    expected=differs
}

# side MODULE FILE...: makes MODULE.il, the flat netlist of the files; each net has one driver.
side() {
    quiet "yosys: $1" yosys -q -p "read_verilog ${*:2}; hierarchy -check -top $name; proc
        check -assert; flatten; opt_clean; check -assert; rename $name $1; write_rtlil $1.il"
}

# Equivalence by nets of the same name: if the registers of both sides are equal once, they and the
# outputs stay equal for ever. Simulation shows the rest: that they become equal out of reset, and which
# side of an assign drives the other, as Yosys takes both for one net.
prove() {
    yosys -QT -p "read_rtlil gold.il; read_rtlil gate.il; equiv_make gold gate equiv
        hierarchy -top equiv; opt_clean; equiv_simple; equiv_induct -seq 2
        equiv_status -assert" > log 2>&1 && return
    grep -q '^ERROR: Found [0-9]* unproven' log || die 'yosys gives up'
    false
}

# simulate_verilog OUT FILE...
simulate_verilog() {
    quiet 'bench in Verilog' iverilog -s bench -o "$1.vvp" bench.v "${@:2}"
    vvp -n "$1.vvp" > "$1"
}

"$tool" run --output-dir . "$folder/$name.cmd" > log 2>&1 || die 'the tool fails'
[[ ${3-} != --swap ]] || swap "${@:4}"

# No file may use an implicit net.
{ echo '`default_nettype none'; cat "$name.v"; } > strict.v
quiet iverilog iverilog -t null -g2001 -Wall -Wno-portbind -s "$name" "$here/cells.v" strict.v
quiet verilator verilator --lint-only -Wall -Wno-DECLFILENAME -Wno-LITENDIAN \
    -Wno-PINCONNECTEMPTY -Wno-UNUSED -Wno-UNOPTFLAT --top-module "$name" "$here/cells.v" strict.v
quiet 'vendor library' ghdl -a --std=93 --work=KORBAL "$here/korbal.vhd"
quiet ghdl ghdl -a --std=93 "$here/cells.vhd" "$name.vhd"
quiet 'ghdl, configuration' ghdl --elab-run --std=93 "CFG_$name" --stop-time=0ns --assert-level=none

side gold "$folder/${name}_ref.v"
side gate "$here/cells.v" strict.v
if prove; then answer=same; else answer=differs; fi
verdict 'equivalence of the Verilog' "$answer"

python3 "$here/bench.py" "$folder/$name.cmd"
simulate_verilog expected.txt "$folder/${name}_ref.v"
# A simulation that ends early, gives X or Z, or changes less than half of the outputs proves nothing.
awk '/[^01]/ { exit bad = 1 }
    { for (k = 1; k <= length($0); ++k) seen[k, substr($0, k, 1)]; width = length($0) }
    END { for (k = 1; k <= width; ++k) moved += (k, 0) in seen && (k, 1) in seen
          exit bad || NR < 1000 || moved <= width / 2 }' expected.txt ||
    die 'the vectors are too weak'

simulate_verilog verilog.txt "$here/cells.v" strict.v
quiet 'bench in VHDL' ghdl -a --std=93 bench.vhd
ghdl --elab-run --std=93 bench --assert-level=none > vhdl.txt 2> log || die 'simulation of the VHDL'
for language in verilog vhdl; do
    if diff expected.txt "$language.txt" > log; then answer=same; else answer=differs; fi
    verdict "simulation of $language, $(wc -l < expected.txt) vectors" "$answer"
done
