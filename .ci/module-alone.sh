#!/usr/bin/env bash
# Installs the stand-in TavixCore SDK from a build folder into a fresh prefix,
# builds the module alone against it, twice (through the SDK's CMake package,
# and through FindTavixCore.cmake with only its headers and library), and runs
# every script case with the SDK's console on each module built; the module's
# TavixCore imports must be the pinned ones.
#   module-alone.sh linux|windows BUILD-FOLDER WORK-FOLDER
set -euo pipefail
platform=$1
build=$2
work=$(mktemp -d "$3/module-alone.XXXXXX")
cd "$(dirname "$0")/.."
cmake --install "$build" --prefix "$work/sdk" >/dev/null
configure=(-G Ninja -DCMAKE_BUILD_TYPE=Release)
if [ "$platform" = windows ]; then
  configure+=(--toolchain "$PWD/cmake/msabi.cmake")
  host=(env WINEDEBUG=-all WINEDLLOVERRIDES=mscoree,mshtml= wine "$work/sdk/bin/tavix-host.exe")
else
  host=("$work/sdk/bin/tavix-host")
fi
for finder in "-DCMAKE_PREFIX_PATH=$work/sdk" "-DTAVIXCORE_ROOT=$work/sdk"; do
  module="$work/module${finder%%=*}"
  cmake -S module -B "$module" "${configure[@]}" "$finder" >/dev/null
  cmake --build "$module" >/dev/null
  for cases in tests/cases/*.tavix; do
    "${host[@]}" --module "$module/TavixStringCmds.hll" --check "$cases" >/dev/null ||
      { "${host[@]}" --module "$module/TavixStringCmds.hll" --check "$cases"; exit 1; }
  done
  if [ "$platform" = windows ]; then
    bash tests/import_audit.sh pe "$module/TavixStringCmds.hll" tests/expected/imports.txt
  else
    bash tests/import_audit.sh elf "$module/TavixStringCmds.hll" "$work/sdk/lib/TavixCore.so" \
      tests/expected/imports.txt
  fi
done
echo "the module alone ($platform): every script case as expected, with both ways of finding the SDK"
