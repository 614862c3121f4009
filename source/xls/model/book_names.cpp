// The book's defined names and the ExternSheet table they refer through.
#include "book_impl.h"

namespace quire {
namespace {

constexpr uint16_t kDeletedSheet = 0xFFFF;

}  // namespace

int BookImplT::externSheetIndex(int firstSheet, int lastSheet, bool create) {
    int self = -1;
    for (size_t i = 0; i < supBooks_.size(); ++i) {
        if (supBooks_[i].selfReference()) {
            self = static_cast<int>(i);
            break;
        }
    }
    if (self >= 0) {
        for (size_t i = 0; i < externSheets_.size(); ++i) {
            const XtiEntry& e = externSheets_[i];
            if (e.iSupBook == self && e.itabFirst == firstSheet && e.itabLast == lastSheet)
                return static_cast<int>(i);
        }
    }
    if (!create) return -1;
    if (self < 0) {
        // The self-reference: ctab (the sheet count, set again on save) and the 0x0401 marker.
        SupBookBlock block;
        KeptRecord record;
        record.id = GlobalsRecord::SupBook;
        record.data = {0, 0, 0x01, 0x04};
        block.records.push_back(record);
        supBooks_.push_back(block);
        self = static_cast<int>(supBooks_.size() - 1);
    }
    if (externSheets_.size() >= 0xFFFF) return -1;
    XtiEntry entry;
    entry.iSupBook = static_cast<uint16_t>(self);
    entry.itabFirst = static_cast<uint16_t>(firstSheet);
    entry.itabLast = static_cast<uint16_t>(lastSheet);
    externSheets_.push_back(entry);
    return static_cast<int>(externSheets_.size() - 1);
}

int BookImplT::sheetOfExternSheet(unsigned xti) const {
    if (xti >= externSheets_.size()) return -1;
    const XtiEntry& e = externSheets_[xti];
    if (e.iSupBook >= supBooks_.size() || !supBooks_[e.iSupBook].selfReference()) return -1;
    if (e.itabFirst != e.itabLast || e.itabFirst >= sheets_.size()) return -1;
    return e.itabFirst;
}

void BookImplT::remapSheetReferences(const std::vector<int>& oldToNew) {
    auto map = [&](uint16_t index) -> int {
        if (index >= oldToNew.size()) return index;  // workbook-level markers and strays stay
        return oldToNew[index];
    };
    // Names local to a deleted sheet go with it; the others follow their sheet.
    std::vector<DefinedName> kept;
    for (auto& name : names_) {
        if (name.itab == 0) {
            kept.push_back(std::move(name));
            continue;
        }
        int moved = map(static_cast<uint16_t>(name.itab - 1));
        if (moved < 0) continue;
        name.itab = static_cast<uint16_t>(moved + 1);
        kept.push_back(std::move(name));
    }
    names_ = std::move(kept);
    for (auto& e : externSheets_) {
        if (e.iSupBook >= supBooks_.size() || !supBooks_[e.iSupBook].selfReference()) continue;
        if (e.itabFirst == kDeletedSheet || e.itabFirst >= 0xFFFE) continue;
        int first = map(e.itabFirst), last = map(e.itabLast);
        if (first < 0 && last < 0) {
            e.itabFirst = e.itabLast = kDeletedSheet;  // references to it now print as #REF!
            continue;
        }
        if (first < 0) first = last;
        if (last < 0) last = first;
        if (first > last) std::swap(first, last);
        e.itabFirst = static_cast<uint16_t>(first);
        e.itabLast = static_cast<uint16_t>(last);
    }
}

}  // namespace quire
