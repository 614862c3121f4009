#pragma once
#include <ostream>
#include <string>
#include <vector>

namespace quire::test {

// One file of the shared corpus of real workbooks.
struct CorpusFile {
    std::string path;      // absolute
    std::string name;      // relative to the corpus folder
    bool ok = false;       // false: other readers refuse it
};

// Test output names the file rather than dumping its bytes.
inline void PrintTo(const CorpusFile& file, std::ostream* out) { *out << file.name; }

// The corpus folder, or an empty string when it is not present.
std::string corpusDir();
// Files of the manifest whose name ends with one of the extensions (".xls", ".xlsx", ...).
std::vector<CorpusFile> corpusFiles(const std::vector<std::string>& extensions);

std::string readFile(const std::string& path);
void writeFile(const std::string& path, const std::string& bytes);
// A fresh folder under the system's temporary folder.
std::string makeTempDir(const std::string& prefix);

}  // namespace quire::test
