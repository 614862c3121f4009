#include "test_support.h"

#include <cstdio>
#include <fstream>
#include <iterator>
#include <sys/stat.h>
#include <sys/wait.h>
#include <unistd.h>

#include "api/qrerror.h"
#include "xls/compound_file.h"
#include "xls/little_endian.h"
#include "xls/record_writer.h"
#include "xls/shared_strings.h"
#include "xls/strings.h"

namespace quire::xls::test {

std::string failureOf(const std::function<void()>& f)
{
    try {
        f();
    } catch (const qrerror& e) {
        return e.what();
    }
    return "";
}

std::vector<uint8_t> readFileBytes(const std::string& path)
{
    std::ifstream in(path, std::ios::binary);
    return std::vector<uint8_t>((std::istreambuf_iterator<char>(in)), std::istreambuf_iterator<char>());
}

void writeFileBytes(const std::string& path, const std::vector<uint8_t>& bytes)
{
    std::ofstream out(path, std::ios::binary | std::ios::trunc);
    out.write(reinterpret_cast<const char*>(bytes.data()), static_cast<std::streamsize>(bytes.size()));
}

std::string tempPath(const std::string& name)
{
    const std::string dir = std::string(QUIRE_TEST_BINARY_DIR) + "/tmp";
    mkdir(dir.c_str(), 0755);
    return dir + "/" + name;
}

uint32_t getU32(const std::vector<uint8_t>& bytes, size_t offset) { return loadU32(bytes.data() + offset); }
void setU32(std::vector<uint8_t>& bytes, size_t offset, uint32_t value) { storeU32(bytes.data() + offset, value); }
void setU16(std::vector<uint8_t>& bytes, size_t offset, uint16_t value) { storeU16(bytes.data() + offset, value); }

std::vector<uint8_t> compoundFileWith(const std::vector<uint8_t>& workbook)
{
    Xls xls;
    xls.setWorkbookStream(workbook);
    std::vector<uint8_t> out;
    xls.close(out);
    return out;
}

size_t fatEntryOffset(const std::vector<uint8_t>& file, uint32_t index)
{
    const uint32_t fatSector = getU32(file, 76 + 4 * (index / 128));
    return (size_t{fatSector} + 1) * 512 + 4 * (index % 128);
}

size_t dirEntryOffset(const std::vector<uint8_t>& file, uint32_t index)
{
    uint32_t sector = getU32(file, 48);
    for (uint32_t i = 0; i < index / 4; ++i)
        sector = getU32(file, fatEntryOffset(file, sector));
    return (size_t{sector} + 1) * 512 + 128 * (index % 4);
}

std::vector<uint8_t> minimalWorkbookStream(const std::vector<std::u16string>& sheetNames,
                                           const std::vector<std::u16string>& cells)
{
    RecordWriter w;
    auto bof = [&](uint16_t dt) {
        std::vector<uint8_t> d;
        appendU16(d, 0x0600);
        appendU16(d, dt);
        appendU16(d, 0x209A);
        appendU16(d, 0x07CD);
        appendU32(d, 0x0000C0C9);
        appendU32(d, 0x00000306);
        w.writeRecord(RecordType::Bof, d);
    };
    bof(0x0005);
    w.writeRecord(0x0042, std::vector<uint8_t>{0xB0, 0x04});  // CodePage 1200
    std::vector<size_t> plyPositions;
    for (const std::u16string& name : sheetNames) {
        std::vector<uint8_t> d;
        appendU32(d, 0);
        d.push_back(0);
        d.push_back(0);
        writeShortXLUnicodeString(d, name);
        plyPositions.push_back(w.position() + 4);
        w.writeRecord(0x0085, d);
    }
    SharedStringTable sst;
    std::vector<size_t> indexes;
    for (const std::u16string& s : cells)
        indexes.push_back(sst.add(s));
    sst.write(w);
    w.writeRecord(RecordType::Eof, nullptr, 0);

    for (size_t sheet = 0; sheet < sheetNames.size(); ++sheet) {
        w.patchUInt32(plyPositions[sheet], static_cast<uint32_t>(w.position()));
        bof(0x0010);
        const size_t rows = sheet == 0 ? cells.size() : 0;
        std::vector<uint8_t> dim;
        appendU32(dim, 0);
        appendU32(dim, static_cast<uint32_t>(rows));
        appendU16(dim, 0);
        appendU16(dim, rows ? 1 : 0);
        appendU16(dim, 0);
        w.writeRecord(0x0200, dim);
        for (size_t r = 0; r < rows; ++r) {
            std::vector<uint8_t> d;
            appendU16(d, static_cast<uint16_t>(r));
            appendU16(d, 0);
            appendU16(d, 0x000F);
            appendU32(d, static_cast<uint32_t>(indexes[r]));
            w.writeRecord(0x00FD, d);
        }
        w.writeRecord(RecordType::Eof, nullptr, 0);
    }
    return w.take();
}

int runCommand(const std::string& command, std::string& output)
{
    output.clear();
    FILE* pipe = popen(command.c_str(), "r");
    if (!pipe)
        return -1;
    char buffer[4096];
    size_t n;
    while ((n = fread(buffer, 1, sizeof buffer, pipe)) > 0)
        output.append(buffer, n);
    const int status = pclose(pipe);
    return WIFEXITED(status) ? WEXITSTATUS(status) : -1;
}

bool xlrdAvailable()
{
    std::string out;
    return runCommand("/usr/bin/python3 -c 'import xlrd' 2>/dev/null", out) == 0;
}

int runPython(const std::string& script, const std::vector<std::string>& args, std::string& output)
{
    const std::string path =
        tempPath("script_" + std::to_string(getpid()) + "_" + std::to_string(std::hash<std::string>{}(script)) + ".py");
    std::ofstream(path) << script;
    std::string command = "/usr/bin/python3 " + path;
    for (const std::string& a : args)
        command += " '" + a + "'";
    return runCommand(command + " 2>&1", output);
}

bool sofficeAvailable()
{
    std::string out;
    return runCommand("command -v soffice >/dev/null 2>&1", out) == 0;
}

} // namespace quire::xls::test
