// What the string commands share: release, run-time class, registration,
// the argument check and the walk over the options given.
#pragma once

#include "command.h"
#include "hstring.h"

constexpr const char* kStringCategory = "String";
constexpr const char* kTestingCategory = "Testing";

// deleteThis of every command: hands the command to the host's unref.
void releaseCommand(Command& command);

// getRuntimeClass of every command: the host's Command record.
const HRuntimeClass* commandRuntimeClass();

// Registration steps of a command's constructor, after the Command base.
void setCategory(Command& command, const char* category);
void declareFlagOption(Command& command, const char* name);
void declareStringOption(Command& command, const char* name);

// True when args holds exactly count values, of the expected types in order.
// The count is tested first, then the types from the first on.
bool argumentsMatch(const TArray<Variable>& args, const Variable::VarType* expected, int count);

// argumentsMatch for a list written in place: argumentsAre(args, {TypeString, TypeInt}).
template <int Count>
bool argumentsAre(const TArray<Variable>& args, const Variable::VarType (&expected)[Count]) {
  return argumentsMatch(args, expected, Count);
}

// The declared-option index that a given option stands for, or -1 when it
// names none of the command's declaredCount options (negative and
// out-of-range indexes included); such options are passed over.
int declaredOptionIndex(const CommandOption& given, int declaredCount);

// Sign-extends a script integer to a size: n >= 0 stays n, a negative n
// becomes 2^64 + n.
size_t widenToSize(int value);
