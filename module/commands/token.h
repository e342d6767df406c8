// strTok ["string"] [-delims set] [-matchAll]: one token per call. A call with
// a string makes it the remainder and takes its first token; a call without
// one goes on from what is left. Once the remainder is used up, calls return
// the empty string. The remainder belongs to this one command object.
#pragma once

#include "command_frame.h"
#include "hstring.h"
#include "token_scan.h"

class StrTokCmd : public CommandFrame<StrTokCmd> {
 public:
  static const CommandDescription kDescription;
  CommandRun run;

 private:
  // Takes the next token off a non-empty remainder and shortens it.
  HString nextToken(const TokenOptions& options);

  // The remainder is m_remainder from m_remainderStart on; keeping the start
  // instead of cutting the string makes a whole walk linear in the text.
  HString m_remainder{""};
  int m_remainderStart = 0;
};
