#pragma once

// A small book for formula tests: sheets, an XTI table that grows on
// demand, defined names and user functions.

#include <string>
#include <vector>

#include "xls/formula/formula_context.h"

namespace quire::xls::test {

class FakeBook : public FormulaContext {
public:
    struct Name {
        std::wstring text;
        int scope = WorkbookScope;
    };
    struct Xti {
        ExternSheetTarget target;
        int first = -1;  // this book's sheets; -1 for other targets
        int last = -1;
    };

    FakeBook();

    wchar_t separator = L',';
    std::vector<std::wstring> sheets;
    std::vector<Xti> xtis;
    std::vector<Name> names;            // index + 1 is the name index
    std::vector<std::wstring> externNames;  // for ptgNameX on xti 'externNameXti'
    unsigned externNameXti = 0xFFFF;
    bool allowUserFunctions = true;

    unsigned addName(const std::wstring& text, int scope = WorkbookScope);

    wchar_t listSeparator() const override { return separator; }
    int sheetIndex(const std::wstring& name) const override;
    bool sheetName(int index, std::wstring& name) const override;
    int externSheetIndex(int firstSheet, int lastSheet) override;
    bool externSheet(unsigned xti, ExternSheetTarget& target) const override;
    unsigned nameIndex(const std::wstring& name, int scope) const override;
    bool nameText(unsigned index, std::wstring& name, int& scope) const override;
    bool externNameText(unsigned xti, unsigned nameIndex, std::wstring& name) const override;
    unsigned userFunctionIndex(const std::wstring& name) override;
};

} // namespace quire::xls::test
