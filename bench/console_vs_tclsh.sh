#!/usr/bin/env bash
# The console splitting a text of 200,000 comma-separated tokens and printing
# the array, against tclsh splitting the same text and printing the list:
# whole processes, side by side in one hyperfine run (Debian's hyperfine and
# tcl). Further consoles to compare (an older build, say) may follow.
#   bench/console_vs_tclsh.sh [TAVIX_HOST...]
set -euo pipefail
root=$(cd "$(dirname "$0")/.." && pwd)
hosts=("$@")
[ ${#hosts[@]} -gt 0 ] || hosts=("$root/build/default/bin/tavix-host")
work=$(mktemp -d)
trap 'rm -rf "$work"' EXIT

python3 - "$work" <<'PY'
import sys
work = sys.argv[1]
text = ",".join("tok%d" % (i % 10000) for i in range(200000))
open(f"{work}/tokens.txt", "w").write(text)
open(f"{work}/split.tavix", "w").write('strTokArray -delims "," "%s"\n' % text)
open(f"{work}/split.tcl", "w").write(
    "set f [open %s/tokens.txt]\nset text [read $f]\nclose $f\nputs [split $text ,]\n" % work)
PY

commands=()
for host in "${hosts[@]}"; do commands+=("$host $work/split.tavix"); done
hyperfine --warmup 3 --runs 30 --style basic --output=null \
  "${commands[@]}" "tclsh $work/split.tcl"
