// Text compiled and printed back is the same text, with either separator.

#include <gtest/gtest.h>

#include "fake_book.h"
#include "test_helpers.h"

using namespace quire::xls;
using namespace quire::xls::test;

namespace {

const wchar_t* const Formulas[] = {
    // arithmetic, precedence, unary minus, percent
    L"1+2*3", L"(1+2)*3", L"-2^2", L"-(2^2)", L"1-2-3", L"1-(2-3)", L"2^3^2", L"A1*-B1", L"--A1", L"+A1",
    L"50%", L"A1%*2", L"10%-1", L"1.5+0.25", L"1E+20*3", L"1E-05", L"65536+70000", L"123456789.123",
    // comparisons and concatenation
    L"A1=B1<C1", L"A1<>B1", L"A1<=B1", L"A1>=B1", L"A1>B1", L"A1<B1", L"\"a\"&B1&\"\"\"q\"\"\"", L"A1&1+2",
    L"TRUE=FALSE", L"#N/A", L"IF(ISERROR(A1),#DIV/0!,A1)",
    // functions: fixed and variable arity, nested, missing arguments
    L"ROUND(A1,2)", L"MID(\"abc\",2,1)", L"DATE(2024,1,31)", L"IF(A1>0,\"pos\",\"neg\")", L"MAX(A1:B3,C1,7)",
    L"PI()", L"NOW()", L"IF(A1,,2)", L"ROUND(SQRT(ABS(-4)),1)", L"IF(ISNA(A1),0,MAX(A1,B1))",
    L"VLOOKUP(A1,$D$1:$E$20,2,FALSE)", L"INDEX(A1:C3,2,3)", L"COUNTIF(A1:A9,\">1\")", L"SUMIF(A1:A9,\">0\",B1:B9)",
    L"CHOOSE(2,A1,B1,C1)", L"CONCATENATE(A1,\" \",B1)",
    // ranges, whole rows and columns, reference operators
    L"SUM(A1:B2)", L"SUM($A$1:$B$2)", L"SUM(A:A)", L"SUM($A:$C)", L"SUM(1:1)", L"SUM($2:$5)", L"SUM(A1:IV65536)",
    L"A1:INDEX(B1:B5,2)", L"SUM((A1,B1:B2))", L"SUM(A1:B2 B1:C3)",
    // other sheets
    L"Sheet2!A1", L"Sheet2!A1+Sheet3!$B$2:C4", L"'My Sheet'!A1*2", L"SUM(Sheet1:Sheet3!A1)", L"'2019'!B7", L"Sheet2!A1:Sheet3!B2", L"'My Sheet'!$A$8:'My Sheet'!$B$10",
    // names, one-argument SUM, TODAY, SUMPRODUCT, OFFSET, arrays, user functions
    L"Rate*2", L"Sheet2!Local", L"SUM(A1)", L"SUM(A1:A3)", L"SUM(A1,A2)", L"SUM()", L"TODAY()", L"TODAY()+1",
    L"SUMPRODUCT(A1:A3,B1:B3)", L"SUMPRODUCT((A1:A3>1)*B1:B3)", L"OFFSET(A1,1,1,2,2)", L"SUM(OFFSET(A1,1,1))",
    L"SUM({1,2;-3,\"a\"})", L"{TRUE,#N/A}", L"_xlfn.IFERROR(A1,0)",
};

class RoundTrip : public ::testing::TestWithParam<wchar_t> {};

} // namespace

TEST_P(RoundTrip, PrintsWhatWasCompiled)
{
    FakeBook book;
    book.separator = GetParam();
    book.addName(L"Rate");
    book.addName(L"Local", 1);
    for (const wchar_t* text : Formulas) {
        std::wstring expected = text;
        if (book.separator == L';') {
            // Argument and union separators follow the book; array constants keep ",".
            bool inString = false, inArray = false;
            for (auto& c : expected) {
                if (c == L'"')
                    inString = !inString;
                else if (!inString && c == L'{')
                    inArray = true;
                else if (!inString && c == L'}')
                    inArray = false;
                else if (!inString && !inArray && c == L',')
                    c = L';';
            }
        }
        SCOPED_TRACE(std::string(expected.begin(), expected.end()));
        ParsedFormula f;
        ASSERT_EQ(failure([&] { f = MakeFormula(expected, book, 0); }), "");
        std::wstring printed;
        ASSERT_EQ(failure([&] { printed = toInfix(f, book); }), "");
        EXPECT_EQ(printed, expected);
        // And the printed text compiles to the same tokens.
        const ParsedFormula again = MakeFormula(printed, book, 0);
        EXPECT_EQ(hex(again.rgce), hex(f.rgce));
        EXPECT_EQ(hex(again.rgcb), hex(f.rgcb));
    }
}

INSTANTIATE_TEST_SUITE_P(Separators, RoundTrip, ::testing::Values(L',', L';'));

TEST(RoundTripSpacing, SpacesAreDropped)
{
    FakeBook book;
    EXPECT_EQ(toInfix(MakeFormula(L" SUM( 1 , 2 ) + 3 ", book, 0), book), L"SUM(1,2)+3");
}
