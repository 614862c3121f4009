#include <gtest/gtest.h>

#include <string>

#include "api/cell_address.h"
#include "api/locale_settings.h"
#include "api/number_formats.h"
#include "api/password_hash.h"
#include "api/picture_type.h"
#include "api/enums.h"
#include "api/qrerror.h"
#include "api/wide_text.h"

namespace quire {
namespace {

TEST(CellAddress, BuildsA1ReferencesWithAndWithoutDollars) {
    EXPECT_EQ(rowColToAddr(0, 0, true, true), L"A1");
    EXPECT_EQ(rowColToAddr(9, 27, false, false), L"$AB$10");
    EXPECT_EQ(rowColToAddr(1048575, 16383, true, true), L"XFD1048576");
    EXPECT_EQ(rowColToAddr(-1, 2, true, false), L"$C");
    EXPECT_EQ(rowColToAddr(4, -1, false, true), L"$5");
    EXPECT_THROW(rowColToAddr(1048576, 0, true, true), qrerror);
    EXPECT_THROW(rowColToAddr(0, 16384, true, true), qrerror);
}

TEST(CellAddress, ColumnLettersAreBijectiveBase26) {
    EXPECT_EQ(columnLetters(0), L"A");
    EXPECT_EQ(columnLetters(25), L"Z");
    EXPECT_EQ(columnLetters(26), L"AA");
    EXPECT_EQ(columnLetters(701), L"ZZ");
    EXPECT_EQ(columnLetters(702), L"AAA");
}

TEST(CellAddress, ParsesReferencesAndTheirAnchors) {
    int row = -9, col = -9;
    bool rowRel = true, colRel = true;
    addrToRowCol(L"$C$5", &row, &col, &rowRel, &colRel);
    EXPECT_EQ(row, 4);
    EXPECT_EQ(col, 2);
    EXPECT_FALSE(rowRel);
    EXPECT_FALSE(colRel);
    addrToRowCol(L"C5", &row, &col, &rowRel, &colRel);
    EXPECT_TRUE(rowRel);
    EXPECT_TRUE(colRel);
    addrToRowCol(L"AB10", &row, &col, nullptr, nullptr);
    EXPECT_EQ(row, 9);
    EXPECT_EQ(col, 27);
    for (int c : {0, 25, 26, 701, 702, 16383}) {
        addrToRowCol(rowColToAddr(41, c, true, true).c_str(), &row, &col, nullptr, nullptr);
        EXPECT_EQ(row, 41);
        EXPECT_EQ(col, c);
    }
}

TEST(CellAddress, HostileAddressesStayBounded) {
    int row = 0, col = 0;
    addrToRowCol(L"ZZZZZZZZZZZZZZZZZZZZZZZ99999999999999999999", &row, &col, nullptr, nullptr);
    addrToRowCol(L"", &row, &col, nullptr, nullptr);
    addrToRowCol(nullptr, &row, &col, nullptr, nullptr);
    SUCCEED();
}

TEST(NumberFormats, BuiltInIdsClassifyAsDatesOrNot) {
    for (int id : {14, 15, 22, 45, 46, 47}) EXPECT_EQ(classifyNumFormatId(id), DateIdKind::Date) << id;
    for (int id : {0, 13, 37, 44, 48, 49}) EXPECT_EQ(classifyNumFormatId(id), DateIdKind::NotDate) << id;
    for (int id : {23, 36, 50, 164}) EXPECT_EQ(classifyNumFormatId(id), DateIdKind::ByText) << id;
}

TEST(NumberFormats, DateLettersCountOnlyOutsideQuotesAndBrackets) {
    EXPECT_TRUE(isDateFormatText(L"yyyy-mm-dd"));
    EXPECT_TRUE(isDateFormatText(L"[h]:mm"));
    EXPECT_FALSE(isDateFormatText(L"[Red]0.00"));
    EXPECT_FALSE(isDateFormatText(L"0.00\" days\""));
    EXPECT_FALSE(isDateFormatText(L"#,##0"));
    EXPECT_FALSE(isDateFormatText(nullptr));
    EXPECT_TRUE(isDateFormatText(L"\"at\" h"));
}

TEST(NumberFormats, RegistryReusesTextsAndTakesTheLowestFreeId) {
    NumFormatRegistry registry;
    EXPECT_EQ(registry.add(L"0.000", 164), 164);
    EXPECT_EQ(registry.add(L"0.000", 164), 164);
    registry.put(166, L"loaded");
    EXPECT_EQ(registry.add(L"a", 164), 165);
    EXPECT_EQ(registry.add(L"b", 164), 167);
    EXPECT_EQ(registry.add(L"loaded", 164), 166);
}

TEST(LocaleSettings, UtfModesChooseTheSeparator) {
    LocaleSettings settings;
    applyLocale(settings, "UTF-8.comma");
    EXPECT_TRUE(settings.utf8Mode);
    EXPECT_EQ(settings.listSeparator, L',');
    applyLocale(settings, "UTF-8");
    EXPECT_EQ(settings.listSeparator, L';');
    EXPECT_THROW(applyLocale(settings, nullptr), qrerror);
    try {
        applyLocale(settings, "xx_NOWHERE.bogus");
        FAIL() << "an unknown locale must be refused";
    } catch (const qrerror& e) {
        EXPECT_STREQ(e.what(), "setlocale error (2)");
    }
    EXPECT_EQ(settings.listSeparator, L';');
    EXPECT_FALSE(settings.utf8Mode);
}

TEST(LocaleSettings, CountryTableDecidesTheSeparator) {
    EXPECT_EQ(listSeparatorForLocaleName("de_DE.UTF-8"), L';');
    EXPECT_EQ(listSeparatorForLocaleName("German_Germany.1252"), L';');
    EXPECT_EQ(listSeparatorForLocaleName("en_US.UTF-8"), L',');
    EXPECT_EQ(listSeparatorForLocaleName("C"), L',');
    EXPECT_EQ(listSeparatorForLocaleName("pt_BR.UTF-8"), L';');
}

// Verifiers as another program (openpyxl's hash_password) computes them.
TEST(PasswordHash, MatchesTheLegacyVerifier) {
    EXPECT_EQ(passwordVerifier(L"secret"), 0xDAA7);
    EXPECT_EQ(passwordVerifier(L"a"), 0xCE88);
    EXPECT_EQ(passwordVerifier(L"Password1"), 0xE1EE);
    EXPECT_EQ(passwordVerifier(L""), 0);
    EXPECT_EQ(passwordVerifier(nullptr), 0);
}

TEST(PictureType, RecognisesSignatures) {
    const unsigned char png[] = {0x89, 'P', 'N', 'G', '\r', '\n', 0x1A, '\n', 0};
    const unsigned char jpeg[] = {0xFF, 0xD8, 0xFF, 0xE0};
    const unsigned char gif[] = {'G', 'I', 'F', '8', '9', 'a'};
    const unsigned char text[] = {'h', 'e', 'l', 'l', 'o'};
    EXPECT_EQ(detectPictureType(png, sizeof png), PictureTypePNG);
    EXPECT_EQ(detectPictureType(jpeg, sizeof jpeg), PictureTypeJPEG);
    EXPECT_EQ(detectPictureType(gif, sizeof gif), PictureTypeGIF);
    EXPECT_EQ(detectPictureType(text, sizeof text), PictureTypeError);
    EXPECT_EQ(detectPictureType(png, 3), PictureTypeError);
}

TEST(WideText, CountsAndCutsInUtf16Units) {
    std::wstring astral = L"a\U0001F600b";
    EXPECT_EQ(utf16Length(astral), 4u);
    EXPECT_EQ(cutToUtf16Units(astral, 2), L"a");
    EXPECT_EQ(cutToUtf16Units(astral, 3), L"a\U0001F600");
    EXPECT_EQ(fromUtf8(toUtf8(astral)), astral);
    std::u16string units = toUtf16(astral);
    EXPECT_EQ(fromUtf16(units.data(), units.size()), astral);
    EXPECT_EQ(fromUtf8("\xC3\x28"), L"\xFFFD(");  // a broken sequence becomes a replacement character
}

}  // namespace
}  // namespace quire
