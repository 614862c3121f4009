#pragma once
#include <memory>

#include "api/book_factory.h"

namespace quire::test {

struct BookDeleter {
    void operator()(IBook* book) const { book->release(); }
};
using BookPtr = std::unique_ptr<IBook, BookDeleter>;

inline BookPtr newBinaryBook() { return BookPtr(createBinaryBook()); }

}  // namespace quire::test
