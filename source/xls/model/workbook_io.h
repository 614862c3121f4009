#pragma once
#include <cstdint>
#include <vector>

namespace quire {

class BookImplT;

// Which part of a file a load reads.
struct LoadRequest {
    int sheetIndex = -1;   // -1: every sheet
    int firstRow = -1;     // rows of the selected sheet, inclusive; -1: no bound
    int lastRow = -1;
    bool infoOnly = false; // globals only, no sheet objects
    bool skipBlanks = true;
};

// Reads a binary workbook (compound file bytes) into a book that was reset to new.
// The bytes are read in place and must stay valid for the call.
void readWorkbook(BookImplT& book, const uint8_t* fileBytes, size_t size, const LoadRequest& request);

// Serialises the book as a compound file holding its workbook stream.
std::vector<uint8_t> writeWorkbook(BookImplT& book);

}  // namespace quire
