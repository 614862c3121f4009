#include "debug_log.h"

#include <atomic>
#include <cstdarg>
#include <cstdio>

#include "host_api.h"
#include "host_strings.h"
#include "unicode.h"

namespace quire_plugin {

namespace {
std::atomic<bool> debugFlag{false};

void emit(const char* text) {
    using Sink = void (*)(const char*);
    if (auto sink = reinterpret_cast<Sink>(resolveHostFunction("QuireDebugSink"))) {
        sink(text);
        return;
    }
    std::fprintf(stderr, "%s\n", text);
}
}  // namespace

bool debugging() { return debugFlag.load(); }
void setDebugging(bool on) { debugFlag.store(on); }

void debugWrite(const char* format, ...) {
    char buffer[4096] = {};
    va_list args;
    va_start(args, format);
    std::vsnprintf(buffer, sizeof buffer, format, args);
    va_end(args);
    emit(buffer);
}

void debugLine(const char* label) { debugWrite("Kit Debug: %s", label); }
void debugLine(const char* label, long long value) { debugWrite("Kit Debug: %s %lld", label, value); }
void debugLine(const char* label, int a) { debugWrite("Kit Debug: %s %d", label, a); }
void debugLine(const char* label, int a, int b) { debugWrite("Kit Debug: %s %d, %d", label, a, b); }
void debugLine(const char* label, int a, int b, int c) {
    debugWrite("Kit Debug: %s %d, %d, %d", label, a, b, c);
}
void debugLine(const char* label, int a, int b, int c, int d, int e, int f) {
    debugWrite("Kit Debug: %s %d, %d, %d, %d, %d, %d", label, a, b, c, d, e, f);
}
void debugLine(const char* label, int a, int b, int c, int d, int e, int f, int g) {
    debugWrite("Kit Debug: %s %d, %d, %d, %d, %d, %d, %d", label, a, b, c, d, e, f, g);
}
void debugLine(const char* label, unsigned value) { debugWrite("Kit Debug: %s %u", label, value); }
void debugLine(const char* label, double value) { debugWrite("Kit Debug: %s %f", label, value); }
void debugLine(const char* label, const void* a, const void* b) {
    debugWrite("Kit Debug: %s %p, %p", label, a, b);
}
void debugLine(const char* label, const void* value) { debugWrite("Kit Debug: %s %p", label, value); }
void debugLine(const char* label, const char* a, const char* b) {
    debugWrite("Kit Debug: %s %s, %s", label, a ? a : "", b ? b : "");
}
void debugLine(const char* label, const char* text) {
    debugWrite("Kit Debug: %s %s", label, text ? text : "");
}
void debugLine(const char* label, const wchar_t* text) {
    // Converted here rather than by "%ls", which fails on characters outside the C locale.
    debugWrite("Kit Debug: %s %s", label, wideToUtf8(text).c_str());
}
void debugLine(const char* label, REALstring text) {
    HostText converted(text);
    debugWrite("Kit Debug: %s %p: %s", label, static_cast<const void*>(text), converted.utf8().c_str());
}

}  // namespace quire_plugin
