// The host's plug-in base classes. A module hands the host an object derived
// from CommandPluginBase; the host asks it for its identity, tells it to
// create its commands (initialize) and reads them back by count and index.
#pragma once

#include "command.h"
#include "core_export.h"
#include "hobject.h"
#include "hstring.h"

class ScriptCmd;
namespace ControlSystem {
class ICommandProvider;
class IEventProvider;
}  // namespace ControlSystem

class TAVIXCORE_API HomCorePluginBase : public HObject {
 public:
  // Destroys the object with the host's own delete.
  void deleteThis() override;

 protected:
  HomCorePluginBase();
  ~HomCorePluginBase() override;

 public:
  const HRuntimeClass* getRuntimeClass() const override;

  virtual HString getMakerName() = 0;
  virtual HString getPublisherName() = 0;
  virtual HString getBuildDate() = 0;
  virtual HString getVersionString() = 0;
  virtual HString getPluginName() = 0;
  virtual HString getReleaseString() = 0;
  virtual bool initialize() = 0;
  virtual bool isReady() = 0;

  static const HRuntimeClass s_classHomCorePluginBase;
};

class TAVIXCORE_API CommandPluginBase : public HomCorePluginBase {
 public:
  void deleteThis() override;

 protected:
  CommandPluginBase();
  ~CommandPluginBase() override;

 public:
  const HRuntimeClass* getRuntimeClass() const override;

  virtual int getNumCommands() = 0;
  virtual Command* getCommand(int index) = 0;

  // The host's own; this host has none of these and answers 0 or null.
  virtual void loadScriptCommands();
  virtual int getNumScriptCommands() const;
  virtual ScriptCmd* getScriptCommand(int index) const;
  virtual int getNumControlStreamCommands() const;
  virtual ControlSystem::ICommandProvider* getControlStreamCommand(int index) const;
  virtual int getNumControlStreamEvents() const;
  virtual ControlSystem::IEventProvider* getControlStreamEvent(int index) const;

  static const HRuntimeClass s_classCommandPluginBase;
};
