#include "ZipAbstractFile.h"

#include "ZipException.h"

namespace quire::zip {

void CZipAbstractFile::readExactly(void* buffer, std::size_t size, int errorCode)
{
    if (read(buffer, size) != size)
        throw CZipException(errorCode, filePath());
}

} // namespace quire::zip
