#include "plugin_base.h"

const HRuntimeClass HomCorePluginBase::s_classHomCorePluginBase = {"HomCorePluginBase",
                                                                   &HObject::s_classHObject};
const HRuntimeClass CommandPluginBase::s_classCommandPluginBase = {
    "CommandPluginBase", &HomCorePluginBase::s_classHomCorePluginBase};

HomCorePluginBase::HomCorePluginBase() = default;
HomCorePluginBase::~HomCorePluginBase() = default;

void HomCorePluginBase::deleteThis() {
  delete this;
}

const HRuntimeClass* HomCorePluginBase::getRuntimeClass() const {
  return &s_classHomCorePluginBase;
}

CommandPluginBase::CommandPluginBase() = default;
CommandPluginBase::~CommandPluginBase() = default;

void CommandPluginBase::deleteThis() {
  delete this;
}

const HRuntimeClass* CommandPluginBase::getRuntimeClass() const {
  return &s_classCommandPluginBase;
}

void CommandPluginBase::loadScriptCommands() {}

int CommandPluginBase::getNumScriptCommands() const {
  return 0;
}

ScriptCmd* CommandPluginBase::getScriptCommand(int /*index*/) const {
  return nullptr;
}

int CommandPluginBase::getNumControlStreamCommands() const {
  return 0;
}

ControlSystem::ICommandProvider* CommandPluginBase::getControlStreamCommand(int /*index*/) const {
  return nullptr;
}

int CommandPluginBase::getNumControlStreamEvents() const {
  return 0;
}

ControlSystem::IEventProvider* CommandPluginBase::getControlStreamEvent(int /*index*/) const {
  return nullptr;
}
