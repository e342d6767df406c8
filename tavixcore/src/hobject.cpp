#include "hobject.h"

const HRuntimeClass HObject::s_classHObject = {"HObject", nullptr};

HObject::HObject() = default;

HObject::~HObject() = default;

const HRuntimeClass* HObject::getRuntimeClass() const {
  return &s_classHObject;
}
