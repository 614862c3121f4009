#include "corpus.h"

#include <cstdlib>
#include <fstream>
#include <iterator>
#include <sstream>
#include <stdexcept>
#include <unistd.h>

namespace quire::test {

std::string corpusDir() {
    std::string dir = std::string(QUIRE_SHARED_DIR) + "/corpus";
    std::ifstream manifest(dir + "/MANIFEST.tsv");
    return manifest ? dir : std::string();
}

std::vector<CorpusFile> corpusFiles(const std::vector<std::string>& extensions) {
    std::vector<CorpusFile> files;
    std::string dir = corpusDir();
    if (dir.empty()) return files;
    std::ifstream manifest(dir + "/MANIFEST.tsv");
    std::string line;
    while (std::getline(manifest, line)) {
        auto tab = line.find('\t');
        if (tab == std::string::npos) continue;
        CorpusFile file;
        file.ok = line.compare(0, tab, "ok") == 0;
        file.name = line.substr(tab + 1);
        file.path = dir + "/" + file.name;
        for (const auto& extension : extensions) {
            if (file.name.size() >= extension.size() &&
                file.name.compare(file.name.size() - extension.size(), extension.size(), extension) == 0) {
                files.push_back(file);
                break;
            }
        }
    }
    return files;
}

std::string readFile(const std::string& path) {
    std::ifstream in(path, std::ios::binary);
    if (!in) throw std::runtime_error("can't read " + path);
    return std::string((std::istreambuf_iterator<char>(in)), std::istreambuf_iterator<char>());
}

void writeFile(const std::string& path, const std::string& bytes) {
    std::ofstream out(path, std::ios::binary);
    out.write(bytes.data(), static_cast<std::streamsize>(bytes.size()));
    if (!out) throw std::runtime_error("can't write " + path);
}

std::string makeTempDir(const std::string& prefix) {
    const char* base = std::getenv("TMPDIR");
    std::string pattern = std::string(base ? base : "/tmp") + "/" + prefix + "XXXXXX";
    std::vector<char> buffer(pattern.begin(), pattern.end());
    buffer.push_back('\0');
    if (!mkdtemp(buffer.data())) throw std::runtime_error("can't make a temporary folder");
    return buffer.data();
}

}  // namespace quire::test
