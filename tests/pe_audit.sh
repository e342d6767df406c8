#!/usr/bin/env bash
# Reads a Windows binary's tables and fails unless they hold what a host, a
# user's machine and its scanners expect:
#   exports MODULE       exactly the five plain functions and the plug-in's two
#                        members, decorated in the Microsoft C++ ABI;
#   imports MODULE       imports from TavixCore.dll, kernel32 and the UCRT's
#                        api-ms-win-crt-* set only;
#   shipping BINARY      hardened as the Microsoft toolchain hardens (ASLR with
#                        high entropy, no-execute data, control-flow guard, CET
#                        shadow stacks, a load configuration with the stack
#                        cookie), with a version resource and a PDB named
#                        without its folder; no manifest in a DLL;
#   thread-state MODULE  no thread-local storage and no guarded statics, so that
#                        no hidden state runs per thread.
set -euo pipefail
table=${1:?usage: pe_audit.sh exports|imports|shipping|thread-state FILE}
module=${2:?usage: pe_audit.sh exports|imports|shipping|thread-state FILE}
readobj=${READOBJ:-llvm-readobj}

# fails with what was looked for, when a pattern is not in the text.
check() {  # WHAT PATTERN TEXT
  if ! grep -qE "$2" <<<"$3"; then
    echo "$table audit failed for $module: $1"
    exit 1
  fi
}

if [ "$table" = shipping ]; then
  headers=$("$readobj" --file-headers "$module")
  for flag in DYNAMIC_BASE HIGH_ENTROPY_VA NX_COMPAT GUARD_CF; do
    check "no $flag" "IMAGE_DLL_CHARACTERISTICS_$flag" "$headers"
  done
  config=$("$readobj" --coff-load-config "$module")
  check "no load configuration" 'LoadConfigTableSize: 0x[1-9A-F]' "$headers"
  check "no stack cookie in the load configuration" 'SecurityCookie: 0x[1-9A-F]' "$config"
  check "no guard tables (CF_INSTRUMENTED)" 'GuardFlags: 0x[0-9A-F]*[1-9A-F]00$' "$config"
  debug=$("$readobj" --coff-debug-directory "$module")
  check "not CET-compatible" 'IMAGE_DLL_CHARACTERISTICS_EX_CET_COMPAT' "$debug"
  check "no PDB named without its folder" 'PDBFileName: [^/\\]+\.pdb$' "$debug"
  resources=$("$readobj" --coff-resources "$module")
  check "no version resource" 'Type: VERSIONINFO' "$resources"
  if [ "${module##*.}" != exe ] && grep -q 'Type: MANIFEST' <<<"$resources"; then
    echo "shipping audit failed for $module: a manifest in a DLL"
    exit 1
  fi
  echo "shipping audit passed: $module"
  exit 0
fi

if [ "$table" = thread-state ]; then
  check "thread-local storage" 'TLSTableSize: 0x0$' "$("$readobj" --file-headers "$module")"
  if grep -qE 'Symbol: (_Init_thread_|_tls_|__dyn_tls)' <<<"$("$readobj" --coff-imports "$module")"; then
    echo "thread-state audit failed for $module: it imports thread-safe-static or TLS support"
    exit 1
  fi
  echo "thread-state audit passed: $module"
  exit 0
fi

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
  if [ -n "$unexpected" ] || ! grep -qx TavixCore.dll <<<"$found"; then
    echo "import audit failed for $module; it imports:"
    printf '  %s\n' $found
    exit 1
  fi
fi
echo "$table audit passed: $(printf '%s\n' "$found" | wc -l) $table"
printf '  %s\n' $found
