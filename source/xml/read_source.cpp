#include "lmx/read_source.h"

#include <cstdio>
#include <memory>

namespace lmx {

void c_read::set_range(const char* begin, const char* end, bool open)
{
    begin_ = begin;
    end_ = end;
    cursor_ = begin;
    open_ = open;
}

int c_read::get()
{
    if (cursor_ >= end_)
        return -1;
    const int c = static_cast<unsigned char>(*cursor_++);
    if (c == '\n' || (c == '\r' && (cursor_ == end_ || *cursor_ != '\n')))
        ++line_;
    return c;
}

c_read_memory::c_read_memory(const void* data, std::size_t size)
{
    const char* begin = static_cast<const char*>(data);
    set_range(begin, begin ? begin + size : begin, begin != nullptr || size == 0);
}

c_read_file::c_read_file(const std::string& path)
{
    struct file_closer {
        void operator()(std::FILE* file) const { std::fclose(file); }
    };
    std::unique_ptr<std::FILE, file_closer> file(std::fopen(path.c_str(), "rb"));
    if (!file) {
        set_range(nullptr, nullptr, false);
        return;
    }
    // Read in blocks rather than trusting a size taken beforehand: the file
    // may be a pipe or change while it is read.
    constexpr std::size_t block = 1 << 16;
    std::size_t used = 0;
    for (;;) {
        contents_.resize(used + block);
        const std::size_t got = std::fread(contents_.data() + used, 1, block, file.get());
        used += got;
        if (got < block)
            break;
    }
    const bool failed = std::ferror(file.get()) != 0;
    contents_.resize(used);
    set_range(contents_.data(), contents_.data() + used, !failed);
}

}  // namespace lmx
