// A loaded command module with its plug-in initialised, as a host holds it:
// the library, the plug-in object from getPlugin(0) and its commands. Closing
// destroys the plug-in first, then releases each command through its own
// deleteThis, then unloads the library.
#pragma once

#include <memory>
#include <string>
#include <vector>

#include "../host/command.h"
#include "../host/plugin_base.h"
#include "module_loader.h"

// The module file built beside the running executable.
std::string defaultModulePath();

class PluginSession;

// The module beside the running executable, loaded on first use and kept
// for the whole run; the program stops with the reason if it cannot load.
PluginSession& sharedDefaultSession();

class PluginSession {
 public:
  // Loads path, checks apiVersion and getNumPlugins, creates the plug-in and
  // its commands. Null with a one-line reason in error on any failure.
  static std::unique_ptr<PluginSession> open(const std::string& path, std::string& error);
  ~PluginSession();
  PluginSession(const PluginSession&) = delete;
  PluginSession& operator=(const PluginSession&) = delete;

  CommandPluginBase& plugin() { return *m_plugin; }
  int apiVersion() const { return m_apiVersion; }
  const std::vector<Command*>& commands() const { return m_commands; }
  // The command of that script name, or null.
  Command* find(const std::string& name) const;

 private:
  PluginSession() = default;

  std::unique_ptr<ModuleLibrary> m_library;
  CommandPluginBase* m_plugin = nullptr;
  int m_apiVersion = 0;
  std::vector<Command*> m_commands;
};
