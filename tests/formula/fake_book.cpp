#include "fake_book.h"

namespace quire::xls::test {

namespace {

bool sameText(const std::wstring& a, const std::wstring& b)
{
    if (a.size() != b.size())
        return false;
    for (size_t i = 0; i < a.size(); ++i) {
        wchar_t x = a[i], y = b[i];
        if (x >= L'a' && x <= L'z')
            x = static_cast<wchar_t>(x - 32);
        if (y >= L'a' && y <= L'z')
            y = static_cast<wchar_t>(y - 32);
        if (x != y)
            return false;
    }
    return true;
}

} // namespace

FakeBook::FakeBook() : sheets{L"Sheet1", L"Sheet2", L"Sheet3", L"My Sheet", L"2019"} {}

unsigned FakeBook::addName(const std::wstring& text, int scope)
{
    names.push_back({text, scope});
    return static_cast<unsigned>(names.size());
}

int FakeBook::sheetIndex(const std::wstring& name) const
{
    for (size_t i = 0; i < sheets.size(); ++i)
        if (sameText(sheets[i], name))
            return static_cast<int>(i);
    return -1;
}

bool FakeBook::sheetName(int index, std::wstring& name) const
{
    if (index < 0 || static_cast<size_t>(index) >= sheets.size())
        return false;
    name = sheets[index];
    return true;
}

int FakeBook::externSheetIndex(int firstSheet, int lastSheet)
{
    for (size_t i = 0; i < xtis.size(); ++i)
        if (xtis[i].first == firstSheet && xtis[i].last == lastSheet)
            return static_cast<int>(i);
    Xti x;
    x.first = firstSheet;
    x.last = lastSheet;
    x.target.kind = ExternSheetTarget::Sheets;
    xtis.push_back(x);
    return static_cast<int>(xtis.size() - 1);
}

bool FakeBook::externSheet(unsigned xti, ExternSheetTarget& target) const
{
    if (xti >= xtis.size())
        return false;
    const Xti& x = xtis[xti];
    target = x.target;
    if (x.first >= 0) {
        if (static_cast<size_t>(x.last) >= sheets.size()) {
            target.kind = ExternSheetTarget::Deleted;
            return true;
        }
        target.firstSheet = sheets[x.first];
        target.lastSheet = sheets[x.last];
    }
    return true;
}

unsigned FakeBook::nameIndex(const std::wstring& name, int scope) const
{
    for (size_t i = 0; i < names.size(); ++i)
        if (names[i].scope == scope && sameText(names[i].text, name))
            return static_cast<unsigned>(i + 1);
    return 0;
}

bool FakeBook::nameText(unsigned index, std::wstring& name, int& scope) const
{
    if (index == 0 || index > names.size())
        return false;
    name = names[index - 1].text;
    scope = names[index - 1].scope;
    return true;
}

bool FakeBook::externNameText(unsigned xti, unsigned nameIndex, std::wstring& name) const
{
    if (xti != externNameXti || nameIndex == 0 || nameIndex > externNames.size())
        return false;
    name = externNames[nameIndex - 1];
    return true;
}

unsigned FakeBook::userFunctionIndex(const std::wstring& name)
{
    if (const unsigned existing = nameIndex(name, WorkbookScope))
        return existing;
    return allowUserFunctions ? addName(name) : 0;
}

} // namespace quire::xls::test
