// Script values built in one step, as a host builds arguments and option values.
#pragma once

#include "variable.h"

Variable stringValue(const char* text);
Variable integerValue(int value);
