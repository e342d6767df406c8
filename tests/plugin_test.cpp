// The module's exports and plug-in object, reached only through the loader.
#include <gtest/gtest.h>

#include <regex>
#include <string>
#include <vector>

#include "../host/plugin_exports.h"
#include "command_runner.h"
#include "module_malloc_hook.h"

namespace {

class PluginTest : public ::testing::Test {
 protected:
  void SetUp() override {
    std::string error;
    library = ModuleLibrary::open(defaultModulePath(), error);
    ASSERT_TRUE(library) << error;
    getPlugin = library->function<GetPluginFn>("getPlugin");
    ASSERT_NE(getPlugin, nullptr);
  }

  std::unique_ptr<ModuleLibrary> library;
  GetPluginFn getPlugin = nullptr;
};

const char* const kCommandOrder[] = {"strCompare", "strFind",     "strLeft",  "strLength",
                                     "strMid",     "strReplace",  "strRight", "strReverseFind",
                                     "strTok",     "strTokArray", "testPrint"};

TEST_F(PluginTest, PlainExportsAnswerTheirValues) {
  const auto apiVersion = library->function<ApiVersionFn>("apiVersion");
  const auto isDebug = library->function<IsDebugFn>("isDebug");
  const auto getNumPlugins = library->function<GetNumPluginsFn>("getNumPlugins");
  const auto isRuvan = library->function<IsRuvanFn>("isRuvan");
  ASSERT_TRUE(apiVersion && isDebug && getNumPlugins && isRuvan);
  EXPECT_EQ(apiVersion(), 524288);
  EXPECT_FALSE(isDebug());
  EXPECT_FALSE(isRuvan());
  EXPECT_EQ(getNumPlugins(), 1);
  EXPECT_EQ(getPlugin(1), nullptr);
  EXPECT_EQ(getPlugin(-1), nullptr);
}

TEST_F(PluginTest, EachGetPluginMakesANewEmptyObject) {
  CommandPluginBase* first = getPlugin(0);
  CommandPluginBase* second = getPlugin(0);
  ASSERT_NE(first, nullptr);
  ASSERT_NE(second, nullptr);
  EXPECT_NE(first, second);
  EXPECT_EQ(first->getNumCommands(), 0);
  EXPECT_EQ(second->getNumCommands(), 0);
  EXPECT_EQ(first->getCommand(0), nullptr);
  first->deleteThis();
  second->deleteThis();
}

TEST_F(PluginTest, IdentityAndHostSlots) {
  CommandPluginBase* plugin = getPlugin(0);
  EXPECT_STREQ(plugin->getMakerName().GetStr(), "Orlem");
  EXPECT_STREQ(plugin->getPublisherName().GetStr(), "Orlem");
  EXPECT_STREQ(plugin->getVersionString().GetStr(), "1.0");
  EXPECT_STREQ(plugin->getPluginName().GetStr(), "Tavix String Commands");
  EXPECT_STREQ(plugin->getReleaseString().GetStr(), "2.00");
  EXPECT_TRUE(plugin->isReady());
  EXPECT_EQ(plugin->getRuntimeClass(), &CommandPluginBase::s_classCommandPluginBase);

  // "Jan  8 2025": month, blank, day padded with a blank, blank, year.
  EXPECT_TRUE(std::regex_match(
      plugin->getBuildDate().GetStr(),
      std::regex(
          "(Jan|Feb|Mar|Apr|May|Jun|Jul|Aug|Sep|Oct|Nov|Dec) ( [1-9]|[12][0-9]|3[01]) [0-9]{4}")));

  plugin->loadScriptCommands();
  EXPECT_EQ(plugin->getNumScriptCommands(), 0);
  EXPECT_EQ(plugin->getScriptCommand(0), nullptr);
  EXPECT_EQ(plugin->getNumControlStreamCommands(), 0);
  EXPECT_EQ(plugin->getControlStreamCommand(0), nullptr);
  EXPECT_EQ(plugin->getNumControlStreamEvents(), 0);
  EXPECT_EQ(plugin->getControlStreamEvent(0), nullptr);
  plugin->deleteThis();
}

TEST_F(PluginTest, InitializeCreatesTheElevenCommandsInOrderAndAgainBehind) {
  CommandPluginBase* plugin = getPlugin(0);
  EXPECT_TRUE(plugin->initialize());
  ASSERT_EQ(plugin->getNumCommands(), 11);
  std::vector<Command*> firstRound;
  for (int i = 0; i < 11; ++i) {
    firstRound.push_back(plugin->getCommand(i));
    EXPECT_STREQ(firstRound.back()->getName(), kCommandOrder[i]) << i;
  }
  EXPECT_EQ(plugin->getCommand(-1), nullptr);
  EXPECT_EQ(plugin->getCommand(11), nullptr);

  EXPECT_TRUE(plugin->initialize());
  ASSERT_EQ(plugin->getNumCommands(), 22);
  for (int i = 0; i < 11; ++i) {
    EXPECT_EQ(plugin->getCommand(i), firstRound[static_cast<size_t>(i)]);
    EXPECT_STREQ(plugin->getCommand(i + 11)->getName(), kCommandOrder[i]);
    EXPECT_NE(plugin->getCommand(i + 11), firstRound[static_cast<size_t>(i)]);
  }

  std::vector<Command*> all;
  for (int i = 0; i < plugin->getNumCommands(); ++i) all.push_back(plugin->getCommand(i));
  plugin->deleteThis();
  for (Command* c : all) c->deleteThis();
}

TEST_F(PluginTest, RefusedListGrowthReachesTheHostAsE1224AndKeepsTheList) {
  CommandPluginBase* plugin = getPlugin(0);
  plugin->initialize();  // 11 commands in 16 slots
  std::vector<Command*> all;
  {
    ModuleMallocHook hook("TavixStringCmds.hll");
    ASSERT_TRUE(hook.installed());
    hook.failNextRequest();  // the 17th append must grow the list
    try {
      plugin->initialize();
      ADD_FAILURE() << "initialize returned";
    } catch (const char* message) {
      EXPECT_STREQ(message, "E1224: Out of memory in TSimpleArray::addSpace");
    }
  }
  ASSERT_EQ(plugin->getNumCommands(), 16);
  for (int i = 0; i < 16; ++i) {
    all.push_back(plugin->getCommand(i));
    EXPECT_STREQ(all.back()->getName(), kCommandOrder[i % 11]) << i;
  }
  EXPECT_EQ(plugin->getCommand(16), nullptr);
  plugin->deleteThis();
  for (Command* c : all) c->deleteThis();
}

TEST_F(PluginTest, CommandsOutliveThePluginAndAreReleasedOneByOne) {
  CommandPluginBase* plugin = getPlugin(0);
  plugin->initialize();
  std::vector<Command*> commands;
  for (int i = 0; i < plugin->getNumCommands(); ++i) commands.push_back(plugin->getCommand(i));
  plugin->deleteThis();

  Command* length = commands[3];
  EXPECT_STREQ(length->getName(), "strLength");
  const CommandRun run = runCommand(*length, {str("four")});
  EXPECT_TRUE(run.ok);
  EXPECT_EQ(run.result.getIntValue(-1), 4);

  // A reference the host still holds keeps the command through deleteThis.
  length->ref();
  length->deleteThis();
  EXPECT_EQ(runCommand(*length, {str("ab")}).result.getIntValue(-1), 2);
  for (Command* c : commands) c->deleteThis();
}

}  // namespace
