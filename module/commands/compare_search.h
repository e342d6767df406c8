// strCompare, strFind, strReverseFind and strLength: questions about strings
// answered with an integer, stored exactly as the host string gives it.
#pragma once

#include "command.h"

// strCompare "string1" "string2" [-noCase]: the sign orders string1 against string2.
class StrCompareCmd : public Command {
 public:
  StrCompareCmd();
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
  ~StrCompareCmd() override;
};

// strFind "string" "subString" index: first position at or after index, negative when absent.
class StrFindCmd : public Command {
 public:
  StrFindCmd();
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
  ~StrFindCmd() override;
};

// strReverseFind "string" "findChar": last position of findChar's first
// character; an empty findChar is an error.
class StrReverseFindCmd : public Command {
 public:
  StrReverseFindCmd();
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
  ~StrReverseFindCmd() override;
};

// strLength "string": the length in bytes.
class StrLengthCmd : public Command {
 public:
  StrLengthCmd();
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
  ~StrLengthCmd() override;
};
