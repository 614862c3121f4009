// QrBookKit: loading and saving, to files and to memory, on the host thread or on a worker.
#include "book_methods.h"

#include <string>

#include "glue.h"
#include "host_binary.h"
#include "worker_call.h"

namespace quire_plugin {

namespace {

BookHandle bookOf(REALobject self) { return bookHandleOf(self); }

// The path of a folder-item argument; false after raising for a nil item.
bool folderPath(REALobject item, std::wstring& path, const char* label = "value") {
    if (!requireArgument(item, label, "path is nil")) return false;
    folderItemPath(item, path);
    return true;
}

RBBoolean loadPartially(REALobject self, const wchar_t* path, RBInteger sheet, RBInteger first, RBInteger last) {
    return hostBool(QR_CALL(qrBookLoadPartiallyW)(bookOf(self), path, static_cast<int>(sheet), static_cast<int>(first),
                                                  static_cast<int>(last)));
}

RBBoolean saveRawInto(REALobject self, REALstring* stringOut, REALobject* blockOut, bool onWorker) {
    if (stringOut) assignString(stringOut, nullptr);
    if (blockOut) assignObject(blockOut, nullptr);
    if (!QR_NEED(qrBookSaveRawW) || !requireHandle(bookOf(self))) return false;
    const char* data = nullptr;
    unsigned size = 0;
    bool saved;
    if (onWorker) {
        WorkerJob job;
        job.kind = WorkerJob::Kind::Save;
        job.book = bookOf(self);
        saved = runOnWorkerThread(job);
        data = job.data;
        size = job.size;
    } else {
        saved = QR_CALL(qrBookSaveRawW)(bookOf(self), &data, &size) != 0;
    }
    if (saved && data && size > 0) {
        if (stringOut) assignString(stringOut, binaryToHostString(data, size));
        if (blockOut) assignObject(blockOut, memoryBlockFromBytes(data, size));
    }
    return hostBool(saved);
}

RBBoolean runJob(REALobject self, WorkerJob& job) {
    job.book = bookOf(self);
    return hostBool(runOnWorkerThread(job));
}

}  // namespace

RBBoolean bookLoadRawPartiallyString(REALobject self, REALstring data, RBInteger sheet, RBInteger first, RBInteger last) {
    if (!QR_NEED(qrBookLoadRawPartiallyW) || !requireHandle(bookOf(self))) return false;
    HostBytes bytes = HostBytes::fromString(data);
    return hostBool(QR_CALL(qrBookLoadRawPartiallyW)(bookOf(self), bytes.data(), bytes.size(), static_cast<int>(sheet),
                                                     static_cast<int>(first), static_cast<int>(last)));
}

RBBoolean bookLoadRawPartiallyBlock(REALobject self, REALobject data, RBInteger sheet, RBInteger first, RBInteger last) {
    if (!QR_NEED(qrBookLoadRawPartiallyW) || !requireHandle(bookOf(self))) return false;
    HostBytes bytes = HostBytes::fromMemoryBlock(data);
    return hostBool(QR_CALL(qrBookLoadRawPartiallyW)(bookOf(self), bytes.data(), bytes.size(), static_cast<int>(sheet),
                                                     static_cast<int>(first), static_cast<int>(last)));
}

RBBoolean bookLoadPartiallyString(REALobject self, REALstring path, RBInteger sheet, RBInteger first, RBInteger last) {
    if (!QR_NEED(qrBookLoadPartiallyW) || !requireHandle(bookOf(self))) return false;
    HostText text(path);
    return loadPartially(self, text.wide(), sheet, first, last);
}

RBBoolean bookLoadPartiallyFolder(REALobject self, REALobject path, RBInteger sheet, RBInteger first, RBInteger last) {
    if (!QR_NEED(qrBookLoadPartiallyW) || !requireHandle(bookOf(self))) return false;
    std::wstring native;
    if (!folderPath(path, native)) return false;
    return loadPartially(self, native.c_str(), sheet, first, last);
}

RBBoolean bookLoadPartiallyTempString(REALobject self, REALstring path, RBInteger sheet, RBInteger first, RBInteger last,
                                      REALstring tempFile) {
    if (!QR_NEED(qrBookLoadPartiallyUsingTempFileW) || !requireHandle(bookOf(self))) return false;
    HostText text(path), temp(tempFile);
    return hostBool(QR_CALL(qrBookLoadPartiallyUsingTempFileW)(bookOf(self), text.wide(), static_cast<int>(sheet),
                                                               static_cast<int>(first), static_cast<int>(last), temp.wide()));
}

RBBoolean bookLoadPartiallyTempFolder(REALobject self, REALobject path, RBInteger sheet, RBInteger first, RBInteger last,
                                      REALobject tempFile) {
    if (!QR_NEED(qrBookLoadPartiallyUsingTempFileW) || !requireHandle(bookOf(self))) return false;
    std::wstring native, temp;
    if (!folderPath(path, native) || !folderPath(tempFile, temp, "file")) return false;
    return hostBool(QR_CALL(qrBookLoadPartiallyUsingTempFileW)(bookOf(self), native.c_str(), static_cast<int>(sheet),
                                                               static_cast<int>(first), static_cast<int>(last), temp.c_str()));
}

RBBoolean bookSaveTempString(REALobject self, REALstring path, RBBoolean useTempFile) {
    if (!QR_NEED(qrBookSaveUsingTempFileW) || !requireHandle(bookOf(self))) return false;
    HostText text(path);
    return hostBool(QR_CALL(qrBookSaveUsingTempFileW)(bookOf(self), text.wide(), useTempFile ? 1 : 0));
}

RBBoolean bookSaveTempFolder(REALobject self, REALobject path, RBBoolean useTempFile) {
    if (!QR_NEED(qrBookSaveUsingTempFileW) || !requireHandle(bookOf(self))) return false;
    std::wstring native;
    if (!folderPath(path, native)) return false;
    return hostBool(QR_CALL(qrBookSaveUsingTempFileW)(bookOf(self), native.c_str(), useTempFile ? 1 : 0));
}

RBBoolean bookLoadTempString(REALobject self, REALstring path, REALstring tempFile) {
    if (!QR_NEED(qrBookLoadUsingTempFileW) || !requireHandle(bookOf(self))) return false;
    HostText text(path), temp(tempFile);
    return hostBool(QR_CALL(qrBookLoadUsingTempFileW)(bookOf(self), text.wide(), temp.wide()));
}

RBBoolean bookLoadTempFolder(REALobject self, REALobject path, REALobject tempFile) {
    if (!QR_NEED(qrBookLoadUsingTempFileW) || !requireHandle(bookOf(self))) return false;
    std::wstring native, temp;
    if (!folderPath(path, native) || !folderPath(tempFile, temp, "file")) return false;
    return hostBool(QR_CALL(qrBookLoadUsingTempFileW)(bookOf(self), native.c_str(), temp.c_str()));
}

RBBoolean bookSaveString(REALobject self, REALstring path) {
    if (!QR_NEED(qrBookSaveW) || !requireHandle(bookOf(self))) return false;
    HostText text(path);
    return hostBool(QR_CALL(qrBookSaveW)(bookOf(self), text.wide()));
}

RBBoolean bookSaveFolder(REALobject self, REALobject path) {
    if (!QR_NEED(qrBookSaveW) || !requireHandle(bookOf(self))) return false;
    std::wstring native;
    if (!folderPath(path, native)) return false;
    return hostBool(QR_CALL(qrBookSaveW)(bookOf(self), native.c_str()));
}

RBBoolean bookLoadString(REALobject self, REALstring path) {
    if (!QR_NEED(qrBookLoadW) || !requireHandle(bookOf(self))) return false;
    HostText text(path);
    return hostBool(QR_CALL(qrBookLoadW)(bookOf(self), text.wide()));
}

RBBoolean bookLoadFolder(REALobject self, REALobject path) {
    if (!QR_NEED(qrBookLoadW) || !requireHandle(bookOf(self))) return false;
    std::wstring native;
    if (!folderPath(path, native)) return false;
    return hostBool(QR_CALL(qrBookLoadW)(bookOf(self), native.c_str()));
}

RBBoolean bookSaveRawString(REALobject self, REALstring* data) { return saveRawInto(self, data, nullptr, false); }
RBBoolean bookSaveRawBlock(REALobject self, REALobject* data) { return saveRawInto(self, nullptr, data, false); }

RBBoolean bookLoadRawString(REALobject self, REALstring data) {
    if (!QR_NEED(qrBookLoadRawW) || !requireHandle(bookOf(self))) return false;
    HostBytes bytes = HostBytes::fromString(data);
    return hostBool(QR_CALL(qrBookLoadRawW)(bookOf(self), bytes.data(), bytes.size()));
}

RBBoolean bookLoadRawBlock(REALobject self, REALobject data) {
    if (!QR_NEED(qrBookLoadRawW) || !requireHandle(bookOf(self))) return false;
    HostBytes bytes = HostBytes::fromMemoryBlock(data);
    return hostBool(QR_CALL(qrBookLoadRawW)(bookOf(self), bytes.data(), bytes.size()));
}

RBBoolean bookSaveMTString(REALobject self, REALstring path) {
    if (!QR_NEED(qrBookSaveW) || !requireHandle(bookOf(self))) return false;
    WorkerJob job;
    job.kind = WorkerJob::Kind::Save;
    job.hasPath = true;
    job.path = HostText(path).wide();
    return runJob(self, job);
}

RBBoolean bookSaveMTFolder(REALobject self, REALobject path) {
    if (!QR_NEED(qrBookSaveW) || !requireHandle(bookOf(self))) return false;
    WorkerJob job;
    job.kind = WorkerJob::Kind::Save;
    job.hasPath = true;
    if (!folderPath(path, job.path)) return false;
    return runJob(self, job);
}

RBBoolean bookLoadMTString(REALobject self, REALstring path) {
    if (!QR_NEED(qrBookLoadW) || !requireHandle(bookOf(self))) return false;
    WorkerJob job;
    job.hasPath = true;
    job.path = HostText(path).wide();
    return runJob(self, job);
}

RBBoolean bookLoadMTFolder(REALobject self, REALobject path) {
    if (!QR_NEED(qrBookLoadW) || !requireHandle(bookOf(self))) return false;
    WorkerJob job;
    job.hasPath = true;
    if (!folderPath(path, job.path)) return false;
    return runJob(self, job);
}

RBBoolean bookSaveRawMTString(REALobject self, REALstring* data) { return saveRawInto(self, data, nullptr, true); }
RBBoolean bookSaveRawMTBlock(REALobject self, REALobject* data) { return saveRawInto(self, nullptr, data, true); }

RBBoolean bookLoadRawMTString(REALobject self, REALstring data) {
    if (!QR_NEED(qrBookLoadRawW) || !requireHandle(bookOf(self))) return false;
    HostBytes bytes = HostBytes::fromString(data);
    WorkerJob job;
    job.data = bytes.data();
    job.size = bytes.size();
    return runJob(self, job);
}

RBBoolean bookLoadRawMTBlock(REALobject self, REALobject data) {
    if (!QR_NEED(qrBookLoadRawW) || !requireHandle(bookOf(self))) return false;
    HostBytes bytes = HostBytes::fromMemoryBlock(data);
    WorkerJob job;
    job.data = bytes.data();
    job.size = bytes.size();
    return runJob(self, job);
}

}  // namespace quire_plugin
