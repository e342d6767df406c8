#include "value_text.h"

void writeValue(OutputStream& out, const Variable& value, Escaping strings) {
  switch (value.getType()) {
    case Variable::TypeInt:
      out << value.getIntValue(-1);
      break;
    case Variable::TypeString:
      writeText(out, value.getStringValue(-1), strings);
      break;
    case Variable::TypeStringArray:
      out << '[';
      for (int i = 0; i < value.getCount(); ++i) {
        if (i > 0) out << ", ";
        writeText(out, value.getStringValue(i), strings);
      }
      out << ']';
      break;
    case Variable::TypeNone:
      break;
  }
}
