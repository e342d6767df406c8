// The module built beside the running program, loaded on first use and kept
// for the whole run: the one that fuzzers and benchmarks drive.
#pragma once

#include "plugin_session.h"

// The session, or null after the reason was printed on standard error.
PluginSession* defaultSession();
