#include "token.h"

#include "command_frame.h"
#include "token_scan.h"

StrTokCmd::StrTokCmd()
    : Command("strTok", "Get HString Token", ""), m_remainder(""), m_remainderStart(0) {
  setCategory(*this, kStringCategory);
  declareStringOption(*this, "delims");
  declareFlagOption(*this, "matchAll");
}

StrTokCmd::~StrTokCmd() = default;

void StrTokCmd::deleteThis() {
  releaseCommand(*this);
}

const HRuntimeClass* StrTokCmd::getRuntimeClass() const {
  return commandRuntimeClass();
}

bool StrTokCmd::execute(const TArray<CommandOption>& options, const TArray<Variable>& args,
                        Variable& result) {
  // A new string replaces the remainder before any option is read, so it
  // stands even when the options are refused.
  if (args.count() != 0) {
    m_remainder = args[0].getStringValue(-1);
    m_remainderStart = 0;
  }
  TokenOptions tokenOptions;
  if (!readTokenOptions(options, tokenOptions)) return false;

  if (remainderIsEmpty()) {
    result.setValue("", -1);
    return true;
  }
  const HString token = nextToken(tokenOptions);
  result.setValue(token, -1);
  return true;
}

HString StrTokCmd::nextToken(const TokenOptions& options) {
  const TokenSpan span =
      options.matchAll ? scanMatchAllToken(m_remainder, m_remainderStart, options)
                       : scanCharSetToken(m_remainder, m_remainderStart, DelimiterSet(options));
  HString token = m_remainder.Mid(static_cast<size_t>(m_remainderStart),
                                  static_cast<size_t>(span.end - m_remainderStart));
  m_remainderStart = span.next;
  if (m_remainderStart >= m_remainder.GetLength()) {
    m_remainder.Empty();
    m_remainderStart = 0;
  }
  return token;
}

bool StrTokCmd::remainderIsEmpty() const {
  return m_remainderStart >= m_remainder.GetLength();
}

void StrTokCmd::getArgSyntaxString(HString& syntax) const {
  syntax = "\"string\"";
}

bool StrTokCmd::checkArgSyntax(const TArray<Variable>& args,
                               const TArray<CommandOption>& /*options*/) const {
  return args.count() == 0 || argumentsAre(args, {Variable::TypeString});
}

Variable::VarType StrTokCmd::getReturnType() const {
  return Variable::TypeString;
}
