#include "host_dates.h"

#include "debug_log.h"
#include "host_api.h"

namespace quire_plugin {

namespace {
const char* const kConstructorWithOffset =
    "Constructor(Year as Integer, Month as Integer, Day as Integer, Hour as Integer, Minute as Integer, "
    "Second as Integer, GMTOffset as Double)";
const char* const kConstructor =
    "Constructor(Year as Integer, Month as Integer, Day as Integer, hour as Integer, minute as Integer, "
    "second as Integer)";
// Tells the constructor to use the local time zone.
constexpr double kLocalTimeZone = -10000.0;

RBInteger readInteger(REALobject object, const char* name) {
    RBInteger value = 0;
    getPropertyInteger(object, name, &value);
    return value;
}
}  // namespace

REALobject newHostDate(const DateParts& p) {
    if (debugging()) debugLine("NewDate", p.year, p.month, p.day, p.hour, p.minute, p.second);
    REALobject date = newInstance("Date");
    if (!date) return nullptr;
    using WithOffset = void (*)(REALobject, RBInteger, RBInteger, RBInteger, RBInteger, RBInteger, RBInteger, double);
    using Plain = void (*)(REALobject, RBInteger, RBInteger, RBInteger, RBInteger, RBInteger, RBInteger);
    if (auto constructor = reinterpret_cast<WithOffset>(loadObjectMethod(date, kConstructorWithOffset))) {
        constructor(date, p.year, p.month, p.day, p.hour, p.minute, p.second, kLocalTimeZone);
    } else if (auto plain = reinterpret_cast<Plain>(loadObjectMethod(date, kConstructor))) {
        plain(date, p.year, p.month, p.day, p.hour, p.minute, p.second);
    } else {
        debugWrite("Date Constructor 3 missing!?");
        // The day first, so that no intermediate date overflows its month.
        setPropertyInteger(date, "Day", 3);
        setPropertyInteger(date, "Year", p.year);
        setPropertyInteger(date, "Month", p.month);
        setPropertyInteger(date, "Day", p.day);
        setPropertyInteger(date, "Hour", p.hour);
        setPropertyInteger(date, "Minute", p.minute);
        setPropertyInteger(date, "Second", p.second);
    }
    return date;
}

DateParts readHostDate(REALobject date) {
    DateParts parts;
    parts.year = static_cast<int>(readInteger(date, "Year"));
    parts.month = static_cast<int>(readInteger(date, "Month"));
    parts.day = static_cast<int>(readInteger(date, "Day"));
    parts.hour = static_cast<int>(readInteger(date, "Hour"));
    parts.minute = static_cast<int>(readInteger(date, "Minute"));
    parts.second = static_cast<int>(readInteger(date, "Second"));
    return parts;
}

}  // namespace quire_plugin
