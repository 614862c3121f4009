#include "xlsx/package_names.h"

#include <cwctype>
#include <vector>

namespace quire::package {

std::string normalisePartName(const std::string& name) {
    std::string result = name;
    for (char& c : result)
        if (c == '\\') c = '/';
    if (result.empty() || result[0] != '/') result.insert(result.begin(), '/');
    return result;
}

std::string relationshipsPartName(const std::string& partName) {
    const std::size_t slash = partName.rfind('/');
    if (slash == std::string::npos) return "/_rels/" + partName + ".rels";
    return partName.substr(0, slash + 1) + "_rels/" + partName.substr(slash + 1) + ".rels";
}

std::string resolveWorkbookTarget(const std::string& target) {
    if (target.compare(0, 4, "/xl/") == 0) return target;
    return "/xl/" + target;
}

std::string partFolder(const std::string& partName) {
    const std::size_t slash = partName.rfind('/');
    return slash == std::string::npos ? std::string() : partName.substr(0, slash);
}

std::string resolveRelative(const std::string& folder, const std::string& target) {
    std::string path = !target.empty() && target[0] == '/' ? target : folder + "/" + target;
    std::vector<std::string> segments;
    std::size_t at = 0;
    while (at <= path.size()) {
        std::size_t next = path.find('/', at);
        if (next == std::string::npos) next = path.size();
        const std::string segment = path.substr(at, next - at);
        if (segment == "..") {
            if (!segments.empty()) segments.pop_back();
        } else if (!segment.empty() && segment != ".") {
            segments.push_back(segment);
        }
        at = next + 1;
    }
    std::string result;
    for (const auto& segment : segments) result += "/" + segment;
    return result.empty() ? "/" : result;
}

const char* workbookTypeForFileName(const std::wstring& fileName) {
    if (fileName.size() < 6) return nullptr;
    std::wstring ending = fileName.substr(fileName.size() - 5);
    for (wchar_t& c : ending) c = static_cast<wchar_t>(std::towlower(c));
    if (ending == L".xlsx") return kXlsxMain;
    if (ending == L".xltx") return kXltxMain;
    if (ending == L".xlsm") return kXlsmMain;
    if (ending == L".xltm") return kXltmMain;
    return nullptr;
}

}  // namespace quire::package
