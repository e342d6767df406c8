#!/usr/bin/env bash
# Builds one commit twice, in two folders, with one SOURCE_DATE_EPOCH, and
# fails unless the results are the same byte for byte: the Linux module, and
# the Windows binaries with their three ZIPs. Then signs the Windows ZIPs'
# binaries with a throwaway self-signed certificate and verifies each.
#   reproducible-and-signed.sh WORK-FOLDER
set -euo pipefail
cd "$(dirname "$0")/.."
work=$(mktemp -d "$1/repro.XXXXXX")
SOURCE_DATE_EPOCH=$(git log -1 --format=%ct)
export SOURCE_DATE_EPOCH

same() {  # FILE-A FILE-B
  cmp "$1" "$2" || { echo "not reproducible: $1 and $2 differ"; exit 1; }
}

for build in one two; do
  cmake --preset default -B "$work/linux-$build" >/dev/null
  cmake --build "$work/linux-$build" --target TavixStringCmds >/dev/null
  cmake --preset windows -B "$work/windows-$build" >/dev/null
  cmake --build "$work/windows-$build" >/dev/null
  (cd "$work/windows-$build" && cpack >/dev/null)
done
same "$work"/linux-{one,two}/bin/TavixStringCmds.hll
for file in bin/TavixStringCmds.hll bin/TavixCore.dll bin/tavix-host.exe \
  TavixStringCmds-2.0-windows-x64.zip TavixStringCmds-2.0-windows-x64-symbols.zip \
  TavixCore-sdk-2.0-windows-x64.zip; do
  same "$work/windows-one/$file" "$work/windows-two/$file"
done
echo "reproducible: the Linux module, the Windows binaries and the three ZIPs"

openssl req -x509 -newkey rsa:2048 -nodes -days 1 -subj "/CN=TavixStringCmds CI signing" \
  -addext extendedKeyUsage=codeSigning -keyout "$work/key.pem" -out "$work/cert.pem" 2>/dev/null
(cd "$work/windows-one" &&
  TAVIX_SIGN_CERT="$work/cert.pem" TAVIX_SIGN_KEY="$work/key.pem" cpack >/dev/null)
mkdir "$work/signed"
for zip in TavixStringCmds-2.0-windows-x64.zip TavixCore-sdk-2.0-windows-x64.zip; do
  unzip -q -o "$work/windows-one/$zip" -d "$work/signed"
done
for binary in TavixStringCmds.hll bin/TavixCore.dll bin/tavix-host.exe; do
  osslsigncode verify -CAfile "$work/cert.pem" -in "$work/signed/$binary" >/dev/null ||
    { echo "signature does not verify: $binary"; exit 1; }
done
WINEDEBUG=-all WINEDLLOVERRIDES=mscoree,mshtml= wine "$work/signed/bin/tavix-host.exe" \
  --module "$work/signed/TavixStringCmds.hll" --check docs/commands.md
echo "signed: the module, TavixCore and the console verify, and run"
