#pragma once
// The shared string table of a book: string cells hold an index into it.
#include <string>

#include "xlsx/flavour.h"
#include "xlsx/xfile.h"

namespace quire {

template <class Tag>
class SharedStrings : public XmlFile<typename XmlFlavour<Tag>::Sst> {
public:
    SharedStrings() : XmlFile<typename XmlFlavour<Tag>::Sst>("sst") {}
    // Index of the text; the same text as the previous call reuses its entry.
    int add(const std::wstring& text);
    // The text of an entry as the file holds it (escapes not decoded).
    std::wstring get(int index) const;
    // The same into `text`, whose storage is reused.
    void getInto(int index, std::wstring& text) const;
    int size() const { return static_cast<int>(this->document().size_si()); }

private:
    std::wstring lastText_;
    int lastIndex_ = -1;
};

}  // namespace quire
