// QrBookKit's shared methods: the library module, one-call loading and the library version.
#include <cstdio>
#include <string>

#include "book_methods.h"
#include "external_library.h"
#include "glue.h"
#include "host_binary.h"
#include "unicode.h"

namespace quire_plugin {

namespace {

// Loads with `load` into a binary book, then into an Open XML book; the loaded book or null.
// `message` receives the Open XML book's message after a second failure.
template <typename Load>
BookHandle loadEitherKind(Load load, REALstring* message) {
    BookHandle book = QR_CALL(qrCreateBookCW)();
    if (!book) return nullptr;
    if (load(book)) return book;
    QR_CALL(qrBookReleaseW)(book);
    // The Open XML entries are needed only now; a missing one is reported here.
    if (!QR_NEED(qrCreateXMLBookCW) || !QR_NEED(qrBookSetLocaleW)) return nullptr;
    book = QR_CALL(qrCreateXMLBookCW)();
    if (!book) return nullptr;
    QR_CALL(qrBookSetLocaleW)(book, "UTF-8");
    if (load(book)) return book;
    if (message) assignString(message, cStringToHostString(QR_CALL(qrBookErrorMessageW)(book), kEncodingAscii));
    QR_CALL(qrBookReleaseW)(book);
    return nullptr;
}

bool needLoad2Entries(bool raw, bool withMessage) {
    if (!QR_NEED(qrCreateBookCW)) return false;
    if (raw ? !QR_NEED(qrBookLoadRawW) : !QR_NEED(qrBookLoadW)) return false;
    if (!QR_NEED(qrBookReleaseW)) return false;
    return !withMessage || QR_NEED(qrBookErrorMessageW);
}

REALobject load2Path(const std::wstring& path, REALstring* message) {
    return wrapBook(loadEitherKind([&](BookHandle book) { return QR_CALL(qrBookLoadW)(book, path.c_str()) != 0; }, message));
}

REALobject load2Bytes(const HostBytes& bytes, REALstring* message) {
    return wrapBook(loadEitherKind(
        [&](BookHandle book) { return QR_CALL(qrBookLoadRawW)(book, bytes.data(), bytes.size()) != 0; }, message));
}

// The version number of the library, through a temporary book; false when none can be made.
bool libraryVersion(int& version) {
    if (!QR_NEED(qrCreateBookCW) || !QR_NEED(qrBookVersionW) || !QR_NEED(qrBookReleaseW)) return false;
    BookHandle book = QR_CALL(qrCreateBookCW)();
    if (!book) return false;
    version = QR_CALL(qrBookVersionW)(book);
    QR_CALL(qrBookReleaseW)(book);
    return true;
}

RBBoolean loadLibrary(const std::string& path) {
    clearExternalLibraryError();
    return hostBool(loadExternalLibrary(path));
}

}  // namespace

RBBoolean bookLoadLibraryString(REALstring path) {
    if (debugging()) debugLine("rbLoadLibraryS");
    HostText text(path);
    return loadLibrary(wideToUtf8(text.wide()));
}

RBBoolean bookLoadLibraryFolder(REALobject file) {
    if (debugging()) debugLine("rbLoadLibraryF");
    std::wstring path;
    if (!folderItemPath(file, path)) {
        clearExternalLibraryError();
        return false;
    }
    return loadLibrary(wideToUtf8(path.c_str()));
}

REALstring bookLoadError() {
    const std::string& text = externalLibraryError();
    return text.empty() ? nullptr : cStringToHostString(text.c_str(), kEncodingUtf8);
}

RBBoolean bookAvailable() { return hostBool(functions().qrBookVersionW != nullptr); }

REALobject bookLoad2String(REALstring path) {
    if (!needLoad2Entries(false, false)) return nullptr;
    return load2Path(HostText(path).wide(), nullptr);
}

REALobject bookLoad2Folder(REALobject path) {
    if (!needLoad2Entries(false, false)) return nullptr;
    if (!requireArgument(path, "value", "path is nil")) return nullptr;
    std::wstring native;
    folderItemPath(path, native);
    return load2Path(native, nullptr);
}

REALobject bookLoadRaw2String(REALstring data) {
    if (!needLoad2Entries(true, false)) return nullptr;
    return load2Bytes(HostBytes::fromString(data), nullptr);
}

REALobject bookLoadRaw2Block(REALobject data) {
    if (!needLoad2Entries(true, false)) return nullptr;
    if (!requireArgument(data, "value", "memoryblock is nil")) return nullptr;
    return load2Bytes(HostBytes::fromMemoryBlock(data), nullptr);
}

REALobject bookLoad2StringMessage(REALstring path, REALstring* message) {
    if (!needLoad2Entries(false, true)) return nullptr;
    return load2Path(HostText(path).wide(), message);
}

REALobject bookLoad2FolderMessage(REALobject path, REALstring* message) {
    if (!needLoad2Entries(false, true)) return nullptr;
    if (!requireArgument(path, "value", "path is nil")) return nullptr;
    std::wstring native;
    folderItemPath(path, native);
    return load2Path(native, message);
}

REALobject bookLoadRaw2StringMessage(REALstring data, REALstring* message) {
    if (!needLoad2Entries(true, true)) return nullptr;
    return load2Bytes(HostBytes::fromString(data), message);
}

REALobject bookLoadRaw2BlockMessage(REALobject data, REALstring* message) {
    if (!needLoad2Entries(true, true)) return nullptr;
    if (!requireArgument(data, "value", "memoryblock is nil")) return nullptr;
    return load2Bytes(HostBytes::fromMemoryBlock(data), message);
}

REALstring bookLibVersion() {
    int v = 0;
    if (!libraryVersion(v)) return nullptr;
    char text[20];
    std::snprintf(text, sizeof text, "%d.%d.%d.%d", (v >> 24) & 0xFF, (v >> 16) & 0xFF, (v >> 8) & 0xFF, v & 0xFF);
    return cStringToHostString(text, kEncodingAscii);
}

RBInteger bookLibVersionNumber() {
    int v = 0;
    return libraryVersion(v) ? v : 0;
}

}  // namespace quire_plugin
