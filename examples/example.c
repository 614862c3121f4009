/* Builds a small workbook through the C interface and prints what it holds. */
#include <stdio.h>
#include <wchar.h>

#include "quire.h"

static int check(BookHandle book, int ok, const char* what) {
    if (!ok) fprintf(stderr, "%s failed: %s\n", what, qrBookErrorMessageW(book));
    return ok;
}

static void printCell(SheetHandle sheet, int row, int col) {
    FormatHandle format = 0;
    switch (qrSheetCellTypeW(sheet, row, col)) {
        case CellTypeNumber:
            if (qrSheetIsDateW(sheet, row, col)) {
                printf("  row %d col %d: date serial %g\n", row, col, qrSheetReadNumW(sheet, row, col, &format));
            } else {
                printf("  row %d col %d: number %g\n", row, col, qrSheetReadNumW(sheet, row, col, &format));
            }
            break;
        case CellTypeString:
            printf("  row %d col %d: string \"%ls\"\n", row, col, qrSheetReadStrW(sheet, row, col, &format));
            break;
        case CellTypeBoolean:
            printf("  row %d col %d: boolean %s\n", row, col, qrSheetReadBoolW(sheet, row, col, &format) ? "TRUE" : "FALSE");
            break;
        case CellTypeError:
            printf("  row %d col %d: error code 0x%02X\n", row, col, qrSheetReadErrorW(sheet, row, col));
            break;
        case CellTypeBlank:
            printf("  row %d col %d: blank with a format\n", row, col);
            break;
        default:
            break;
    }
}

/* The same content for both file kinds: two sheets, formats, a font and every kind of value. */
static int fillBook(BookHandle book) {
    SheetHandle sales = qrBookAddSheetW(book, L"Sales", 0);
    SheetHandle notes = qrBookAddSheetW(book, L"Notes", 0);
    if (!check(book, sales && notes, "adding sheets")) return 0;

    FormatHandle dateFormat = qrBookAddFormatW(book, 0);
    qrFormatSetNumFormatW(dateFormat, NumformatDate);
    FormatHandle money = qrBookAddFormatW(book, 0);
    qrFormatSetNumFormatW(money, qrBookAddCustomNumFormatW(book, L"#,##0.00 \"EUR\""));
    FontHandle boldFont = qrBookAddFontW(book, 0);
    qrFontSetBoldW(boldFont, 1);
    FormatHandle heading = qrBookAddFormatW(book, 0);
    qrFormatSetFontW(heading, boldFont);
    qrFormatSetFillPatternW(heading, FillPatternSolid);
    qrFormatSetPatternForegroundColorW(heading, ColorLightyellow);
    qrFormatSetBorderW(heading, BorderStyleThin);

    qrSheetWriteStrW(sales, 0, 0, L"Item", heading);
    qrSheetWriteStrW(sales, 0, 1, L"Amount", heading);
    qrSheetWriteStrW(sales, 0, 2, L"Date", heading);
    qrSheetWriteStrW(sales, 1, 0, L"Apples", 0);
    qrSheetWriteNumW(sales, 1, 1, 1234.5, money);
    qrSheetWriteNumW(sales, 1, 2, qrBookDatePackW(book, 2026, 12, 6, 0, 0, 0, 0), dateFormat);
    qrSheetWriteBoolW(sales, 2, 0, 1, 0);
    qrSheetWriteErrorW(sales, 2, 1, ErrorTypeDiv0, 0);
    qrSheetWriteBlankW(sales, 2, 2, heading);
    qrSheetSetColW(sales, 0, 2, 14.0, 0, 0);
    qrSheetSetMergeW(notes, 0, 0, 0, 3);
    qrSheetWriteStrW(notes, 0, 0, L"Written by the quire example", 0);
    return 1;
}

static void printBook(BookHandle book) {
    printf("quire %X: %d sheets, %d formats, %d fonts\n", qrBookVersionW(book),
           qrBookSheetCountW(book), qrBookFormatSizeW(book), qrBookFontSizeW(book));
    for (int i = 0; i < qrBookSheetCountW(book); ++i) {
        SheetHandle sheet = qrBookGetSheetW(book, i);
        printf("sheet %d \"%ls\": rows %d-%d, columns %d-%d\n", i, qrSheetNameW(sheet),
               qrSheetFirstRowW(sheet), qrSheetLastRowW(sheet) - 1, qrSheetFirstColW(sheet),
               qrSheetLastColW(sheet) - 1);
        for (int row = qrSheetFirstRowW(sheet); row < qrSheetLastRowW(sheet); ++row)
            for (int col = qrSheetFirstColW(sheet); col < qrSheetLastColW(sheet); ++col)
                printCell(sheet, row, col);
    }
    int year = 0, month = 0, day = 0;
    qrBookDateUnpackW(book, qrSheetReadNumW(qrBookGetSheetW(book, 0), 1, 2, 0), &year, &month, &day, 0, 0, 0, 0);
    printf("the date cell unpacks to %04d-%02d-%02d\n", year, month, day);
}

/* Loads a saved file with a fresh book of the same kind and prints what it holds. */
static int loadBack(BookHandle loaded, const wchar_t* fileName) {
    if (!loaded) return 0;
    int ok = check(loaded, qrBookLoadW(loaded, fileName), "loading back");
    if (ok) {
        SheetHandle first = qrBookGetSheetW(loaded, 0);
        /* Each string result lives until the sheet's next one: print one at a time. */
        printf("%ls loaded back: %d sheets, first \"%ls\"", fileName, qrBookSheetCountW(loaded),
               qrSheetNameW(first));
        printf(", A2 = \"%ls\", B2 = %g\n", qrSheetReadStrW(first, 1, 0, 0),
               qrSheetReadNumW(first, 1, 1, 0));
        printBook(loaded);
    }
    qrBookReleaseW(loaded);
    return ok;
}

int main(void) {
    /* The binary half: example.xls. */
    BookHandle book = qrCreateBookCW();
    if (!book) return 1;
    if (!fillBook(book)) {
        qrBookReleaseW(book);
        return 1;
    }
    printBook(book);
    int ok = check(book, qrSheetWriteNumW(qrBookGetSheetW(book, 0), 70000, 0, 1, 0) == 0, "refusing row 70000");
    printf("writing row 70000 says: %s\n", qrBookErrorMessageW(book));
    ok = check(book, qrBookSaveW(book, L"example.xls"), "saving example.xls") && ok;
    qrBookReleaseW(book);
    if (!ok) return 1;
    ok = loadBack(qrCreateBookCW(), L"example.xls");

    /* The Open XML half: the same content in example.xlsx. */
    BookHandle xml = qrCreateXMLBookCW();
    if (!xml) return 1;
    if (!fillBook(xml)) {
        qrBookReleaseW(xml);
        return 1;
    }
    printBook(xml);
    ok = check(xml, qrBookSaveW(xml, L"example.xlsx"), "saving example.xlsx") && ok;
    qrBookReleaseW(xml);
    ok = ok && loadBack(qrCreateXMLBookCW(), L"example.xlsx");
    return ok ? 0 : 1;
}
