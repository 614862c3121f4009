#include "xls/formula/ptg_reader.h"

#include "xls/formula/function_table.h"
#include "xls/formula/ptg.h"
#include "xls/little_endian.h"

namespace quire::xls {

namespace {

// Payload sizes of the fixed-size Ptgs by id (classed ids by base id);
// -1 for variable or unknown.
int payloadSize(uint8_t id)
{
    if (id >= ptg::Add && id <= ptg::MissArg)
        return 0;
    switch (id) {
    case ptg::Exp:
    case ptg::Tbl:
        return 4;
    case ptg::Err:
    case ptg::Bool:
        return 1;
    case ptg::Int:
        return 2;
    case ptg::Num:
        return 8;
    default:
        break;
    }
    if (id < 0x20 || id >= 0x80)
        return -1;
    switch (ptg::baseId(id)) {
    case ptg::Array: return 7;
    case ptg::Func: return 2;
    case ptg::FuncVar: return 3;
    case ptg::Name: return 4;
    case ptg::Ref: return 4;
    case ptg::Area: return 8;
    case ptg::MemArea: return 6;
    case ptg::MemErr: return 6;
    case ptg::MemNoMem: return 6;
    case ptg::MemFunc: return 2;
    case ptg::RefErr: return 4;
    case ptg::AreaErr: return 8;
    case ptg::RefN: return 4;
    case ptg::AreaN: return 8;
    case ptg::NameX: return 6;
    case ptg::Ref3d: return 6;
    case ptg::Area3d: return 10;
    case ptg::RefErr3d: return 6;
    case ptg::AreaErr3d: return 10;
    default: return -1;
    }
}

bool isVolatileFunction(unsigned id)
{
    switch (id) {
    case 63:   // RAND
    case 74:   // NOW
    case FunctionOffset:
    case 125:  // CELL
    case 148:  // INDIRECT
    case FunctionToday:
    case 244:  // INFO
        return true;
    default:
        return false;
    }
}

} // namespace

size_t ptgSize(const uint8_t* data, size_t size)
{
    if (size == 0)
        return 0;
    const uint8_t id = data[0];
    size_t total = 0;
    if (id == ptg::Str) {
        if (size < 3)
            return 0;
        total = 3 + size_t{data[1]} * ((data[2] & 0x01) ? 2 : 1);
    } else if (id == ptg::Attr) {
        if (size < 4)
            return 0;
        const uint8_t kind = data[1];
        if (kind == ptg::AttrChoose)
            total = 4 + (size_t{loadU16(data + 2)} + 1) * 2;
        else if (kind == ptg::AttrVolatile || kind == ptg::AttrIf || kind == ptg::AttrGoto || kind == ptg::AttrSum ||
                 kind == ptg::AttrBaxcel || kind == ptg::AttrBaxcelVolatile || kind == ptg::AttrSpace ||
                 kind == ptg::AttrSpaceVolatile)
            total = 4;
        else
            return 0;
    } else {
        const int payload = payloadSize(id);
        if (payload < 0)
            return 0;
        total = 1 + static_cast<size_t>(payload);
    }
    return total <= size ? total : 0;
}

bool isVolatile(const uint8_t* rgce, size_t cce)
{
    size_t pos = 0;
    while (pos < cce) {
        const size_t n = ptgSize(rgce + pos, cce - pos);
        if (n == 0)
            return true;
        const uint8_t id = rgce[pos];
        if (id == ptg::Attr && (rgce[pos + 1] & ptg::AttrVolatile))
            return true;
        if (id >= 0x20 && id < 0x80) {
            const uint8_t base = ptg::baseId(id);
            if (base == ptg::Func && isVolatileFunction(loadU16(rgce + pos + 1)))
                return true;
            if (base == ptg::FuncVar && isVolatileFunction(loadU16(rgce + pos + 2) & 0x7FFF))
                return true;
        }
        pos += n;
    }
    return false;
}

bool sharedFormulaAnchor(const uint8_t* rgce, size_t cce, uint16_t& row, uint16_t& col)
{
    if (cce != 5 || rgce[0] != ptg::Exp)
        return false;
    row = loadU16(rgce + 1);
    col = loadU16(rgce + 3);
    return true;
}

} // namespace quire::xls
