// The copy utilities' host methods. Their arguments are checked as the copy needs them; the
// copying itself is not built yet and says so with a host exception rather than doing nothing.
#include "copy_methods.h"

#include "glue.h"

namespace quire_plugin {

namespace {
void notAvailable() { raiseHostException("RuntimeException", "copying is not available yet"); }

// The book of a sheet instance's owner, or null.
BookHandle bookOfSheet(REALobject sheet) { return bookHandleOf(ownerBookOf(sheet)); }

// The checks shared by the sheet and row copies onto a sheet or into a book.
bool checkSheetCopy(REALobject self, BookHandle destBook) {
    if (!QR_NEED(qrSheetRemoveFilterW) || !requireHandle(sheetOf(self))) return false;
    if (!requireArgument(bookOfSheet(self), "sbook", "Book is nil")) return false;
    return requireArgument(destBook, "dbook", "Book is nil");
}
}  // namespace

void bookCopyContent(REALobject self, REALobject dest, REALobject) {
    if (!requireArgument(dest, "dest", "Dest book is nil")) return;
    if (!requireHandle(bookHandleOf(self))) return;
    if (!requireArgument(bookHandleOf(dest), "md->handle", "Dest book is nil")) return;
    notAvailable();
}

void sheetCopySheetToBook(REALobject self, REALobject dest, REALobject) {
    if (!requireArgument(dest, "destBook", "destBook is nil")) return;
    if (!checkSheetCopy(self, bookHandleOf(dest))) return;
    notAvailable();
}

void sheetCopySheetToSheet(REALobject self, REALobject dest, REALobject) {
    if (!requireArgument(dest, "destSheet", "destSheet is nil")) return;
    if (!checkSheetCopy(self, bookOfSheet(dest))) return;
    notAvailable();
}

void sheetCopyRow(REALobject self, REALobject dest, RBInteger, RBInteger, REALobject) {
    if (!requireArgument(dest, "destSheet", "destSheet is nil")) return;
    if (!checkSheetCopy(self, bookOfSheet(dest))) return;
    notAvailable();
}

}  // namespace quire_plugin
