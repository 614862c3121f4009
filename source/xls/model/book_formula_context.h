#pragma once
#include "xls/formula/formula_context.h"

namespace quire {

class BookImplT;

// The formula compiler's and printer's view of a binary book.
class BookFormulaContext : public xls::FormulaContext {
public:
    explicit BookFormulaContext(BookImplT& book) : book_(book) {}

    wchar_t listSeparator() const override;
    int sheetIndex(const std::wstring& name) const override;
    bool sheetName(int index, std::wstring& name) const override;
    int externSheetIndex(int firstSheet, int lastSheet) override;
    bool externSheet(unsigned xti, xls::ExternSheetTarget& target) const override;
    unsigned nameIndex(const std::wstring& name, int scope) const override;
    bool nameText(unsigned index, std::wstring& name, int& scope) const override;
    bool externNameText(unsigned xti, unsigned nameIndex, std::wstring& name) const override;

private:
    BookImplT& book_;
};

}  // namespace quire
