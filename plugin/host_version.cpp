#include "host_version.h"

namespace quire_plugin {

namespace {
double versionNumber = 0.0;
int code = 9;
}  // namespace

int versionCodeFor(double number) {
    if (number >= 2013.04) return 13;
    if (number >= 2013.03) return 12;
    if (number >= 2013.0) return 11;
    if (number >= 2012.0) return 10;
    return 9;
}

void recordHostVersion(double number) {
    versionNumber = number;
    code = versionCodeFor(number);
}

double hostVersion() { return versionNumber; }
int versionCode() { return code; }

}  // namespace quire_plugin
