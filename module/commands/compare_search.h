// strCompare, strFind, strReverseFind and strLength: questions about strings
// answered with an integer, stored exactly as the host string gives it.
#pragma once

#include "command_frame.h"

// strCompare "string1" "string2" [-noCase]: the sign orders string1 against string2.
class StrCompareCmd : public CommandFrame<StrCompareCmd> {
 public:
  static const CommandDescription kDescription;
  static CommandRun run;
};

// strFind "string" "subString" index: first position at or after index, negative when absent.
class StrFindCmd : public CommandFrame<StrFindCmd> {
 public:
  static const CommandDescription kDescription;
  static CommandRun run;
};

// strReverseFind "string" "findChar": last position of findChar's first
// character; an empty findChar is an error.
class StrReverseFindCmd : public CommandFrame<StrReverseFindCmd> {
 public:
  static const CommandDescription kDescription;
  static CommandRun run;
};

// strLength "string": the length in bytes.
class StrLengthCmd : public CommandFrame<StrLengthCmd> {
 public:
  static const CommandDescription kDescription;
  static CommandRun run;
};
