#pragma once
#include <gtest/gtest.h>

#include <string>

#include "api/book_factory.h"
#include "api/enums.h"

namespace quire {

// A new binary book, released after each test.
class BinaryBookTest : public ::testing::Test {
protected:
    void SetUp() override { book = createBinaryBook(); }
    void TearDown() override { book->release(); }
    std::string message() const { return book->errorMessage(); }
    ISheet* addSheet(const wchar_t* name) { return book->addSheet(name, nullptr); }

    IBook* book = nullptr;
};

}  // namespace quire
