// The growable array of strings in which strTokArray collects its tokens: the
// host's TArray<HString>, constructed with its grow step of 8.
#pragma once

#include "hstring.h"
#include "tarray.h"

class HStringArray : public TArray<HString> {
 public:
  ~HStringArray() override = default;
};
