#include "compare_search.h"

#include "command_frame.h"

namespace {

constexpr int kNoCaseOption = 0;
constexpr int kCompareOptionCount = 1;

}  // namespace

// strCompare

StrCompareCmd::StrCompareCmd() : Command("strCompare", "Compare Strings", "") {
  setCategory(*this, kStringCategory);
  declareFlagOption(*this, "noCase");
}

StrCompareCmd::~StrCompareCmd() = default;

void StrCompareCmd::deleteThis() {
  releaseCommand(*this);
}

const HRuntimeClass* StrCompareCmd::getRuntimeClass() const {
  return commandRuntimeClass();
}

bool StrCompareCmd::execute(const TArray<CommandOption>& options, const TArray<Variable>& args,
                            Variable& result) {
  const HString first(args[0].getStringValue(-1));
  const HString second(args[1].getStringValue(-1));
  bool noCase = false;
  for (int i = 0; i < options.count(); ++i) {
    if (declaredOptionIndex(options[i], kCompareOptionCount) == kNoCaseOption) noCase = true;
  }
  result.setValue(noCase ? first.CompareNoCase(second) : first.Compare(second), -1);
  return true;
}

void StrCompareCmd::getArgSyntaxString(HString& syntax) const {
  syntax = "\"string1\" \"string2\"";
}

bool StrCompareCmd::checkArgSyntax(const TArray<Variable>& args,
                                   const TArray<CommandOption>& /*options*/) const {
  return argumentsAre(args, {Variable::TypeString, Variable::TypeString});
}

bool StrCompareCmd::canExecuteSolo() const {
  return false;
}

Variable::VarType StrCompareCmd::getReturnType() const {
  return Variable::TypeInt;
}

// strFind

StrFindCmd::StrFindCmd() : Command("strFind", "Find Sub-string", "") {
  setCategory(*this, kStringCategory);
}

StrFindCmd::~StrFindCmd() = default;

void StrFindCmd::deleteThis() {
  releaseCommand(*this);
}

const HRuntimeClass* StrFindCmd::getRuntimeClass() const {
  return commandRuntimeClass();
}

bool StrFindCmd::execute(const TArray<CommandOption>& /*options*/, const TArray<Variable>& args,
                         Variable& result) {
  const HString text(args[0].getStringValue(-1));
  const HString sub(args[1].getStringValue(-1));
  const int start = args[2].getIntValue(-1);
  result.setValue(text.Find(sub, start), -1);
  return true;
}

void StrFindCmd::getArgSyntaxString(HString& syntax) const {
  syntax = "\"string\" \"subString\" index";
}

bool StrFindCmd::checkArgSyntax(const TArray<Variable>& args,
                                const TArray<CommandOption>& /*options*/) const {
  return argumentsAre(args, {Variable::TypeString, Variable::TypeString, Variable::TypeInt});
}

bool StrFindCmd::canExecuteSolo() const {
  return false;
}

Variable::VarType StrFindCmd::getReturnType() const {
  return Variable::TypeInt;
}

// strReverseFind

StrReverseFindCmd::StrReverseFindCmd() : Command("strReverseFind", "Find Char Reverse", "") {
  setCategory(*this, kStringCategory);
}

StrReverseFindCmd::~StrReverseFindCmd() = default;

void StrReverseFindCmd::deleteThis() {
  releaseCommand(*this);
}

const HRuntimeClass* StrReverseFindCmd::getRuntimeClass() const {
  return commandRuntimeClass();
}

bool StrReverseFindCmd::execute(const TArray<CommandOption>& /*options*/,
                                const TArray<Variable>& args, Variable& result) {
  const HString text(args[0].getStringValue(-1));
  HString findChar(args[1].getStringValue(-1));
  if (findChar.IsEmpty()) {
    Command::logError("Second argument cannot be an empty string");
    return false;
  }
  result.setValue(text.ReverseFind(findChar[0]), -1);
  return true;
}

void StrReverseFindCmd::getArgSyntaxString(HString& syntax) const {
  syntax = "\"string\" \"findChar\"";
}

bool StrReverseFindCmd::checkArgSyntax(const TArray<Variable>& args,
                                       const TArray<CommandOption>& /*options*/) const {
  return argumentsAre(args, {Variable::TypeString, Variable::TypeString});
}

bool StrReverseFindCmd::canExecuteSolo() const {
  return false;
}

Variable::VarType StrReverseFindCmd::getReturnType() const {
  return Variable::TypeInt;
}

// strLength

StrLengthCmd::StrLengthCmd() : Command("strLength", "Get Length of HString", "") {
  setCategory(*this, kStringCategory);
}

StrLengthCmd::~StrLengthCmd() = default;

void StrLengthCmd::deleteThis() {
  releaseCommand(*this);
}

const HRuntimeClass* StrLengthCmd::getRuntimeClass() const {
  return commandRuntimeClass();
}

bool StrLengthCmd::execute(const TArray<CommandOption>& /*options*/, const TArray<Variable>& args,
                           Variable& result) {
  const HString text(args[0].getStringValue(-1));
  result.setValue(text.GetLength(), -1);
  return true;
}

void StrLengthCmd::getArgSyntaxString(HString& syntax) const {
  syntax = "\"string\"";
}

bool StrLengthCmd::checkArgSyntax(const TArray<Variable>& args,
                                  const TArray<CommandOption>& /*options*/) const {
  return argumentsAre(args, {Variable::TypeString});
}

bool StrLengthCmd::canExecuteSolo() const {
  return false;
}

Variable::VarType StrLengthCmd::getReturnType() const {
  return Variable::TypeInt;
}
