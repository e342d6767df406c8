// What the fuzz harnesses share: a check that stops the run with a message.
#pragma once

// Aborts, naming what broke, when condition is false.
void require(bool condition, const char* what);
