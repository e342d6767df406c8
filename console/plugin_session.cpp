#include "plugin_session.h"

#include <string.h>

#include "out_of_memory.h"
#include "plugin_exports.h"
#include "system_files.h"

namespace {

const char kModuleFileName[] = "TavixStringCmds.hll";

}  // namespace

HString defaultModulePath() {
  // Beside the console in a build folder; in ../lib when installed.
  const HString folder = executableDirectory();
  HString path;
  path.Format("%s%s", folder.GetStr(), kModuleFileName);
  if (notRegularFile(path) == nullptr) return path;
  path.Format("%s../lib/%s", folder.GetStr(), kModuleFileName);
  return path;
}

Owned<PluginSession> PluginSession::open(const char* path, HString& error) {
  Owned<PluginSession> session;
  try {
    session = Owned<PluginSession>(new PluginSession());
    if (!session->load(path, error)) session.reset();
  } catch (const char* message) {  // E1224 from the module
    error.Format("%s: initialize failed: %s", path, message);
    session.reset();
  } catch (const OutOfMemory&) {
    error.Format("%s: out of memory", path);
    session.reset();
  }
  return session;
}

bool PluginSession::load(const char* path, HString& error) {
  m_library = ModuleLibrary::open(path, error);
  if (!m_library) return false;
  const auto apiVersion = m_library->function<ApiVersionFn>("apiVersion");
  const auto getNumPlugins = m_library->function<GetNumPluginsFn>("getNumPlugins");
  const auto getPlugin = m_library->function<GetPluginFn>("getPlugin");
  const char* missing = apiVersion == nullptr      ? "apiVersion"
                        : getNumPlugins == nullptr ? "getNumPlugins"
                        : getPlugin == nullptr     ? "getPlugin"
                                                   : nullptr;
  if (missing != nullptr) {
    error.Format("%s does not export %s", path, missing);
    return false;
  }
  m_apiVersion = apiVersion();
  if (m_apiVersion != kPluginApiVersion) {
    error.Format("%s has interface version %d, expected %d", path, m_apiVersion, kPluginApiVersion);
    return false;
  }
  if (getNumPlugins() < 1) {
    error.Format("%s holds no plug-in", path);
    return false;
  }
  m_plugin = getPlugin(0);
  if (m_plugin == nullptr) {
    error.Format("%s gave no plug-in for index 0", path);
    return false;
  }
  // Whatever initialize created is released with the session, also after a failure.
  try {
    m_plugin->initialize();
  } catch (...) {
    adoptCommands();
    throw;
  }
  adoptCommands();
  return true;
}

void PluginSession::adoptCommands() {
  for (int i = 0; i < m_plugin->getNumCommands(); ++i) {
    Command* command = m_plugin->getCommand(i);
    if (command != nullptr) m_commands.add(command);
  }
}

PluginSession::~PluginSession() {
  if (m_plugin != nullptr) m_plugin->deleteThis();
  for (int i = 0; i < m_commands.count(); ++i) m_commands[i]->deleteThis();
}

Command* PluginSession::find(const char* name) const {
  for (int i = 0; i < m_commands.count(); ++i) {
    if (strcmp(name, m_commands[i]->getName()) == 0) return m_commands[i];
  }
  return nullptr;
}
