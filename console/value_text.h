// How the console writes a script value: an integer in decimal, a string
// quoted, an array as a bracketed list of quoted strings; nothing for no value.
#pragma once

#include "output_stream.h"
#include "text_escape.h"
#include "variable.h"

void writeValue(OutputStream& out, const Variable& value, Escaping strings);
