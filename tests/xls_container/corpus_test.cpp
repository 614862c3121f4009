// Every .xls of the shared corpus opens as a compound file (or fails with a
// message) and its workbook stream reads as records: the globals up to EOF,
// the shared string table, then every sheet substream from its BoundSheet8
// position.

#include <gtest/gtest.h>

#include <fstream>
#include <map>
#include <sstream>

#include "api/qrerror.h"
#include "test_support.h"
#include "xls/compound_file.h"
#include "xls/little_endian.h"
#include "xls/record_reader.h"
#include "xls/shared_strings.h"
#include "xls/strings.h"

using namespace quire::xls;
using namespace quire::xls::test;

namespace {

struct CorpusFile {
    std::string expectation;  // "ok" or "bad"
    std::string path;
};

std::vector<CorpusFile> corpusXlsFiles()
{
    std::vector<CorpusFile> files;
    const std::string root = std::string(QUIRE_SHARED_DIR) + "/corpus";
    std::ifstream manifest(root + "/MANIFEST.tsv");
    std::string line;
    while (std::getline(manifest, line)) {
        const size_t tab = line.find('\t');
        if (tab == std::string::npos)
            continue;
        const std::string path = line.substr(tab + 1);
        if (path.size() > 4 && path.compare(path.size() - 4, 4, ".xls") == 0)
            files.push_back({line.substr(0, tab), root + "/" + path});
    }
    return files;
}

// Reads records from the reader's position to the substream's EOF; returns
// the number of records. BoundSheet8 positions go to 'sheets' and the SST is
// parsed when 'globals'.
size_t readSubstream(RecordReader& reader, bool globals, std::vector<uint32_t>& sheets, size_t& sstStrings)
{
    size_t records = 0;
    RecordHeader h;
    while (reader.readHeader(h)) {
        ++records;
        size_t remaining = h.length;
        if (globals && h.type == 0x0085) {
            checkRecordSize(h.length >= 8, "BoundSheet8");
            sheets.push_back(reader.readUInt32(remaining));
        } else if (globals && h.type == 0x002F) {
            throw qrerror("workbook is encrypted");  // FilePass: what follows is ciphertext
        } else if (globals && h.type == RecordType::Sst) {
            SharedStringTable sst;
            sst.read(reader, h);
            sstStrings = sst.size();
            continue;
        }
        reader.skip(remaining, remaining);
        if (h.type == RecordType::Eof)
            break;
    }
    return records;
}

} // namespace

TEST(Corpus, EveryXlsOpensAndReadsAsRecords)
{
    const std::vector<CorpusFile> files = corpusXlsFiles();
    if (files.empty())
        GTEST_SKIP() << "no corpus at " << QUIRE_SHARED_DIR;
    size_t opened = 0, encrypted = 0, readFully = 0;
    std::map<std::string, std::vector<std::string>> openFailures, recordFailures;
    for (const CorpusFile& file : files) {
        Xls xls;
        try {
            xls.open(file.path);
        } catch (const qrerror& e) {
            openFailures[e.what()].push_back(file.expectation + " " + file.path);
            continue;
        }
        ++opened;
        if (xls.encrypted()) {
            ++encrypted;
            continue;
        }
        try {
            const std::vector<uint8_t>& stream = xls.workbookStream();
            RecordReader reader(stream);
            std::vector<uint32_t> sheets;
            size_t sstStrings = 0;
            readSubstream(reader, true, sheets, sstStrings);
            for (uint32_t position : sheets) {
                reader.seek(position);
                readSubstream(reader, false, sheets, sstStrings);
            }
            // Every root stream can be extracted too.
            for (const CompoundStream& s : xls.rootStreams())
                EXPECT_LE(s.data.size(), stream.size() + readFileBytes(file.path).size());
            ++readFully;
        } catch (const qrerror& e) {
            recordFailures[e.what()].push_back(file.expectation + " " + file.path);
        }
    }
    std::ostringstream report;
    report << files.size() << " files: " << opened << " opened (" << encrypted << " encrypted), " << readFully
           << " read as records\n";
    for (const auto& [message, paths] : openFailures) {
        report << "open failed: \"" << message << "\" x" << paths.size() << "\n";
        for (const std::string& p : paths)
            report << "    " << p << "\n";
    }
    for (const auto& [message, paths] : recordFailures) {
        report << "records failed: \"" << message << "\" x" << paths.size() << "\n";
        for (const std::string& p : paths)
            report << "    " << p << "\n";
    }
    std::printf("%s", report.str().c_str());
    // Compound files that real programs open must open here as well; an old
    // BIFF2-4 file is a bare record stream without a container.
    for (const auto& [message, paths] : openFailures)
        for (const std::string& p : paths) {
            const std::vector<uint8_t> head = readFileBytes(p.substr(p.find(' ') + 1));
            const bool compound = head.size() >= 8 && loadU32(head.data()) == 0xE011CFD0u;
            EXPECT_FALSE(compound && p.rfind("ok ", 0) == 0) << "opening " << p << " failed: " << message;
        }
    for (const auto& [message, paths] : recordFailures)
        for (const std::string& p : paths)
            EXPECT_NE(p.rfind("ok ", 0), 0u) << "reading " << p << " failed: " << message;
    EXPECT_GE(readFully, 240u);
}
