#pragma once
#include <cstdint>
#include <string>
#include <vector>

#include "cell_store.h"

namespace quire {

// Settings of a binary sheet, each in the shape of the record that carries it.

struct RowInfo {                 // Row
    uint16_t rw = 0;
    uint16_t miyRw = 255;        // height in twentieths of a point
    uint16_t grbit = 0x0100;     // bits 0-2 iOutLevel, 4 fCollapsed, 5 fDyZero, 6 fUnsynced, 7 fGhostDirty, 8 reserved (1)
    uint16_t ixfeFlags = 0x000F; // bits 0-11 ixfe_val, 12 fExAsc, 13 fExDes, 14 fPhonetic

    static constexpr uint16_t kCollapsed = 0x0010;
    static constexpr uint16_t kHidden = 0x0020;
    static constexpr uint16_t kCustomHeight = 0x0040;
    static constexpr uint16_t kHasFormat = 0x0080;
    int outlineLevel() const { return grbit & 7; }
    int xf() const { return ixfeFlags & 0x0FFF; }
};

struct ColInfo {                 // ColInfo
    uint16_t colFirst = 0;
    uint16_t colLast = 0;
    uint16_t coldx = 2158;       // width in 1/256 of a character (8.43, the default)
    uint16_t ixfe = 15;
    uint16_t grbit = 0;          // bit 0 fHidden, 1 fUserSet, 2 fBestFit, 8-10 iOutLevel, 12 fCollapsed

    static constexpr uint16_t kHidden = 0x0001;
    static constexpr uint16_t kUserSet = 0x0002;
    static constexpr uint16_t kCollapsed = 0x1000;
    int outlineLevel() const { return (grbit >> 8) & 7; }
};

struct Ref8 {                    // a cell range of MergeCells
    uint16_t rwFirst = 0;
    uint16_t rwLast = 0;
    uint16_t colFirst = 0;
    uint16_t colLast = 0;
};

struct PageBreak {               // one entry of HorizontalPageBreaks / VerticalPageBreaks
    uint16_t index = 0;
    uint16_t start = 0;
    uint16_t end = 0;
};

struct Window2 {
    uint16_t grbit = 0x06B6;     // grid, headers, zeros, default colour, outline symbols, selected, paged
    uint16_t rwTop = 0;
    uint16_t colLeft = 0;
    uint16_t icvHdr = 64;
    uint16_t wScaleSLV = 0;
    uint16_t wScaleNormal = 0;

    static constexpr uint16_t kDspGrid = 0x0002;
    static constexpr uint16_t kFrozen = 0x0008;
    static constexpr uint16_t kRightToLeft = 0x0040;
    static constexpr uint16_t kFrozenNoSplit = 0x0100;
    static constexpr uint16_t kSelected = 0x0200;
    static constexpr uint16_t kPaged = 0x0400;
};

struct Pane {
    bool present = false;
    uint16_t x = 0;              // frozen columns
    uint16_t y = 0;              // frozen rows
    uint16_t rwTop = 0;
    uint16_t colLeft = 0;
    uint8_t pnnAcct = 3;
};

struct Setup {
    uint16_t iPaperSize = 0;
    uint16_t iScale = 100;
    int16_t iPageStart = 1;
    uint16_t iFitWidth = 1;
    uint16_t iFitHeight = 1;
    uint16_t grbit = 0x0006;     // bit 1 fPortrait; bit 2 fNoPls: no printer settings yet
    uint16_t iRes = 600;
    uint16_t iVRes = 600;
    double numHdr = 0.5;
    double numFtr = 0.5;
    uint16_t iCopies = 1;

    static constexpr uint16_t kPortrait = 0x0002;
    static constexpr uint16_t kNoPrinterSettings = 0x0004;
};

struct WsBool {
    uint16_t grbit = 0x04C1;     // auto breaks, summary rows below, summary columns right, outline symbols

    static constexpr uint16_t kRowSumsBelow = 0x0040;
    static constexpr uint16_t kColSumsRight = 0x0080;
    static constexpr uint16_t kFitToPage = 0x0100;
};

struct Hyperlink {               // HLink: a range and its target
    Ref8 ref;
    std::wstring target;
};

struct IgnoredErrorRange {       // one range of the ignored-errors shared feature
    Ref8 ref;
    uint32_t flags = 0;
};

struct OutlineGroup {
    int first = 0;
    int last = 0;
};

// Print and page settings of a sheet.
struct PageSettings {
    Setup setup;
    std::wstring header;
    std::wstring footer;
    double leftMargin = 0.75;
    double rightMargin = 0.75;
    double topMargin = 1.0;
    double bottomMargin = 1.0;
    bool hCenter = false;
    bool vCenter = false;
    bool printGrid = false;
    bool printRowCol = false;
};

// View settings of a sheet.
struct ViewSettings {
    Window2 window2;
    uint16_t sclNumerator = 100;
    uint16_t sclDenominator = 100;
    bool sclPresent = false;
    Pane pane;
    std::vector<uint8_t> selection;  // Selection record payload, kept as loaded
};

// Protection of a sheet.
struct ProtectionSettings {
    bool protect = false;
    uint16_t password = 0;            // verifier of the legacy password hash
    int enhancedProtection = -1;      // EnhancedProtection mask
};

}  // namespace quire
