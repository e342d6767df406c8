#include "plugin_session.h"

#include <cstdio>
#include <cstdlib>
#include <exception>

#include "../host/plugin_exports.h"

namespace {

const char kModuleFileName[] = "TavixStringCmds.hll";

}  // namespace

std::string defaultModulePath() {
  return executableDirectory() + kModuleFileName;
}

PluginSession& sharedDefaultSession() {
  static PluginSession* session = [] {
    std::string error;
    PluginSession* opened = PluginSession::open(defaultModulePath(), error).release();
    if (opened == nullptr) {
      std::fprintf(stderr, "%s\n", error.c_str());
      std::exit(2);
    }
    return opened;
  }();
  return *session;
}

std::unique_ptr<PluginSession> PluginSession::open(const std::string& path, std::string& error) {
  std::unique_ptr<PluginSession> session(new PluginSession());
  session->m_library = ModuleLibrary::open(path, error);
  if (!session->m_library) return nullptr;

  const auto apiVersion = session->m_library->function<ApiVersionFn>("apiVersion");
  const auto getNumPlugins = session->m_library->function<GetNumPluginsFn>("getNumPlugins");
  const auto getPlugin = session->m_library->function<GetPluginFn>("getPlugin");
  for (const auto& [name, found] :
       {std::pair<const char*, bool>{"apiVersion", apiVersion != nullptr},
        {"getNumPlugins", getNumPlugins != nullptr},
        {"getPlugin", getPlugin != nullptr}}) {
    if (!found) {
      error = path + " does not export " + name;
      return nullptr;
    }
  }
  session->m_apiVersion = apiVersion();
  if (session->m_apiVersion != kPluginApiVersion) {
    error = path + " has interface version " + std::to_string(session->m_apiVersion) +
            ", expected " + std::to_string(kPluginApiVersion);
    return nullptr;
  }
  if (getNumPlugins() < 1) {
    error = path + " holds no plug-in";
    return nullptr;
  }
  session->m_plugin = getPlugin(0);
  if (session->m_plugin == nullptr) {
    error = path + " gave no plug-in for index 0";
    return nullptr;
  }
  std::string failure;
  try {
    session->m_plugin->initialize();
  } catch (const char* message) {
    failure = message;
  } catch (const std::exception& exception) {
    failure = exception.what();
  }
  // Whatever initialize created is released with the session, also after a failure.
  for (int i = 0; i < session->m_plugin->getNumCommands(); ++i) {
    Command* command = session->m_plugin->getCommand(i);
    if (command != nullptr) session->m_commands.push_back(command);
  }
  if (!failure.empty()) {
    error = path + ": initialize failed: " + failure;
    return nullptr;
  }
  return session;
}

PluginSession::~PluginSession() {
  if (m_plugin != nullptr) m_plugin->deleteThis();
  for (Command* command : m_commands) command->deleteThis();
}

Command* PluginSession::find(const std::string& name) const {
  for (Command* command : m_commands) {
    if (name == command->getName()) return command;
  }
  return nullptr;
}
