#pragma once
// The "Constructor" of the classes whose objects only come from the library: host code cannot
// make them, so it does nothing.
#include "host_sdk.h"

namespace quire_plugin {
inline void objectConstructor(REALobject) {}
}  // namespace quire_plugin
