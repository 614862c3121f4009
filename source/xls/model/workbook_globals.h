#pragma once
#include <cstdint>
#include <map>
#include <vector>

#include "cell_store.h"

namespace quire {

// Record types of the workbook globals that the book reads or writes itself.
namespace GlobalsRecord {
constexpr uint16_t InterfaceHdr = 0x00E1, Mms = 0x00C1, InterfaceEnd = 0x00E2, WriteAccess = 0x005C,
                   CodePage = 0x0042, Dsf = 0x0161, RRTabId = 0x013D, BuiltInFnGroupCount = 0x009C,
                   WinProtect = 0x0019, Protect = 0x0012, Password = 0x0013, Prot4Rev = 0x01AF,
                   Prot4RevPass = 0x01BC, Window1 = 0x003D, Backup = 0x0040, HideObj = 0x008D,
                   Date1904 = 0x0022, CalcPrecision = 0x000E, RefreshAll = 0x01B7, BookBool = 0x00DA,
                   UsesElfs = 0x0160, Country = 0x008C, RecalcId = 0x01C1, BookExt = 0x0863,
                   ObProj = 0x00D3, ObNoMacros = 0x01BD, CodeName = 0x01BA, XfCrc = 0x087C,
                   TableStyles = 0x088E, ClrtClient = 0x105C, MtrSettings = 0x089A,
                   ForceFullCalculation = 0x08A3, Theme = 0x0896, CompressPictures = 0x089B,
                   Compat12 = 0x088C, FilePass = 0x002F, Font = 0x0031, Format = 0x041E, Xf = 0x00E0,
                   Style = 0x0293, StyleExt = 0x0892, XfExt = 0x087D, Palette = 0x0092,
                   BoundSheet8 = 0x0085, Lbl = 0x0018, SupBook = 0x01AE, ExternSheet = 0x0017,
                   ExternName = 0x0023, Sst = 0x00FC, ExtSst = 0x00FF, MsoDrawingGroup = 0x00EB,
                   HfPicture = 0x0866, Template = 0x0060, Excel9File = 0x01C0, Continue = 0x003C,
                   Bof = 0x0809, Eof = 0x000A;
}  // namespace GlobalsRecord

// The workbook globals beyond fonts, formats, styles, sheets and strings: each single-value
// record by type, the records kept verbatim, and every other record in file order.
struct WorkbookGlobals {
    std::vector<uint8_t> bof;
    std::map<uint16_t, std::vector<uint8_t>> singles;
    std::map<uint16_t, std::vector<KeptRecord>> verbatim;  // with their CONTINUE records
    std::vector<KeptRecord> xfExt;
    std::vector<KeptRecord> hfPictures;
    std::vector<KeptRecord> drawingGroup;  // MsoDrawingGroup with its CONTINUE records
    std::vector<KeptRecord> others;

    // The values of a new book.
    void setDefaults();
    const std::vector<uint8_t>* single(uint16_t type) const;
};

}  // namespace quire
