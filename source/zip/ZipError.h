// ZipError: failures of the reader and writer wrappers that are not archive
// errors with a code (an unusable entry size, memory exhaustion). what() is
// the message the caller reports.
#pragma once

#include <stdexcept>

namespace quire::zip {

class ZipError : public std::runtime_error {
public:
    using std::runtime_error::runtime_error;
};

} // namespace quire::zip
