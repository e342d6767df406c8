#include "command_frame.h"

#include <stdint.h>

bool argumentsFitSyntax(const TArray<Variable>& args, const char* syntax, bool optional) {
  if (optional && args.count() == 0) return true;
  // Each word of the syntax names one argument; its first character, its type.
  const char* firsts[16];
  int words = 0;
  for (const char* at = syntax; *at != '\0' && words < 16; ++at) {
    if (*at != ' ' && (at == syntax || at[-1] == ' ')) firsts[words++] = at;
  }
  if (args.count() != words) return false;
  for (int i = 0; i < words; ++i) {
    const Variable::VarType expected = *firsts[i] == '"' ? Variable::TypeString : Variable::TypeInt;
    if (args[i].getType() != expected) return false;
  }
  return true;
}

size_t widenToSize(int value) {
  return static_cast<size_t>(static_cast<uint64_t>(static_cast<int64_t>(value)));
}
