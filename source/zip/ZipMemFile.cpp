#include "ZipMemFile.h"

#include "ZipException.h"

#include <algorithm>
#include <cerrno>
#include <cstdint>
#include <cstdlib>
#include <cstring>
#include <new>

namespace quire::zip {

CZipMemFile::CZipMemFile(std::size_t growth) : m_growth(growth == 0 ? defaultGrowth : growth) {}

CZipMemFile::~CZipMemFile()
{
    release();
}

void CZipMemFile::release()
{
    if (m_owned)
        std::free(m_data);
    m_data = nullptr;
    m_length = m_position = m_capacity = 0;
    m_owned = true;
    m_readOnly = false;
}

void CZipMemFile::attachReadOnly(const void* data, std::size_t size)
{
    release();
    // The buffer is never written through this pointer: m_readOnly guards it.
    m_data = static_cast<unsigned char*>(const_cast<void*>(data));
    m_length = m_capacity = data ? size : 0;
    m_owned = false;
    m_readOnly = true;
}

void CZipMemFile::attachWritable(void* data, std::size_t capacity)
{
    release();
    m_data = static_cast<unsigned char*>(data);
    m_capacity = data ? capacity : 0;
    m_owned = false;
}

void CZipMemFile::reserve(std::size_t capacity)
{
    release();
    if (capacity == 0)
        return;
    m_data = static_cast<unsigned char*>(std::malloc(capacity));
    if (!m_data)
        throw std::bad_alloc();
    m_capacity = capacity;
}

ZipBuffer CZipMemFile::detach()
{
    if (!m_owned)
        throw CZipException(CZipException::internalError);
    ZipBuffer buffer(m_data, m_length);
    m_data = nullptr;
    release();
    return buffer;
}

void CZipMemFile::ensureCapacity(std::size_t required)
{
    if (required <= m_capacity)
        return;
    if (!m_owned)
        throw CZipException(ENOSPC);
    // Grow geometrically, in whole growth steps, so that writing a large
    // archive copies each byte a bounded number of times.
    std::size_t wanted = m_capacity + m_capacity / 2;
    if (wanted < required)
        wanted = required;
    const std::size_t steps = wanted / m_growth + (wanted % m_growth != 0);
    if (steps > SIZE_MAX / m_growth)
        throw CZipException(ENOMEM);
    wanted = steps * m_growth;
    auto* grown = static_cast<unsigned char*>(std::realloc(m_data, wanted));
    if (!grown)
        throw CZipException(ENOMEM);
    m_data = grown;
    m_capacity = wanted;
}

std::size_t CZipMemFile::read(void* buffer, std::size_t size)
{
    if (m_position >= m_length)
        return 0;
    const std::size_t count = std::min(size, m_length - m_position);
    std::memcpy(buffer, m_data + m_position, count);
    m_position += count;
    return count;
}

void CZipMemFile::write(const void* data, std::size_t size)
{
    if (m_readOnly)
        throw CZipException(EBADF);
    if (size == 0)
        return;
    if (size > SIZE_MAX - m_position)
        throw CZipException(ENOMEM);
    const std::size_t end = m_position + size;
    ensureCapacity(end);
    if (m_position > m_length)
        std::memset(m_data + m_length, 0, m_position - m_length);
    std::memcpy(m_data + m_position, data, size);
    m_position = end;
    if (end > m_length)
        m_length = end;
}

void CZipMemFile::seek(std::uint64_t position)
{
    if (position > SIZE_MAX)
        throw CZipException(EINVAL);
    m_position = static_cast<std::size_t>(position);
}

void CZipMemFile::setLength(std::uint64_t length)
{
    if (m_readOnly)
        throw CZipException(EBADF);
    if (length > SIZE_MAX)
        throw CZipException(ENOMEM);
    const auto newLength = static_cast<std::size_t>(length);
    ensureCapacity(newLength);
    if (newLength > m_length)
        std::memset(m_data + m_length, 0, newLength - m_length);
    m_length = newLength;
    if (m_position > m_length)
        m_position = m_length;
}

void CZipMemFile::close()
{
    // The contents stay available until detach() or destruction.
    m_position = 0;
}

} // namespace quire::zip
