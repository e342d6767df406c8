// Turns its input into a sequence of command calls on the loaded module and
// checks what must hold whatever a script passes.
#include <fuzzer/FuzzedDataProvider.h>

#include <algorithm>
#include <climits>
#include <cstdint>
#include <cstring>
#include <string>

#include "fuzz_support.h"
#include "log_capture.h"
#include "plugin_session.h"

namespace {

const int kInterestingInts[] = {0, 1, 2, 3, -1, -2, -5, INT_MIN, INT_MAX, INT_MIN + 1, 64};
const Variable::VarType kTypes[] = {Variable::TypeNone, Variable::TypeInt, Variable::TypeString,
                                    Variable::TypeStringArray};

Variable value(FuzzedDataProvider& data, Variable::VarType type) {
  Variable v;
  if (type == Variable::TypeInt) {
    v.setValue(
        data.ConsumeBool() ? data.PickValueInArray(kInterestingInts) : data.ConsumeIntegral<int>(),
        -1);
  } else if (type == Variable::TypeString) {
    std::string s = data.ConsumeRandomLengthString(48);
    s.erase(std::remove(s.begin(), s.end(), '\0'), s.end());  // host strings hold no NUL
    v.setValue(s.c_str(), -1);
  } else if (type == Variable::TypeStringArray) {
    v = Variable(Variable::TypeStringArray, data.ConsumeIntegralInRange(0, 3));
  }
  return v;
}

// The arguments a command takes, read from its syntax text: a quoted word is
// a string, a bare word an integer.
void addArgumentsOfItsShape(FuzzedDataProvider& data, const Command& command,
                            TArray<Variable>& args) {
  HString syntax;
  command.getArgSyntaxString(syntax);
  const char* text = syntax.GetStr();
  for (size_t i = 0; text[i] != '\0'; ++i) {
    if (i == 0 || text[i - 1] == ' ')
      args.add(value(data, text[i] == '"' ? Variable::TypeString : Variable::TypeInt));
  }
}

// The declared-option index of the command's option of that name, or -1.
int optionIndex(const Command& command, const char* name) {
  int index = -1;
  Variable::VarType type = Variable::TypeNone;
  return command.getOptionSyntax(name, index, type) == 1 ? index : -1;
}

// The delimiters the token commands should use for these options, and the
// mode; false when an empty delims value must make them fail.
bool tokenOptions(const Command& command, const TArray<CommandOption>& options, std::string& delims,
                  bool& matchAll) {
  const int delimsIndex = optionIndex(command, "delims");
  const int matchAllIndex = optionIndex(command, "matchAll");
  delims = " \t\n\r";
  matchAll = false;
  for (int i = 0; i < options.count(); ++i) {
    if (options[i].getIndex() == delimsIndex) delims = options[i].getValue().getStringValue(-1);
    if (options[i].getIndex() == delimsIndex && delims.empty()) return false;
    matchAll = matchAll || options[i].getIndex() == matchAllIndex;
  }
  return true;
}

void checkTokens(const Command& command, const std::string& input,
                 const TArray<CommandOption>& options, const Variable& result, bool array) {
  std::string delims;
  bool matchAll = false;
  if (!tokenOptions(command, options, delims, matchAll)) return;
  if (!array) {
    require(matchAll ||
                std::string(result.getStringValue(-1)).find_first_of(delims) == std::string::npos,
            "strTok token holds a delimiter");
    return;
  }
  std::string joined;
  for (int i = 0; i < result.getCount(); ++i) {
    const std::string element = result.getStringValue(i);
    require(matchAll || (!element.empty() && element.find_first_of(delims) == std::string::npos),
            "character-set element is empty or holds a delimiter");
    joined += (i > 0 ? delims : "") + element;
  }
  require(!matchAll || joined == input || joined + delims == input,
          "match-all elements do not join back to the text");
}

void runOneCall(FuzzedDataProvider& data) {
  PluginSession& s = fuzzedSession();
  Command& command = s.command(data.ConsumeIntegralInRange(0, s.commandCount() - 1));
  const std::string name = command.getName();

  TArray<Variable> args;
  if (data.ConsumeBool()) {  // the command's own shape, so that it runs
    if (name != "strTok" || data.ConsumeBool()) addArgumentsOfItsShape(data, command, args);
  } else {
    for (int i = data.ConsumeIntegralInRange(0, 4); i > 0; --i)
      args.add(value(data, data.PickValueInArray(kTypes)));
  }
  TArray<CommandOption> options;
  for (int i = data.ConsumeIntegralInRange(0, 4); i > 0; --i) {
    const int index =
        data.ConsumeBool() ? data.ConsumeIntegralInRange(-1, 2) : data.ConsumeIntegral<int>();
    options.add(CommandOption::given(index, value(data, data.PickValueInArray(kTypes))));
  }

  // A start value no successful run can leave: commands returning arrays
  // never return integers, and the others never return arrays.
  const bool returnsArray = command.getReturnType() == Variable::TypeStringArray;
  Variable result = returnsArray ? Variable() : Variable(Variable::TypeStringArray, 1);
  if (returnsArray) result.setValue(424242, -1);
  const Variable::VarType startType = result.getType();

  TArray<LogEntry> log;
  LogCapture capture(log);
  if (!command.checkArgSyntax(args, options)) {
    require(log.count() == 0, "argument check logged");
    return;
  }
  const bool ok = command.execute(options, args, result);
  bool error = false;
  bool warning = false;
  for (int i = 0; i < log.count(); ++i) {
    error = error || log[i].level == LogLevel::Error;
    warning = warning || log[i].level == LogLevel::Warning;
  }
  require(ok == !error, "execute returned false without an error, or true after one");
  if (name == "testPrint") {
    require(log.count() == 3 && result.getType() == startType,
            "testPrint logs three messages and leaves the result");
    return;
  }
  require((result.getType() == startType) == (error || warning),
          "result untouched exactly when an error or warning was logged");
  if (error || warning) return;
  if (name == "strLength") {
    require(result.getIntValue(-1) == static_cast<int>(std::strlen(args[0].getStringValue(-1))),
            "strLength is the byte length");
  } else if (name == "strTokArray" || name == "strTok") {
    checkTokens(command, args.count() > 0 ? args[0].getStringValue(-1) : "", options, result,
                name == "strTokArray");
  }
}

}  // namespace

extern "C" int LLVMFuzzerTestOneInput(const uint8_t* bytes, size_t size) {
  FuzzedDataProvider data(bytes, size);
  for (int call = 0; call < 16 && data.remaining_bytes() > 0; ++call) runOneCall(data);
  return 0;
}
