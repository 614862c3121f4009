#include "xlsx/xfile.h"

#include <cstdio>

namespace quire {

void writeXmlText(const std::string& fileName, std::string& buffer, const std::string& text) {
    if (fileName.empty()) {
        buffer = text;
        return;
    }
    std::FILE* out = std::fopen(fileName.c_str(), "wb");
    if (!out) throw qrerror("can't open file for writing");
    const bool written = std::fwrite(text.data(), 1, text.size(), out) == text.size();
    if (std::fclose(out) != 0 || !written) throw qrerror("can't open file for writing");
}

void BinaryFile::write(const std::string& fileName, std::string& buffer) { writeXmlText(fileName, buffer, bytes_); }

std::string xmlErrorText(const std::string& partName, const lmx::c_xml_reader& reader, lmx::elmx_error code) {
    const lmx::c_error& error = reader.error();
    std::string text(lmx::error_message(error.code != lmx::ELMX_OK ? error.code : code));
    if (text.empty()) text = "XML error " + std::to_string(static_cast<int>(code));
    text += " in " + partName;
    if (!error.item_name.empty()) text += " (" + error.item_name + ")";
    if (error.xml_line > 0) text += " at line " + std::to_string(error.xml_line);
    return text;
}

}  // namespace quire
