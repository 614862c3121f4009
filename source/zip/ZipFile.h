// CZipFile: a disk file under an archive, opened by path for reading or
// created (truncated) for writing.
#pragma once

#include "ZipAbstractFile.h"

namespace quire::zip {

class CZipFile final : public CZipAbstractFile {
public:
    enum class Mode { readOnly, create };

    CZipFile() = default;
    CZipFile(const std::string& path, Mode mode) { open(path, mode); }
    ~CZipFile() override;

    void open(const std::string& path, Mode mode);

    std::size_t read(void* buffer, std::size_t size) override;
    void write(const void* data, std::size_t size) override;
    void seek(std::uint64_t position) override;
    std::uint64_t position() const override { return m_position; }
    std::uint64_t length() const override;
    void setLength(std::uint64_t length) override;
    void flush() override;
    void close() override;
    // Closes without reporting errors, for a file that is being discarded.
    void abandon() noexcept;
    bool isClosed() const override { return m_descriptor < 0; }
    std::string filePath() const override { return m_path; }

private:
    [[noreturn]] void throwSystemError() const;
    void requireOpen() const;

    int m_descriptor = -1;
    std::uint64_t m_position = 0;
    std::string m_path;
};

} // namespace quire::zip
