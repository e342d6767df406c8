// strTokArray "string" [-delims set] [-matchAll]: all tokens of a string at
// once, as an array of strings. With no token at all it warns "Couldn't find
// any string tokens" and leaves the result as it was.
#pragma once

#include "command_frame.h"

class StrTokArrayCmd : public CommandFrame<StrTokArrayCmd> {
 public:
  static const CommandDescription kDescription;
  static CommandRun run;
};
