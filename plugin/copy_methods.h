#pragma once
// The copy utilities: copying a book's content, a sheet or a row into another book or sheet.
#include "host_sdk.h"

namespace quire_plugin {

void bookCopyContent(REALobject self, REALobject dest, REALobject options);
void sheetCopySheetToBook(REALobject self, REALobject dest, REALobject options);
void sheetCopySheetToSheet(REALobject self, REALobject dest, REALobject options);
void sheetCopyRow(REALobject self, REALobject dest, RBInteger sourceRow, RBInteger destRow, REALobject options);

}  // namespace quire_plugin
