// Our token bytes against those of an independent writer (xlwt): where the
// encoding is not a matter of choice (operators, references, integers and
// doubles, function ids and argument counts, SUMPRODUCT's arrays), the two
// must agree. Skipped when /usr/bin/python3 with xlwt is not installed.

#include <gtest/gtest.h>

#include <cstdio>
#include <fstream>
#include <map>
#include <sstream>

#include "fake_book.h"
#include "test_helpers.h"
#include "xls/formula/ptg.h"
#include "xls/formula/ptg_reader.h"
#include "xls/little_endian.h"

using namespace quire::xls;
using namespace quire::xls::test;

namespace {

// Formulas whose encoding has one right answer; xlwt and we differ on
// attributes (IF jumps, volatility) only, which are dropped before comparing.
const char* const Formulas[] = {
    "1+2*3",        "(1+2)*3",          "1-2-3",           "-2^2",           "A1*-B1",           "50%",
    "70000+1.5",    "0.1*65535",        "A1&B1",           "A1<>B1",         "A1>=$B$2",         "A1<=B$2",
    "$A1>B1",       "A1<B1",            "A1=B1",           "A1/B1",          "ROUND(A1,2)",      "MID(A1,2,3)",
    "IF(A1>0,1,2)", "MAX(A1:B3,C1)",    "MIN(A1:B3)+1",    "AVERAGE(A1:A9)", "COUNTIF(A1:A9,1)", "DATE(2024,1,31)",
    "ABS(A1)",      "SQRT(ABS(-4))",    "SUM(A1)",         "SUM(A1:A3)",     "SUM(A1,B2,3)",     "TODAY()",
    "NOW()+1",      "SUMPRODUCT(A1:A3,B1:B3)",             "Sheet2!A1+Sheet3!B2:C4",             "Sheet2!$A$1*2",
    "SUM(Sheet3!A1:B2)", "TRUE",        "FALSE<>TRUE",     "IV65536+A1",     "VLOOKUP(A1,$D$1:$E$9,2,FALSE)",
};

struct Token {
    std::vector<uint8_t> bytes;
};

// The tokens with attributes dropped, single references reduced to their
// base id (the class of a plain reference argument is a matter of choice)
// and 3-D references carrying their sheet range instead of the XTI index.
std::vector<std::string> normalize(const std::vector<uint8_t>& rgce,
                                   const std::map<unsigned, std::pair<int, int>>& xti)
{
    std::vector<std::string> out;
    size_t pos = 0;
    while (pos < rgce.size()) {
        const size_t n = ptgSize(rgce.data() + pos, rgce.size() - pos);
        if (n == 0) {
            out.push_back("bad");
            break;
        }
        std::vector<uint8_t> t(rgce.begin() + pos, rgce.begin() + pos + n);
        pos += n;
        if (t[0] == ptg::Attr && t[1] != ptg::AttrSum)
            continue;
        if (t[0] >= 0x20 && t[0] < 0x80) {
            const uint8_t base = ptg::baseId(t[0]);
            // The class of a plain reference argument and of a call's result is a
            // matter of choice (xlwt gives IF reference class, for one).
            if (base == ptg::Ref || base == ptg::Ref3d || base == ptg::Func || base == ptg::FuncVar)
                t[0] = base;
            if (base == ptg::Ref3d || base == ptg::Area3d) {
                const auto it = xti.find(loadU16(t.data() + 1));
                const std::pair<int, int> sheets = it == xti.end() ? std::make_pair(-1, -1) : it->second;
                t[1] = static_cast<uint8_t>(sheets.first);
                t[2] = static_cast<uint8_t>(sheets.second);
            }
        }
        out.push_back(hex(t));
    }
    return out;
}

std::string joined(const std::vector<std::string>& parts)
{
    std::string s;
    for (const auto& p : parts)
        s += p + " ";
    return s;
}

} // namespace

TEST(XlwtAgreement, TokenBytesMatchWhereTheyMust)
{
    const std::string script = std::string(QUIRE_FORMULA_TEST_DIR) + "/xlwt_tokens.py";
    if (std::system("/usr/bin/python3 -c 'import xlwt, xlrd' >/dev/null 2>&1") != 0)
        GTEST_SKIP() << "python3-xlwt / python3-xlrd are not installed";
    const std::string input = std::string(QUIRE_TEST_BINARY_DIR) + "/xlwt_formulas.txt";
    const std::string output = std::string(QUIRE_TEST_BINARY_DIR) + "/xlwt_tokens.txt";
    {
        std::ofstream in(input);
        for (const char* f : Formulas)
            in << f << "\n";
    }
    const std::string command = "/usr/bin/python3 " + script + " < " + input + " > " + output;
    ASSERT_EQ(std::system(command.c_str()), 0) << command;

    std::map<unsigned, std::vector<uint8_t>> theirs;
    std::map<unsigned, std::pair<int, int>> theirXti;
    std::ifstream result(output);
    std::string line;
    while (std::getline(result, line)) {
        std::istringstream fields(line);
        std::string kind;
        fields >> kind;
        if (kind == "F") {
            unsigned row;
            std::string bytes;
            fields >> row >> bytes;
            theirs[row] = unhex(bytes);
        } else if (kind == "X") {
            unsigned index, supbook;
            int first, last;
            fields >> index >> supbook >> first >> last;
            theirXti[index] = {first, last};
        }
    }
    ASSERT_EQ(theirs.size(), sizeof Formulas / sizeof Formulas[0]);

    FakeBook book;
    for (size_t row = 0; row < theirs.size(); ++row) {
        const std::string text = Formulas[row];
        SCOPED_TRACE(text);
        const ParsedFormula ours = MakeFormula(std::wstring(text.begin(), text.end()), book, 0);
        std::map<unsigned, std::pair<int, int>> ourXti;
        for (size_t i = 0; i < book.xtis.size(); ++i)
            ourXti[static_cast<unsigned>(i)] = {book.xtis[i].first, book.xtis[i].last};
        auto mine = normalize(ours.rgce, ourXti);
        auto other = normalize(theirs[static_cast<unsigned>(row)], theirXti);
        // xlwt writes functions without arguments as ptgFunc, we as ptgFuncVar with none.
        for (auto& t : other)
            if (t.size() == 6 && t.rfind("21", 0) == 0 && text.find("()") != std::string::npos &&
                text.find("TODAY") == std::string::npos)
                t = "2200" + t.substr(2);
        EXPECT_EQ(joined(mine), joined(other));
    }
}
