#include "listing.h"

const char* typeName(Variable::VarType type) {
  switch (type) {
    case Variable::TypeInt:
      return "integer";
    case Variable::TypeString:
      return "string";
    case Variable::TypeStringArray:
      return "array of strings";
    case Variable::TypeNone:
      break;
  }
  return "none";
}
