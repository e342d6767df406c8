// The frame every string command stands on. A command is a description (its
// name, texts, arguments, result and options, as the host sees them) and a
// run function; the frame turns the description into the overrides the host
// calls, each implemented once here.
#pragma once

#include <stddef.h>

#include "command.h"
#include "command_option.h"
#include "hobject.h"
#include "hstring.h"
#include "tarray.h"
#include "variable.h"

// An option a command declares, with its declared-option index: its place
// in the command's list of options, from 0.
struct OptionDescription {
  int index;
  const char* name;
  bool takesString;  // a string value (type 3); otherwise a flag without value
};

// True when each option's index is its place in the list, as the host numbers them.
template <int OptionCount>
constexpr bool optionsInOrder(const OptionDescription (&options)[OptionCount]) {
  for (int i = 0; i < OptionCount; ++i) {
    if (options[i].index != i) return false;
  }
  return true;
}

// Where a command keeps what the host's Command answers by default.
enum CommandTrait : unsigned {
  kOwnAnswers = 0,
  kOptionalArguments = 1,  // no arguments at all are accepted too
  kHostSoloAnswer = 2,     // canExecuteSolo is the host's; otherwise false
};

struct CommandDescription {
  const char* name;
  const char* description;
  const char* category;
  // The argument syntax text; each word names one argument: a word in double
  // quotes a string, a bare word an integer. Null: the syntax text, the
  // argument check and the result type are the host's defaults.
  const char* syntax;
  Variable::VarType returns;
  unsigned traits;
  const OptionDescription* options;
  int optionCount;

  template <int OptionCount>
  constexpr CommandDescription withOptions(const OptionDescription (&declared)[OptionCount]) const {
    return CommandDescription{name,    description, category, syntax,
                              returns, traits,      declared, OptionCount};
  }
};

// A command of the "String" category, with an argument syntax of its own.
constexpr CommandDescription stringCommand(const char* name, const char* description,
                                           const char* syntax, Variable::VarType returns,
                                           unsigned traits = kOwnAnswers) {
  return CommandDescription{name, description, "String", syntax, returns, traits, nullptr, 0};
}

// What a command does when it runs: its options given, its arguments (checked
// against its syntax) and the value that receives its result. Returns false
// only after logging an error.
using CommandRun = bool(const TArray<CommandOption>& options, const TArray<Variable>& args,
                        Variable& result);

// True when args are exactly the arguments that syntax names (or none, when
// optional): the count is tested first, then each type in order.
bool argumentsFitSyntax(const TArray<Variable>& args, const char* syntax, bool optional);

// Sign-extends a script integer to a size: n >= 0 stays n, a negative n
// becomes 2^64 + n.
size_t widenToSize(int value);

// Self declares `static const CommandDescription kDescription` and a
// CommandRun `run`, which may be static. The frame adds no data member and no
// virtual slot.
template <class Self>
class CommandFrame : public Command {
 public:
  // Declares the command to the host: the Command base with its name and
  // description, then its category, then its options in order.
  CommandFrame()
      : Command(HString(described().name), HString(described().description), HString("")) {
    setCommandCategory(HString(described().category), HString(""));
    for (int i = 0; i < described().optionCount; ++i) {
      const OptionDescription& option = described().options[i];
      addOption(CommandOption::createInstance(
                    HString(option.name), option.takesString ? 1 : 0,
                    option.takesString ? Variable::TypeString : Variable::TypeNone, false),
                0, false);
    }
  }

  // Hands the command to the host, which destroys it with its last reference.
  void deleteThis() override { unref(); }

  // No command has a run-time class record of its own. An SDK that declares
  // getRuntimeClass otherwise needs this one line changed.
  const HRuntimeClass* getRuntimeClass() const override { return &Command::s_classCommand; }

  bool execute(const TArray<CommandOption>& options, const TArray<Variable>& args,
               Variable& result) override {
    return static_cast<Self*>(this)->run(options, args, result);
  }

  void getArgSyntaxString(HString& syntax) const override {
    if (described().syntax == nullptr) return Command::getArgSyntaxString(syntax);
    syntax = described().syntax;
  }

  bool checkArgSyntax(const TArray<Variable>& args,
                      const TArray<CommandOption>& options) const override {
    if (described().syntax == nullptr) return Command::checkArgSyntax(args, options);
    return argumentsFitSyntax(args, described().syntax,
                              (described().traits & kOptionalArguments) != 0);
  }

  bool canExecuteSolo() const override {
    return (described().traits & kHostSoloAnswer) != 0 && Command::canExecuteSolo();
  }

  Variable::VarType getReturnType() const override {
    return described().syntax == nullptr ? Command::getReturnType() : described().returns;
  }

 protected:
  ~CommandFrame() override = default;

 private:
  static const CommandDescription& described() { return Self::kDescription; }
};
