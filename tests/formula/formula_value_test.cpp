// The cached result of a formula cell, and the token-array questions the
// cell layer asks.

#include <gtest/gtest.h>

#include <cmath>
#include <limits>

#include "test_helpers.h"
#include "xls/formula/formula_value.h"
#include "xls/formula/parsed_formula.h"
#include "xls/formula/ptg_reader.h"

using namespace quire::xls;
using namespace quire::xls::test;

namespace {

std::string written(const FormulaValue& v)
{
    std::vector<uint8_t> bytes(FormulaValueSize);
    writeFormulaValue(v, bytes.data());
    return hex(bytes);
}

FormulaValue read(const std::string& h)
{
    const auto bytes = unhex(h);
    return readFormulaValue(bytes.data());
}

} // namespace

TEST(FormulaValue, Layout)
{
    EXPECT_EQ(written(FormulaValue::ofNumber(1.5)), "000000000000f83f");
    EXPECT_EQ(written(FormulaValue::ofString()), "000000000000ffff");
    EXPECT_EQ(written(FormulaValue::ofBoolean(true)), "010001000000ffff");
    EXPECT_EQ(written(FormulaValue::ofError(0x2A)), "02002a000000ffff");
    EXPECT_EQ(written(FormulaValue::ofBlank()), "030000000000ffff");
}

TEST(FormulaValue, ReadsEveryKind)
{
    EXPECT_EQ(read("000000000000f83f").kind, FormulaValue::Number);
    EXPECT_EQ(read("000000000000f83f").number, 1.5);
    EXPECT_EQ(read("000000000000ffff").kind, FormulaValue::String);
    EXPECT_EQ(read("010001000000ffff").kind, FormulaValue::Boolean);
    EXPECT_TRUE(read("010001000000ffff").boolean);
    EXPECT_FALSE(read("010000000000ffff").boolean);
    EXPECT_EQ(read("020007000000ffff").kind, FormulaValue::Error);
    EXPECT_EQ(read("020007000000ffff").error, 0x07);
    EXPECT_EQ(read("030000000000ffff").kind, FormulaValue::Blank);
    EXPECT_EQ(failure([] { read("090000000000ffff"); }), "FormulaBlock: file is corrupt");
}

TEST(FormulaValue, NotANumberIsWrittenAsAnError)
{
    // A NaN could carry 0xFFFF in its last bytes and read back as a string.
    const FormulaValue v = read(written(FormulaValue::ofNumber(-std::numeric_limits<double>::quiet_NaN())));
    EXPECT_EQ(v.kind, FormulaValue::Error);
    EXPECT_EQ(v.error, 0x24);
    EXPECT_EQ(read(written(FormulaValue::ofNumber(-0.0))).kind, FormulaValue::Number);
}

TEST(ParsedFormulaLayout, CellParsedFormula)
{
    ParsedFormula f;
    f.rgce = {0x1E, 0x01, 0x00};
    f.rgcb = {0xAA};
    EXPECT_EQ(hex(f.cellParsedFormula()), "03001e0100aa");
    const auto bytes = f.cellParsedFormula();
    const ParsedFormula back = ParsedFormula::fromCellParsedFormula(bytes.data(), bytes.size());
    EXPECT_EQ(back.rgce, f.rgce);
    EXPECT_EQ(back.rgcb, f.rgcb);
    const auto shortData = unhex("05001e01");
    EXPECT_EQ(failure([&] { ParsedFormula::fromCellParsedFormula(shortData.data(), shortData.size()); }),
              "error in formula");
}

TEST(TokenQuestions, Volatility)
{
    auto isVol = [](const std::string& h) {
        const auto b = unhex(h);
        return isVolatile(b.data(), b.size());
    };
    EXPECT_TRUE(isVol("19010000" "41dd00"));
    EXPECT_TRUE(isVol("42004a00"));                      // NOW()
    EXPECT_TRUE(isVol("24000000c01e01001e010022034e00"));  // OFFSET
    EXPECT_FALSE(isVol("1e01001e02001e03000503"));
    EXPECT_FALSE(isVol("250000020000c000c019100000"));
    EXPECT_TRUE(isVol("2400"));  // truncated: recalculate to be safe
    EXPECT_FALSE(isVol(""));
}

TEST(TokenQuestions, SharedFormulaAnchor)
{
    const auto b = unhex("0104000200");
    uint16_t row = 0, col = 0;
    ASSERT_TRUE(sharedFormulaAnchor(b.data(), b.size(), row, col));
    EXPECT_EQ(row, 4);
    EXPECT_EQ(col, 2);
    const auto other = unhex("1e0100");
    EXPECT_FALSE(sharedFormulaAnchor(other.data(), other.size(), row, col));
}

TEST(TokenQuestions, PtgSizes)
{
    const auto b = unhex("170201e900e000");
    EXPECT_EQ(ptgSize(b.data(), b.size()), 7u);
    EXPECT_EQ(ptgSize(b.data(), 6), 0u);
    const auto choose = unhex("19040200060008000900");
    EXPECT_EQ(ptgSize(choose.data(), choose.size()), 10u);
    EXPECT_EQ(ptgSize(choose.data(), 8), 0u);
}
