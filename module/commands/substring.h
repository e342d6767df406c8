// strLeft, strRight, strMid and strReplace: new strings cut from, or
// rewritten from, a script string. Script integers reach the host string
// sign-extended to sizes (-1 becomes 2^64 - 1); the host string clamps them.
#pragma once

#include "command.h"

// strLeft "string" count: the first count characters.
class StrLeftCmd : public Command {
 public:
  StrLeftCmd();
  void deleteThis() override;
  const HRuntimeClass* getRuntimeClass() const override;
  bool execute(const TArray<CommandOption>& options, const TArray<Variable>& args,
               Variable& result) override;
  void getArgSyntaxString(HString& syntax) const override;
  bool checkArgSyntax(const TArray<Variable>& args,
                      const TArray<CommandOption>& options) const override;
  bool canExecuteSolo() const override;
  Variable::VarType getReturnType() const override;

 protected:
  ~StrLeftCmd() override;
};

// strRight "string" count: the last count characters.
class StrRightCmd : public Command {
 public:
  StrRightCmd();
  void deleteThis() override;
  const HRuntimeClass* getRuntimeClass() const override;
  bool execute(const TArray<CommandOption>& options, const TArray<Variable>& args,
               Variable& result) override;
  void getArgSyntaxString(HString& syntax) const override;
  bool checkArgSyntax(const TArray<Variable>& args,
                      const TArray<CommandOption>& options) const override;
  bool canExecuteSolo() const override;
  Variable::VarType getReturnType() const override;

 protected:
  ~StrRightCmd() override;
};

// strMid "string" firstIndex count: count characters from firstIndex; a count of
// exactly -1 takes everything from firstIndex to the end.
class StrMidCmd : public Command {
 public:
  StrMidCmd();
  void deleteThis() override;
  const HRuntimeClass* getRuntimeClass() const override;
  bool execute(const TArray<CommandOption>& options, const TArray<Variable>& args,
               Variable& result) override;
  void getArgSyntaxString(HString& syntax) const override;
  bool checkArgSyntax(const TArray<Variable>& args,
                      const TArray<CommandOption>& options) const override;
  bool canExecuteSolo() const override;
  Variable::VarType getReturnType() const override;

 protected:
  ~StrMidCmd() override;
};

// strReplace "string" "subStringOld" "subStringNew": every occurrence replaced.
class StrReplaceCmd : public Command {
 public:
  StrReplaceCmd();
  void deleteThis() override;
  const HRuntimeClass* getRuntimeClass() const override;
  bool execute(const TArray<CommandOption>& options, const TArray<Variable>& args,
               Variable& result) override;
  void getArgSyntaxString(HString& syntax) const override;
  bool checkArgSyntax(const TArray<Variable>& args,
                      const TArray<CommandOption>& options) const override;
  bool canExecuteSolo() const override;
  Variable::VarType getReturnType() const override;

 protected:
  ~StrReplaceCmd() override;
};
