// What the listing shows of a plug-in and its commands, for the renderers
// that write it.
#pragma once

#include "hstring.h"
#include "plugin_base.h"
#include "variable.h"

// The plug-in's identity strings, each by its key, in the order shown.
struct IdentityField {
  const char* key;
  HString (HomCorePluginBase::*value)();
};
inline constexpr IdentityField kIdentityFields[] = {
    {"maker", &HomCorePluginBase::getMakerName},
    {"publisher", &HomCorePluginBase::getPublisherName},
    {"buildDate", &HomCorePluginBase::getBuildDate},
    {"version", &HomCorePluginBase::getVersionString},
    {"name", &HomCorePluginBase::getPluginName},
    {"release", &HomCorePluginBase::getReleaseString},
};

// "integer", "string", "array of strings" or "none".
const char* typeName(Variable::VarType type);

// "true" or "false".
inline const char* boolText(bool value) {
  return value ? "true" : "false";
}
