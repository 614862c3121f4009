#include "xlsx/content_types.h"

#include "api/wide_text.h"
#include "xlsx/package_names.h"

namespace quire {
namespace {

bool sameAscii(const std::wstring& a, const std::string& b, bool ignoreCase) {
    if (a.size() != b.size()) return false;
    for (std::size_t i = 0; i < a.size(); ++i) {
        wchar_t x = a[i];
        wchar_t y = static_cast<unsigned char>(b[i]);
        if (ignoreCase) {
            if (x >= L'A' && x <= L'Z') x = static_cast<wchar_t>(x + 32);
            if (y >= L'A' && y <= L'Z') y = static_cast<wchar_t>(y + 32);
        }
        if (x != y) return false;
    }
    return true;
}

}  // namespace

std::string ContentTypes::contentType(const std::string& partName) const {
    const std::string name = package::normalisePartName(partName);
    const auto& types = document();
    for (std::size_t i = 0; i < types.size_Override(); ++i) {
        const auto& item = types.get_Override(i);
        if (sameAscii(item.get_PartName(), name, false)) return toUtf8(item.get_ContentType());
    }
    // Part names compare without case in packages; an exact match above wins.
    for (std::size_t i = 0; i < types.size_Override(); ++i) {
        const auto& item = types.get_Override(i);
        if (sameAscii(item.get_PartName(), name, true)) return toUtf8(item.get_ContentType());
    }
    const std::size_t dot = name.rfind('.');
    const std::size_t slash = name.rfind('/');
    if (dot == std::string::npos || dot + 1 == name.size() || (slash != std::string::npos && dot < slash)) return {};
    const std::string extension = name.substr(dot + 1);
    for (std::size_t i = 0; i < types.size_Default(); ++i) {
        const auto& item = types.get_Default(i);
        if (sameAscii(item.get_Extension(), extension, true)) return toUtf8(item.get_ContentType());
    }
    return {};
}

void ContentTypes::setOverride(const std::string& partName, const std::string& contentType) {
    auto& types = document();
    for (std::size_t i = 0; i < types.size_Override(); ++i) {
        auto& item = types.get_Override(i);
        if (sameAscii(item.get_PartName(), partName, false)) {
            item.set_ContentType(fromUtf8(contentType));
            return;
        }
    }
    auto& item = types.append_Override();
    item.set_PartName(fromUtf8(partName));
    item.set_ContentType(fromUtf8(contentType));
}

void ContentTypes::addDefault(const std::string& extension, const std::string& contentType) {
    auto& types = document();
    for (std::size_t i = 0; i < types.size_Default(); ++i) {
        auto& item = types.get_Default(i);
        if (sameAscii(item.get_Extension(), extension, true)) {
            item.set_ContentType(fromUtf8(contentType));
            return;
        }
    }
    auto& item = types.append_Default();
    item.set_Extension(fromUtf8(extension));
    item.set_ContentType(fromUtf8(contentType));
}

bool ContentTypes::hasDefault(const std::string& extension) const {
    const auto& types = document();
    for (std::size_t i = 0; i < types.size_Default(); ++i)
        if (sameAscii(types.get_Default(i).get_Extension(), extension, true)) return true;
    return false;
}

void ContentTypes::removeOverride(const std::string& partName) {
    auto& types = document();
    for (std::size_t i = types.size_Override(); i > 0; --i)
        if (sameAscii(types.get_Override(i - 1).get_PartName(), partName, false)) types.delete_Override(i - 1);
}

}  // namespace quire
