// The exceptions that cross the module's boundary, met as a host meets them:
// E1224 thrown by the module when its command list cannot grow, caught as a
// const char*, and the allocation exception thrown in TavixCore passing
// through a command. Plain C++ without a test framework, so that it runs
// wherever the module does.
#include <stdio.h>
#include <string.h>

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

// The plug-in's command of that name.
Command& commandNamed(CommandPluginBase& plugin, const char* name) {
  for (int i = 0;; ++i) {
    if (strcmp(plugin.getCommand(i)->getName(), name) == 0) return *plugin.getCommand(i);
  }
}

// n copies of c.
Variable repeated(char c, int n) {
  HString text;
  while (n-- > 0) text += c;
  return stringValue(text);
}

}  // namespace

int main() {
  HString error;
  Owned<ModuleLibrary> library = ModuleLibrary::open(defaultModulePath(), error);
  if (!library) {
    printf("FAILED: %s\n", error.GetStr());
    return 1;
  }
  CommandPluginBase* plugin = library->function<GetPluginFn>("getPlugin")(0);
  plugin->initialize();  // 11 commands in 16 slots
  {
    ModuleMallocHook hook("TavixStringCmds.hll");
    expect(hook.installed(), "the module's malloc import is found");
    hook.failNextRequestOf(32 * sizeof(Command*));  // the 17th append grows the list to 32
    const char* caught = nullptr;
    try {
      plugin->initialize();
    } catch (const char* message) {
      caught = message;
    }
    expect(
        caught != nullptr && strcmp(caught, "E1224: Out of memory in TSimpleArray::addSpace") == 0,
        "E1224 from the module is caught as const char*");
  }
  expect(plugin->getNumCommands() == 16, "the list keeps the 16 commands it held");
  expect(strcmp(plugin->getCommand(15)->getName(), "strMid") == 0,
         "the commands appended before the failure stay in order");

  // A result past 2^31 bytes: the host string refuses it with the allocation exception.
  TArray<Variable> args;
  args.add(repeated('a', 46341));
  args.add(stringValue("a"));
  args.add(repeated('b', 46341));
  bool caughtOutOfMemory = false;
  try {
    Variable result;
    commandNamed(*plugin, "strReplace").execute(TArray<CommandOption>(), args, result);
  } catch (const OutOfMemory&) {
    caughtOutOfMemory = true;
  }
  expect(caughtOutOfMemory, "the allocation exception from TavixCore passes through a command");

  TArray<Command*> commands;
  for (int i = 0; i < plugin->getNumCommands(); ++i) commands.add(plugin->getCommand(i));
  plugin->deleteThis();
  for (int i = 0; i < commands.count(); ++i) commands[i]->deleteThis();
  return g_failures == 0 ? 0 : 1;
}
