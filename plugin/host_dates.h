#pragma once
// Host "Date" objects.
#include "host_sdk.h"

namespace quire_plugin {

struct DateParts {
    int year = 0, month = 0, day = 0, hour = 0, minute = 0, second = 0;
};

// A new host date through its constructor; nil when no date can be made.
REALobject newHostDate(const DateParts& parts);

// The parts of a host date; milliseconds are not read.
DateParts readHostDate(REALobject date);

}  // namespace quire_plugin
