#pragma once
// The host's version, learnt once at start-up, and the version code derived from it, which
// chooses the class-definition layout.

namespace quire_plugin {

void recordHostVersion(double number);
double hostVersion();
int versionCode();

// 13 from 2013.04, 12 from 2013.03, 11 from 2013.0, 10 from 2012.0, else 9.
int versionCodeFor(double number);

// Hosts from 2012.0 convert text with "PluginGetStringData" and build it with an encoding.
inline bool hostHasStringData() { return hostVersion() >= 2012.0; }
// Hosts from 2013.0 take UTF-32 text directly.
inline bool hostTakesUtf32() { return hostVersion() >= 2013.0; }
// Hosts from 2017.0 give memory block data through functions.
inline bool hostHasMemoryBlockAccessors() { return hostVersion() >= 2017.0; }

}  // namespace quire_plugin
