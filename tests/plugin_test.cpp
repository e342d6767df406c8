// The module as a host meets it through its exports: the plug-in object's
// life, its command list, and what the commands declare beyond what a script
// sees. What each command computes is in cases/.
#include <gtest/gtest.h>

#include <climits>
#include <regex>
#include <stdexcept>
#include <string>
#include <vector>

#include "module_loader.h"
#include "plugin_exports.h"
#include "plugin_session.h"
#include "script_values.h"

namespace {

class PluginTest : public ::testing::Test {
 protected:
  void SetUp() override {
    HString error;
    library = ModuleLibrary::open(defaultModulePath(), error);
    ASSERT_TRUE(library) << error.GetStr();
    getPlugin = library->function<GetPluginFn>("getPlugin");
    ASSERT_NE(getPlugin, nullptr);
  }

  // A plug-in with its commands created, and every command it listed.
  CommandPluginBase* initialised(std::vector<Command*>& commands) {
    CommandPluginBase* plugin = getPlugin(0);
    EXPECT_TRUE(plugin->initialize());
    for (int i = 0; i < plugin->getNumCommands(); ++i) commands.push_back(plugin->getCommand(i));
    return plugin;
  }

  Owned<ModuleLibrary> library;
  GetPluginFn getPlugin = nullptr;
};

// The command of that script name among commands.
Command& named(const std::vector<Command*>& commands, const char* name) {
  for (Command* command : commands) {
    if (std::string(command->getName()) == name) return *command;
  }
  throw std::runtime_error(name);
}

// Runs a command on string arguments, with options of these declared indexes
// whose values are ",".
Variable run(Command& command, const std::vector<const char*>& texts,
             const std::vector<int>& optionIndexes = {}) {
  TArray<Variable> args;
  for (const char* text : texts) args.add(stringValue(text));
  TArray<CommandOption> options;
  for (int index : optionIndexes) options.add(CommandOption::given(index, stringValue(",")));
  EXPECT_TRUE(command.checkArgSyntax(args, options));
  Variable result;
  EXPECT_TRUE(command.execute(options, args, result));
  return result;
}

// apiVersion and the identity strings are in the console's listing
// (tests/expected/list.json).
TEST_F(PluginTest, ExportsAnswerAndEachGetPluginMakesANewEmptyObject) {
  EXPECT_FALSE(library->function<IsDebugFn>("isDebug")());
  EXPECT_FALSE(library->function<IsRuvanFn>("isRuvan")());
  EXPECT_EQ(library->function<GetNumPluginsFn>("getNumPlugins")(), 1);
  EXPECT_EQ(getPlugin(1), nullptr);
  EXPECT_EQ(getPlugin(-1), nullptr);
  CommandPluginBase* first = getPlugin(0);
  CommandPluginBase* second = getPlugin(0);
  ASSERT_NE(first, second);
  EXPECT_EQ(first->getNumCommands(), 0);
  EXPECT_EQ(first->getCommand(0), nullptr);
  EXPECT_TRUE(first->isReady());
  EXPECT_EQ(first->getRuntimeClass(), &CommandPluginBase::s_classCommandPluginBase);
  // "Jan  8 2025": month, blank, day padded with a blank, blank, year.
  EXPECT_TRUE(std::regex_match(
      first->getBuildDate().GetStr(),
      std::regex("(Jan|Feb|Mar|Apr|May|Jun|Jul|Aug|Sep|Oct|Nov|Dec) ( [1-9]|[12][0-9]|3[01]) "
                 "[0-9]{4}")));
  first->deleteThis();
  second->deleteThis();
}

// The order of the first eleven is in the console's listing.
TEST_F(PluginTest, EachInitializeAppendsElevenMoreInTheSameOrder) {
  std::vector<Command*> commands;
  CommandPluginBase* plugin = initialised(commands);
  EXPECT_TRUE(plugin->initialize());
  ASSERT_EQ(plugin->getNumCommands(), 22);
  for (int i = 0; i < 11; ++i) {
    EXPECT_EQ(plugin->getCommand(i), commands[static_cast<size_t>(i)]);
    EXPECT_STREQ(plugin->getCommand(i + 11)->getName(),
                 commands[static_cast<size_t>(i)]->getName());
    commands.push_back(plugin->getCommand(i + 11));
  }
  EXPECT_EQ(plugin->getCommand(22), nullptr);
  plugin->deleteThis();
  for (Command* c : commands) c->deleteThis();
}

TEST_F(PluginTest, CommandsOutliveThePluginAndAreReleasedByReference) {
  std::vector<Command*> commands;
  initialised(commands)->deleteThis();
  Command& length = named(commands, "strLength");
  EXPECT_EQ(run(length, {"four"}).getIntValue(-1), 4);
  length.ref();  // a reference the host still holds keeps it through deleteThis
  length.deleteThis();
  EXPECT_EQ(run(length, {"ab"}).getIntValue(-1), 2);
  for (Command* c : commands) c->deleteThis();
}

TEST_F(PluginTest, CommandsDeclareWhatOnlyAHostSees) {
  std::vector<Command*> commands;
  CommandPluginBase* plugin = initialised(commands);
  for (Command* c : commands) {
    SCOPED_TRACE(c->getName());
    EXPECT_EQ(c->getRuntimeClass(), &Command::s_classCommand);
    EXPECT_FALSE(c->isUndoable());
    int index = -1;
    Variable::VarType type = Variable::TypeInt;
    EXPECT_EQ(c->getOptionSyntax(nullptr, index, type), 0);
    for (int o = 0; o < c->getNumOptions(); ++o) {
      EXPECT_EQ(c->getOptionSyntax(c->getOption(o)->getName(), index, type), 1);
      EXPECT_EQ(index, o);
      EXPECT_EQ(type, c->getOption(o)->getValueType());
    }
  }
  // Options with indexes a command never declared are passed over.
  EXPECT_EQ(
      run(named(commands, "strCompare"), {"ABC", "abc"}, {1, -1, 31, 32, INT_MIN}).getIntValue(-1),
      'A' - 'a');
  EXPECT_EQ(run(named(commands, "strTokArray"), {"a,b,c d"}, {2, -1, 33, INT_MIN}).getCount(), 2);
  plugin->deleteThis();
  for (Command* c : commands) c->deleteThis();
}

}  // namespace
