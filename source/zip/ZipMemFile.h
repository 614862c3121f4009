// CZipMemFile: archive storage in memory. It either owns a growable buffer
// (for writing; capacity grows in whole steps of the growth size) or is
// attached to a caller's buffer that it neither copies nor frees: read-only,
// or writable up to a fixed capacity.
#pragma once

#include "ZipAbstractFile.h"
#include "ZipBuffer.h"

namespace quire::zip {

class CZipMemFile final : public CZipAbstractFile {
public:
    static constexpr std::size_t defaultGrowth = 1024;

    explicit CZipMemFile(std::size_t growth = defaultGrowth);
    ~CZipMemFile() override;

    // Reads from the caller's buffer, which must outlive this file or the next attach.
    void attachReadOnly(const void* data, std::size_t size);
    // Writes into the caller's buffer, at most capacity bytes; length starts at 0.
    void attachWritable(void* data, std::size_t capacity);
    // Reserves an owned buffer of exactly capacity bytes; throws std::bad_alloc.
    void reserve(std::size_t capacity);
    // Hands the owned buffer to the caller and leaves this file empty.
    ZipBuffer detach();

    const unsigned char* data() const { return m_data; }
    std::size_t capacity() const { return m_capacity; }
    bool ownsBuffer() const { return m_owned; }

    std::size_t read(void* buffer, std::size_t size) override;
    void write(const void* data, std::size_t size) override;
    void seek(std::uint64_t position) override;
    std::uint64_t position() const override { return m_position; }
    std::uint64_t length() const override { return m_length; }
    void setLength(std::uint64_t length) override;
    void close() override;
    bool isClosed() const override { return false; }

private:
    void release();
    void ensureCapacity(std::size_t required);

    unsigned char* m_data = nullptr;
    std::size_t m_length = 0;
    std::size_t m_position = 0;
    std::size_t m_capacity = 0;
    std::size_t m_growth;
    bool m_owned = true;
    bool m_readOnly = false;
};

} // namespace quire::zip
