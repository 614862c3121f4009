#include "cell_dump.h"

#include <cmath>
#include <cstdlib>
#include <sstream>

#include "api/enums.h"
#include "api/wide_text.h"

namespace quire::test {
namespace {

std::string unescape(const std::string& text) {
    std::string out;
    for (size_t i = 0; i < text.size(); ++i) {
        if (text[i] != '\\' || i + 1 == text.size()) {
            out += text[i];
            continue;
        }
        char next = text[++i];
        out += next == 'n' ? '\n' : next == 'r' ? '\r' : next == 't' ? '\t' : next;
    }
    return out;
}

std::string errorText(int code) {
    switch (code) {
        case ErrorTypeNull: return "#NULL!";
        case ErrorTypeDiv0: return "#DIV/0!";
        case ErrorTypeValue: return "#VALUE!";
        case ErrorTypeRef: return "#REF!";
        case ErrorTypeName: return "#NAME?";
        case ErrorTypeNum: return "#NUM!";
        case ErrorTypeNA: return "#N/A";
        default: return "#" + std::to_string(code);
    }
}

std::string numberText(double value) {
    std::ostringstream out;
    out.precision(17);
    out << value;
    return out.str();
}

}  // namespace

std::string utf8(const wchar_t* text) { return text ? toUtf8(text) : std::string(); }

std::string escapeDumpText(const std::string& text) {
    std::string out;
    for (char c : text) {
        switch (c) {
            case '\\': out += "\\\\"; break;
            case '\n': out += "\\n"; break;
            case '\r': out += "\\r"; break;
            case '\t': out += "\\t"; break;
            default: out += c;
        }
    }
    return out;
}

CellDump parseCellDump(const std::string& text) {
    CellDump dump;
    std::istringstream in(text);
    std::string line;
    int sheet = -1;
    while (std::getline(in, line)) {
        if (line.size() > 2 && line[0] == 'S' && line[1] == ' ') {
            auto space = line.find(' ', 2);
            sheet = std::atoi(line.c_str() + 2);
            dump.sheets.push_back(unescape(space == std::string::npos ? "" : line.substr(space + 1)));
        } else if (line.size() > 2 && line[0] == 'C' && line[1] == ' ' && sheet >= 0) {
            // "C <row> <col> <kind> <value>": the value is everything after the fourth space.
            size_t rowEnd = line.find(' ', 2);
            size_t colEnd = rowEnd == std::string::npos ? rowEnd : line.find(' ', rowEnd + 1);
            size_t kindEnd = colEnd == std::string::npos ? colEnd : line.find(' ', colEnd + 1);
            if (kindEnd == std::string::npos) continue;
            int row = std::atoi(line.c_str() + 2);
            int col = std::atoi(line.c_str() + rowEnd + 1);
            DumpedCell cell;
            cell.kind = line[colEnd + 1];
            std::string value = line.substr(kindEnd + 1);
            cell.value = cell.kind == 'S' ? unescape(value) : value;
            dump.cells[{sheet, row, col}] = cell;
        }
    }
    return dump;
}

CellDump dumpBook(IBook& book) {
    CellDump dump;
    int worksheet = 0;
    for (int i = 0; i < book.sheetCount(); ++i) {
        if (book.sheetType(i) != SheetTypeSheet) continue;
        ISheet* sheet = book.getSheet(i);
        if (!sheet) continue;
        dump.sheets.push_back(utf8(sheet->name()));
        int lastRow = sheet->lastRow(), lastCol = sheet->lastCol();
        for (int row = sheet->firstRow(); row < lastRow; ++row) {
            for (int col = sheet->firstCol(); col < lastCol; ++col) {
                DumpedCell cell;
                switch (sheet->cellType(row, col)) {
                    case CellTypeNumber:
                        cell.kind = 'N';
                        cell.value = numberText(sheet->readNum(row, col, nullptr));
                        break;
                    case CellTypeString:
                        cell.kind = 'S';
                        cell.value = utf8(sheet->readStr(row, col, nullptr));
                        break;
                    case CellTypeBoolean:
                        cell.kind = 'B';
                        cell.value = sheet->readBool(row, col, nullptr) ? "1" : "0";
                        break;
                    case CellTypeError:
                        cell.kind = 'E';
                        cell.value = errorText(sheet->readError(row, col));
                        break;
                    case CellTypeBlank:
                        // A formula whose cached result is empty reads elsewhere as an empty string.
                        if (!sheet->isFormula(row, col)) continue;
                        cell.kind = 'S';
                        break;
                    default:
                        continue;
                }
                dump.cells[{worksheet, row, col}] = cell;
            }
        }
        ++worksheet;
    }
    return dump;
}

std::vector<std::string> compareDumps(const CellDump& expected, const CellDump& actual, size_t limit) {
    std::vector<std::string> differences;
    auto note = [&](const std::string& text) {
        if (differences.size() < limit) differences.push_back(text);
    };
    if (expected.sheets != actual.sheets) {
        std::string text = "sheets differ: expected";
        for (const auto& s : expected.sheets) text += " [" + s + "]";
        text += ", got";
        for (const auto& s : actual.sheets) text += " [" + s + "]";
        note(text);
    }
    for (const auto& entry : expected.cells) {
        int sheet, row, col;
        std::tie(sheet, row, col) = entry.first;
        std::string where = "sheet " + std::to_string(sheet) + " row " + std::to_string(row) +
                            " col " + std::to_string(col);
        auto found = actual.cells.find(entry.first);
        if (found == actual.cells.end()) {
            note(where + ": missing, expected " + entry.second.kind + " " + entry.second.value);
            continue;
        }
        const DumpedCell& want = entry.second;
        const DumpedCell& got = found->second;
        bool same = want.kind == got.kind;
        if (same && want.kind == 'N') {
            double a = std::strtod(want.value.c_str(), nullptr), b = std::strtod(got.value.c_str(), nullptr);
            same = a == b || (std::isnan(a) && std::isnan(b));
        } else if (same) {
            same = want.value == got.value;
        }
        if (!same) note(where + ": expected " + want.kind + " " + want.value + ", got " + got.kind + " " + got.value);
    }
    for (const auto& entry : actual.cells) {
        if (expected.cells.count(entry.first)) continue;
        int sheet, row, col;
        std::tie(sheet, row, col) = entry.first;
        note("sheet " + std::to_string(sheet) + " row " + std::to_string(row) + " col " +
             std::to_string(col) + ": unexpected " + entry.second.kind + " " + entry.second.value);
    }
    return differences;
}

}  // namespace quire::test
