#include "xlsx/xml_shared_strings.h"

#include "xlsx/xstring_escape.h"

namespace quire {

namespace {
constexpr std::size_t kMaxStringLength = 32767;
}

template <class Tag>
int SharedStrings<Tag>::add(const std::wstring& text) {
    if (text.size() > kMaxStringLength) throw qrerror("string is too long");
    std::wstring stored = encodeXstring(text);
    auto& table = this->document();
    table.set_count(table.isset_count() ? table.get_count() + 1 : 1);
    if (lastIndex_ >= 0 && !lastText_.empty() && stored == lastText_ &&
        lastIndex_ < static_cast<int>(table.size_si()))
        return lastIndex_;
    table.append_plain_si(ooxml::write_utf8(stored));
    table.set_uniqueCount(static_cast<std::uint32_t>(table.size_si()));
    lastIndex_ = static_cast<int>(table.size_si()) - 1;
    lastText_ = std::move(stored);
    return lastIndex_;
}

template <class Tag>
std::wstring SharedStrings<Tag>::get(int index) const {
    std::wstring text;
    getInto(index, text);
    return text;
}

template <class Tag>
void SharedStrings<Tag>::getInto(int index, std::wstring& text) const {
    const auto& table = this->document();
    if (index < 0 || static_cast<std::size_t>(index) >= table.size_si())
        throw qrerror("index is out of range or no value");
    const auto* entry = table.rich_si(static_cast<std::size_t>(index));
    if (!entry) {
        ooxml::read_value(table.plain_si(static_cast<std::size_t>(index)), text);
        return;
    }
    text.clear();
    if (const auto* t = entry->find_t()) {
        text = t->get_value();
        return;
    }
    for (std::size_t i = 0; i < entry->size_r(); ++i)
        if (const auto* t = entry->get_r(i).find_t()) text += t->get_value();
}

template class SharedStrings<excelNormal_tag>;
template class SharedStrings<excelStrict_tag>;

}  // namespace quire
