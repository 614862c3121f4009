#pragma once
#include <clocale>
#include <string>

namespace quire {

// Numbers in Open XML parts use "." whatever the process locale: the numeric category is
// "C" while a package is read or written, and restored afterwards.
class NumericLocaleC {
public:
    NumericLocaleC() {
        if (const char* current = std::setlocale(LC_NUMERIC, nullptr)) previous_ = current;
        std::setlocale(LC_NUMERIC, "C");
    }
    ~NumericLocaleC() {
        if (!previous_.empty()) std::setlocale(LC_NUMERIC, previous_.c_str());
    }
    NumericLocaleC(const NumericLocaleC&) = delete;
    NumericLocaleC& operator=(const NumericLocaleC&) = delete;

private:
    std::string previous_;
};

}  // namespace quire
