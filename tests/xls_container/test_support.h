#pragma once

// Helpers shared by the container and record stream tests.

#include <cstdint>
#include <functional>
#include <string>
#include <vector>

namespace quire::xls::test {

// Text of the qrerror thrown by f, or "" when nothing was thrown.
std::string failureOf(const std::function<void()>& f);

std::vector<uint8_t> readFileBytes(const std::string& path);
void writeFileBytes(const std::string& path, const std::vector<uint8_t>& bytes);
// A fresh path in the test binary folder.
std::string tempPath(const std::string& name);

// Little-endian patching of hand-made corruptions.
uint32_t getU32(const std::vector<uint8_t>& bytes, size_t offset);
void setU32(std::vector<uint8_t>& bytes, size_t offset, uint32_t value);
void setU16(std::vector<uint8_t>& bytes, size_t offset, uint16_t value);

// A compound file made by our writer around the given workbook stream.
std::vector<uint8_t> compoundFileWith(const std::vector<uint8_t>& workbook);
// File offset of FAT entry 'index' of a file whose FAT sectors are listed in
// the header (fewer than 110 FAT sectors).
size_t fatEntryOffset(const std::vector<uint8_t>& file, uint32_t index);
// File offset of directory entry 'index'.
size_t dirEntryOffset(const std::vector<uint8_t>& file, uint32_t index);

// A small but complete BIFF8 workbook stream: one sheet per name, column A of
// the first sheet holding 'cells' as shared strings, row by row.
std::vector<uint8_t> minimalWorkbookStream(const std::vector<std::u16string>& sheetNames,
                                           const std::vector<std::u16string>& cells);

// Runs /usr/bin/python3 with a script; returns false when python3 with xlrd
// is not installed. 'output' receives stdout, 'exitCode' the status.
bool xlrdAvailable();
int runPython(const std::string& script, const std::vector<std::string>& args, std::string& output);
bool sofficeAvailable();
int runCommand(const std::string& command, std::string& output);

} // namespace quire::xls::test
