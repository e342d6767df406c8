#include "substring.h"

#include "command_frame.h"

// strLeft

StrLeftCmd::StrLeftCmd() : Command("strLeft", "Get Left Sub-string", "") {
  setCategory(*this, kStringCategory);
}

StrLeftCmd::~StrLeftCmd() = default;

void StrLeftCmd::deleteThis() {
  releaseCommand(*this);
}

const HRuntimeClass* StrLeftCmd::getRuntimeClass() const {
  return commandRuntimeClass();
}

bool StrLeftCmd::execute(const TArray<CommandOption>& /*options*/, const TArray<Variable>& args,
                         Variable& result) {
  const HString text(args[0].getStringValue(-1));
  const HString part = text.Left(widenToSize(args[1].getIntValue(-1)));
  result.setValue(part, -1);
  return true;
}

void StrLeftCmd::getArgSyntaxString(HString& syntax) const {
  syntax = "\"string\" count";
}

bool StrLeftCmd::checkArgSyntax(const TArray<Variable>& args,
                                const TArray<CommandOption>& /*options*/) const {
  return argumentsAre(args, {Variable::TypeString, Variable::TypeInt});
}

bool StrLeftCmd::canExecuteSolo() const {
  return false;
}

Variable::VarType StrLeftCmd::getReturnType() const {
  return Variable::TypeString;
}

// strRight

StrRightCmd::StrRightCmd() : Command("strRight", "Get Right Sub-string", "") {
  setCategory(*this, kStringCategory);
}

StrRightCmd::~StrRightCmd() = default;

void StrRightCmd::deleteThis() {
  releaseCommand(*this);
}

const HRuntimeClass* StrRightCmd::getRuntimeClass() const {
  return commandRuntimeClass();
}

bool StrRightCmd::execute(const TArray<CommandOption>& /*options*/, const TArray<Variable>& args,
                          Variable& result) {
  const HString text(args[0].getStringValue(-1));
  const HString part = text.Right(widenToSize(args[1].getIntValue(-1)));
  result.setValue(part, -1);
  return true;
}

void StrRightCmd::getArgSyntaxString(HString& syntax) const {
  syntax = "\"string\" count";
}

bool StrRightCmd::checkArgSyntax(const TArray<Variable>& args,
                                 const TArray<CommandOption>& /*options*/) const {
  return argumentsAre(args, {Variable::TypeString, Variable::TypeInt});
}

bool StrRightCmd::canExecuteSolo() const {
  return false;
}

Variable::VarType StrRightCmd::getReturnType() const {
  return Variable::TypeString;
}

// strMid

namespace {

constexpr int kMidToEnd = -1;

}  // namespace

StrMidCmd::StrMidCmd() : Command("strMid", "Get Middle Sub-string", "") {
  setCategory(*this, kStringCategory);
}

StrMidCmd::~StrMidCmd() = default;

void StrMidCmd::deleteThis() {
  releaseCommand(*this);
}

const HRuntimeClass* StrMidCmd::getRuntimeClass() const {
  return commandRuntimeClass();
}

bool StrMidCmd::execute(const TArray<CommandOption>& /*options*/, const TArray<Variable>& args,
                        Variable& result) {
  const HString text(args[0].getStringValue(-1));
  const size_t first = widenToSize(args[1].getIntValue(-1));
  const int count = args[2].getIntValue(-1);
  const HString part = count == kMidToEnd ? text.Mid(first) : text.Mid(first, widenToSize(count));
  result.setValue(part, -1);
  return true;
}

void StrMidCmd::getArgSyntaxString(HString& syntax) const {
  syntax = "\"string\" firstIndex count";
}

bool StrMidCmd::checkArgSyntax(const TArray<Variable>& args,
                               const TArray<CommandOption>& /*options*/) const {
  return argumentsAre(args, {Variable::TypeString, Variable::TypeInt, Variable::TypeInt});
}

bool StrMidCmd::canExecuteSolo() const {
  return false;
}

Variable::VarType StrMidCmd::getReturnType() const {
  return Variable::TypeString;
}

// strReplace

StrReplaceCmd::StrReplaceCmd() : Command("strReplace", "Replace Sub-string", "") {
  setCategory(*this, kStringCategory);
}

StrReplaceCmd::~StrReplaceCmd() = default;

void StrReplaceCmd::deleteThis() {
  releaseCommand(*this);
}

const HRuntimeClass* StrReplaceCmd::getRuntimeClass() const {
  return commandRuntimeClass();
}

bool StrReplaceCmd::execute(const TArray<CommandOption>& /*options*/, const TArray<Variable>& args,
                            Variable& result) {
  HString text(args[0].getStringValue(-1));
  text.Replace(args[1].getStringValue(-1), args[2].getStringValue(-1));
  result.setValue(text, -1);
  return true;
}

void StrReplaceCmd::getArgSyntaxString(HString& syntax) const {
  syntax = "\"string\" \"subStringOld\" \"subStringNew\"";
}

bool StrReplaceCmd::checkArgSyntax(const TArray<Variable>& args,
                                   const TArray<CommandOption>& /*options*/) const {
  return argumentsAre(args, {Variable::TypeString, Variable::TypeString, Variable::TypeString});
}

bool StrReplaceCmd::canExecuteSolo() const {
  return false;
}

Variable::VarType StrReplaceCmd::getReturnType() const {
  return Variable::TypeString;
}
