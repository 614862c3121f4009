#include "xls/formula/parsed_formula.h"

#include "api/qrerror.h"
#include "xls/little_endian.h"

namespace quire::xls {

std::vector<uint8_t> ParsedFormula::cellParsedFormula() const
{
    if (rgce.size() > 0xFFFF)
        throw qrerror("error in formula");
    std::vector<uint8_t> out;
    out.reserve(2 + rgce.size() + rgcb.size());
    appendU16(out, static_cast<uint16_t>(rgce.size()));
    out.insert(out.end(), rgce.begin(), rgce.end());
    out.insert(out.end(), rgcb.begin(), rgcb.end());
    return out;
}

ParsedFormula ParsedFormula::fromCellParsedFormula(const uint8_t* data, size_t size)
{
    if (size < 2)
        throw qrerror("error in formula");
    const size_t cce = loadU16(data);
    if (cce > size - 2)
        throw qrerror("error in formula");
    ParsedFormula f;
    f.rgce.assign(data + 2, data + 2 + cce);
    f.rgcb.assign(data + 2 + cce, data + size);
    return f;
}

} // namespace quire::xls
