// The flat entry points against recording doubles of the interfaces: each entry point must call
// its one operation with the caller's arguments in order, plus the fixed arguments it adds, and
// turn booleans, handles and out-parameters as the C interface promises.
#include <gtest/gtest.h>

#include "api/enums.h"
#include "api/handles.h"
#include "recording_mocks.h"

namespace {

using namespace quire::recording;
using quire::flat::toHandle;

class FlatForwarding : public ::testing::Test {
protected:
    void SetUp() override {
        calls.clear();
        resultBool = true;
        outBool = true;
        resultBook = &bookDouble;
        resultSheet = &sheetDouble;
        resultFormat = &formatDouble;
        resultFont = &fontDouble;
        resultAutoFilter = &autoFilterDouble;
        resultFilterColumn = &filterColumnDouble;
    }

    RecordingBook bookDouble{"B"};
    RecordingSheet sheetDouble{"S"};
    RecordingFormat formatDouble{"F"};
    RecordingFont fontDouble{"T"};
    RecordingAutoFilter autoFilterDouble{"A"};
    RecordingFilterColumn filterColumnDouble{"C"};

    BookHandle book = toHandle(static_cast<quire::IBook*>(&bookDouble));
    SheetHandle sheet = toHandle(static_cast<quire::ISheet*>(&sheetDouble));
    FormatHandle format = toHandle(static_cast<quire::IFormat*>(&formatDouble));
    FontHandle font = toHandle(static_cast<quire::IFont*>(&fontDouble));
    AutoFilterHandle autoFilter = toHandle(static_cast<quire::IAutoFilter*>(&autoFilterDouble));
    FilterColumnHandle filterColumn =
        toHandle(static_cast<quire::IFilterColumn*>(&filterColumnDouble));

