// The factories of the C interface. Kept apart from the forwarding entry points because only
// these depend on the engines.
#include "book_factory.h"
#include "handles.h"

using namespace quire::flat;

extern "C" {

BookHandle qrCreateBookCW(void) { return toHandle(quire::createBinaryBook()); }

// qrCreateXMLBookCW belongs to the Open XML engine, which defines it next to its book.

}  // extern "C"
