// Turns its input into a sequence of command calls on the loaded module and
// checks what must hold whatever a script passes.
#include <fuzzer/FuzzedDataProvider.h>

#include <algorithm>
#include <climits>
#include <cstdint>
#include <cstdlib>
#include <cstring>
#include <string>
#include <vector>

#include "../tools/log_capture.h"
#include "../tools/plugin_session.h"
#include "fuzz_support.h"

namespace {

// The argument types a command takes, read from its syntax text: a quoted
// word is a string, a bare word an integer.
std::vector<Variable::VarType> shape(const Command& command) {
  HString syntax;
  command.getArgSyntaxString(syntax);
  const char* text = syntax.GetStr();
  std::vector<Variable::VarType> types;
  for (size_t i = 0; text[i] != '\0'; ++i) {
    if (i == 0 || text[i - 1] == ' ')
      types.push_back(text[i] == '"' ? Variable::TypeString : Variable::TypeInt);
  }
  return types;
}

const int kInterestingInts[] = {0, 1, 2, 3, -1, -2, -5, INT_MIN, INT_MAX, INT_MIN + 1, 64};

std::string text(FuzzedDataProvider& data) {
  std::string s = data.ConsumeRandomLengthString(48);
  s.erase(std::remove(s.begin(), s.end(), '\0'), s.end());  // host strings hold no NUL
  return s;
}

Variable value(FuzzedDataProvider& data, Variable::VarType type) {
  Variable v;
  switch (type) {
    case Variable::TypeInt:
      v.setValue(data.ConsumeBool() ? kInterestingInts[data.ConsumeIntegralInRange<size_t>(
                                          0, std::size(kInterestingInts) - 1)]
                                    : data.ConsumeIntegral<int>(),
                 -1);
      break;
    case Variable::TypeString:
      v.setValue(text(data).c_str(), -1);
      break;
    case Variable::TypeStringArray:
      v = Variable(Variable::TypeStringArray, data.ConsumeIntegralInRange(0, 3));
      break;
    case Variable::TypeNone:
      break;
  }
  return v;
}

Variable::VarType anyType(FuzzedDataProvider& data) {
  const Variable::VarType types[] = {Variable::TypeNone, Variable::TypeInt, Variable::TypeString,
                                     Variable::TypeStringArray};
  return types[data.ConsumeIntegralInRange(0, 3)];
}

// The delimiters and mode the token commands should use for these options,
// or false when an empty delims value must make them fail.
bool effectiveTokenOptions(const TArray<CommandOption>& options, std::string& delims,
                           bool& matchAll) {
  delims = " \t\n\r";
  matchAll = false;
  for (int i = 0; i < options.count(); ++i) {
    if (options[i].getIndex() == 0) {
      delims = options[i].getValue().getStringValue(-1);
      if (delims.empty()) return false;
    } else if (options[i].getIndex() == 1) {
      matchAll = true;
    }
  }
  return true;
}

bool endsWith(const std::string& s, const std::string& tail) {
  return s.size() >= tail.size() && s.compare(s.size() - tail.size(), tail.size(), tail) == 0;
}

void checkTokenArray(const std::string& input, const TArray<CommandOption>& options,
                     const Variable& result) {
  std::string delims;
  bool matchAll = false;
  if (!effectiveTokenOptions(options, delims, matchAll)) return;
  if (!matchAll) {
    for (int i = 0; i < result.getCount(); ++i) {
      const std::string element = result.getStringValue(i);
      require(!element.empty(), "character-set element is empty");
      require(element.find_first_of(delims) == std::string::npos,
              "character-set element holds a delimiter");
    }
    return;
  }
  std::string joined;
  for (int i = 0; i < result.getCount(); ++i) {
    if (i > 0) joined += delims;
    joined += result.getStringValue(i);
  }
  require(joined == input || (endsWith(input, delims) && joined + delims == input),
          "match-all elements do not join back to the text");
}

void runOneCall(FuzzedDataProvider& data) {
  PluginSession& s = sharedDefaultSession();
  const size_t position = data.ConsumeIntegralInRange<size_t>(0, s.commands().size() - 1);
  Command& command = *s.commands()[position];
  const std::string name = command.getName();

  TArray<Variable> args;
  if (data.ConsumeBool()) {  // the command's own shape, so that it runs
    const std::vector<Variable::VarType> types = shape(command);
    const size_t count = (name == "strTok" && data.ConsumeBool()) ? 0 : types.size();
    for (size_t i = 0; i < count; ++i) args.add(value(data, types[i]));
  } else {
    const int count = data.ConsumeIntegralInRange(0, 4);
    for (int i = 0; i < count; ++i) args.add(value(data, anyType(data)));
  }
  TArray<CommandOption> options;
  const int optionCount = data.ConsumeIntegralInRange(0, 4);
  for (int i = 0; i < optionCount; ++i) {
    const int index =
        data.ConsumeBool() ? data.ConsumeIntegralInRange(-1, 2) : data.ConsumeIntegral<int>();
    options.add(CommandOption::given(index, value(data, anyType(data))));
  }

  // A start value no successful run can leave: commands returning arrays
  // never return integers, and the others never return arrays.
  const bool returnsArray = command.getReturnType() == Variable::TypeStringArray;
  Variable result = returnsArray ? Variable() : Variable(Variable::TypeStringArray, 1);
  if (returnsArray) result.setValue(424242, -1);
  const Variable::VarType startType = result.getType();

  LogCapture capture;
  if (!command.checkArgSyntax(args, options)) {
    require(capture.entries().empty(), "argument check logged");
    return;
  }
  const bool ok = command.execute(options, args, result);
  bool error = false;
  bool warning = false;
  for (const LogEntry& entry : capture.entries()) {
    error = error || entry.level == LogError;
    warning = warning || entry.level == LogWarning;
  }
  require(ok == !error, "execute returned false without an error, or true after one");
  if (name == "testPrint") {
    require(capture.entries().size() == 3 && result.getType() == startType,
            "testPrint logs three messages and leaves the result");
    return;
  }
  require((result.getType() == startType) == (error || warning),
          "result untouched exactly when an error or warning was logged");
  if (error || warning) return;
  if (name == "strLength") {
    require(result.getIntValue(-1) == static_cast<int>(std::strlen(args[0].getStringValue(-1))),
            "strLength is the byte length");
  } else if (name == "strTokArray") {
    checkTokenArray(args[0].getStringValue(-1), options, result);
  } else if (name == "strTok") {
    std::string delims;
    bool matchAll = false;
    if (effectiveTokenOptions(options, delims, matchAll) && !matchAll) {
      require(std::string(result.getStringValue(-1)).find_first_of(delims) == std::string::npos,
              "strTok token holds a delimiter");
    }
  }
}

}  // namespace

extern "C" int LLVMFuzzerTestOneInput(const uint8_t* bytes, size_t size) {
  FuzzedDataProvider data(bytes, size);
  for (int call = 0; call < 16 && data.remaining_bytes() > 0; ++call) runOneCall(data);
  return 0;
}
