// The printf family as the Microsoft C++ toolchain's headers define it: each
// a call of the UCRT's __stdio_common_* functions. It stands in for mingw-w64's
// wrappers of the same name, which carry DWARF debug information that has no
// place in a PE image with a PDB.
#include <stdarg.h>
#include <stdio.h>

namespace {

// C99 behaviour: the length that was needed, and the text cut and ended with
// a NUL when it does not fit.
constexpr unsigned long long kStandardSnprintf = 0x0002ULL;

}  // namespace

int __cdecl vsnprintf(char* buffer, size_t count, const char* format, va_list arguments) {
  const int result =
      __stdio_common_vsprintf(kStandardSnprintf, buffer, count, format, nullptr, arguments);
  return result < 0 ? -1 : result;
}

int __cdecl snprintf(char* buffer, size_t count, const char* format, ...) {
  va_list arguments;
  va_start(arguments, format);
  const int result = vsnprintf(buffer, count, format, arguments);
  va_end(arguments);
  return result;
}

int __cdecl vfprintf(FILE* file, const char* format, va_list arguments) {
  return __stdio_common_vfprintf(0, file, format, nullptr, arguments);
}

int __cdecl fprintf(FILE* file, const char* format, ...) {
  va_list arguments;
  va_start(arguments, format);
  const int result = vfprintf(file, format, arguments);
  va_end(arguments);
  return result;
}

int __cdecl printf(const char* format, ...) {
  va_list arguments;
  va_start(arguments, format);
  const int result = vfprintf(stdout, format, arguments);
  va_end(arguments);
  return result;
}
