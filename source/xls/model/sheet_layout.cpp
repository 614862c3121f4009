// Rows, columns, merged ranges, page breaks, panes, outline groups and grid editing.
#include <algorithm>
#include <cmath>

#include "book_impl.h"
#include "sheet_impl.h"

namespace quire {
namespace {

constexpr int kMaxPageBreaks = 1026;
constexpr int kMaxRowHeightTwips = 8200;
constexpr int kMaxOutlineLevel = 7;
// Pixel measures of the default font (Arial 10): widest digit and row padding.
constexpr int kMaxDigitWidthPx = 7;
constexpr int kColumnPaddingPx = 5;

void checkRowLast(int rowFirst, int rowLast) {
    if (static_cast<unsigned>(rowFirst) > SheetImplT::kMaxRow) throw qrerror("row must be in range 0-65535");
    if (static_cast<unsigned>(rowLast) > SheetImplT::kMaxRow) throw qrerror("rowLast must be in range 0-65535");
    if (rowLast < rowFirst) throw qrerror("rowLast must be greater than or equal to rowFirst");
}

void checkColRange(int colFirst, int colLast) {
    if (static_cast<unsigned>(colFirst) > SheetImplT::kMaxCol) throw qrerror("colFirst must be in range 0-255");
    if (static_cast<unsigned>(colLast) > SheetImplT::kMaxCol) throw qrerror("colLast must be in range 0-255");
    if (colLast < colFirst) throw qrerror("colLast must be greater than or equal to colFirst");
}

bool contains(const Ref8& ref, int row, int col) {
    return row >= ref.rwFirst && row <= ref.rwLast && col >= ref.colFirst && col <= ref.colLast;
}

void writeRef(const Ref8& ref, int* rowFirst, int* rowLast, int* colFirst, int* colLast) {
    if (rowFirst) *rowFirst = ref.rwFirst;
    if (rowLast) *rowLast = ref.rwLast;
    if (colFirst) *colFirst = ref.colFirst;
    if (colLast) *colLast = ref.colLast;
}

// Two groups may nest or stand apart; a partial overlap has no outline levels that hold it.
bool overlapsBadly(const std::vector<OutlineGroup>& groups, int first, int last) {
    for (const auto& g : groups) {
        bool disjoint = last < g.first || first > g.last;
        bool nested = (first >= g.first && last <= g.last) || (g.first >= first && g.last <= last);
        if (!disjoint && !nested) return true;
    }
    return false;
}

}  // namespace

// ---- Columns ----

ColInfo* SheetImplT::columnInfo(int col) {
    for (auto& info : cols_) {
        if (col >= info.colFirst && col <= info.colLast) return &info;
    }
    return nullptr;
}

// Makes colFirst..colLast covered by ranges of their own, splitting any range that straddles them
// and filling gaps with default ranges.
void SheetImplT::splitColumnRanges(int colFirst, int colLast) {
    std::vector<ColInfo> result;
    for (const auto& info : cols_) {
        if (info.colLast < colFirst || info.colFirst > colLast) {
            result.push_back(info);
            continue;
        }
        if (info.colFirst < colFirst) {
            ColInfo before = info;
            before.colLast = static_cast<uint16_t>(colFirst - 1);
            result.push_back(before);
        }
        ColInfo middle = info;
        middle.colFirst = static_cast<uint16_t>(std::max<int>(info.colFirst, colFirst));
        middle.colLast = static_cast<uint16_t>(std::min<int>(info.colLast, colLast));
        result.push_back(middle);
        if (info.colLast > colLast) {
            ColInfo after = info;
            after.colFirst = static_cast<uint16_t>(colLast + 1);
            result.push_back(after);
        }
    }
    for (int c = colFirst; c <= colLast; ++c) {
        bool covered = std::any_of(result.begin(), result.end(), [c](const ColInfo& i) {
            return c >= i.colFirst && c <= i.colLast;
        });
        if (covered) continue;
        ColInfo fill;
        fill.colFirst = fill.colLast = static_cast<uint16_t>(c);
        fill.coldx = static_cast<uint16_t>(std::lround((defColWidth + 0.43) * 256));
        while (fill.colLast < colLast) {
            int next = fill.colLast + 1;
            bool nextCovered = std::any_of(result.begin(), result.end(), [next](const ColInfo& i) {
                return next >= i.colFirst && next <= i.colLast;
            });
            if (nextCovered) break;
            ++fill.colLast;
        }
        result.push_back(fill);
        c = fill.colLast;
    }
    std::sort(result.begin(), result.end(),
              [](const ColInfo& a, const ColInfo& b) { return a.colFirst < b.colFirst; });
    cols_ = std::move(result);
}

double SheetImplT::colWidth(int col) {
    return message().guard(-1.0, [&] {
        if (static_cast<unsigned>(col) > kMaxCol) throw qrerror("col must be in range 0-255");
        if (const ColInfo* info = columnInfo(col)) return info->coldx / 256.0;
        return defColWidth + 0.43;  // the default width plus the cell padding
    });
}

int SheetImplT::colWidthPx(int col) {
    double width = colWidth(col);
    if (width < 0) return -1;
    if (width < 1) return static_cast<int>(std::lround(width * (kMaxDigitWidthPx + kColumnPaddingPx)));
    return static_cast<int>(std::floor(width * kMaxDigitWidthPx + 0.5)) + kColumnPaddingPx;
}

bool SheetImplT::setCol(int colFirst, int colLast, double width, IFormatT<wchar_t>* format,
                        bool hidden) {
    return message().guard(false, [&] {
        checkColRange(colFirst, colLast);
        int xf = -1;
        if (format) {
            xf = book_->xfIndexOf(format);
            if (xf < 0) throw qrerror("specified format not found");
        }
        if (width > 255) throw qrerror("width is too big");
        splitColumnRanges(colFirst, colLast);
        for (auto& info : cols_) {
            if (info.colFirst < colFirst || info.colLast > colLast) continue;
            if (width >= 0) {
                info.coldx = static_cast<uint16_t>(std::lround(width * 256));
                info.grbit |= ColInfo::kUserSet;
            }
            if (xf >= 0) info.ixfe = static_cast<uint16_t>(xf);
            info.grbit = hidden ? (info.grbit | ColInfo::kHidden) : (info.grbit & ~ColInfo::kHidden);
        }
        return true;
    });
}

bool SheetImplT::colHidden(int col) {
    return message().guard(false, [&] {
        if (static_cast<unsigned>(col) > kMaxCol) throw qrerror("col must be in range 0-255");
        const ColInfo* info = columnInfo(col);
        return info && (info->grbit & ColInfo::kHidden) != 0;
    });
}

bool SheetImplT::setColHidden(int col, bool hidden) {
    return message().guard(false, [&] {
        if (static_cast<unsigned>(col) > kMaxCol) throw qrerror("col must be in range 0-255");
        splitColumnRanges(col, col);
        ColInfo* info = columnInfo(col);
        info->grbit = hidden ? (info->grbit | ColInfo::kHidden) : (info->grbit & ~ColInfo::kHidden);
        return true;
    });
}

// ---- Rows ----

RowInfo& SheetImplT::rowInfo(int row) {
    auto found = rows_.find(row);
    if (found != rows_.end()) return found->second;
    RowInfo info;
    info.rw = static_cast<uint16_t>(row);
    info.miyRw = defaultRowHeight;
    return rows_.emplace(row, info).first->second;
}

double SheetImplT::rowHeight(int row) {
    return message().guard(-1.0, [&] {
        if (static_cast<unsigned>(row) > kMaxRow) throw qrerror("row must be in range 0-65535");
        auto found = rows_.find(row);
        int twips = found == rows_.end() ? defaultRowHeight : found->second.miyRw;
        return twips / 20.0;
    });
}

int SheetImplT::rowHeightPx(int row) {
    double height = rowHeight(row);
    if (height < 0) return -1;
    return static_cast<int>(std::lround(height * 96.0 / 72.0));
}

bool SheetImplT::setRow(int row, double height, IFormatT<wchar_t>* format, bool hidden) {
    return message().guard(false, [&] {
        if (static_cast<unsigned>(row) > kMaxRow) throw qrerror("row must be in range 0-65535");
        int xf = -1;
        if (format) {
            xf = book_->xfIndexOf(format);
            if (xf < 0) throw qrerror("specified format not found");
        }
        long twips = std::lround(height * 20);
        if (twips > kMaxRowHeightTwips) throw qrerror("height is too big");
        RowInfo& info = rowInfo(row);
        if (height >= 0) {
            info.miyRw = static_cast<uint16_t>(twips);
            info.grbit |= RowInfo::kCustomHeight;
        }
        if (xf >= 0) {
            info.ixfeFlags = static_cast<uint16_t>((info.ixfeFlags & 0xF000) | (xf & 0x0FFF));
            info.grbit |= RowInfo::kHasFormat;
        }
        info.grbit = hidden ? (info.grbit | RowInfo::kHidden) : (info.grbit & ~RowInfo::kHidden);
        return true;
    });
}

bool SheetImplT::rowHidden(int row) {
    return message().guard(false, [&] {
        if (static_cast<unsigned>(row) > kMaxRow) throw qrerror("row must be in range 0-65535");
        auto found = rows_.find(row);
        return found != rows_.end() && (found->second.grbit & RowInfo::kHidden) != 0;
    });
}

bool SheetImplT::setRowHidden(int row, bool hidden) {
    return message().guard(false, [&] {
        if (static_cast<unsigned>(row) > kMaxRow) throw qrerror("row must be in range 0-65535");
        RowInfo& info = rowInfo(row);
        info.grbit = hidden ? (info.grbit | RowInfo::kHidden) : (info.grbit & ~RowInfo::kHidden);
        return true;
    });
}

// ---- Merged ranges ----

bool SheetImplT::getMerge(int row, int col, int* rowFirst, int* rowLast, int* colFirst,
                          int* colLast) {
    return message().guard(false, [&] {
        for (const auto& ref : merges_) {
            if (contains(ref, row, col)) {
                writeRef(ref, rowFirst, rowLast, colFirst, colLast);
                return true;
            }
        }
        throw qrerror("this cell isn't in merging block");
    });
}

bool SheetImplT::setMerge(int rowFirst, int rowLast, int colFirst, int colLast) {
    return message().guard(false, [&] {
        if (static_cast<unsigned>(rowFirst) > kMaxRow || static_cast<unsigned>(rowLast) > kMaxRow)
            throw qrerror("row must be in range 0-65535");
        if (rowLast < rowFirst) throw qrerror("rowLast must be greater than or equal to rowFirst");
        if (colLast < colFirst) throw qrerror("colLast must be greater than or equal to colFirst");
        if (static_cast<unsigned>(colFirst) > kMaxCol || static_cast<unsigned>(colLast) > kMaxCol)
            throw qrerror("col must be in range 0-255");
        Ref8 ref;
        ref.rwFirst = static_cast<uint16_t>(rowFirst);
        ref.rwLast = static_cast<uint16_t>(rowLast);
        ref.colFirst = static_cast<uint16_t>(colFirst);
        ref.colLast = static_cast<uint16_t>(colLast);
        merges_.push_back(ref);
        return true;
    });
}

bool SheetImplT::delMerge(int row, int col) {
    return message().guard(false, [&] {
        for (auto it = merges_.begin(); it != merges_.end(); ++it) {
            if (contains(*it, row, col)) {
                merges_.erase(it);
                return true;
            }
        }
        throw qrerror("this cell isn't in merging block");
    });
}

int SheetImplT::mergeSize() {
    message().ok();
    return static_cast<int>(merges_.size());
}

bool SheetImplT::merge(int index, int* rowFirst, int* rowLast, int* colFirst, int* colLast) {
    return message().guard(false, [&] {
        if (index < 0 || index >= static_cast<int>(merges_.size()))
            throw qrerror("index is out of range");
        writeRef(merges_[index], rowFirst, rowLast, colFirst, colLast);
        return true;
    });
}

bool SheetImplT::delMergeByIndex(int index) {
    return message().guard(false, [&] {
        if (index < 0 || index >= static_cast<int>(merges_.size()))
            throw qrerror("index is out of range");
        merges_.erase(merges_.begin() + index);
        return true;
    });
}

// ---- Page breaks ----

int SheetImplT::getHorPageBreak(int index) {
    return message().guard(-1, [&] {
        if (index < 0 || index >= static_cast<int>(horBreaks_.size()))
            throw qrerror("index is out of range");
        return static_cast<int>(horBreaks_[index].index);
    });
}

int SheetImplT::getHorPageBreakSize() {
    message().ok();
    return static_cast<int>(horBreaks_.size());
}

int SheetImplT::getVerPageBreak(int index) {
    return message().guard(-1, [&] {
        if (index < 0 || index >= static_cast<int>(verBreaks_.size()))
            throw qrerror("index is out of range");
        return static_cast<int>(verBreaks_[index].index);
    });
}

int SheetImplT::getVerPageBreakSize() {
    message().ok();
    return static_cast<int>(verBreaks_.size());
}

bool SheetImplT::setPageBreak(std::vector<PageBreak>& breaks, int index, bool pageBreak,
                              uint16_t end) {
    auto found = std::lower_bound(breaks.begin(), breaks.end(), index,
                                  [](const PageBreak& b, int i) { return b.index < i; });
    bool exists = found != breaks.end() && found->index == index;
    if (exists) {
        if (pageBreak) throw qrerror("pagebreak already exists");
        breaks.erase(found);
        return true;
    }
    if (!pageBreak) throw qrerror("pagebreak not found");
    if (static_cast<int>(breaks.size()) >= kMaxPageBreaks)
        throw qrerror("number of pagebreaks is exceed limit");
    PageBreak b;
    b.index = static_cast<uint16_t>(index);
    b.start = 0;
    b.end = end;
    breaks.insert(found, b);
    return true;
}

bool SheetImplT::setHorPageBreak(int row, bool pageBreak) {
    return message().guard(false, [&] {
        if (static_cast<unsigned>(row) > kMaxRow) throw qrerror("row must be in range 0-65535");
        return setPageBreak(horBreaks_, row, pageBreak, kMaxCol);
    });
}

bool SheetImplT::setVerPageBreak(int col, bool pageBreak) {
    return message().guard(false, [&] {
        if (static_cast<unsigned>(col) > kMaxCol) throw qrerror("col must be in range 0-255");
        return setPageBreak(verBreaks_, col, pageBreak, kMaxRow);
    });
}

// ---- Panes ----

void SheetImplT::split(int row, int col) {
    message().guardVoid([&] {
        if (static_cast<unsigned>(row) > kMaxRow) throw qrerror("row must be in range 0-65535");
        if (static_cast<unsigned>(col) > kMaxCol) throw qrerror("col must be in range 0-255");
        Pane& pane = view_.pane;
        if (row == 0 && col == 0) {
            pane = Pane();
            view_.window2.grbit &= ~(Window2::kFrozen | Window2::kFrozenNoSplit);
            return;
        }
        pane.present = true;
        pane.x = static_cast<uint16_t>(col);
        pane.y = static_cast<uint16_t>(row);
        pane.rwTop = static_cast<uint16_t>(row);
        pane.colLeft = static_cast<uint16_t>(col);
        pane.pnnAcct = (row > 0 && col > 0) ? 0 : (row > 0 ? 2 : 1);
        view_.window2.grbit |= Window2::kFrozen | Window2::kFrozenNoSplit;
    });
}

bool SheetImplT::splitInfo(int* row, int* col) {
    return message().guard(false, [&] {
        if (!view_.pane.present) throw qrerror("worksheet is not splitted");
        if (row) *row = view_.pane.y;
        if (col) *col = view_.pane.x;
        return true;
    });
}

// ---- Outline groups ----

bool SheetImplT::groupRows(int rowFirst, int rowLast, bool collapsed) {
    return message().guard(false, [&] {
        if (rowFirst > rowLast) throw qrerror("must be rowFirst <= rowLast");
        if (static_cast<unsigned>(rowFirst) > kMaxRow || static_cast<unsigned>(rowLast) > kMaxRow)
            throw qrerror("rowLast must be in range 0-65535");
        if (overlapsBadly(rowGroups_, rowFirst, rowLast)) throw qrerror("detect overlap");
        for (int r = rowFirst; r <= rowLast; ++r) {
            if (rows_.count(r) && rows_[r].outlineLevel() >= kMaxOutlineLevel)
                throw qrerror("detect overlap");
        }
        rowGroups_.push_back({rowFirst, rowLast});
        for (int r = rowFirst; r <= rowLast; ++r) {
            RowInfo& info = rowInfo(r);
            info.grbit = static_cast<uint16_t>((info.grbit & ~7u) | (info.outlineLevel() + 1));
            if (collapsed) info.grbit |= RowInfo::kHidden;
        }
        if (collapsed) {
            int summary = wsBool_.grbit & WsBool::kRowSumsBelow ? rowLast + 1 : rowFirst - 1;
            if (summary >= 0 && summary <= kMaxRow) rowInfo(summary).grbit |= RowInfo::kCollapsed;
        }
        return true;
    });
}

bool SheetImplT::groupCols(int colFirst, int colLast, bool collapsed) {
    return message().guard(false, [&] {
        if (colFirst > colLast) throw qrerror("must be colFirst <= colLast");
        if (static_cast<unsigned>(colFirst) > kMaxCol) throw qrerror("colFirst must be in range 0-255");
        if (static_cast<unsigned>(colLast) > kMaxCol) throw qrerror("colLast must be in range 0-255");
        if (overlapsBadly(colGroups_, colFirst, colLast)) throw qrerror("detect overlap");
        splitColumnRanges(colFirst, colLast);
        for (const auto& info : cols_) {
            if (info.colFirst >= colFirst && info.colLast <= colLast &&
                info.outlineLevel() >= kMaxOutlineLevel)
                throw qrerror("detect overlap");
        }
        colGroups_.push_back({colFirst, colLast});
        for (auto& info : cols_) {
            if (info.colFirst < colFirst || info.colLast > colLast) continue;
            info.grbit = static_cast<uint16_t>((info.grbit & ~0x0700u) | ((info.outlineLevel() + 1) << 8));
            if (collapsed) info.grbit |= ColInfo::kHidden;
        }
        if (collapsed) {
            int summary = wsBool_.grbit & WsBool::kColSumsRight ? colLast + 1 : colFirst - 1;
            if (summary >= 0 && summary <= kMaxCol) {
                splitColumnRanges(summary, summary);
                columnInfo(summary)->grbit |= ColInfo::kCollapsed;
            }
        }
        return true;
    });
}

bool SheetImplT::groupSummaryBelow() {
    message().ok();
    return (wsBool_.grbit & WsBool::kRowSumsBelow) != 0;
}

void SheetImplT::setGroupSummaryBelow(bool below) {
    message().ok();
    wsBool_.grbit = below ? (wsBool_.grbit | WsBool::kRowSumsBelow) : (wsBool_.grbit & ~WsBool::kRowSumsBelow);
}

bool SheetImplT::groupSummaryRight() {
    message().ok();
    return (wsBool_.grbit & WsBool::kColSumsRight) != 0;
}

void SheetImplT::setGroupSummaryRight(bool right) {
    message().ok();
    wsBool_.grbit = right ? (wsBool_.grbit | WsBool::kColSumsRight) : (wsBool_.grbit & ~WsBool::kColSumsRight);
}

// ---- Editing the grid ----

void SheetImplT::clear(int rowFirst, int rowLast, int colFirst, int colLast) {
    message().guardVoid([&] {
        if (rowLast < rowFirst) throw qrerror("rowLast must be greater than or equal to rowFirst");
        if (colLast < colFirst) throw qrerror("colLast must be greater than or equal to colFirst");
        int lastRowToClear = std::min<int>(rowLast, static_cast<int>(cells_.rowCount()) - 1);
        for (int r = std::max(rowFirst, 0); r <= lastRowToClear; ++r) {
            int lastColumn = std::min<int>(colLast, static_cast<int>(cells_.rowWords(r).size()) - 1);
            for (int c = std::max(colFirst, 0); c <= lastColumn; ++c) cells_.erase(r, c);
        }
        invalidateUsedRange();
    });
}

// Moves every row from `from` on by `count` (negative: up); cells pushed past the last row are lost.
void SheetImplT::shiftRows(int from, int count) {
    int rowsHeld = static_cast<int>(cells_.rowCount());
    if (count > 0) {
        for (int r = rowsHeld - 1; r >= from; --r) {
            int columns = static_cast<int>(cells_.rowWords(r).size());
            for (int c = 0; c < columns; ++c) {
                if (!cells_.exists(r, c)) continue;
                if (r + count > kMaxRow) cells_.erase(r, c);
                else cells_.move(r, c, r + count, c);
            }
        }
    } else {
        for (int r = from; r < rowsHeld; ++r) {
            int columns = static_cast<int>(cells_.rowWords(r).size());
            for (int c = 0; c < columns; ++c) {
                if (cells_.exists(r, c)) cells_.move(r, c, r + count, c);
            }
        }
    }
    std::map<int, RowInfo> moved;
    for (auto& entry : rows_) {
        int r = entry.first;
        if (r >= from) r += count;
        if (r < 0 || r > kMaxRow) continue;
        entry.second.rw = static_cast<uint16_t>(r);
        moved.emplace(r, entry.second);
    }
    rows_ = std::move(moved);
    invalidateUsedRange();
}

void SheetImplT::shiftCols(int from, int count) {
    for (int r = 0; r < static_cast<int>(cells_.rowCount()); ++r) {
        int columns = static_cast<int>(cells_.rowWords(r).size());
        if (count > 0) {
            for (int c = columns - 1; c >= from; --c) {
                if (!cells_.exists(r, c)) continue;
                if (c + count > kMaxCol) cells_.erase(r, c);
                else cells_.move(r, c, r, c + count);
            }
        } else {
            for (int c = from; c < columns; ++c) {
                if (cells_.exists(r, c)) cells_.move(r, c, r, c + count);
            }
        }
    }
    std::vector<ColInfo> moved;
    for (auto info : cols_) {
        int first = info.colFirst, last = info.colLast;
        if (first >= from) first += count;
        if (last >= from) last += count;
        first = std::max(first, 0);
        last = std::min(last, kMaxCol);
        if (first > last) continue;
        info.colFirst = static_cast<uint16_t>(first);
        info.colLast = static_cast<uint16_t>(last);
        moved.push_back(info);
    }
    cols_ = std::move(moved);
    invalidateUsedRange();
}

namespace {

// Shifts one coordinate pair of a range for an insertion (count > 0) or removal (count < 0) at
// `from`; false when the removal swallows the range.
bool shiftSpan(uint16_t& first, uint16_t& last, int from, int count, int maxIndex) {
    int f = first, l = last;
    if (count < 0) {
        int removedLast = from - count - 1;
        if (f >= from && l <= removedLast) return false;
        if (f > removedLast) f += count;
        else if (f >= from) f = from;
        if (l > removedLast) l += count;
        else if (l >= from) l = from - 1;
    } else {
        if (f >= from) f += count;
        if (l >= from) l += count;
    }
    if (f > maxIndex || l < f) return false;
    first = static_cast<uint16_t>(f);
    last = static_cast<uint16_t>(std::min(l, maxIndex));
    return true;
}

void shiftRefs(std::vector<Ref8>& refs, bool rowsShift, int from, int count, int maxIndex) {
    std::vector<Ref8> kept;
    for (Ref8 ref : refs) {
        bool keep = rowsShift ? shiftSpan(ref.rwFirst, ref.rwLast, from, count, maxIndex)
                              : shiftSpan(ref.colFirst, ref.colLast, from, count, maxIndex);
        if (keep) kept.push_back(ref);
    }
    refs = std::move(kept);
}

}  // namespace

bool SheetImplT::insertRow(int rowFirst, int rowLast, bool updateReferences) {
    return message().guard(false, [&] {
        checkRowLast(rowFirst, rowLast);
        int count = rowLast - rowFirst + 1;
        shiftRows(rowFirst, count);
        if (updateReferences) {
            shiftNamedRanges(true, rowFirst, count);
            shiftRefs(merges_, true, rowFirst, count, kMaxRow);
            for (auto& link : hyperlinks_) shiftSpan(link.ref.rwFirst, link.ref.rwLast, rowFirst, count, kMaxRow);
        }
        return true;
    });
}

bool SheetImplT::removeRow(int rowFirst, int rowLast, bool updateReferences) {
    return message().guard(false, [&] {
        checkRowLast(rowFirst, rowLast);
        int count = rowLast - rowFirst + 1;
        for (int r = rowFirst; r <= rowLast && r < static_cast<int>(cells_.rowCount()); ++r) {
            int columns = static_cast<int>(cells_.rowWords(r).size());
            for (int c = 0; c < columns; ++c) cells_.erase(r, c);
        }
        for (int r = rowFirst; r <= rowLast; ++r) rows_.erase(r);
        shiftRows(rowLast + 1, -count);
        if (updateReferences) {
            shiftNamedRanges(true, rowFirst, -count);
            shiftRefs(merges_, true, rowFirst, -count, kMaxRow);
            std::vector<Hyperlink> kept;
            for (auto link : hyperlinks_) {
                if (shiftSpan(link.ref.rwFirst, link.ref.rwLast, rowFirst, -count, kMaxRow))
                    kept.push_back(link);
            }
            hyperlinks_ = std::move(kept);
        }
        return true;
    });
}

bool SheetImplT::insertCol(int colFirst, int colLast, bool updateReferences) {
    return message().guard(false, [&] {
        checkColRange(colFirst, colLast);
        int count = colLast - colFirst + 1;
        shiftCols(colFirst, count);
        if (updateReferences) {
            shiftNamedRanges(false, colFirst, count);
            shiftRefs(merges_, false, colFirst, count, kMaxCol);
            for (auto& link : hyperlinks_) shiftSpan(link.ref.colFirst, link.ref.colLast, colFirst, count, kMaxCol);
        }
        return true;
    });
}

bool SheetImplT::removeCol(int colFirst, int colLast, bool updateReferences) {
    return message().guard(false, [&] {
        checkColRange(colFirst, colLast);
        int count = colLast - colFirst + 1;
        for (int r = 0; r < static_cast<int>(cells_.rowCount()); ++r) {
            int columns = static_cast<int>(cells_.rowWords(r).size());
            for (int c = colFirst; c <= colLast && c < columns; ++c) cells_.erase(r, c);
        }
        splitColumnRanges(colFirst, colLast);
        cols_.erase(std::remove_if(cols_.begin(), cols_.end(),
                                   [&](const ColInfo& i) { return i.colFirst >= colFirst && i.colLast <= colLast; }),
                    cols_.end());
        shiftCols(colLast + 1, -count);
        if (updateReferences) {
            shiftNamedRanges(false, colFirst, -count);
            shiftRefs(merges_, false, colFirst, -count, kMaxCol);
            std::vector<Hyperlink> kept;
            for (auto link : hyperlinks_) {
                if (shiftSpan(link.ref.colFirst, link.ref.colLast, colFirst, -count, kMaxCol))
                    kept.push_back(link);
            }
            hyperlinks_ = std::move(kept);
        }
        return true;
    });
}

}  // namespace quire
