#pragma once
#include <stdexcept>

// The library's exception: carries the text that becomes the book's message.
struct qrerror : std::runtime_error {
    using std::runtime_error::runtime_error;
};
