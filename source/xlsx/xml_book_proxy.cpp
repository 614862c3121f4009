#include "xlsx/xml_book_proxy.h"

#include <cstring>
#include <string>

#include "api/handles.h"
#include "xlsx/xml_book_impl.h"

namespace quire {
namespace {

IBookT<wchar_t>* makeFlavour(bool strict) {
    if (strict) return new XMLBookImplT<wchar_t, excelStrict_tag>();
    return new XMLBookImplT<wchar_t, excelNormal_tag>();
}

// A book of the other flavour fails on the workbook's document element: its namespace is not
// the one that flavour binds.
bool stoppedAtWorkbookRoot(const char* message) {
    const std::string text = message ? message : "";
    return text.rfind("Element not found in ", 0) == 0 && text.find(" (workbook) ") != std::string::npos;
}

}  // namespace

XMLBookProxy::XMLBookProxy() : book_(makeFlavour(false)) {}

XMLBookProxy::~XMLBookProxy() { delete book_; }

template <class Load>
bool XMLBookProxy::retry(Load&& load) {
    if (load(*book_)) return true;
    if (std::strcmp(book_->errorMessage(), "bad allocation") == 0) return false;
    IBookT<wchar_t>* other = nullptr;
    try {
        other = makeFlavour(!strict_);
    } catch (...) {
        return false;  // the first book and its message stay
    }
    const bool loaded = load(*other);
    // When both fail, the message worth keeping is the one of the flavour that got past the
    // workbook's document element: the other one only says that its namespace is not there.
    if (!loaded && (!stoppedAtWorkbookRoot(book_->errorMessage()) || stoppedAtWorkbookRoot(other->errorMessage()))) {
        delete other;
        return false;
    }
    delete book_;
    book_ = other;
    strict_ = !strict_;
    return loaded;
}

bool XMLBookProxy::load(const wchar_t* fileName, const wchar_t* tempFile) {
    return retry([&](IBookT<wchar_t>& book) { return book.load(fileName, tempFile); });
}

bool XMLBookProxy::loadSheet(const wchar_t* fileName, int sheetIndex, const wchar_t* tempFile) {
    return retry([&](IBookT<wchar_t>& book) { return book.loadSheet(fileName, sheetIndex, tempFile); });
}

bool XMLBookProxy::loadPartially(const wchar_t* fileName, int sheetIndex, int firstRow, int lastRow,
                                 const wchar_t* tempFile) {
    return retry([&](IBookT<wchar_t>& book) {
        return book.loadPartially(fileName, sheetIndex, firstRow, lastRow, tempFile);
    });
}

bool XMLBookProxy::loadRaw(const char* data, unsigned size, int sheetIndex, int firstRow, int lastRow) {
    return retry([&](IBookT<wchar_t>& book) { return book.loadRaw(data, size, sheetIndex, firstRow, lastRow); });
}

IBookT<wchar_t>* createXmlBook() noexcept {
    try {
        return new XMLBookProxy();
    } catch (...) {
        return nullptr;
    }
}

}  // namespace quire

extern "C" {

BookHandle qrCreateXMLBookCW(void) { return quire::flat::toHandle(quire::createXmlBook()); }

}  // extern "C"
