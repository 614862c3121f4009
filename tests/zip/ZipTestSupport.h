// Helpers shared by the ZIP tests: temporary folders, file I/O, test data,
// and running the outside programs that judge our archives.
#pragma once

#include <cstdint>
#include <string>
#include <vector>

namespace ziptest {

// A fresh folder under the temporary directory, removed with its contents.
class TempDir {
public:
    TempDir();
    ~TempDir();
    TempDir(const TempDir&) = delete;
    TempDir& operator=(const TempDir&) = delete;
    const std::string& path() const { return m_path; }
    std::string file(const std::string& name) const { return m_path + "/" + name; }

private:
    std::string m_path;
};

struct CommandResult {
    int exitCode = -1;
    std::string output;   // stdout and stderr together
};

// Runs a shell command line; output is captured.
CommandResult run(const std::string& commandLine);
bool haveProgram(const std::string& name);
std::string quote(const std::string& text);

// The Debian interpreter, which has zipfile with bzip2 and Zip64 support.
constexpr const char* python = "/usr/bin/python3";
// Runs python with a script and arguments (each quoted here).
CommandResult runPython(const TempDir& dir, const std::string& script, const std::vector<std::string>& args);

std::string readFile(const std::string& path);
void writeFile(const std::string& path, const std::string& data);

// Deterministic test data: incompressible bytes, and compressible text.
std::string randomBytes(std::uint32_t seed, std::size_t size);
std::string sampleText(std::uint32_t seed, std::size_t size);

// The shared corpus folder, or empty when it is not there.
std::string corpusDir();

} // namespace ziptest
