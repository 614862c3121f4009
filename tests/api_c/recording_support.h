#pragma once
// Support for the recording test doubles: the shared call log, how each argument type is
// written to it, the values written through out-parameters and the results returned.
#include <sstream>
#include <string>
#include <vector>

#include "api/IBookT.h"

namespace quire::recording {

// Every test double carries a label, which the log shows wherever the object is an argument.
class Labelled {
public:
    explicit Labelled(const char* label) : label_(label) {}
    virtual ~Labelled() = default;
    const char* label() const { return label_; }

private:
    const char* label_;
};

inline std::vector<std::string> calls;

// Objects handed out as results; the test fixture points them at its doubles.
inline IBook* resultBook = nullptr;
inline ISheet* resultSheet = nullptr;
inline IFormat* resultFormat = nullptr;
inline IFont* resultFont = nullptr;
inline IAutoFilter* resultAutoFilter = nullptr;
inline IFilterColumn* resultFilterColumn = nullptr;

// Results of operations, and what they write through out-parameters.
inline bool resultBool = true;
constexpr int kResultInt = 42;
constexpr double kResultDouble = 1.5;
inline const wchar_t* const kResultText = L"result";
inline const char* const kResultNarrowText = "message";
constexpr int kOutInt = 7;
inline bool outBool = true;
constexpr double kOutDouble = 2.5;
constexpr unsigned kOutUnsigned = 3;
inline const char* const kOutBytes = "bytes";
inline const wchar_t* const kOutText = L"out";

inline std::string describe(bool value) { return value ? "true" : "false"; }
inline std::string describe(int value) { return std::to_string(value); }
inline std::string describe(unsigned value) { return std::to_string(value) + "u"; }
inline std::string describe(double value) {
    std::ostringstream text;
    text << value;
    return text.str() + "d";
}
inline std::string describe(const wchar_t* text) {
    if (text == nullptr) return "null";
    std::string narrow = "L'";
    for (; *text != 0; ++text) narrow += static_cast<char>(*text);
    return narrow + "'";
}
inline std::string describe(const char* text) {
    return text == nullptr ? "null" : "'" + std::string(text) + "'";
}

// Out-parameters: "out" when given (and filled), "null" when not.
inline std::string describe(int* out) {
    if (out == nullptr) return "null";
    *out = kOutInt;
    return "out";
}
inline std::string describe(bool* out) {
    if (out == nullptr) return "null";
    *out = outBool;
    return "out";
}
inline std::string describe(double* out) {
    if (out == nullptr) return "null";
    *out = kOutDouble;
    return "out";
}
inline std::string describe(unsigned* out) {
    if (out == nullptr) return "null";
    *out = kOutUnsigned;
    return "out";
}
inline std::string describe(const char** out) {
    if (out == nullptr) return "null";
    *out = kOutBytes;
    return "out";
}
inline std::string describe(const wchar_t** out) {
    if (out == nullptr) return "null";
    *out = kOutText;
    return "out";
}
inline std::string describe(IFormat** out) {
    if (out == nullptr) return "null";
    *out = resultFormat;
    return "out";
}

// Objects passed in: their label.
template <class Interface>
std::string describe(Interface* object) {
    if (object == nullptr) return "null";
    const auto* labelled = dynamic_cast<const Labelled*>(object);
    return labelled != nullptr ? labelled->label() : "?";
}

template <class... Args>
void record(const char* operation, Args... args) {
    std::string call = operation;
    call += "(";
    if constexpr (sizeof...(Args) > 0) {
        const char* separator = "";
        ((call += separator, call += describe(args), separator = ","), ...);
    }
    call += ")";
    calls.push_back(call);
}

template <class T>
T cannedResult();
template <> inline bool cannedResult<bool>() { return resultBool; }
template <> inline int cannedResult<int>() { return kResultInt; }
template <> inline double cannedResult<double>() { return kResultDouble; }
template <> inline const wchar_t* cannedResult<const wchar_t*>() { return kResultText; }
template <> inline const char* cannedResult<const char*>() { return kResultNarrowText; }
template <> inline IBook* cannedResult<IBook*>() { return resultBook; }
template <> inline ISheet* cannedResult<ISheet*>() { return resultSheet; }
template <> inline IFormat* cannedResult<IFormat*>() { return resultFormat; }
template <> inline IFont* cannedResult<IFont*>() { return resultFont; }
template <> inline IAutoFilter* cannedResult<IAutoFilter*>() { return resultAutoFilter; }
template <> inline IFilterColumn* cannedResult<IFilterColumn*>() { return resultFilterColumn; }

}  // namespace quire::recording
