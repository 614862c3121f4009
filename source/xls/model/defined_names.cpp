#include "defined_names.h"

namespace quire {
namespace {

constexpr uint8_t kPtgArea3d = 0x3B;
constexpr uint8_t kPtgRef3d = 0x3A;

uint16_t u16At(const uint8_t* p) { return static_cast<uint16_t>(p[0] | (p[1] << 8)); }

}  // namespace

bool DefinedName::area(uint16_t& xti, int& rowFirst, int& rowLast, int& colFirst, int& colLast) const {
    if (rgce.size() == 11 && (rgce[0] & 0x1F) == (kPtgArea3d & 0x1F)) {
        xti = u16At(&rgce[1]);
        rowFirst = u16At(&rgce[3]);
        rowLast = u16At(&rgce[5]);
        colFirst = u16At(&rgce[7]) & 0x3FFF;
        colLast = u16At(&rgce[9]) & 0x3FFF;
        return true;
    }
    if (rgce.size() == 7 && (rgce[0] & 0x1F) == (kPtgRef3d & 0x1F)) {
        xti = u16At(&rgce[1]);
        rowFirst = rowLast = u16At(&rgce[3]);
        colFirst = colLast = u16At(&rgce[5]) & 0x3FFF;
        return true;
    }
    return false;
}

void DefinedName::setArea(uint16_t xti, int rowFirst, int rowLast, int colFirst, int colLast) {
    // Absolute references: the row and column relative flags stay clear.
    rgce = {kPtgArea3d,
            static_cast<uint8_t>(xti), static_cast<uint8_t>(xti >> 8),
            static_cast<uint8_t>(rowFirst), static_cast<uint8_t>(rowFirst >> 8),
            static_cast<uint8_t>(rowLast), static_cast<uint8_t>(rowLast >> 8),
            static_cast<uint8_t>(colFirst), static_cast<uint8_t>((colFirst >> 8) & 0x3F),
            static_cast<uint8_t>(colLast), static_cast<uint8_t>((colLast >> 8) & 0x3F)};
    rgcb.clear();
}

bool SupBookBlock::selfReference() const {
    return !records.empty() && records[0].data.size() >= 4 && records[0].data[2] == 0x01 &&
           records[0].data[3] == 0x04;
}

bool SupBookBlock::addIn() const {
    return !records.empty() && records[0].data.size() >= 4 && records[0].data[2] == 0x01 &&
           records[0].data[3] == 0x3A;
}

const wchar_t* builtInNameText(wchar_t code) {
    static const wchar_t* const names[] = {
        L"Consolidate_Area", L"Auto_Open", L"Auto_Close", L"Extract", L"Database", L"Criteria",
        L"Print_Area", L"Print_Titles", L"Recorder", L"Data_Form", L"Auto_Activate",
        L"Auto_Deactivate", L"Sheet_Title", L"_FilterDatabase"};
    if (code < 0 || static_cast<size_t>(code) >= sizeof names / sizeof names[0]) return nullptr;
    return names[code];
}

}  // namespace quire
