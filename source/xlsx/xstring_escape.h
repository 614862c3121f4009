#pragma once
// The file form of text in Open XML parts: characters XML cannot carry travel as "_xHHHH_".
#include <string>

namespace quire {

std::wstring encodeXstring(const std::wstring& text);
std::wstring decodeXstring(const std::wstring& text);

}  // namespace quire
