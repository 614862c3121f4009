#include <gtest/gtest.h>

#include "api/dates.h"

namespace quire {
namespace {

struct Unpacked {
    int year = -1, month = -1, day = -1, hour = -1, min = -1, sec = -1, msec = -1;
};

Unpacked unpack(double value, bool date1904 = false) {
    Unpacked u;
    EXPECT_TRUE(dateUnpack(date1904, value, &u.year, &u.month, &u.day, &u.hour, &u.min, &u.sec, &u.msec));
    return u;
}

TEST(DatePack, SerialsOfThe1900System) {
    EXPECT_EQ(datePack(false, 1900, 1, 1, 0, 0, 0, 0), 1.0);
    EXPECT_EQ(datePack(false, 1900, 2, 28, 0, 0, 0, 0), 59.0);
    EXPECT_EQ(datePack(false, 1900, 3, 1, 0, 0, 0, 0), 61.0);
    EXPECT_EQ(datePack(false, 2000, 1, 1, 0, 0, 0, 0), 36526.0);
    EXPECT_EQ(datePack(false, 2026, 12, 6, 0, 0, 0, 0), 46362.0);
}

TEST(DatePack, SerialsOfThe1904System) {
    EXPECT_EQ(datePack(true, 1904, 1, 2, 0, 0, 0, 0), 1.0);
    EXPECT_EQ(datePack(true, 2000, 1, 1, 0, 0, 0, 0), 36526.0 - 1462);
}

TEST(DatePack, TimeOnlyAndOverflowingFields) {
    EXPECT_DOUBLE_EQ(datePack(false, 0, 0, 0, 12, 0, 0, 0), 0.5);
    EXPECT_DOUBLE_EQ(datePack(false, 0, 0, 0, 6, 30, 0, 0), 0.25 + 30.0 / 1440);
    // Month 13 is January of the next year; day 0 the last day of the month before.
    EXPECT_EQ(datePack(false, 2019, 13, 1, 0, 0, 0, 0), datePack(false, 2020, 1, 1, 0, 0, 0, 0));
    EXPECT_EQ(datePack(false, 2020, 3, 0, 0, 0, 0, 0), datePack(false, 2020, 2, 29, 0, 0, 0, 0));
}

TEST(DateUnpack, TheFictitiousLeapDayAndItsNeighbours) {
    Unpacked u = unpack(60);
    EXPECT_EQ(u.year, 1900);
    EXPECT_EQ(u.month, 2);
    EXPECT_EQ(u.day, 29);
    u = unpack(1);
    EXPECT_EQ(u.month, 1);
    EXPECT_EQ(u.day, 1);
    u = unpack(32);
    EXPECT_EQ(u.month, 2);
    EXPECT_EQ(u.day, 1);
    u = unpack(61);
    EXPECT_EQ(u.month, 3);
    EXPECT_EQ(u.day, 1);
}

TEST(DateUnpack, RoundTripsOverCenturies) {
    for (int year : {1900, 1901, 1999, 2000, 2024, 2100, 9999}) {
        for (int month = 1; month <= 12; ++month) {
            double serial = datePack(false, year, month, 15, 13, 14, 15, 0);
            Unpacked u = unpack(serial);
            EXPECT_EQ(u.year, year);
            EXPECT_EQ(u.month, month);
            EXPECT_EQ(u.day, 15);
            EXPECT_EQ(u.hour, 13);
            EXPECT_EQ(u.min, 14);
            EXPECT_EQ(u.sec, 15);
            EXPECT_EQ(u.msec, 0);
        }
    }
    Unpacked u = unpack(datePack(true, 2010, 7, 4, 0, 0, 0, 0), true);
    EXPECT_EQ(u.year, 2010);
    EXPECT_EQ(u.month, 7);
    EXPECT_EQ(u.day, 4);
}

TEST(DateUnpack, PureTimeHasNoDate) {
    Unpacked u = unpack(0.5);
    EXPECT_EQ(u.year, 0);
    EXPECT_EQ(u.month, 0);
    EXPECT_EQ(u.day, 0);
    EXPECT_EQ(u.hour, 12);
}

TEST(DateUnpack, OutOfRangeWritesNothing) {
    int year = 123;
    EXPECT_FALSE(dateUnpack(false, 2958466, &year, nullptr, nullptr, nullptr, nullptr, nullptr, nullptr));
    EXPECT_FALSE(dateUnpack(false, -657435, &year, nullptr, nullptr, nullptr, nullptr, nullptr, nullptr));
    EXPECT_EQ(year, 123);
    EXPECT_TRUE(dateUnpack(false, 2958465.5, &year, nullptr, nullptr, nullptr, nullptr, nullptr, nullptr));
    EXPECT_EQ(year, 9999);
}

TEST(DateUnpack, MillisecondsRoundingCarriesIntoTheNextDay) {
    double serial = datePack(false, 2020, 1, 31, 23, 59, 59, 0) + 0.9996 / 86400;
    Unpacked u = unpack(serial);
    EXPECT_EQ(u.msec, 0);
    EXPECT_EQ(u.sec, 0);
    EXPECT_EQ(u.min, 0);
    EXPECT_EQ(u.hour, 0);
    EXPECT_EQ(u.day, 1);
    EXPECT_EQ(u.month, 2);
}

TEST(DateUnpack, SecondsWithoutMinutesStillCountFromTheHour) {
    double serial = datePack(false, 2020, 5, 5, 10, 20, 30, 0);
    int hour = 0, sec = 0;
    ASSERT_TRUE(dateUnpack(false, serial, nullptr, nullptr, nullptr, &hour, nullptr, &sec, nullptr));
    EXPECT_EQ(hour, 10);
    EXPECT_EQ(sec, 30);
}

}  // namespace
}  // namespace quire
