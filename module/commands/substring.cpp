#include "substring.h"

#include "hstring.h"

namespace {

// The one count that takes everything from firstIndex to the end.
constexpr int kMidToEnd = -1;

// The part that cut takes of argument 0, sized by argument 1, as the result.
template <class Cut>
bool storePart(const TArray<Variable>& args, Variable& result, Cut cut) {
  HString text(args[0].getStringValue(-1));
  const HString part = cut(text, widenToSize(args[1].getIntValue(-1)));
  result.setValue(part, -1);
  return true;
}

}  // namespace

const CommandDescription StrLeftCmd::kDescription =
    stringCommand("strLeft", "Get Left Sub-string", "\"string\" count", Variable::TypeString);

const CommandDescription StrRightCmd::kDescription =
    stringCommand("strRight", "Get Right Sub-string", "\"string\" count", Variable::TypeString);

const CommandDescription StrMidCmd::kDescription = stringCommand(
    "strMid", "Get Middle Sub-string", "\"string\" firstIndex count", Variable::TypeString);

const CommandDescription StrReplaceCmd::kDescription =
    stringCommand("strReplace", "Replace Sub-string",
                  "\"string\" \"subStringOld\" \"subStringNew\"", Variable::TypeString);

bool StrLeftCmd::run(const TArray<CommandOption>& /*options*/, const TArray<Variable>& args,
                     Variable& result) {
  return storePart(args, result, [](HString& text, size_t count) { return text.Left(count); });
}

bool StrRightCmd::run(const TArray<CommandOption>& /*options*/, const TArray<Variable>& args,
                      Variable& result) {
  return storePart(args, result, [](HString& text, size_t count) { return text.Right(count); });
}

bool StrMidCmd::run(const TArray<CommandOption>& /*options*/, const TArray<Variable>& args,
                    Variable& result) {
  HString text(args[0].getStringValue(-1));
  const size_t first = widenToSize(args[1].getIntValue(-1));
  const int count = args[2].getIntValue(-1);
  const HString part = count == kMidToEnd ? text.Mid(first) : text.Mid(first, widenToSize(count));
  result.setValue(part, -1);
  return true;
}

bool StrReplaceCmd::run(const TArray<CommandOption>& /*options*/, const TArray<Variable>& args,
                        Variable& result) {
  HString text(args[0].getStringValue(-1));
  text.Replace(args[1].getStringValue(-1), args[2].getStringValue(-1));
  result.setValue(text, -1);
  return true;
}
