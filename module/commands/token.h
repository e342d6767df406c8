// strTok ["string"] [-delims set] [-matchAll]: one token per call. A call with
// a string makes it the remainder and takes its first token; a call without
// one goes on from what is left. Once the remainder is used up, calls return
// the empty string. The remainder belongs to this one command object.
#pragma once

#include "command.h"
#include "hstring.h"
#include "token_scan.h"

class StrTokCmd : public Command {
 public:
  StrTokCmd();
  void deleteThis() override;
  const HRuntimeClass* getRuntimeClass() const override;
  bool execute(const TArray<CommandOption>& options, const TArray<Variable>& args,
               Variable& result) override;
  void getArgSyntaxString(HString& syntax) const override;
  bool checkArgSyntax(const TArray<Variable>& args,
                      const TArray<CommandOption>& options) const override;
  Variable::VarType getReturnType() const override;

 protected:
  ~StrTokCmd() override;

 private:
  // Takes the next token off a non-empty remainder and shortens it.
  HString nextToken(const TokenOptions& options);
  bool remainderIsEmpty() const;

  // The remainder is m_remainder from m_remainderStart on; keeping the start
  // instead of cutting the string makes a whole walk linear in the text.
  HString m_remainder;
  int m_remainderStart;
};
