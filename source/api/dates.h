#pragma once

namespace quire {

// Serial dates: a day count with the time of day as fraction, in the 1900 or the 1904 system.
double datePack(bool date1904, int year, int month, int day, int hour, int min, int sec, int msec);

// False (and nothing written) when the value lies outside the representable range.
bool dateUnpack(bool date1904, double value, int* year, int* month, int* day, int* hour, int* min,
                int* sec, int* msec);

}  // namespace quire
