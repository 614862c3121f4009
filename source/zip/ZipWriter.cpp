#include "ZipWriter.h"

#include "ZipException.h"
#include "ZipNameCodec.h"

#include <filesystem>

namespace quire::zip {

void ZipWriter::create(const std::string& path)
{
    abandon();
    m_archive.open(path, CZipArchive::create);
    m_path = path;
    m_inMemory = false;
}

void ZipWriter::createInMemory()
{
    abandon();
    m_memFile.reserve(0);
    m_archive.open(m_memFile, CZipArchive::create);
    m_inMemory = true;
}

void ZipWriter::add(const std::string& utf8Name, const void* data, std::size_t size)
{
    add(utf8ToWide(utf8Name), data, size);
}

void ZipWriter::add(const std::wstring& name, const void* data, std::size_t size)
{
    CZipMemFile source;
    source.attachReadOnly(data, size);
    m_archive.addNewFile(source, name, -1, CZipArchive::defaultAddOptions, defaultTransferBufferSize);
}

void ZipWriter::addFile(const std::string& utf8Name, const std::string& sourcePath)
{
    addFile(utf8ToWide(utf8Name), sourcePath);
}

void ZipWriter::addFile(const std::wstring& name, const std::string& sourcePath)
{
    m_archive.addNewFile(sourcePath, name, -1, CZipArchive::defaultAddOptions, defaultTransferBufferSize);
}

void ZipWriter::openEntry(const std::string& utf8Name, int level)
{
    m_archive.openNewFile(utf8ToWide(utf8Name), level);
}

void ZipWriter::writeEntry(const void* data, std::size_t size)
{
    m_archive.writeNewFile(data, size);
}

void ZipWriter::closeEntry()
{
    m_archive.closeNewFile();
}

void ZipWriter::close()
{
    try {
        m_archive.close();
    } catch (...) {
        // The archive failed while being finished: what is on disk is unusable.
        if (!m_path.empty()) {
            std::error_code ignored;
            std::filesystem::remove(m_path, ignored);
        }
        abandon();
        throw;
    }
    m_path.clear();
}

void ZipWriter::abandon() noexcept
{
    const bool unfinished = !m_archive.isClosed();
    m_archive.abandon();
    if (unfinished && !m_path.empty()) {
        std::error_code ignored;
        std::filesystem::remove(m_path, ignored);
    }
    if (unfinished && m_inMemory)
        m_memFile.reserve(0);
    m_path.clear();
}

ZipBuffer ZipWriter::takeBuffer()
{
    if (!m_inMemory || isOpen())
        throw CZipException(CZipException::internalError);
    return m_memFile.detach();
}

} // namespace quire::zip
