#pragma once

// What the formula compiler and printer need to know of the book: sheets,
// the ExternSheet (XTI) table, defined names and the list separator. The
// book implements it; the formula code never sees the book itself.

#include <string>

namespace quire::xls {

// Scope values for defined names: a sheet index (0 and up) or the workbook.
constexpr int WorkbookScope = -1;

// Where an XTI entry of the ExternSheet table points.
struct ExternSheetTarget {
    enum Kind {
        Sheets,     // sheets of this book: firstSheet..lastSheet
        External,   // sheets of another workbook: book, firstSheet..lastSheet
        Workbook,   // a whole workbook, no sheet (names of add-ins and other books)
        Deleted     // the sheet no longer exists: references print as #REF!
    };
    Kind kind = Deleted;
    std::wstring book;        // External: the workbook's name as stored
    std::wstring firstSheet;
    std::wstring lastSheet;   // equal to firstSheet for one sheet
};

class FormulaContext {
public:
    virtual ~FormulaContext() = default;

    // The argument separator written by the printer: L';' or L','.
    virtual wchar_t listSeparator() const = 0;

    // --- Sheets --------------------------------------------------------------
    // Index of the sheet with this name, ASCII letters compared without case;
    // -1 when there is none.
    virtual int sheetIndex(const std::wstring& name) const = 0;
    // Name of a sheet of this book; false when the index is out of range.
    virtual bool sheetName(int index, std::wstring& name) const = 0;

    // --- ExternSheet ---------------------------------------------------------
    // The XTI index that refers to sheets first..last of this book, adding the
    // self-reference SupBook and the entry when missing; -1 when none can be had.
    virtual int externSheetIndex(int firstSheet, int lastSheet) = 0;
    // The target of an XTI index; false when the index is not in the table.
    virtual bool externSheet(unsigned xti, ExternSheetTarget& target) const = 0;

    // --- Defined names ---------------------------------------------------------
    // 1-based index of the name with this text (ASCII letters compared without
    // case) in exactly this scope (a sheet index or WorkbookScope); 0 when none.
    virtual unsigned nameIndex(const std::wstring& name, int scope) const = 0;
    // Text and scope of the name with this 1-based index; built-in names by
    // their full text (Print_Area, ...). False when there is no such name.
    virtual bool nameText(unsigned index, std::wstring& name, int& scope) const = 0;
    // Text of name nameIndex (1-based) of the SupBook behind an XTI (ptgNameX):
    // an add-in function or a name of another workbook. False when unknown;
    // for XTIs of this book the printer then uses nameText(nameIndex).
    virtual bool externNameText(unsigned xti, unsigned nameIndex, std::wstring& name) const
    {
        (void)xti; (void)nameIndex; (void)name;
        return false;
    }
    // 1-based index of the name that stands for a call of a function outside
    // the built-in table (a macro, add-in or _xlfn. function), added when the
    // book allows it; 0 rejects the call.
    virtual unsigned userFunctionIndex(const std::wstring& name)
    {
        (void)name;
        return 0;
    }
};

} // namespace quire::xls
