#!/usr/bin/env bash
# Compiles the host headers and the module's classes for the Microsoft C++ ABI
# and compares every class's virtual table slots with slot_table.txt: hosts
# call the plug-in and the commands through these slots.
set -euo pipefail
source "$(dirname "$0")/abi_probe.sh"

# The probe makes the compiler lay out the virtual table of every class a host
# calls through, by calling one virtual operation through a pointer of each.
probe='
#include "commands/compare_search.h"
#include "commands/hstring_array.h"
#include "commands/substring.h"
#include "commands/test_print.h"
#include "commands/token.h"
#include "commands/token_array.h"
#include "plugin/string_commands_plugin.h"
template <class T> void layOut(T* object) { object->getRuntimeClass(); }
template <class... Commands> void create() { Command* made[] = {new Commands()...}; (void)made; }
void layOutAll(HObject* a, Command* b, HomCorePluginBase* c, CommandPluginBase* d,
               TavixStringCommandsPlugin* e, HStringArray* q, Variable* r) {
  layOut(a), layOut(b), layOut(c), layOut(d);
  create<StrCompareCmd, StrFindCmd, StrLeftCmd, StrLengthCmd, StrMidCmd, StrReplaceCmd,
         StrRightCmd, StrReverseFindCmd, StrTokCmd, StrTokArrayCmd, TestPrintCmd>();
  e->initialize();  // the plug-in overrides no getRuntimeClass
  delete q;         // the string array overrides only its destructor
  r->getType();
}'
dump=$(compileProbe microsoft -fdump-vtable-layouts)

# One line per slot: class, slot, the qualified operation (and "pure").
actual=$(printf '%s\n' "$dump" | awk '
  /^VFTable for / { n = split($0, q, "\047"); cls = q[n - 1]; if (cls == "CommandFrame") cls = ""; next }
  /^$/ { cls = ""; next }
  cls != "" && /^ *[0-9]+ \| / {
    slot = $1
    entry = $0; sub(/^ *[0-9]+ \| /, "", entry)
    name = entry; sub(/\(.*/, "", name); n = split(name, w, " "); name = w[n]
    sub(/^\*/, "", name)
    print cls, slot, name (entry ~ /\[pure\]/ ? " pure" : "")
  }' | sort -u -k1,1 -k2,2n)
expected=$(sed -e '/^#/d' -e '/^$/d' "$here/slot_table.txt" | sort -u -k1,1 -k2,2n)

if ! differences=$(diff <(printf '%s\n' "$expected") <(printf '%s\n' "$actual")); then
  echo "slot audit failed (< expected, > built):"
  printf '%s\n' "$differences" | grep '^[<>]'
  exit 1
fi
echo "slot audit passed: $(printf '%s\n' "$actual" | wc -l) slots in $(printf '%s\n' "$actual" | cut -d' ' -f1 | sort -u | wc -l) classes"
