// The module's one plug-in: "Tavix String Commands". It creates the eleven
// string commands when the host calls initialize and hands them out by index.
// It owns its list's buffer, not the commands: they outlive it and are
// released through their own deleteThis.
#pragma once

#include "command.h"
#include "hstring.h"
#include "plugin_base.h"
#include "plugin_export.h"
#include "simple_array.h"

class TavixStringCommandsPlugin : public CommandPluginBase {
 public:
  // A new plug-in with an empty command list; the caller releases it with deleteThis.
  TAVIX_PLUGIN_EXPORT static TavixStringCommandsPlugin* createInstance();

  // Destroys this plug-in object and frees its memory in the module.
  TAVIX_PLUGIN_EXPORT void deleteThis() override;

  HString getMakerName() override;
  HString getPublisherName() override;
  // The compile date, as "Jan  8 2025".
  HString getBuildDate() override;
  HString getVersionString() override;
  HString getPluginName() override;
  HString getReleaseString() override;
  // Creates one object of each command class, in their fixed order, and
  // appends them to the list. A second call appends eleven more.
  bool initialize() override;
  bool isReady() override;
  int getNumCommands() override;
  // The command at index, or null outside 0..getNumCommands()-1.
  Command* getCommand(int index) override;

 private:
  TavixStringCommandsPlugin();
  ~TavixStringCommandsPlugin() override;

  TSimpleArray<Command*> m_commands;
};
