// What the fuzz harnesses share: a check that stops the run with a message,
// and the module they drive.
#pragma once

// Aborts, naming what broke, when condition is false.
void require(bool condition, const char* what);

class PluginSession;
// The module beside the harness, loaded once; aborts when it cannot be loaded.
PluginSession& fuzzedSession();
