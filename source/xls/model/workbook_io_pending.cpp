#include "api/qrerror.h"
#include "workbook_io.h"

namespace quire {

// The binary file reader and writer are not built yet; loads and saves say so.
void readWorkbook(BookImplT&, const std::string&, const LoadRequest&) {
    throw qrerror("reading .xls files is not available yet");
}

std::string writeWorkbook(BookImplT&) { throw qrerror("writing .xls files is not available yet"); }

}  // namespace quire
