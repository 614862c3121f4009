#pragma once
#include <cstdint>
#include <string>
#include <vector>

#include "cell_store.h"

namespace quire {

// A defined name (Lbl record): a named range, a print area or title, or any other name.
struct DefinedName {
    uint16_t flags = 0;            // fHidden, fFunc, fOB, fProc, fCalcExp, fBuiltin (bit 5), ...
    uint8_t chKey = 0;
    std::wstring text;             // a built-in name: its one-character code
    uint16_t itab = 0;             // 0: the workbook; n: local to sheet n - 1
    std::vector<uint8_t> rgce;
    std::vector<uint8_t> rgcb;

    static constexpr uint16_t kHidden = 0x0001;
    static constexpr uint16_t kBuiltin = 0x0020;
    bool builtIn() const { return (flags & kBuiltin) != 0; }
    bool isBuiltIn(wchar_t code) const { return builtIn() && text.size() == 1 && text[0] == code; }
    // The single 3-D area or cell its formula is, if it is one.
    bool area(uint16_t& xti, int& rowFirst, int& rowLast, int& colFirst, int& colLast) const;
    void setArea(uint16_t xti, int rowFirst, int rowLast, int colFirst, int colLast);
};

// One entry of the ExternSheet table.
struct XtiEntry {
    uint16_t iSupBook = 0;
    uint16_t itabFirst = 0;
    uint16_t itabLast = 0;
};

// A SupBook record with the ExternName, XCT and CRN records that belong to it.
struct SupBookBlock {
    std::vector<KeptRecord> records;
    bool selfReference() const;
    bool addIn() const;
};

// Text of a built-in name code (Print_Area, ...); null for an unknown code.
const wchar_t* builtInNameText(wchar_t code);

constexpr wchar_t kPrintArea = 0x06;
constexpr wchar_t kPrintTitles = 0x07;

}  // namespace quire
