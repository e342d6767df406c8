#!/usr/bin/env bash
# Reads a Windows module's export or import table and fails unless it holds
# exactly what a host expects: the five plain functions and the plug-in's two
# members, decorated in the Microsoft C++ ABI; imports from TavixCore.dll,
# kernel32 and the UCRT's api-ms-win-crt-* set only.
#   pe_audit.sh exports|imports MODULE
set -euo pipefail
table=${1:?usage: pe_audit.sh exports|imports MODULE}
module=${2:?usage: pe_audit.sh exports|imports MODULE}
readobj=${READOBJ:-llvm-readobj}

if [ "$table" = exports ]; then
  found=$("$readobj" --coff-exports "$module" | sed -n 's/^ *Name: \(..*\)$/\1/p' | sort)
  expected=$(printf '%s\n' apiVersion isDebug getNumPlugins getPlugin isRuvan \
    '?createInstance@TavixStringCommandsPlugin@@SAPEAV1@XZ' \
    '?deleteThis@TavixStringCommandsPlugin@@UEAAXXZ' | sort)
  if [ "$found" != "$expected" ]; then
    echo "export audit failed for $module (< expected, > exported):"
    diff <(printf '%s\n' "$expected") <(printf '%s\n' "$found") | grep '^[<>]' || true
    exit 1
  fi
else
  found=$("$readobj" --coff-imports "$module" | sed -n 's/^ *Name: \(.*\.dll\)$/\1/p' | sort -u)
  unexpected=$(printf '%s\n' "$found" | grep -viE '^(TavixCore\.dll|kernel32\.dll|api-ms-win-crt-[a-z]+-l1-1-0\.dll)$' || true)
  if [ -n "$unexpected" ] || ! printf '%s\n' "$found" | grep -qx TavixCore.dll; then
    echo "import audit failed for $module; it imports:"
    printf '  %s\n' $found
    exit 1
  fi
fi
echo "$table audit passed: $(printf '%s\n' "$found" | wc -l) $table"
printf '  %s\n' $found
