#include "package_support.h"

#include "quire.h"
#include "zip/ZipReader.h"

namespace quire::test {
namespace {

std::map<std::string, std::string> readAll(zip::ZipReader& reader) {
    std::map<std::string, std::string> entries;
    for (std::size_t i = 0; i < reader.entryCount(); ++i) entries[reader.entryNameUtf8(i)] = reader.extract(i);
    return entries;
}

}  // namespace

std::map<std::string, std::string> readPackage(const std::string& path) {
    zip::ZipReader reader;
    reader.open(path);
    return readAll(reader);
}

std::map<std::string, std::string> readPackageFromMemory(const char* data, std::size_t size) {
    zip::ZipReader reader;
    reader.open(data, size);
    return readAll(reader);
}

IBook* newXmlBook() { return reinterpret_cast<IBook*>(qrCreateXMLBookCW()); }

std::wstring widen(const std::string& text) { return std::wstring(text.begin(), text.end()); }

}  // namespace quire::test
