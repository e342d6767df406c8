// A loaded command module with its plug-in initialised, as a host holds it:
// the library, the plug-in object from getPlugin(0) and its commands. Closing
// destroys the plug-in first, then releases each command through its own
// deleteThis, then unloads the library.
#pragma once

#include "command.h"
#include "hstring.h"
#include "module_loader.h"
#include "owned.h"
#include "plugin_base.h"
#include "tarray.h"

// The module file beside the running executable, or else in the lib folder
// beside its bin folder, as an installed console finds it.
HString defaultModulePath();

class PluginSession {
 public:
  // Loads path, checks apiVersion and getNumPlugins, creates the plug-in and
  // its commands. Empty with a one-line reason in error on any failure,
  // running out of memory included.
  static Owned<PluginSession> open(const char* path, HString& error);
  ~PluginSession();
  PluginSession(const PluginSession&) = delete;
  PluginSession& operator=(const PluginSession&) = delete;

  CommandPluginBase& plugin() { return *m_plugin; }
  int apiVersion() const { return m_apiVersion; }
  int commandCount() const { return m_commands.count(); }
  Command& command(int index) const { return *m_commands[index]; }
  // The command of that script name, or null.
  Command* find(const char* name) const;

 private:
  PluginSession() = default;
  bool load(const char* path, HString& error);
  void adoptCommands();

  Owned<ModuleLibrary> m_library;
  CommandPluginBase* m_plugin = nullptr;
  int m_apiVersion = 0;
  TArray<Command*> m_commands;
};
