#!/usr/bin/env python3
"""Draws the cost per token of the token commands against the number of
tokens, from command_bench's JSON output, as a PNG (with Debian's gnuplot).

    build/default/bin/command_bench --benchmark_filter=scaling --benchmark_repetitions=5 \\
        --benchmark_out=after.json --benchmark_out_format=json
    bench/plot_scaling.py scaling.png after.json [before.json]

Each JSON file gives one line per token command and mode; a second file is
drawn dashed, labelled with its name."""
import json
import os
import subprocess
import sys
import tempfile


def series(path):
    """{'strTokArray charSet': [(tokens, ns per token), ...], ...}, from the
    medians of repeated runs where there are some, else from the runs."""
    lines = {}
    runs = json.load(open(path))["benchmarks"]
    medians = any(run.get("aggregate_name") == "median" for run in runs)
    for run in runs:
        name = run["name"]  # BM_strTokArray_scaling/charSet/1000, or ..._median
        if medians:
            if run.get("aggregate_name") != "median":
                continue
            name = name[: -len("_median")]
        elif run.get("run_type") != "iteration":
            continue
        if "_scaling/" not in name or name.count("/") != 2:
            continue
        command, mode, tokens = name[3:].split("/")
        command = command.replace("_scaling", "").replace("_walk", " walk")
        nanoseconds = run["real_time"] * {"ns": 1, "us": 1e3, "ms": 1e6, "s": 1e9}[run["time_unit"]]
        lines.setdefault(f"{command} {mode}", []).append((int(tokens), nanoseconds / int(tokens)))
    return lines


def main():
    if len(sys.argv) < 3:
        sys.exit(__doc__)
    png, files = sys.argv[1], sys.argv[2:]
    work = tempfile.mkdtemp()
    plots = []
    for index, path in enumerate(files):
        label = os.path.splitext(os.path.basename(path))[0]
        for color, (name, points) in enumerate(sorted(series(path).items()), start=1):
            data = os.path.join(work, f"{index}-{color}.dat")
            with open(data, "w") as out:
                out.writelines(f"{tokens} {cost}\n" for tokens, cost in sorted(points))
            dash = "dashtype 2" if index > 0 else "dashtype 1"
            plots.append(f"'{data}' with linespoints lw 2 lc {color} {dash} title '{name} ({label})'")
    script = "\n".join([
        "set terminal pngcairo size 900,640 font 'sans,10'",
        f"set output '{png}'",
        "set title 'Cost per token against the number of tokens'",
        "set logscale x",
        "set xlabel 'tokens in the text'",
        "set ylabel 'ns per token'",
        "set yrange [0:*]",
        "set key outside below maxrows 4",
        "set grid",
        "plot " + ", ".join(plots),
    ])
    subprocess.run(["gnuplot"], input=script, text=True, check=True)


main()
