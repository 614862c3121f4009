// Token arrays from damaged or hostile files: printing fails with a
// message or succeeds, and never reads outside the buffers (run this under
// the sanitizers).

#include <gtest/gtest.h>

#include <memory>
#include <random>

#include "api/qrerror.h"
#include "fake_book.h"
#include "test_helpers.h"
#include "xls/formula/ptg_reader.h"

using namespace quire::xls;
using namespace quire::xls::test;

namespace {

FakeBook hostileBook()
{
    FakeBook book;
    book.addName(L"Rate");
    book.externSheetIndex(1, 1);
    book.externSheetIndex(0, 2);
    book.externNames = {L"ADDIN"};
    book.externNameXti = 1;
    return book;
}

// Prints from exactly-sized heap copies so that any overread is caught.
void printExactly(const std::vector<uint8_t>& rgce, const std::vector<uint8_t>& rgcb, const FakeBook& book)
{
    std::unique_ptr<uint8_t[]> ce(new uint8_t[rgce.size() + 1]);
    std::unique_ptr<uint8_t[]> cb(new uint8_t[rgcb.size() + 1]);
    std::copy(rgce.begin(), rgce.end(), ce.get());
    std::copy(rgcb.begin(), rgcb.end(), cb.get());
    FormulaOrigin origin;
    origin.row = 3;
    origin.col = 3;
    try {
        toInfix(ce.get(), rgce.size(), cb.get(), rgcb.size(), book, origin);
    } catch (const qrerror& e) {
        EXPECT_STRNE(e.what(), "");
    }
    isVolatile(ce.get(), rgce.size());
    uint16_t row, col;
    sharedFormulaAnchor(ce.get(), rgce.size(), row, col);
}

} // namespace

TEST(HostileTokens, RandomBytes)
{
    const FakeBook book = hostileBook();
    std::mt19937 random(12345);
    for (int round = 0; round < 20000; ++round) {
        std::vector<uint8_t> rgce(random() % 40);
        for (auto& b : rgce)
            b = static_cast<uint8_t>(random());
        std::vector<uint8_t> rgcb(random() % 24);
        for (auto& b : rgcb)
            b = static_cast<uint8_t>(random());
        printExactly(rgce, rgcb, book);
    }
}

TEST(HostileTokens, RandomTokensFromValidIds)
{
    // Plausible ids with random payloads reach deeper into the printer.
    const uint8_t ids[] = {0x03, 0x04, 0x05, 0x0F, 0x10, 0x11, 0x12, 0x13, 0x14, 0x15, 0x16, 0x17, 0x19,
                           0x1C, 0x1D, 0x1E, 0x1F, 0x20, 0x21, 0x22, 0x23, 0x24, 0x25, 0x26, 0x29, 0x2C,
                           0x2D, 0x39, 0x3A, 0x3B, 0x3C, 0x3D, 0x41, 0x42, 0x44, 0x60, 0x65};
    const FakeBook book = hostileBook();
    std::mt19937 random(777);
    for (int round = 0; round < 20000; ++round) {
        std::vector<uint8_t> rgce;
        const int tokens = 1 + static_cast<int>(random() % 8);
        for (int t = 0; t < tokens; ++t) {
            rgce.push_back(ids[random() % sizeof ids]);
            const int payload = static_cast<int>(random() % 12);
            for (int k = 0; k < payload; ++k)
                rgce.push_back(static_cast<uint8_t>(random() % 4 == 0 ? random() : random() % 3));
        }
        std::vector<uint8_t> rgcb(random() % 32);
        for (auto& b : rgcb)
            b = static_cast<uint8_t>(random() % 3 == 0 ? random() : random() % 5);
        printExactly(rgce, rgcb, book);
    }
}

TEST(HostileTokens, EveryTruncationOfValidFormulas)
{
    FakeBook book = hostileBook();
    const wchar_t* texts[] = {L"SUM({1,2;-3,\"abc\"})+Sheet2!A1:B3*IF(A1,,\"x\")", L"Rate&CHOOSE(2,1,2,3)",
                              L"TODAY()-SUMPRODUCT(A1:A3,B1:B3)", L"_xlfn.IFERROR(1/0,\"e\")"};
    for (const wchar_t* text : texts) {
        const ParsedFormula f = MakeFormula(text, book, 0);
        for (size_t n = 0; n <= f.rgce.size(); ++n)
            for (size_t m : {size_t{0}, f.rgcb.size() / 2, f.rgcb.size()})
                printExactly(std::vector<uint8_t>(f.rgce.begin(), f.rgce.begin() + n),
                             std::vector<uint8_t>(f.rgcb.begin(), f.rgcb.begin() + m), book);
    }
}

TEST(HostileTokens, LongChainsStayBounded)
{
    const FakeBook book = hostileBook();
    // One operand wrapped 65000 times: fails once the text is too long.
    std::vector<uint8_t> rgce = {0x1E, 0x01, 0x00};
    rgce.resize(65003, 0x15);
    EXPECT_EQ(failure([&] { toInfix(rgce.data(), rgce.size(), nullptr, 0, book); }),
              "can't build infix formula string");
    std::vector<uint8_t> minus = {0x1E, 0x01, 0x00};
    minus.resize(70003, 0x13);
    EXPECT_EQ(failure([&] { toInfix(minus.data(), minus.size(), nullptr, 0, book); }),
              "can't build infix formula string");
    // A huge array constant announced by a few bytes.
    const std::vector<uint8_t> array = {0x60, 0, 0, 0, 0, 0, 0, 0};
    const std::vector<uint8_t> extra = {0xFF, 0xFF, 0xFF, 0x01};
    EXPECT_EQ(failure([&] { toInfix(array.data(), array.size(), extra.data(), extra.size(), book); }),
              "ByteStream::popDouble() error");
}