    // Out-parameter targets.
    int ints[8] = {};
    int flags[4] = {};
    double number = 0;
    unsigned size = 0;
    const char* bytes = nullptr;
    const wchar_t* texts[2] = {};
    FormatHandle formatOut = nullptr;
};

// One entry point call: exactly one operation call, logged as expected.
#define EXPECT_FORWARD(call, expected)          \
    do {                                        \
        calls.clear();                          \
        (void)(call);                           \
        ASSERT_EQ(calls.size(), 1u) << #call;   \
        EXPECT_EQ(calls[0], expected) << #call; \
    } while (false)

TEST_F(FlatForwarding, BookEntryPointsForwardInOrder) {
    EXPECT_FORWARD(qrBookLoadUsingTempFileW(book, L"w1", L"w2"), "load(L'w1',L'w2')");
    EXPECT_FORWARD(qrBookLoadW(book, L"w1"), "load(L'w1',null)");
    EXPECT_FORWARD(qrBookLoadPartiallyUsingTempFileW(book, L"w1", 1, 2, 3, L"w2"),
                   "loadPartially(L'w1',1,2,3,L'w2')");
    EXPECT_FORWARD(qrBookLoadPartiallyW(book, L"w1", 1, 2, 3), "loadPartially(L'w1',1,2,3,null)");
    EXPECT_FORWARD(qrBookSaveUsingTempFileW(book, L"w1", 5), "save(L'w1',true)");
    EXPECT_FORWARD(qrBookSaveUsingTempFileW(book, L"w1", 0), "save(L'w1',false)");
    EXPECT_FORWARD(qrBookSaveW(book, L"w1"), "save(L'w1',false)");
    EXPECT_FORWARD(qrBookLoadRawPartiallyW(book, "n1", 9u, 1, 2, 3), "loadRaw('n1',9u,1,2,3)");
    EXPECT_FORWARD(qrBookLoadRawW(book, "n1", 9u), "loadRaw('n1',9u,-1,-1,-1)");
    EXPECT_FORWARD(qrBookSaveRawW(book, &bytes, &size), "saveRaw(out,out)");
    EXPECT_FORWARD(qrBookAddSheetW(book, L"w1", sheet), "addSheet(L'w1',S)");
    EXPECT_FORWARD(qrBookInsertSheetW(book, 1, L"w1", sheet), "insertSheet(1,L'w1',S)");
    EXPECT_FORWARD(qrBookGetSheetW(book, 1), "getSheet(1)");
    EXPECT_FORWARD(qrBookSheetTypeW(book, 1), "sheetType(1)");
    EXPECT_FORWARD(qrBookMoveSheetW(book, 1, 2), "moveSheet(1,2)");
    EXPECT_FORWARD(qrBookDelSheetW(book, 1), "delSheet(1)");
    EXPECT_FORWARD(qrBookSheetCountW(book), "sheetCount()");
    EXPECT_FORWARD(qrBookAddFormatW(book, format), "addFormat(F)");
    EXPECT_FORWARD(qrBookAddFontW(book, font), "addFont(T)");
    EXPECT_FORWARD(qrBookAddCustomNumFormatW(book, L"w1"), "addCustomNumFormat(L'w1')");
    EXPECT_FORWARD(qrBookCustomNumFormatW(book, 1), "customNumFormat(1)");
    EXPECT_FORWARD(qrBookFormatW(book, 1), "format(1)");
    EXPECT_FORWARD(qrBookFormatSizeW(book), "formatSize()");
    EXPECT_FORWARD(qrBookFontW(book, 1), "font(1)");
    EXPECT_FORWARD(qrBookFontSizeW(book), "fontSize()");
    EXPECT_FORWARD(qrBookDatePackW(book, 1, 2, 3, 4, 5, 6, 7), "datePack(1,2,3,4,5,6,7)");
    EXPECT_FORWARD(qrBookDateUnpackW(book, 1.5, &ints[0], &ints[1], &ints[2], &ints[3], &ints[4],
                                     &ints[5], &ints[6]),
                   "dateUnpack(1.5d,out,out,out,out,out,out,out)");
    EXPECT_FORWARD(qrBookColorPackW(book, 1, 2, 3), "colorPack(1,2,3)");
    EXPECT_FORWARD(qrBookColorUnpackW(book, 1, &ints[0], &ints[1], &ints[2]),
                   "colorUnpack(1,out,out,out)");
    EXPECT_FORWARD(qrBookActiveSheetW(book), "activeSheet()");
    EXPECT_FORWARD(qrBookSetActiveSheetW(book, 1), "setActiveSheet(1)");
    EXPECT_FORWARD(qrBookPictureSizeW(book), "pictureSize()");
    EXPECT_FORWARD(qrBookGetPictureW(book, 1, &bytes, &size), "getPicture(1,out,out)");
    EXPECT_FORWARD(qrBookAddPictureW(book, L"w1"), "addPicture(L'w1')");
    EXPECT_FORWARD(qrBookAddPicture2W(book, "n1", 9u), "addPicture2('n1',9u)");
    EXPECT_FORWARD(qrBookDefaultFontW(book, &ints[0]), "defaultFont(out)");
    EXPECT_FORWARD(qrBookSetDefaultFontW(book, L"w1", 1), "setDefaultFont(L'w1',1)");
    EXPECT_FORWARD(qrBookRefR1C1W(book), "refR1C1()");
    EXPECT_FORWARD(qrBookSetRefR1C1W(book, 5), "setRefR1C1(true)");
    EXPECT_FORWARD(qrBookRgbModeW(book), "rgbMode()");
    EXPECT_FORWARD(qrBookSetRgbModeW(book, 5), "setRgbMode(true)");
    EXPECT_FORWARD(qrBookVersionW(book), "version()");
    EXPECT_FORWARD(qrBookBiffVersionW(book), "biffVersion()");
    EXPECT_FORWARD(qrBookIsDate1904W(book), "isDate1904()");
    EXPECT_FORWARD(qrBookSetDate1904W(book, 5), "setDate1904(true)");
    EXPECT_FORWARD(qrBookIsTemplateW(book), "isTemplate()");
    EXPECT_FORWARD(qrBookSetTemplateW(book, 5), "setTemplate(true)");
    EXPECT_FORWARD(qrBookSetLocaleW(book, "n1"), "setLocale('n1')");
    EXPECT_FORWARD(qrBookErrorMessageW(book), "errorMessage()");
    EXPECT_FORWARD(qrBookReleaseW(book), "release()");
}

TEST_F(FlatForwarding, SheetEntryPointsForwardInOrder) {
    EXPECT_FORWARD(qrSheetCellTypeW(sheet, 1, 2), "cellType(1,2)");
    EXPECT_FORWARD(qrSheetIsFormulaW(sheet, 1, 2), "isFormula(1,2)");
    EXPECT_FORWARD(qrSheetCellFormatW(sheet, 1, 2), "cellFormat(1,2)");
    EXPECT_FORWARD(qrSheetSetCellFormatW(sheet, 1, 2, format), "setCellFormat(1,2,F)");
    EXPECT_FORWARD(qrSheetReadStrW(sheet, 1, 2, &formatOut), "readStr(1,2,out)");
    EXPECT_FORWARD(qrSheetWriteStrW(sheet, 1, 2, L"w1", format), "writeStr(1,2,L'w1',F,2)");
    EXPECT_FORWARD(qrSheetReadNumW(sheet, 1, 2, &formatOut), "readNum(1,2,out)");
    EXPECT_FORWARD(qrSheetWriteNumW(sheet, 1, 2, 1.5, format), "writeNum(1,2,1.5d,F)");
    EXPECT_FORWARD(qrSheetReadBoolW(sheet, 1, 2, &formatOut), "readBool(1,2,out)");
    EXPECT_FORWARD(qrSheetWriteBoolW(sheet, 1, 2, 5, format), "writeBool(1,2,true,F,255)");
    EXPECT_FORWARD(qrSheetWriteBoolW(sheet, 1, 2, -1, nullptr), "writeBool(1,2,true,null,255)");
    EXPECT_FORWARD(qrSheetWriteBoolW(sheet, 1, 2, 0, format), "writeBool(1,2,false,F,255)");
    EXPECT_FORWARD(qrSheetReadBlankW(sheet, 1, 2, &formatOut), "readBlank(1,2,out)");
    EXPECT_FORWARD(qrSheetWriteBlankW(sheet, 1, 2, format), "writeBlank(1,2,F)");
    EXPECT_FORWARD(qrSheetReadFormulaW(sheet, 1, 2, &formatOut), "readFormula(1,2,out)");
    EXPECT_FORWARD(qrSheetWriteFormulaW(sheet, 1, 2, L"w1", format), "writeFormula(1,2,L'w1',F)");
    EXPECT_FORWARD(qrSheetWriteFormulaNumW(sheet, 1, 2, L"w1", 1.5, format),
                   "writeFormulaNum(1,2,L'w1',1.5d,F)");
    EXPECT_FORWARD(qrSheetWriteFormulaStrW(sheet, 1, 2, L"w1", L"w2", format),
                   "writeFormulaStr(1,2,L'w1',L'w2',F)");
    EXPECT_FORWARD(qrSheetWriteFormulaBoolW(sheet, 1, 2, L"w1", 5, format),
                   "writeFormulaBool(1,2,L'w1',true,F)");
    EXPECT_FORWARD(qrSheetReadCommentW(sheet, 1, 2), "readComment(1,2)");
    EXPECT_FORWARD(qrSheetWriteCommentW(sheet, 1, 2, L"w1", L"w2", 3, 4),
                   "writeComment(1,2,L'w1',L'w2',3,4)");
    EXPECT_FORWARD(qrSheetRemoveCommentW(sheet, 1, 2), "removeComment(1,2)");
    EXPECT_FORWARD(qrSheetIsDateW(sheet, 1, 2), "isDate(1,2)");
    EXPECT_FORWARD(qrSheetReadErrorW(sheet, 1, 2), "readError(1,2)");
    EXPECT_FORWARD(qrSheetWriteErrorW(sheet, 1, 2, 3, format), "writeError(1,2,3,F)");
    EXPECT_FORWARD(qrSheetColWidthW(sheet, 1), "colWidth(1)");
    EXPECT_FORWARD(qrSheetRowHeightW(sheet, 1), "rowHeight(1)");
    EXPECT_FORWARD(qrSheetColWidthPxW(sheet, 1), "colWidthPx(1)");
    EXPECT_FORWARD(qrSheetRowHeightPxW(sheet, 1), "rowHeightPx(1)");
    EXPECT_FORWARD(qrSheetSetColW(sheet, 1, 2, 1.5, format, 5), "setCol(1,2,1.5d,F,true)");
    EXPECT_FORWARD(qrSheetSetRowW(sheet, 1, 1.5, format, 5), "setRow(1,1.5d,F,true)");
    EXPECT_FORWARD(qrSheetRowHiddenW(sheet, 1), "rowHidden(1)");
    EXPECT_FORWARD(qrSheetSetRowHiddenW(sheet, 1, 5), "setRowHidden(1,true)");
    EXPECT_FORWARD(qrSheetColHiddenW(sheet, 1), "colHidden(1)");
    EXPECT_FORWARD(qrSheetSetColHiddenW(sheet, 1, 5), "setColHidden(1,true)");
    EXPECT_FORWARD(qrSheetGetMergeW(sheet, 1, 2, &ints[0], &ints[1], &ints[2], &ints[3]),
                   "getMerge(1,2,out,out,out,out)");
    EXPECT_FORWARD(qrSheetSetMergeW(sheet, 1, 2, 3, 4), "setMerge(1,2,3,4)");
    EXPECT_FORWARD(qrSheetDelMergeW(sheet, 1, 2), "delMerge(1,2)");
    EXPECT_FORWARD(qrSheetMergeSizeW(sheet), "mergeSize()");
    EXPECT_FORWARD(qrSheetMergeW(sheet, 1, &ints[0], &ints[1], &ints[2], &ints[3]),
                   "merge(1,out,out,out,out)");
    EXPECT_FORWARD(qrSheetDelMergeByIndexW(sheet, 1), "delMergeByIndex(1)");
    EXPECT_FORWARD(qrSheetPictureSizeW(sheet), "pictureSize()");
    EXPECT_FORWARD(qrSheetGetPictureW(sheet, 1, &ints[0], &ints[1], &ints[2], &ints[3], &ints[4],
                                      &ints[5], &ints[6], &ints[7]),
                   "getPicture(1,out,out,out,out,out,out,out,out,0)");
    EXPECT_FORWARD(qrSheetGetPictureW(sheet, 1, nullptr, nullptr, nullptr, nullptr, nullptr,
                                      nullptr, nullptr, nullptr),
                   "getPicture(1,null,null,null,null,null,null,null,null,0)");
    EXPECT_FORWARD(qrSheetSetPictureW(sheet, 1, 2, 3, 1.5, 4, 5, 6),
                   "setPicture(1,2,3,1.5d,4,5,6)");
    EXPECT_FORWARD(qrSheetSetPicture2W(sheet, 1, 2, 3, 4, 5, 6, 7, 8),
                   "setPicture2(1,2,3,4,5,6,7,8)");
    EXPECT_FORWARD(qrSheetGetHorPageBreakW(sheet, 1), "getHorPageBreak(1)");
    EXPECT_FORWARD(qrSheetGetHorPageBreakSizeW(sheet), "getHorPageBreakSize()");
    EXPECT_FORWARD(qrSheetGetVerPageBreakW(sheet, 1), "getVerPageBreak(1)");
    EXPECT_FORWARD(qrSheetGetVerPageBreakSizeW(sheet), "getVerPageBreakSize()");
    EXPECT_FORWARD(qrSheetSetHorPageBreakW(sheet, 1, 5), "setHorPageBreak(1,true)");
    EXPECT_FORWARD(qrSheetSetVerPageBreakW(sheet, 1, 5), "setVerPageBreak(1,true)");
    EXPECT_FORWARD(qrSheetSplitW(sheet, 1, 2), "split(1,2)");
    EXPECT_FORWARD(qrSheetSplitInfoW(sheet, &ints[0], &ints[1]), "splitInfo(out,out)");
    EXPECT_FORWARD(qrSheetGroupRowsW(sheet, 1, 2, 5), "groupRows(1,2,true)");
    EXPECT_FORWARD(qrSheetGroupColsW(sheet, 1, 2, 5), "groupCols(1,2,true)");
    EXPECT_FORWARD(qrSheetGroupSummaryBelowW(sheet), "groupSummaryBelow()");
    EXPECT_FORWARD(qrSheetSetGroupSummaryBelowW(sheet, 5), "setGroupSummaryBelow(true)");
    EXPECT_FORWARD(qrSheetGroupSummaryRightW(sheet), "groupSummaryRight()");
    EXPECT_FORWARD(qrSheetSetGroupSummaryRightW(sheet, 5), "setGroupSummaryRight(true)");
    EXPECT_FORWARD(qrSheetClearW(sheet, 1, 2, 3, 4), "clear(1,2,3,4)");
    EXPECT_FORWARD(qrSheetInsertColW(sheet, 1, 2), "insertCol(1,2,true)");
    EXPECT_FORWARD(qrSheetInsertRowW(sheet, 1, 2), "insertRow(1,2,true)");
    EXPECT_FORWARD(qrSheetRemoveColW(sheet, 1, 2), "removeCol(1,2,true)");
    EXPECT_FORWARD(qrSheetRemoveRowW(sheet, 1, 2), "removeRow(1,2,true)");
    EXPECT_FORWARD(qrSheetCopyCellW(sheet, 1, 2, 3, 4), "copyCell(1,2,3,4)");
    EXPECT_FORWARD(qrSheetFirstRowW(sheet), "firstRow()");
    EXPECT_FORWARD(qrSheetLastRowW(sheet), "lastRow()");
    EXPECT_FORWARD(qrSheetFirstColW(sheet), "firstCol()");
    EXPECT_FORWARD(qrSheetLastColW(sheet), "lastCol()");
    EXPECT_FORWARD(qrSheetDisplayGridlinesW(sheet), "displayGridlines()");
    EXPECT_FORWARD(qrSheetSetDisplayGridlinesW(sheet, 5), "setDisplayGridlines(true)");
    EXPECT_FORWARD(qrSheetPrintGridlinesW(sheet), "printGridlines()");
    EXPECT_FORWARD(qrSheetSetPrintGridlinesW(sheet, 5), "setPrintGridlines(true)");
    EXPECT_FORWARD(qrSheetZoomW(sheet), "zoom()");
    EXPECT_FORWARD(qrSheetSetZoomW(sheet, 1), "setZoom(1)");
    EXPECT_FORWARD(qrSheetPrintZoomW(sheet), "printZoom()");
    EXPECT_FORWARD(qrSheetSetPrintZoomW(sheet, 1), "setPrintZoom(1)");
    EXPECT_FORWARD(qrSheetGetPrintFitW(sheet, &ints[0], &ints[1]), "getPrintFit(out,out)");
    EXPECT_FORWARD(qrSheetSetPrintFitW(sheet, 1, 2), "setPrintFit(1,2)");
    EXPECT_FORWARD(qrSheetLandscapeW(sheet), "landscape()");
    EXPECT_FORWARD(qrSheetSetLandscapeW(sheet, 5), "setLandscape(true)");
    EXPECT_FORWARD(qrSheetPaperW(sheet), "paper()");
    EXPECT_FORWARD(qrSheetSetPaperW(sheet, 1), "setPaper(1)");
    EXPECT_FORWARD(qrSheetHeaderW(sheet), "header()");
    EXPECT_FORWARD(qrSheetSetHeaderW(sheet, L"w1", 1.5), "setHeader(L'w1',1.5d)");
    EXPECT_FORWARD(qrSheetHeaderMarginW(sheet), "headerMargin()");
    EXPECT_FORWARD(qrSheetFooterW(sheet), "footer()");
    EXPECT_FORWARD(qrSheetSetFooterW(sheet, L"w1", 1.5), "setFooter(L'w1',1.5d)");
    EXPECT_FORWARD(qrSheetFooterMarginW(sheet), "footerMargin()");
    EXPECT_FORWARD(qrSheetHCenterW(sheet), "hCenter()");
    EXPECT_FORWARD(qrSheetSetHCenterW(sheet, 5), "setHCenter(true)");
    EXPECT_FORWARD(qrSheetVCenterW(sheet), "vCenter()");
    EXPECT_FORWARD(qrSheetSetVCenterW(sheet, 5), "setVCenter(true)");
    EXPECT_FORWARD(qrSheetMarginLeftW(sheet), "marginLeft()");
    EXPECT_FORWARD(qrSheetSetMarginLeftW(sheet, 1.5), "setMarginLeft(1.5d)");
    EXPECT_FORWARD(qrSheetMarginRightW(sheet), "marginRight()");
    EXPECT_FORWARD(qrSheetSetMarginRightW(sheet, 1.5), "setMarginRight(1.5d)");
    EXPECT_FORWARD(qrSheetMarginTopW(sheet), "marginTop()");
    EXPECT_FORWARD(qrSheetSetMarginTopW(sheet, 1.5), "setMarginTop(1.5d)");
    EXPECT_FORWARD(qrSheetMarginBottomW(sheet), "marginBottom()");
    EXPECT_FORWARD(qrSheetSetMarginBottomW(sheet, 1.5), "setMarginBottom(1.5d)");
    EXPECT_FORWARD(qrSheetPrintRowColW(sheet), "printRowCol()");
    EXPECT_FORWARD(qrSheetSetPrintRowColW(sheet, 5), "setPrintRowCol(true)");
    EXPECT_FORWARD(qrSheetPrintRepeatRowsW(sheet, &ints[0], &ints[1]), "printRepeatRows(out,out)");
    EXPECT_FORWARD(qrSheetSetPrintRepeatRowsW(sheet, 1, 2), "setPrintRepeatRows(1,2)");
    EXPECT_FORWARD(qrSheetPrintRepeatColsW(sheet, &ints[0], &ints[1]), "printRepeatCols(out,out)");
    EXPECT_FORWARD(qrSheetSetPrintRepeatColsW(sheet, 1, 2), "setPrintRepeatCols(1,2)");
    EXPECT_FORWARD(qrSheetPrintAreaW(sheet, &ints[0], &ints[1], &ints[2], &ints[3]),
                   "printArea(out,out,out,out)");
    EXPECT_FORWARD(qrSheetSetPrintAreaW(sheet, 1, 2, 3, 4), "setPrintArea(1,2,3,4)");
    EXPECT_FORWARD(qrSheetClearPrintRepeatsW(sheet), "clearPrintRepeats()");
    EXPECT_FORWARD(qrSheetClearPrintAreaW(sheet), "clearPrintArea()");
    EXPECT_FORWARD(
        qrSheetGetNamedRangeW(sheet, L"w1", &ints[0], &ints[1], &ints[2], &ints[3], 1, &flags[0]),
        "getNamedRange(L'w1',out,out,out,out,1,out)");
    EXPECT_FORWARD(qrSheetSetNamedRangeW(sheet, L"w1", 1, 2, 3, 4),
                   "setNamedRange(L'w1',1,2,3,4,0)");
    EXPECT_FORWARD(qrSheetDelNamedRangeW(sheet, L"w1", 1), "delNamedRange(L'w1',1)");
    EXPECT_FORWARD(qrSheetNamedRangeSizeW(sheet), "namedRangeSize()");
    EXPECT_FORWARD(
        qrSheetNamedRangeW(sheet, 1, &ints[0], &ints[1], &ints[2], &ints[3], &ints[4], &flags[0]),
        "namedRange(1,out,out,out,out,out,out)");
    EXPECT_FORWARD(qrSheetTableSizeW(sheet), "tableSize()");
    EXPECT_FORWARD(
        qrSheetTableW(sheet, 1, &ints[0], &ints[1], &ints[2], &ints[3], &ints[4], &ints[5]),
        "table(1,out,out,out,out,out,out)");
    EXPECT_FORWARD(qrSheetHyperlinkSizeW(sheet), "hyperlinkSize()");
    EXPECT_FORWARD(qrSheetHyperlinkW(sheet, 1, &ints[0], &ints[1], &ints[2], &ints[3]),
                   "hyperlink(1,out,out,out,out)");
    EXPECT_FORWARD(qrSheetDelHyperlinkW(sheet, 1), "delHyperlink(1)");
    EXPECT_FORWARD(qrSheetAddHyperlinkW(sheet, L"w1", 1, 2, 3, 4), "addHyperlink(L'w1',1,2,3,4)");
    EXPECT_FORWARD(qrSheetAutoFilterW(sheet), "autoFilter()");
    EXPECT_FORWARD(qrSheetApplyFilterW(sheet), "applyFilter()");
    EXPECT_FORWARD(qrSheetRemoveFilterW(sheet), "removeFilter()");
    EXPECT_FORWARD(qrSheetNameW(sheet), "name()");
    EXPECT_FORWARD(qrSheetSetNameW(sheet, L"w1"), "setName(L'w1')");
    EXPECT_FORWARD(qrSheetProtectW(sheet), "protect()");
    EXPECT_FORWARD(qrSheetSetProtectExW(sheet, 5, L"w1", 1), "setProtectEx(true,L'w1',1)");
    EXPECT_FORWARD(qrSheetSetProtectW(sheet, 5), "setProtectEx(true,null,-1)");
    EXPECT_FORWARD(qrSheetSetProtectW(sheet, 0), "setProtectEx(false,null,-1)");
    EXPECT_FORWARD(qrSheetHiddenW(sheet), "hidden()");
    EXPECT_FORWARD(qrSheetSetHiddenW(sheet, 1), "setHidden(1)");
    EXPECT_FORWARD(qrSheetGetTopLeftViewW(sheet, &ints[0], &ints[1]), "getTopLeftView(out,out)");
    EXPECT_FORWARD(qrSheetSetTopLeftViewW(sheet, 1, 2), "setTopLeftView(1,2)");
    EXPECT_FORWARD(qrSheetRightToLeftW(sheet), "rightToLeft()");
    EXPECT_FORWARD(qrSheetSetRightToLeftW(sheet, 5), "setRightToLeft(true)");
    EXPECT_FORWARD(qrSheetSetAutoFitAreaW(sheet, 1, 2, 3, 4), "setAutoFitArea(1,2,3,4)");
    EXPECT_FORWARD(qrSheetAddrToRowColW(sheet, L"w1", &ints[0], &ints[1], &flags[0], &flags[1]),
                   "addrToRowCol(L'w1',out,out,out,out)");
    EXPECT_FORWARD(qrSheetRowColToAddrW(sheet, 1, 2, 5, 5), "rowColToAddr(1,2,true,true)");
    EXPECT_FORWARD(qrSheetSetTabRgbColorW(sheet, 1, 2, 3), "setTabRgbColor(1,2,3)");
    EXPECT_FORWARD(qrSheetSetTabColorW(sheet, 1), "setTabColor(1)");
    EXPECT_FORWARD(qrSheetAddIgnoredErrorW(sheet, 1, 2, 3, 4, 5), "addIgnoredError(1,2,3,4,5)");
    EXPECT_FORWARD(qrSheetAddDataValidationExW(sheet, 1, 2, 3, 4, 5, 6, L"w1", L"w2", 1, 0, -1, 2,
                                               L"w3", L"w4", L"w5", L"w6", 11),
                   "addDataValidation(1,2,3,4,5,6,L'w1',L'w2',true,false,false,true,"
                   "L'w3',L'w4',L'w5',L'w6',11)");
    EXPECT_FORWARD(qrSheetAddDataValidationW(sheet, 1, 2, 3, 4, 5, 6, L"w1", L"w2"),
                   "addDataValidation(1,2,3,4,5,6,L'w1',L'w2',true,false,true,true,"
                   "null,null,null,null,0)");
    EXPECT_FORWARD(qrSheetAddDataValidationDoubleExW(sheet, 1, 2, 3, 4, 5, 6, 1.5, 2.5, -1, 3, 0,
                                                     -7, L"w1", L"w2", L"w3", L"w4", 11),
                   "addDataValidationDouble(1,2,3,4,5,6,1.5d,2.5d,false,true,false,false,"
                   "L'w1',L'w2',L'w3',L'w4',11)");
    EXPECT_FORWARD(qrSheetAddDataValidationDoubleW(sheet, 1, 2, 3, 4, 5, 6, 1.5, 2.5),
                   "addDataValidationDouble(1,2,3,4,5,6,1.5d,2.5d,true,false,true,true,"
                   "null,null,null,null,0)");
    EXPECT_FORWARD(qrSheetRemoveDataValidationsW(sheet), "removeDataValidations()");
}

TEST_F(FlatForwarding, FormatEntryPointsForwardInOrder) {
    EXPECT_FORWARD(qrFormatFontW(format), "font()");
    EXPECT_FORWARD(qrFormatSetFontW(format, font), "setFont(T)");
    EXPECT_FORWARD(qrFormatNumFormatW(format), "numFormat()");
    EXPECT_FORWARD(qrFormatSetNumFormatW(format, 1), "setNumFormat(1)");
    EXPECT_FORWARD(qrFormatAlignHW(format), "alignH()");
    EXPECT_FORWARD(qrFormatSetAlignHW(format, 1), "setAlignH(1)");
    EXPECT_FORWARD(qrFormatAlignVW(format), "alignV()");
    EXPECT_FORWARD(qrFormatSetAlignVW(format, 1), "setAlignV(1)");
    EXPECT_FORWARD(qrFormatWrapW(format), "wrap()");
    EXPECT_FORWARD(qrFormatSetWrapW(format, 5), "setWrap(true)");
    EXPECT_FORWARD(qrFormatRotationW(format), "rotation()");
    EXPECT_FORWARD(qrFormatSetRotationW(format, 1), "setRotation(1)");
    EXPECT_FORWARD(qrFormatIndentW(format), "indent()");
    EXPECT_FORWARD(qrFormatSetIndentW(format, 1), "setIndent(1)");
    EXPECT_FORWARD(qrFormatShrinkToFitW(format), "shrinkToFit()");
    EXPECT_FORWARD(qrFormatSetShrinkToFitW(format, 5), "setShrinkToFit(true)");
    EXPECT_FORWARD(qrFormatSetBorderW(format, 1), "setBorder(1)");
    EXPECT_FORWARD(qrFormatSetBorderColorW(format, 1), "setBorderColor(1)");
    EXPECT_FORWARD(qrFormatBorderLeftW(format), "borderLeft()");
    EXPECT_FORWARD(qrFormatSetBorderLeftW(format, 1), "setBorderLeft(1)");
    EXPECT_FORWARD(qrFormatBorderRightW(format), "borderRight()");
    EXPECT_FORWARD(qrFormatSetBorderRightW(format, 1), "setBorderRight(1)");
    EXPECT_FORWARD(qrFormatBorderTopW(format), "borderTop()");
    EXPECT_FORWARD(qrFormatSetBorderTopW(format, 1), "setBorderTop(1)");
    EXPECT_FORWARD(qrFormatBorderBottomW(format), "borderBottom()");
    EXPECT_FORWARD(qrFormatSetBorderBottomW(format, 1), "setBorderBottom(1)");
    EXPECT_FORWARD(qrFormatBorderLeftColorW(format), "borderLeftColor()");
    EXPECT_FORWARD(qrFormatSetBorderLeftColorW(format, 1), "setBorderLeftColor(1)");
    EXPECT_FORWARD(qrFormatBorderRightColorW(format), "borderRightColor()");
    EXPECT_FORWARD(qrFormatSetBorderRightColorW(format, 1), "setBorderRightColor(1)");
    EXPECT_FORWARD(qrFormatBorderTopColorW(format), "borderTopColor()");
    EXPECT_FORWARD(qrFormatSetBorderTopColorW(format, 1), "setBorderTopColor(1)");
    EXPECT_FORWARD(qrFormatBorderBottomColorW(format), "borderBottomColor()");
    EXPECT_FORWARD(qrFormatSetBorderBottomColorW(format, 1), "setBorderBottomColor(1)");
    EXPECT_FORWARD(qrFormatBorderDiagonalW(format), "borderDiagonal()");
    EXPECT_FORWARD(qrFormatSetBorderDiagonalW(format, 1), "setBorderDiagonal(1)");
    EXPECT_FORWARD(qrFormatBorderDiagonalStyleW(format), "borderDiagonalStyle()");
    EXPECT_FORWARD(qrFormatSetBorderDiagonalStyleW(format, 1), "setBorderDiagonalStyle(1)");
    EXPECT_FORWARD(qrFormatBorderDiagonalColorW(format), "borderDiagonalColor()");
    EXPECT_FORWARD(qrFormatSetBorderDiagonalColorW(format, 1), "setBorderDiagonalColor(1)");
    EXPECT_FORWARD(qrFormatFillPatternW(format), "fillPattern()");
    EXPECT_FORWARD(qrFormatSetFillPatternW(format, 1), "setFillPattern(1)");
    EXPECT_FORWARD(qrFormatPatternForegroundColorW(format), "patternForegroundColor()");
    EXPECT_FORWARD(qrFormatSetPatternForegroundColorW(format, 1), "setPatternForegroundColor(1)");
    EXPECT_FORWARD(qrFormatPatternBackgroundColorW(format), "patternBackgroundColor()");
    EXPECT_FORWARD(qrFormatSetPatternBackgroundColorW(format, 1), "setPatternBackgroundColor(1)");
    EXPECT_FORWARD(qrFormatLockedW(format), "locked()");
    EXPECT_FORWARD(qrFormatSetLockedW(format, 5), "setLocked(true)");
    EXPECT_FORWARD(qrFormatHiddenW(format), "hidden()");
    EXPECT_FORWARD(qrFormatSetHiddenW(format, 5), "setHidden(true)");
}

TEST_F(FlatForwarding, FontEntryPointsForwardInOrder) {
    EXPECT_FORWARD(qrFontSizeW(font), "size()");
    EXPECT_FORWARD(qrFontSetSizeW(font, 1), "setSize(1)");
    EXPECT_FORWARD(qrFontItalicW(font), "italic()");
    EXPECT_FORWARD(qrFontSetItalicW(font, 5), "setItalic(true)");
    EXPECT_FORWARD(qrFontStrikeOutW(font), "strikeOut()");
    EXPECT_FORWARD(qrFontSetStrikeOutW(font, 5), "setStrikeOut(true)");
    EXPECT_FORWARD(qrFontColorW(font), "color()");
    EXPECT_FORWARD(qrFontSetColorW(font, 1), "setColor(1)");
    EXPECT_FORWARD(qrFontBoldW(font), "bold()");
    EXPECT_FORWARD(qrFontSetBoldW(font, 5), "setBold(true)");
    EXPECT_FORWARD(qrFontScriptW(font), "script()");
    EXPECT_FORWARD(qrFontSetScriptW(font, 1), "setScript(1)");
    EXPECT_FORWARD(qrFontUnderlineW(font), "underline()");
    EXPECT_FORWARD(qrFontSetUnderlineW(font, 1), "setUnderline(1)");
    EXPECT_FORWARD(qrFontNameW(font), "name()");
    EXPECT_FORWARD(qrFontSetNameW(font, L"w1"), "setName(L'w1')");
}

TEST_F(FlatForwarding, AutoFilterEntryPointsForwardInOrder) {
    EXPECT_FORWARD(qrAutoFilterGetRefW(autoFilter, &ints[0], &ints[1], &ints[2], &ints[3]),
                   "getRef(out,out,out,out)");
    EXPECT_FORWARD(qrAutoFilterSetRefW(autoFilter, 1, 2, 3, 4), "setRef(1,2,3,4)");
    EXPECT_FORWARD(qrAutoFilterColumnW(autoFilter, 1), "column(1)");
    EXPECT_FORWARD(qrAutoFilterColumnSizeW(autoFilter), "columnSize()");
    EXPECT_FORWARD(qrAutoFilterColumnByIndexW(autoFilter, 1), "columnByIndex(1)");
    EXPECT_FORWARD(qrAutoFilterGetSortRangeW(autoFilter, &ints[0], &ints[1], &ints[2], &ints[3]),
                   "getSortRange(out,out,out,out)");
    EXPECT_FORWARD(qrAutoFilterGetSortW(autoFilter, &ints[0], &flags[0]), "getSort(out,out)");
    EXPECT_FORWARD(qrAutoFilterSetSortW(autoFilter, 1, 5), "setSort(1,true)");
}

TEST_F(FlatForwarding, FilterColumnEntryPointsForwardInOrder) {
    EXPECT_FORWARD(qrFilterColumnIndexW(filterColumn), "index()");
    EXPECT_FORWARD(qrFilterColumnFilterTypeW(filterColumn), "filterType()");
    EXPECT_FORWARD(qrFilterColumnFilterSizeW(filterColumn), "filterSize()");
    EXPECT_FORWARD(qrFilterColumnFilterW(filterColumn, 1), "filter(1)");
    EXPECT_FORWARD(qrFilterColumnAddFilterW(filterColumn, L"w1"), "addFilter(L'w1')");
    EXPECT_FORWARD(qrFilterColumnGetTop10W(filterColumn, &number, &flags[0], &flags[1]),
                   "getTop10(out,out,out)");
    EXPECT_FORWARD(qrFilterColumnSetTop10W(filterColumn, 1.5, 5, 5), "setTop10(1.5d,true,true)");
    EXPECT_FORWARD(qrFilterColumnGetCustomFilterW(filterColumn, &ints[0], &texts[1], &ints[1],
                                                  &texts[0], &flags[0]),
                   "getCustomFilter(out,out,out,out,out)");
    EXPECT_FORWARD(qrFilterColumnSetCustomFilterExW(filterColumn, 1, L"w1", 2, L"w2", 3),
                   "setCustomFilter(1,L'w1',2,L'w2',true)");
    EXPECT_FORWARD(qrFilterColumnSetCustomFilterW(filterColumn, 1, L"w1"),
                   "setCustomFilter(1,L'w1',0,null,false)");
    EXPECT_FORWARD(qrFilterColumnClearW(filterColumn), "clear()");
}

TEST_F(FlatForwarding, RowColToAddrTakesOnlyPositiveFlagsAsRelative) {
    EXPECT_FORWARD(qrSheetRowColToAddrW(sheet, 0, 0, 1, 1), "rowColToAddr(0,0,true,true)");
    EXPECT_FORWARD(qrSheetRowColToAddrW(sheet, 0, 0, -1, -1), "rowColToAddr(0,0,false,false)");
    EXPECT_FORWARD(qrSheetRowColToAddrW(sheet, 0, 0, 0, 0), "rowColToAddr(0,0,false,false)");
    EXPECT_FORWARD(qrSheetRowColToAddrW(sheet, 0, 0, 1, -1), "rowColToAddr(0,0,true,false)");
    EXPECT_FORWARD(qrSheetRowColToAddrW(sheet, 0, 0, -5, 9), "rowColToAddr(0,0,false,true)");
}

TEST_F(FlatForwarding, BooleanArgumentsTakeAnyNonZeroAsTrue) {
    EXPECT_FORWARD(qrSheetSetRowHiddenW(sheet, 3, -1), "setRowHidden(3,true)");
    EXPECT_FORWARD(qrSheetSetRowHiddenW(sheet, 3, 0), "setRowHidden(3,false)");
    EXPECT_FORWARD(qrFontSetBoldW(font, 2), "setBold(true)");
    EXPECT_FORWARD(qrFilterColumnSetTop10W(filterColumn, 10, 0, -3), "setTop10(10d,false,true)");
    // Enumerations that look like flags are passed as they are.
    EXPECT_FORWARD(qrSheetSetHiddenW(sheet, 2), "setHidden(2)");
}

TEST_F(FlatForwarding, BooleanResultsAreZeroOrOne) {
    resultBool = true;
    EXPECT_EQ(qrSheetWriteNumW(sheet, 0, 0, 1.0, nullptr), 1);
    EXPECT_EQ(qrFormatWrapW(format), 1);
    resultBool = false;
    EXPECT_EQ(qrSheetWriteNumW(sheet, 0, 0, 1.0, nullptr), 0);
    EXPECT_EQ(qrFormatWrapW(format), 0);
}

TEST_F(FlatForwarding, OtherResultsPassThrough) {
    EXPECT_EQ(qrBookSheetCountW(book), kResultInt);
    EXPECT_EQ(qrSheetReadNumW(sheet, 0, 0, nullptr), kResultDouble);
    EXPECT_STREQ(qrSheetNameW(sheet), kResultText);
    EXPECT_STREQ(qrBookErrorMessageW(book), kResultNarrowText);
}

TEST_F(FlatForwarding, HandlesAreTheObjectsAddresses) {
    EXPECT_EQ(qrBookGetSheetW(book, 0), sheet);
    EXPECT_EQ(qrBookAddFormatW(book, nullptr), format);
    EXPECT_EQ(qrBookFontW(book, 0), font);
    EXPECT_EQ(qrFormatFontW(format), font);
    EXPECT_EQ(qrSheetAutoFilterW(sheet), autoFilter);
    EXPECT_EQ(qrAutoFilterColumnW(autoFilter, 0), filterColumn);
    EXPECT_EQ(reinterpret_cast<void*>(sheet),
              static_cast<void*>(static_cast<quire::ISheet*>(&sheetDouble)));

    resultSheet = nullptr;
    EXPECT_EQ(qrBookAddSheetW(book, L"x", nullptr), nullptr);
    EXPECT_EQ(calls.back(), "addSheet(L'x',null)");
    EXPECT_FORWARD(qrBookInsertSheetW(book, 1, L"x", sheet), "insertSheet(1,L'x',S)");
    EXPECT_FORWARD(qrFormatSetFontW(format, nullptr), "setFont(null)");
}

TEST_F(FlatForwarding, FormatOutParameterReturnsAHandleOrIsLeftOut) {
    EXPECT_STREQ(qrSheetReadStrW(sheet, 1, 2, &formatOut), kResultText);
    EXPECT_EQ(formatOut, format);

    formatOut = nullptr;
    EXPECT_EQ(qrSheetReadBoolW(sheet, 1, 2, &formatOut), 1);
    EXPECT_EQ(formatOut, format);

    // No pointer from the caller: the operation sees none either.
    EXPECT_FORWARD(qrSheetReadBlankW(sheet, 1, 2, nullptr), "readBlank(1,2,null)");
    EXPECT_FORWARD(qrSheetReadFormulaW(sheet, 1, 2, nullptr), "readFormula(1,2,null)");
}

TEST_F(FlatForwarding, BooleanOutParametersAreStoredAsZeroOrOne) {
    flags[0] = flags[1] = 12345;
    outBool = true;
    qrSheetAddrToRowColW(sheet, L"A1", &ints[0], &ints[1], &flags[0], &flags[1]);
    EXPECT_EQ(flags[0], 1);
    EXPECT_EQ(flags[1], 1);
    EXPECT_EQ(ints[0], kOutInt);

    outBool = false;
    flags[0] = flags[1] = 12345;
    EXPECT_EQ(qrFilterColumnGetTop10W(filterColumn, &number, &flags[0], &flags[1]), 1);
    EXPECT_EQ(flags[0], 0);
    EXPECT_EQ(flags[1], 0);
    EXPECT_EQ(number, kOutDouble);

    flags[0] = 12345;
    qrAutoFilterGetSortW(autoFilter, &ints[0], &flags[0]);
    EXPECT_EQ(flags[0], 0);
    qrSheetGetNamedRangeW(sheet, L"n", nullptr, nullptr, nullptr, nullptr, -1, &flags[1]);
    EXPECT_EQ(flags[1], 0);
}

TEST_F(FlatForwarding, NullOutParametersStayNull) {
    EXPECT_FORWARD(qrSheetAddrToRowColW(sheet, L"C5", &ints[0], &ints[1], nullptr, nullptr),
                   "addrToRowCol(L'C5',out,out,null,null)");
    EXPECT_FORWARD(qrFilterColumnGetTop10W(filterColumn, nullptr, nullptr, nullptr),
                   "getTop10(null,null,null)");
    EXPECT_FORWARD(qrAutoFilterGetSortW(autoFilter, nullptr, nullptr), "getSort(null,null)");
    EXPECT_FORWARD(
        qrSheetNamedRangeW(sheet, 0, nullptr, nullptr, nullptr, nullptr, nullptr, nullptr),
        "namedRange(0,null,null,null,null,null,null)");
    EXPECT_FORWARD(
        qrFilterColumnGetCustomFilterW(filterColumn, nullptr, nullptr, nullptr, nullptr, nullptr),
        "getCustomFilter(null,null,null,null,null)");
}

TEST_F(FlatForwarding, CustomFilterOperatorsComeBackThroughTheCallersPointers) {
    ints[0] = ints[1] = -99;
    flags[0] = 12345;
    outBool = true;
    EXPECT_EQ(qrFilterColumnGetCustomFilterW(filterColumn, &ints[0], &texts[0], &ints[1], &texts[1],
                                             &flags[0]),
              1);
    EXPECT_EQ(calls.back(), "getCustomFilter(out,out,out,out,out)");
    EXPECT_EQ(ints[0], kOutInt);
    EXPECT_EQ(ints[1], kOutInt);
    EXPECT_STREQ(texts[0], kOutText);
    EXPECT_STREQ(texts[1], kOutText);
    EXPECT_EQ(flags[0], 1);
}

TEST_F(FlatForwarding, RawDataPassesThrough) {
    EXPECT_EQ(qrBookSaveRawW(book, &bytes, &size), 1);
    EXPECT_STREQ(bytes, kOutBytes);
    EXPECT_EQ(size, kOutUnsigned);
    EXPECT_EQ(qrBookGetPictureW(book, 0, &bytes, &size), kResultInt);
}

// The C header's constants mirror the library's enumerations, name for name and value for value.
// clang-format off
#define QUIRE_ENUM_MEMBERS \
    X(ColorBlack) X(ColorWhite) X(ColorRed) X(ColorBrightgreen) X(ColorBlue) X(ColorYellow) \
    X(ColorPink) X(ColorTurquoise) X(ColorDarkred) X(ColorGreen) X(ColorDarkblue) \
    X(ColorDarkyellow) X(ColorViolet) X(ColorTeal) X(ColorGray25) X(ColorGray50) \
    X(ColorPeriwinkleCf) X(ColorPlumCf) X(ColorIvoryCf) X(ColorLightturquoiseCf) \
    X(ColorDarkpurpleCf) X(ColorCoralCf) X(ColorOceanblueCf) X(ColorIceblueCf) X(ColorDarkblueCl) \
    X(ColorPinkCl) X(ColorYellowCl) X(ColorTurquoiseCl) X(ColorVioletCl) X(ColorDarkredCl) \
    X(ColorTealCl) X(ColorBlueCl) X(ColorSkyblue) X(ColorLightturquoise) X(ColorLightgreen) \
    X(ColorLightyellow) X(ColorPaleblue) X(ColorRose) X(ColorLavender) X(ColorTan) \
    X(ColorLightblue) X(ColorAqua) X(ColorLime) X(ColorGold) X(ColorLightorange) X(ColorOrange) \
    X(ColorBluegray) X(ColorGray40) X(ColorDarkteal) X(ColorSeagreen) X(ColorDarkgreen) \
    X(ColorOlivegreen) X(ColorBrown) X(ColorPlum) X(ColorIndigo) X(ColorGray80) \
    X(ColorDefaultForeground) X(ColorDefaultBackground) X(ColorTooltip) X(ColorNone) X(ColorAuto) \
    X(NumformatGeneral) X(NumformatNumber) X(NumformatNumberD2) X(NumformatNumberSep) \
    X(NumformatNumberSepD2) X(NumformatCurrencyNegbra) X(NumformatCurrencyNegbraRed) \
    X(NumformatCurrencyD2Negbra) X(NumformatCurrencyD2NegbraRed) X(NumformatPercent) \
    X(NumformatPercentD2) X(NumformatScientificD2) X(NumformatFractionOneDig) \
    X(NumformatFractionTwoDig) X(NumformatDate) X(NumformatCustomDMonYY) X(NumformatCustomDMon) \
    X(NumformatCustomMonYY) X(NumformatCustomHMMAM) X(NumformatCustomHMMSSAM) \
    X(NumformatCustomHMM) X(NumformatCustomHMMSS) X(NumformatCustomMDYYYYHMM) \
    X(NumformatNumberSepNegbra) X(NumformatNumberSepNegbraRed) X(NumformatNumberD2SepNegbra) \
    X(NumformatNumberD2SepNegbraRed) X(NumformatAccount) X(NumformatAccountcur) \
    X(NumformatAccountD2) X(NumformatAccountD2Cur) X(NumformatCustoMMMSS) X(NumformatCustomH0MMSS) \
    X(NumformatCustoMMMSS0) X(NumformatCustom000P0EPlus0) X(NumformatText) X(AlignHGeneral) \
    X(AlignHLeft) X(AlignHCenter) X(AlignHRight) X(AlignHFill) X(AlignHJustify) X(AlignHMerge) \
    X(AlignHDistributed) X(AlignVTop) X(AlignVCenter) X(AlignVBottom) X(AlignVJustify) \
    X(AlignVDistributed) X(BorderStyleNone) X(BorderStyleThin) X(BorderStyleMedium) \
    X(BorderStyleDashed) X(BorderStyleDotted) X(BorderStyleThick) X(BorderStyleDouble) \
    X(BorderStyleHair) X(BorderStyleMediumdashed) X(BorderStyleDashdot) \
    X(BorderStyleMediumdashdot) X(BorderStyleDashdotdot) X(BorderStyleMediumdashdotdot) \
    X(BorderStyleSlantdashdot) X(BorderDiagonalNone) X(BorderDiagonalDown) X(BorderDiagonalUp) \
    X(BorderDiagonalBoth) X(FillPatternNone) X(FillPatternSolid) X(FillPatternGray50) \
    X(FillPatternGray75) X(FillPatternGray25) X(FillPatternHorstripe) X(FillPatternVerstripe) \
    X(FillPatternRevdiagstripe) X(FillPatternDiagstripe) X(FillPatternDiagcrosshatch) \
    X(FillPatternThickdiagcrosshatch) X(FillPatternThinhorstripe) X(FillPatternThinverstripe) \
    X(FillPatternThinrevdiagstripe) X(FillPatternThindiagstripe) X(FillPatternThinhorcrosshatch) \
    X(FillPatternThindiagcrosshatch) X(FillPatternGray12P5) X(FillPatternGray6P25) \
    X(UnderlineNone) X(UnderlineSingle) X(UnderlineDouble) X(UnderlineSingleacc) \
    X(UnderlineDoubleacc) X(ScriptNormal) X(ScriptSuper) X(ScriptSub) X(CellTypeEmpty) \
    X(CellTypeNumber) X(CellTypeString) X(CellTypeBoolean) X(CellTypeBlank) X(CellTypeError) \
    X(ErrorTypeNull) X(ErrorTypeDiv0) X(ErrorTypeValue) X(ErrorTypeRef) X(ErrorTypeName) \
    X(ErrorTypeNum) X(ErrorTypeNA) X(ErrorTypeNoError) X(SheetTypeSheet) X(SheetTypeChart) \
    X(SheetTypeUnknown) X(SheetStateVisible) X(SheetStateHidden) X(SheetStateVeryHidden) \
    X(ScopeWorkbook) X(ScopeUndefined) X(PictureTypePNG) X(PictureTypeJPEG) X(PictureTypeGIF) \
    X(PictureTypeWMF) X(PictureTypeDIB) X(PictureTypeEMF) X(PictureTypePICT) X(PictureTypeTIFF) \
    X(PictureTypeError) X(PaperDefault) X(PaperLetter) X(PaperLetterSmall) X(PaperTabloid) \
    X(PaperLedger) X(PaperLegal) X(PaperStatement) X(PaperExecutive) X(PaperA3) X(PaperA4) \
    X(PaperA4Small) X(PaperA5) X(PaperB4) X(PaperB5) X(PaperFolio) X(PaperQuatro) X(Paper10X14) \
    X(Paper10X17) X(PaperNote) X(PaperEnvelope9) X(PaperEnvelope10) X(PaperEnvelope11) \
    X(PaperEnvelope12) X(PaperEnvelope14) X(PaperCSize) X(PaperDSize) X(PaperESize) \
    X(PaperEnvelopeDL) X(PaperEnvelopeC5) X(PaperEnvelopeC3) X(PaperEnvelopeC4) X(PaperEnvelopeC6) \
    X(PaperEnvelopeC65) X(PaperEnvelopeB4) X(PaperEnvelopeB5) X(PaperEnvelopeB6) X(PaperEnvelope) \
    X(PaperEnvelopeMonarch) X(PaperUSEnvelope) X(PaperFanfold) X(PaperGermanStdFanfold) \
    X(PaperGermanLegalFanfold) X(PaperB4Iso) X(PaperJapanesePostcard) X(Paper9X11) X(Paper10X11) \
    X(Paper15X11) X(PaperEnvelopeInvite) X(PaperUSLetterExtra) X(PaperUSLegalExtra) \
    X(PaperUSTabloidExtra) X(PaperA4Extra) X(PaperLetterTransverse) X(PaperA4Transverse) \
    X(PaperLetterExtraTransverse) X(PaperSupera) X(PaperSuperb) X(PaperUSLetterPlus) \
    X(PaperA4Plus) X(PaperA5Transverse) X(PaperB5Transverse) X(PaperA3Extra) X(PaperA5Extra) \
    X(PaperB5Extra) X(PaperA2) X(PaperA3Transverse) X(PaperA3ExtraTransverse) \
    X(PaperJapaneseDoublePostcard) X(PaperA6) X(PaperJapaneseEnvelopeKaku2) \
    X(PaperJapaneseEnvelopeKaku3) X(PaperJapaneseEnvelopeChou3) X(PaperJapaneseEnvelopeChou4) \
    X(PaperLetterRotated) X(PaperA3Rotated) X(PaperA4Rotated) X(PaperA5Rotated) X(PaperB4Rotated) \
    X(PaperB5Rotated) X(PaperJapanesePostcardRotated) X(PaperDoubleJapanesePostcardRotated) \
    X(PaperA6Rotated) X(PaperJapaneseEnvelopeKaku2Rotated) X(PaperJapaneseEnvelopeKaku3Rotated) \
    X(PaperJapaneseEnvelopeChou3Rotated) X(PaperJapaneseEnvelopeChou4Rotated) X(PaperB6) \
    X(PaperB6Rotated) X(Paper12X11) X(PaperJapaneseEnvelopeYou4) \
    X(PaperJapaneseEnvelopeYou4Rotated) X(PaperPrc16K) X(PaperPrc32K) X(PaperPrc32KBig) \
    X(PaperPrcEnvelope1) X(PaperPrcEnvelope2) X(PaperPrcEnvelope3) X(PaperPrcEnvelope4) \
    X(PaperPrcEnvelope5) X(PaperPrcEnvelope6) X(PaperPrcEnvelope7) X(PaperPrcEnvelope8) \
    X(PaperPrcEnvelope9) X(PaperPrcEnvelope10) X(PaperPrc16KRotated) X(PaperPrc32KRotated) \
    X(PaperPrc32KbigRotated) X(PaperPrcEnvelope1Rotated) X(PaperPrcEnvelope2Rotated) \
    X(PaperPrcEnvelope3Rotated) X(PaperPrcEnvelope4Rotated) X(PaperPrcEnvelope5Rotated) \
    X(PaperPrcEnvelope6Rotated) X(PaperPrcEnvelope7Rotated) X(PaperPrcEnvelope8Rotated) \
    X(PaperPrcEnvelope9Rotated) X(PaperPrcEnvelope10Rotated) X(IgnoreErrorNoError) \
    X(IgnoreErrorEvalError) X(IgnoreErrorEmptyCellref) X(IgnoreErrorNumberStoredAsText) \
    X(IgnoreErrorInconsistRange) X(IgnoreErrorInconsistFormula) X(IgnoreErrorTwodigTextyear) \
    X(IgnoreErrorUnlockFormula) X(IgnoreErrorDataValidation) X(ProtectDefault) X(ProtectAll) \
    X(ProtectObjects) X(ProtectScenarios) X(ProtectFormatCells) X(ProtectFormatColumns) \
    X(ProtectFormatRows) X(ProtectInsertColumns) X(ProtectInsertRows) X(ProtectInsertHyperlinks) \
    X(ProtectDeleteColumns) X(ProtectDeleteRows) X(ProtectSelLockedCells) X(ProtectSort) \
    X(ProtectAutofilter) X(ProtectPivottables) X(ProtectSelUnlockedCells) X(ValidationTypeNone) \
    X(ValidationTypeWhole) X(ValidationTypeDecimal) X(ValidationTypeList) X(ValidationTypeDate) \
    X(ValidationTypeTime) X(ValidationTypeTextlength) X(ValidationTypeCustom) \
    X(ValidationOpBetween) X(ValidationOpNotbetween) X(ValidationOpEqual) X(ValidationOpNotequal) \
    X(ValidationOpLessthan) X(ValidationOpLessthanorequal) X(ValidationOpGreaterthan) \
    X(ValidationOpGreaterthanorequal) X(ValidationErrstyleStop) X(ValidationErrstyleWarning) \
    X(ValidationErrstyleInformation) X(FilterValue) X(FilterTop10) X(FilterCustom) \
    X(FilterDynamic) X(FilterColor) X(FilterIcon) X(FilterExt) X(FilterNotSet) X(OperatorEqual) \
    X(OperatorGreaterThan) X(OperatorGreaterThanOrEqual) X(OperatorLessThan) \
    X(OperatorLessThanOrEqual) X(OperatorNotEqual)

#define X(name) static_assert(static_cast<int>(::name) == static_cast<int>(quire::name), #name);
QUIRE_ENUM_MEMBERS
#undef X
// clang-format on

}  // namespace
