#include "workbook_globals.h"

#include <string>

namespace quire {
namespace {

std::vector<uint8_t> u16(uint16_t value) {
    return {static_cast<uint8_t>(value), static_cast<uint8_t>(value >> 8)};
}

std::vector<uint8_t> writeAccessUser(const std::string& user) {
    // XLUnicodeString of the user name, padded with spaces to the record's fixed 112 bytes.
    std::vector<uint8_t> data = {static_cast<uint8_t>(user.size()), 0, 0};
    data.insert(data.end(), user.begin(), user.end());
    data.resize(112, ' ');
    return data;
}

}  // namespace

void WorkbookGlobals::setDefaults() {
    bof = {0x00, 0x06, 0x05, 0x00, 0x9A, 0x20, 0xCD, 0x07,
           0xC9, 0xC0, 0x00, 0x00, 0x06, 0x03, 0x00, 0x00};
    singles.clear();
    verbatim.clear();
    xfExt.clear();
    hfPictures.clear();
    drawingGroup.clear();
    others.clear();
    using namespace GlobalsRecord;
    singles[InterfaceHdr] = u16(1200);
    singles[Mms] = u16(0);
    singles[WriteAccess] = writeAccessUser("quire");
    singles[CodePage] = u16(1200);
    singles[Dsf] = u16(0);
    singles[BuiltInFnGroupCount] = u16(0x0011);
    singles[WinProtect] = u16(0);
    singles[Protect] = u16(0);
    singles[Password] = u16(0);
    singles[Prot4Rev] = u16(0);
    singles[Prot4RevPass] = u16(0);
    // xWn, yWn, dxWn, dyWn, grbit, itabCur, itabFirst, ctabSel, wTabRatio.
    singles[Window1] = {0xE0, 0x01, 0x5A, 0x00, 0xCF, 0x3F, 0x4E, 0x2A, 0x38, 0x00,
                        0x00, 0x00, 0x00, 0x00, 0x01, 0x00, 0x58, 0x02};
    singles[Backup] = u16(0);
    singles[HideObj] = u16(0);
    singles[CalcPrecision] = u16(1);
    singles[RefreshAll] = u16(0);
    singles[BookBool] = u16(0);
    singles[UsesElfs] = u16(0);
    singles[Country] = {0x01, 0x00, 0x01, 0x00};
    singles[RecalcId] = {0xC1, 0x01, 0x00, 0x00, 0x54, 0x8D, 0x01, 0x00};
}

const std::vector<uint8_t>* WorkbookGlobals::single(uint16_t type) const {
    auto found = singles.find(type);
    return found == singles.end() ? nullptr : &found->second;
}

}  // namespace quire
