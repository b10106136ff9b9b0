#!/usr/bin/env python3
"""ratios.py NOW LAST: prints the CPU times of the steps of two runs and their ratio, then NOW becomes
LAST. Both are what Google Benchmark writes as JSON. A step that only one of them has gets no ratio.
"""
import json
import os
import sys


def steps(file):
    """CPU time of a round by name; nothing if there is no such run."""
    if not os.path.exists(file):
        return {}
    with open(file, encoding="utf-8") as run:
        return {step["name"]: (step["cpu_time"], step["time_unit"])
                for step in json.load(run)["benchmarks"] if step["run_type"] == "iteration"}


now, last = steps(sys.argv[1]), steps(sys.argv[2])
if last:
    print(f"\n{'step':<32}{'now':>15}{'last':>15}  ratio")
    for name, (time, unit) in now.items():
        before = last.get(name)
        change = f"{before[0]:12.0f} {before[1]}{time / before[0]:7.2f}" if before else f"{'-':>15}"
        print(f"{name:<32}{time:12.0f} {unit}{change}")
with open(sys.argv[2], "w", encoding="utf-8") as kept:
    json.dump({"benchmarks": [{"name": name, "cpu_time": time, "time_unit": unit,
                               "run_type": "iteration"}
                              for name, (time, unit) in {**last, **now}.items()]}, kept)
