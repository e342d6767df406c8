// The growable array of strings in which strTokArray collects its tokens.
#pragma once

#include "hstring.h"
#include "tarray.h"

class HStringArray : public TArray<HString> {
 public:
  static constexpr int kGrowStep = 8;

  HStringArray();
  ~HStringArray() override;
};
