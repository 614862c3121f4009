#include "worker_call.h"

#include <pthread.h>

#include <chrono>
#include <mutex>
#include <thread>

#include "function_table.h"
#include "host_api.h"

namespace quire_plugin {

namespace {

constexpr size_t kWorkerStackSize = 0x200000;

struct WorkerState {
    WorkerJob* job;
    FunctionTable table;  // the entries as they were when the call began
    std::mutex mutex;
    bool done = false;
};

void runJob(WorkerJob& job, const FunctionTable& table) {
    if (job.kind == WorkerJob::Kind::Save) {
        if (job.hasPath) {
            job.result = table.qrBookSaveW(job.book, job.path.c_str()) != 0;
        } else {
            const char* data = nullptr;
            unsigned size = 0;
            job.result = table.qrBookSaveRawW(job.book, &data, &size) != 0;
            job.data = data;
            job.size = size;
        }
        return;
    }
    if (job.hasPath) job.result = table.qrBookLoadW(job.book, job.path.c_str()) != 0;
    if (job.data) job.result = table.qrBookLoadRawW(job.book, job.data, job.size) != 0;
}

void* workerMain(void* argument) {
    auto* state = static_cast<WorkerState*>(argument);
    runJob(*state->job, state->table);
    std::lock_guard<std::mutex> lock(state->mutex);
    state->done = true;
    return nullptr;
}

bool isDone(WorkerState& state) {
    std::lock_guard<std::mutex> lock(state.mutex);
    return state.done;
}

}  // namespace

bool runOnWorkerThread(WorkerJob& job) {
    job.result = false;
    WorkerState state{&job, functions(), {}, false};
    pthread_attr_t attributes;
    if (pthread_attr_init(&attributes) != 0) return false;
    pthread_attr_setstacksize(&attributes, kWorkerStackSize);
    pthread_t thread;
    int started = pthread_create(&thread, &attributes, workerMain, &state);
    pthread_attr_destroy(&attributes);
    if (started != 0) return false;
    yieldToHost();
    while (!isDone(state)) {
        yieldToHost();
        std::this_thread::sleep_for(std::chrono::milliseconds(1));
    }
    pthread_join(thread, nullptr);
    return job.result;
}

}  // namespace quire_plugin
