// What both entry points do before and after the program or library runs:
// choose the stack cookie, run the static constructors, and keep the
// destructors registered with atexit in a table of this module's own.
#pragma once

// Chooses this module's stack cookie: the first thing each entry point does,
// in a frame of its own that keeps no cookie.
extern "C" void __security_init_cookie();

// Prepares the table and runs every static constructor of this module.
void startModule();
// Runs the registered destructors, last registered first.
void finishModule();
