// Tokens to text: every Ptg the printer knows, the list separator and the
// printer's messages.

#include <gtest/gtest.h>

#include <cstring>

#include "fake_book.h"
#include "test_helpers.h"

using namespace quire::xls;
using namespace quire::xls::test;

namespace {

std::wstring print(const std::string& rgceHex, const FakeBook& book, const std::string& rgcbHex = {},
                   const FormulaOrigin& origin = {})
{
    const auto rgce = unhex(rgceHex);
    const auto rgcb = unhex(rgcbHex);
    return toInfix(rgce.data(), rgce.size(), rgcb.data(), rgcb.size(), book, origin);
}

std::wstring print(const std::string& rgceHex)
{
    FakeBook book;
    return print(rgceHex, book);
}

std::string printFailure(const std::string& rgceHex)
{
    FakeBook book;
    return failure([&] { print(rgceHex, book); });
}

} // namespace

TEST(Printer, OperatorsAndConstants)
{
    EXPECT_EQ(print("1e01001e02001e03000503"), L"1+2*3");
    EXPECT_EQ(print("1e01001e020003151e030005"), L"(1+2)*3");
    EXPECT_EQ(print("1e0200131e020007"), L"-2^2");
    EXPECT_EQ(print("1e02001214"), L"+2%");
    EXPECT_EQ(print("1f000000000000f83f"), L"1.5");
    EXPECT_EQ(print("1f9a9999999999b93f"), L"0.1");
    EXPECT_EQ(print("1f0000000000000000"), L"0");
    EXPECT_EQ(print("1d011d000b"), L"TRUE=FALSE");
    EXPECT_EQ(print("1c2a1c0708"), L"#N/A&#DIV/0!");
    EXPECT_EQ(print("170300612262"), L"\"a\"\"b\"");   // one-byte characters
    EXPECT_EQ(print("170201e900e000"), L"\"\u00e9\u00e0\"");
    for (uint8_t op = 0x09; op <= 0x0E; ++op) {
        const char* texts[] = {"<", "<=", "=", ">=", ">", "<>"};
        std::string h = "1e01001e0200";
        h += "0";
        h += "0123456789abcdef"[op];
        EXPECT_EQ(print(h), L"1" + std::wstring(texts[op - 9], texts[op - 9] + std::strlen(texts[op - 9])) + L"2");
    }
}

TEST(Printer, References)
{
    EXPECT_EQ(print("24000000c0"), L"A1");
    EXPECT_EQ(print("44ffffff00"), L"$IV$65536");
    EXPECT_EQ(print("64000000c0"), L"A1");
    EXPECT_EQ(print("250000010000c001c0"), L"A1:B2");
    EXPECT_EQ(print("250000ffff00400240"), L"A:C");
    EXPECT_EQ(print("25010002000080ff80"), L"2:3");
    EXPECT_EQ(print("2a00000000"), L"#REF!");
    EXPECT_EQ(print("2b0000000000000000"), L"#REF!");
    EXPECT_EQ(print("3c000000000000"), L"#REF!");
    EXPECT_EQ(print("3d00000000000000000000"), L"#REF!");
    EXPECT_EQ(print("24000000c0250000040001c001c011"), L"A1:B1:B5");
    EXPECT_EQ(print("24000000c024000001c00f"), L"A1 B1");
}

TEST(Printer, ListSeparator)
{
    FakeBook book;
    book.separator = L';';
    EXPECT_EQ(print("1e01001e0200420204" "00", book), L"SUM(1;2)");
    EXPECT_EQ(print("24000000c024000001c01015", book), L"(A1;B1)");
    book.separator = L',';
    EXPECT_EQ(print("1e01001e0200420204" "00", book), L"SUM(1,2)");
}

TEST(Printer, Functions)
{
    EXPECT_EQ(print("24000000c01e0200411b00"), L"ROUND(A1,2)");
    EXPECT_EQ(print("42001300"), L"PI()");
    EXPECT_EQ(print("411300"), L"PI()");
    EXPECT_EQ(print("250000020000c000c019100000"), L"SUM(A1:A3)");
    EXPECT_EQ(print("19010000" "41dd00"), L"TODAY()");
    EXPECT_EQ(print("24000000c0161e0200420301" "00"), L"IF(A1,,2)");
    EXPECT_EQ(print("24000000c01e01001e010022034e00"), L"OFFSET(A1,1,1)");
    // IF with its jump attributes and spaces, as Excel writes it.
    EXPECT_EQ(print("44000000c01e00000d190207001e010019080a001e02001908030022030100"), L"IF(A1>0,1,2)");
    EXPECT_EQ(print("1e0100" "190402000600080009" "00" "1e0200" "1e0300" "420364" "00"), L"CHOOSE(1,2,3)");
    EXPECT_EQ(print("194001001e0100"), L"1");
}

TEST(Printer, NamesAndUserFunctions)
{
    FakeBook book;
    book.addName(L"Rate");
    book.addName(L"Local", 1);
    book.addName(L"_xlfn.IFERROR");
    EXPECT_EQ(print("2301000000", book), L"Rate");
    EXPECT_EQ(print("4301000000", book), L"Rate");
    FormulaOrigin onSheet2;
    onSheet2.sheet = 1;
    EXPECT_EQ(print("2302000000", book, {}, onSheet2), L"Local");
    EXPECT_EQ(print("2302000000", book), L"Sheet2!Local");
    EXPECT_EQ(print("230300000024000000c01e00004203ff00", book), L"_xlfn.IFERROR(A1,0)");
    EXPECT_EQ(failure([&] { print("2309000000", book); }), "toInfix error: unknown name");
    book.externNames = {L"EUROCONVERT"};
    book.externNameXti = 0;
    book.xtis.push_back({});
    book.xtis[0].target.kind = ExternSheetTarget::Workbook;
    EXPECT_EQ(print("3900000100000" "01e0100" "4202ff00", book), L"EUROCONVERT(1)");
}

