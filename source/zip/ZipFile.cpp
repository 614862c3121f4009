#include "ZipFile.h"

#include "ZipException.h"

#include <cerrno>
#include <fcntl.h>
#include <sys/stat.h>
#include <unistd.h>

namespace quire::zip {

CZipFile::~CZipFile()
{
    abandon();
}

void CZipFile::abandon() noexcept
{
    if (m_descriptor >= 0)
        ::close(m_descriptor);
    m_descriptor = -1;
}

void CZipFile::open(const std::string& path, Mode mode)
{
    if (m_descriptor >= 0)
        close();
    m_path = path;
    m_position = 0;
    const int flags = mode == Mode::readOnly ? O_RDONLY : (O_RDWR | O_CREAT | O_TRUNC);
    do {
        m_descriptor = ::open(path.c_str(), flags | O_CLOEXEC, 0666);
    } while (m_descriptor < 0 && errno == EINTR);
    if (m_descriptor < 0)
        throwSystemError();
    struct stat info {};
    if (::fstat(m_descriptor, &info) == 0 && S_ISDIR(info.st_mode)) {
        ::close(m_descriptor);
        m_descriptor = -1;
        throw CZipException(EISDIR, m_path);
    }
}

void CZipFile::throwSystemError() const
{
    throw CZipException(CZipException::fromErrno(errno), m_path);
}

void CZipFile::requireOpen() const
{
    if (m_descriptor < 0)
        throw CZipException(EBADF, m_path);
}

std::size_t CZipFile::read(void* buffer, std::size_t size)
{
    requireOpen();
    auto* out = static_cast<unsigned char*>(buffer);
    std::size_t done = 0;
    while (done < size) {
        const ssize_t got = ::pread(m_descriptor, out + done, size - done, static_cast<off_t>(m_position));
        if (got < 0) {
            if (errno == EINTR)
                continue;
            throwSystemError();
        }
        if (got == 0)
            break;
        done += static_cast<std::size_t>(got);
        m_position += static_cast<std::uint64_t>(got);
    }
    return done;
}

void CZipFile::write(const void* data, std::size_t size)
{
    requireOpen();
    const auto* in = static_cast<const unsigned char*>(data);
    std::size_t done = 0;
    while (done < size) {
        const ssize_t put = ::pwrite(m_descriptor, in + done, size - done, static_cast<off_t>(m_position));
        if (put < 0) {
            if (errno == EINTR)
                continue;
            throwSystemError();
        }
        done += static_cast<std::size_t>(put);
        m_position += static_cast<std::uint64_t>(put);
    }
}

void CZipFile::seek(std::uint64_t position)
{
    requireOpen();
    if (position > static_cast<std::uint64_t>(INT64_MAX))
        throw CZipException(EINVAL, m_path);
    m_position = position;
}

std::uint64_t CZipFile::length() const
{
    requireOpen();
    struct stat info {};
    if (::fstat(m_descriptor, &info) != 0)
        throwSystemError();
    return static_cast<std::uint64_t>(info.st_size);
}

void CZipFile::setLength(std::uint64_t length)
{
    requireOpen();
    if (::ftruncate(m_descriptor, static_cast<off_t>(length)) != 0)
        throwSystemError();
}

void CZipFile::flush()
{
    requireOpen();
    // Data goes straight to the kernel with pwrite; nothing is buffered here.
}

void CZipFile::close()
{
    if (m_descriptor < 0)
        return;
    const int descriptor = m_descriptor;
    m_descriptor = -1;
    if (::close(descriptor) != 0 && errno != EINTR)
        throwSystemError();
}

} // namespace quire::zip
