#include <gtest/gtest.h>

#include <clocale>
#include <cmath>
#include <cstdint>
#include <limits>

#include "lmx/binary.h"
#include "lmx/regex.h"
#include "lmx/value_conversion.h"

namespace {

TEST(BooleanValues, TrueFalseOneZero)
{
    bool value = false;
    EXPECT_EQ(lmx::read_boolean("1", value), lmx::ELMX_OK);
    EXPECT_TRUE(value);
    EXPECT_EQ(lmx::read_boolean("false", value), lmx::ELMX_OK);
    EXPECT_FALSE(value);
    EXPECT_EQ(lmx::read_boolean("true", value), lmx::ELMX_OK);
    EXPECT_TRUE(value);
    EXPECT_EQ(lmx::read_boolean("0", value), lmx::ELMX_OK);
    EXPECT_FALSE(value);
    EXPECT_EQ(lmx::read_boolean(" true\n", value), lmx::ELMX_OK);
    for (const char* text : {"yes", "True", "", "2", "t"})
        EXPECT_EQ(lmx::read_boolean(text, value), lmx::ELMX_VALUE_BAD_FORMAT) << text;
    EXPECT_EQ(lmx::write_boolean(true), "true");
    EXPECT_EQ(lmx::write_boolean(false), "false");
}

TEST(DoubleValues, ReadsSchemaSyntax)
{
    double value = 0;
    EXPECT_EQ(lmx::read_double("-1.5e3", value), lmx::ELMX_OK);
    EXPECT_EQ(value, -1500);
    EXPECT_EQ(lmx::read_double("+.5", value), lmx::ELMX_OK);
    EXPECT_EQ(value, 0.5);
    EXPECT_EQ(lmx::read_double("7.", value), lmx::ELMX_OK);
    EXPECT_EQ(value, 7);
    EXPECT_EQ(lmx::read_double("1E+2", value), lmx::ELMX_OK);
    EXPECT_EQ(value, 100);
    EXPECT_EQ(lmx::read_double("NaN", value), lmx::ELMX_OK);
    EXPECT_TRUE(std::isnan(value));
    EXPECT_EQ(lmx::read_double("-INF", value), lmx::ELMX_OK);
    EXPECT_EQ(value, -std::numeric_limits<double>::infinity());
    EXPECT_EQ(lmx::read_double("1e999", value), lmx::ELMX_OK);
    EXPECT_EQ(value, std::numeric_limits<double>::infinity());
    EXPECT_EQ(lmx::read_double("-1e-999", value), lmx::ELMX_OK);
    EXPECT_TRUE(value == 0 && std::signbit(value));
    for (const char* text : {"", ".", "e5", "1e", "1.2.3", "0x10", "inf", "nan", "1,5", "1 2", "--1", "+-1", "1e+-2"})
        EXPECT_EQ(lmx::read_double(text, value), lmx::ELMX_VALUE_BAD_FORMAT) << text;
}

TEST(DoubleValues, ReadingIgnoresADecimalCommaLocale)
{
    const std::string previous = std::setlocale(LC_NUMERIC, nullptr);
    if (!std::setlocale(LC_NUMERIC, "de_DE.UTF-8") && !std::setlocale(LC_NUMERIC, "fr_FR.UTF-8"))
        GTEST_SKIP() << "no decimal-comma locale installed";
    double value = 0;
    const lmx::elmx_error code = lmx::read_double("2.25", value);
    const std::string written = lmx::write_double(2.25);
    std::setlocale(LC_NUMERIC, previous.c_str());
    EXPECT_EQ(code, lmx::ELMX_OK);
    EXPECT_EQ(value, 2.25);
    EXPECT_EQ(written, "2.25");
}

TEST(DoubleValues, WritesSpecialValuesAndFourteenDigits)
{
    EXPECT_EQ(lmx::write_double(std::numeric_limits<double>::quiet_NaN()), "NaN");
    EXPECT_EQ(lmx::write_double(std::numeric_limits<double>::infinity()), "INF");
    EXPECT_EQ(lmx::write_double(-std::numeric_limits<double>::infinity()), "-INF");
    EXPECT_EQ(lmx::write_double(-0.0), "-0.0");
    EXPECT_EQ(lmx::write_double(0.0), "0.0");
    EXPECT_EQ(lmx::write_double(0.1), "0.1");
    EXPECT_EQ(lmx::write_double(1.0 / 3), "0.33333333333333");
    EXPECT_EQ(lmx::write_double(123456789012345678.0), "1.2345678901235e+17");
    EXPECT_EQ(lmx::write_double(42), "42");
    EXPECT_EQ(lmx::write_double(1e-7), "1e-07");
}

TEST(IntegerValues, RangeTestedAgainstTheType)
{
    std::int32_t signed_value = 0;
    EXPECT_EQ(lmx::read_integer("-2147483648", signed_value), lmx::ELMX_OK);
    EXPECT_EQ(signed_value, INT32_MIN);
    EXPECT_EQ(lmx::read_integer("+17", signed_value), lmx::ELMX_OK);
    EXPECT_EQ(signed_value, 17);
    EXPECT_EQ(lmx::read_integer("2147483648", signed_value), lmx::ELMX_VALUE_EXCEEDS_MAX);
    EXPECT_EQ(lmx::read_integer("-2147483649", signed_value), lmx::ELMX_VALUE_EXCEEDS_MIN);
    std::uint32_t unsigned_value = 0;
    EXPECT_EQ(lmx::read_integer("4294967295", unsigned_value), lmx::ELMX_OK);
    EXPECT_EQ(unsigned_value, UINT32_MAX);
    EXPECT_EQ(lmx::read_integer("-1", unsigned_value), lmx::ELMX_VALUE_EXCEEDS_MIN);
    EXPECT_EQ(lmx::read_integer("-0", unsigned_value), lmx::ELMX_OK);
    EXPECT_EQ(lmx::read_integer("4294967296", unsigned_value), lmx::ELMX_VALUE_EXCEEDS_MAX);
    for (const char* text : {"", "+", "-", "1.0", "1e3", "x", "+-1", "--1", "12a", "-1a"})
        EXPECT_EQ(lmx::read_integer(text, signed_value), lmx::ELMX_VALUE_BAD_FORMAT) << text;
    EXPECT_EQ(lmx::write_integer(-12), "-12");
    EXPECT_EQ(lmx::write_integer(UINT32_MAX), "4294967295");
}

TEST(BinaryValues, HexAndBase64RoundTrip)
{
    lmx::c_binary value;
    ASSERT_EQ(lmx::c_binary::from_hex("00ff7Fa0", value), lmx::ELMX_OK);
    EXPECT_EQ(value.bytes(), (std::vector<unsigned char>{0x00, 0xFF, 0x7F, 0xA0}));
    EXPECT_EQ(value.to_hex(), "00FF7FA0");
    EXPECT_EQ(lmx::c_binary::from_hex("0", value), lmx::ELMX_VALUE_BAD_FORMAT);
    EXPECT_EQ(lmx::c_binary::from_hex("zz", value), lmx::ELMX_VALUE_BAD_FORMAT);
    for (const std::string text : {"", "f", "fo", "foo", "foob", "fooba", "foobar"}) {
        lmx::c_binary original(std::vector<unsigned char>(text.begin(), text.end()));
        lmx::c_binary decoded;
        ASSERT_EQ(lmx::c_binary::from_base64(original.to_base64(), decoded), lmx::ELMX_OK) << text;
        EXPECT_EQ(decoded, original) << text;
    }
    EXPECT_EQ(lmx::c_binary(std::vector<unsigned char>{'f', 'o'}).to_base64(), "Zm8=");
    EXPECT_EQ(lmx::c_binary::from_base64("Zm9v\nYmFy", value), lmx::ELMX_OK);
    EXPECT_EQ(lmx::c_binary::from_base64("Zm9", value), lmx::ELMX_VALUE_BAD_FORMAT);
    EXPECT_EQ(lmx::c_binary::from_base64("Zm=v", value), lmx::ELMX_VALUE_BAD_FORMAT);
    EXPECT_EQ(lmx::c_binary::from_base64("Z!9v", value), lmx::ELMX_VALUE_BAD_FORMAT);
}

TEST(PatternFacets, WholeValueMustMatch)
{
    const lmx::c_regex guid("\\{[0-9A-F]{8}-[0-9A-F]{4}-[0-9A-F]{4}-[0-9A-F]{4}-[0-9A-F]{12}\\}");
    ASSERT_TRUE(guid.is_valid());
    EXPECT_TRUE(guid.matches("{00000000-0001-0002-0003-000000000004}"));
    EXPECT_FALSE(guid.matches("x{00000000-0001-0002-0003-000000000004}"));
    EXPECT_FALSE(lmx::c_regex("(").is_valid());
    EXPECT_FALSE(lmx::c_regex("(").matches("("));
    EXPECT_FALSE(lmx::c_regex("a*").matches(std::string(lmx::c_regex::longest_value + 1, 'a')));
}

}  // namespace
