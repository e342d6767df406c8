#!/usr/bin/env bash
# Lists the framework functions and data that the built module takes from
# TavixCore and compares them with the module's pinned list: names the
# framework's contract gives, and nothing else of the library. A change to
# the list is a change of the contract. The classes' run-time type records,
# which the compiler refers to as flags ask (the vptr sanitizer, say), are left out.
#   import_audit.sh elf MODULE TAVIXCORE EXPECTED   (undefined dynamic symbols that TavixCore defines)
#   import_audit.sh pe MODULE EXPECTED              (the TavixCore.dll entries of the import table)
set -euo pipefail
abi=${1:?usage: import_audit.sh elf|pe MODULE [TAVIXCORE] EXPECTED}
module=${2:?module}
if [ "$abi" = elf ]; then
  core=${3:?TavixCore library}
  expected=${4:?expected list}
  defined=$(nm -D --defined-only "$core" | awk '{print $3}' | sort -u)
  wanted=$(nm -D --undefined-only "$module" | awk '{print $2}' | sort -u)
  found=$(comm -12 <(printf '%s\n' "$defined") <(printf '%s\n' "$wanted") | c++filt |
    grep -v '^typeinfo ' | sort)
else
  expected=${3:?expected list}
  found=$("${READOBJ:-llvm-readobj}" --coff-imports "$module" |
    awk '/Name: /{dll = $2} /Symbol: / && dll == "TavixCore.dll" {print $2}' |
    "${UNDNAME:-llvm-undname}" | grep -v -e '^$' -e '^[?]' | sort)
fi
if ! differences=$(diff <(sed -e '/^#/d' -e '/^$/d' "$expected") <(printf '%s\n' "$found")); then
  echo "import audit failed for $module (< pinned, > imported):"
  printf '%s\n' "$differences" | grep '^[<>]'
  exit 1
fi
echo "import audit passed: $(printf '%s\n' "$found" | wc -l) names from TavixCore"
