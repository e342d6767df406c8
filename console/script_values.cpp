#include "script_values.h"

Variable stringValue(const char* text) {
  Variable value;
  value.setValue(text, -1);
  return value;
}

Variable integerValue(int value) {
  Variable result;
  result.setValue(value, -1);
  return result;
}
