// The root of the host's class tree and its run-time class records.
#pragma once

#include "core_export.h"

// Names a class and its base, for the host's run-time class queries.
struct HRuntimeClass {
  const char* className;
  const HRuntimeClass* baseClass;
};

class TAVIXCORE_API HObject {
 public:
  // Releases the object in the way its class owns it.
  virtual void deleteThis() = 0;

 protected:
  HObject();
  virtual ~HObject();

 public:
  virtual const HRuntimeClass* getRuntimeClass() const;

  static const HRuntimeClass s_classHObject;

  HObject(const HObject&) = delete;
  HObject& operator=(const HObject&) = delete;
};
