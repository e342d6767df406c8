#include "string_commands_plugin.h"

#include "commands/compare_search.h"
#include "commands/substring.h"
#include "commands/test_print.h"
#include "commands/token.h"
#include "commands/token_array.h"

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
  CommandClass* command = new CommandClass();
  try {
    m_commands.add(command);
  } catch (...) {
    command->deleteThis();  // a command whose append fails is released again, not leaked
    throw;
  }
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
