// strLeft, strRight, strMid and strReplace: new strings cut from a string or
// rewritten, as the host string gives them. Script integers reach the host
// string sign-extended to sizes, which it clamps to what the string holds.
#pragma once

#include "command_frame.h"

// strLeft "string" count: the first count characters.
class StrLeftCmd : public CommandFrame<StrLeftCmd> {
 public:
  static const CommandDescription kDescription;
  static CommandRun run;
};

// strRight "string" count: the last count characters.
class StrRightCmd : public CommandFrame<StrRightCmd> {
 public:
  static const CommandDescription kDescription;
  static CommandRun run;
};

// strMid "string" firstIndex count: count characters from firstIndex; a count
// of -1 takes everything to the end.
class StrMidCmd : public CommandFrame<StrMidCmd> {
 public:
  static const CommandDescription kDescription;
  static CommandRun run;
};

// strReplace "string" "subStringOld" "subStringNew": every occurrence replaced.
class StrReplaceCmd : public CommandFrame<StrReplaceCmd> {
 public:
  static const CommandDescription kDescription;
  static CommandRun run;
};
