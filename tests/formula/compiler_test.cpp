// Formula text to tokens: exact bytes and the compiler's messages.

#include <gtest/gtest.h>

#include "fake_book.h"
#include "test_helpers.h"
#include "xls/formula/formula_compiler.h"

using namespace quire::xls;
using namespace quire::xls::test;

namespace {

std::string compile(const std::wstring& text, FakeBook& book, int sheet = 0)
{
    return hex(MakeFormula(text, book, sheet).rgce);
}

std::string compile(const std::wstring& text)
{
    FakeBook book;
    return compile(text, book);
}

std::string compileFailure(const std::wstring& text)
{
    FakeBook book;
    return failure([&] { MakeFormula(text, book, 0); });
}

} // namespace

TEST(Compiler, ArithmeticFollowsPrecedence)
{
    EXPECT_EQ(compile(L"1+2*3"), "1e01001e02001e03000503");
    EXPECT_EQ(compile(L"(1+2)*3"), "1e01001e020003151e030005");
    EXPECT_EQ(compile(L"1-2-3"), "1e01001e0200041e030004");  // left to right
    EXPECT_EQ(compile(L"2^3^2"), "1e02001e0300071e020007");
    EXPECT_EQ(compile(L"8/4"), "1e08001e040006");
}

TEST(Compiler, UnaryMinusBindsTighterThanPower)
{
    EXPECT_EQ(compile(L"-2^2"), "1e0200131e020007");
    EXPECT_EQ(compile(L"+A1"), "44000000c012");
    EXPECT_EQ(compile(L"--A1"), "44000000c01313");
    EXPECT_EQ(compile(L"2*-3"), "1e02001e03001305");
    EXPECT_EQ(compile(L"1-(-1)"), "1e01001e0100131504");
}

TEST(Compiler, PercentIsPostfix)
{
    EXPECT_EQ(compile(L"50%"), "1e320014");
    EXPECT_EQ(compile(L"-A1%"), "44000000c01314");
    // A minus after a percent sign subtracts.
    EXPECT_EQ(compile(L"10%-1"), "1e0a00141e010004");
}

TEST(Compiler, ComparisonsBindTighterThanEquality)
{
    // A1=B1<C1 is A1=(B1<C1).
    EXPECT_EQ(compile(L"A1=B1<C1"), "44000000c044000001c044000002c0090b");
    EXPECT_EQ(compile(L"A1<=B1"), "44000000c044000001c00a");
    EXPECT_EQ(compile(L"A1>=B1"), "44000000c044000001c00c");
    EXPECT_EQ(compile(L"A1<>B1"), "44000000c044000001c00e");
    EXPECT_EQ(compile(L"A1>B1"), "44000000c044000001c00d");
}

TEST(Compiler, ConcatenationBindsLoosest)
{
    EXPECT_EQ(compile(L"\"a\"&1+2"), "17010161001e01001e02000308");
}

TEST(Compiler, IntegersAndDoubles)
{
    EXPECT_EQ(compile(L"0"), "1e0000");
    EXPECT_EQ(compile(L"65535"), "1effff");
    EXPECT_EQ(compile(L"65536"), "1f000000000000f040");
    EXPECT_EQ(compile(L"1.5"), "1f000000000000f83f");
    EXPECT_EQ(compile(L"1E3"), "1f0000000000408f40");
    EXPECT_EQ(compile(L"000012"), "1f0000000000002840");  // six digits: not ptgInt
}

TEST(Compiler, StringsBooleansErrors)
{
    EXPECT_EQ(compile(L"\"say \"\"hi\"\"\""), "17080173006100790020002200680069002200");
    EXPECT_EQ(compile(L"\"\""), "170001");
    EXPECT_EQ(compile(L"TRUE"), "1d01");
    EXPECT_EQ(compile(L"false"), "1d00");
    EXPECT_EQ(compile(L"#N/A"), "1c2a");
    EXPECT_EQ(compile(L"#DIV/0!"), "1c07");
    EXPECT_EQ(compile(L"#NULL!"), "1c00");
    EXPECT_EQ(compile(L"#VALUE!"), "1c0f");
    EXPECT_EQ(compile(L"#REF!"), "1c17");
    EXPECT_EQ(compile(L"#NAME?"), "1c1d");
    EXPECT_EQ(compile(L"#NUM!"), "1c24");
    EXPECT_EQ(compileFailure(std::wstring(256, L'x').insert(0, L"\"") + L"\""),
              "ShortXLUnicodeString: string is too long");
    EXPECT_EQ(compileFailure(L"\"" + std::wstring(255, L'x') + L"\""), "");
}

TEST(Compiler, SingleErrorIsDetected)
{
    FakeBook book;
    uint8_t code = 0;
    EXPECT_TRUE(isSingleError(MakeFormula(L"#N/A", book, 0), code));
    EXPECT_EQ(code, 0x2A);
    EXPECT_FALSE(isSingleError(MakeFormula(L"1", book, 0), code));
}