TEST(Printer, ThreeDimensionalReferences)
{
    FakeBook book;
    book.externSheetIndex(1, 1);
    book.externSheetIndex(3, 3);
    book.externSheetIndex(0, 2);
    book.externSheetIndex(4, 4);
    FakeBook::Xti external;
    external.target.kind = ExternSheetTarget::External;
    external.target.book = L"Other.xls";
    external.target.firstSheet = L"Data";
    external.target.lastSheet = L"Data";
    book.xtis.push_back(external);
    FakeBook::Xti deleted;
    deleted.target.kind = ExternSheetTarget::Deleted;
    book.xtis.push_back(deleted);

    EXPECT_EQ(print("3a0000000000c0", book), L"Sheet2!A1");
    EXPECT_EQ(print("5a0100000000c0", book), L"'My Sheet'!A1");
    EXPECT_EQ(print("3b02000000010000000100", book), L"Sheet1:Sheet3!$A$1:$B$2");
    EXPECT_EQ(print("3a0300000000c0", book), L"'2019'!A1");
    EXPECT_EQ(print("3a0400000000c0", book), L"'[Other.xls]Data'!A1");
    EXPECT_EQ(print("3a0500000000c0", book), L"#REF!");
    EXPECT_EQ(print("3b05000000010000000100", book), L"#REF!");
    EXPECT_EQ(failure([&] { print("3a0900000000c0", book); }), "toInfix error: unknown XTI index");
}

TEST(Printer, RelativeTokensNeedTheCell)
{
    FakeBook book;
    FormulaOrigin origin;
    origin.row = 4;
    origin.col = 2;
    // Row offset -1, column offset +1 from C5; absolute parts as stored.
    EXPECT_EQ(print("2cffff01c0", book, {}, origin), L"D4");
    EXPECT_EQ(print("2c0100fe40", book, {}, origin), L"A$2");
    EXPECT_EQ(print("2d0000010000c000c0", book, {}, origin), L"C5:C6");
    EXPECT_EQ(failure([&] { print("2c000000c0", book); }), "toInfix error: relative reference without a cell");
}

TEST(Printer, ArraysAndMemoryTokens)
{
    FakeBook book;
    EXPECT_EQ(print("60000000000000001910" "0000", book,
                    "01" "0100" "01000000000000f03f" "010000000000000040" "0100000000000008c0" "0201000161" "00"),
              L"SUM({1,2;-3,\"a\"})");
    EXPECT_EQ(print("4000000000000000", book, "00" "0000" "0401000000000000" "00"), L"{TRUE}");
    EXPECT_EQ(print("4000000000000000", book, "00" "0000" "102a00000000000000"), L"{#N/A}");
    // ptgMemFunc and ptgMemArea only wrap the subexpression that follows.
    EXPECT_EQ(print("290d00" "25" "0000010000000000" "19100000", book), L"SUM($A$1:$A$2)");
    EXPECT_EQ(print("260000000009" "00" "250000010000c001c0", book, "0100" "0000010000000100"), L"A1:B2");
}

TEST(Printer, Failures)
{
    EXPECT_EQ(printFailure("18"), "unknown Ptg 0x18");
    EXPECT_EQ(printFailure("180100000000"), "unknown Ptg 0x18");
    EXPECT_EQ(printFailure("19ff0000"), "unknown Ptg 0x19");
    EXPECT_EQ(printFailure("00"), "can't recognize formula block: unknown ptg");
    EXPECT_EQ(printFailure("30"), "can't recognize formula block: unknown ptg");
    EXPECT_EQ(printFailure("13"), "toInfix error: incorrect unary minus expression");
    EXPECT_EQ(printFailure("12"), "toInfix error: incorrect unary plus expression");
    EXPECT_EQ(printFailure("14"), "toInfix error: incorrect percent expression");
    EXPECT_EQ(printFailure("1e010011"), "toInfix error: incorrect ptgRange expression");
    EXPECT_EQ(printFailure("1e010003"), "toInfix error: expected two operands for binary operator");
    EXPECT_EQ(printFailure("15"), "toInfix error: incorrect brackets");
    EXPECT_EQ(printFailure("1e0100420204" "00"), "toInfix error: incorrect function expression");
    EXPECT_EQ(printFailure("4200ca00"), "toInfix error: incorrect function expression");  // id 202 is unused
    EXPECT_EQ(printFailure("1e01001e0100"), "can't build infix formula string");
    EXPECT_EQ(printFailure(""), "can't build infix formula string");
    EXPECT_EQ(printFailure("2400"), "ByteStream::popInt16() error");
    EXPECT_EQ(printFailure("230100"), "ByteStream::popInt32() error");
    EXPECT_EQ(printFailure("1f0000"), "ByteStream::popDouble() error");
    EXPECT_EQ(printFailure("170501610062"), "GetFormula move1 error");
    EXPECT_EQ(printFailure("01000000" "00"), "toInfix error: formula refers to a shared or array formula");
}
