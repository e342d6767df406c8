#include "hstring_array.h"

HStringArray::HStringArray() : TArray<HString>(kGrowStep) {}

HStringArray::~HStringArray() = default;
