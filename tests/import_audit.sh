#!/usr/bin/env bash
# Lists what the built module takes from TavixCore, by qualified name, and
# fails on any name that tests/expected/imports.txt does not hold: the names
# of the framework's contract that the module may use, and nothing else of
# the library (no private member, no helper of the stand-in). Changing that
# file changes the contract. The classes' run-time type records, which the
# compiler refers to as flags ask (the vptr sanitizer, say), are left out.
#   import_audit.sh elf MODULE TAVIXCORE ALLOWED   (undefined dynamic symbols that TavixCore defines)
#   import_audit.sh pe MODULE ALLOWED              (the TavixCore.dll entries of the import table)
set -euo pipefail
abi=${1:?usage: import_audit.sh elf|pe MODULE [TAVIXCORE] ALLOWED}
module=${2:?module}
if [ "$abi" = elf ]; then
  core=${3:?TavixCore library}
  allowed=${4:?allowed names}
  defined=$(nm -D --defined-only "$core" | awk '{print $3}' | sort -u)
  wanted=$(nm -D --undefined-only "$module" | awk '{print $2}' | sort -u)
  signatures=$(comm -12 <(printf '%s\n' "$defined") <(printf '%s\n' "$wanted") | c++filt |
    grep -v '^typeinfo ' || true)
else
  allowed=${3:?allowed names}
  signatures=$("${READOBJ:-llvm-readobj}" --coff-imports "$module" |
    awk '/Name: /{dll = $2} /Symbol: / && dll == "TavixCore.dll" {print $2}' |
    "${UNDNAME:-llvm-undname}" | grep -v -e '^$' -e '^[?]')
fi
# A signature's qualified name: what stands before its parameters, last word.
names=$(printf '%s\n' "$signatures" | sed -e 's/(.*//' -e 's/.* //' -e 's/^\*//' | sort -u)
unlisted=$(comm -23 <(printf '%s\n' "$names") <(sed -e '/^#/d' -e '/^$/d' "$allowed" | sort -u))
if [ -n "$unlisted" ]; then
  echo "import audit failed for $module: it takes from TavixCore what the contract does not name:"
  printf '  %s\n' $unlisted
  exit 1
fi
echo "import audit passed: $(printf '%s\n' "$names" | wc -l) names from TavixCore, each of the contract"
