#pragma once
// The debug log: lines for the system debugger output. The host may offer a sink of its own under
// the name "QuireDebugSink" (a function taking the text); without one the lines go to stderr.
#include "host_sdk.h"

namespace quire_plugin {

// The shared property QrBookKit.Debugging.
bool debugging();
void setDebugging(bool on);

// Formats into a buffer of 4096 bytes (longer text is cut) and writes it unchanged.
void debugWrite(const char* format, ...) __attribute__((format(printf, 1, 2)));

// "Kit Debug: " lines with a label and values; callers write them while debugging() is true.
void debugLine(const char* label);
void debugLine(const char* label, long long value);
void debugLine(const char* label, int a);
void debugLine(const char* label, int a, int b);
void debugLine(const char* label, int a, int b, int c);
void debugLine(const char* label, int a, int b, int c, int d, int e, int f);
void debugLine(const char* label, int a, int b, int c, int d, int e, int f, int g);
void debugLine(const char* label, unsigned value);
void debugLine(const char* label, double value);
void debugLine(const char* label, const void* a, const void* b);
void debugLine(const char* label, const void* value);
void debugLine(const char* label, const char* a, const char* b);
void debugLine(const char* label, const char* text);
void debugLine(const char* label, const wchar_t* text);
// "%p: %s": the host string's address and its text as UTF-8.
void debugLine(const char* label, REALstring text);

}  // namespace quire_plugin
