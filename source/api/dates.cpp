#include "dates.h"

namespace quire {
namespace {

constexpr long kJulianOffset1900 = 2415019;
constexpr long kJulianOffset1904 = 2416481;

long julianDayNumber(long year, long month, long day) {
    long a = (month - 14) / 12;
    return (1461 * (year + 4800 + a)) / 4 + (367 * (month - 2 - 12 * a)) / 12 -
           (3 * ((year + 4900 + a) / 100)) / 4 + day - 32075;
}

void calendarDate(long jdn, int& year, int& month, int& day) {
    long l = jdn + 68569;
    long n = (4 * l) / 146097;
    l = l - (146097 * n + 3) / 4;
    long i = (4000 * (l + 1)) / 1461001;
    l = l - (1461 * i) / 4 + 31;
    long j = (80 * l) / 2447;
    day = static_cast<int>(l - (2447 * j) / 80);
    l = j / 11;
    month = static_cast<int>(j + 2 - 12 * l);
    year = static_cast<int>(100 * (n - 49) + i + l);
}

int daysInMonth(int year, int month) {
    static const int days[] = {31, 28, 31, 30, 31, 30, 31, 31, 30, 31, 30, 31};
    if (month == 2 && ((year % 4 == 0 && year % 100 != 0) || year % 400 == 0)) return 29;
    return days[(month - 1) % 12];
}

}  // namespace

double datePack(bool date1904, int year, int month, int day, int hour, int min, int sec, int msec) {
    double serial = 0;
    if (year >= 1 || month >= 1 || day >= 1) {
        long jdn = julianDayNumber(year, month, day);
        long days = jdn - (date1904 ? kJulianOffset1904 : kJulianOffset1900);
        // The 1900 system counts a 29 February 1900 that never was; dates before March sit one lower.
        if (!date1904 && jdn < julianDayNumber(1900, 3, 1)) days -= 1;
        serial = static_cast<double>(days);
    }
    return serial + hour / 24.0 + min / 1440.0 + sec / 86400.0 + msec / 86400000.0;
}

bool dateUnpack(bool date1904, double value, int* year, int* month, int* day, int* hour, int* min,
                int* sec, int* msec) {
    if (!(value > -657435.0 && value < 2958466.0)) return false;

    long whole = static_cast<long>(value);
    double fraction = value - static_cast<double>(whole) + 1e-11;
    if (fraction >= 1.0) fraction -= 1e-11;

    int y = 0, mo = 0, d = 0;
    if (whole >= 1) {
        calendarDate(whole + (date1904 ? kJulianOffset1904 : kJulianOffset1900), y, mo, d);
        // Reproduce the 1900 leap-year day: serial 60 is 29 February 1900.
        if (y == 1899 && mo == 12 && d == 31) {
            y = 1900; mo = 1; d = 1;
        } else if (y == 1900 && (mo == 1 || mo == 2)) {
            d += 1;
            if (mo == 1 && d == 32) { mo = 2; d = 1; }
        }
    }
    if (year) *year = y;
    if (month) *month = mo;
    if (day) *day = d;

    int h = 0, mi = 0, s = 0, ms = 0;
    if (hour || min || sec) {
        h = static_cast<int>(fraction * 24);
        fraction = fraction * 24 - h;
        if (min || sec) {
            mi = static_cast<int>(fraction * 60);
            fraction = fraction * 60 - mi;
        }
        if (sec) {
            s = static_cast<int>(fraction * 60);
            fraction = fraction * 60 - s;
            ms = static_cast<int>(fraction * 1000 + 0.5);
        }
    }
    if (msec && sec) {
        // Rounding to whole milliseconds may carry up through the units that were asked for.
        if (ms == 1000) {
            ms = 0;
            if (++s == 60) {
                s = 0;
                if (min && ++mi == 60) {
                    mi = 0;
                    if (hour && ++h == 24) {
                        h = 0;
                        if (day && d > 0) {
                            d += 1;
                            if (d > daysInMonth(y, mo)) {
                                d = 1;
                                if (month && ++mo > 12) {
                                    mo = 1;
                                    if (year) ++y;
                                }
                            }
                            *day = d;
                            if (month) *month = mo;
                            if (year) *year = y;
                        }
                    }
                }
            }
        }
    }
    if (hour) *hour = h;
    if (min) *min = mi;
    if (sec) *sec = s;
    if (msec) *msec = ms;
    return true;
}

}  // namespace quire
