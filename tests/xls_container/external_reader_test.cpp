// Files we write, checked by independent readers: xlrd (through the system
// python3) and LibreOffice. Skipped when those programs are not installed.

#include <gtest/gtest.h>

#include "test_support.h"
#include "xls/compound_file.h"

using namespace quire::xls;
using namespace quire::xls::test;

namespace {

std::vector<uint8_t> patterned(size_t n, uint8_t salt)
{
    std::vector<uint8_t> v(n);
    for (size_t i = 0; i < n; ++i)
        v[i] = static_cast<uint8_t>(i * 31 + salt + (i >> 10));
    return v;
}

std::string utf8(const std::u16string& s)
{
    std::string out;
    for (char16_t c : s) {
        if (c < 0x80) {
            out.push_back(static_cast<char>(c));
        } else if (c < 0x800) {
            out.push_back(static_cast<char>(0xC0 | (c >> 6)));
            out.push_back(static_cast<char>(0x80 | (c & 0x3F)));
        } else {
            out.push_back(static_cast<char>(0xE0 | (c >> 12)));
            out.push_back(static_cast<char>(0x80 | ((c >> 6) & 0x3F)));
            out.push_back(static_cast<char>(0x80 | (c & 0x3F)));
        }
    }
    return out;
}

const char* const CompdocScript = R"(
import sys, hashlib, xlrd.compdoc
data = open(sys.argv[1], 'rb').read()
log = open('/dev/null', 'w')
cd = xlrd.compdoc.CompDoc(data, logfile=log)
for name in sys.argv[2:]:
    s = cd.get_named_stream(name.replace('\\x05', '\x05'))
    print(name, len(s), hashlib.md5(s).hexdigest())
)";

std::string md5Of(const std::vector<uint8_t>& data, const std::string& tag)
{
    const std::string path = tempPath("md5_" + tag + ".bin");
    writeFileBytes(path, data);
    std::string out;
    runCommand("md5sum '" + path + "' | cut -d' ' -f1", out);
    return out.substr(0, 32);
}

std::vector<std::u16string> sampleCells(size_t count)
{
    std::vector<std::u16string> cells;
    for (size_t i = 0; i < count; ++i) {
        std::u16string s = u"cell ";
        for (size_t k = i; k > 0; k /= 10)
            s.insert(5, 1, static_cast<char16_t>(u'0' + k % 10));
        if (i % 3 == 1)
            s += u" \u00e9t\u00e9";
        if (i % 3 == 2)
            s += u" \u4e2d\u6587";
        cells.push_back(s);
    }
    cells.push_back(std::u16string(9000, u'L'));  // crosses CONTINUE records
    return cells;
}

} // namespace

TEST(ExternalReaders, XlrdReadsOurCompoundFileStreams)
{
    if (!xlrdAvailable())
        GTEST_SKIP() << "/usr/bin/python3 with xlrd is not installed";
    const std::vector<uint8_t> workbook = patterned(300000, 1);
    const std::vector<uint8_t> summary = patterned(200, 2);
    const std::vector<uint8_t> big = patterned(9000, 3);
    Xls writer;
    writer.setWorkbookStream(workbook);
    writer.addStream(u"\x05SummaryInformation", summary);
    writer.addStream(u"Big", big);
    const std::string path = tempPath("compdoc_check.xls");
    writer.close(path);

    std::string out;
    ASSERT_EQ(runPython(CompdocScript, {path, "Workbook", "\\x05SummaryInformation", "Big"}, out), 0) << out;
    EXPECT_EQ(out, "Workbook 300000 " + md5Of(workbook, "w") + "\n\\x05SummaryInformation 200 " + md5Of(summary, "s") +
                       "\nBig 9000 " + md5Of(big, "b") + "\n");
}

TEST(ExternalReaders, XlrdReadsOurDifatChain)
{
    if (!xlrdAvailable())
        GTEST_SKIP() << "/usr/bin/python3 with xlrd is not installed";
    // 16 MB: 261 FAT sectors, two DIFAT sectors.
    const std::vector<uint8_t> workbook = patterned(size_t{16} << 20, 4);
    Xls writer;
    writer.setWorkbookStream(workbook);
    const std::string path = tempPath("compdoc_difat.xls");
    writer.close(path);
    std::string out;
    ASSERT_EQ(runPython(CompdocScript, {path, "Workbook"}, out), 0) << out;
    EXPECT_EQ(out, "Workbook 16777216 " + md5Of(workbook, "difat") + "\n");
}

TEST(ExternalReaders, XlrdOpensAMinimalWorkbookWithSharedStrings)
{
    if (!xlrdAvailable())
        GTEST_SKIP() << "/usr/bin/python3 with xlrd is not installed";
    const std::vector<std::u16string> cells = sampleCells(12000);
    Xls writer;
    writer.setWorkbookStream(minimalWorkbookStream({u"Data", u"\u00dcbersicht", u"Third"}, cells));
    const std::string path = tempPath("minimal_xlrd.xls");
    writer.close(path);

    const std::string script = R"(
import sys, xlrd
bk = xlrd.open_workbook(sys.argv[1], logfile=open('/dev/null', 'w'))
out = open(sys.argv[2], 'w', encoding='utf-8')
out.write('|'.join(bk.sheet_names()) + '\n')
sh = bk.sheet_by_index(0)
for r in range(sh.nrows):
    out.write(sh.cell_value(r, 0) + '\n')
)";
    const std::string dump = tempPath("minimal_xlrd.txt");
    std::string out;
    ASSERT_EQ(runPython(script, {path, dump}, out), 0) << out;
    std::string expected = "Data|" + utf8(u"\u00dcbersicht") + "|Third\n";
    for (const std::u16string& c : cells)
        expected += utf8(c) + "\n";
    const std::vector<uint8_t> got = readFileBytes(dump);
    EXPECT_EQ(std::string(got.begin(), got.end()), expected);
}

TEST(ExternalReaders, LibreOfficeConvertsAMinimalWorkbook)
{
    if (!sofficeAvailable())
        GTEST_SKIP() << "LibreOffice is not installed";
    const std::vector<std::u16string> cells = sampleCells(3000);
    Xls writer;
    writer.setWorkbookStream(minimalWorkbookStream({u"Data"}, cells));
    writer.addStream(u"\x05SummaryInformation", std::vector<uint8_t>(48, 0));
    const std::string path = tempPath("minimal_lo.xls");
    writer.close(path);
    const std::string outDir = tempPath("lo_out");
    const std::string profile = tempPath("lo_profile");
    std::string log;
    const int rc = runCommand("timeout 180 soffice -env:UserInstallation=file://" + profile +
                                  " --headless --convert-to csv:\"Text - txt - csv (StarCalc)\":44,34,76 --outdir '" +
                                  outDir + "' '" + path + "' 2>&1",
                              log);
    ASSERT_EQ(rc, 0) << log;
    const std::vector<uint8_t> csv = readFileBytes(outDir + "/minimal_lo.csv");
    std::string expected;
    for (const std::u16string& c : cells)
        expected += utf8(c) + "\n";
    EXPECT_EQ(std::string(csv.begin(), csv.end()), expected) << log;
}