TEST(Compiler, References)
{
    EXPECT_EQ(compile(L"A1"), "24000000c0");
    EXPECT_EQ(compile(L"$A$1"), "2400000000");
    EXPECT_EQ(compile(L"A$1"), "2400000040");
    EXPECT_EQ(compile(L"$A1"), "2400000080");
    EXPECT_EQ(compile(L"IV65536"), "24ffffffc0");
    EXPECT_EQ(compile(L"A1:B2"), "250000010000c001c0");
    EXPECT_EQ(compile(L"$A$1:$B$2"), "250000010000000100");
    EXPECT_EQ(compile(L"A:C"), "250000ffff00400240");
    EXPECT_EQ(compile(L"2:3"), "25010002000080ff80");
}

TEST(Compiler, ReferenceLimits)
{
    EXPECT_EQ(compileFailure(L"IW1"), "Column is out of range");
    EXPECT_EQ(compileFailure(L"A65537"), "Row is out of range");
    EXPECT_EQ(compileFailure(L"A0"), "Row is out of range");
    EXPECT_EQ(compileFailure(L"A1:IW2"), "Column is out of range");
    EXPECT_EQ(compileFailure(L"A12345678901"), "MakeFormula::isReference: can't convert string to number");
}

TEST(Compiler, ThreeDimensionalReferencesGoThroughTheXtiTable)
{
    FakeBook book;
    EXPECT_EQ(compile(L"Sheet2!A1", book), "3a0000000000c0");
    EXPECT_EQ(compile(L"Sheet3!$B$2:C4", book), "3b010001000300010002c0");
    EXPECT_EQ(compile(L"'My Sheet'!A1+sheet2!B1", book), "5a0200000000c05a0000000001c003");
    EXPECT_EQ(compile(L"Sheet1:Sheet3!A1", book), "3a0300000000c0");
    EXPECT_EQ(compile(L"'2019'!A1", book), "3a0400000000c0");
    ASSERT_EQ(book.xtis.size(), 5u);
    EXPECT_EQ(book.xtis[0].first, 1);
    EXPECT_EQ(book.xtis[3].first, 0);
    EXPECT_EQ(book.xtis[3].last, 2);
    EXPECT_EQ(compileFailure(L"Nowhere!A1"), "incorrect token in formula");
}

TEST(Compiler, DefinedNames)
{
    FakeBook book;
    const unsigned global = book.addName(L"Rate");
    const unsigned local = book.addName(L"Rate", 1);
    EXPECT_EQ(global, 1u);
    // The sheet's own name wins over the workbook's.
    EXPECT_EQ(compile(L"Rate*2", book, 0), "23010000001e020005");
    EXPECT_EQ(compile(L"rate*2", book, 1), "23020000001e020005");
    EXPECT_EQ(compile(L"Sheet2!Rate", book, 0), "2302000000");
    EXPECT_EQ(local, 2u);
    EXPECT_EQ(failure([&] { MakeFormula(L"Unknown+1", book, 0); }), "incorrect token in formula");
    // A name that would be out of the sheet's columns as a reference.
    book.addName(L"TAX2019");
    EXPECT_EQ(compile(L"TAX2019", book), "2303000000");
}

TEST(Compiler, FixedArityFunctions)
{
    EXPECT_EQ(compile(L"ROUND(A1,2)"), "24000000c01e0200411b00");
    EXPECT_EQ(compile(L"MID(\"abc\",2,1)"), "1703016100620063001e02001e0100411f00");
    EXPECT_EQ(compile(L"DATE(2024,1,31)"), "1ee8071e01001e1f00414100");
    EXPECT_EQ(compileFailure(L"ROUND(A1)"), "incorrect number of function parameters");
    EXPECT_EQ(compileFailure(L"ISNA()"), "incorrect number of function parameters");
}

TEST(Compiler, VariableArityFunctions)
{
    EXPECT_EQ(compile(L"IF(A1>0,1,2)"), "44000000c01e00000d1e01001e0200420301" "00");
    EXPECT_EQ(compile(L"MAX(A1:B3,C1)"), "250000020000c001c024000002c0420207" "00");
    EXPECT_EQ(compile(L"PI()"), "42001300");
    EXPECT_EQ(compile(L"IF(A1,,2)"), "24000000c0161e0200420301" "00");
    EXPECT_EQ(compile(L"COUNTIF(A1:A9,\">1\")"), "250000080000c000c0170201" "3e003100" "41" "5a01");
}

TEST(Compiler, NestedCalls)
{
    EXPECT_EQ(compile(L"ROUND(SQRT(ABS(-4)),1)"), "1e040013411800411400" "1e0100411b00");
    EXPECT_EQ(compile(L"IF(ISNA(A1),0,MAX(A1,B1))"),
              "24000000c0410200" "1e0000" "24000000c024000001c0420207" "00" "420301" "00");
}

