// The plugin's only export: the host calls it once with its resolver.
#include "class_registration.h"
#include "debug_log.h"
#include "function_table.h"
#include "host_api.h"
#include "host_objects.h"
#include "host_version.h"

namespace {
const char* const kPluginName = "Qr";
const char* const kPluginVersion = "$$ Plugin version: 20.1 (2020) $$";
}  // namespace

extern "C" __attribute__((visibility("default"))) void REALPluginMain(REALresolver resolver) {
    using namespace quire_plugin;
    setHostResolver(resolver);
    recordHostVersion(hostVersionNumber());
    if (!resolver) return;
    registerPluginVersion(versionCode());

    recordPluginName(kPluginName);
    // Kept in the binary so that the version can be read from the file.
    static const char* volatile versionText = kPluginVersion;
    (void)versionText;
    for (const char* c = kPluginName; *c; ++c)
        if (*c == ' ') debugWrite("Warning: plugin name containts space character %s", kPluginName);

    fillWithInternalLibrary();

    registerClass(&filterColumnClass());
    registerClass(&autoFilterClass());
    registerClass(&formatClass());
    registerClass(&fontClass());
    registerClass(&sheetClass());
    registerClass(&bookClass());
    registerClass(&copyOptionsClass());
}
