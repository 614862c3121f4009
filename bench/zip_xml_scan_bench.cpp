// Inflates xl/worksheets/sheet1.xml of an .xlsx file with ZipReader and scans it
// with lmx::c_xml, counting elements, attributes and text bytes. Prints MB/s
// (10^6 bytes of inflated XML per second), best of N runs each, next to zlib
// inflating the same deflated bytes in a single call, the ceiling for the ZIP
// layer.
//
//   zip_xml_scan_bench book.xlsx [runs]
#include <zlib.h>

#include <algorithm>
#include <chrono>
#include <cstdint>
#include <cstdio>
#include <cstdlib>
#include <cstring>
#include <exception>
#include <fstream>
#include <iterator>
#include <memory>
#include <stdexcept>
#include <string>
#include <utility>
#include <vector>

#include "lmx/xml_scanner.h"
#include "zip/ZipFileHeader.h"
#include "zip/ZipReader.h"

namespace {

constexpr const char* kSheetPart = "xl/worksheets/sheet1.xml";

using Clock = std::chrono::steady_clock;

double secondsSince(Clock::time_point start) {
    return std::chrono::duration<double>(Clock::now() - start).count();
}

double megabytesPerSecond(std::size_t bytes, double seconds) {
    return seconds > 0 ? static_cast<double>(bytes) / 1e6 / seconds : 0.0;
}

std::string readWholeFile(const std::string& path) {
    std::ifstream in(path, std::ios::binary);
    if (!in) throw std::runtime_error("cannot open " + path);
    return std::string(std::istreambuf_iterator<char>(in), std::istreambuf_iterator<char>());
}

unsigned littleEndian16(const unsigned char* p) { return p[0] | (p[1] << 8u); }

// The deflated bytes of an entry, found through its local header, for the
// zlib baseline.
std::pair<const unsigned char*, std::size_t> deflatedData(const std::string& file,
                                                          const quire::zip::CZipFileHeader& entry) {
    const auto* base = reinterpret_cast<const unsigned char*>(file.data());
    const std::uint64_t offset = entry.localHeaderOffset;
    if (offset + quire::zip::CZipFileHeader::localFixedSize > file.size())
        throw std::runtime_error("local header outside the file");
    const unsigned char* local = base + offset;
    const std::size_t dataOffset = offset + quire::zip::CZipFileHeader::localFixedSize +
                                   littleEndian16(local + 26) + littleEndian16(local + 28);
    if (dataOffset + entry.compressedSize > file.size())
        throw std::runtime_error("entry data outside the file");
    return {base + dataOffset, static_cast<std::size_t>(entry.compressedSize)};
}

// Raw inflate of the whole entry in one call into a buffer of its final size:
// zlib on its own, with no transfer buffers, copies or CRC.
void zlibInflate(const unsigned char* input, std::size_t inputSize, unsigned char* out, std::size_t outSize) {
    z_stream stream{};
    if (inflateInit2(&stream, -MAX_WBITS) != Z_OK) throw std::runtime_error("inflateInit2 failed");
    stream.next_in = const_cast<Bytef*>(input);
    stream.avail_in = static_cast<uInt>(inputSize);
    stream.next_out = out;
    stream.avail_out = static_cast<uInt>(outSize);
    const int result = inflate(&stream, Z_FINISH);
    inflateEnd(&stream);
    if (result != Z_STREAM_END) throw std::runtime_error("zlib inflate failed");
}

struct ScanCounts {
    std::size_t elements = 0;
    std::size_t attributes = 0;
    std::size_t attributeBytes = 0;
    std::size_t textBytes = 0;
    bool ok = false;
};

ScanCounts scan(const std::string& xml) {
    ScanCounts counts;
    lmx::c_xml scanner(xml.data(), xml.size());
    for (;;) {
        switch (scanner.next()) {
        case lmx::xml_event::start_element:
            ++counts.elements;
            counts.attributes += scanner.attributes().size();
            for (const lmx::c_xml_attribute& attribute : scanner.attributes())
                counts.attributeBytes += attribute.value.size();
            break;
        case lmx::xml_event::text:
            counts.textBytes += scanner.text().size();
            break;
        case lmx::xml_event::end_element:
            break;
        case lmx::xml_event::end_document:
            counts.ok = true;
            return counts;
        case lmx::xml_event::error:
        case lmx::xml_event::none:
            std::fprintf(stderr, "scan error at line %d:\n%s", scanner.line(),
                         scanner.error().report().c_str());
            return counts;
        }
    }
}

int run(const std::string& path, int runs) {
    const std::string file = readWholeFile(path);

    quire::zip::ZipReader reader;
    reader.open(file.data(), file.size());
    const std::size_t index = reader.find(kSheetPart);
    if (index == quire::zip::ZipReader::npos) {
        std::fprintf(stderr, "%s: no %s\n", path.c_str(), kSheetPart);
        return 1;
    }
    const quire::zip::CZipFileHeader& entry = reader.entryInfo(index);
    const std::size_t inflatedSize = static_cast<std::size_t>(entry.uncompressedSize);

    // ZipReader: deflated bytes to a CRC-checked string.
    std::string xml;
    double inflateBest = 1e300;
    for (int i = 0; i < runs; ++i) {
        const auto start = Clock::now();
        std::string part = reader.extract(index);
        const double seconds = secondsSince(start);
        if (seconds < inflateBest) inflateBest = seconds;
        xml.swap(part);
    }
    if (xml.size() != inflatedSize) {
        std::fprintf(stderr, "inflated %zu bytes, expected %zu\n", xml.size(), inflatedSize);
        return 1;
    }

    // zlib on its own, the same bytes in one call: into a buffer that is
    // already mapped (the ceiling), and into a fresh one followed by the CRC,
    // which is the work extract() cannot avoid (first touch of every page of
    // a new buffer of the entry's size, and the check).
    const auto [deflated, deflatedSize] = deflatedData(file, entry);
    std::vector<unsigned char> warm(inflatedSize);
    double zlibWarmBest = 1e300, zlibFreshBest = 1e300;
    for (int i = 0; i < runs; ++i) {
        auto start = Clock::now();
        zlibInflate(deflated, deflatedSize, warm.data(), inflatedSize);
        double seconds = secondsSince(start);
        if (seconds < zlibWarmBest) zlibWarmBest = seconds;

        start = Clock::now();
        std::unique_ptr<unsigned char[]> fresh(new unsigned char[inflatedSize]);
        zlibInflate(deflated, deflatedSize, fresh.get(), inflatedSize);
        const uLong crc = crc32(0L, fresh.get(), static_cast<uInt>(inflatedSize));
        seconds = secondsSince(start);
        if (seconds < zlibFreshBest) zlibFreshBest = seconds;
        if (crc != entry.crc32 || std::memcmp(fresh.get(), xml.data(), inflatedSize) != 0) {
            std::fprintf(stderr, "zlib baseline: not the bytes ZipReader produced\n");
            return 1;
        }
    }

    // The scan over the inflated bytes.
    ScanCounts counts;
    double scanBest = 1e300;
    for (int i = 0; i < runs; ++i) {
        const auto start = Clock::now();
        counts = scan(xml);
        const double seconds = secondsSince(start);
        if (!counts.ok) return 1;
        if (seconds < scanBest) scanBest = seconds;
    }

    std::printf("sheet part: %zu bytes inflated from %zu (%.1f MB), best of %d\n", inflatedSize,
                deflatedSize, inflatedSize / 1e6, runs);
    std::printf("counts: %zu elements, %zu attributes (%zu value bytes), %zu text bytes\n",
                counts.elements, counts.attributes, counts.attributeBytes, counts.textBytes);
    std::printf("RESULT quire-inflate %.1f MB/s %.4f s\n", megabytesPerSecond(inflatedSize, inflateBest),
                inflateBest);
    std::printf("RESULT zlib-inflate-warm %.1f MB/s %.4f s\n", megabytesPerSecond(inflatedSize, zlibWarmBest),
                zlibWarmBest);
    std::printf("RESULT zlib-inflate-fresh+crc %.1f MB/s %.4f s\n",
                megabytesPerSecond(inflatedSize, zlibFreshBest), zlibFreshBest);
    std::printf("RESULT quire-c_xml-scan %.1f MB/s %.4f s\n", megabytesPerSecond(inflatedSize, scanBest),
                scanBest);
    return 0;
}

}  // namespace

int main(int argc, char** argv) {
    if (argc < 2) {
        std::fprintf(stderr, "usage: %s book.xlsx [runs]\n", argv[0]);
        return 2;
    }
    const int runs = argc > 2 ? std::max(1, std::atoi(argv[2])) : 3;
    try {
        return run(argv[1], runs);
    } catch (const std::exception& error) {
        std::fprintf(stderr, "%s: %s\n", argv[1], error.what());
        return 1;
    }
}
