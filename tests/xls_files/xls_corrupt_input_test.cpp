// Corrupt and hostile .xls input fails with a message: never a crash, a hang or runaway memory.
#include <gtest/gtest.h>

#include <memory>
#include <random>

#include "api/book_factory.h"
#include "api/enums.h"
#include "corpus.h"
#include "xls/compound_file.h"
#include "xls/record_reader.h"

namespace quire::test {
namespace {

struct BookDeleter {
    void operator()(IBook* book) const { book->release(); }
};
using BookPtr = std::unique_ptr<IBook, BookDeleter>;

struct Rec {
    uint16_t type;
    std::vector<uint8_t> data;
};

std::string savedBook() {
    BookPtr book(createBinaryBook());
    ISheet* sheet = book->addSheet(L"Sheet1", nullptr);
    for (int r = 0; r < 50; ++r) {
        sheet->writeNum(r, 0, r * 1.5, nullptr);
        sheet->writeStr(r, 1, (L"text " + std::to_wstring(r % 7)).c_str(), nullptr, 2);
    }
    book->addSheet(L"Sheet2", nullptr)->writeBool(0, 0, true, nullptr, ErrorTypeNoError);
    const char* data = nullptr;
    unsigned size = 0;
    EXPECT_TRUE(book->saveRaw(&data, &size));
    return std::string(data, size);
}

std::vector<Rec> workbookRecords(const std::string& file) {
    xls::Xls container;
    container.open(reinterpret_cast<const uint8_t*>(file.data()), file.size());
    xls::RecordReader reader(container.workbookStream());
    std::vector<Rec> records;
    xls::Record record;
    uint16_t next = 0;
    // The stream may be padded with zeros after its last EOF.
    while (reader.peekType(next) && next != 0 && reader.next(record))
        records.push_back({record.type, {record.data, record.data + record.size}});
    return records;
}

std::string fileOf(const std::vector<Rec>& records) {
    std::vector<uint8_t> stream;
    for (const auto& r : records) {
        stream.push_back(static_cast<uint8_t>(r.type));
        stream.push_back(static_cast<uint8_t>(r.type >> 8));
        stream.push_back(static_cast<uint8_t>(r.data.size()));
        stream.push_back(static_cast<uint8_t>(r.data.size() >> 8));
        stream.insert(stream.end(), r.data.begin(), r.data.end());
    }
    xls::Xls container;
    container.setWorkbookStream(stream);
    std::vector<uint8_t> file;
    container.close(file);
    return std::string(file.begin(), file.end());
}

std::string loadMessage(const std::string& bytes) {
    BookPtr book(createBinaryBook());
    bool loaded = book->loadRaw(bytes.data(), static_cast<unsigned>(bytes.size()), -1, -1, -1);
    std::string message = book->errorMessage();
    if (!loaded) {
        EXPECT_NE(message, "ok");
        EXPECT_EQ(book->sheetCount(), 0) << "a failed load leaves a new book";
        EXPECT_EQ(book->formatSize(), 21);
    }
    return loaded ? "loaded" : message;
}

Rec* firstOf(std::vector<Rec>& records, uint16_t type) {
    for (auto& r : records)
        if (r.type == type) return &r;
    return nullptr;
}

TEST(XlsCorruptInput, RecordsThatBreakTheRulesNameTheRecord) {
    std::string good = savedBook();
    ASSERT_EQ(loadMessage(good), "loaded");

    auto records = workbookRecords(good);
    records[0].data[1] = 0x04;  // BOF version 0x0400
    EXPECT_EQ(loadMessage(fileOf(records)), "This file format isn't supported");

    records = workbookRecords(good);
    records.insert(records.begin() + 1, Rec{0x002F, {0, 0, 0, 0, 0, 0}});
    EXPECT_EQ(loadMessage(fileOf(records)), "workbook is encrypted");

    records = workbookRecords(good);
    firstOf(records, 0x00E0)->data.push_back(0);
    EXPECT_EQ(loadMessage(fileOf(records)), "XF size is incorrect");

    records = workbookRecords(good);
    firstOf(records, 0x0031)->data.resize(10);
    EXPECT_EQ(loadMessage(fileOf(records)), "Font size is incorrect");

    records = workbookRecords(good);
    firstOf(records, 0x027E)->data.resize(9);
    EXPECT_EQ(loadMessage(fileOf(records)), "RK size is incorrect");

    records = workbookRecords(good);
    firstOf(records, 0x00FD)->data[6] = 0xFF;  // a string index far past the table
    firstOf(records, 0x00FD)->data[7] = 0xFF;
    EXPECT_EQ(loadMessage(fileOf(records)), "StrMap: sst is out of range (2)");

    records = workbookRecords(good);
    records.insert(records.begin() + 3, Rec{0x0000, {}});
    EXPECT_EQ(loadMessage(fileOf(records)), "read error: record id can't be 0");

    records = workbookRecords(good);
    firstOf(records, 0x0085)->data[0] = 0xFF;  // a sheet substream beyond the stream
    firstOf(records, 0x0085)->data[3] = 0x7F;
    EXPECT_NE(loadMessage(fileOf(records)), "loaded");
}

TEST(XlsCorruptInput, EveryTruncationFailsCleanly) {
    std::string good = savedBook();
    for (size_t length = 0; length < good.size(); length += 61) {
        std::string cut = good.substr(0, length);
        std::string message = loadMessage(cut);
        EXPECT_NE(message, "loaded") << "a file cut at " << length << " of " << good.size() << " bytes loaded";
    }
    // A workbook stream cut inside its records.
    auto records = workbookRecords(good);
    std::string stream = fileOf(records);
    for (size_t keep = 1; keep < records.size(); keep += 3) {
        std::vector<Rec> head(records.begin(), records.begin() + static_cast<long>(keep));
        EXPECT_NE(loadMessage(fileOf(head)), "loaded") << keep << " records";
    }
}

TEST(XlsCorruptInput, FlippedBytesNeverCrash) {
    std::string good = savedBook();
    std::mt19937 random(1234);
    for (int round = 0; round < 400; ++round) {
        std::string bad = good;
        int flips = 1 + round % 8;
        for (int i = 0; i < flips; ++i) bad[random() % bad.size()] = static_cast<char>(random());
        loadMessage(bad);  // loads or fails; the sanitizers watch the rest
    }
}

TEST(XlsCorruptInput, CorpusFilesWithFlippedBytesNeverCrash) {
    auto files = corpusFiles({".xls"});
    if (files.empty()) GTEST_SKIP() << "the corpus is not present";
    std::mt19937 random(99);
    int tried = 0;
    for (const auto& file : files) {
        if (!file.ok || tried++ % 8 != 0) continue;
        std::string good = readFile(file.path);
        if (good.empty()) continue;
        for (int round = 0; round < 20; ++round) {
            std::string bad = good;
            for (int i = 0; i < 4; ++i) bad[random() % bad.size()] = static_cast<char>(random());
            SCOPED_TRACE(file.name);
            loadMessage(bad);
        }
    }
}

}  // namespace
}  // namespace quire::test
