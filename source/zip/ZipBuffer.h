// ZipBuffer: a byte buffer handed from the ZIP layer to its caller. The
// memory comes from std::malloc; release() gives up ownership, after which the
// caller frees it with std::free.
#pragma once

#include <cstddef>
#include <cstdlib>
#include <utility>

namespace quire::zip {

class ZipBuffer {
public:
    ZipBuffer() = default;
    ZipBuffer(unsigned char* data, std::size_t size) : m_data(data), m_size(size) {}
    ZipBuffer(ZipBuffer&& other) noexcept
        : m_data(std::exchange(other.m_data, nullptr)), m_size(std::exchange(other.m_size, 0)) {}
    ZipBuffer& operator=(ZipBuffer&& other) noexcept
    {
        if (this != &other) {
            std::free(m_data);
            m_data = std::exchange(other.m_data, nullptr);
            m_size = std::exchange(other.m_size, 0);
        }
        return *this;
    }
    ZipBuffer(const ZipBuffer&) = delete;
    ZipBuffer& operator=(const ZipBuffer&) = delete;
    ~ZipBuffer() { std::free(m_data); }

    const unsigned char* data() const { return m_data; }
    unsigned char* data() { return m_data; }
    std::size_t size() const { return m_size; }
    bool empty() const { return m_size == 0; }

    unsigned char* release()
    {
        m_size = 0;
        return std::exchange(m_data, nullptr);
    }

private:
    unsigned char* m_data = nullptr;
    std::size_t m_size = 0;
};

} // namespace quire::zip
