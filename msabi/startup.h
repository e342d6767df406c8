// What both entry points do before and after the program or library runs:
// run the static constructors, and keep the destructors registered with
// atexit in a table of this module's own.
#pragma once

// Prepares the table and runs every static constructor of this module.
void startModule();
// Runs the registered destructors, last registered first.
void finishModule();
