#pragma once
#include <map>
#include <string>

#include "api/IBookT.h"

namespace quire::test {

// The entries of a ZIP package by name, with their bytes.
std::map<std::string, std::string> readPackage(const std::string& path);
std::map<std::string, std::string> readPackageFromMemory(const char* data, std::size_t size);

// A new Open XML book through the C interface's factory.
IBook* newXmlBook();

std::wstring widen(const std::string& text);

}  // namespace quire::test
