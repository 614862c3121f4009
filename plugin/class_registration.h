#pragma once
// Handing class definitions to the host: each definition is checked (findings go to the debug
// output) and registered in the layout that the host's version code asks for.
#include "host_sdk.h"

namespace quire_plugin {

// The plugin name, recorded at start-up; registration needs it.
void recordPluginName(const char* name);

void registerClass(REALclassDefinition* definition);

}  // namespace quire_plugin
