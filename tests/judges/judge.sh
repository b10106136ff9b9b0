#!/usr/bin/env bash
# judge.sh FOLDER [TOOL]: asks independent readers whether the written files that FOLDER/judge lists
# are legal; with a TOOL, those that it writes when it runs the command file of FOLDER. GHDL analyses
# and elaborates VHDL-93, Icarus and Verilator read Verilog. 77: no reader here.
set -euo pipefail
judges=$(cd "$(dirname "${BASH_SOURCE[0]}")" && pwd)
folder=$(cd "$1" && pwd)

for reader in ghdl iverilog verilator; do
    command -v "$reader" > /dev/null || {
        echo "judge.sh: $reader is not installed"
        exit 77
    }
done

work=$(mktemp -d)
trap 'rm -rf "$work"' EXIT
cd "$work"

# Cells without a configuration get the default binding of the simulator.
judge_vhdl() {
    local -a options=(--std=93 -P"$work" -Wno-binding)
    local top
    top=$(sed -n 's/^configuration \([^ ]*\) of .*/\1/p' "$1")
    top=${top:-$(sed -n 's/^entity \([^ ]*\) is.*/\1/p' "$1")}
    rm -f ./*.cf &&
        ghdl -a "${options[@]}" --work=KORBAL "$judges/kelements.vhd" &&
        ghdl -a "${options[@]}" "$judges/cells.vhd" &&
        ghdl -a "${options[@]}" "$1" &&
        ghdl -r "${options[@]}" "$top" --stop-time=0ns
}

# Open inputs and ascending buses are what the design asks for.
judge_verilog() {
    local top
    top=$(sed -n 's/^module \([^(]*\)(.*/\1/p' "$1")
    iverilog -Wall -Wno-portbind -t null -s "$top" "$1" "$judges/cells.v" &&
        verilator --lint-only -Wno-LITENDIAN --top-module "$top" -v "$judges/cells.v" "$1"
}

judge() {
    case $1 in
        *.vhd) judge_vhdl "$1" ;;
        *.v) judge_verilog "$1" ;;
        *) echo 'neither .vhd nor .v' && return 1 ;;
    esac
}

written=$folder
if (($# > 1)); then
    written=$work/written
    mkdir "$written"
    "$2" run --output-dir "$written" "$folder/${folder##*/}.cmd"
fi

files() { if [[ $written == "$folder" ]]; then cat judge; else ls; fi; }

# Any message of a reader counts as a complaint.
failures=0
while read -r file; do
    if ! said=$(judge "$written/$file" 2>&1) || [[ -n $said ]]; then
        printf '%s:\n%s\n' "$file" "$said"
        failures=$((failures + 1))
    fi
done < <(cd "$written" && files)
exit $((failures > 0))
