// The functions the host finds by name when it loads the module.
#include "plugin_base.h"
#include "plugin_export.h"
#include "string_commands_plugin.h"

namespace {

// The plug-in interface version this module is built for.
constexpr int kApiVersion = 0x80000;

}  // namespace

extern "C" {

TAVIX_PLUGIN_EXPORT int apiVersion() {
  return kApiVersion;
}

TAVIX_PLUGIN_EXPORT bool isDebug() {
  return false;
}

TAVIX_PLUGIN_EXPORT int getNumPlugins() {
  return 1;
}

TAVIX_PLUGIN_EXPORT CommandPluginBase* getPlugin(int index) {
  return index == 0 ? TavixStringCommandsPlugin::createInstance() : nullptr;
}

TAVIX_PLUGIN_EXPORT bool isRuvan() {
  return false;
}

}  // extern "C"
