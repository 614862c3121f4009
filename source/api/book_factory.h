#pragma once
#include "IBookT.h"

namespace quire {

// Creates a new empty binary (.xls) book; null when memory cannot be obtained.
IBook* createBinaryBook() noexcept;

}  // namespace quire
