#include "compare_search.h"

#include "command.h"
#include "hstring.h"

namespace {

// strCompare's one option, with its declared-option index.
enum CompareOption { kNoCaseOption };
constexpr OptionDescription kCompareOptions[] = {{kNoCaseOption, "noCase", false}};
static_assert(optionsInOrder(kCompareOptions), "each option's index is its place");

}  // namespace

const CommandDescription StrCompareCmd::kDescription =
    stringCommand("strCompare", "Compare Strings", "\"string1\" \"string2\"", Variable::TypeInt)
        .withOptions(kCompareOptions);

const CommandDescription StrFindCmd::kDescription = stringCommand(
    "strFind", "Find Sub-string", "\"string\" \"subString\" index", Variable::TypeInt);

const CommandDescription StrReverseFindCmd::kDescription = stringCommand(
    "strReverseFind", "Find Char Reverse", "\"string\" \"findChar\"", Variable::TypeInt);

const CommandDescription StrLengthCmd::kDescription =
    stringCommand("strLength", "Get Length of HString", "\"string\"", Variable::TypeInt);

bool StrCompareCmd::run(const TArray<CommandOption>& options, const TArray<Variable>& args,
                        Variable& result) {
  const HString first(args[0].getStringValue(-1));
  const HString second(args[1].getStringValue(-1));
  bool noCase = false;
  for (int i = 0; i < options.count(); ++i) {
    if (options[i].getIndex() == kNoCaseOption) noCase = true;
  }
  result.setValue(noCase ? first.CompareNoCase(second) : first.Compare(second), -1);
  return true;
}

bool StrFindCmd::run(const TArray<CommandOption>& /*options*/, const TArray<Variable>& args,
                     Variable& result) {
  const HString text(args[0].getStringValue(-1));
  const HString sub(args[1].getStringValue(-1));
  result.setValue(text.Find(sub, args[2].getIntValue(-1)), -1);
  return true;
}

bool StrReverseFindCmd::run(const TArray<CommandOption>& /*options*/, const TArray<Variable>& args,
                            Variable& result) {
  const HString text(args[0].getStringValue(-1));
  const HString findChar(args[1].getStringValue(-1));
  if (findChar.IsEmpty()) {
    Command::logError("Second argument cannot be an empty string");
    return false;
  }
  result.setValue(text.ReverseFind(findChar[0]), -1);
  return true;
}

bool StrLengthCmd::run(const TArray<CommandOption>& /*options*/, const TArray<Variable>& args,
                       Variable& result) {
  const HString text(args[0].getStringValue(-1));
  result.setValue(text.GetLength(), -1);
  return true;
}
