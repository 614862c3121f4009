#include <string>

#include "book_fixture.h"

namespace quire {
namespace {

using BookSheets = BinaryBookTest;

std::wstring nameOf(ISheet* sheet) { return sheet->name(); }

TEST_F(BookSheets, NewBookHasNoSheetAndTheFirstBecomesActive) {
    EXPECT_EQ(book->sheetCount(), 0);
    EXPECT_EQ(message(), "ok");
    ISheet* first = addSheet(L"First");
    ASSERT_NE(first, nullptr);
    EXPECT_EQ(message(), "ok");
    EXPECT_EQ(book->activeSheet(), 0);
    EXPECT_EQ(book->getSheet(0), first);
    EXPECT_EQ(book->version(), 0x03080800);
    EXPECT_EQ(book->biffVersion(), 0x0600);
}

TEST_F(BookSheets, InsertAppendsAtCountAndRefusesBeyond) {
    addSheet(L"A");
    EXPECT_NE(book->insertSheet(1, L"B", nullptr), nullptr);
    EXPECT_EQ(book->insertSheet(3, L"C", nullptr), nullptr);
    EXPECT_EQ(message(), "index is out of range");
    EXPECT_EQ(book->insertSheet(-1, L"C", nullptr), nullptr);
    EXPECT_NE(book->insertSheet(0, L"C", nullptr), nullptr);
    EXPECT_EQ(nameOf(book->getSheet(0)), L"C");
    EXPECT_EQ(nameOf(book->getSheet(2)), L"B");
    // Inserting before the active sheet moves the active index with it.
    EXPECT_EQ(book->activeSheet(), 1);
}

TEST_F(BookSheets, NamesAreCutTo31AndUniqueWithoutRegardToCase) {
    ISheet* sheet = addSheet(L"abcdefghijklmnopqrstuvwxyz0123456");  // 33 characters
    ASSERT_NE(sheet, nullptr);
    EXPECT_EQ(message(), "warning: sheet's name is cut to 31 characters");
    EXPECT_EQ(nameOf(sheet).size(), 31u);
    addSheet(L"Data");
    EXPECT_EQ(addSheet(L"DATA"), nullptr);
    EXPECT_EQ(message(), "book already contains such sheet name");
    EXPECT_EQ(book->sheetCount(), 2);
    EXPECT_EQ(addSheet(nullptr), nullptr);
    EXPECT_EQ(message(), "sheet name can't be 0");
    // Letters beyond A to Z compare by their code.
    EXPECT_NE(addSheet(L"\u00E9t\u00E9"), nullptr);
    EXPECT_NE(addSheet(L"\u00C9t\u00E9"), nullptr);
}

TEST_F(BookSheets, MoveSheetRefusesMovesThatChangeNothing) {
    addSheet(L"S0");
    addSheet(L"S1");
    EXPECT_FALSE(book->moveSheet(0, 1));
    EXPECT_EQ(message(), "there is no sense: srcIndex is equal to dstIndex - 1");
    EXPECT_FALSE(book->moveSheet(1, 1));
    EXPECT_EQ(message(), "there is no sense: srcIndex is equal to dstIndex");
    EXPECT_FALSE(book->moveSheet(2, 0));
    EXPECT_EQ(message(), "srcIndex is out of range");
    EXPECT_FALSE(book->moveSheet(0, 3));
    EXPECT_EQ(message(), "dstIndex is out of range");
    EXPECT_EQ(nameOf(book->getSheet(0)), L"S0");
    EXPECT_TRUE(book->moveSheet(0, 2));
    EXPECT_EQ(nameOf(book->getSheet(0)), L"S1");
    EXPECT_EQ(nameOf(book->getSheet(1)), L"S0");
    EXPECT_TRUE(book->moveSheet(1, 0));
    EXPECT_EQ(nameOf(book->getSheet(0)), L"S0");
}

TEST_F(BookSheets, DeleteKeepsAtLeastOneSheet) {
    addSheet(L"Only");
    EXPECT_FALSE(book->delSheet(0));
    EXPECT_EQ(message(), "can't remove the last sheet in workbook");
    addSheet(L"Second");
    addSheet(L"Third");
    book->setActiveSheet(2);
    EXPECT_TRUE(book->delSheet(2));
    EXPECT_EQ(book->sheetCount(), 2);
    EXPECT_EQ(book->activeSheet(), 1);
    EXPECT_FALSE(book->delSheet(5));
    EXPECT_EQ(message(), "index is out of range");
}

TEST_F(BookSheets, GetSheetAndTypesReportBadIndexes) {
    addSheet(L"One");
    EXPECT_EQ(book->getSheet(1), nullptr);
    EXPECT_EQ(message(), "index is out of range");
    EXPECT_EQ(book->sheetType(0), SheetTypeSheet);
    EXPECT_EQ(book->sheetType(7), SheetTypeUnknown);
    EXPECT_EQ(message(), "index is out of range");
    EXPECT_EQ(std::wstring(book->getSheetName(0)), L"One");
    book->setActiveSheet(3);
    EXPECT_EQ(message(), "index is out of range");
}

TEST_F(BookSheets, CopyOfASheetTakesItsCellsUnderTheNewName) {
    ISheet* source = addSheet(L"Source");
    source->writeNum(1, 1, 42, nullptr);
    source->writeStr(2, 2, L"text", nullptr, 2);
    source->setMerge(5, 6, 0, 3);
    ISheet* copy = book->addSheet(L"Copy", source);
    ASSERT_NE(copy, nullptr);
    EXPECT_EQ(copy->readNum(1, 1, nullptr), 42);
    EXPECT_EQ(std::wstring(copy->readStr(2, 2, nullptr)), L"text");
    EXPECT_EQ(copy->mergeSize(), 1);
    EXPECT_EQ(nameOf(copy), L"Copy");
    copy->writeNum(1, 1, 7, nullptr);
    EXPECT_EQ(source->readNum(1, 1, nullptr), 42);
}

TEST_F(BookSheets, CopyFromAnotherBookCopiesFormatsToo) {
    IBook* other = createBinaryBook();
    ISheet* source = other->addSheet(L"There", nullptr);
    IFormat* bold = other->addFormat(nullptr);
    IFont* font = other->addFont(nullptr);
    font->setBold(true);
    bold->setFont(font);
    bold->setNumFormat(other->addCustomNumFormat(L"0.0000"));
    source->writeNum(0, 0, 3.25, bold);
    ISheet* copy = book->addSheet(L"Here", source);
    ASSERT_NE(copy, nullptr);
    IFormat* format = nullptr;
    EXPECT_EQ(copy->readNum(0, 0, &format), 3.25);
    ASSERT_NE(format, nullptr);
    EXPECT_TRUE(format->font()->bold());
    EXPECT_EQ(std::wstring(book->customNumFormat(format->numFormat())), L"0.0000");
    other->release();
}

TEST_F(BookSheets, BookWideFlagsAndLocale) {
    EXPECT_FALSE(book->isDate1904());
    book->setDate1904(true);
    EXPECT_TRUE(book->isDate1904());
    EXPECT_EQ(book->datePack(1904, 1, 2, 0, 0, 0, 0), 1.0);
    EXPECT_FALSE(book->isTemplate());
    EXPECT_FALSE(book->rgbMode());
    EXPECT_FALSE(book->refR1C1());
    addSheet(L"R");
    book->setRefR1C1(true);
    EXPECT_TRUE(book->refR1C1());
    EXPECT_TRUE(book->setLocale("UTF-8.comma"));
    EXPECT_EQ(message(), "ok");
    EXPECT_FALSE(book->setLocale(nullptr));
    EXPECT_EQ(message(), "setlocale error (1)");
}

TEST_F(BookSheets, PicturesAreRegisteredFromMemory) {
    const char png[] = "\x89PNG\r\n\x1A\n0000";
    EXPECT_EQ(book->addPicture2(png, sizeof png), 0);
    EXPECT_EQ(book->pictureSize(), 1);
    const char* data = nullptr;
    unsigned size = 0;
    EXPECT_EQ(book->getPicture(0, &data, &size), PictureTypePNG);
    EXPECT_EQ(size, sizeof png);
    EXPECT_EQ(book->getPicture(1, &data, &size), PictureTypeError);
    EXPECT_EQ(message(), "index is out of range");
    EXPECT_EQ(book->addPicture(L"/nonexistent/picture.png"), -1);
    EXPECT_EQ(message(), "can't open file");
    EXPECT_EQ(book->addPictureAsLink(L"x.png", false), -1);
    EXPECT_EQ(message(), "function is not supported for xls files");
}

TEST_F(BookSheets, LoadFailuresLeaveANewBook) {
    addSheet(L"Before");
    EXPECT_FALSE(book->load(nullptr, nullptr));
    EXPECT_EQ(message(), "file name name can't be 0");
    EXPECT_EQ(book->sheetCount(), 0);
    EXPECT_EQ(book->formatSize(), 21);
    EXPECT_FALSE(book->load(L"/nonexistent/book.xls", nullptr));
    EXPECT_EQ(message(), "can't open file for reading");
    EXPECT_FALSE(book->save(nullptr, false));
    EXPECT_EQ(message(), "file name can't be 0");
}

}  // namespace
}  // namespace quire
