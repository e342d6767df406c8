// strTokArray "string" [-delims set] [-matchAll]: all tokens of a string at
// once, as an array of strings. With no token at all it warns "Couldn't find
// any string tokens" and leaves the result as it was.
#pragma once

#include "command.h"

class StrTokArrayCmd : public Command {
 public:
  StrTokArrayCmd();
  void deleteThis() override;
  const HRuntimeClass* getRuntimeClass() const override;
  bool execute(const TArray<CommandOption>& options, const TArray<Variable>& args,
               Variable& result) override;
  void getArgSyntaxString(HString& syntax) const override;
  bool checkArgSyntax(const TArray<Variable>& args,
                      const TArray<CommandOption>& options) const override;
  Variable::VarType getReturnType() const override;

 protected:
  ~StrTokArrayCmd() override;
};
