#include "listing.h"

const IdentityField kIdentityFields[6] = {
    {"maker", &HomCorePluginBase::getMakerName},
    {"publisher", &HomCorePluginBase::getPublisherName},
    {"buildDate", &HomCorePluginBase::getBuildDate},
    {"version", &HomCorePluginBase::getVersionString},
    {"name", &HomCorePluginBase::getPluginName},
    {"release", &HomCorePluginBase::getReleaseString},
};

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
