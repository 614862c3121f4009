#include "ZipTestSupport.h"

#include <array>
#include <cstdio>
#include <cstdlib>
#include <filesystem>
#include <fstream>
#include <random>
#include <sstream>
#include <stdexcept>
#include <sys/wait.h>

namespace ziptest {

TempDir::TempDir()
{
    std::string pattern = (std::filesystem::temp_directory_path() / "quire-ziptest-XXXXXX").string();
    if (!::mkdtemp(pattern.data()))
        throw std::runtime_error("cannot create a temporary folder");
    m_path = pattern;
}

TempDir::~TempDir()
{
    std::error_code ignored;
    std::filesystem::remove_all(m_path, ignored);
}

CommandResult run(const std::string& commandLine)
{
    CommandResult result;
    FILE* pipe = ::popen((commandLine + " 2>&1").c_str(), "r");
    if (!pipe)
        return result;
    std::array<char, 4096> buffer {};
    std::size_t got = 0;
    while ((got = std::fread(buffer.data(), 1, buffer.size(), pipe)) > 0)
        result.output.append(buffer.data(), got);
    const int status = ::pclose(pipe);
    result.exitCode = WIFEXITED(status) ? WEXITSTATUS(status) : -1;
    return result;
}

bool haveProgram(const std::string& name)
{
    return run("command -v " + quote(name) + " >/dev/null").exitCode == 0;
}

std::string quote(const std::string& text)
{
    std::string out = "'";
    for (const char c : text) {
        if (c == '\'')
            out += "'\\''";
        else
            out += c;
    }
    return out + "'";
}

CommandResult runPython(const TempDir& dir, const std::string& script, const std::vector<std::string>& args)
{
    const std::string scriptPath = dir.file("script.py");
    writeFile(scriptPath, script);
    std::string line = std::string(python) + " " + quote(scriptPath);
    for (const std::string& arg : args)
        line += " " + quote(arg);
    return run(line);
}

std::string readFile(const std::string& path)
{
    std::ifstream in(path, std::ios::binary);
    if (!in)
        throw std::runtime_error("cannot read " + path);
    std::ostringstream data;
    data << in.rdbuf();
    return data.str();
}

void writeFile(const std::string& path, const std::string& data)
{
    std::ofstream out(path, std::ios::binary | std::ios::trunc);
    out.write(data.data(), static_cast<std::streamsize>(data.size()));
    if (!out)
        throw std::runtime_error("cannot write " + path);
}

std::string randomBytes(std::uint32_t seed, std::size_t size)
{
    std::mt19937 engine(seed);
    std::string data(size, '\0');
    for (char& c : data)
        c = static_cast<char>(engine() & 0xFF);
    return data;
}

std::string sampleText(std::uint32_t seed, std::size_t size)
{
    static const char* const words[] = {"<row r=\"", "\">", "<c t=\"s\">", "<v>", "</v></c>", "sheet", "</row>\n",
                                        "value", "42", "3.14159", "xl/worksheets/", " "};
    std::mt19937 engine(seed);
    std::string text;
    while (text.size() < size)
        text += words[engine() % (sizeof words / sizeof words[0])];
    text.resize(size);
    return text;
}

std::string corpusDir()
{
    const std::string dir = std::string(QUIRE_SHARED_DIR) + "/corpus";
    return std::filesystem::is_directory(dir) ? dir : std::string();
}

} // namespace ziptest
