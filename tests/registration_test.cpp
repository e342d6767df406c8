// What each command declares to the host, against the texts hosts and
// scripts see.
#include <gtest/gtest.h>

#include <string>
#include <vector>

#include "command_runner.h"

namespace {

struct DeclaredOption {
  std::string name;
  bool takesValue;
  Variable::VarType type;
};

struct Registration {
  const char* name;
  const char* description;
  const char* category;
  std::vector<DeclaredOption> options;
  const char* syntax;
  Variable::VarType returnType;
  bool canExecuteSolo;
};

const std::vector<DeclaredOption> kTokenOptions = {{"delims", true, Variable::TypeString},
                                                   {"matchAll", false, Variable::TypeNone}};

const Registration kRegistrations[] = {
    {"strCompare",
     "Compare Strings",
     "String",
     {{"noCase", false, Variable::TypeNone}},
     "\"string1\" \"string2\"",
     Variable::TypeInt,
     false},
    {"strFind",
     "Find Sub-string",
     "String",
     {},
     "\"string\" \"subString\" index",
     Variable::TypeInt,
     false},
    {"strLeft",
     "Get Left Sub-string",
     "String",
     {},
     "\"string\" count",
     Variable::TypeString,
     false},
    {"strLength", "Get Length of HString", "String", {}, "\"string\"", Variable::TypeInt, false},
    {"strMid",
     "Get Middle Sub-string",
     "String",
     {},
     "\"string\" firstIndex count",
     Variable::TypeString,
     false},
    {"strReplace",
     "Replace Sub-string",
     "String",
     {},
     "\"string\" \"subStringOld\" \"subStringNew\"",
     Variable::TypeString,
     false},
    {"strRight",
     "Get Right Sub-string",
     "String",
     {},
     "\"string\" count",
     Variable::TypeString,
     false},
    {"strReverseFind",
     "Find Char Reverse",
     "String",
     {},
     "\"string\" \"findChar\"",
     Variable::TypeInt,
     false},
    // The next three keep the host's canExecuteSolo (true here); testPrint
    // keeps the host's syntax text and return type as well.
    {"strTok", "Get HString Token", "String", kTokenOptions, "\"string\"", Variable::TypeString,
     true},
    {"strTokArray", "Get HString Token Array", "String", kTokenOptions, "\"string\"",
     Variable::TypeStringArray, true},
    {"testPrint", "Tests print command", "Testing", {}, "", Variable::TypeNone, true},
};

TEST(RegistrationTest, EveryCommandDeclaresItselfAsDocumented) {
  const std::vector<Command*>& commands = sharedDefaultSession().commands();
  ASSERT_EQ(commands.size(), std::size(kRegistrations));
  for (size_t i = 0; i < commands.size(); ++i) {
    const Registration& r = kRegistrations[i];
    const Command& c = *commands[i];
    SCOPED_TRACE(r.name);
    EXPECT_STREQ(c.getName(), r.name);
    EXPECT_STREQ(c.getDescription(), r.description);
    EXPECT_STREQ(c.getCategory(), r.category);
    HString syntax("previous text");
    c.getArgSyntaxString(syntax);
    EXPECT_STREQ(syntax.GetStr(), r.syntax);
    EXPECT_EQ(c.getReturnType(), r.returnType);
    EXPECT_EQ(c.canExecuteSolo(), r.canExecuteSolo);
    EXPECT_FALSE(c.isUndoable());
    EXPECT_EQ(c.getRuntimeClass(), &Command::s_classCommand);
    ASSERT_EQ(c.getNumOptions(), static_cast<int>(r.options.size()));
    for (int o = 0; o < c.getNumOptions(); ++o) {
      const DeclaredOption& expected = r.options[static_cast<size_t>(o)];
      EXPECT_EQ(c.getOption(o)->getName(), expected.name);
      EXPECT_EQ(c.getOption(o)->takesValue(), expected.takesValue);
      EXPECT_EQ(c.getOption(o)->getValueType(), expected.type);
      EXPECT_EQ(c.getOption(o)->getIndex(), o);
      int index = -1;
      Variable::VarType type = Variable::TypeInt;
      EXPECT_EQ(c.getOptionSyntax(expected.name.c_str(), index, type), 1);
      EXPECT_EQ(index, o);
      EXPECT_EQ(type, expected.type);
    }
  }
}

TEST(RegistrationTest, ArgumentChecksAcceptExactlyTheDocumentedShapes) {
  struct Case {
    const char* command;
    std::vector<Variable> args;
    bool accepted;
  };
  const Case cases[] = {
      {"strCompare", {str("a"), str("b")}, true},
      {"strCompare", {str("a")}, false},
      {"strCompare", {str("a"), num(1)}, false},
      {"strFind", {str("a"), str("b"), num(0)}, true},
      {"strFind", {str("a"), str("b"), str("0")}, false},
      {"strFind", {str("a"), str("b"), num(0), num(0)}, false},
      {"strLeft", {str("a"), num(1)}, true},
      {"strLeft", {num(1), num(1)}, false},
      {"strLeft", {str("a"), str("1")}, false},
      {"strLeft", {str("a")}, false},
      {"strLength", {str("a")}, true},
      {"strLength", {}, false},
      {"strLength", {Variable(Variable::TypeStringArray, 1)}, false},
      {"strMid", {str("a"), num(0), num(1)}, true},
      {"strMid", {str("a"), num(0), str("1")}, false},
      {"strReplace", {str("a"), str("b"), str("c")}, true},
      {"strReplace", {num(1), str("b"), str("c")}, false},
      {"strReplace", {str("a"), str("b"), num(1)}, false},
      {"strRight", {str("a"), num(1)}, true},
      {"strRight", {str("a"), num(1), num(2)}, false},
      {"strReverseFind", {str("a"), str("b")}, true},
      {"strReverseFind", {str("a"), Variable()}, false},
      {"strTok", {}, true},
      {"strTok", {str("a")}, true},
      {"strTok", {num(1)}, false},
      {"strTok", {str("a"), str("b")}, false},
      {"strTokArray", {str("a")}, true},
      {"strTokArray", {}, false},
      {"strTokArray", {num(3)}, false},
      {"testPrint", {num(1), str("x"), Variable()}, true},
  };
  for (const Case& c : cases) {
    SCOPED_TRACE(std::string(c.command) + " with " + std::to_string(c.args.size()) + " args");
    TArray<Variable> args;
    for (const Variable& v : c.args) args.add(v);
    const TArray<CommandOption> options;
    LogCapture capture;
    EXPECT_EQ(command(c.command).checkArgSyntax(args, options), c.accepted);
    EXPECT_TRUE(capture.entries().empty());
  }
}

}  // namespace
