#pragma once
#include <map>
#include <string>
#include <tuple>
#include <vector>

#include "api/IBookT.h"

namespace quire::test {

// A cell as another reader reports it: kind N, S, B or E and the value as text.
struct DumpedCell {
    char kind = 'N';
    std::string value;
};

// Sheets (names in order) and cells keyed by sheet, row, column.
struct CellDump {
    std::vector<std::string> sheets;
    std::map<std::tuple<int, int, int>, DumpedCell> cells;
};

// Parses the dump format: "S <sheet> <name>" and "C <row> <col> <kind> <value>" lines.
CellDump parseCellDump(const std::string& text);
// The same dump made from a book through its interfaces (worksheets only, values as stored).
CellDump dumpBook(IBook& book);
// Differences between what another reader saw and what we read, at most `limit` lines.
std::vector<std::string> compareDumps(const CellDump& expected, const CellDump& actual, size_t limit = 10);

// UTF-8 text of a wide string; the dump format's escapes.
std::string utf8(const wchar_t* text);
std::string escapeDumpText(const std::string& text);

}  // namespace quire::test
