#include "string_commands_plugin.h"

#include "commands/compare_search.h"
#include "commands/substring.h"
#include "commands/test_print.h"
#include "commands/token.h"
#include "commands/token_array.h"

namespace {

constexpr int kCommandListGrowStep = 16;
constexpr const char* kMakerName = "Orlem";

template <class CommandClass>
Command* create() {
  return new CommandClass();
}

// Every command of the module, in the order the host lists them.
Command* (*const kCommands[])() = {
    create<StrCompareCmd>, create<StrFindCmd>,     create<StrLeftCmd>,  create<StrLengthCmd>,
    create<StrMidCmd>,     create<StrReplaceCmd>,  create<StrRightCmd>, create<StrReverseFindCmd>,
    create<StrTokCmd>,     create<StrTokArrayCmd>, create<TestPrintCmd>};

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
#if defined(TAVIX_BUILD_DATE)
  return HString(TAVIX_BUILD_DATE);  // the day SOURCE_DATE_EPOCH named, for a build that repeats
#else
  return HString(__DATE__);
#endif
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

bool TavixStringCommandsPlugin::initialize() {
  for (Command* (*const create)() : kCommands) {
    Command* command = create();
    try {
      m_commands.add(command);
    } catch (...) {
      command->deleteThis();  // a command whose append fails is released again, not leaked
      throw;
    }
  }
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
