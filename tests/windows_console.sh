#!/usr/bin/env bash
# The Windows console with names a user may give it, under wine: a script and
# a module folder named outside the system's code page, a load error told in
# words, and a module path longer than 260 characters.
#   windows_console.sh MODULE HOST-COMMAND...
set -euo pipefail
module=$1
shift
work=$(mktemp -d)
trap 'rm -rf "$work"' EXIT
cd "$work"
failed=0
expect() {  # WHAT PATTERN OUTPUT
  if grep -qE "$2" <<<"$3"; then
    echo "ok: $1"
  else
    printf 'FAILED: %s\n  expected to match: %s\n  got: %s\n' "$1" "$2" "$3"
    failed=1
  fi
}

mkdir 日本
cp "$module" 日本/
printf 'strLength "日本" # => 6\n' > '日本 да.tavix'
expect "names outside the code page" '^日本 да\.tavix: 1 cases as expected$' \
  "$("$@" --module 日本/TavixStringCmds.hll --check '日本 да.tavix' 2>&1)"

printf 'not a library\n' > w32.dll
expect "a load error in words" '^tavix-host: cannot load w32\.dll: [^(]+ \(error 193\)$' \
  "$("$@" --module w32.dll -e 'strLength a' 2>&1 || true)"

long=$(printf 'folder-%02d/' $(seq 1 30))
mkdir -p "$long"
cp "$module" "$long"
expect "a module path of ${#long} characters" '^3$' \
  "$("$@" --module "${long}TavixStringCmds.hll" -e 'strLength abc' 2>&1)"
exit $failed
