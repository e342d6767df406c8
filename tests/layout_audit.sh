#!/usr/bin/env bash
# Lays out, for both C++ ABIs the module is built in (Itanium on Linux,
# Microsoft on Windows), the framework types the module holds or reads by
# value and the command that embeds one, and compares their sizes and member
# offsets with layout_table.txt. The module's inline code and its objects
# depend on these layouts; a framework release that changes them needs the
# module rebuilt.
set -euo pipefail
source "$(dirname "$0")/abi_probe.sh"

# Records whose members are pinned, and records whose size alone is (their
# members are the framework's own; the module only needs their size).
members='HString TArray<HString> StrTokCmd'
sizes='HStringArray Variable CommandOption Command'
probe='
#include "commands/hstring_array.h"
#include "commands/token.h"
unsigned long long probe() {
  return sizeof(Variable) + sizeof(CommandOption) + sizeof(HStringArray) + sizeof(StrTokCmd);
}'

layOut() {  # ABI
  compileProbe "$1" -fdump-record-layouts |
    awk -v abi="$1" -v members="$members" -v sizes="$sizes" '
      function clean(text) { gsub(/(class|struct|enum) /, "", text); gsub(/ \*/, "*", text); return text }
      BEGIN {
        n = split(members, m, " "); for (i = 1; i <= n; i++) want[m[i]] = "members"
        n = split(sizes, s, " "); for (i = 1; i <= n; i++) want[s[i]] = "size"
      }
      /Dumping AST Record Layout/ { record = ""; named = 0; next }
      !named && /^ *0 \| / { sub(/^ *0 \| /, ""); record = clean($0); named = 1; next }
      record in want && want[record] == "members" && /^ *[0-9]+ \|   [^ ]/ {
        offset = $1; sub(/^ *[0-9]+ \|   /, ""); print abi, record, offset, clean($0)
      }
      record in want && /\[sizeof=/ {
        match($0, /sizeof=[0-9]+/); print abi, record, "size", substr($0, RSTART + 7, RLENGTH - 7)
        record = ""
      }'
}

# A row the two ABIs share is written once, as "both".
actual=$({
  layOut itanium
  layOut microsoft
} | awk '{ abi = $1; $1 = ""; row = substr($0, 2); seen[row] = seen[row] abi }
         END { for (row in seen) print (seen[row] == "itaniummicrosoft" ? "both" : seen[row]), row }' |
  sort -k2,2 -k3,3n -k1,1 | uniq)
expected=$(sed -e '/^#/d' -e '/^$/d' "$here/layout_table.txt" | sort -k2,2 -k3,3n -k1,1 | uniq)
if ! differences=$(diff <(printf '%s\n' "$expected") <(printf '%s\n' "$actual")); then
  echo "layout audit failed (< expected, > built):"
  printf '%s\n' "$differences" | grep '^[<>]'
  exit 1
fi
echo "layout audit passed: $(printf "%s\n" "$actual" | wc -l) rows, for both ABIs"
