#include "default_session.h"

#include <stdio.h>

PluginSession* defaultSession() {
  static PluginSession* const session = [] {
    HString error;
    Owned<PluginSession> opened = PluginSession::open(defaultModulePath().GetStr(), error);
    if (!opened) fprintf(stderr, "%s\n", error.GetStr());
    return opened.release();
  }();
  return session;
}
