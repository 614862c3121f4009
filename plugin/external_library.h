#pragma once
// Pointing the function table at an external library module that exports the flat entry points.
#include <string>

namespace quire_plugin {

// Loads the module at `path` (UTF-8) and fills the table from it; false, with the table unchanged,
// when the module cannot be loaded. True when the module exports qrBookReleaseW. Modules stay
// loaded: books made through them may still be alive.
bool loadExternalLibrary(const std::string& path);

// Why the last load failed; empty when it did not.
const std::string& externalLibraryError();
void clearExternalLibraryError();

}  // namespace quire_plugin
