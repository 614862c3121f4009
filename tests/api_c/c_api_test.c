/* The C interface from a C program: builds a binary book through the shared library and reads
 * back every kind of cell, the book's messages and the address helpers. Prints each failed check
 * and exits non-zero when any failed. */
#include <stdio.h>
#include <string.h>
#include <wchar.h>

#include "quire.h"

static int failures = 0;

#define CHECK(condition)                                                          \
    do {                                                                          \
        if (!(condition)) {                                                       \
            fprintf(stderr, "%s:%d: check failed: %s\n", __FILE__, __LINE__,      \
                    #condition);                                                  \
            ++failures;                                                           \
        }                                                                         \
    } while (0)

static int messageIs(BookHandle book, const char* expected) {
    const char* message = qrBookErrorMessageW(book);
    if (message != NULL && strcmp(message, expected) == 0) return 1;
    fprintf(stderr, "  message is \"%s\", expected \"%s\"\n", message ? message : "(null)",
            expected);
    return 0;
}

static int textIs(const wchar_t* text, const wchar_t* expected) {
    if (text != NULL && wcscmp(text, expected) == 0) return 1;
    fprintf(stderr, "  text is \"%ls\", expected \"%ls\"\n", text ? text : L"(null)", expected);
    return 0;
}

static void checkCells(BookHandle book, SheetHandle sheet) {
    FormatHandle custom = qrBookAddFormatW(book, NULL);
    FormatHandle format = NULL;
    CHECK(custom != NULL);

    /* number */
    CHECK(qrSheetWriteNumW(sheet, 0, 0, 42.5, NULL) == 1);
    CHECK(messageIs(book, "ok"));
    CHECK(qrSheetCellTypeW(sheet, 0, 0) == CellTypeNumber);
    CHECK(qrSheetReadNumW(sheet, 0, 0, &format) == 42.5);
    CHECK(format != NULL);
    CHECK(messageIs(book, "ok"));

    /* string, with its own format coming back through the out-parameter */
    CHECK(qrSheetWriteStrW(sheet, 1, 0, L"hello", custom) == 1);
    CHECK(qrSheetCellTypeW(sheet, 1, 0) == CellTypeString);
    format = NULL;
    CHECK(textIs(qrSheetReadStrW(sheet, 1, 0, &format), L"hello"));
    CHECK(format == custom);
    CHECK(textIs(qrSheetReadStrW(sheet, 1, 0, NULL), L"hello"));

    /* boolean: any non-zero value is true */
    CHECK(qrSheetWriteBoolW(sheet, 2, 0, 5, NULL) == 1);
    CHECK(qrSheetWriteBoolW(sheet, 2, 1, 0, NULL) == 1);
    CHECK(qrSheetCellTypeW(sheet, 2, 0) == CellTypeBoolean);
    format = NULL;
    CHECK(qrSheetReadBoolW(sheet, 2, 0, &format) == 1);
    CHECK(format != NULL);
    CHECK(qrSheetReadBoolW(sheet, 2, 1, NULL) == 0);
    CHECK(messageIs(book, "ok"));

    /* error */
    qrSheetWriteErrorW(sheet, 3, 0, ErrorTypeDiv0, NULL);
    CHECK(messageIs(book, "ok"));
    CHECK(qrSheetCellTypeW(sheet, 3, 0) == CellTypeError);
    CHECK(qrSheetReadErrorW(sheet, 3, 0) == ErrorTypeDiv0);
    qrSheetReadBoolW(sheet, 3, 0, NULL);
    CHECK(messageIs(book, "this cell doesn't contain a bool"));

    /* blank: a cell with nothing but its format */
    CHECK(qrSheetWriteBlankW(sheet, 4, 0, custom) == 1);
    CHECK(qrSheetCellTypeW(sheet, 4, 0) == CellTypeBlank);
    format = NULL;
    CHECK(qrSheetReadBlankW(sheet, 4, 0, &format) == 1);
    CHECK(format == custom);
    CHECK(messageIs(book, "ok"));

    /* a cell never written */
    CHECK(qrSheetCellTypeW(sheet, 10, 10) == CellTypeEmpty);
    CHECK(messageIs(book, "ok"));

    /* a failure leaves its text, the next success "ok" again */
    CHECK(qrSheetWriteNumW(sheet, 70000, 0, 1.0, NULL) == 0);
    CHECK(messageIs(book, "row must be in range 0-65535"));
    CHECK(qrSheetWriteNumW(sheet, 0, 300, 1.0, NULL) == 0);
    CHECK(messageIs(book, "col must be in range 0-255"));
    CHECK(qrSheetWriteNumW(sheet, 5, 0, 1.0, NULL) == 1);
    CHECK(messageIs(book, "ok"));
}

static void checkAddresses(SheetHandle sheet) {
    int row = -7, col = -7, rowRelative = 12345, colRelative = 12345;

    CHECK(textIs(qrSheetRowColToAddrW(sheet, 0, 0, 1, 1), L"A1"));
    CHECK(textIs(qrSheetRowColToAddrW(sheet, 0, 0, -1, -1), L"$A$1"));
    CHECK(textIs(qrSheetRowColToAddrW(sheet, 9, 27, 0, 0), L"$AB$10"));

    qrSheetAddrToRowColW(sheet, L"C5", &row, &col, NULL, NULL);
    CHECK(row == 4);
    CHECK(col == 2);

    qrSheetAddrToRowColW(sheet, L"$C$5", &row, &col, &rowRelative, &colRelative);
    CHECK(row == 4 && col == 2);
    CHECK(rowRelative == 0);
    CHECK(colRelative == 0);

    rowRelative = colRelative = 12345;
    qrSheetAddrToRowColW(sheet, L"C5", &row, &col, &rowRelative, &colRelative);
    CHECK(rowRelative == 1);
    CHECK(colRelative == 1);
}

int main(void) {
    BookHandle book = qrCreateBookCW();
    SheetHandle data;
    SheetHandle second;

    if (book == NULL) {
        fprintf(stderr, "qrCreateBookCW returned null\n");
        return 1;
    }
    CHECK(qrBookVersionW(book) == 0x03080800);
    CHECK(qrBookSheetCountW(book) == 0);

    data = qrBookAddSheetW(book, L"Data", NULL);
    CHECK(data != NULL);
    CHECK(messageIs(book, "ok"));
    second = qrBookAddSheetW(book, L"Second", NULL);
    CHECK(second != NULL);
    CHECK(qrBookSheetCountW(book) == 2);
    CHECK(qrBookGetSheetW(book, 1) == second);
    CHECK(qrBookSheetTypeW(book, 0) == SheetTypeSheet);
    CHECK(textIs(qrSheetNameW(second), L"Second"));
    CHECK(qrBookAddSheetW(book, L"data", NULL) == NULL);
    CHECK(messageIs(book, "book already contains such sheet name"));

    if (data != NULL) {
        checkCells(book, data);
        checkAddresses(data);
    }

    qrBookReleaseW(book);

    if (failures != 0) {
        fprintf(stderr, "%d check(s) failed\n", failures);
        return 1;
    }
    printf("all checks passed\n");
    return 0;
}
