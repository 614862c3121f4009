// Corpus packages rewritten cell by cell through our interfaces keep, as openpyxl sees them, the
// values and basic styles of the original.
#include <gtest/gtest.h>

#include <memory>
#include <string>
#include <sys/stat.h>
#include <vector>

#include "api/enums.h"
#include "corpus.h"
#include "external_tools.h"
#include "xlsx/xml_book_proxy.h"

namespace quire::test {
namespace {

struct BookDeleter {
    void operator()(IBook* book) const { book->release(); }
};
using BookPtr = std::unique_ptr<IBook, BookDeleter>;

// openpyxl decodes the escape of an underscore (_x005F_) in shared strings but not in inline
// strings: a package of escaped inline strings reads differently once its text is shared.
const char* const kInlineEscapes = "xw/optimize07.xlsx";

// Every 20th sound package, small enough for openpyxl to read in a moment.
std::vector<CorpusFile> sample() {
    std::vector<CorpusFile> files;
    int index = 0;
    for (const auto& file : corpusFiles({".xlsx", ".xlsm"})) {
        if (!file.ok || file.name == kInlineEscapes) continue;
        struct stat info {};
        if (index++ % 20 != 0 || stat(file.path.c_str(), &info) != 0 || info.st_size > 2000000) continue;
        files.push_back(file);
    }
    return files;
}

// Writes every value cell back with its own value and format; formulas stay as they are.
void rewriteCells(IBook& book) {
    for (int i = 0; i < book.sheetCount(); ++i) {
        if (book.sheetType(i) != SheetTypeSheet) continue;
        ISheet* sheet = book.getSheet(i);
        if (!sheet) continue;
        for (int row = sheet->firstRow(); row < sheet->lastRow(); ++row) {
            for (int col = sheet->firstCol(); col < sheet->lastCol(); ++col) {
                if (sheet->isFormula(row, col)) continue;
                IFormat* format = nullptr;
                switch (sheet->cellType(row, col)) {
                    case CellTypeNumber: {
                        double value = sheet->readNum(row, col, &format);
                        if (std::string(book.errorMessage()) == "ok") sheet->writeNum(row, col, value, format);
                        break;
                    }
                    case CellTypeString: {
                        const wchar_t* text = sheet->readStr(row, col, &format);
                        if (!text) break;
                        std::wstring copy = text;
                        sheet->writeStr(row, col, copy.c_str(), format, 2);
                        break;
                    }
                    case CellTypeBoolean: {
                        bool value = sheet->readBool(row, col, &format);
                        sheet->writeBool(row, col, value, format, ErrorTypeNoError);
                        break;
                    }
                    case CellTypeError: {
                        int code = sheet->readError(row, col);
                        format = sheet->cellFormat(row, col);
                        sheet->writeError(row, col, code, format);
                        break;
                    }
                    case CellTypeBlank:
                        sheet->readBlank(row, col, &format);
                        sheet->writeBlank(row, col, format);
                        break;
                    default:
                        break;
                }
            }
        }
    }
}

// Prints one line per cell whose value or basic style differs between two packages.
const char* kCompareScript = R"PY(
import sys, warnings
warnings.filterwarnings("ignore")
import openpyxl

def style(cell):
    f, a, b, fill = cell.font, cell.alignment, cell.border, cell.fill
    return (cell.number_format, bool(f.b), bool(f.i), f.sz and float(f.sz), f.name,
            fill.fill_type, fill.fill_type and str(fill.fgColor.rgb),
            b.left.style, b.right.style, b.top.style, b.bottom.style,
            a.horizontal, a.vertical, bool(a.wrap_text))

def compare(original, saved, name):
    try:
        want = openpyxl.load_workbook(original, data_only=True)
    except Exception:
        return  # a package openpyxl cannot read has nothing to compare
    got = openpyxl.load_workbook(saved, data_only=True)
    if want.sheetnames != got.sheetnames:
        print(name, "sheets", want.sheetnames, got.sheetnames)
        return
    shown = 0
    for ws in want.worksheets:
        other = got[ws.title]
        for row in ws.iter_rows():
            for cell in row:
                mine = other[cell.coordinate]
                what = None
                if cell.value != mine.value:
                    what = "value %r %r" % (cell.value, mine.value)
                elif cell.value is not None and style(cell) != style(mine):
                    what = "style %r %r" % (style(cell), style(mine))
                if what and shown < 5:
                    print(name, ws.title, cell.coordinate, what)
                    shown += 1

args = sys.argv[1:]
for i in range(0, len(args), 3):
    compare(args[i], args[i + 1], args[i + 2])
print("compared")
)PY";

TEST(XlsxRoundTrip, RewrittenCellsKeepTheirValuesAndStylesInOpenpyxl) {
#ifdef QUIRE_SANITIZED_BUILD
    GTEST_SKIP() << "checked in the plain build; the sanitizers watch our own code";
#endif
    auto files = sample();
    if (files.empty()) GTEST_SKIP() << "the corpus is not present";
    if (!havePythonModule("openpyxl")) GTEST_SKIP() << "python3-openpyxl is not installed";
    std::string dir = makeTempDir("quire-xlsx-round-");
    std::string arguments;
    for (size_t i = 0; i < files.size(); ++i) {
        const CorpusFile& file = files[i];
        BookPtr book(createXmlBook());
        ASSERT_TRUE(book->load(std::wstring(file.path.begin(), file.path.end()).c_str(), nullptr))
            << file.name << ": " << book->errorMessage();
        rewriteCells(*book);
        std::string saved = dir + "/f" + std::to_string(i) + ".xlsx";
        ASSERT_TRUE(book->save(std::wstring(saved.begin(), saved.end()).c_str(), false))
            << file.name << ": " << book->errorMessage();
        arguments += " " + shellQuote(file.path) + " " + shellQuote(saved) + " " + shellQuote(file.name);
    }
    std::string script = dir + "/compare.py";
    writeFile(script, kCompareScript);
    std::string output;
    ASSERT_EQ(runCommand(systemPython() + " " + shellQuote(script) + arguments, &output), 0) << output;
    EXPECT_EQ(output, "compared\n") << files.size() << " packages:\n" << output;
}

}  // namespace
}  // namespace quire::test
