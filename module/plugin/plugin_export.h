// Marks the module's exports; everything else of the module stays hidden.
#pragma once

#if defined(_WIN32)
#define TAVIX_PLUGIN_EXPORT __declspec(dllexport)
#else
#define TAVIX_PLUGIN_EXPORT __attribute__((visibility("default")))
#endif
