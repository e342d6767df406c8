#include "startup.h"

#include <stddef.h>

// The UCRT's tables of functions to run at exit, one per module.
typedef void(__cdecl* ExitFunction)();
struct OnExitTable {
  ExitFunction* first;
  ExitFunction* last;
  ExitFunction* end;
};
extern "C" int __cdecl _initialize_onexit_table(OnExitTable* table);
extern "C" int __cdecl _register_onexit_function(OnExitTable* table, ExitFunction function);
extern "C" int __cdecl _execute_onexit_table(OnExitTable* table);

namespace {

// The compiler puts a pointer to each static constructor in .CRT$XCU; the
// linker sorts .CRT$XCA before it and .CRT$XCZ after it.
__attribute__((section(".CRT$XCA"), used)) ExitFunction g_constructorsBegin[] = {nullptr};
__attribute__((section(".CRT$XCZ"), used)) ExitFunction g_constructorsEnd[] = {nullptr};

OnExitTable g_exitTable;

}  // namespace

// Static destructors are registered here by the compiler; they run when the
// module finishes, not when the process does, so that a library unloaded
// early takes its destructors with it.
extern "C" int __cdecl atexit(ExitFunction function) {
  return _register_onexit_function(&g_exitTable, function);
}

void startModule() {
  _initialize_onexit_table(&g_exitTable);
  for (ExitFunction* constructor = g_constructorsBegin + 1; constructor < g_constructorsEnd;
       ++constructor) {
    if (*constructor != nullptr) (*constructor)();
  }
}

void finishModule() {
  _execute_onexit_table(&g_exitTable);
}