TEST(Compiler, ArgumentSeparators)
{
    EXPECT_EQ(compile(L"SUM(1;2)"), compile(L"SUM(1,2)"));
    EXPECT_EQ(compile(L"SUM(1,2)"), "1e01001e0200420204" "00");
    EXPECT_EQ(compile(L"SUM ( 1 , 2 )"), "1e01001e0200420204" "00");
}

TEST(Compiler, SumWithOneArgumentIsAnAttribute)
{
    EXPECT_EQ(compile(L"SUM(A1:A3)"), "250000020000c000c019100000");
    EXPECT_EQ(compile(L"SUM()"), "42000400");
}

TEST(Compiler, TodayIsVolatile)
{
    EXPECT_EQ(compile(L"TODAY()"), "19010000" "41dd00");
    // The volatile attribute opens the token array, wherever TODAY stands.
    EXPECT_EQ(compile(L"1+TODAY()"), "19010000" "1e0100" "41dd00" "03");
    EXPECT_EQ(compile(L"TODAY()-TODAY()"), "19010000" "41dd00" "41dd00" "04");
    EXPECT_EQ(compileFailure(L"TODAY(1)"), "incorrect number of function parameters");
}

TEST(Compiler, SumProductTakesArrays)
{
    EXPECT_EQ(compile(L"SUMPRODUCT(A1:A3,B1:B3)"), "650000020000c000c0650000020001c001c04202e400");
    EXPECT_EQ(compile(L"SUMPRODUCT((A1:A3>1)*B1:B3)"),
              "650000020000c000c01e01000d15650000020001c001c0054201e400");
    // Nested calls keep their own classes.
    EXPECT_EQ(compile(L"SUMPRODUCT(SUM(A1:A3))"), "250000020000c000c0191000004201e400");
}

TEST(Compiler, OffsetIsReferenceClass)
{
    EXPECT_EQ(compile(L"OFFSET(A1,1,1)"), "24000000c01e01001e010022034e00");
    EXPECT_EQ(compile(L"SUM(OFFSET(A1,1,1,2,2))"), "24000000c01e01001e01001e02001e020022054e0019100000");
}

TEST(Compiler, RangeAndUnionOperators)
{
    EXPECT_EQ(compile(L"A1:INDEX(B1:B5,2)"), "24000000c0250000040001c001c01e0200420" "21d0011");
    EXPECT_EQ(compile(L"SUM((A1,B1))"), "24000000c024000001c0101519100000");
    EXPECT_EQ(compile(L"A1:B2 B1:C3"), "250000010000c001c0250000020001c002c00f");
}

TEST(Compiler, ArrayConstants)
{
    FakeBook book;
    const ParsedFormula f = MakeFormula(L"SUM({1,2;-3,\"a\"})", book, 0);
    EXPECT_EQ(hex(f.rgce), "60000000000000001910" "0000");
    EXPECT_EQ(hex(f.rgcb), "01" "0100" "01000000000000f03f" "010000000000000040" "0100000000000008c0" "0201000161" "00");
}

TEST(Compiler, UserFunctionsGoThroughNames)
{
    FakeBook book;
    EXPECT_EQ(compile(L"_xlfn.IFERROR(A1,0)", book), "230100000024000000c01e0000420" "3ff00");
    EXPECT_EQ(book.names.at(0).text, L"_xlfn.IFERROR");
    book.allowUserFunctions = false;
    EXPECT_EQ(failure([&] { MakeFormula(L"MYFUNC(1)", book, 0); }), "incorrect token in formula");
}

TEST(Compiler, Failures)
{
    EXPECT_EQ(compileFailure(L"SUM A1"), "error: function name without open parenthesis");
    EXPECT_EQ(compileFailure(L"SUM(1,2"), "error: function parentheses not found");
    EXPECT_EQ(compileFailure(L"SUM((1,2)"), "error: function parentheses not found");
    EXPECT_EQ(compileFailure(L"1+"), "error in formula");
    EXPECT_EQ(compileFailure(L""), "error in formula");
    EXPECT_EQ(compileFailure(L"(1+2"), "error in formula");
    EXPECT_EQ(compileFailure(L"1+2)"), "error in formula");
    EXPECT_EQ(compileFailure(L"1 2"), "error in formula");
    EXPECT_EQ(compileFailure(L"\"open"), "error in formula");
    EXPECT_EQ(compileFailure(L"1@2"), "incorrect token in formula");
    EXPECT_EQ(compileFailure(L"#BAD!"), "incorrect token in formula");
    EXPECT_EQ(compileFailure(std::wstring(2000, L'(') + L"1" + std::wstring(2000, L')')), "error in formula");
    std::wstring longSum = L"1";
    for (int i = 0; i < 5000; ++i)
        longSum += L"+1";
    EXPECT_EQ(compileFailure(longSum), "error in formula");
}

TEST(Compiler, NothingIsLeftInTheBookWhenCompilingFails)
{
    FakeBook book;
    EXPECT_NE(failure([&] { MakeFormula(L"Sheet2!A1+", book, 0); }), "");
    EXPECT_TRUE(book.xtis.empty());
}
