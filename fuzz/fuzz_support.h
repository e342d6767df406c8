// What the fuzz harnesses share: the module, loaded once, and a check that
// stops the run with a message.
#pragma once

#include "../tools/plugin_session.h"

// The module beside the harness, loaded and initialised on first use.
PluginSession& fuzzedModule();

// Aborts, naming what broke, when condition is false.
void require(bool condition, const char* what);
