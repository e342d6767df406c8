#!/usr/bin/env bash
# Reads the export table of the Windows module and fails unless it holds
# exactly the five plain functions and the plug-in's two members.
set -euo pipefail
module=${1:?usage: export_audit.sh TavixStringCmds.hll}
objdump=${OBJDUMP:-x86_64-w64-mingw32-objdump}

exports=$("$objdump" -p "$module" |
  awk '/\[Ordinal\/Name Pointer\] Table/ { table = 1; next }
       table && /^[[:space:]]*\[ *[0-9]+\]/ { print $NF; next }
       table { table = 0 }' | sort)
# The two members carry this compiler's C++ name decoration.
expected=$(printf '%s\n' apiVersion isDebug getNumPlugins getPlugin isRuvan \
  _ZN25TavixStringCommandsPlugin14createInstanceEv \
  _ZN25TavixStringCommandsPlugin10deleteThisEv | sort)

if [ "$exports" != "$expected" ]; then
  echo "export audit failed for $module (< expected, > exported):"
  diff <(printf '%s\n' "$expected") <(printf '%s\n' "$exports") | grep '^[<>]' || true
  exit 1
fi
echo "export audit passed: $(printf '%s\n' "$exports" | wc -l) exports"
