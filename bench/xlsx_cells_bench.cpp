// Writes or reads 1,000,000 cells of an .xlsx file: 100,000 rows by 10 columns, even columns
// numbers, odd columns strings from a pool of 5,000 (every one used, in turn). Prints seconds and
// peak memory.
#include <sys/resource.h>

#include <chrono>
#include <cstdio>
#include <cstring>
#include <string>

#include "xlsx/xml_book_proxy.h"

namespace {

constexpr int kRows = 100000;
constexpr int kCols = 10;
constexpr int kPool = 5000;

long peakKilobytes() {
    rusage usage{};
    getrusage(RUSAGE_SELF, &usage);
    return usage.ru_maxrss;
}

// Processor time of this process: unlike the wall clock, not stretched by other work on the machine.
double cpuSeconds() {
    rusage usage{};
    getrusage(RUSAGE_SELF, &usage);
    return usage.ru_utime.tv_sec + usage.ru_stime.tv_sec + (usage.ru_utime.tv_usec + usage.ru_stime.tv_usec) / 1e6;
}

int writeBook(const std::string& path) {
    quire::IBook* book = quire::createXmlBook();
    quire::ISheet* sheet = book->addSheet(L"Data", nullptr);
    std::wstring pool[kPool];
    for (int i = 0; i < kPool; ++i) pool[i] = L"string value " + std::to_wstring(i);
    for (int row = 0; row < kRows; ++row) {
        for (int col = 0; col < kCols; ++col) {
            if (col % 2 == 0) sheet->writeNum(row, col, row * 0.5 + col, nullptr);
            else sheet->writeStr(row, col, pool[(row * (kCols / 2) + col / 2) % kPool].c_str(), nullptr, 2);
        }
    }
    bool saved = book->save(std::wstring(path.begin(), path.end()).c_str(), false);
    if (!saved) std::fprintf(stderr, "save failed: %s\n", book->errorMessage());
    book->release();
    return saved ? 0 : 1;
}

int readBook(const std::string& path) {
    quire::IBook* book = quire::createXmlBook();
    if (!book->load(std::wstring(path.begin(), path.end()).c_str(), nullptr)) {
        std::fprintf(stderr, "load failed: %s\n", book->errorMessage());
        return 1;
    }
    quire::ISheet* sheet = book->getSheet(0);
    double sum = 0;
    size_t characters = 0;
    for (int row = 0; row < kRows; ++row) {
        for (int col = 0; col < kCols; ++col) {
            if (col % 2 == 0) sum += sheet->readNum(row, col, nullptr);
            else characters += std::wcslen(sheet->readStr(row, col, nullptr));
        }
    }
    book->release();
    std::fprintf(stderr, "checksum %.1f %zu\n", sum, characters);
    return 0;
}

}  // namespace

int main(int argc, char** argv) {
    if (argc != 3 || (std::strcmp(argv[1], "write") != 0 && std::strcmp(argv[1], "read") != 0)) {
        std::fprintf(stderr, "usage: %s write|read FILE\n", argv[0]);
        return 2;
    }
    auto start = std::chrono::steady_clock::now();
    int status = std::strcmp(argv[1], "write") == 0 ? writeBook(argv[2]) : readBook(argv[2]);
    double seconds = std::chrono::duration<double>(std::chrono::steady_clock::now() - start).count();
    std::printf("quire %s: %.3f s (cpu %.3f s), peak %.1f MB\n", argv[1], seconds, cpuSeconds(),
                peakKilobytes() / 1024.0);
    return status;
}
