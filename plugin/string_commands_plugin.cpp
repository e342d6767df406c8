#include "string_commands_plugin.h"

#include <memory>

#include "../commands/compare_search.h"
#include "../commands/substring.h"
#include "../commands/test_print.h"
#include "../commands/token.h"
#include "../commands/token_array.h"

namespace {

constexpr int kCommandListGrowStep = 16;
constexpr const char* kMakerName = "Orlem";

}  // namespace

TavixStringCommandsPlugin::TavixStringCommandsPlugin() : m_commands(kCommandListGrowStep) {}

TavixStringCommandsPlugin::~TavixStringCommandsPlugin() = default;

TavixStringCommandsPlugin* TavixStringCommandsPlugin::createInstance() {
  return new TavixStringCommandsPlugin();
}

void TavixStringCommandsPlugin::deleteThis() {
  delete this;
}

HString TavixStringCommandsPlugin::getMakerName() {
  return HString(kMakerName);
}

HString TavixStringCommandsPlugin::getPublisherName() {
  return HString(kMakerName);
}

HString TavixStringCommandsPlugin::getBuildDate() {
  return HString(__DATE__);
}

HString TavixStringCommandsPlugin::getVersionString() {
  return HString("1.0");
}

HString TavixStringCommandsPlugin::getPluginName() {
  return HString("Tavix String Commands");
}

HString TavixStringCommandsPlugin::getReleaseString() {
  return HString("2.00");
}

template <class CommandClass>
void TavixStringCommandsPlugin::addCommand() {
  // A command whose append fails is released again, not leaked.
  std::unique_ptr<CommandClass, void (*)(CommandClass*)> command(
      new CommandClass(), [](CommandClass* c) { c->deleteThis(); });
  m_commands.add(command.get());
  static_cast<void>(command.release());  // the list holds it now
}

bool TavixStringCommandsPlugin::initialize() {
  addCommand<StrCompareCmd>();
  addCommand<StrFindCmd>();
  addCommand<StrLeftCmd>();
  addCommand<StrLengthCmd>();
  addCommand<StrMidCmd>();
  addCommand<StrReplaceCmd>();
  addCommand<StrRightCmd>();
  addCommand<StrReverseFindCmd>();
  addCommand<StrTokCmd>();
  addCommand<StrTokArrayCmd>();
  addCommand<TestPrintCmd>();
  return true;
}

bool TavixStringCommandsPlugin::isReady() {
  return true;
}

int TavixStringCommandsPlugin::getNumCommands() {
  return m_commands.count();
}

Command* TavixStringCommandsPlugin::getCommand(int index) {
  return m_commands.at(index);
}
