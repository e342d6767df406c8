#include "token.h"

const CommandDescription StrTokCmd::kDescription =
    stringCommand("strTok", "Get HString Token", "\"string\"", Variable::TypeString,
                  kOptionalArguments | kHostSoloAnswer)
        .withOptions(kTokenOptions);

bool StrTokCmd::run(const TArray<CommandOption>& options, const TArray<Variable>& args,
                    Variable& result) {
  // A new string replaces the remainder before any option is read, so it
  // stands even when the options are refused.
  if (args.count() != 0) {
    m_remainder = args[0].getStringValue(-1);
    m_remainderStart = 0;
  }
  TokenOptions tokenOptions;
  if (!readTokenOptions(options, tokenOptions)) return false;
  if (m_remainderStart >= m_remainder.GetLength()) {
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
  HString token(m_remainder.Mid(static_cast<size_t>(m_remainderStart),
                                static_cast<size_t>(span.end - m_remainderStart)));
  m_remainderStart = span.next;
  if (m_remainderStart >= m_remainder.GetLength()) {
    m_remainder.Empty();
    m_remainderStart = 0;
  }
  return token;
}
