// The functions a command module exports by name, as the host calls them.
#pragma once

class CommandPluginBase;

// The interface version this host understands.
const int kPluginApiVersion = 0x80000;

typedef int (*ApiVersionFn)();
typedef bool (*IsDebugFn)();
typedef int (*GetNumPluginsFn)();
// A new plug-in object for index 0..getNumPlugins()-1, null otherwise; the
// caller owns it until it calls its deleteThis.
typedef CommandPluginBase* (*GetPluginFn)(int index);
typedef bool (*IsRuvanFn)();
