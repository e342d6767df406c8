// The exceptions that cross the module's boundary, met as a host meets them:
// E1224 from the module when its command list cannot grow, the module's own
// allocation exception, and TavixCore's passing through the module's frames;
// with the host's destructors run on the way, from 8 threads at once, and
// over 100 loads and unloads. Plain C++ without a test framework, so that it
// runs wherever the module does; on Windows also with the host and TavixCore
// on a second exception runtime (vcruntime140.dll) while the module keeps the
// UCRT's.
//   boundary_test [MODULE [--vcruntime]]
#include <stdio.h>
#include <string.h>

#if defined(_WIN32)
#include <windows.h>
#else
#include <pthread.h>
#endif

#include "module_loader.h"
#include "module_malloc_hook.h"
#include "out_of_memory.h"
#include "plugin_exports.h"
#include "plugin_session.h"
#include "script_values.h"

namespace {

int g_failures = 0;

void expect(bool holds, const char* what) {
  printf("%s: %s\n", holds ? "ok" : "FAILED", what);
  g_failures += holds ? 0 : 1;
}

// Sets a flag when the frame that holds it is left: a host's destructor.
struct Witness {
  bool& destroyed;
  ~Witness() { destroyed = true; }
};

// The plug-in's command of that name.
Command& commandNamed(CommandPluginBase& plugin, const char* name) {
  for (int i = 0;; ++i) {
    if (strcmp(plugin.getCommand(i)->getName(), name) == 0) return *plugin.getCommand(i);
  }
}

Variable repeated(char c, int n) {
  HString text;
  while (n-- > 0) text += c;
  return stringValue(text);
}

// Runs strReplace to a result past 2^31 bytes, which TavixCore's string
// refuses with the allocation exception; whether it came through.
bool tavixCoreRefusesThroughTheModule(Command& replace) {
  TArray<Variable> args;
  args.add(repeated('a', 46341));
  args.add(stringValue("a"));
  args.add(repeated('b', 46341));
  try {
    Variable result;
    replace.execute(TArray<CommandOption>(), args, result);
  } catch (const OutOfMemory&) {
    return true;
  }
  return false;
}

// Runs work on 8 threads at once and waits for them all.
void onEightThreads(void (*work)()) {
#if defined(_WIN32)
  HANDLE threads[8];
  for (HANDLE& thread : threads) {
    thread = CreateThread(
        nullptr, 0, [](void* run) -> DWORD { return reinterpret_cast<void (*)()>(run)(), 0; },
        reinterpret_cast<void*>(work), 0, nullptr);
  }
  WaitForMultipleObjects(8, threads, TRUE, INFINITE);
  for (HANDLE thread : threads) CloseHandle(thread);
#else
  pthread_t threads[8];
  for (pthread_t& thread : threads) {
    pthread_create(
        &thread, nullptr,
        [](void* run) -> void* { return reinterpret_cast<void (*)()>(run)(), nullptr; },
        reinterpret_cast<void*>(work));
  }
  for (pthread_t thread : threads) pthread_join(thread, nullptr);
#endif
}

Command* g_replace = nullptr;
int g_caughtOnThreads = 0;  // each thread adds its own count once, atomically

void throwFromThreads() {
  int caught = 0;
  for (int i = 0; i < 20; ++i) caught += tavixCoreRefusesThroughTheModule(*g_replace) ? 1 : 0;
#if defined(_WIN32)
  InterlockedExchangeAdd(reinterpret_cast<volatile LONG*>(&g_caughtOnThreads), caught);
#else
  __atomic_fetch_add(&g_caughtOnThreads, caught, __ATOMIC_SEQ_CST);
#endif
}

}  // namespace

int main(int argc, char** argv) {
  const HString modulePath = argc > 1 ? HString(argv[1]) : defaultModulePath();
#if defined(_WIN32)
  if (argc > 2 && strcmp(argv[2], "--vcruntime") == 0) {
    expect(GetModuleHandleA("vcruntime140.dll") != nullptr,
           "the host and TavixCore take their exception runtime from vcruntime140.dll");
  }
#endif
  HString error;
  Owned<ModuleLibrary> library = ModuleLibrary::open(modulePath, error);
  if (!library) {
    printf("FAILED: %s\n", error.GetStr());
    return 1;
  }
  CommandPluginBase& plugin = *library->function<GetPluginFn>("getPlugin")(0);
  plugin.initialize();  // 11 commands in 16 slots
  {
    ModuleMallocHook hook("TavixStringCmds.hll");
    expect(hook.installed(), "the module's malloc and realloc imports are found");
    hook.failNextRequestOf(32 * sizeof(Command*));  // the 17th append grows the list to 32
    bool destroyed = false;
    const char* caught = nullptr;
    try {
      try {
        Witness witness{destroyed};
        plugin.initialize();
      } catch (const char*) {
        throw;  // the host rethrows what the module threw
      }
    } catch (const char* message) {
      caught = message;
    }
    expect(
        caught != nullptr && strcmp(caught, "E1224: Out of memory in TSimpleArray::addSpace") == 0,
        "E1224 from the module is caught as const char*, and rethrown by the host");
    expect(destroyed, "the host's destructors run as E1224 leaves its frames");
    expect(plugin.getNumCommands() == 16 && strcmp(plugin.getCommand(15)->getName(), "strMid") == 0,
           "the list keeps the 16 commands it held, in order");

    // strTokArray's first token grows its array of 8 strings in the module.
    hook.failNextRequestOf(8 * sizeof(HString));
    TArray<Variable> args;
    args.add(stringValue("a b"));
    const char* what = nullptr;
    try {
      Variable result;
      commandNamed(plugin, "strTokArray").execute(TArray<CommandOption>(), args, result);
    } catch (const OutOfMemory& exception) {
      what = exception.what();
    }
    expect(what != nullptr && what[0] != '\0',
           "the module's own allocation exception is caught by reference, with what()");
  }

  g_replace = &commandNamed(plugin, "strReplace");
  expect(tavixCoreRefusesThroughTheModule(*g_replace),
         "the allocation exception from TavixCore passes through a command");
  onEightThreads(throwFromThreads);
  expect(g_caughtOnThreads == 8 * 20, "8 threads throw across the boundary at once");
  TArray<Command*> commands;
  for (int i = 0; i < plugin.getNumCommands(); ++i) commands.add(plugin.getCommand(i));
  plugin.deleteThis();
  for (int i = 0; i < commands.count(); ++i) commands[i]->deleteThis();
  library.reset();

  int cycles = 0;
  for (; cycles < 100; ++cycles) {
    Owned<PluginSession> again = PluginSession::open(modulePath, error);
    if (!again || !tavixCoreRefusesThroughTheModule(commandNamed(again->plugin(), "strReplace")))
      break;
  }
  expect(cycles == 100, "100 loads and unloads, each throwing across the boundary");
  return g_failures == 0 ? 0 : 1;
}
