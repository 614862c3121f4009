// The shared corpus: every readable Open XML workbook opens and every entry
// extracts with a matching CRC-32; refused files fail with an error, not a crash.
#include "ZipError.h"
#include "ZipException.h"
#include "ZipReader.h"
#include "ZipTestSupport.h"

#include <gtest/gtest.h>

#include <fstream>
#include <sstream>

using namespace ziptest;
using quire::zip::CZipException;
using quire::zip::ZipError;
using quire::zip::ZipReader;

namespace {

struct CorpusFile {
    bool ok = false;
    std::string path;
};

std::vector<CorpusFile> corpusFiles(const std::string& dir)
{
    std::vector<CorpusFile> files;
    std::ifstream manifest(dir + "/MANIFEST.tsv");
    std::string line;
    while (std::getline(manifest, line)) {
        const std::size_t tab = line.find('\t');
        if (tab == std::string::npos)
            continue;
        files.push_back({line.substr(0, tab) == "ok", dir + "/" + line.substr(tab + 1)});
    }
    return files;
}

bool isOpenXmlPackage(const std::string& path)
{
    for (const char* extension : {".xlsx", ".xlsm", ".xltx"}) {
        const std::string suffix = extension;
        if (path.size() > suffix.size() && path.compare(path.size() - suffix.size(), suffix.size(), suffix) == 0)
            return true;
    }
    return false;
}

// Extracts every entry; returns the first failure, or empty.
std::string extractEverything(ZipReader& reader)
{
    for (std::size_t i = 0; i < reader.entryCount(); ++i) {
        try {
            const std::string data = reader.extract(i);
            if (data.size() != reader.entrySize(i))
                return reader.entryNameUtf8(i) + ": wrong size";
        } catch (const std::exception& error) {
            return reader.entryNameUtf8(i) + ": " + error.what();
        }
    }
    return {};
}

} // namespace

TEST(ZipCorpus, EveryReadableWorkbookExtractsWithMatchingCrc)
{
    const std::string dir = corpusDir();
    if (dir.empty())
        GTEST_SKIP() << "the shared corpus is not present";
    std::size_t checked = 0;
    std::size_t entries = 0;
    std::vector<std::string> failures;
    for (const CorpusFile& file : corpusFiles(dir)) {
        if (!file.ok || !isOpenXmlPackage(file.path))
            continue;
        ++checked;
        try {
            ZipReader fromPath;
            fromPath.open(file.path);
            entries += fromPath.entryCount();
            if (fromPath.entryCount() == 0)
                failures.push_back(file.path + ": no entries");
            std::string failure = extractEverything(fromPath);

            const std::string bytes = readFile(file.path);
            ZipReader fromMemory;
            fromMemory.open(bytes.data(), bytes.size());
            if (failure.empty())
                failure = extractEverything(fromMemory);
            if (!failure.empty())
                failures.push_back(file.path + ": " + failure);
        } catch (const std::exception& error) {
            failures.push_back(file.path + ": " + error.what());
        }
    }
    EXPECT_GT(checked, 800u);
    EXPECT_GT(entries, checked * 5);
    std::ostringstream list;
    for (const std::string& failure : failures)
        list << failure << "\n";
    EXPECT_TRUE(failures.empty()) << failures.size() << " of " << checked << " failed:\n" << list.str();
}

TEST(ZipCorpus, RefusedAndBinaryFilesFailCleanly)
{
    const std::string dir = corpusDir();
    if (dir.empty())
        GTEST_SKIP() << "the shared corpus is not present";
    std::size_t notArchives = 0;
    for (const CorpusFile& file : corpusFiles(dir)) {
        if (file.ok && isOpenXmlPackage(file.path))
            continue;
        ZipReader reader;
        try {
            // Some binary workbooks embed a small package (a theme) near
            // their end and open like a self-extractor; that is fine too.
            reader.open(file.path);
            extractEverything(reader);   // failures are expected; crashes are not
        } catch (const CZipException& error) {
            if (error.code() == CZipException::badZipFile)
                ++notArchives;
        } catch (const ZipError&) {
        }
    }
    EXPECT_GT(notArchives, 100u);
}
