#pragma once
#include <cstddef>
#include <string>
#include <vector>

namespace lmx {

// A whole input held as one contiguous byte range, so that the scanner can
// run over it without per-character calls. The cursor functions (one byte of
// look-ahead and a line count) serve callers that want to read bytes singly.
class c_read {
public:
    virtual ~c_read() = default;

    const char* data() const { return begin_; }
    std::size_t size() const { return static_cast<std::size_t>(end_ - begin_); }
    // False when the source could not be opened or read.
    bool is_open() const { return open_; }

    // -1 at the end of the input.
    int peek() const { return cursor_ < end_ ? static_cast<unsigned char>(*cursor_) : -1; }
    int get();
    // Lines end at LF, CR LF or a lone CR.
    int line() const { return line_; }

protected:
    void set_range(const char* begin, const char* end, bool open);

private:
    const char* begin_ = nullptr;
    const char* end_ = nullptr;
    const char* cursor_ = nullptr;
    int line_ = 1;
    bool open_ = false;
};

// Reads a buffer owned by the caller, which must outlive the read; no copy.
class c_read_memory : public c_read {
public:
    c_read_memory(const void* data, std::size_t size);
};

// Reads a named file whole into memory.
class c_read_file : public c_read {
public:
    explicit c_read_file(const std::string& path);

private:
    std::vector<char> contents_;
};

}  // namespace lmx
