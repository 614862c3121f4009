#pragma once
// Library calls on a worker thread: the calling host thread keeps yielding to the host while one
// thread with a 2 MiB stack runs the call.
#include <quire.h>

#include <string>

namespace quire_plugin {

struct WorkerJob {
    enum class Kind { Load, Save };
    Kind kind = Kind::Load;
    BookHandle book = nullptr;
    bool hasPath = false;
    std::wstring path;
    // Load: the bytes to load from. Save to memory: the book's buffer afterwards.
    const char* data = nullptr;
    unsigned size = 0;
    bool result = false;
};

// Runs the job; false when the thread cannot be started.
bool runOnWorkerThread(WorkerJob& job);

}  // namespace quire_plugin
